// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelOpenTestCase.h"

#include <QDBusConnection>
#include <QDBusContext>
#include <QProcess>
#include <QTimer>

#include <fcntl.h>

/// An application on the session bus.
class BusApplication : public QObject, protected QDBusContext
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.freedesktop.Application")

public:
    enum Manner { Answers, Refuses, Hesitates, Leaves };
    explicit BusApplication(Manner manner)
        : m_manner(manner)
    {
    }
    int activations() const { return m_activations; }
    QVariantMap platformData() const { return m_platformData; }

public Q_SLOTS:
    void Activate(const QVariantMap &platformData)
    {
        ++m_activations;
        m_platformData = platformData;
        if (m_manner == Refuses)
            sendErrorReply(QStringLiteral("org.example.Error"), QStringLiteral("no"));
        else if (m_manner != Answers)
            setDelayedReply(true);
        if (m_manner == Leaves)
            QTimer::singleShot(0, this, &BusApplication::left);
    }

Q_SIGNALS:
    void left();

private:
    Manner m_manner;
    int m_activations = 0;
    QVariantMap m_platformData;
};

/// Entries of applications that are activated over the session bus.
class tst_vel_open_bus : public VelOpenTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void activatesOverTheBusFirst_data();
    void activatesOverTheBusFirst();
    void runsTheCommandWhenTheBusRefuses();
    void runsTheCommandWhenTheApplicationGoesAway();
    void handsTheStartupIdOn();
    void runsTheCommandWhenNobodyIsOnTheBus();
    void runsTheCommandWithoutABus();
    void leavesAnApplicationThatTakesItsTimeAlone();
    void asksNoBusForOtherEntries();

private:
    QString startBus();
    void activate(BusApplication::Manner manner, int activations, bool execRuns,
                  const QByteArray &beforeAll = QByteArray());
};

QString tst_vel_open_bus::startBus()
{
    m_bus.reset(new QProcess);
    m_bus->start(QStringLiteral("dbus-daemon"),
                 {QStringLiteral("--session"), QStringLiteral("--nofork"), QStringLiteral("--nopidfile"),
                  QStringLiteral("--print-address=1")});
    QByteArray address;
    while (!address.endsWith('\n') && m_bus->waitForReadyRead(10000))
        address += m_bus->readAllStandardOutput();
    qputenv("DBUS_SESSION_BUS_ADDRESS", address.trimmed());
    return QString::fromLatin1(address.trimmed());
}

void tst_vel_open_bus::activate(BusApplication::Manner manner, int activations, bool execRuns,
                                const QByteArray &beforeAll)
{
    const QString address = startBus();
    QVERIFY(!address.isEmpty());
    {
        QDBusConnection bus = QDBusConnection::connectToBus(address, QStringLiteral("test"));
        QVERIFY(bus.isConnected());
        BusApplication application(manner);
        QVERIFY(bus.registerService(QStringLiteral("org.example.My-App")));
        QVERIFY(bus.registerObject(QStringLiteral("/org/example/My_App"), &application,
                                   QDBusConnection::ExportAllSlots));
        connect(&application, &BusApplication::left, this, [&bus] {
            QDBusConnection::disconnectFromBus(QStringLiteral("test"));
            bus = QDBusConnection(QString()); // the last one that held it
        });
        probe("probe", "echo ran");
        // Where the command must not run, to try it would be an error.
        const QByteArray program = execRuns ? "probe" : "no-such-program-here";
        const QString path = write(QStringLiteral("org.example.My-App.desktop"),
                                   beforeAll + "[Desktop Entry]\nType=Application\nName=x\nExec=" + program
                                       + "\nDBusActivatable=true\n");
        QCOMPARE(open(path), 0);
        QVERIFY2(m_time < 2000, qPrintable(QString::number(m_time)));
        QCOMPARE(application.activations(), activations);
        QCOMPARE(application.platformData().value(QStringLiteral("desktop-startup-id")).toByteArray(),
                 qgetenv("DESKTOP_STARTUP_ID"));
    }
    if (execRuns)
        QTRY_COMPARE(told(), QByteArray("ran\n"));
}

void tst_vel_open_bus::activatesOverTheBusFirst_data()
{
    QTest::addColumn<QByteArray>("beforeAll");
    QTest::newRow("plain") << QByteArray();
    QTest::newRow("byte order mark") << QByteArray("\xEF\xBB\xBF");
}

void tst_vel_open_bus::activatesOverTheBusFirst()
{
    QFETCH(QByteArray, beforeAll);
    activate(BusApplication::Answers, 1, false, beforeAll);
}

void tst_vel_open_bus::runsTheCommandWhenTheBusRefuses()
{
    activate(BusApplication::Refuses, 1, true);
}

void tst_vel_open_bus::runsTheCommandWhenTheApplicationGoesAway()
{
    activate(BusApplication::Leaves, 1, true);
}

void tst_vel_open_bus::handsTheStartupIdOn()
{
    qputenv("DESKTOP_STARTUP_ID", "menu_TIME1234");
    activate(BusApplication::Answers, 1, false);
    qunsetenv("DESKTOP_STARTUP_ID");
}

void tst_vel_open_bus::runsTheCommandWhenNobodyIsOnTheBus()
{
    QVERIFY(!startBus().isEmpty());
    probe("probe", "echo ran");
    const QByteArray keys = "Type=Application\nName=x\nExec=probe\nDBusActivatable=true\n";
    QCOMPARE(open(entry(keys, QStringLiteral("org.example.Nobody.desktop"))), 0);
    QTRY_COMPARE(told(), QByteArray("ran\n"));
    QVERIFY(QFile::remove(path(QStringLiteral("told"))));
    QCOMPARE(open(entry(keys, QStringLiteral("no bus name.desktop"))), 0);
    QTRY_COMPARE(told(), QByteArray("ran\n"));
    // Without a command there is nothing to fall back on.
    QCOMPARE(open(entry("Type=Application\nName=x\nDBusActivatable=true\n",
                        QStringLiteral("org.example.Nobody.desktop"))),
             1);
}

void tst_vel_open_bus::runsTheCommandWithoutABus()
{
    probe("probe", "echo ran");
    const QByteArray keys = "Type=Application\nName=x\nExec=probe\nDBusActivatable=true\n";
    QCOMPARE(open(entry(keys, QStringLiteral("org.example.App.desktop"))), 0);
    QTRY_COMPARE(told(), QByteArray("ran\n"));
}

void tst_vel_open_bus::leavesAnApplicationThatTakesItsTimeAlone()
{
    activate(BusApplication::Hesitates, 1, false);
}

void tst_vel_open_bus::asksNoBusForOtherEntries()
{
    const QString address = startBus();
    {
        QDBusConnection bus = QDBusConnection::connectToBus(address, QStringLiteral("test"));
        BusApplication application(BusApplication::Answers);
        QVERIFY(bus.registerService(QStringLiteral("org.example.App")));
        QVERIFY(bus.registerObject(QStringLiteral("/org/example/App"), &application,
                                   QDBusConnection::ExportAllSlots));
        probe("probe", "echo ran");
        QCOMPARE(open(entry("Type=Application\nName=x\nExec=probe\nDBusActivatable=false\n"
                            "[Desktop Action a]\nDBusActivatable=true\n",
                            QStringLiteral("org.example.App.desktop"))),
                 0);
        QCOMPARE(application.activations(), 0);
    }
    QTRY_COMPARE(told(), QByteArray("ran\n"));
}

VEL_TEST_GUILESS_MAIN(tst_vel_open_bus)
#include "tst_vel_open_bus.moc"
