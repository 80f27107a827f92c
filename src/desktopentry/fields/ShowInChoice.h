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
     * Writes the chosen list to \a record and leaves the other one alone.
     */
    template <typename Record>
    void save(Record *record) const
    {
        if (isOnlyChosen())
            record->setOnlyShowIn(only());
        else
            record->setNotShowIn(no());
    }

    /// Whether load() chooses "Only show in" for \a record.
    template <typename Record>
    static bool choosesOnly(const Record &record)
    {
        return record.getNotShowIn().isEmpty();
    }

    bool isOnlyChosen() const;
    /// Chooses "Only show in" or the other list; nobody is told.
    void choose(bool only);
    StringListEdit *onlyField() const { return m_only; }
    StringListEdit *noField() const { return m_no; }

Q_SIGNALS:
    /// The user chose the other list.
    void switched();

private:
    QStringList only() const;
    QStringList no() const;

    QRadioButton *m_onlyButton;
    StringListEdit *m_only;
    QRadioButton *m_noButton;
    StringListEdit *m_no;
    bool m_isLoading = false;
};

} // namespace VelUI
