// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Every key of a keyboard, as the X server sends it, in the key field of the dialog: what is
// recorded is still there after the next start. VEL_TEST_LAYOUTS="us de fr" tries these layouts with
// all combinations of modifiers, instead of two with a few.

#include "KeyTakingTestCase.h"
#include "ServerKeyboard.h"

#include <frame/QtMajor.h>
#include <shortcuts/KeySequences.h>

#include <QProcess>

namespace {

QVector<int> allCombinations()
{
    QVector<int> all;
    for (int modifiers = 0; modifiers <= ServerKeyboard::AllModifiers; ++modifiers)
        all.append(modifiers);
    return all;
}

// Those that once gave keys which were lost are among them.
QVector<int> someCombinations()
{
    using K = ServerKeyboard;
    return {0,
            K::Shift,
            K::Control,
            K::Super,
            K::AltGr,
            K::Shift | K::AltGr,
            K::Shift | K::Control,
            K::Control | K::Alt | K::NumLock};
}

// The modifiers of a chord that are held for it, whatever the layout.
int heldFor(int modifiers)
{
    return (modifiers & ServerKeyboard::Control ? int(Qt::CTRL) : 0)
        | (modifiers & ServerKeyboard::Alt ? int(Qt::ALT) : 0)
        | (modifiers & ServerKeyboard::Super ? int(Qt::META) : 0);
}

} // namespace

class tst_RecordedLayouts : public KeyTakingTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void losesNoKeyOfALayout_data();
    void losesNoKeyOfALayout();
};

void tst_RecordedLayouts::losesNoKeyOfALayout_data()
{
    QTest::addColumn<QString>("layout");
    const QStringList layouts = isFull() ? fullLayouts() : QStringList{str("us"), str("de")};
    for (const QString &layout : layouts)
        QTest::newRow(qPrintable(layout)) << layout;
}

void tst_RecordedLayouts::losesNoKeyOfALayout()
{
    QFETCH(QString, layout);
    QCOMPARE(QProcess::execute(str("setxkbmap"), {layout}), 0);
    ServerKeyboard keyboard(*m_dialog->windowHandle());
    qInfo("%s: %d of %d symbols can be pressed", qPrintable(layout), keyboard.reachableSymbolCount(),
          keyboard.symbolCount());

    const QVector<int> allModifiers = isFull() ? allCombinations() : someCombinations();
    for (int modifiers : allModifiers) {
        QVERIFY(keyboard.hold(modifiers));
        const QVector<int> codes = keyboard.codes();
        for (int code : codes) {
            prepare();
            keyboard.press(code);
            QVERIFY(keyboard.wait());
            const QKeySequence shown = keyWidget()->keySequence();
            const QKeySequence key = take();
            const QByteArray what = layout.toLatin1() + ", modifiers " + QByteArray::number(modifiers)
                + ", code " + QByteArray::number(code) + ": " + key.toString().toUtf8();
            QVERIFY2(KeySequences::survivesSaving(shown), what);
            // One press is one chord at most, with the modifiers that were held.
            QVERIFY2(key.count() <= 1, what);
            const int held = QtMajor::chord(key, 0) & int(Qt::CTRL | Qt::ALT | Qt::META);
            QVERIFY2(key.isEmpty() || held == heldFor(modifiers), what);
        }
    }
    keyboard.hold(0);
    compareSaved(layout);
    // More than the letters and digits.
    QVERIFY(m_takenPresses > 60 * allModifiers.size());
}

VEL_TEST_MAIN(tst_RecordedLayouts)

#include "tst_RecordedLayouts.moc"
