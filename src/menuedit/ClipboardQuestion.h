// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/QtMajor.h>

#include <QAbstractNativeEventFilter>
#include <QByteArrayList>
#include <QObject>

/**
 * A question to the program that owns the clipboard of an X11 session, which nobody waits for. The
 * clipboard of Qt waits five seconds for each answer, and nothing else happens meanwhile.
 */
class ClipboardQuestion : public QObject, private QAbstractNativeEventFilter
{
    Q_OBJECT

public:
    explicit ClipboardQuestion(QObject *parent = nullptr);
    ~ClipboardQuestion() override;

    /// Whether another program has to be asked: on X11, where it owns the clipboard.
    static bool isNeeded();

    /// Asks for the types that the clipboard offers; what was asked before is taken back.
    void askForTypes();
    /// The same for the data of a \a type, which are not read: it only has to be seen that they come.
    void askForData(const QByteArray &type);
    /// No longer waits for the answer, if there is none yet.
    void takeBack();
    /// Whether there is no answer yet.
    bool isOpen() const { return m_window != 0; }

Q_SIGNALS:
    /// The owner has answered, if only that it does not have that; \a types are those that the
    /// clipboard offers if it was asked for them.
    void answered(const QByteArrayList &types);

private:
    void ask(const char *type);
    QByteArrayList offeredTypes() const;
    bool nativeEventFilter(const QByteArray &eventType, void *message,
                           QtMajor::NativeResult *result) override;

    // The window that is to have the answer; none without a question.
    unsigned long m_window = 0;
    bool m_isForTypes = false;
};
