// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFormHost.h"

#include <memory>

class QAction;
class QToolButton;

namespace VelUI {

class EntryTextDialog;
class FieldDescriptions;
class FormHistory;
class LanguageBar;
class LanguageRows;
class TrialLine;

/**
 * What the properties form has beyond the plain one.
 *
 * It puts its parts into the form when it is made and takes them out again when it is destroyed;
 * then the form is as it was. Its parts learn from it which rows there are, have places in them, and
 * hear of every change.
 */
class EntryFormAssistance : public QObject
{
    Q_OBJECT

public:
    explicit EntryFormAssistance(EntryFormHost &form);
    ~EntryFormAssistance() override;

    /// The rows in the order of the form, also those that the type of the entry hides. The rows of a
    /// language have another field and label when the form turns to another language.
    const QVector<FormRow> &rows() const;
    /// The row of \a key without a language; null when the form has none.
    const FormRow *row(const QString &key) const;
    bool isShown(const FormRow &row) const;

    /// Puts \a widget, such as a button, behind the field; the form owns it. It may be hidden, shown
    /// and deleted at will, and the Tab key comes to it after the field.
    void addBeside(const FormRow &row, QWidget *widget);
    /// The same for a widget, such as a sentence, under the field.
    void addBelow(const FormRow &row, QWidget *widget);

    /// What is shown under rows does not move the others until releaseRows(); showAhead() paints it before.
    void holdRows();
    void showAhead(const FormRow &row);
    void releaseRows();

    /// Gives a field another value as the user would, in a step of its own that can be taken back.
    void edit(const FormRow &row, const QVariant &value);
    /// Takes back what the user did in the form, and does it again.
    FormHistory &history() const { return *m_history; }

    /// The entry as it would be saved now; its contents() are those of the file.
    VelUIDesktopEntry record() const;

Q_SIGNALS:
    /// record() may have changed: the user edited something, an entry was loaded, the type is another.
    void recordChanged();

private:
    QToolButton *addButton(const char *name);
    void addHistory();
    void addText();
    void addTrial();
    void showText(bool isShown);

    EntryFormHost &m_form;
    QVector<FormRow> m_rows;
    std::unique_ptr<LanguageRows> m_languageRows;
    std::unique_ptr<LanguageBar> m_bar;
    std::unique_ptr<FieldDescriptions> m_descriptions;
    std::unique_ptr<FormHistory> m_history;
    std::unique_ptr<EntryTextDialog> m_text; ///< null while it is not shown
    std::unique_ptr<TrialLine> m_trial;
    QToolButton *m_textButton = nullptr;
};

} // namespace VelUI
