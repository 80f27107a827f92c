// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QMap>

#include <sys/stat.h>

#include <glib.h>

#include <memory>

/**
 * The desktop entries of all packages installed on this machine, read beside GKeyFile.
 *
 * GKeyFile takes lang@MODIFIER before lang_COUNTRY, the standard and the record the other way
 * round; it takes the unlocalized value where there is no other, the record gives none; and it
 * has no value for an escape it does not know, where the record keeps the escape; and it refuses
 * a file for one bad line. Everything else has to be the same.
 */
class tst_DesktopEntryCorpus : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();

    void givesTheValuesOfGKeyFile_data();
    void givesTheValuesOfGKeyFile();
    void leavesEveryFileUntouchedWhenNothingChanges();
    void changesOneLineForOneKey();
    void changesOneLineForOneLocalKey();

private:
    QStringList m_files;
    int m_translatedPackages = 0;
};

namespace {

// A package with less is not worth much to this test.
constexpr int ManyLanguages = 20;
constexpr int EnoughPackages = 10;

struct FreeKeyFile
{
    void operator()(GKeyFile *file) const { g_key_file_free(file); }
};
using KeyFile = std::unique_ptr<GKeyFile, FreeKeyFile>;

KeyFile keyFile(const QString &path)
{
    KeyFile file(g_key_file_new());
    if (!g_key_file_load_from_file(file.get(), qPrintable(path), G_KEY_FILE_KEEP_TRANSLATIONS, nullptr))
        return nullptr;
    return file;
}

// The key lines of a text without its comments, for counting.
int languagesOf(const QByteArray &bytes)
{
    return bytes.count("\nName[");
}

// What GKeyFile says; null where it has no value.
QString peerText(GKeyFile *file, const QByteArray &group, const QByteArray &key)
{
    const std::unique_ptr<char, void (*)(void *)> text(
        g_key_file_get_string(file, group.constData(), key.constData(), nullptr), g_free);
    return text ? QString::fromUtf8(text.get()) : QString();
}

bool peerHas(GKeyFile *file, const QByteArray &group, const QByteArray &key)
{
    return g_key_file_has_key(file, group.constData(), key.constData(), nullptr);
}

// The raw value, to tell an unknown escape from a wrong value of ours.
bool peerCannotRead(GKeyFile *file, const QByteArray &group, const QByteArray &key)
{
    GError *error = nullptr;
    g_free(g_key_file_get_string(file, group.constData(), key.constData(), &error));
    const bool isMalformed = error && peerHas(file, group, key);
    g_clear_error(&error);
    return isMalformed;
}

// The value for a locale in the standard's order, found with GKeyFile's help.
QString peerLocalText(GKeyFile *file, const QByteArray &group, const QByteArray &key,
                      const QByteArrayList &order)
{
    for (const QByteArray &locale : order) {
        const QByteArray variant = key + '[' + locale + ']';
        if (peerHas(file, group, variant) && !peerCannotRead(file, group, variant))
            return peerText(file, group, variant);
    }
    return {};
}

// The variant of a key that stands first in the standard's order; empty where there is none.
QByteArray peerVariant(GKeyFile *file, const QByteArray &group, const QByteArray &key,
                       const QByteArrayList &order)
{
    for (const QByteArray &locale : order) {
        if (peerHas(file, group, key + '[' + locale + ']'))
            return key + '[' + locale + ']';
    }
    return {};
}

// How GKeyFile itself would choose; empty where it takes the unlocalized value.
QByteArray peerLocale(GKeyFile *file, const QByteArray &group, const QByteArray &key,
                      const QByteArray &locale)
{
    const std::unique_ptr<char, void (*)(void *)> found(
        g_key_file_get_locale_for_key(file, group.constData(), key.constData(), locale.constData()), g_free);
    return found.get();
}

QStringList peerList(const QString &value)
{
    // Read with GKeyFile's string rules, so only the separators are left; the corpus has no "\;".
    return value.split(QLatin1Char(';'), Qt::SkipEmptyParts);
}

const QByteArray MainGroup = "Desktop Entry";

// One file beside GKeyFile: what differs, and what was counted.
class FileComparison
{
public:
    FileComparison(GKeyFile *peer, QByteArrayList order)
        : m_peer(peer)
        , m_order(std::move(order))
    {
    }

    void text(const QByteArray &group, const QByteArray &key, const QString &value)
    {
        if (peerCannotRead(m_peer, group, key))
            ++unknownEscapes;
        else
            same(key, value == peerText(m_peer, group, key));
    }

