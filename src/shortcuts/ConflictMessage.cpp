// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ConflictMessage.h"

#include "ShortcutConflict.h"

#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QDialog>
#include <QGuiApplication>
#include <QPointer>

#include <utility>

namespace {

// How often it is looked whether a button of the mouse is still held, in milliseconds.
constexpr int MouseWait = 20;

} // namespace

ConflictMessage::ConflictMessage(QDialog *dialog)
    : m_dialog(dialog)
{
    m_timer.setSingleShot(true);
    m_timer.setInterval(MouseWait);
    connect(&m_timer, &QTimer::timeout, this, &ConflictMessage::show);
}

ConflictMessage::~ConflictMessage() = default;

void ConflictMessage::refuse(const QKeySequence &key, const ShortcutConflict &conflict)
{
    const QString text = conflict.kind == ShortcutConflict::Global
        ? QCoreApplication::translate("EditShortcutsDialog",
                                      "Shortcut '%1' is already used for global action '%2'.")
        : QCoreApplication::translate("EditShortcutsDialog",
                                      "Shortcut '%1' is already used for action '%2'. Please try another.");
    m_text = text.arg(key.toString(QKeySequence::PortableText), conflict.holder);
}

void ConflictMessage::clear()
{
    m_text.clear();
}

bool ConflictMessage::show()
{
    if (m_text.isEmpty())
        return true;
    // A message that opens while a button is pressed would keep the release from it.
    if (QGuiApplication::mouseButtons() != Qt::NoButton) {
        showLater();
        return false;
    }
    const QString text = std::exchange(m_text, QString());
    const QPointer<ConflictMessage> self(this);
    MessageBox::show(m_dialog, QMessageBox::Critical,
                     QCoreApplication::translate("EditShortcutsDialog", "Shortcuts conflict"), text);
    if (self)
        Q_EMIT closed();
    return false;
}

void ConflictMessage::showLater()
{
    m_timer.start();
}
