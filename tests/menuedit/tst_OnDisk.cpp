// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/OnDisk.h>

#include <QFile>

class tst_OnDisk : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void tellsWhetherThereIsAnything_data();
    void tellsWhetherThereIsAnything();
};

void tst_OnDisk::init()
{
    TestCase::init();
    write(QStringLiteral("file"), "");
    write(QStringLiteral("folder/.hidden"), "");
    for (const char *target : {"file", "folder", "missing"})
        QVERIFY(QFile::link(path(QLatin1String(target)),
                            path(QLatin1String("link to ") + QLatin1String(target))));
}

void tst_OnDisk::tellsWhetherThereIsAnything_data()
{
    QTest::addColumn<bool>("isThere");
    for (const char *name :
         {"file", "folder", "folder/.hidden", "link to file", "link to folder", "link to missing"})
        QTest::newRow(name) << true;
    for (const char *name : {"missing", "file/below", "link to missing/below"})
        QTest::newRow(name) << false;
}

void tst_OnDisk::tellsWhetherThereIsAnything()
{
    QFETCH(bool, isThere);
    QCOMPARE(OnDisk::exists(path(QLatin1String(QTest::currentDataTag()))), isThere);
    QVERIFY(!OnDisk::exists(QString()));
}

VEL_TEST_GUILESS_MAIN(tst_OnDisk)

#include "tst_OnDisk.moc"
