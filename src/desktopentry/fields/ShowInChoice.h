// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QStringList>

class QRadioButton;
class QWidget;

namespace VelUI {

class FormLayout;
class StringListEdit;

/// The choice between "Only show in" and "Not show in", each with a list of desktop environments:
/// two rows of a form whose buttons exclude each other, "Only show in" first.
class ShowInChoice : public QObject
{
    Q_OBJECT

public:
    /// The texts of a form.
    struct Texts
    {
        QString only; ///< the first button and its dialogs
        QString no; ///< the second button and its dialogs
        QString addLabel;
        QString editLabel;
    };

    /// Appends the rows to \a layout; its widget owns what they are made of.
    ShowInChoice(const Texts &texts, FormLayout *layout);

    /// Fills both lists and chooses "Not show in" when its list holds something.
    void load(const QStringList &only, const QStringList &no);

    /// Fills the choice from \a record: an entry or an action.
    template <typename Record>
    void load(const Record &record)
    {
        load(record.getOnlyShowIn(), record.getNotShowIn());
    }

    /**
     * Writes the chosen list to \a record and empties the other one.
     *
     * A record that holds both lists keeps them, unless something else was chosen: here, or in the
     * other record that the choice was filled from.
     */
    template <typename Record>
    void save(Record *record) const
    {
        if (isOnlyChosen()) {
            record->setOnlyShowIn(only());
            record->setNotShowIn({});
            return;
        }
        const bool keepsBoth = keepsBothOf(record->getOnlyShowIn(), record->getNotShowIn());
        record->setNotShowIn(no());
        if (!keepsBoth)
            record->setOnlyShowIn({});
    }

private:
    bool isOnlyChosen() const;
    QStringList only() const;
    QStringList no() const;
    bool keepsBothOf(const QStringList &only, const QStringList &no) const;

    QRadioButton *m_onlyButton;
    StringListEdit *m_only;
    QRadioButton *m_noButton;
    StringListEdit *m_no;
    bool m_isSwitched = false; // since the last loading
};

} // namespace VelUI
