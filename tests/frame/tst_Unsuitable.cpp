// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/Unsuitable.h>

/// The names of the codes against what the platform's records give.
class tst_Unsuitable : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void namesTheCodesOfTheRecords_data();
    void namesTheCodesOfTheRecords();
};

void tst_Unsuitable::namesTheCodesOfTheRecords_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<int>("code");
    const QByteArray application = "Type=Application\nName=a\n";
    QTest::newRow("no command") << application << Unsuitable::NoExec;
    QTest::newRow("no such program") << application + "Exec=/nowhere/program\n" << Unsuitable::ProgramMissing;
    QTest::newRow("no executable file") << application + "Exec=/etc/passwd\n"
                                        << Unsuitable::ProgramNotExecutable;
    QTest::newRow("program that PATH lacks") << application + "Exec=no-such-program-anywhere\n"
                                             << Unsuitable::ProgramNotInPath;
    QTest::newRow("no such TryExec") << application + "Exec=/bin/sh\nTryExec=/nowhere/program\n"
                                     << Unsuitable::TryExecMissing;
    QTest::newRow("TryExec that PATH lacks")
        << application + "Exec=/bin/sh\nTryExec=no-such-program-anywhere\n"
        << Unsuitable::TryExecNotInPath;
    QTest::newRow("link without a target") << QByteArray("Type=Link\nName=a\n") << Unsuitable::UrlMissing;
}

void tst_Unsuitable::namesTheCodesOfTheRecords()
{
    QFETCH(QByteArray, keys);
    VelUIDesktopEntry entry(write(QStringLiteral("a.desktop"), "[Desktop Entry]\n" + keys));
    QVERIFY(entry.load());
    VelUIDesktopEntry::SuitableError error = 0;
    QVERIFY(!entry.isSuitable(&error));
    QTEST(error, "code");
}

VEL_TEST_GUILESS_MAIN(tst_Unsuitable)

#include "tst_Unsuitable.moc"
