// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <support/Program.h>

#include <pwd.h>
#include <unistd.h>

class tst_Program : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasAHome_data();
    void hasAHome();
    void leavesTheHomeThatIsSet();
};

void tst_Program::hasAHome_data()
{
    QTest::addColumn<QByteArray>("variable");
    QTest::newRow("not set") << QByteArray();
    QTest::newRow("empty") << QByteArray("");
    QTest::newRow("relative") << QByteArray("home");
}

void tst_Program::hasAHome()
{
    QFETCH(QByteArray, variable);
    const passwd *const user = getpwuid(getuid());
    QVERIFY(user);
    const QByteArray home = qgetenv("HOME");
    if (variable.isNull())
        qunsetenv("HOME");
    else
        qputenv("HOME", variable);
    Program::describe(QStringLiteral("tst_Program"));
    const QByteArray found = qgetenv("HOME");
    qputenv("HOME", home);
    QCOMPARE(found, QByteArray(user->pw_dir));
}

void tst_Program::leavesTheHomeThatIsSet()
{
    const QByteArray home = qgetenv("HOME");
    qputenv("HOME", "/nowhere/");
    Program::describe(QStringLiteral("tst_Program"));
    const QByteArray found = qgetenv("HOME");
    qputenv("HOME", home);
    QCOMPARE(found, QByteArray("/nowhere/"));
}

VEL_TEST_GUILESS_MAIN(tst_Program)

#include "tst_Program.moc"
