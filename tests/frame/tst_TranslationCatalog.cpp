// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>
#include <QFile>
#include <QProcess>

namespace {

const char english[] = "New entry, 0 translators\n";
const char german[] = "Neuer Eintrag, 1 translators\n";
const char germanBeside[] = "Eintrag von nebenan, 1 translators\n";

} // namespace

// Each test runs a program of its own: what it loads, and when, is what is tested.
class tst_TranslationCatalog : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void textsStayEnglishWithoutACatalog();
    void textsStayEnglishForACatalogThatIsDamaged();
    void textsStayEnglishInALanguageWithoutCatalog();
    void loadsTheCatalogOfTheSystemLanguage_data();
    void loadsTheCatalogOfTheSystemLanguage();
    void waitsForTheApplicationWhenLoadedBeforeIt();
    void loadsAtOnceWhenOpenedOnTheApplicationThread();
    void waitsForTheEventLoopWhenOpenedOnAnotherThread();
    void takesTheCatalogBesideTheLibraryElse();
    void followsTheLinkThatTheLibraryIsLoadedBy();
    void asksTheFixedDirectoryFirst();
    void doesNothingWithoutADirectory();
    void libraryLooksInItsFixedDirectory();

private:
    QByteArray probe(const QString &program, const QStringList &arguments, const QString &language);
    void addCatalog(const QString &name);
    void addCatalogBeside(const QString &name);
};

void tst_TranslationCatalog::init()
{
    TestCase::init();
    QDir(QStringLiteral(VEL_BESIDE_DIR)).removeRecursively();
    QDir(QStringLiteral(VEL_CATALOG_DIR)).removeRecursively();
    QVERIFY(QDir().mkpath(QStringLiteral(VEL_CATALOG_DIR)));
}

void tst_TranslationCatalog::addCatalog(const QString &name)
{
    QVERIFY(QFile::copy(QStringLiteral(VEL_MESSAGES), QStringLiteral(VEL_CATALOG_DIR "/") + name));
}

void tst_TranslationCatalog::addCatalogBeside(const QString &name)
{
    QVERIFY(QDir().mkpath(QStringLiteral(VEL_BESIDE_DIR)));
    QVERIFY(QFile::copy(QStringLiteral(VEL_MESSAGES_BESIDE), QStringLiteral(VEL_BESIDE_DIR "/") + name));
}

QByteArray tst_TranslationCatalog::probe(const QString &program, const QStringList &arguments,
                                         const QString &language)
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("LANG"), language);
    environment.insert(QStringLiteral("LC_ALL"), language);
    environment.insert(QStringLiteral("LANGUAGE"), language);
    environment.insert(QStringLiteral("VEL_REDIRECT_FROM"), QStringLiteral("/usr/share/vel/translations"));
    environment.insert(QStringLiteral("VEL_REDIRECT_TO"), QStringLiteral(VEL_CATALOG_DIR));
    if (arguments.contains(QStringLiteral(VEL_LIBRARY))) {
        environment.insert(QStringLiteral("LD_PRELOAD"), QStringLiteral(VEL_REDIRECT));
        environment.insert(QStringLiteral("ASAN_OPTIONS"),
                           QStringLiteral("verify_asan_link_order=0:detect_leaks=0"));
    }
    process.setProcessEnvironment(environment);
    process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    process.start(program, arguments);
    if (!process.waitForFinished() || process.exitCode() != 0)
        QTest::qFail("the probe failed", __FILE__, __LINE__);
    return process.readAllStandardOutput();
}

void tst_TranslationCatalog::textsStayEnglishWithoutACatalog()
{
    QCOMPARE(probe(QStringLiteral(VEL_LINKED_PROBE), {}, QStringLiteral("de_DE.UTF-8")),
             QByteArray("started: ") + english + "running: " + english);
}

void tst_TranslationCatalog::textsStayEnglishForACatalogThatIsDamaged()
{
    QFile file(QStringLiteral(VEL_CATALOG_DIR "/libveluiextra_de.qm"));
    QVERIFY(file.open(QIODevice::WriteOnly));
    QVERIFY(file.write("no catalog") > 0);
    file.close();

    // Neither installed nor left behind as a child of the application.
    QCOMPARE(probe(QStringLiteral(VEL_LINKED_PROBE), {}, QStringLiteral("de_DE.UTF-8")),
             QByteArray("started: ") + english + "running: " + english);
}

void tst_TranslationCatalog::textsStayEnglishInALanguageWithoutCatalog()
{
    addCatalog(QStringLiteral("libveluiextra_de.qm"));

    QCOMPARE(probe(QStringLiteral(VEL_LINKED_PROBE), {}, QStringLiteral("fr_FR.UTF-8")),
             QByteArray("started: ") + english + "running: " + english);
}

