// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/QtMajor.h>

#include <QAbstractNativeEventFilter>
#include <QVector>
#include <QWindow>

/**
 * The keyboard of the X server, pressed key by key and thousands of times a second.
 *
 * Other than XDoTool it starts no program and knows keys by their codes, as the hardware does.
 */
class ServerKeyboard : public QAbstractNativeEventFilter
{
public:
    /// What a hand can hold or lock while it presses a key.
    enum Modifier {
        Shift = 1,
        Control = 2,
        Alt = 4,
        Super = 8,
        AltGr = 16,
        CapsLock = 32,
        NumLock = 64,
        AllModifiers = 127
    };

    /// The keys go to \a window while it is active.
    explicit ServerKeyboard(const QWindow &window);
    ~ServerKeyboard() override;
    Q_DISABLE_COPY_MOVE(ServerKeyboard)

    /// Every key code of the map, but for keys that are held.
    QVector<int> codes() const;
    /// How many symbols the map has, and how many of them a key gives with some Modifier.
    int symbolCount() const;
    int reachableSymbolCount() const;

    /// Holds and locks a set of Modifier instead of those held before; false when the map lacks
    /// a key for one, or the server's state is another one then.
    bool hold(int modifiers);
    /// Presses and releases a key. Whatever it locks or latches is undone.
    void press(int code);
    /// Waits until all that was pressed has arrived; false when it does not.
    bool wait();

    bool nativeEventFilter(const QByteArray &type, void *message, QtMajor::NativeResult *result) override;

private:
    void setLocks();
    void send(int code, bool isDown);

    struct _XDisplay *const m_display;
    const unsigned long m_window;
    const unsigned long m_marker;
    unsigned int m_sent = 0;
    unsigned int m_arrived = 0;
    unsigned int m_locked = 0;
    QVector<int> m_held;
};
