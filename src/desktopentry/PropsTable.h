// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FormRow.h"
#include "PropsRow.h"

#include <QCoreApplication>
#include <QVector>

#include <memory>
#include <vector>

class QLineEdit;

namespace VelUI {

class ShowInChoice;
class StringListEdit;
class UrlRow;

/// The rows of the properties form below the one of the type, in their order.
///
/// The source has the table: a line for each key.
class PropsTable
{
    Q_DECLARE_TR_FUNCTIONS(VelDesktopEntryPropsWidgetPrivate)

public:
    /// Appends the rows to \a layout.
    explicit PropsTable(FormLayout *layout);
    ~PropsTable();

    /// Gives the dialogs of a field their titles and labels.
    static void setKeywordTexts(StringListEdit *field);

    /// Shows the rows for an entry of \a type; hides and empties the others.
    void showFor(const QString &type);
    /// The same when the user changes the type: the rows come back with what they showed when the
    /// user left their type.
    void changeTo(const QString &type);
    /// Fills the rows that are shown for the type of \a entry.
    void load(const VelUIDesktopEntry &entry, const QString &type);
    void save(VelUIDesktopEntry *entry, const QString &type) const;

    UrlRow *urlRow() const;
    ShowInChoice *showIn() const;
    const QVector<FormRow> &formRows() const;
    /// The line of the name, with which editing begins.
    QLineEdit *nameLine() const;

private:
    Q_DISABLE_COPY(PropsTable)

    // The label of a row; a bold one marks a key that an entry must have.
    struct Label
    {
        Label(const QString &labelText, bool bold = false, const QString &translatedText = QString())
            : text(labelText)
            , isBold(bold)
            , translated(translatedText)
        {
        }
        QString text;
        bool isBold;
        QString translated;
    };

    static Label required(const QString &text);
    static Label localized(const QString &text);
    static void setCategoryTexts(StringListEdit *field);
    static void setMimeTypeTexts(StringListEdit *field);

    void build();
    void forget();
    void addUrl();
    void addShowIn();
    template <typename Field, typename Getter, typename Setter>
    Field *add(const char *key, const Label &label, PropsRow::ShownFor shownFor, const char *objectName,
               Getter getter, Setter setter);

    FormLayout *const m_layout;
    std::vector<std::unique_ptr<PropsRow>> m_rows;
    QVector<FormRow> m_formRows;
    UrlRow *m_urlRow = nullptr;
    ShowInChoice *m_showIn = nullptr;
    QLineEdit *m_nameLine = nullptr;
};

} // namespace VelUI
