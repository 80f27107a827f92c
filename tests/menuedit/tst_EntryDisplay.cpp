// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>
#include <menuedit/EntryDisplay.h>

class tst_EntryDisplay : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void composesTheName_data();
    void composesTheName();
    void hidesWhatIsDeletedOrMeantForOthers_data();
    void hidesWhatIsDeletedOrMeantForOthers();

private:
    VelUIDesktopEntry entry(const QByteArray &keys);
};

VelUIDesktopEntry tst_EntryDisplay::entry(const QByteArray &keys)
{
    return VelUIDesktopEntry(
        write(QStringLiteral("a.desktop"), "[Desktop Entry]\nType=Application\n" + keys));
}

void tst_EntryDisplay::composesTheName_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<QString>("expected");
    QTest::newRow("translated name alone") << QByteArray("Name[en]=Local\n") << QStringLiteral("Local");
    QTest::newRow("translated name wins")
        << QByteArray("Name=Plain\nName[en]=Local\nGenericName[en]=Kind\n") << QStringLiteral("Local");
    QTest::newRow("untranslated") << QByteArray("Name=Plain\n") << QStringLiteral("Plain");
    QTest::newRow("untranslated and kind")
        << QByteArray("Name=Plain\nGenericName[en]=Kind\n") << QStringLiteral("Plain Kind");
    QTest::newRow("untranslated kind does not count")
        << QByteArray("Name=Plain\nGenericName=Kind\n") << QStringLiteral("Plain");
    QTest::newRow("kind alone") << QByteArray("GenericName[en]=Kind\n") << QStringLiteral(" Kind");
    QTest::newRow("nothing") << QByteArray() << QString();
}

void tst_EntryDisplay::composesTheName()
{
    QFETCH(QByteArray, keys);
    QFETCH(QString, expected);

    QCOMPARE(EntryDisplay::shownName(entry(keys)), expected);
}

void tst_EntryDisplay::hidesWhatIsDeletedOrMeantForOthers_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<bool>("hidden");
    QTest::newRow("plain") << QByteArray("Name=A\nExec=true\n") << false;
    QTest::newRow("deleted") << QByteArray("Hidden=true\n") << true;
    QTest::newRow("deleted and not displayed") << QByteArray("Hidden=true\nNoDisplay=true\n") << true;
    QTest::newRow("not displayed") << QByteArray("NoDisplay=true\n") << false;
    QTest::newRow("not displayed and for others")
        << QByteArray("NoDisplay=true\nOnlyShowIn=OTHER;\n") << false;
    QTest::newRow("for others") << QByteArray("OnlyShowIn=OTHER;\n") << true;
    QTest::newRow("not for this desktop") << QByteArray("NotShowIn=VEL;\n") << true;
    QTest::newRow("program missing") << QByteArray("TryExec=/missing/program\n") << false;
    QTest::newRow("nothing") << QByteArray() << false;
}

void tst_EntryDisplay::hidesWhatIsDeletedOrMeantForOthers()
{
    QFETCH(QByteArray, keys);
    QFETCH(bool, hidden);
    qputenv("XDG_CURRENT_DESKTOP", "VEL");

    QCOMPARE(EntryDisplay::isHidden(entry(keys)), hidden);
}

VEL_TEST_GUILESS_MAIN(tst_EntryDisplay)

#include "tst_EntryDisplay.moc"
