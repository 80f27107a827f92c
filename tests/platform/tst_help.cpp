// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/help.h>

#include <QDir>
#include <QFile>

/// A program of ours stands in for the one that opens pages, and notes what it is asked for.
class HelpTest : public TestCase
{
    Q_OBJECT

private:
    QByteArray m_path;

    QByteArray opened() const
    {
        QFile file(path(QStringLiteral("opened")));
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }

private Q_SLOTS:
    void init()
    {
        TestCase::init();
        m_path = qgetenv("PATH");
        qputenv("VEL_DATA_DIR", QFile::encodeName(path(QStringLiteral("data"))));
        const QString program =
            write(QStringLiteral("bin/xdg-open"),
                  "#!/bin/sh\nprintf '%s|' \"$@\" >'" + QFile::encodeName(folder()) + "/new'\nmv '"
                      + QFile::encodeName(folder()) + "/new' '" + QFile::encodeName(folder()) + "/opened'\n");
        QVERIFY(QFile::setPermissions(program, QFile::ReadOwner | QFile::ExeOwner | QFile::WriteOwner));
        qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))) + ':' + m_path);
    }

    void cleanup()
    {
        qputenv("PATH", m_path);
        qunsetenv("VEL_DATA_DIR");
        TestCase::cleanup();
    }

    void isFalseWhenThereIsNoSuchPage()
    {
        write(QStringLiteral("data/doc/index.html"), "<p>");
        QVERIFY(!velHelpShow("missing"));
        QVERIFY(QDir().mkpath(path(QStringLiteral("data/doc/folder.html"))));
        QVERIFY(!velHelpShow("folder"));
    }

    void isFalseForAPageOutsideOfTheHelp()
    {
        write(QStringLiteral("data/secret.html"), "<p>");
        write(QStringLiteral("data/doc/index.html"), "<p>");
        QVERIFY(!velHelpShow("../secret"));
    }

    void isFalseWhenNothingCanOpenThePage()
    {
        write(QStringLiteral("data/doc/index.html"), "<p>");
        qputenv("PATH", QFile::encodeName(path(QStringLiteral("data"))));
        QVERIFY(!velHelpShow(std::string()));
    }

    void opensTheIndexWithoutAPage()
    {
        const QString page = write(QStringLiteral("data/doc/index.html"), "<p>");
        QVERIFY(velHelpShow(std::string()));
        QTRY_COMPARE(opened(), QFile::encodeName(page) + '|');
    }

    void bringsAPageAboutTheMenuEditor()
    {
        qputenv("VEL_DATA_DIR", VEL_SOURCE_DIR "/data");
        QVERIFY(velHelpShow(std::string()));
        QTRY_COMPARE(opened(), QByteArray(VEL_SOURCE_DIR "/data/doc/index.html|"));
    }

    void opensThePageOfThatName()
    {
        write(QStringLiteral("data/doc/index.html"), "<p>");
        const QString page = write(QStringLiteral("data/doc/menu editor.html"), "<p>");
        QVERIFY(velHelpShow("menu editor"));
        QTRY_COMPARE(opened(), QFile::encodeName(page) + '|');
    }

    void opensTheInstalledPageWhereTheDataDirectoryLacksIt()
    {
        const QByteArray installed = VEL_INSTALLED_DATA_DIR "/doc/index.html";
        const bool isThere = QFile::exists(QFile::decodeName(installed));
        QCOMPARE(velHelpShow(std::string()), isThere);
        if (isThere)
            QTRY_COMPARE(opened(), installed + '|');
        qunsetenv("VEL_DATA_DIR");
        QCOMPARE(velHelpShow(std::string()), isThere);
    }

    void startsTheProgramOffTheStreamsOfTheCaller()
    {
        write(QStringLiteral("data/doc/index.html"), "<p>");
        write(QStringLiteral("bin/xdg-open"),
              "#!/bin/sh\noutput=$(readlink /proc/$$/fd/1)\necho \"$output\" >'"
                  + QFile::encodeName(path(QStringLiteral("opened"))) + "'\n");
        QVERIFY(velHelpShow(std::string()));
        QTRY_COMPARE(opened(), QByteArray("/dev/null\n"));
    }
};

VEL_TEST_GUILESS_MAIN(HelpTest)
#include "tst_help.moc"
