// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RowFindings.h"

#include <QLineEdit>

#include <algorithm>
#include <utility>

namespace VelUI {

namespace {

// Files of another kind may have dozens of faults, of which the first tell enough.
constexpr int MostLines = 4;

EntryFinding summary(int left)
{
    return {EntryProblem::UnknownKey,
            EntryFinding::Hint,
            {},
            {},
            {},
            RowFindings::tr("And %n more.", nullptr, left),
            std::nullopt};
}

QStringList descriptions(const QWidget *widget, const QString &more)
{
    QStringList texts{widget->accessibleDescription(), more};
    texts.removeAll(QString());
    return texts;
}

} // namespace

RowFindings::RowFindings(std::function<void(FindingLine *)> addLine, QObject *parent)
    : QObject(parent)
    , m_addLine(std::move(addLine))
{
}

RowFindings::~RowFindings()
{
    m_spoken.clear();
    describe(nullptr);
}

void RowFindings::say(QVector<Said> all, QWidget *field)
{
    std::stable_sort(all.begin(), all.end(),
                     [](const Said &a, const Said &b) { return a.finding.severity > b.finding.severity; });
    if (all.size() > MostLines) {
        const EntryFinding rest = summary(all.size() - MostLines + 1);
        all.resize(MostLines - 1);
        all.append({rest, all.constLast().key, rest.sentence, false});
    }
    QStringList spoken;
    for (int i = 0; i < all.size(); ++i) {
        line(i)->say(all.at(i));
        spoken.append(line(i)->spoken());
    }
    for (int i = all.size(); i < m_lines.size(); ++i) {
        if (m_lines.at(i))
            m_lines.at(i)->hide();
    }
    m_spoken = spoken.join(QLatin1Char(' '));
    describe(field);
}

const QWidget *RowFindings::lastLine() const
{
    const QWidget *last = nullptr;
    for (const QPointer<FindingLine> &line : m_lines) {
        if (line && !line->isHidden())
            last = line;
    }
    return last;
}

FindingLine *RowFindings::line(int index)
{
    while (m_lines.size() <= index) {
        auto *const line = new FindingLine;
        line->hide();
        m_addLine(line);
        connect(line, &FindingLine::repairRequested, this, &RowFindings::repairRequested);
        m_lines.append(line);
    }
    return m_lines.at(index);
}

// The focus is in a line of the field, if it has any.
void RowFindings::describe(QWidget *field)
{
    for (const Described &described : qAsConst(m_described)) {
        if (described.widget)
            described.widget->setAccessibleDescription(described.former);
    }
    m_described.clear();
    if (!field || m_spoken.isEmpty())
        return;
    QList<QWidget *> widgets{field};
    for (QLineEdit *edit : field->findChildren<QLineEdit *>())
        widgets.append(edit);
    for (QWidget *widget : qAsConst(widgets)) {
        m_described.append({widget, widget->accessibleDescription()});
        widget->setAccessibleDescription(descriptions(widget, m_spoken).join(QLatin1Char(' ')));
    }
}

} // namespace VelUI
