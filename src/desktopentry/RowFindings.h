// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FindingLine.h"

#include <QObject>
#include <QPointer>
#include <QVector>

#include <functional>

namespace VelUI {

/// What is said under one row of a form, and by its field to those who do not see it.
class RowFindings : public QObject
{
    Q_OBJECT

public:
    using Said = FindingLine::Said;

    /// So many lines are shown at most: files of another kind may have thousands of faults, of which the
    /// first tell enough.
    static constexpr int MostLines = 4;

    /// \a addLine puts a line under the row.
    RowFindings(std::function<void(FindingLine *)> addLine, QObject *parent);
    ~RowFindings() override;

    /// Says \a worst, that there are \a more, and has \a field describe itself with it.
    void say(QVector<Said> worst, int more, QWidget *field);
    bool isEmpty() const { return m_spoken.isEmpty(); }
    /// The last line that is shown; null when there is none.
    const QWidget *lastLine() const;

Q_SIGNALS:
    void repairRequested(const EntryRepair &repair);

private:
    FindingLine *line(int index);
    void describe(QWidget *field);

    const std::function<void(FindingLine *)> m_addLine;
    QVector<QPointer<FindingLine>> m_lines;
    QString m_spoken;
    QPointer<QWidget> m_field;
    struct Described
    {
        QPointer<QWidget> widget;
        QString former;
    };
    QVector<Described> m_described;
};

} // namespace VelUI
