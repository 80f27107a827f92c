// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QDialog>

class QComboBox;
class QDialogButtonBox;
class QLabel;

namespace VelUI {

/// Asks for a language: one with a name, or any well-formed code.
class LanguageDialog : public QDialog
{
    Q_OBJECT

public:
    explicit LanguageDialog(QWidget *parent = nullptr);

    /// The code that was chosen or typed.
    QString language() const;

private:
    void fill();
    void judge();

    QComboBox *const m_box;
    QLabel *const m_verdict;
    QDialogButtonBox *const m_buttons;
};

} // namespace VelUI
