// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/check/CachedLookups.h>

#include <QDir>
#include <QFile>
#include <QSignalSpy>

namespace {

using Answer = EntryLookups::Answer;
constexpr int Patience = 20000;

} // namespace

/// Answers about the computer: none at the first time, and none while somebody types.
class tst_CachedLookups : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void knowsNothingAtFirst();
    void looksForPrograms_data();
    void looksForPrograms();
    void looksForFilesIconsAndMimeTypes();
    void tellsOnceOfAllAnswers();
    void looksForNothingThatNobodyAsksAnyMore();
    void givesAnOldAnswerUntilItHasANewOne();

private:
    QString makeProgram(const QString &name);
};

QString tst_CachedLookups::makeProgram(const QString &name)
{
    const QString program = write(name, "#!/bin/sh\n");
    QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    return program;
}

void tst_CachedLookups::knowsNothingAtFirst()
{
    CachedLookups lookups;
    QVERIFY(lookups.program(QStringLiteral("sh"), QString()) == Answer::Unknown);
    QVERIFY(lookups.icon(QStringLiteral("folder")) == Answer::Unknown);
    QVERIFY(lookups.file(QStringLiteral("/")) == Answer::Unknown);
    QVERIFY(lookups.mimeType(QStringLiteral("text/plain")) == Answer::Unknown);
}

void tst_CachedLookups::looksForPrograms_data()
{
    QTest::addColumn<QString>("program");
    QTest::addColumn<bool>("inFolder");
    QTest::addColumn<bool>("isThere");
    QTest::newRow("of PATH") << "sh" << false << true;
    QTest::newRow("nowhere in PATH") << "nosuchprogram" << false << false;
    QTest::newRow("path") << "/bin/sh" << false << true;
    QTest::newRow("no such path") << "/bin/nosuchprogram" << false << false;
    QTest::newRow("folder") << "/bin" << false << false;
    QTest::newRow("in the folder of the entry") << "./My Program" << true << true;
    QTest::newRow("not executable") << "./text" << true << false;
}

void tst_CachedLookups::looksForPrograms()
{
    QFETCH(QString, program);
    QFETCH(bool, inFolder);
    QFETCH(bool, isThere);
    makeProgram(QStringLiteral("My Program"));
    write(QStringLiteral("text"), "text");
    CachedLookups lookups;
    QSignalSpy known(&lookups, &CachedLookups::known);
    const QString place = inFolder ? folder() : QString();
    QVERIFY(lookups.program(program, place) == Answer::Unknown);
    QVERIFY(known.wait(Patience));
    QVERIFY(lookups.program(program, place) == (isThere ? Answer::Yes : Answer::No));
}

void tst_CachedLookups::looksForFilesIconsAndMimeTypes()
{
    const QString picture = write(QStringLiteral("picture.png"), "picture");
    CachedLookups lookups;
    QSignalSpy known(&lookups, &CachedLookups::known);
    const auto ask = [&] {
        return QVector<Answer>{lookups.file(folder()),
                               lookups.file(path(QStringLiteral("nothing"))),
                               lookups.icon(picture),
                               lookups.icon(path(QStringLiteral("nothing.png"))),
                               lookups.icon(QStringLiteral("no-such-icon-anywhere")),
                               lookups.mimeType(QStringLiteral("text/plain")),
                               lookups.mimeType(QStringLiteral("text/x-nobody"))};
    };
    QCOMPARE(ask().count(Answer::Unknown), 7);
    QVERIFY(known.wait(Patience));
    QVERIFY(ask()
            == QVector<Answer>(
                {Answer::Yes, Answer::No, Answer::Yes, Answer::No, Answer::No, Answer::Yes, Answer::No}));
}

void tst_CachedLookups::tellsOnceOfAllAnswers()
{
    CachedLookups lookups;
    QSignalSpy known(&lookups, &CachedLookups::known);
    for (const char *program : {"a", "b", "sh"})
        lookups.program(QString::fromLatin1(program), QString());
    QVERIFY(known.wait(Patience));
    QCOMPARE(known.size(), 1);
    for (const char *program : {"a", "b", "sh"})
        QVERIFY(lookups.program(QString::fromLatin1(program), QString()) != Answer::Unknown);
}

void tst_CachedLookups::looksForNothingThatNobodyAsksAnyMore()
{
    CachedLookups lookups;
    QSignalSpy known(&lookups, &CachedLookups::known);
    lookups.program(QStringLiteral("s"), QString());
    lookups.dropQuestions();
    lookups.program(QStringLiteral("sh"), QString());
    QVERIFY(known.wait(Patience));
    QVERIFY(lookups.program(QStringLiteral("sh"), QString()) == Answer::Yes);
    QVERIFY(lookups.program(QStringLiteral("s"), QString()) == Answer::Unknown);
}

void tst_CachedLookups::givesAnOldAnswerUntilItHasANewOne()
{
    CachedLookups lookups;
    QSignalSpy known(&lookups, &CachedLookups::known);
    const QString program = path(QStringLiteral("program"));
    QVERIFY(lookups.program(program, QString()) == Answer::Unknown);
    QVERIFY(known.wait(Patience));
    QVERIFY(lookups.program(program, QString()) == Answer::No);
    makeProgram(QStringLiteral("program"));
    // Asked now and then, as a form does.
    while (known.size() < 2) {
        QVERIFY(lookups.program(program, QString()) == Answer::No);
        known.wait(1000);
    }
    QVERIFY(lookups.program(program, QString()) == Answer::Yes);
}

VEL_TEST_MAIN(tst_CachedLookups)

#include "tst_CachedLookups.moc"
