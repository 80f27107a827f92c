// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuIndex.h"

#include <QObject>
#include <QSet>
#include <QString>
#include <QStringList>

#include <memory>

class FilteredRows;
class MenuSelection;
class MenuVoice;
class QTreeView;
class ShownMenu;

/**
 * Shows only those items of a menu that hold all the words of a text, and the folders that lead to
 * them, opened.
 *
 * What is shown once stays for as long as the text is the same: an item that was edited, moved or
 * made does not vanish under the hands of the user. When the filter ends, the folders are open as
 * they were before, and those that lead to the selected item.
 */
class MenuFilter : public QObject
{
    Q_OBJECT

public:
    MenuFilter(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuVoice &voice);
    ~MenuFilter() override;

    /// Filters by \a text; by none, if it has no words. This object may go away meanwhile.
    void setText(const QString &text);
    bool isOn() const { return !m_words.isEmpty(); }
    /// Whether entries that the menu leaves out are found.
    void setHiddenFound(bool isFound);

    /// Selects the next match below the current item, or the first; whether there is one.
    bool selectNext();

private:
    void takeModel();
    void begin();
    void end();
    void showNew();
    void showMore();
    void apply(const FilteredRows &rows);
    void openFolders();
    void openFoldersSoon();
    void tellIfNothing();

    QTreeView *const m_view;
    const ShownMenu &m_menu;
    MenuSelection &m_selection;
    MenuVoice &m_voice;
    std::unique_ptr<MenuIndex> m_index;
    QStringList m_words;
    QString m_text;
    QSet<QString> m_openedBefore;
    bool m_isHiddenFound = false;
    bool m_isTold = false;
    bool m_isOpening = false;
    bool m_isBeginning = false;
};
