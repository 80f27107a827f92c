// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"
#include "ShortcutScheme.h"
#include "ShortcutsModelTestCase.h"

#include <QDir>
#include <QFileInfo>
#include <QSettings>
#include <QSignalSpy>

#include <csignal>

#include <sys/resource.h>
#include <sys/stat.h>

using ShortcutScheme::OnClash;
using ShortcutScheme::Result;

class tst_ShortcutScheme : public ShortcutsModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void refusesWhatIsNoFileOfKeys_data();
    void refusesWhatIsNoFileOfKeys();
    void doesNotWaitForAPipe();
    void refusesAFileThatIsTooLarge();
    void skipsAndCountsWhatMakesNoSense();
    void readsWhatAnEditorWrites();
    void leavesTheOldFileWholeWhenItCannotSave();
    void writesNothingIntoAPipe();

    void savesWhatTheModelShowsAsSettingsDo();
    void savesOneKeyForEachName();
    void leavesOutAKeyThatWouldNotReadBack();
    void keepsEveryName_data();
    void keepsEveryName();
    void keepsEveryKey_data();
    void keepsEveryKey();
    void writesThroughALink();

    void makesWhatItTakesPending();
    void skipsNamesThatTheModelLacks();
    void takesAKeyAway();
    void asksForAKeyThatAnotherShortcutHas_data();
    void asksForAKeyThatAnotherShortcutHas();
    void changesNothingWhenCanceledAfterOtherAnswers();
    void asksForAKeyThatStandsTwiceInTheFile();
    void letsTwoShortcutsExchangeTheirKeys();
    void asksForTheKeyThatASkippedShortcutKeeps();
    void asksNothingAboutKeysThatStay();
    void asksForGlobalKeysAndNeverTakesThem();
    void skipsClashesWhenNobodyAnswers();
    void survivesTheEndOfTheModelDuringAQuestion();

private:
    struct Question
    {
        QString name;
        QString otherName;
        QKeySequence key;
    };

    QKeySequence keyOf(const QString &name) const;
    QString scheme(const QByteArray &lines) { return write(str("in.ini"), "[Shortcuts]\n" + lines); }
    Result load(const QByteArray &lines, const QVector<OnClash> &answers = {});

    QVector<Question> m_asked;
};

void tst_ShortcutScheme::init()
{
    ShortcutsModelTestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    m_asked.clear();
}

void tst_ShortcutScheme::cleanup()
{
    qunsetenv("VEL_CONFIG_HOME");
    ShortcutsModelTestCase::cleanup();
}

// The pending key of an action that addAction() made.
QKeySequence tst_ShortcutScheme::keyOf(const QString &name) const
{
    for (int group = 0; group < m_model->rowCount(); ++group) {
        for (int i = 0; i < m_model->rowCount(m_model->index(group, 0)); ++i) {
            if (row(group, i).data().toString() == str("Text of ") + name)
                return m_model->keySequence(row(group, i));
        }
    }
    return QKeySequence(Qt::Key_unknown);
}

// Gives the answers one after the other, and none more.
Result tst_ShortcutScheme::load(const QByteArray &lines, const QVector<OnClash> &answers)
{
    const auto ask = [&](const QString &name, const QString &otherName, const QKeySequence &key) {
        m_asked.append({name, otherName, key});
        return answers.value(m_asked.size() - 1, OnClash::Cancel);
    };
    return ShortcutScheme::load(m_model.get(), scheme(lines), ask);
}

void tst_ShortcutScheme::refusesWhatIsNoFileOfKeys_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("error");
    QTest::newRow("missing") << str("missing") << str("could not be read from");
    QTest::newRow("folder") << str(".") << str("is not a regular file.");
    QTest::newRow("another group") << str("other.ini") << str("holds no shortcuts.");
    QTest::newRow("empty") << str("empty.ini") << str("holds no shortcuts.");
}

void tst_ShortcutScheme::refusesWhatIsNoFileOfKeys()
{
    QFETCH(QString, name);
    QFETCH(QString, error);
    addAction("a", "g", f1);
    write(str("other.ini"), "[Keys]\na=F2\n");
    write(str("empty.ini"), "");
    const Result result = ShortcutScheme::load(m_model.get(), path(name), {});
    QVERIFY(!result.ok);
    QCOMPARE(result.taken, 0);
    QCOMPARE(result.skipped, 0);
    QVERIFY2(result.error.contains(path(name)) && result.error.contains(error), qPrintable(result.error));
    QCOMPARE(keyOf(str("a")), f1);
}

