// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ClipboardQuestion.h"

#include <QObject>
#include <QTimer>

/**
 * Whether the clipboard holds files. The program that owns it is asked once, when it takes the
 * clipboard, and again before something is pasted; only the paste waits for it, and not for long.
 */
class ClipboardContents : public QObject
{
    Q_OBJECT

public:
    ClipboardContents();
    ~ClipboardContents() override;

    /// Whether there may be files: the owner said so, or said nothing for so long that a paste has
    /// to tell.
    bool mayHoldFiles() const { return m_holdsFiles || m_isSilent; }

    /**
     * Waits until the owner shows that it answers, two seconds at most and not for one that never
     * did; what the user does meanwhile has to wait. This object may be deleted meanwhile.
     *
     * @return whether it answers, and this object is still there
     */
    bool isAnswered();

Q_SIGNALS:
    /// What mayHoldFiles() says may be another thing now.
    void changed();

private:
    void look();
    void take(const QByteArrayList &types);
    void noticeSilence();
    bool wait();

    ClipboardQuestion m_question;
    QTimer m_patience;
    bool m_isForTypes = false;
    bool m_holdsFiles = false;
    bool m_isSilent = false;
};