    void localText(const QByteArray &group, const QByteArray &key, const QString &value)
    {
        // An escape that GKeyFile does not know makes its value malformed; ours keeps it as it stands.
        const QByteArray variant = peerVariant(m_peer, group, key, m_order);
        if (!variant.isEmpty() && peerCannotRead(m_peer, group, variant)) {
            ++unknownEscapes;
            return;
        }
        const QString expected = peerLocalText(m_peer, group, key, m_order);
        const QByteArray chosen = peerLocale(m_peer, group, key, m_order.constFirst());
        same(key, value == expected);
        if (!chosen.isEmpty() && expected != peerText(m_peer, group, key + '[' + chosen + ']')) {
            // Where GKeyFile chooses otherwise it is for its own order alone.
            ++otherOrder;
            same(key, chosen.contains('@') && m_order.size() == 4);
        }
    }

    void list(const QByteArray &key, const QStringList &value)
    {
        same(key, value == peerList(peerText(m_peer, MainGroup, key)));
    }

    void flag(const QByteArray &key, bool value)
    {
        same(key,
             value == bool(g_key_file_get_boolean(m_peer, MainGroup.constData(), key.constData(), nullptr)));
    }

    QByteArrayList differing;
    int values = 0;
    int otherOrder = 0;
    int unknownEscapes = 0;

private:
    void same(const QByteArray &key, bool equal)
    {
        ++values;
        if (!equal)
            differing.append(key);
    }

    GKeyFile *const m_peer;
    const QByteArrayList m_order;
};

void compareMainGroup(FileComparison &peer, const VelUIDesktopEntry &record)
{
    peer.text(MainGroup, "Type", record.getType());
    peer.text(MainGroup, "Name", record.getName());
    peer.text(MainGroup, "GenericName", record.getGenericName());
    peer.text(MainGroup, "Comment", record.getComment());
    peer.text(MainGroup, "Icon", record.getIcon());
    peer.text(MainGroup, "Exec", record.getExec());
    peer.text(MainGroup, "TryExec", record.getTryExec());
    peer.text(MainGroup, "Path", record.getPath());
    peer.text(MainGroup, "URL", record.getURL());
    peer.text(MainGroup, "StartupWMClass", record.getStartupWMClass());
    peer.text(MainGroup, "Version", record.getVersion());
    peer.localText(MainGroup, "Name", record.getLocalName());
    peer.localText(MainGroup, "GenericName", record.getLocalGenericName());
    peer.localText(MainGroup, "Comment", record.getLocalComment());
    peer.localText(MainGroup, "Icon", record.getLocalIcon());
    peer.list("Keywords", record.getKeywords());
    peer.list("Categories", record.getCategories());
    peer.list("MimeType", record.getMimeType());
    peer.list("OnlyShowIn", record.getOnlyShowIn());
    peer.list("NotShowIn", record.getNotShowIn());
    peer.flag("Terminal", record.getTerminal());
    peer.flag("NoDisplay", record.getNoDisplay());
    peer.flag("Hidden", record.getHidden());
    peer.flag("StartupNotify", record.getStartupNotify());
}

void compareActions(FileComparison &peer, const VelUIDesktopEntry &record)
{
    QStringList ids;
    for (const VelUIDesktopAction &action : record.getActions()) {
        ids.append(action.getId());
        const QByteArray group = "Desktop Action " + action.getId().toUtf8();
        peer.text(group, "Name", action.getName());
        peer.text(group, "Icon", action.getIcon());
        peer.text(group, "Exec", action.getExec());
        peer.localText(group, "Name", action.getLocalName());
    }
    peer.list("Actions", ids);
}

int differingLines(const QByteArray &before, const QByteArray &after)
{
    const QByteArrayList a = before.split('\n');
    const QByteArrayList b = after.split('\n');
    if (a.size() != b.size())
        return -1;
    int count = 0;
    for (int i = 0; i < a.size(); ++i)
        count += a[i] != b[i];
    return count;
}

} // namespace

void tst_DesktopEntryCorpus::initTestCase()
{
    const QDir packages(QStringLiteral("/var/lib/dpkg/info"));
    for (const QString &name : packages.entryList({QStringLiteral("*.list")})) {
        int languages = 0;
        for (const QByteArray &line : read(packages.filePath(name)).split('\n')) {
            const QString file = QFile::decodeName(line);
            const bool isEntry = line.endsWith(".desktop") || line.endsWith(".directory");
            if (!isEntry || !QFileInfo(file).isFile())
                continue;
            m_files.append(file);
            languages = qMax(languages, languagesOf(read(file)));
        }
        m_translatedPackages += languages >= ManyLanguages;
    }
    qInfo("%d entries, %d packages with %d languages or more", m_files.size(), m_translatedPackages,
          ManyLanguages);
    if (m_translatedPackages < EnoughPackages)
        QSKIP(
            "too few packages with translated desktop entries are installed; try kcharselect, kcolorchooser, "
            "kfloppy, kcalc, kruler, l3afpad, lxterminal, gkbd-capplet, mousepad, xdg-user-dirs-gtk");
}

