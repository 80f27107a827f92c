// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormFindings.h"

#include "EditActionsWidget.h"
#include "EntryFormAssistance.h"
#include "FieldEdit.h"
#include "check/EntryCheck.h"

#include <QApplication>
#include <QCoreApplication>
#include <QPointer>
#include <QScrollArea>
#include <QScrollBar>
#include <QShortcut>
#include <QWidget>

#include <algorithm>
#include <utility>

namespace VelUI {

// Where the focus is in the view of a form: what the user types in must not move away under his hands.
class FormFindings::FocusPlace
{
public:
    explicit FocusPlace(const QWidget *form)
        : m_area(form->findChild<QScrollArea *>())
        , m_focused(QApplication::focusWidget())
    {
        if (!m_area || !m_focused || !m_area->widget()->isAncestorOf(m_focused))
            m_focused = nullptr;
        else
            m_top = top();
    }

    /// Lays out what changed and scrolls by as much as that moved the place.
    void restore() const
    {
        QCoreApplication::sendPostedEvents(nullptr, QEvent::LayoutRequest);
        if (!m_focused || !m_area)
            return;
        QScrollBar *const bar = m_area->verticalScrollBar();
        bar->setValue(bar->value() + top() - m_top);
    }

private:
    int top() const { return m_focused->mapTo(m_area->viewport(), QPoint()).y(); }

