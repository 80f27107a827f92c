// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QStringList>
#include <QVector>

#include <functional>
#include <optional>

class QToolButton;
class QWidget;

namespace VelUI {

class PathEdit;
class StringListEdit;
struct FormRow;

/// The buttons of a form behind those fields whose values can be chosen: MIME types, categories,
/// desktops, programs and field codes. What is chosen is an edit of the user.
class FieldChoosers : public QObject
{
    Q_OBJECT

public:
    /// Puts a button behind the field of a row.
    using Place = std::function<void(const FormRow &row, QWidget *button)>;

    /// Gives buttons to those of \a rows that have a chooser.
    FieldChoosers(const QVector<FormRow> &rows, Place place, QObject *parent);

private:
    using ChooseList = std::function<std::optional<QStringList>(QWidget *, const QStringList &)>;
    // The text of a field with a program that was chosen for it.
    using TakeProgram = QString (*)(const QString &text, const QString &program);

    void addTo(const FormRow &row);
    void addListButton(const FormRow &row, const ChooseList &choose);
    void addProgramButton(const FormRow &row, TakeProgram take);
    void addFieldCodes(const FormRow &row);
    QToolButton *addButton(const FormRow &row, const QString &text, const QString &tip);

    const Place m_place;
};

} // namespace VelUI
