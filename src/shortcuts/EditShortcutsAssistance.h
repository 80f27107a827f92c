// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditShortcutsForm.h"
#include "ShortcutsModel.h"

#include <QObject>
#include <QPointer>
#include <QTimer>

#include <memory>

class NoMatchLabel;
class ShortcutFilterBar;
class TreeAssistance;

/**
 * What the shortcuts dialog has beyond its plain form.
 *
 * It puts its parts into the form when it is made and takes them out again when it is destroyed;
 * then the form is as it was.
 */
class EditShortcutsAssistance : public QObject
{
    Q_OBJECT

public:
    /// Completes \a form, which shows \a shortcuts, or nothing when that is null.
    EditShortcutsAssistance(const EditShortcutsForm &form, ShortcutsModel *shortcuts);
    ~EditShortcutsAssistance() override;

    /// Goes one step back to the whole tree; false when there is no filter.
    bool stepBackFromFilter();

Q_SIGNALS:
    /// A part made other keys pending.
    void keysChanged();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QWidget *dialog() const;
    void addFilterBar();
    void addSchemes();
    void restoreSizes();
    void rememberSizes() const;
    void applyFilter();
    void showCount(int count);

    const EditShortcutsForm m_form;
    const QPointer<ShortcutsModel> m_model;
    const std::unique_ptr<TreeAssistance> m_tree;
    std::unique_ptr<ShortcutFilterBar> m_filterBar;
    std::unique_ptr<NoMatchLabel> m_noMatchLabel;
    QTimer m_preparation; // of the filter
};