void tst_ShortcutScheme::doesNotWaitForAPipe()
{
    const QString pipe = path(str("pipe"));
    QCOMPARE(mkfifo(QFile::encodeName(pipe).constData(), 0600), 0);
    const Result result = ShortcutScheme::load(m_model.get(), pipe, {});
    QVERIFY(!result.ok);
    QCOMPARE(result.error, pipe + str(" is not a regular file."));
}

void tst_ShortcutScheme::refusesAFileThatIsTooLarge()
{
    addAction("a", "g", f1);
    const QByteArray start = "[Shortcuts]\na=F2\n;";
    const int most = 8 * 1024 * 1024;
    const QString file = write(str("in.ini"), start + QByteArray(most - start.size() + 1, 'x'));
    Result result = ShortcutScheme::load(m_model.get(), file, {});
    QVERIFY(!result.ok);
    QCOMPARE(result.error, file + str(" is too large for a file of shortcuts."));
    QVERIFY(QFile::resize(file, most));
    result = ShortcutScheme::load(m_model.get(), file, {});
    QVERIFY(result.ok);
    QCOMPARE(keyOf(str("a")), f2);
}

void tst_ShortcutScheme::skipsAndCountsWhatMakesNoSense()
{
    for (const char *name : {"a", "b", "c", "d", "e", "f"})
        addAction(name, "g", f1);
    const Result result = load("a=Gibberish\nb=\"F2\nc\n=F3\nd=F\\q5\ne=@Invalid()\n\x80\xff\x01\nf=F4\n");
    QVERIFY(result.ok);
    QCOMPARE(result.taken, 1);
    QCOMPARE(result.skipped, 7);
    QCOMPARE(result.error, str("Unreadable shortcuts in %1 were skipped: 7").arg(path(str("in.ini"))));
    QCOMPARE(keyOf(str("a")), f1);
    QCOMPARE(keyOf(str("f")), QKeySequence(Qt::Key_F4));
}

void tst_ShortcutScheme::readsWhatAnEditorWrites()
{
    addAction("a", "g");
    addAction("b", "g");
    addAction("c", "g");
    const Result result =
        ShortcutScheme::load(m_model.get(),
                             write(str("in.ini"),
                                   "\xef\xbb\xbf[Other]\r\na=F9\r\n[Shortcuts]\r\n; note\r\n# note\r\n\r\n"
                                   "  a = ctrl+k, ctrl+c  \r\nb=F9\r\nb=F2\r\nc=Ctrl+\xc3\x84"),
                             {});
    QVERIFY(result.ok);
    QCOMPARE(result.error, QString());
    QCOMPARE(result.taken, 3);
    QCOMPARE(result.skipped, 0);
    QCOMPARE(keyOf(str("a")), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C));
    QCOMPARE(keyOf(str("b")), f2);
    QCOMPARE(keyOf(str("c")), QKeySequence(Qt::CTRL | Qt::Key_Adiaeresis));
}

void tst_ShortcutScheme::leavesTheOldFileWholeWhenItCannotSave()
{
    addAction("a", "g", f1);
    QString error;
    const QString missing = path(str("missing/out.ini"));
    QVERIFY(!ShortcutScheme::save(*m_model, missing, &error));
    QVERIFY2(error.startsWith(str("The shortcuts could not be saved to %1: ").arg(missing)),
             qPrintable(error));
    QVERIFY(!ShortcutScheme::save(*m_model, missing));

    // As on a full disk, the file cannot grow beyond some bytes.
    const QString old = write(str("old/out.ini"), "old");
    rlimit before = {};
    getrlimit(RLIMIT_FSIZE, &before);
    const rlimit small = {4, before.rlim_max};
    const auto handler = std::signal(SIGXFSZ, SIG_IGN);
    setrlimit(RLIMIT_FSIZE, &small);
    const bool saved = ShortcutScheme::save(*m_model, old, &error);
    setrlimit(RLIMIT_FSIZE, &before);
    std::signal(SIGXFSZ, handler);
    QVERIFY(!saved);
    QVERIFY(error.startsWith(str("The shortcuts could not be saved to ")));
    QCOMPARE(read(old), QByteArray("old"));
    QCOMPARE(QDir(path(str("old"))).entryList(QDir::Files | QDir::Hidden), QStringList{str("out.ini")});
}

