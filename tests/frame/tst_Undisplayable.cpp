// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/Undisplayable.h>

/// The names of the codes against what the platform's records give.
class tst_Undisplayable : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void namesTheCodesOfTheRecords_data();
    void namesTheCodesOfTheRecords();
};

void tst_Undisplayable::namesTheCodesOfTheRecords_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<int>("code");
    const QByteArray notInstalled = "TryExec=no-such-program-anywhere\n";
    const QByteArray elsewhere = "OnlyShowIn=NoSuchDesktop;\n" + notInstalled;
    QTest::newRow("deleted") << "Hidden=true\nNoDisplay=true\n" + elsewhere << Undisplayable::Hidden;
    QTest::newRow("in no menu") << "NoDisplay=true\n" + elsewhere << Undisplayable::NoDisplay;
    QTest::newRow("for another desktop") << elsewhere << Undisplayable::ForOtherDesktops;
    QTest::newRow("not installed") << notInstalled << Undisplayable::NotInstalled;
}

void tst_Undisplayable::namesTheCodesOfTheRecords()
{
    QFETCH(QByteArray, keys);
    VelUIDesktopEntry entry(write(QStringLiteral("a.desktop"),
                                  "[Desktop Entry]\nType=Application\nName=a\nExec=/bin/sh\n" + keys));
    QVERIFY(entry.load());
    VelUIDesktopEntry::DisplayableError error = 0;
    QVERIFY(!entry.isDisplayable(&error));
    QTEST(error, "code");
}

VEL_TEST_GUILESS_MAIN(tst_Undisplayable)

#include "tst_Undisplayable.moc"
