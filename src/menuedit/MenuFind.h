// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuWalk.h"

#include <QObject>
#include <QString>
#include <QStringList>
#include <QVector>

class MenuSelection;
class MenuVoice;
class QTreeView;
class ShownMenu;

/**
 * Finding items by their names: the text asked for, the matches and the one that is shown.
 *
 * A search looks through the folders on disk. The model reads those on the way to a match that is
 * shown, and no others.
 */
class MenuFind : public QObject
{
    Q_OBJECT

public:
    MenuFind(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuVoice &voice);
    ~MenuFind() override;

    /// Asks for a text and selects the first match; the user may take this object away meanwhile.
    void ask();
    /// Searches the whole menu and selects the first match, or goes on to the \a next one of the
    /// last search; whether a match was selected. This object may go away meanwhile.
    bool find(bool next);
    /// Drops the matches, so that the next search begins anew.
    void clear();

private:
    /// How a search ended.
    enum class End { Whole, Limit, Canceled };

    bool showNext();
    bool show(const QString &path);
    void keepInSight(const QString &loadedFolder);
    End search(const QString &text, QVector<MenuWalk::Item> *matches);
    QStringList inOrder(const QVector<MenuWalk::Item> &matches) const;
    void tellNothing(const QString &text);
    void tellOfLimit();

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuVoice &m_voice;
    QString m_text;
    QStringList m_matches;
    int m_shown = -1;
    bool m_isSearching = false;
};
