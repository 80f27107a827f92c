// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OddName.h"
#include "TestCase.h"

#include <veluiaux/VelTrash.h>

#include <QDir>

class tst_VelTrash : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void isEmptyWithoutATrash();
    void isEmptyWithoutThrownAwayFiles();
    void holdsWhatLiesInIt_data();
    void holdsWhatLiesInIt();
    void looksAnewInEveryCall();
    void takesTheHomeFolderWithoutADataHome_data();
    void takesTheHomeFolderWithoutADataHome();
    void isEmptyWhenItIsNoFolder();

private:
    QByteArray m_home;
};

void tst_VelTrash::init()
{
    TestCase::init();
    m_home = qgetenv("HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
}

void tst_VelTrash::cleanup()
{
    qputenv("HOME", m_home);
    TestCase::cleanup();
}

void tst_VelTrash::isEmptyWithoutATrash()
{
    QVERIFY(VelTrash::isEmpty());
}

void tst_VelTrash::isEmptyWithoutThrownAwayFiles()
{
    QVERIFY(QDir().mkpath(path(QStringLiteral("data/Trash/files"))));
    write(QStringLiteral("data/Trash/directorysizes"), "");
    QVERIFY(VelTrash::isEmpty());
}

void tst_VelTrash::holdsWhatLiesInIt_data()
{
    QTest::addColumn<QString>("kind");
    for (const char *kind : {"file", "hidden file", "folder", "dangling link", "a name that is no text"})
        QTest::newRow(kind) << QString::fromLatin1(kind);
}

void tst_VelTrash::holdsWhatLiesInIt()
{
    QFETCH(QString, kind);
    const QString files = path(QStringLiteral("data/Trash/files"));
    QVERIFY(QDir().mkpath(files));
    if (kind == QLatin1String("file"))
        write(QStringLiteral("data/Trash/files/a"), "x");
    else if (kind == QLatin1String("hidden file"))
        write(QStringLiteral("data/Trash/files/.a"), "x");
    else if (kind == QLatin1String("folder"))
        QVERIFY(QDir(files).mkdir(QStringLiteral("a")));
    else if (kind == QLatin1String("a name that is no text"))
        writeOddName(files);
    else
        QVERIFY(QFile::link(QStringLiteral("/nowhere"), files + QStringLiteral("/a")));
    QVERIFY(!VelTrash::isEmpty());
}

void tst_VelTrash::looksAnewInEveryCall()
{
    const QString file = write(QStringLiteral("data/Trash/files/a"), "x");
    QVERIFY(!VelTrash::isEmpty());
    QVERIFY(QFile::remove(file));
    QVERIFY(VelTrash::isEmpty());
    write(QStringLiteral("data/Trash/files/b"), "x");
    QVERIFY(!VelTrash::isEmpty());
}

void tst_VelTrash::takesTheHomeFolderWithoutADataHome_data()
{
    QTest::addColumn<QByteArray>("dataHome");
    QTest::newRow("not set") << QByteArray();
    QTest::newRow("empty") << QByteArray("");
    QTest::newRow("relative") << QByteArray("data");
}

void tst_VelTrash::takesTheHomeFolderWithoutADataHome()
{
    QFETCH(QByteArray, dataHome);
    qputenv("HOME", QFile::encodeName(path(QStringLiteral("home"))));
    if (dataHome.isNull())
        qunsetenv("XDG_DATA_HOME");
    else
        qputenv("XDG_DATA_HOME", dataHome);
    QVERIFY(VelTrash::isEmpty());
    write(QStringLiteral("home/.local/share/Trash/files/a"), "x");
    QVERIFY(!VelTrash::isEmpty());
}

void tst_VelTrash::isEmptyWhenItIsNoFolder()
{
    write(QStringLiteral("data/Trash/files"), "not a folder");
    QVERIFY(VelTrash::isEmpty());
}

VEL_TEST_GUILESS_MAIN(tst_VelTrash)

#include "tst_VelTrash.moc"
