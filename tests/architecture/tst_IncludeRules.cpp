// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HouseRules.h"
#include "SourceFiles.h"
#include "TestCase.h"

#include <QDir>

namespace {

bool isPublicHeader(const QString &file)
{
    return SourceFiles::isBelow(file, QStringLiteral("include"));
}

// The public header of one subsystem is included in another through a door alone.
bool isAllowedHeader(const HouseRules &rules, const QString &folder, const QString &includer,
                     const QString &header)
{
    const bool isOwn = SourceFiles::isBelow(SourceFiles::unitOf(header), folder);
    return isOwn || rules.isDoor(includer, header);
}

bool isAllowed(const HouseRules &rules, const QString &folder, const QString &includer, const QString &file)
{
    if (rules.isRuleHeader(includer, file))
        return true;
    if (folder.startsWith(QLatin1String("src/")) && isPublicHeader(file))
        return isAllowedHeader(rules, folder, includer, file);
    return rules.allowsFolder(folder, file);
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
    void everyWordOfTheTableIsUnderstood();
    void platformCoreKnowsNoQt();
    void recordsAreReachedThroughTheirInterface();
    void reportsAnArrowThatIsNotAllowed();
    void reportsAWordThatIsNotUnderstood();
};

void tst_IncludeRules::everyArrowIsAllowed_data()
{
    QTest::addColumn<QString>("folder");
    for (const QString &folder : HouseRules::inForce().folders())
        QTest::newRow(qPrintable(folder)) << folder;
}

void tst_IncludeRules::everyArrowIsAllowed()
{
    QFETCH(QString, folder);
    const QStringList files = SourceFiles::below(folder);
    QVERIFY(!files.isEmpty());
    QStringList wrong;
    for (const QString &includer : files) {
        for (const SourceFiles::Include &include : SourceFiles::includesOf(includer)) {
            if (!include.file.isEmpty() && !isAllowed(HouseRules::inForce(), folder, includer, include.file))
                wrong.append(
                    QStringLiteral("%1:%2 includes %3").arg(includer).arg(include.line).arg(include.file));
        }
    }
    QVERIFY2(wrong.isEmpty(), qPrintable(wrong.join(QLatin1Char('\n'))));
}

void tst_IncludeRules::everySourceFolderHasARule()
{
    const QStringList ruled = HouseRules::inForce().folders();
    for (const QString &parent : {QStringLiteral("src"), QStringLiteral("platform")}) {
        const QStringList folders =
            QDir(SourceFiles::absolute(parent)).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
        QVERIFY(!folders.isEmpty());
        for (const QString &name : folders) {
            const QString folder = parent + QLatin1Char('/') + name;
            if (!SourceFiles::below(folder).isEmpty())
                QVERIFY2(ruled.contains(folder), qPrintable(folder));
        }
    }
    for (const char *folder : {"include", "apps", "examples", "designer"})
        QVERIFY2(ruled.contains(QLatin1String(folder)), folder);
}

void tst_IncludeRules::everyWordOfTheTableIsUnderstood()
{
    const QStringList errors = HouseRules::inForce().errors();
    QVERIFY2(errors.isEmpty(), qPrintable(errors.join(QLatin1Char('\n'))));
}

void tst_IncludeRules::platformCoreKnowsNoQt()
{
    const QStringList files = SourceFiles::below(QStringLiteral("platform/velcore"));
    QVERIFY(!files.isEmpty());
    for (const QString &file : files) {
        for (const SourceFiles::Include &include : SourceFiles::includesOf(file))
            QVERIFY2(!include.written.startsWith(QLatin1Char('Q')), qPrintable(file + include.written));
    }
}

void tst_IncludeRules::recordsAreReachedThroughTheirInterface()
{
    for (const QString &file : SourceFiles::below(QStringLiteral("src"))) {
        if (SourceFiles::isBelow(file, QStringLiteral("src/frame")))
            continue;
        for (const SourceFiles::Include &include : SourceFiles::includesOf(file))
            QVERIFY2(!include.written.startsWith(QLatin1String("veluiaux/VelUIDesktop")), qPrintable(file));
    }
}

void tst_IncludeRules::reportsAnArrowThatIsNotAllowed()
{
    const HouseRules &rules = HouseRules::inForce();
    const QString menuedit = QStringLiteral("src/menuedit");
    const QString view = QStringLiteral("src/menuedit/VelMenuView.cpp");
    QVERIFY(isAllowed(rules, menuedit, view, QStringLiteral("src/frame/DesktopEntryRecord.h")));
    QVERIFY(isAllowed(rules, menuedit, view, QStringLiteral("platform/velcore/include/velcore/dirs.h")));
    QVERIFY(!isAllowed(rules, menuedit, view, QStringLiteral("platform/velcore/environment.h")));
    QVERIFY(!isAllowed(rules, menuedit, view, QStringLiteral("src/desktopentry/FormLayout.h")));
    QVERIFY(isAllowed(rules, menuedit, view, QStringLiteral("include/VelMenuView.h")));
    QVERIFY(isAllowed(rules, menuedit, view, QStringLiteral("include/VelDesktopEntryEditDialog.h")));
    QVERIFY(!isAllowed(rules, menuedit, QStringLiteral("src/menuedit/VelMenuView.h"),
                       QStringLiteral("include/VelDesktopEntryEditDialog.h")));
    QVERIFY(!isAllowed(rules, menuedit, view, QStringLiteral("include/EditShortcutsDialog.h")));
    QVERIFY(!isAllowed(rules, QStringLiteral("apps"), QStringLiteral("apps/vel-gallery/main.cpp"),
                       QStringLiteral("src/menuedit/SortOrder.h")));
}

void tst_IncludeRules::reportsAWordThatIsNotUnderstood()
{
    const HouseRules rules(QStringLiteral("| folder | is | may include |\n|---|---|---|\n"
                                          "| `src/a`, `src/b` | two | frame, cellar |\n"));
    QCOMPARE(rules.folders(), (QStringList{QStringLiteral("src/a"), QStringLiteral("src/b")}));
    QCOMPARE(rules.errors().size(), 1);
    QVERIFY(rules.allowsFolder(QStringLiteral("src/b"), QStringLiteral("src/frame/x.h")));
    QVERIFY(!rules.allowsFolder(QStringLiteral("src/b"), QStringLiteral("src/cellar/x.h")));
}

VEL_TEST_GUILESS_MAIN(tst_IncludeRules)

#include "tst_IncludeRules.moc"