void tst_TranslationCatalog::loadsTheCatalogOfTheSystemLanguage_data()
{
    QTest::addColumn<QString>("fileName");
    QTest::addColumn<QString>("language");

    QTest::newRow("language") << QStringLiteral("libveluiextra_de.qm") << QStringLiteral("de");
    QTest::newRow("language and country")
        << QStringLiteral("libveluiextra_de_DE.qm") << QStringLiteral("de_DE.UTF-8");
    QTest::newRow("language for a country")
        << QStringLiteral("libveluiextra_de.qm") << QStringLiteral("de_AT.UTF-8");
}

void tst_TranslationCatalog::loadsTheCatalogOfTheSystemLanguage()
{
    QFETCH(QString, fileName);
    QFETCH(QString, language);
    addCatalog(fileName);

    QCOMPARE(probe(QStringLiteral(VEL_LINKED_PROBE), {}, language),
             QByteArray("started: ") + german + "running: " + german);
}

void tst_TranslationCatalog::waitsForTheApplicationWhenLoadedBeforeIt()
{
    addCatalog(QStringLiteral("libveluiextra_de.qm"));

    QCOMPARE(probe(QStringLiteral(VEL_PROBE), {QStringLiteral("before"), QStringLiteral(VEL_WITH_DIRECTORY)},
                   QStringLiteral("de")),
             QByteArray("started: ") + german + "running: " + german);
}

void tst_TranslationCatalog::loadsAtOnceWhenOpenedOnTheApplicationThread()
{
    addCatalog(QStringLiteral("libveluiextra_de.qm"));

    QCOMPARE(probe(QStringLiteral(VEL_PROBE), {QStringLiteral("after"), QStringLiteral(VEL_WITH_DIRECTORY)},
                   QStringLiteral("de")),
             QByteArray("started: ") + german + "running: " + german);
}

void tst_TranslationCatalog::waitsForTheEventLoopWhenOpenedOnAnotherThread()
{
    addCatalog(QStringLiteral("libveluiextra_de.qm"));

    QCOMPARE(probe(QStringLiteral(VEL_PROBE), {QStringLiteral("worker"), QStringLiteral(VEL_WITH_DIRECTORY)},
                   QStringLiteral("de")),
             QByteArray("started: ") + english + "running: " + german);
}

void tst_TranslationCatalog::takesTheCatalogBesideTheLibraryElse()
{
    addCatalog(QStringLiteral("libveluiextra_fr.qm"));
    addCatalogBeside(QStringLiteral("libveluiextra_de.qm"));

    QCOMPARE(probe(QStringLiteral(VEL_LINKED_PROBE), {}, QStringLiteral("de_DE.UTF-8")),
             QByteArray("started: ") + germanBeside + "running: " + germanBeside);
}

void tst_TranslationCatalog::followsTheLinkThatTheLibraryIsLoadedBy()
{
    addCatalogBeside(QStringLiteral("libveluiextra_de.qm"));
    const QString link = path(QStringLiteral("plugin.so"));
    QVERIFY(QFile::link(QStringLiteral(VEL_WITH_DIRECTORY), link));

    QCOMPARE(probe(QStringLiteral(VEL_PROBE), {QStringLiteral("after"), link}, QStringLiteral("de")),
             QByteArray("started: ") + germanBeside + "running: " + germanBeside);
}

void tst_TranslationCatalog::asksTheFixedDirectoryFirst()
{
    addCatalog(QStringLiteral("libveluiextra_de.qm"));
    addCatalogBeside(QStringLiteral("libveluiextra_de.qm"));

    QCOMPARE(probe(QStringLiteral(VEL_LINKED_PROBE), {}, QStringLiteral("de")),
             QByteArray("started: ") + german + "running: " + german);
}

void tst_TranslationCatalog::doesNothingWithoutADirectory()
{
    addCatalog(QStringLiteral("libveluiextra_de.qm"));
    addCatalogBeside(QStringLiteral("libveluiextra_de.qm"));
    QVERIFY(QDir::setCurrent(QStringLiteral(VEL_CATALOG_DIR)));

    QCOMPARE(probe(QStringLiteral(VEL_PROBE),
                   {QStringLiteral("after"), QStringLiteral(VEL_WITHOUT_DIRECTORY)}, QStringLiteral("de")),
             QByteArray("started: ") + english + "running: " + english);
}

void tst_TranslationCatalog::libraryLooksInItsFixedDirectory()
{
    addCatalog(QStringLiteral("libveluiextra_de.qm"));

    QCOMPARE(probe(QStringLiteral(VEL_PROBE), {QStringLiteral("after"), QStringLiteral(VEL_LIBRARY)},
                   QStringLiteral("de")),
             QByteArray("started: ") + german + "running: " + german);
}

VEL_TEST_GUILESS_MAIN(tst_TranslationCatalog)

#include "tst_TranslationCatalog.moc"
