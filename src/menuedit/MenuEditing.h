// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FreeName.h"

#include <QModelIndex>
#include <QObject>
#include <QString>

class MenuFind;
class MenuHistory;
class MenuSelection;
class MenuVoice;
class QTreeView;
class ShownMenu;

/**
 * Creating, editing and deleting of items, with the questions and the editor that belong to it.
 *
 * An event loop runs in each operation, in which the view may go, or show another directory.
 */
class MenuEditing : public QObject
{
    Q_OBJECT

public:
    MenuEditing(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                MenuVoice &voice, MenuHistory &history);
    ~MenuEditing() override;

    /// Whether the editor that is opened helps its user beyond the plain one.
    void setAssisted(bool isAssisted) { m_isAssisted = isAssisted; }

    /// Creates a folder or an entry where the selection says and opens the editor on it; whether
    /// it was made and kept. The user is told when it cannot be made.
    bool createNew(FreeName::Kind kind);
    /// Opens the editor on the item at \a path; whether it was saved.
    bool edit(const QString &path);
    /// Deletes the item at \a path after asking; the user is told of what stays.
    void remove(const QString &path);

Q_SIGNALS:
    /// The menu on disk was changed.
    void changed();

private:
    QString selectedFolder() const;
    bool writeNew(const QString &path, FreeName::Kind kind, const QString &number);
    bool openEditor(const QString &path);
    bool offerNew(const QString &path, FreeName::Kind kind, QString *complaint);
    void tell(const QString &text, const QModelIndex &at = QModelIndex());

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuFind &m_find;
    MenuVoice &m_voice;
    MenuHistory &m_history;
    bool m_isAssisted = false;
};
