// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QVector>
#include <QWidget>

class QHBoxLayout;
class QPushButton;

/**
 * One thing that speaks against a key, and the ways out of it.
 *
 * Assistive programs see an alert.
 */
class ClashLine : public QWidget
{
    Q_OBJECT

public:
    struct Content
    {
        QString text; ///< a whole sentence
        QString key; ///< the key that is spoken against, as it is shown
        QString otherName; ///< the name of the other shortcut; empty for none
        QString otherText; ///< what the user knows the other shortcut by
        bool isSerious = false; ///< whether the key would not work, or would not be taken
        bool canTakeOver = false; ///< whether the other shortcut can give its key away

        bool operator==(const Content &other) const;
    };

    ClashLine(Content content, QWidget *parent);
    ~ClashLine() override;

    const Content &content() const { return m_content; }
    /// Those that the line has, in their order.
    const QVector<QPushButton *> &buttons() const { return m_buttons; }
    /// Tells assistive programs of the line, which is seen now.
    void announce();

Q_SIGNALS:
    void goToRequested(const QString &otherName);
    void takeOverRequested(const QString &otherName);

private:
    QPushButton *addButton(QHBoxLayout *layout, const QString &text, const QString &name);
    void addButtons(QHBoxLayout *layout);

    const Content m_content;
    QVector<QPushButton *> m_buttons;
};
