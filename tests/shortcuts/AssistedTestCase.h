// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "RecordingTestCase.h"

#include <shortcuts/ClashLine.h>

#include <QScrollArea>

/**
 * An assisted dialog that is shown and active, with the lines in its box of clashes.
 */
class AssistedTestCase : public RecordingTestCase
{
    Q_OBJECT

protected Q_SLOTS:
    void init()
    {
        RecordingTestCase::init();
        m_dialog->setAssistance(true);
    }

protected:
    static inline const QKeySequence ctrlJ{Qt::CTRL | Qt::Key_J};

    QScrollArea *clashBox() const { return child<QScrollArea>("clashBox"); }
    QPushButton *noneButton() const { return child<QPushButton>("noneButton"); }

    // The lines that are seen, from the top.
    QVector<ClashLine *> lines() const
    {
        QVector<ClashLine *> seen;
        const auto all = clashBox()->findChildren<ClashLine *>();
        for (ClashLine *line : all) {
            if (!line->isHidden())
                seen.append(line);
        }
        std::sort(seen.begin(), seen.end(),
                  [](const ClashLine *left, const ClashLine *right) { return left->y() < right->y(); });
        return seen;
    }
    QStringList texts() const
    {
        QStringList texts;
        for (const ClashLine *line : lines())
            texts.append(line->findChildren<QLabel *>().constLast()->text());
        return texts;
    }
    // The button of a text in a line; null when it has none.
    QPushButton *lineButton(int line, const char *text) const
    {
        const auto buttons = lines().at(line)->findChildren<QPushButton *>();
        for (QPushButton *button : buttons) {
            if (button->text() == str(text))
                return button;
        }
        return nullptr;
    }
    static QString sameKey(const char *key, const char *other)
    {
        return str("Shortcut '%1' is already used for action '%2'.").arg(str(key), str(other));
    }

    // Records a key that another shortcut has, until the line of that is seen.
    void recordClash(const char *name, const QString &keys)
    {
        recordUnfinished(name, keys);
        QTRY_VERIFY(!lines().isEmpty());
    }
};
