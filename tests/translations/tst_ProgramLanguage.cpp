// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QProcess>

// A program in a folder laid out like an installed one, which another language's user starts.
class tst_ProgramLanguage : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isTakenFromBesideTheProgram_data();
    void isTakenFromBesideTheProgram();
    void isTakenFromTheFixedDirectoryElse();
    void ofTheProgramGoesBeforeTheFixedDirectory();
    void staysEnglishWithoutACatalog();
    void reachesTheHelp();
    void reachesTheTextsOfQt();

private:
    /// Copies the compiled catalog of \a from into \a directory as that of \a to.
    void installCatalog(const QString &directory, const QString &from, const QString &to);
    /// What the copied program says on standard error about an unknown format.
    QString complaint(const QString &language);
    QString run(const QString &language, const QStringList &arguments, bool errors);
};

void tst_ProgramLanguage::installCatalog(const QString &directory, const QString &from, const QString &to)
{
    QVERIFY(QDir().mkpath(directory));
    QVERIFY(QFile::copy(QStringLiteral(VEL_COMPILED_DIR "/veluiextra-tools_%1.qm").arg(from),
                        directory + QStringLiteral("/veluiextra-tools_%1.qm").arg(to)));
}

QString tst_ProgramLanguage::run(const QString &language, const QStringList &arguments, bool errors)
{
    const QString program = path(QStringLiteral("prefix/bin/vel-menuprint"));
    QDir().mkpath(QFileInfo(program).path());
    QFile::remove(program);
    if (!QFile::copy(QStringLiteral(VEL_PROGRAM), program))
        return QStringLiteral("cannot copy the program");
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("LANGUAGE"), language);
    // What this machine has installed is of no concern.
    environment.insert(QStringLiteral("LD_PRELOAD"), QStringLiteral(VEL_REDIRECT));
    environment.insert(QStringLiteral("VEL_REDIRECT_FROM"), QStringLiteral(VEL_TRANSLATIONS_DIR));
    environment.insert(QStringLiteral("VEL_REDIRECT_TO"), path(QStringLiteral("fixed")));
    environment.insert(QStringLiteral("ASAN_OPTIONS"),
                       QStringLiteral("verify_asan_link_order=0:detect_leaks=0"));
    QProcess process;
    process.setProcessEnvironment(environment);
    process.start(program, arguments);
    if (!process.waitForFinished())
        return process.errorString();
    return QString::fromUtf8(errors ? process.readAllStandardError() : process.readAllStandardOutput());
}

QString tst_ProgramLanguage::complaint(const QString &language)
{
    return run(language, {QStringLiteral("--format"), QStringLiteral("xyz")}, true);
}

void tst_ProgramLanguage::isTakenFromBesideTheProgram_data()
{
    QTest::addColumn<QString>("language");
    QTest::addColumn<QString>("expected");
    QTest::newRow("de") << QStringLiteral("de") << QStringLiteral("unbekanntes Format: xyz");
    QTest::newRow("pt_BR") << QStringLiteral("pt_BR") << QStringLiteral("formato desconhecido: xyz");
    QTest::newRow("zh_CN") << QStringLiteral("zh_CN") << QStringLiteral("未知格式：xyz");
}

void tst_ProgramLanguage::isTakenFromBesideTheProgram()
{
    QFETCH(QString, language);
    QFETCH(QString, expected);
    installCatalog(path(QStringLiteral("prefix/share/vel/translations")), language, language);
    QCOMPARE(complaint(language), QStringLiteral("vel-menuprint: %1\n").arg(expected));
}

void tst_ProgramLanguage::isTakenFromTheFixedDirectoryElse()
{
    installCatalog(path(QStringLiteral("fixed")), QStringLiteral("de"), QStringLiteral("de"));
    QCOMPARE(complaint(QStringLiteral("de")), QStringLiteral("vel-menuprint: unbekanntes Format: xyz\n"));
}

void tst_ProgramLanguage::ofTheProgramGoesBeforeTheFixedDirectory()
{
    installCatalog(path(QStringLiteral("prefix/share/vel/translations")), QStringLiteral("de"),
                   QStringLiteral("de"));
    installCatalog(path(QStringLiteral("fixed")), QStringLiteral("fr"), QStringLiteral("de"));
    QCOMPARE(complaint(QStringLiteral("de")), QStringLiteral("vel-menuprint: unbekanntes Format: xyz\n"));
}

void tst_ProgramLanguage::staysEnglishWithoutACatalog()
{
    installCatalog(path(QStringLiteral("fixed")), QStringLiteral("fr"), QStringLiteral("fr"));
    QCOMPARE(complaint(QStringLiteral("de")), QStringLiteral("vel-menuprint: unknown format: xyz\n"));
}

void tst_ProgramLanguage::reachesTheHelp()
{
    installCatalog(path(QStringLiteral("prefix/share/vel/translations")), QStringLiteral("de"),
                   QStringLiteral("de"));
    const QString help = run(QStringLiteral("de"), {QStringLiteral("--help")}, false);
    QVERIFY2(help.contains(QStringLiteral("Gibt einen Menüordner in seiner Reihenfolge aus.")),
             qPrintable(help));
}

void tst_ProgramLanguage::reachesTheTextsOfQt()
{
    QCOMPARE(run(QStringLiteral("de"), {QStringLiteral("--nonsense")}, true),
             QStringLiteral("vel-menuprint: Unbekannte Option 'nonsense'.\n"));
}

VEL_TEST_GUILESS_MAIN(tst_ProgramLanguage)

#include "tst_ProgramLanguage.moc"
