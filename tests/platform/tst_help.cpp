// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velcore/dirs.h>
#include <velintegration/help.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>

// The installed folder of this test.
std::string velInstalledDataDir()
{
    return VEL_INSTALLED_DATA_DIR;
}

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
        QDir(QStringLiteral(VEL_INSTALLED_DATA_DIR)).removeRecursively();
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

    void ignoresADataDirectoryThatIsNotAbsolute()
    {
        write(QStringLiteral("data/doc/index.html"), "<p>");
        const QString before = QDir::currentPath();
        QVERIFY(QDir::setCurrent(folder()));
        qputenv("VEL_DATA_DIR", "data");
        const bool isShown = velHelpShow(std::string());
        QVERIFY(QDir::setCurrent(before));
        QVERIFY(!isShown);
    }

    void bringsAPageAboutTheMenuEditor()
    {
        qputenv("VEL_DATA_DIR", VEL_SOURCE_DIR "/data");
        QVERIFY(velHelpShow(std::string()));
        QTRY_COMPARE(opened(), QByteArray(VEL_SOURCE_DIR "/data/doc/index.html|"));
    }

    void prefersThePageInTheLanguageOfTheUser()
    {
        const QString english = write(QStringLiteral("data/doc/index.html"), "<p>");
        const QString german = write(QStringLiteral("data/doc/de/index.html"), "<p>");
        const QString alone = write(QStringLiteral("data/doc/alone.html"), "<p>");
        const auto opensWith = [this](const char *locale, const char *page) {
            QFile::remove(path(QStringLiteral("opened")));
            qputenv("LC_ALL", locale);
            const bool isShown = velHelpShow(page);
            qunsetenv("LC_ALL");
            return isShown;
        };
        QVERIFY(opensWith("de_AT.UTF-8", ""));
        QTRY_COMPARE(opened(), QFile::encodeName(german) + '|');
        QVERIFY(opensWith("fr_FR.UTF-8", ""));
        QTRY_COMPARE(opened(), QFile::encodeName(english) + '|');
        QVERIFY(opensWith("de_DE.UTF-8", "alone"));
        QTRY_COMPARE(opened(), QFile::encodeName(alone) + '|');
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
        QVERIFY(!velHelpShow(std::string()));
        const QString page = QStringLiteral(VEL_INSTALLED_DATA_DIR "/doc/index.html");
        QVERIFY(QDir().mkpath(QFileInfo(page).path()));
        QFile file(page);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.close();

        QVERIFY(velHelpShow(std::string()));
        QTRY_COMPARE(opened(), QFile::encodeName(page) + '|');
        QVERIFY(QFile::remove(path(QStringLiteral("opened"))));
        qunsetenv("VEL_DATA_DIR");
        QVERIFY(velHelpShow(std::string()));
        QTRY_COMPARE(opened(), QFile::encodeName(page) + '|');

        // The data directory comes first.
        qputenv("VEL_DATA_DIR", QFile::encodeName(path(QStringLiteral("data"))));
        const QString own = write(QStringLiteral("data/doc/index.html"), "<p>");
        QVERIFY(velHelpShow(std::string()));
        QTRY_COMPARE(opened(), QFile::encodeName(own) + '|');
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