    QPointer<QScrollArea> m_area;
    QPointer<QWidget> m_focused;
    int m_top = 0;
};

namespace {

const QLatin1String MainGroup("Desktop Entry");
const QLatin1String ActionPrefix("Desktop Action ");

} // namespace

FormFindings::FormFindings(EntryFormAssistance *assistance, Form form)
    : QObject(assistance)
    , m_assistance(*assistance)
    , m_form(std::move(form))
{
    for (int i = 0; i < m_assistance.rows().size(); ++i) {
        const auto addLine = [this, i](FindingLine *line) {
            m_assistance.addBelow(m_assistance.rows().at(i), line);
        };
        m_rows.append(new RowFindings(addLine, this));
        connect(m_rows.last(), &RowFindings::repairRequested, this, &FormFindings::repair);
    }
    // Several signals may tell of one edit.
    m_soon.setSingleShot(true);
    m_roomSoon.setSingleShot(true);
    connect(&m_soon, &QTimer::timeout, this, &FormFindings::check);
    connect(&m_roomSoon, &QTimer::timeout, this, &FormFindings::makeRoom);
    connect(assistance, &EntryFormAssistance::recordChanged, &m_soon, [this] { m_soon.start(0); });
    connect(&m_lookups, &CachedLookups::known, this, &FormFindings::check);
    // Whoever comes back may have brought what was missing.
    connect(qApp, &QGuiApplication::applicationStateChanged, this, [this](Qt::ApplicationState state) {
        if (state == Qt::ApplicationActive)
            m_soon.start(0);
    });
    for (const int step : {1, -1}) {
        const QKeySequence key(step > 0 ? Qt::Key_F8 : int(Qt::SHIFT) | int(Qt::Key_F8));
        auto *const shortcut = new QShortcut(key, m_form.widget);
        connect(this, &QObject::destroyed, shortcut, &QObject::deleteLater);
        connect(shortcut, &QShortcut::activated, this, [this, step] { goOn(step); });
    }
    m_soon.start(0);
}

FormFindings::~FormFindings() = default;

void FormFindings::check()
{
    m_lookups.dropQuestions();
    const VelUIDesktopEntry record = m_assistance.record();
    const EntryFindings findings = EntryCheck::check(record, record.contents(), m_form.path(), m_lookups);
    QVector<QVector<const EntryFinding *>> all(m_rows.size());
    for (const EntryFinding &finding : findings)
        all[rowOf(finding)].append(&finding);
    say(all);
}

// The sentences come first: moving and painting all rows below takes several times as long.
void FormFindings::say(QVector<QVector<const EntryFinding *>> all)
{
    if (!m_place)
        m_place = std::make_unique<FocusPlace>(m_form.widget);
    m_assistance.holdRows();
    for (int i = 0; i < m_rows.size(); ++i) {
        sayUnder(i, &all[i]);
        m_assistance.showAhead(m_assistance.rows().at(i));
    }
    m_roomSoon.start(0);
}

void FormFindings::sayUnder(int row, QVector<const EntryFinding *> *all)
{
    std::stable_sort(all->begin(), all->end(),
                     [](const EntryFinding *a, const EntryFinding *b) { return a->severity > b->severity; });
    const int lines = all->size() > RowFindings::MostLines ? RowFindings::MostLines - 1 : all->size();
    QVector<RowFindings::Said> worst;
    for (int i = 0; i < lines; ++i)
        worst.append(said(*all->at(i), row));
    m_rows.at(row)->say(worst, all->size() - lines, m_assistance.rows().at(row).field);
}

void FormFindings::makeRoom()
{
    m_roomSoon.stop();
    m_assistance.releaseRows();
    if (const auto place = std::exchange(m_place, nullptr))
        place->restore();
}

// A translation is shown in the row behind that of its key.
int FormFindings::rowOf(const EntryFinding &finding) const
{
    const bool isOfAction = finding.group.startsWith(ActionPrefix);
    const QString key = isOfAction ? QStringLiteral("Actions") : finding.key;
    const auto &rows = m_assistance.rows();
    if (key.isEmpty() || !(isOfAction || finding.group == MainGroup))
        return rows.size() - 1;
    for (int i = 0; i < rows.size(); ++i) {
        if (rows.at(i).key != key || !m_assistance.isShown(rows.at(i)))
            continue;
        const bool hasTranslation = i + 1 < rows.size() && rows.at(i + 1).key == key;
        return i + (hasTranslation && !finding.locale.isEmpty() && !isOfAction ? 1 : 0);
    }
    return rows.size() - 1;
}

RowFindings::Said FormFindings::said(const EntryFinding &finding, int row) const
{
    const FormRow &shown = m_assistance.rows().at(row);
    const bool isOfAction = finding.group.startsWith(ActionPrefix);
    QString about;
    if (isOfAction && !finding.key.isEmpty())
        about = finding.group.mid(ActionPrefix.size());
    else if (!finding.locale.isEmpty())
        about = QStringLiteral("%1[%2]").arg(finding.key, finding.locale);
    else if (finding.key != shown.key && !finding.sentence.contains(finding.key))
        about = finding.key;
    const QString sentence = about.isEmpty()
        ? finding.sentence
        : tr("%1: %2", "a key or an action of an entry, and what is wrong with it")
              .arg(about, finding.sentence);
    const bool canRepair = finding.repair && rowOf(*finding.repair) == &shown && shown.field->isEnabled()
        && !m_form.isReadOnly();
    const QString key = finding.key.isEmpty() ? QStringLiteral("File") : finding.key;
    return {finding, isOfAction ? shown.key : key, sentence, canRepair};
}

void FormFindings::goOn(int step)
{
    makeRoom();
    const auto &rows = m_assistance.rows();
    int current = step > 0 ? -1 : rows.size();
    for (int i = 0; i < rows.size(); ++i) {
        const QWidget *focused = QApplication::focusWidget();
        if (focused && (rows.at(i).field == focused || rows.at(i).field->isAncestorOf(focused)))
            current = i;
    }
    for (int i = 1; i <= rows.size(); ++i) {
        const int next = (current + i * step + 2 * rows.size()) % rows.size();
        if (m_rows.at(next)->isEmpty() || !m_assistance.isShown(rows.at(next)))
            continue;
        FieldEdit::focus(rows.at(next).field);
        bringIntoView(next);
        return;
    }
    QApplication::beep();
}

// The field and what is said about it.
void FormFindings::bringIntoView(int row) const
{
    auto *const area = m_form.widget->findChild<QScrollArea *>();
    const QWidget *const line = m_rows.at(row)->lastLine();
    if (!area || !line)
        return;
    const QRect place(line->mapTo(area->widget(), QPoint()), line->size());
    area->ensureVisible(place.left(), place.bottom(), 0, 0);
    area->ensureWidgetVisible(m_assistance.rows().at(row).field);
}

const FormRow *FormFindings::rowOf(const EntryRepair &repair) const
{
    return m_assistance.row(repair.action.isEmpty() ? repair.key : QStringLiteral("Actions"));
}

void FormFindings::repair(const EntryRepair &repair)
{
    const FormRow *row = rowOf(repair);
    if (!row)
        return;
    if (repair.action.isEmpty()) {
        m_assistance.edit(*row, repair.value);
    } else {
        VelUIDesktopEntry entry = m_assistance.record();
        repair.applyTo(&entry);
        m_assistance.edit(*row, QVariant::fromValue(entry.getActions()));
    }
    FieldEdit::focus(row->field);
}

} // namespace VelUI