void tst_DesktopEntryCorpus::givesTheValuesOfGKeyFile_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArrayList>("order");
    QTest::newRow("de") << QByteArray("de_DE.UTF-8") << QByteArrayList{"de_DE", "de"};
    QTest::newRow("pt_BR") << QByteArray("pt_BR.UTF-8") << QByteArrayList{"pt_BR", "pt"};
    QTest::newRow("zh_TW") << QByteArray("zh_TW.UTF-8") << QByteArrayList{"zh_TW", "zh"};
    QTest::newRow("sr@latin") << QByteArray("sr_RS.UTF-8@latin")
                              << QByteArrayList{"sr_RS@latin", "sr_RS", "sr@latin", "sr"};
    QTest::newRow("ca@valencia") << QByteArray("ca_ES.UTF-8@valencia")
                                 << QByteArrayList{"ca_ES@valencia", "ca_ES", "ca@valencia", "ca"};
    QTest::newRow("ja") << QByteArray("ja_JP.UTF-8") << QByteArrayList{"ja_JP", "ja"};
    QTest::newRow("C") << QByteArray("C") << QByteArrayList{"en"};
}

void tst_DesktopEntryCorpus::givesTheValuesOfGKeyFile()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArrayList, order);
    qputenv("LANG", locale);
    int values = 0;
    int otherOrder = 0;
    int unknownEscapes = 0;
    int refused = 0;
    for (const QString &path : m_files) {
        const KeyFile file = keyFile(path);
        if (!file) {
            ++refused;
            continue;
        }
        const VelUIDesktopEntry record(path);
        QCOMPARE(record.isValid(), bool(g_key_file_has_group(file.get(), MainGroup.constData())));
        FileComparison peer(file.get(), order);
        compareMainGroup(peer, record);
        compareActions(peer, record);
        QCOMPARE(record.getLocalKeywords(),
                 peerList(peerLocalText(file.get(), MainGroup, "Keywords", order)));
        QVERIFY2(peer.differing.isEmpty(), QFile::encodeName(path) + ": " + peer.differing.join(", "));
        values += peer.values;
        otherOrder += peer.otherOrder;
        unknownEscapes += peer.unknownEscapes;
    }
    qInfo("%d values compared; GKeyFile: %d in another order, %d unknown escapes, %d files refused", values,
          otherOrder, unknownEscapes, refused);
    QVERIFY(values > m_files.size());
    QVERIFY(refused * 50 < m_files.size());
}

void tst_DesktopEntryCorpus::leavesEveryFileUntouchedWhenNothingChanges()
{
    for (const QString &path : m_files) {
        const QByteArray bytes = read(path);
        const QString copy = write(QStringLiteral("x.desktop"), bytes);
        struct stat before;
        QCOMPARE(::stat(qPrintable(copy), &before), 0);
        VelUIDesktopEntry record(copy);
        record.setName(record.getName());
        record.setLocalName(record.getLocalName());
        record.setKeywords(record.getKeywords());
        record.setActions(record.getActions());
        QVERIFY(record.save());
        struct stat after;
        QCOMPARE(::stat(qPrintable(copy), &after), 0);
        QVERIFY(after.st_ino == before.st_ino && after.st_ctim.tv_nsec == before.st_ctim.tv_nsec);
        QVERIFY2(read(copy) == bytes, qPrintable(path));
    }
}

void tst_DesktopEntryCorpus::changesOneLineForOneKey()
{
    for (const QString &path : m_files) {
        const QByteArray bytes = read(path);
        const QString copy = write(QStringLiteral("x.desktop"), bytes);
        VelUIDesktopEntry record(copy);
        if (!record.isValid())
            continue;
        const bool had = !record.getName().isEmpty();
        record.setName(QStringLiteral("Changed"));
        QVERIFY(record.save());
        const QByteArray changed = read(copy);
        if (had)
            QVERIFY2(differingLines(bytes, changed) == 1, qPrintable(path));
        QCOMPARE(changed.count("\nName=Changed\n") + changed.count("\nName = Changed\n"), 1);
    }
}

void tst_DesktopEntryCorpus::changesOneLineForOneLocalKey()
{
    qputenv("LANG", "de_DE.UTF-8");
    int changed = 0;
    for (const QString &path : m_files) {
        const QByteArray bytes = read(path);
        const QString copy = write(QStringLiteral("x.desktop"), bytes);
        VelUIDesktopEntry record(copy);
        if (record.getLocalName().isEmpty())
            continue;
        record.setLocalName(QStringLiteral("Anders"));
        QVERIFY(record.save());
        QVERIFY2(differingLines(bytes, read(copy)) == 1, qPrintable(path));
        QCOMPARE(VelUIDesktopEntry(copy).getLocalName(), QStringLiteral("Anders"));
        ++changed;
    }
    QVERIFY(changed >= EnoughPackages);
}

VEL_TEST_GUILESS_MAIN(tst_DesktopEntryCorpus)

#include "tst_DesktopEntryCorpus.moc"
