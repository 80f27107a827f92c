// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velcore/session.h>

class SessionTest : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        qunsetenv("VEL_SESSION");
    }

    void hasNoSuffixByDefault()
    {
        QCOMPARE(velSessionConfigSuffix(0), std::string());
        qputenv("VEL_SESSION", "");
        QCOMPARE(velSessionConfigSuffix(0), std::string());
    }

    void hasTheNameOfTheSessionBehindADot()
    {
        qputenv("VEL_SESSION", "guest");
        QCOMPARE(velSessionConfigSuffix(0), std::string(".guest"));
        qputenv("VEL_SESSION", "work");
        QCOMPARE(velSessionConfigSuffix(0), std::string(".work"));
    }

    void otherKindsHaveNone()
    {
        qputenv("VEL_SESSION", "guest");
        QCOMPARE(velSessionConfigSuffix(1), std::string());
        QCOMPARE(velSessionConfigSuffix(-1), std::string());
    }
};

VEL_TEST_GUILESS_MAIN(SessionTest)
#include "tst_session.moc"
