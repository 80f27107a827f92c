// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>

namespace {

const QString sourceDir = QStringLiteral(VEL_SOURCE_DIR);

// A folder of the house and the folders whose files its own may include. A folder may always
// include its own files; "include" stands for the public headers, "platform" for the public
// headers of all three platform libraries.
struct Rule
{
    const char *folder;
    QStringList allowed;
};

const QVector<Rule> &rules()
{
    static const auto text = [](const char *list) {
        return QString::fromLatin1(list).split(QLatin1Char(' '));
    };
    static const QVector<Rule> all{
        {"platform/rules", {}},
        {"platform/velcore", {}},
        {"platform/veluiaux", text("platform/rules platform/velcore/include")},
        {"platform/velintegration",
         text("platform/rules platform/velcore/include platform/veluiaux/include")},
        {"platform/programs", text("platform platform/rules")},
        {"include", {}},
        {"src/frame", text("platform")},
        {"src/settings", text("include")},
        {"src/widgets", text("include")},
        {"src/icons", text("include src/frame platform")},
        {"src/shortcuts", text("include src/frame platform")},
        {"src/desktopentry", text("include src/frame platform")},
        {"src/menuedit", text("include src/frame platform")},
        {"apps", text("include platform")},
        {"designer", text("include")},
        {"examples", text("include platform")},
    };
    return all;
}

// Which subsystem a public header belongs to. Across subsystems only these arrows exist, and only
// from a .cpp file: the menu view opens the entry editor, the entry editor opens the menu dialog,
// and the menu model shows the icons of the provider.
struct Door
{
    const char *from;
    const char *header;
};

const Door doors[] = {
    {"src/menuedit", "VelDesktopEntryEditDialog.h"},
    {"src/desktopentry", "VelMenuDialog.h"},
    {"src/menuedit", "VelMimeTypeIconProvider.h"},
};

// A program that makes no window may link the internal objects, for the rules alone.
struct RuleHeader
{
    const char *program;
    const char *header;
};

const RuleHeader ruleHeaders[] = {
    {"apps/vel-menuprint", "src/menuedit/SortOrder.h"},
    {"apps/vel-menuprint", "src/menuedit/ItemOrder.h"},
    {"apps/vel-menuprint", "src/menuedit/EntryDisplay.h"},
    {"apps/vel-menuprint", "src/frame/EntryPath.h"},
    {"apps/vel-menuprint", "src/frame/DesktopEntryRecord.h"},
};

QString subsystemOf(const QString &publicHeader)
{
    const QString source = QFileInfo(publicHeader).completeBaseName();
    for (const Rule &rule : rules()) {
        const QString folder = QString::fromLatin1(rule.folder);
        if (folder.startsWith(QLatin1String("src/"))
            && QFile::exists(sourceDir + QLatin1Char('/') + folder + QLatin1Char('/') + source
                             + QStringLiteral(".cpp")))
            return folder;
    }
    return QString();
}

struct Include
{
    QString file; // of ours, relative to the source folder; empty for what is not ours
    QString written;
    int line;
};

QString relative(const QString &path)
{
    return QDir(sourceDir).relativeFilePath(QDir::cleanPath(path));
}

// The file of ours that an include names, tried in the order in which the compiler would.
QString resolve(const QString &includer, const QString &written)
{
    QStringList candidates{QFileInfo(includer).absolutePath(), sourceDir + QStringLiteral("/src"),
                           sourceDir + QStringLiteral("/include"), sourceDir + QStringLiteral("/apps")};
    candidates << sourceDir + QStringLiteral("/platform/rules");
    for (const char *library : {"velcore", "veluiaux", "velintegration"}) {
        candidates << sourceDir + QStringLiteral("/platform/%1/include").arg(QLatin1String(library))
                   << sourceDir + QStringLiteral("/platform/%1").arg(QLatin1String(library));
    }
    for (const QString &candidate : qAsConst(candidates)) {
        const QString path = candidate + QLatin1Char('/') + written;
        if (QFileInfo(path).isFile())
            return relative(path);
    }
    return QString();
}

QVector<Include> includesOf(const QString &path)
{
    QVector<Include> includes;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return includes;
    static const QRegularExpression pattern(QStringLiteral("^\\s*#\\s*include\\s*[<\"]([^>\"]+)[>\"]"));
    int number = 0;
    while (!file.atEnd()) {
        ++number;
        const QRegularExpressionMatch match = pattern.match(QString::fromUtf8(file.readLine()));
        if (match.hasMatch())
            includes.append({resolve(path, match.captured(1)), match.captured(1), number});
    }
    return includes;
}

QStringList sourcesBelow(const QString &folder)
{
    QStringList files;
    QDirIterator iterator(sourceDir + QLatin1Char('/') + folder,
                          {QStringLiteral("*.h"), QStringLiteral("*.cpp"), QStringLiteral("*.c")},
                          QDir::Files, QDirIterator::Subdirectories);
    while (iterator.hasNext())
        files.append(iterator.next());
    files.sort();
    return files;
}

bool isBelow(const QString &file, const QString &folder)
{
    return file.startsWith(folder + QLatin1Char('/'));
}

bool isPlatformHeader(const QString &file)
{
    return file.startsWith(QLatin1String("platform/"))
        && file.section(QLatin1Char('/'), 2, 2) == QLatin1String("include");
}

bool isAllowedFolder(const Rule &rule, const QString &file)
{
    if (isBelow(file, QString::fromLatin1(rule.folder)))
        return true;
    for (const QString &folder : rule.allowed) {
        if (folder == QLatin1String("platform") ? isPlatformHeader(file) : isBelow(file, folder))
            return true;
    }
    return false;
}

bool isOpenDoor(const QString &folder, const QString &includer, const QString &header)
{
    if (subsystemOf(header) == folder)
        return true;
    if (!includer.endsWith(QLatin1String(".cpp")))
        return false;
    for (const Door &door : doors) {
        if (folder == QLatin1String(door.from)
            && header == QLatin1String("include/") + QLatin1String(door.header))
            return true;
    }
    return false;
}

bool isRuleHeader(const QString &includer, const QString &header)
{
    for (const RuleHeader &rule : ruleHeaders) {
        if (isBelow(includer, QString::fromLatin1(rule.program)) && header == QLatin1String(rule.header))
            return true;
    }
    return false;
}

} // namespace

