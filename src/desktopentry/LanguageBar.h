// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFormHost.h"
#include "LanguageNote.h"

#include <QMap>
#include <QStringList>
#include <QWidget>

class QAbstractButton;
class QBoxLayout;
class QComboBox;
class QLabel;

namespace VelUI {

class LanguageRows;

/// The line above the form: the language that its rows show, who sees that, and a place for buttons.
class LanguageBar : public QWidget
{
    Q_OBJECT

public:
    /// Puts itself above the rows of \a form, which \a rows turns.
    LanguageBar(EntryFormHost &form, LanguageRows &rows);

    /// Puts a button at the end of the line.
    void addButton(QAbstractButton *button);

private:
    // What is told of an entry.
    struct Coverage
    {
        QString shown; // language
        LanguageNote::Languages languages; // of each key
        QMap<QString, QString> inForce; // for the user
        QStringList texts; // keys that have a text for everybody

        bool operator==(const Coverage &other) const
        {
            return shown == other.shown && languages == other.languages && inForce == other.inForce
                && texts == other.texts;
        }
    };
    struct Item
    {
        QString language; // empty for the user's own
        QString text;
        bool exists;
    };

    void build();
    void refresh();
    Coverage coverage() const;
    void showItems(const QVector<Item> &items);
    void choose(int item);
    void askForLanguage();
    Item itemOf(const QString &language) const;
    static QString textOf(const QString &language, bool exists, int count, int total);
    QStringList otherLanguages() const;
    QString note() const;

    EntryFormHost &m_form;
    LanguageRows &m_rows;
    QBoxLayout *m_line;
    QComboBox *m_box;
    QLabel *m_note;
    Coverage m_coverage;
};

} // namespace VelUI
