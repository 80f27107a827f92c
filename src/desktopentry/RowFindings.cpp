// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RowFindings.h"

#include <QLineEdit>

#include <utility>

namespace VelUI {

namespace {

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

void RowFindings::say(QVector<Said> worst, int more, QWidget *field)
{
    if (more > 0) {
        const EntryFinding rest = summary(more);
        worst.append({rest, worst.constLast().key, rest.sentence, false});
    }
    QStringList spoken;
    for (int i = 0; i < worst.size(); ++i) {
        line(i)->say(worst.at(i));
        spoken.append(line(i)->spoken());
    }
    for (int i = worst.size(); i < m_lines.size(); ++i) {
        if (m_lines.at(i))
            m_lines.at(i)->hide();
    }
    const QString formerly = std::exchange(m_spoken, spoken.join(QLatin1Char(' ')));
    // Whoever listens to the descriptions hears of changes alone.
    if (m_spoken != formerly || field != m_field)
        describe(field);
    m_field = field;
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
