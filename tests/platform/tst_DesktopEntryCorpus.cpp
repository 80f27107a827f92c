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
 * round; it takes the unlocalised value where there is no other, the record gives none; and it
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
    return peerHas(file, group, key) && peerText(file, group, key).isNull();
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

// How GKeyFile itself would choose; empty where it takes the unlocalised value.
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
    const QByteArray main = "Desktop Entry";
    int values = 0;
    int otherOrder = 0;
    int unknownEscapes = 0;
    int refused = 0;
    for (const QString &path : m_files) {
        const KeyFile peer = keyFile(path);
        const VelUIDesktopEntry record(path);
        if (!peer) {
            ++refused;
            continue;
        }
        QCOMPARE(record.isValid(), bool(g_key_file_has_group(peer.get(), main.constData())));

        const auto compare = [&](const QByteArray &group, const QByteArray &key, const QString &value) {
            if (peerCannotRead(peer.get(), group, key)) {
                ++unknownEscapes;
                return true;
            }
            ++values;
            return value == peerText(peer.get(), group, key);
        };
        const auto compareLocal = [&](const QByteArray &group, const QByteArray &key, const QString &value) {
            const QByteArray chosen = peerLocale(peer.get(), group, key, order.constFirst());
            const QString expected = peerLocalText(peer.get(), group, key, order);
            ++values;
            // Where GKeyFile chooses otherwise it is for its own order alone.
            if (!chosen.isEmpty() && expected != peerText(peer.get(), group, key + '[' + chosen + ']')) {
                ++otherOrder;
                if (!chosen.contains('@') || order.size() < 4)
                    return false;
            }
            return value == expected;
        };
        const auto list = [&](const QByteArray &key) { return peerList(peerText(peer.get(), main, key)); };
        const auto flag = [&](const QByteArray &key) {
            return bool(g_key_file_get_boolean(peer.get(), main.constData(), key.constData(), nullptr));
        };

        QVERIFY2(compare(main, "Type", record.getType()), qPrintable(path));
        QVERIFY2(compare(main, "Name", record.getName()), qPrintable(path));
        QVERIFY2(compare(main, "GenericName", record.getGenericName()), qPrintable(path));
        QVERIFY2(compare(main, "Comment", record.getComment()), qPrintable(path));
        QVERIFY2(compare(main, "Icon", record.getIcon()), qPrintable(path));
        QVERIFY2(compare(main, "Exec", record.getExec()), qPrintable(path));
        QVERIFY2(compare(main, "TryExec", record.getTryExec()), qPrintable(path));
        QVERIFY2(compare(main, "Path", record.getPath()), qPrintable(path));
        QVERIFY2(compare(main, "URL", record.getURL()), qPrintable(path));
        QVERIFY2(compare(main, "StartupWMClass", record.getStartupWMClass()), qPrintable(path));
        QVERIFY2(compare(main, "Version", record.getVersion()), qPrintable(path));
        QVERIFY2(compareLocal(main, "Name", record.getLocalName()), qPrintable(path));
        QVERIFY2(compareLocal(main, "GenericName", record.getLocalGenericName()), qPrintable(path));
        QVERIFY2(compareLocal(main, "Comment", record.getLocalComment()), qPrintable(path));
        QVERIFY2(compareLocal(main, "Icon", record.getLocalIcon()), qPrintable(path));
        QCOMPARE(record.getLocalKeywords(), peerList(peerLocalText(peer.get(), main, "Keywords", order)));
        QCOMPARE(record.getKeywords(), list("Keywords"));
        QCOMPARE(record.getCategories(), list("Categories"));
        QCOMPARE(record.getMimeType(), list("MimeType"));
        QCOMPARE(record.getOnlyShowIn(), list("OnlyShowIn"));
        QCOMPARE(record.getNotShowIn(), list("NotShowIn"));
        QCOMPARE(record.getTerminal(), flag("Terminal"));
        QCOMPARE(record.getNoDisplay(), flag("NoDisplay"));
        QCOMPARE(record.getHidden(), flag("Hidden"));
        QCOMPARE(record.getStartupNotify(), flag("StartupNotify"));

        QStringList ids;
        for (const VelUIDesktopAction &action : record.getActions()) {
            ids.append(action.getId());
            const QByteArray group = "Desktop Action " + action.getId().toUtf8();
            QVERIFY2(compare(group, "Name", action.getName()), qPrintable(path));
            QVERIFY2(compare(group, "Icon", action.getIcon()), qPrintable(path));
            QVERIFY2(compare(group, "Exec", action.getExec()), qPrintable(path));
            QVERIFY2(compareLocal(group, "Name", action.getLocalName()), qPrintable(path));
        }
        QCOMPARE(ids, list("Actions"));
    }
    qInfo(
        "%d values compared, %d chosen in the standard's order, %d with escapes that GKeyFile does not know, "
        "%d files that it refuses as a whole",
        values, otherOrder, unknownEscapes, refused);
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
