// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FormRow.h"
#include "RowFindings.h"
#include "check/CachedLookups.h"

#include <QObject>
#include <QTimer>
#include <QVector>

#include <functional>
#include <memory>

class QWidget;

namespace VelUI {

class EntryFormAssistance;

/**
 * Checks the entry in an assisted form while the user edits it, and says under each row what is wrong
 * with it.
 *
 * What no row is about stands under the last one, what an action is about under that of the actions. F8
 * goes to the next row that has something to say, Shift+F8 to the previous one.
 */
class FormFindings : public QObject
{
    Q_OBJECT

public:
    /// What the form knows and its assistance does not.
    struct Form
    {
        QWidget *widget;
        std::function<QString()> path; ///< of the file that the entry will be
        std::function<bool()> isReadOnly;
    };

    FormFindings(EntryFormAssistance *assistance, Form form);
    ~FormFindings() override;

private:
    class FocusPlace;

    void check();
    void say(QVector<QVector<const EntryFinding *>> all);
    void sayUnder(int row, QVector<const EntryFinding *> *all);
    void makeRoom();
    int rowOf(const EntryFinding &finding) const;
    const FormRow *rowOf(const EntryRepair &repair) const;
    RowFindings::Said said(const EntryFinding &finding, int row) const;
    void goOn(int step);
    void bringIntoView(int row) const;
    void repair(const EntryRepair &repair);

    EntryFormAssistance &m_assistance;
    const Form m_form;
    CachedLookups m_lookups;
    QTimer m_soon;
    QTimer m_roomSoon;
    std::unique_ptr<FocusPlace> m_place; ///< null unless room is to be made
    QVector<RowFindings *> m_rows; ///< as the form has them
};

} // namespace VelUI
