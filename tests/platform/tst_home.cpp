// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velcore/dirs.h>
#include <velcore/home.h>
#include <velintegration/startmenu.h>
#include <veluiaux/VelTrash.h>

#include <QDirIterator>

#include <pwd.h>

namespace {

QByteArray registeredHome;

} // namespace

// Stands in front of that of the C library, for every library that the program loads.
extern "C" __attribute__((visibility("default"))) int getpwuid_r(uid_t, passwd *entry, char *, std::size_t,
                                                                 passwd **found)
{
    entry->pw_dir = registeredHome.data();
    *found = entry;
    return 0;
}

/// A user whose home the user data base knows, and nobody else.
class HomeTest : public TestCase
{
    Q_OBJECT

private:
    QByteArray m_home;

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        m_home = qgetenv("HOME");
        registeredHome = QFile::encodeName(path(QStringLiteral("home")));
        for (const char *name : {"HOME", "XDG_CONFIG_HOME", "XDG_DATA_HOME"})
            qunsetenv(name);
    }

    void cleanup()
    {
        qputenv("HOME", m_home);
        TestCase::cleanup();
    }

    void isThatOfTheUserDataBaseWithoutAnother_data()
    {
        QTest::addColumn<QByteArray>("variable");
        QTest::newRow("not set") << QByteArray();
        QTest::newRow("empty") << QByteArray("");
        QTest::newRow("relative") << QByteArray("home");
    }

    void isThatOfTheUserDataBaseWithoutAnother()
    {
        QFETCH(QByteArray, variable);
        if (!variable.isNull())
            qputenv("HOME", variable);
        QCOMPARE(QByteArray::fromStdString(Vel::homeDirectory()), registeredHome);
        QCOMPARE(QByteArray::fromStdString(Vel::dataHome()), registeredHome + "/.local/share");
        QCOMPARE(QByteArray::fromStdString(GetVelDir(VelDir::Desktop)), registeredHome + "/Desktop");
    }

    void holdsTheTrash()
    {
        write(QStringLiteral("home/.local/share/Trash/files/a"), "x");
        QVERIFY(!VelTrash::isEmpty());
    }

    void holdsApplications()
    {
        write(QStringLiteral("home/.local/share/applications/own.desktop"),
              "[Desktop Entry]\nType=Application\nName=Own\nExec=true\nCategories=Utility;\n");
        qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("none"))));
        const QString menu = path(QStringLiteral("menu"));
        QVERIFY(CreateStartMenu(QFile::encodeName(menu).constData(), nullptr));
        qunsetenv("XDG_DATA_DIRS");
        QDirIterator entries(menu, {QStringLiteral("*.desktop")}, QDir::Files, QDirIterator::Subdirectories);
        QVERIFY(entries.hasNext());
        QVERIFY(entries.next().contains(QLatin1String("own")));
    }
};

VEL_TEST_GUILESS_MAIN(HomeTest)

#include "tst_home.moc"
