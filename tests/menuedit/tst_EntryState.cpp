// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"
#include <frame/DesktopEntryRecord.h>
#include <menuedit/EntryState.h>

Q_DECLARE_METATYPE(EntryState::Kind)

/// Whether the menu shows an entry, and what changes that.
class tst_EntryState : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsWhatKeepsAnEntryOut_data();
    void tellsWhatKeepsAnEntryOut();
    void hidesByOneMark();
    void showsAgainWhateverHidIt_data();
    void showsAgainWhateverHidIt();
    void failsWhereNothingCanBeWritten();

private:
    QString entry(const QByteArray &more)
    {
        return write(QStringLiteral("a.desktop"), "[Desktop Entry]\nType=Application\nExec=true\n" + more);
    }
};

void tst_EntryState::tellsWhatKeepsAnEntryOut_data()
{
    using Kind = EntryState::Kind;
    QTest::addColumn<QByteArray>("more");
    QTest::addColumn<Kind>("kind");
    QTest::addColumn<QString>("text");
    QTest::newRow("shown") << QByteArray("Name=A\n") << Kind::Shown << QString();
    QTest::newRow("only a local name") << QByteArray("Name[en]=A\n") << Kind::Shown << QString();
    QTest::newRow("deleted") << QByteArray("Name=A\nHidden=true\nNoDisplay=true\n") << Kind::Deleted
                             << QStringLiteral("Not in the menu: it is marked as deleted (Hidden).");
    QTest::newRow("not displayed") << QByteArray("Name=A\nNoDisplay=true\n") << Kind::NotDisplayed
                                   << QStringLiteral(
                                          "Not in the menu: it is marked not to be displayed (NoDisplay).");
    QTest::newRow("only elsewhere")
        << QByteArray("Name=A\nOnlyShowIn=GNOME;Unity;\n") << Kind::ForOtherDesktops
        << QStringLiteral("Not in the menu: it is meant for other desktops only (GNOME, Unity).");
    QTest::newRow("not here") << QByteArray("Name=A\nNotShowIn=VEL;\n") << Kind::ForOtherDesktops
                              << QStringLiteral("Not in the menu: it is not meant for this desktop.");
    QTest::newRow("not installed")
        << QByteArray("Name=A\nTryExec=/no/such\n") << Kind::NotInstalled
        << QStringLiteral("Not in the menu: the program /no/such is not installed (TryExec).");
    QTest::newRow("nameless") << QByteArray() << Kind::Nameless
                              << QStringLiteral("This entry has no name. The name of its file is shown.");
}

void tst_EntryState::tellsWhatKeepsAnEntryOut()
{
    QFETCH(QByteArray, more);
    QFETCH(EntryState::Kind, kind);
    QFETCH(QString, text);
    const QString path = entry(more);
    QCOMPARE(EntryState::of(VelUIDesktopEntry(path)), kind);
    QCOMPARE(EntryState::explanation(path), text);

    const QString malformed = write(QStringLiteral("b.desktop"), "Name=A\n");
    QCOMPARE(EntryState::of(VelUIDesktopEntry(malformed)), EntryState::Kind::Malformed);
    QCOMPARE(EntryState::explanation(malformed),
             QStringLiteral("This file is not a desktop entry, whatever its name says."));
}

void tst_EntryState::hidesByOneMark()
{
    const QString path = entry("Name=A\n# kept\n");
    const QByteArray before = read(path);
    QVERIFY(EntryState::hide(path));
    QCOMPARE(read(path),
             QByteArray("[Desktop Entry]\nType=Application\nExec=true\nName=A\nNoDisplay=true\n# kept\n"));
    QVERIFY(EntryState::showAgain(path));
    QCOMPARE(EntryState::of(VelUIDesktopEntry(path)), EntryState::Kind::Shown);
    QVERIFY(before != read(path)); // the mark stays, as "false"
}

void tst_EntryState::showsAgainWhateverHidIt_data()
{
    QTest::addColumn<QByteArray>("more");
    for (const char *more :
         {"Hidden=true\n", "NoDisplay=true\n", "Hidden=true\nNoDisplay=true\nOnlyShowIn=GNOME;\n",
          "OnlyShowIn=GNOME;\n", "NotShowIn=VEL;GNOME;\n", "OnlyShowIn=GNOME;\nNotShowIn=VEL;\n"})
        QTest::newRow(more) << QByteArray(more);
}

void tst_EntryState::showsAgainWhateverHidIt()
{
    QFETCH(QByteArray, more);
    const QString path = entry("Name=A\n" + more);
    QVERIFY(EntryState::of(VelUIDesktopEntry(path)) != EntryState::Kind::Shown);
    QVERIFY(EntryState::showAgain(path));
    QCOMPARE(EntryState::of(VelUIDesktopEntry(path)), EntryState::Kind::Shown);
}

void tst_EntryState::failsWhereNothingCanBeWritten()
{
    QVERIFY(!EntryState::hide(path(QStringLiteral("none/a.desktop"))));
}

VEL_TEST_GUILESS_MAIN(tst_EntryState)
#include "tst_EntryState.moc"