// Reads every #include line of the project and compares it with who may include whom.
class tst_IncludeRules : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void everyArrowIsAllowed_data();
    void everyArrowIsAllowed();
    void everySourceFolderHasARule();
    void platformCoreKnowsNoQt();
    void recordsAreReachedThroughTheirInterface();
    void reportsAnArrowThatIsNotAllowed();
};

void tst_IncludeRules::everyArrowIsAllowed_data()
{
    QTest::addColumn<int>("index");
    for (int i = 0; i < rules().size(); ++i)
        QTest::newRow(rules().at(i).folder) << i;
}

void tst_IncludeRules::everyArrowIsAllowed()
{
    QFETCH(int, index);
    const Rule &rule = rules().at(index);
    const QString folder = QString::fromLatin1(rule.folder);
    QStringList wrong;
    for (const QString &path : sourcesBelow(folder)) {
        const QString includer = relative(path);
        for (const Include &include : includesOf(path)) {
            if (include.file.isEmpty())
                continue;
            bool allowed = isAllowedFolder(rule, include.file) || isRuleHeader(includer, include.file);
            if (allowed && isBelow(include.file, QStringLiteral("include"))
                && folder.startsWith(QLatin1String("src/")))
                allowed = isOpenDoor(folder, includer, include.file);
            if (!allowed)
                wrong.append(
                    QStringLiteral("%1:%2 includes %3").arg(includer).arg(include.line).arg(include.file));
        }
    }
    QVERIFY2(wrong.isEmpty(), qPrintable(wrong.join(QLatin1Char('\n'))));
}

void tst_IncludeRules::everySourceFolderHasARule()
{
    for (const QString &parent : {QStringLiteral("src"), QStringLiteral("platform")}) {
        const QStringList folders =
            QDir(sourceDir + QLatin1Char('/') + parent).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
        QVERIFY(!folders.isEmpty());
        for (const QString &name : folders) {
            const QString folder = parent + QLatin1Char('/') + name;
            if (sourcesBelow(folder).isEmpty())
                continue;
            const auto isThisFolder = [&folder](const Rule &rule) {
                return folder == QLatin1String(rule.folder);
            };
            QVERIFY2(std::any_of(rules().begin(), rules().end(), isThisFolder), qPrintable(folder));
        }
    }
}

void tst_IncludeRules::platformCoreKnowsNoQt()
{
    const QStringList files = sourcesBelow(QStringLiteral("platform/velcore"));
    QVERIFY(!files.isEmpty());
    for (const QString &path : files) {
        for (const Include &include : includesOf(path))
            QVERIFY2(!include.written.startsWith(QLatin1Char('Q')),
                     qPrintable(relative(path) + include.written));
    }
}

void tst_IncludeRules::recordsAreReachedThroughTheirInterface()
{
    for (const QString &path : sourcesBelow(QStringLiteral("src"))) {
        if (isBelow(relative(path), QStringLiteral("src/frame")))
            continue;
        for (const Include &include : includesOf(path))
            QVERIFY2(!include.written.startsWith(QLatin1String("veluiaux/VelUIDesktop")),
                     qPrintable(relative(path)));
    }
}

void tst_IncludeRules::reportsAnArrowThatIsNotAllowed()
{
    const auto rule = std::find_if(rules().begin(), rules().end(),
                                   [](const Rule &each) { return !qstrcmp(each.folder, "src/menuedit"); });
    QVERIFY(rule != rules().end());
    QVERIFY(isAllowedFolder(*rule, QStringLiteral("src/frame/DesktopEntryRecord.h")));
    QVERIFY(isAllowedFolder(*rule, QStringLiteral("platform/velcore/include/velcore/dirs.h")));
    QVERIFY(!isAllowedFolder(*rule, QStringLiteral("platform/velcore/environment.h")));
    QVERIFY(!isAllowedFolder(*rule, QStringLiteral("src/desktopentry/FormLayout.h")));
    QVERIFY(!isOpenDoor(QStringLiteral("src/menuedit"), QStringLiteral("src/menuedit/VelMenuView.h"),
                        QStringLiteral("include/VelDesktopEntryEditDialog.h")));
    QVERIFY(isOpenDoor(QStringLiteral("src/menuedit"), QStringLiteral("src/menuedit/VelMenuView.cpp"),
                       QStringLiteral("include/VelDesktopEntryEditDialog.h")));
    QVERIFY(!isOpenDoor(QStringLiteral("src/desktopentry"), QStringLiteral("src/desktopentry/FormLayout.cpp"),
                        QStringLiteral("include/VelDesktopEntryEditDialog2.h")));
}

VEL_TEST_GUILESS_MAIN(tst_IncludeRules)

#include "tst_IncludeRules.moc"
