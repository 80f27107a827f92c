// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QLibrary>

// A small library in a prefix of each test's own.
class tst_LibraryPlace : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void startsAProgramByItsNameWherePathHasIt();
    void startsAProgramFromTheLibrarysPrefixElse();
    void leavesAFileAloneThatCannotBeRun();
    void keepsTheNameOfAProgramThatIsNowhere();
    void startsNothingFromABuild();
    void startsNothingBesideALibraryThatIsAlone();
    void seesTheCatalogsOfTheLibrarysPrefix();
    void seesTheIconsOfTheLibrarysPrefix();
    void seesTheIconsOfTheProgramsPrefixWherePartOfIt();
    void followsALinkToTheLibrary();

private:
    /// Copies the library into the prefix, and links it at \a link if that is given; loads what came last.
    void install(const QString &link = QString());
    QString program() const;
    QString folder(const char *function) const;
    void addProgram(const QString &name, bool isExecutable = true);

    QByteArray m_path;
    QScopedPointer<QLibrary> m_library;
};

void tst_LibraryPlace::init()
{
    TestCase::init();
    m_path = qgetenv("PATH");
    QVERIFY(QDir().mkpath(path(QStringLiteral("path"))));
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("path"))));
}

void tst_LibraryPlace::cleanup()
{
    if (m_library)
        m_library->unload();
    m_library.reset();
    qputenv("PATH", m_path);
    TestCase::cleanup();
}

void tst_LibraryPlace::install(const QString &link)
{
    const QString file = path(QStringLiteral("prefix/lib/libplace.so"));
    QVERIFY(QDir().mkpath(QFileInfo(file).path()));
    QVERIFY(QFile::copy(QStringLiteral(VEL_PLACE_LIBRARY), file));
    QVERIFY(QDir().mkpath(path(QStringLiteral("prefix/share/translations"))));
    if (!link.isEmpty()) {
        QVERIFY(QDir().mkpath(QFileInfo(link).path()));
        QVERIFY(QFile::link(file, link));
    }
    m_library.reset(new QLibrary(link.isEmpty() ? file : link));
    QVERIFY2(m_library->load(), qPrintable(m_library->errorString()));
}

QString tst_LibraryPlace::program() const
{
    const auto find =
        reinterpret_cast<void (*)(const QString *, QString *)>(m_library->resolve("placeOfProgram"));
    const QString name = QStringLiteral("vel-open");
    QString found;
    find(&name, &found);
    return found;
}

QString tst_LibraryPlace::folder(const char *function) const
{
    QString found;
    reinterpret_cast<void (*)(QString *)>(m_library->resolve(function))(&found);
    return found;
}

void tst_LibraryPlace::addProgram(const QString &name, bool isExecutable)
{
    const QString file = write(name, "#!/bin/sh\n");
    if (isExecutable)
        QVERIFY(QFile::setPermissions(file, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

void tst_LibraryPlace::startsAProgramByItsNameWherePathHasIt()
{
    addProgram(QStringLiteral("path/vel-open"));
    addProgram(QStringLiteral("prefix/bin/vel-open"));
    install();
    QCOMPARE(program(), QStringLiteral("vel-open"));
}

void tst_LibraryPlace::startsAProgramFromTheLibrarysPrefixElse()
{
    addProgram(QStringLiteral("prefix/bin/vel-open"));
    install();
    QCOMPARE(program(), path(QStringLiteral("prefix/bin/vel-open")));
}

void tst_LibraryPlace::leavesAFileAloneThatCannotBeRun()
{
    addProgram(QStringLiteral("prefix/bin/vel-open"), false);
    install();
    QCOMPARE(program(), QStringLiteral("vel-open"));
}

void tst_LibraryPlace::keepsTheNameOfAProgramThatIsNowhere()
{
    install();
    QCOMPARE(program(), QStringLiteral("vel-open"));
}

void tst_LibraryPlace::startsNothingFromABuild()
{
    addProgram(QStringLiteral("prefix/bin/vel-open"));
    write(QStringLiteral("prefix/CMakeCache.txt"), "");
    install();
    QCOMPARE(program(), QStringLiteral("vel-open"));
}

void tst_LibraryPlace::startsNothingBesideALibraryThatIsAlone()
{
    addProgram(QStringLiteral("prefix/bin/vel-open"));
    install();
    QVERIFY(QDir().rmdir(path(QStringLiteral("prefix/share/translations"))));
    QCOMPARE(program(), QStringLiteral("vel-open"));
}

void tst_LibraryPlace::seesTheCatalogsOfTheLibrarysPrefix()
{
    install();
    QCOMPARE(folder("placeOfCatalogs"), path(QStringLiteral("prefix/share/translations")));
}

void tst_LibraryPlace::seesTheIconsOfTheLibrarysPrefix()
{
    install();
    QCOMPARE(folder("placeOfIcons"), path(QStringLiteral("prefix/share/icons")));
}

void tst_LibraryPlace::seesTheIconsOfTheProgramsPrefixWherePartOfIt()
{
    m_library.reset(new QLibrary(QStringLiteral(VEL_PLACE_IN_PROGRAM)));
    QVERIFY2(m_library->load(), qPrintable(m_library->errorString()));
    QCOMPARE(folder("placeOfIcons"),
             QFileInfo(QCoreApplication::applicationDirPath()).path() + QLatin1String("/share/icons"));
}

void tst_LibraryPlace::followsALinkToTheLibrary()
{
    addProgram(QStringLiteral("prefix/bin/vel-open"));
    install(path(QStringLiteral("elsewhere/libplace.so")));
    QCOMPARE(program(), path(QStringLiteral("prefix/bin/vel-open")));
}

VEL_TEST_GUILESS_MAIN(tst_LibraryPlace)

#include "tst_LibraryPlace.moc"
