// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>

namespace {

const QString sourceDir = QStringLiteral(VEL_SOURCE_DIR);

// The program without its license lines, as a guide shows it.
QByteArray programOf(const QByteArray &source)
{
    return source.mid(source.indexOf("\n\n") + 2);
}

} // namespace

// The guides show the programs that are compiled, whole and to the letter.
class tst_Guides : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showEveryExample_data();
    void showEveryExample();
    void showNothingElse();
};

void tst_Guides::showEveryExample_data()
{
    QTest::addColumn<QString>("example");
    for (const QString &name :
         QDir(sourceDir + QStringLiteral("/examples")).entryList({QStringLiteral("*.cpp")}))
        QTest::newRow(qPrintable(name)) << name;
}

void tst_Guides::showEveryExample()
{
    QFETCH(QString, example);
    const QByteArray block =
        "```cpp\n" + programOf(read(sourceDir + QStringLiteral("/examples/") + example)) + "```\n";
    const QDir guides(sourceDir + QStringLiteral("/docs/guides"));
    int shown = 0;
    for (const QString &guide : guides.entryList({QStringLiteral("*.md")}))
        shown += read(guides.filePath(guide)).contains(block) ? 1 : 0;
    QCOMPARE(shown, 1);
}

void tst_Guides::showNothingElse()
{
    const QDir guides(sourceDir + QStringLiteral("/docs/guides"));
    int programs = 0;
    for (const QString &name : guides.entryList({QStringLiteral("*.md")})) {
        const int inThis = read(guides.filePath(name)).count("```cpp\n");
        // A guide for users has none.
        QVERIFY2(inThis <= 1, qPrintable(name));
        programs += inThis;
    }
    QCOMPARE(programs,
             QDir(sourceDir + QStringLiteral("/examples")).entryList({QStringLiteral("*.cpp")}).size());
}

VEL_TEST_GUILESS_MAIN(tst_Guides)

#include "tst_Guides.moc"
