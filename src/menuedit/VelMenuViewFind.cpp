// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeLoader.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuView.h"
#include "VelMenuViewPrivate.h"
#include "WaitCursor.h"

#include <frame/MessageBox.h>

#include <QInputDialog>
#include <QPointer>

#include <algorithm>

void VelMenuView::clearFindResults()
{
    d->findResults.clear();
    d->findPos = -1;
}

void VelMenuView::slotFind()
{
    const QPointer<VelMenuView> self(this);
    const QString text =
        QInputDialog::getText(this, tr("Find"), tr("Find string:"), QLineEdit::Normal, d->findText);
    if (!self)
        return;
    d->findText = text;
    findAndSelect(false);
}

void VelMenuView::slotFindNext()
{
    findAndSelect(true);
}

bool VelMenuView::findAndSelect(bool next)
{
    if (d->findText.isEmpty())
        return false;
    if (next && d->showNextMatch())
        return true;

    clearFindResults();
    const QString text = d->findText;
    const QPointer<VelMenuView> self(this);
    {
        const WaitCursor waiting;
        if (self)
            d->loader->load(d->proxy->mapToSource(rootIndex()));
        // The view may show another directory by now, with nothing to be found there.
        if (!self || d->findText != text)
            return false;
        for (const QModelIndex &match : d->matches())
            d->findResults.append(match);
    }
    if (d->findResults.isEmpty()) {
        MessageBox::show(this, QMessageBox::Information, tr("Find"), tr("'%1' not found .").arg(text),
                         QMessageBox::Close);
        return false;
    }
    d->findPos = 0;
    d->showMatch();
    return true;
}

QModelIndexList VelMenuViewPrivate::matches() const
{
    // From the first child, as a search from the root itself would begin among its siblings.
    const QModelIndex root = q->rootIndex();
    const QModelIndex first = root.isValid() ? proxy->index(0, 0, root) : QModelIndex();
    if (!first.isValid())
        return {};
    return proxy->match(first, Qt::DisplayRole, findText, -1,
                        Qt::MatchContains | Qt::MatchWrap | Qt::MatchRecursive);
}

bool VelMenuViewPrivate::showNextMatch()
{
    for (int i = findResults.size() - 1; i >= 0; --i) {
        if (findResults.at(i).isValid())
            continue;
        findResults.removeAt(i);
        if (i <= findPos)
            --findPos;
    }
    if (findResults.isEmpty())
        return false;
    findPos = (findPos + 1) % findResults.size();
    showMatch();
    return true;
}

void VelMenuViewPrivate::showMatch()
{
    const QModelIndex match = findResults.at(findPos);
    selectOnly(match);
    q->scrollTo(match);
}
