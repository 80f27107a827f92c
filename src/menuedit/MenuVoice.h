// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ReadableTip.h"

#include <QModelIndex>
#include <QObject>

#include <functional>

class QAbstractItemView;

/**
 * What the parts of a view of a menu tell the user without a window: what failed and why, what is
 * to be considered, what was done.
 *
 * All of it becomes one signal. Where nobody listens, warnings and failures are shown as a tip at
 * the item that they are about; notes are not, as the tree shows what was done.
 */
class MenuVoice : public QObject
{
    Q_OBJECT

public:
    enum Kind {
        Note = 0, ///< Something was done.
        Warning = 1, ///< Something was done in another way than one might think.
        Failure = 2 ///< Something was not done.
    };

    /// What a text has to do with the step that was done last, which can be taken back.
    enum class Subject {
        Other, ///< nothing
        Step, ///< It tells of that step.
        Rest ///< It tells what was left of that step, of which was told before.
    };

    /// For \a view; \a isHeard tells whether anybody listens to told().
    MenuVoice(QAbstractItemView *view, std::function<bool()> isHeard);
    ~MenuVoice() override;

    /**
     * Tells \a text, whole sentences in plain text, which say what happened and what to do.
     *
     * Whoever listens may delete the view.
     *
     * @param at the item of the view that it is about; invalid for none
     * @param subject what the text has to do with what can be taken back
     */
    void tell(const QString &text, Kind kind, const QModelIndex &at = QModelIndex(),
              Subject subject = Subject::Other);

    /// What is being told has to do with it.
    Subject subject() const { return m_subject; }

Q_SIGNALS:
    void told(const QString &text, int kind);

private:
    const std::function<bool()> m_isHeard;
    ReadableTip m_tip;
    Subject m_subject = Subject::Other;
};
