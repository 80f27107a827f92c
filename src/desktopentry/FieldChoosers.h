// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QStringList>

#include <functional>
#include <optional>

class QToolButton;
class QWidget;

namespace VelUI {

class EntryFormAssistance;
class PathEdit;
class StringListEdit;
struct FormRow;

/// The buttons of the assisted form behind those fields whose values can be chosen: MIME types,
/// categories, desktops, programs and field codes. What is chosen is an edit of the user.
class FieldChoosers : public QObject
{
    Q_OBJECT

public:
    /// Adds the buttons to the form of \a assistance, which owns this.
    explicit FieldChoosers(EntryFormAssistance *assistance);

private:
    using ChooseList = std::function<std::optional<QStringList>(QWidget *, const QStringList &)>;
    // The text of a field with a program that was chosen for it.
    using TakeProgram = QString (*)(const QString &text, const QString &program);

    void addListButton(const QString &key, const ChooseList &choose);
    void addProgramButton(const QString &key, TakeProgram take);
    void addFieldCodes(const QString &key);
    QToolButton *addButton(const FormRow &row, const QString &text, const QString &tip);

    EntryFormAssistance *const m_assistance;
};

} // namespace VelUI
