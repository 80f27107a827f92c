// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DialogTestCase.h"
#include "SavedKeys.h"

#include <QSet>

/**
 * A shown dialog in whose key field one key after the other is recorded, with no other action in
 * the way.
 */
class KeyTakingTestCase : public DialogTestCase
{
    Q_OBJECT

protected Q_SLOTS:
    void init()
    {
        DialogTestCase::init();
        for (const char *name : {"open", "save", "copy", "cut"})
            m_model->setKeySequence(row(name), QKeySequence());
        m_row = row("open");
        m_recorded.clear();
        m_presses = 0;
        m_takenPresses = 0;
        m_dialog->show();
        m_dialog->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
        tree()->setCurrentIndex(m_row);
    }

protected:
    // The layouts to try with all that there is, instead of a part of two that takes seconds.
    static QStringList fullLayouts()
    {
        return qEnvironmentVariable("VEL_TEST_LAYOUTS").split(QLatin1Char(' '), Qt::SkipEmptyParts);
    }
    static bool isFull() { return !fullLayouts().isEmpty(); }

    // Makes the field ready for the next key.
    void prepare()
    {
        QVERIFY(keyWidget()->isEnabled());
        keyWidget()->setFocus();
        QVERIFY(keyWidget()->hasFocus());
    }

    // Leaves the field after a key was pressed in it, and returns what was recorded.
    QKeySequence take()
    {
        tree()->setFocus();
        ++m_presses;
        const QKeySequence key = m_model->keySequence(m_row);
        if (key.isEmpty())
            return key;
        ++m_takenPresses;
        m_recorded.insert(key);
        m_model->setKeySequence(m_row, QKeySequence());
        return key;
    }

    // Saves and loads what was recorded; reports it under a name.
    void compareSaved(const QString &name)
    {
        QVector<QKeySequence> keys;
        for (const QKeySequence &key : qAsConst(m_recorded))
            keys.append(key);
        const QStringList lost = SavedKeys::lostOf(keys, path(str("keys.ini")));
        qInfo("%s: %d presses, %d of them recorded, %d different keys, %d lost", qPrintable(name), m_presses,
              m_takenPresses, int(keys.size()), int(lost.size()));
        QVERIFY2(lost.isEmpty(), qPrintable(lost.mid(0, 20).join(str("; "))));
    }

    int m_presses = 0;
    int m_takenPresses = 0;

private:
    QPersistentModelIndex m_row;
    QSet<QKeySequence> m_recorded;
};