void tst_ShortcutScheme::writesNothingIntoAPipe()
{
    const QString pipe = path(str("pipe"));
    QCOMPARE(mkfifo(QFile::encodeName(pipe).constData(), 0600), 0);
    QString error;
    QVERIFY(!ShortcutScheme::save(*m_model, pipe, &error));
    QCOMPARE(error, pipe + str(" is not a regular file."));
    QVERIFY(!QFileInfo(pipe).isFile());
}

void tst_ShortcutScheme::savesWhatTheModelShowsAsSettingsDo()
{
    const QKeySequence chords = VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_Comma);
    addAction("b", "g", f1);
    addAction("a", "g", chords);
    addAction("none", "other");
    m_model->setKeySequence(row(0, 1), f3);
    const QString file = path(str("out.ini"));
    QString error = str("old");
    QVERIFY(ShortcutScheme::save(*m_model, file, &error));
    QCOMPARE(error, QString());
    QCOMPARE(read(file), QByteArray("[Shortcuts]\na=\"Ctrl+K, Ctrl+,\"\nb=\"F3\"\nnone=\n"));

    QSettings settings(file, QSettings::IniFormat);
    ShortcutsModel other(&settings, str("Shortcuts"));
    QAction action(nullptr);
    other.registerAction(str("a"), &action, str("g"));
    QCOMPARE(action.shortcut(), chords);
}

void tst_ShortcutScheme::savesOneKeyForEachName()
{
    addAction("a", "first", f1);
    addAction("a", "second", f2);
    QVERIFY(ShortcutScheme::save(*m_model, path(str("out.ini"))));
    QCOMPARE(read(path(str("out.ini"))), QByteArray("[Shortcuts]\na=\"F2\"\n"));
    const Result result = load("a=F3\n");
    QCOMPARE(result.taken, 1);
    QVERIFY(m_asked.isEmpty());
    QCOMPARE(m_model->keySequence(row(0, 0)), f3);
    QCOMPARE(m_model->keySequence(row(1, 0)), f3);
}

void tst_ShortcutScheme::leavesOutAKeyThatWouldNotReadBack()
{
    addAction("a", "g", f1);
    addAction("b", "g", QKeySequence(Qt::Key_Super_L));
    QVERIFY(ShortcutScheme::save(*m_model, path(str("out.ini"))));
    QCOMPARE(read(path(str("out.ini"))), QByteArray("[Shortcuts]\na=\"F1\"\n"));
}

void tst_ShortcutScheme::keepsEveryName_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name :
         {"a/b", "/a", "a//b", "a/",  "/",    "a\\b",   "a=b",   "[a]", "; a", "# a",    "%41",
          "%",   "%U", "a b",  " a ", "a\nb", "a\r\tb", "\"a\"", "@a",  "a,b", "%U0041", "%zz"})
        QTest::newRow(name) << str(name);
    QTest::newRow("Japanese") << QString(QChar(0x65e5));
    QTest::newRow("Latin-1") << QString(QChar(0xe4));
    QTest::newRow("emoji") << QString::fromUtf8("\xf0\x9f\x99\x82");
}

void tst_ShortcutScheme::keepsEveryName()
{
    QFETCH(QString, name);
    QAction action(str("Text of it"));
    action.setShortcut(f1);
    m_model->registerAction(name, &action, str("g"));
    const QString file = path(str("out.ini"));
    QVERIFY(ShortcutScheme::save(*m_model, file));
    QCOMPARE(read(file).count('\n'), 2);
    m_model->setKeySequence(row(0, 0), f2);
    const Result result = ShortcutScheme::load(m_model.get(), file, {});
    QCOMPARE(result.taken, 1);
    QCOMPARE(m_model->keySequence(row(0, 0)), f1);
    // QSettings reads the same, but knows no name that ends in "/".
    if (!name.endsWith(QLatin1Char('/')))
        QCOMPARE(QSettings(file, QSettings::IniFormat).allKeys(), QStringList{str("Shortcuts/") + name});
}

void tst_ShortcutScheme::keepsEveryKey_data()
{
    QTest::addColumn<QKeySequence>("key");
    for (const char *text : {"@", "\"", "\\", ";", "=", ",", "Ctrl+,, Ctrl+;", "Space",
                             "Ctrl+Shift+Alt+Meta+F35", "%", "Num+5", "["})
        QTest::newRow(text) << QKeySequence(str(text));
    QTest::newRow("none") << QKeySequence();
    QTest::newRow("umlaut") << QKeySequence(Qt::CTRL | Qt::Key_Adiaeresis);
    QTest::newRow("umlaut before a digit") << VelTest::keySequence(Qt::Key_Adiaeresis, Qt::Key_A);
    QTest::newRow("Cyrillic") << QKeySequence(Qt::CTRL | 0x416);
}

