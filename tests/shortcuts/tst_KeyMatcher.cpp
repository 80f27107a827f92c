// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"
#include "TestCase.h"

#include <shortcuts/KeyMatcher.h>

#include <X11/Xlib.h>

#include <vector>

namespace {

QVector<QByteArray> keyNames()
{
    QVector<QByteArray> names = {"",        "f5",    "F01",  "F36",    "F0",     "F1x", "F",        "None",
                                 "Del",     "PgUp",  "-",    "+",      "|",      ",",   "\"",       "#1",
                                 "#",       "xNone", "Esc",  "Enter",  "None+a", "ab",  "\xc3\x84", "\xff",
                                 "Super_L", "Ins",   "Strg", "K, Del", "Num"};
    for (unsigned long symbol = 0; symbol < 0x10000; ++symbol) {
        if (const char *name = XKeysymToString(symbol))
            names.append(name);
    }
    for (unsigned long symbol = 0x10080000; symbol < 0x10090000; ++symbol) {
        if (const char *name = XKeysymToString(symbol))
            names.append(name);
    }
    return names;
}

} // namespace

class tst_KeyMatcher : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void answersAsTheTextsDo_data();
    void answersAsTheTextsDo();
};

void tst_KeyMatcher::answersAsTheTextsDo_data()
{
    QTest::addColumn<QByteArray>("prefix");
    for (const char *prefix : {"", "Ctrl+", "Control|alt|", "None|Shift|", "None+None+", "xNone+",
                               "NoNone+ne+", "\"Mod4|", "Meta+Shift+", "Foo+", "Ctrl+K, ", "Num+", "++",
                               "none|", "\"\"", "Alt+Ctrl+Shift+Mod4+", "CTRL|", "Strg+"})
        QTest::newRow(*prefix ? prefix : "(nothing)") << QByteArray(prefix);
}

void tst_KeyMatcher::answersAsTheTextsDo()
{
    QFETCH(QByteArray, prefix);
    std::vector<KeyMatcher> matchers = {
        KeyMatcher(QKeySequence()), KeyMatcher(VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::Key_Delete)),
        KeyMatcher(QKeySequence(Qt::Key_unknown)),
        KeyMatcher(QKeySequence(int(Qt::KeypadModifier) | Qt::Key_5)),
        KeyMatcher(QKeySequence(int(Qt::KeypadModifier) | Qt::Key_Enter))};
    for (const int modifiers : {0, int(Qt::CTRL), int(Qt::CTRL | Qt::ALT), int(Qt::META), int(Qt::SHIFT)}) {
        for (const int key : {int(Qt::Key_A), int(Qt::Key_5), int(Qt::Key_F1), int(Qt::Key_F12),
                              int(Qt::Key_Delete), int(Qt::Key_Adiaeresis), int(Qt::Key_PageUp)})
            matchers.push_back(KeyMatcher(QKeySequence(modifiers | key)));
    }
    const auto names = keyNames();
    for (const QByteArray &name : names) {
        // A key without its closing quote loses its last character.
        for (const QByteArray &fileKey : {prefix + name, prefix + name + '"'}) {
            // Every name with a few of them in turn; all with all would take minutes.
            for (auto i = size_t(qHash(fileKey) % 20); i < matchers.size(); i += 20) {
                const bool expected = matchers.at(i).matchesText(fileKey.constData());
                QVERIFY2(matchers.at(i).matches(fileKey.constData()) == expected, fileKey.constData());
            }
        }
    }
}

VEL_TEST_MAIN(tst_KeyMatcher)

#include "tst_KeyMatcher.moc"
