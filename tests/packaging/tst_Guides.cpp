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
    const QStringList names = guides.entryList({QStringLiteral("*.md")});
    QCOMPARE(names.size(),
             QDir(sourceDir + QStringLiteral("/examples")).entryList({QStringLiteral("*.cpp")}).size());
    for (const QString &name : names)
        QCOMPARE(read(guides.filePath(name)).count("```cpp\n"), 1);
}

VEL_TEST_GUILESS_MAIN(tst_Guides)

#include "tst_Guides.moc"