void tst_ShortcutScheme::keepsEveryKey()
{
    QFETCH(QKeySequence, key);
    addAction("a", "g", key);
    const QString file = path(str("out.ini"));
    QVERIFY(ShortcutScheme::save(*m_model, file));
    m_model->setKeySequence(row(0, 0), f2);
    const Result result = ShortcutScheme::load(m_model.get(), file, {});
    QCOMPARE(result.taken, 1);
    QCOMPARE(m_model->keySequence(row(0, 0)), key);
    QCOMPARE(QSettings(file, QSettings::IniFormat).value(str("Shortcuts/a")).toString(),
             key.toString(QKeySequence::PortableText));
}

void tst_ShortcutScheme::writesThroughALink()
{
    addAction("a", "g", f1);
    const QString target = write(str("target.ini"), "old");
    const QString link = path(str("link.ini"));
    QVERIFY(QFile::link(target, link));
    QVERIFY(ShortcutScheme::save(*m_model, link));
    QVERIFY(QFileInfo(link).isSymLink());
    QCOMPARE(read(target), QByteArray("[Shortcuts]\na=\"F1\"\n"));
}

void tst_ShortcutScheme::makesWhatItTakesPending()
{
    const QAction *action = addAction("a", "g", f1);
    const Result result = load("a=F2\n");
    QVERIFY(result.ok);
    QCOMPARE(result.taken, 1);
    QCOMPARE(keyOf(str("a")), f2);
    QCOMPARE(action->shortcut(), f1);
    m_model->commitChanges();
    QCOMPARE(action->shortcut(), f2);
}

void tst_ShortcutScheme::skipsNamesThatTheModelLacks()
{
    addAction("a", "g", f1);
    const Result result = load("a=F2\nlacking=F1\nalso=F2\n");
    QVERIFY(result.ok);
    QCOMPARE(result.taken, 1);
    QCOMPARE(result.skipped, 2);
    QCOMPARE(result.error, QString());
    QVERIFY(m_asked.isEmpty());
}

void tst_ShortcutScheme::takesAKeyAway()
{
    addAction("a", "g", f1);
    addAction("b", "g");
    const Result result = load("a=\nb=\n");
    QCOMPARE(result.taken, 2);
    QVERIFY(m_asked.isEmpty());
    QCOMPARE(keyOf(str("a")), QKeySequence());
}

void tst_ShortcutScheme::asksForAKeyThatAnotherShortcutHas_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("ok");
    QTest::addColumn<int>("taken");
    QTest::addColumn<QKeySequence>("key");
    QTest::addColumn<QKeySequence>("otherKey");
    QTest::newRow("replace") << int(OnClash::Replace) << true << 2 << f2 << QKeySequence();
    QTest::newRow("skip") << int(OnClash::Skip) << true << 1 << f1 << f2;
    QTest::newRow("cancel") << int(OnClash::Cancel) << false << 0 << f1 << f2;
}

void tst_ShortcutScheme::asksForAKeyThatAnotherShortcutHas()
{
    QFETCH(int, answer);
    QFETCH(int, taken);
    QFETCH(bool, ok);
    addAction("a", "g", f1);
    addAction("other", "another", f2);
    addAction("z", "g");
    const Result result = load("a=F2\nz=F3\n", {OnClash(answer)});
    QCOMPARE(m_asked.size(), 1);
    QCOMPARE(m_asked.at(0).name, str("a"));
    QCOMPARE(m_asked.at(0).otherName, str("other"));
    QCOMPARE(m_asked.at(0).key, f2);
    QCOMPARE(result.ok, ok);
    QCOMPARE(result.taken, taken);
    QCOMPARE(result.skipped, ok ? 2 - taken : 0);
    QCOMPARE(result.error, QString());
    QTEST(keyOf(str("a")), "key");
    QTEST(keyOf(str("other")), "otherKey");
    QCOMPARE(keyOf(str("z")), ok ? f3 : QKeySequence());
}

void tst_ShortcutScheme::changesNothingWhenCanceledAfterOtherAnswers()
{
    addAction("a", "g", QKeySequence(Qt::Key_F5));
    addAction("b", "g", QKeySequence(Qt::Key_F6));
    addAction("x", "g", f1);
    addAction("y", "g", f2);
    m_model->setKeySequence(row(0, 2), f3);
    QSignalSpy spy(m_model.get(), &QAbstractItemModel::dataChanged);
    const Result result = load("a=F3\nb=F2\n", {OnClash::Replace, OnClash::Cancel});
    QCOMPARE(m_asked.size(), 2);
    QVERIFY(!result.ok);
    QCOMPARE(spy.count(), 0);
    QCOMPARE(keyOf(str("x")), f3);
    QCOMPARE(keyOf(str("a")), QKeySequence(Qt::Key_F5));
}

