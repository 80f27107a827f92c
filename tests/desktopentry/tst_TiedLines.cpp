// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/fields/TiedLines.h>

#include <QLineEdit>
#include <QSignalSpy>

using namespace FormDriving;
using namespace VelUI;

namespace {

// Two lines that hold a text each.
struct Lines
{
    Lines(const QString &first, const QString &second)
        : tie(&base, &local)
    {
        base.setText(first);
        local.setText(second);
    }

    QLineEdit base;
    QLineEdit local;
    TiedLines tie;
};

} // namespace

class tst_TiedLines : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void carriesWhatIsTyped_data();
    void carriesWhatIsTyped();
    void staysTiedThroughAnEmptyLine();
    void endsWhenTheSecondLineIsEdited();
    void beginsAgainWithTheSameText();
    void carriesNoTextThatAProgramSets();
    void tellsOfNoEditInTheSecondLine();
};

void tst_TiedLines::carriesWhatIsTyped_data()
{
    QTest::addColumn<QString>("first");
    QTest::addColumn<QString>("second");
    QTest::addColumn<QString>("carried");
    QTest::newRow("the same text") << QStringLiteral("a") << QStringLiteral("a") << QStringLiteral("ax");
    QTest::newRow("another text") << QStringLiteral("a") << QStringLiteral("b") << QStringLiteral("b");
    QTest::newRow("two empty lines") << QString() << QString() << QString();
    QTest::newRow("an empty second line") << QStringLiteral("a") << QString() << QString();
}

void tst_TiedLines::carriesWhatIsTyped()
{
    QFETCH(QString, first);
    QFETCH(QString, second);
    QFETCH(QString, carried);
    Lines lines(first, second);
    QTest::keyClick(&lines.base, Qt::Key_X);
    QCOMPARE(lines.local.text(), carried);
}

void tst_TiedLines::staysTiedThroughAnEmptyLine()
{
    Lines lines(QStringLiteral("old"), QStringLiteral("old"));
    retype(&lines.base, QStringLiteral("new"));
    QCOMPARE(lines.local.text(), QStringLiteral("new"));
}

void tst_TiedLines::endsWhenTheSecondLineIsEdited()
{
    Lines lines(QStringLiteral("a"), QStringLiteral("a"));
    QTest::keyClick(&lines.local, Qt::Key_L);
    QTest::keyClick(&lines.base, Qt::Key_X);
    QCOMPARE(lines.local.text(), QStringLiteral("al"));
}

void tst_TiedLines::beginsAgainWithTheSameText()
{
    Lines lines(QStringLiteral("a"), QStringLiteral("a"));
    QTest::keyClick(&lines.local, Qt::Key_L);
    QTest::keyClick(&lines.local, Qt::Key_Backspace);
    QTest::keyClick(&lines.base, Qt::Key_X);
    QCOMPARE(lines.local.text(), QStringLiteral("ax"));
}

void tst_TiedLines::carriesNoTextThatAProgramSets()
{
    Lines lines(QStringLiteral("a"), QStringLiteral("a"));
    lines.base.setText(QStringLiteral("b"));
    QCOMPARE(lines.local.text(), QStringLiteral("a"));
    QTest::keyClick(&lines.base, Qt::Key_X);
    QCOMPARE(lines.local.text(), QStringLiteral("a"));
}

void tst_TiedLines::tellsOfNoEditInTheSecondLine()
{
    Lines lines(QStringLiteral("a"), QStringLiteral("a"));
    const QSignalSpy edited(&lines.local, &QLineEdit::textEdited);
    QTest::keyClick(&lines.base, Qt::Key_X);
    QCOMPARE(edited.count(), 0);
}

VEL_TEST_MAIN(tst_TiedLines)

#include "tst_TiedLines.moc"
