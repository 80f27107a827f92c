// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Random shortcut files, looked up beside parsing all of them: VEL_TEST_ROUNDS sets another number of files,
// VEL_TEST_SEED repeats a run.

#include "QtMajor.h"
#include "TestCase.h"

#include <shortcuts/GlobalShortcuts.h>
#include <shortcuts/KeyMatcher.h>
#include <shortcuts/QuotedText.h>

#include <QKeySequence>
#include <QRandomGenerator>

#include <cstdio>

#define SI_NO_CONVERSION
#define SI_IMPLEMENTATION
#include <SimpleIni.h>

namespace {

const QVector<QKeySequence> &sequences()
{
    static const QVector<QKeySequence> all = {
        QKeySequence(Qt::Key_F1), QKeySequence(Qt::CTRL | Qt::Key_A), QKeySequence(Qt::META | Qt::Key_B),
        VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_Delete)};
    return all;
}

QString findByParsing(const QString &path, const QKeySequence &sequence)
{
    FILE *const file = std::fopen(QFile::encodeName(path).constData(), "rb");
    CSimpleIniA ini;
    const bool isLoaded = ini.LoadFile(file) >= 0;
    std::fclose(file);
    const CSimpleIniA::TKeyVal *const bindings = isLoaded ? ini.GetSection("ShortCutKeys") : nullptr;
    if (!bindings)
        return {};
    const KeyMatcher matcher(sequence);
    for (const auto &binding : *bindings) {
        if (matcher.matchesText(binding.first.pItem))
            return QuotedText::withoutQuotes(QString::fromUtf8(binding.second));
    }
    return {};
}

} // namespace

class tst_GlobalShortcuts : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void answersAsParsingTheWholeFileDoes();

private:
    QByteArray randomFile();
    template <int count>
    QByteArray one(const char *const (&pieces)[count])
    {
        return pieces[m_random.bounded(count)];
    }

    QRandomGenerator m_random;
};

QByteArray tst_GlobalShortcuts::randomFile()
{
    const char *const starts[] = {"", "", "\xef\xbb\xbf", "\xef\xbb", "\xff\xfe", "; comment\n\n", "#\r"};
    const char *const sections[] = {"[ShortCutKeys]",
                                    "[ShortCutKeys]",
                                    "[shortcutkeys]",
                                    "[ ShortCutKeys ]x",
                                    "[ShortCutKeys",
                                    "[Other]",
                                    "[",
                                    "[]",
                                    "[[ShortCutKeys]]"};
    const char *const keys[] = {
        "F1",  "f1", "\"None|F1\"", "Ctrl+A", "Ctrl|a", " Mod4|b ", "Ctrl+K, Ctrl+Del", "\tNone|F1\v", ";F1",
        "#F1", "",   "\"",          "x",      "[F1",    "None+F1\f"};
    const char *const values[] = {"act", "\"act\"", "", "<<<END", "a=b", " \t", "two words", "\"", "[x]"};
    const char *const ends[] = {"\n", "\n", "\n", "\r\n", "\r", "\n\r", "\n\n", " \n", ""};
    const char *const assignments[] = {"=", "=", "=", " = ", "", "=="};
    QByteArray bytes = one(starts);
    for (int line = m_random.bounded(12); line > 0; --line) {
        if (m_random.bounded(4) == 0)
            bytes += one(sections);
        else
            bytes += one(keys) + one(assignments) + one(values);
        bytes += one(ends);
        if (m_random.bounded(40) == 0)
            bytes += '\0';
    }
    return bytes;
}

void tst_GlobalShortcuts::answersAsParsingTheWholeFileDoes()
{
    bool isSet = false;
    int seed = qEnvironmentVariableIntValue("VEL_TEST_SEED", &isSet);
    if (!isSet)
        seed = int(QRandomGenerator::global()->bounded(1 << 30));
    qInfo("VEL_TEST_SEED=%d", seed);
    m_random.seed(quint32(seed));
    int rounds = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS");
    if (rounds <= 0)
        rounds = qEnvironmentVariableIsSet("VEL_TEST_FULL") ? 10000 : 2000;
    int found = 0;
    for (int round = 0; round < rounds; ++round) {
        const QByteArray bytes = randomFile();
        const QString file = write(QStringLiteral("keyshortcutrc"), bytes);
        for (const QKeySequence &sequence : sequences()) {
            const QString expected = findByParsing(file, sequence);
            QVERIFY2(GlobalShortcuts::find(file, sequence) == expected,
                     bytes.toPercentEncoding().constData());
            found += expected.isNull() ? 0 : 1;
        }
    }
    // Both answers were seen often.
    QVERIFY(found > rounds / 10);
    QVERIFY(found < 3 * rounds);
}

VEL_TEST_MAIN(tst_GlobalShortcuts)

#include "tst_GlobalShortcuts.moc"