void tst_ShortcutScheme::asksForAKeyThatStandsTwiceInTheFile()
{
    addAction("a", "g", f1);
    addAction("b", "g", f2);
    const Result result = load("a=F3\nb=F3\n", {OnClash::Replace});
    QCOMPARE(m_asked.size(), 1);
    QCOMPARE(result.taken, 1);
    QCOMPARE(result.skipped, 1);
    QCOMPARE(keyOf(str("a")), f3);
    QCOMPARE(keyOf(str("b")), QKeySequence());
}

void tst_ShortcutScheme::letsTwoShortcutsExchangeTheirKeys()
{
    addAction("a", "g", f1);
    addAction("b", "g", f2);
    const Result result = load("a=F2\nb=F1\n");
    QVERIFY(m_asked.isEmpty());
    QCOMPARE(result.taken, 2);
    QCOMPARE(keyOf(str("a")), f2);
    QCOMPARE(keyOf(str("b")), f1);
}

void tst_ShortcutScheme::asksForTheKeyThatASkippedShortcutKeeps()
{
    addAction("a", "g", f1);
    addAction("b", "g", f2);
    addAction("c", "g", f3);
    // When a keeps F1, b cannot have it any more, and has to be asked for.
    const Result result = load("a=F3\nb=F1\n", {OnClash::Skip, OnClash::Skip});
    QCOMPARE(m_asked.size(), 2);
    QCOMPARE(m_asked.at(1).name, str("b"));
    QCOMPARE(m_asked.at(1).otherName, str("a"));
    QVERIFY(result.ok);
    QCOMPARE(result.taken, 0);
    QCOMPARE(result.skipped, 2);
    QCOMPARE(keyOf(str("a")), f1);
    QCOMPARE(keyOf(str("b")), f2);
}

void tst_ShortcutScheme::asksNothingAboutKeysThatStay()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF1=\"VELWM_MENU\"\n");
    addAction("a", "g", f1);
    addAction("b", "g", f1);
    const Result result = load("a=F1\nb=F1\n");
    QVERIFY(m_asked.isEmpty());
    QCOMPARE(result.taken, 2);
}

void tst_ShortcutScheme::asksForGlobalKeysAndNeverTakesThem()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF2=\"VELWM_MENU\"\nF3=VELWM_ICON\n");
    addAction("a", "g", f1);
    addAction("b", "g");
    Result result = load("a=F2\nb=F3\n", {OnClash::Replace});
    QCOMPARE(m_asked.size(), 1);
    QCOMPARE(m_asked.at(0).name, str("a"));
    QCOMPARE(m_asked.at(0).otherName, QString());
    QVERIFY(result.ok);
    QCOMPARE(result.taken, 1);
    QCOMPARE(result.skipped, 1);
    QCOMPARE(keyOf(str("a")), f1);
    QCOMPARE(keyOf(str("b")), f3);

    m_asked.clear();
    result = load("a=F2\nb=F5\n", {OnClash::Cancel});
    QVERIFY(!result.ok);
    QCOMPARE(keyOf(str("b")), f3);
}

void tst_ShortcutScheme::skipsClashesWhenNobodyAnswers()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF3=\"VELWM_MENU\"\n");
    addAction("a", "g", f1);
    addAction("b", "g", f2);
    const Result result = ShortcutScheme::load(m_model.get(), scheme("a=F2\nb=F3\n"), {});
    QVERIFY(result.ok);
    QCOMPARE(result.taken, 0);
    QCOMPARE(result.skipped, 2);
    QCOMPARE(keyOf(str("a")), f1);
    QCOMPARE(keyOf(str("b")), f2);
}

void tst_ShortcutScheme::survivesTheEndOfTheModelDuringAQuestion()
{
    addAction("a", "g", f1);
    addAction("b", "g", f2);
    const auto ask = [&](const QString &, const QString &, const QKeySequence &) {
        m_model.reset();
        return OnClash::Replace;
    };
    const Result result = ShortcutScheme::load(m_model.get(), scheme("a=F2\n"), ask);
    QVERIFY(!result.ok);
}

VEL_TEST_MAIN(tst_ShortcutScheme)

#include "tst_ShortcutScheme.moc"
