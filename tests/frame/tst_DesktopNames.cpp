// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DesktopNames.h>

class tst_DesktopNames : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void listsTheRegisteredOnesInOrder();
    void knowsTheSession_data();
    void knowsTheSession();
};

void tst_DesktopNames::listsTheRegisteredOnesInOrder()
{
    const QStringList names = DesktopNames::registered();
    for (const char *name : {"GNOME", "KDE", "LXQt", "MATE", "XFCE"})
        QVERIFY2(names.contains(QLatin1String(name)), name);
    QStringList sorted = names;
    sorted.sort(Qt::CaseInsensitive);
    QCOMPARE(names, sorted);
    QCOMPARE(sorted.removeDuplicates(), 0);
}

void tst_DesktopNames::knowsTheSession_data()
{
    QTest::addColumn<QByteArray>("variable");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("none") << QByteArray() << QStringList(QStringLiteral("VEL"));
    QTest::newRow("one") << QByteArray("KDE") << QStringList(QStringLiteral("KDE"));
    QTest::newRow("two") << QByteArray("ubuntu:GNOME")
                         << QStringList{QStringLiteral("ubuntu"), QStringLiteral("GNOME")};
    QTest::newRow("colons") << QByteArray("::A:") << QStringList(QStringLiteral("A"));
}

void tst_DesktopNames::knowsTheSession()
{
    QFETCH(QByteArray, variable);
    QFETCH(QStringList, names);
    qputenv("XDG_CURRENT_DESKTOP", variable);
    QCOMPARE(DesktopNames::ofSession(), names);
    qunsetenv("XDG_CURRENT_DESKTOP");
}

VEL_TEST_GUILESS_MAIN(tst_DesktopNames)

#include "tst_DesktopNames.moc"
