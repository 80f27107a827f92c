// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DialogTestCase.h"
#include "XDoTool.h"

#include <QSignalSpy>

/**
 * A dialog that is shown and active, for keys and clicks that come from the X server.
 */
class RecordingTestCase : public DialogTestCase
{
    Q_OBJECT

protected Q_SLOTS:
    void init()
    {
        DialogTestCase::init();
        m_dialog->show();
        activate();
    }

protected:
    // Longer than the key editor waits for one more chord.
    static constexpr int LongerThanARecording = 1500;

    // Asks again, as a message may just have closed, and the window manager takes its time.
    void activate()
    {
        QTRY_VERIFY_WITH_TIMEOUT(
            (m_dialog->activateWindow(), QTest::qWaitForWindowActive(m_dialog.get(), 1000)), 20000);
    }

    // Makes the action current and its key editor ready.
    void record(const char *name)
    {
        activate();
        select(name);
        customButton()->setChecked(true);
        keyWidget()->setFocus();
        QTRY_VERIFY(keyWidget()->hasFocus());
    }

    // Records the action's key up to the point where the editor waits for one more chord.
    void recordUnfinished(const char *name, const QString &keys)
    {
        record(name);
        XDoTool::press(keys);
        QTRY_VERIFY(!keyWidget()->keySequence().isEmpty());
    }

    // Whether no key of the model changes for longer than a recording takes.
    bool keysStay() const
    {
        QSignalSpy spy(m_model.get(), &QAbstractItemModel::dataChanged);
        return !spy.wait(LongerThanARecording);
    }
};
