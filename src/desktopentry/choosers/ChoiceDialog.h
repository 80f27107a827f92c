// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ChoiceModel.h"

#include <QDialog>
#include <QTimer>

#include <memory>

class QDialogButtonBox;
class QLabel;
class QLineEdit;

namespace VelUI {

class ChoiceFilter;
class ChoiceSource;
class ChoiceView;

/**
 * A dialog in which a user chooses from many things: a line to filter them, and a list of them, with
 * check boxes where several may be chosen.
 *
 * The keyboard is enough: typing filters, Down leads into the list, Space checks a box there. The size
 * is remembered.
 */
class ChoiceDialog : public QDialog
{
    Q_OBJECT

public:
    struct Texts
    {
        QString title;
        QStringList headers; ///< of the columns
        QString sizeGroup; ///< under which the size is kept; no user text
    };

    ChoiceDialog(ChoiceModel::Kind kind, const Texts &texts, QWidget *parent);
    ~ChoiceDialog() override;

    ChoiceModel *model() const { return m_model; }

    /// Begins with \a values as the chosen ones; they stand first.
    void setChosen(const QStringList &values);
    /// What is chosen, in the order in which it was at the beginning, new ones behind.
    QStringList chosen() const;

    /// Reads the choices from \a source, some at a time, while the user works already.
    void read(std::unique_ptr<ChoiceSource> source);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void build(const Texts &texts);
    void layOut();
    void connectParts();
    bool isSeveral() const;
    bool watchFilterKey(const QKeyEvent &event);
    void enterList();
    void filterChanged();
    void rowsChanged();
    void showState(const QString &state);
    void showCount();
    void readSome();

    ChoiceModel *const m_model;
    ChoiceFilter *const m_filter;
    QLineEdit *m_filterEdit = nullptr;
    ChoiceView *m_view = nullptr;
    QLabel *m_countLabel = nullptr;
    QLabel *m_stateLabel = nullptr;
    QDialogButtonBox *m_buttons = nullptr;
    const QString m_sizeGroup;
    std::unique_ptr<ChoiceSource> m_source;
    QTimer m_reading;
};

} // namespace VelUI
