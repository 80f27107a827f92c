// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>
#include <QElapsedTimer>
#include <QProcess>
#include <QRegularExpression>
#include <QSet>

namespace {

const QDir doc(QStringLiteral(VEL_SOURCE_DIR "/data/doc"));

// The program of a manual page; that of the menu editor is what the help opens with.
QString pageOf(const QString &program)
{
    return (program == QLatin1String("vel-menuedit") ? QStringLiteral("index") : program)
        + QStringLiteral(".html");
}

QStringList programs()
{
    QStringList names;
    for (const QString &page :
         QDir(QStringLiteral(VEL_SOURCE_DIR "/data/man")).entryList({QStringLiteral("*.1")}))
        names.append(page.chopped(2));
    return names;
}

QByteArray xdotool(const QStringList &arguments)
{
    QProcess process;
    process.start(QStringLiteral("xdotool"), arguments);
    process.waitForFinished();
    return process.readAllStandardOutput().trimmed();
}

} // namespace

// The help has a page for each program, in English and in German, and the windows open theirs.
class tst_HelpPages : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void coverEveryProgram_data();
    void coverEveryProgram();
    void leadOnlyToWhatIsThere_data();
    void leadOnlyToWhatIsThere();
    void openWithF1_data();
    void openWithF1();

private:
    static void addLanguages();
};

void tst_HelpPages::addLanguages()
{
    QTest::addColumn<QString>("folder");
    QTest::newRow("en") << QString();
    QTest::newRow("de") << QStringLiteral("de/");
}

void tst_HelpPages::coverEveryProgram_data()
{
    addLanguages();
}

void tst_HelpPages::coverEveryProgram()
{
    QFETCH(QString, folder);
    QVERIFY(programs().size() >= 8);
    const QByteArray index = read(doc.filePath(folder + QStringLiteral("index.html")));
    for (const QString &program : programs()) {
        const QByteArray page = read(doc.filePath(folder + pageOf(program)));
        QVERIFY2(page.contains("<code>" + program.toUtf8() + ' ')
                     || page.contains("<code>" + program.toUtf8() + "</code> "),
                 qPrintable(program));
        const QByteArray language = folder.isEmpty() ? "en" : "de";
        QVERIFY2(page.contains("<html lang=\"" + language + "\">"), qPrintable(program));
        if (program != QLatin1String("vel-menuedit"))
            QVERIFY2(index.contains("href=\"" + pageOf(program).toUtf8() + '"'), qPrintable(program));
    }
    QCOMPARE(QDir(doc.filePath(folder)).entryList({QStringLiteral("*.html")}).size(), programs().size());
}

void tst_HelpPages::leadOnlyToWhatIsThere_data()
{
    addLanguages();
}

void tst_HelpPages::leadOnlyToWhatIsThere()
{
    QFETCH(QString, folder);
    static const QRegularExpression link(QStringLiteral("(?:href|src)=\"([^\"]*)\""));
    const QDir pages(doc.filePath(folder));
    int links = 0;
    for (const QString &name : pages.entryList({QStringLiteral("*.html")})) {
        QRegularExpressionMatchIterator found =
            link.globalMatch(QString::fromUtf8(read(pages.filePath(name))));
        while (found.hasNext()) {
            const QString target = found.next().captured(1);
            QVERIFY2(QFile::exists(pages.filePath(target)), qPrintable(name + QStringLiteral(": ") + target));
            ++links;
        }
    }
    QVERIFY(links > 8 * 8);
}

void tst_HelpPages::openWithF1_data()
{
    QTest::addColumn<QString>("program");
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<QString>("locale");
    QTest::addColumn<QString>("page");
    const QStringList menu{QStringLiteral("--dir"), QStringLiteral(VEL_SOURCE_DIR "/data/sample")};
    const QStringList entry{QStringLiteral("--read-only"),
                            QStringLiteral(VEL_SOURCE_DIR "/apps/vel-menuedit/vel-menuedit.desktop")};
    const QString english = QStringLiteral("C.UTF-8");
    const QString german = QStringLiteral("de_DE.UTF-8");
    QTest::newRow("menu editor") << QStringLiteral("vel-menuedit") << menu << english
                                 << QStringLiteral("index.html");
    QTest::newRow("menu editor, German")
        << QStringLiteral("vel-menuedit") << menu << german << QStringLiteral("de/index.html");
    QTest::newRow("entry editor") << QStringLiteral("vel-entryedit") << entry << english
                                  << QStringLiteral("vel-entryedit.html");
    QTest::newRow("entry editor, German")
        << QStringLiteral("vel-entryedit") << entry << german << QStringLiteral("de/vel-entryedit.html");
    QTest::newRow("gallery") << QStringLiteral("vel-gallery") << QStringList() << english
                             << QStringLiteral("vel-gallery.html");
}

void tst_HelpPages::openWithF1()
{
    QFETCH(QString, program);
    QFETCH(QStringList, arguments);
    QFETCH(QString, locale);
    QFETCH(QString, page);
    const QString log = path(QStringLiteral("log"));
    const QString opener = write(QStringLiteral("bin/xdg-open"),
                                 "#!/bin/sh\necho \"$1\" >'" + QFile::encodeName(log) + ".part'\nmv '"
                                     + QFile::encodeName(log) + ".part' '" + QFile::encodeName(log) + "'\n");
    QVERIFY(QFile::setPermissions(opener, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("PATH"),
                       path(QStringLiteral("bin")) + QLatin1Char(':')
                           + environment.value(QStringLiteral("PATH")));
    environment.insert(QStringLiteral("VEL_DATA_DIR"), QStringLiteral(VEL_SOURCE_DIR "/data"));
    environment.insert(QStringLiteral("LC_ALL"), locale);

    QProcess process;
    process.setProcessEnvironment(environment);
    process.start(QStringLiteral(VEL_PROGRAMS "/") + program, arguments);
    QVERIFY(process.waitForStarted());
    const QString id = QString::number(process.processId());
    const auto isActive = [&id] {
        return xdotool({QStringLiteral("getactivewindow"), QStringLiteral("getwindowpid")}) == id.toLatin1();
    };
    QTRY_VERIFY_WITH_TIMEOUT(isActive(), 20000);
    // On a busy machine a key that comes right after the window is lost.
    QElapsedTimer passed;
    passed.start();
    while (!QFile::exists(log) && passed.elapsed() < 60000) {
        xdotool({QStringLiteral("key"), QStringLiteral("F1")});
        if (QTest::qWaitFor([&log] { return QFile::exists(log); }, 10000))
            break;
    }
    QVERIFY(QFile::exists(log));
    QCOMPARE(read(log), doc.filePath(page).toUtf8() + '\n');
    process.terminate();
    QVERIFY(process.waitForFinished(20000));
}

VEL_TEST_GUILESS_MAIN(tst_HelpPages)

#include "tst_HelpPages.moc"
