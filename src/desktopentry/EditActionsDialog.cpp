// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditActionsDialog.h"

#include "ActionIds.h"
#include "EditActionsWidget.h"
#include "fields/ListMessage.h"

#include <QCoreApplication>

namespace VelUI {

namespace {

const ListDialogForm::Names FormNames = {
    "EditActionsDialog",
    QT_TRANSLATE_NOOP("EditActionsDialog", "Actions"),
};

constexpr int MostSentences = 2;

class Sentences
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::EditActionsDialog)

public:
    static QString of(const ActionIds::Problem &problem);
    static QString of(const QVector<ActionIds::Problem> &problems);
    static QString repairOf(const QVector<ActionIds::Problem> &problems);
};

QString Sentences::of(const ActionIds::Problem &problem)
{
    const QString id = ListMessage::shortened(problem.id);
    const QString proposal = ListMessage::shortened(problem.proposal);
    switch (problem.fault) {
    case ActionIds::Fault::Missing:
        return tr("An action has no id. It can have \"%1\".").arg(proposal);
    case ActionIds::Fault::Equal:
        return tr("Two actions have the id \"%1\". The second one can have \"%2\".").arg(id, proposal);
    case ActionIds::Fault::Impossible:
        return tr("No entry can hold the id \"%1\". It can be \"%2\".").arg(id, proposal);
    case ActionIds::Fault::Odd:
        break;
    }
    return tr("The id \"%1\" should have only A to Z, a to z, 0 to 9 and \"-\" in it, as \"%2\" has.")
        .arg(id, proposal);
}

QString Sentences::of(const QVector<ActionIds::Problem> &problems)
{
    QStringList sentences;
    for (const ActionIds::Problem &problem : problems.mid(0, MostSentences))
        sentences.append(of(problem));
    if (problems.size() > MostSentences)
        sentences.append(tr("%n more id(s) should be changed.", nullptr, problems.size() - MostSentences));
    return sentences.join(QLatin1Char('\n'));
}

QString Sentences::repairOf(const QVector<ActionIds::Problem> &problems)
{
    if (problems.size() == 1)
        return tr("Use \"%1\"").arg(ListMessage::shortened(problems.constFirst().proposal));
    return problems.isEmpty() ? QString() : tr("Use the proposed ids");
}

} // namespace

EditActionsDialog::EditActionsDialog(const QList<VelUIDesktopAction> &actions, QWidget *parent)
    : QDialog(parent)
    , m_listWidget(new EditActionsWidget(this))
{
    m_ui.setupUi(this, m_listWidget, FormNames);
    m_listWidget->setActions(actions);
    const QStringList ids = ActionIds::of(actions);
    m_toldIds = QSet<QString>(ids.begin(), ids.end());
    m_ui.repair = [this] { repairIds(); };
    connect(m_listWidget, &EditActionsWidget::changed, this, [this] {
        setChanged(true);
        tellOfIds();
    });
    setChanged(false);
    tellOfIds();
}

void EditActionsDialog::tellOfIds()
{
    const QVector<ActionIds::Problem> problems = ActionIds::problems(ActionIds::of(actions()));
    m_ui.tell(Sentences::of(problems), Sentences::repairOf(problems));
}

void EditActionsDialog::repairIds()
{
    const QList<VelUIDesktopAction> before = actions();
    const QVector<ActionIds::Problem> problems = ActionIds::problems(ActionIds::of(before));
    if (problems.isEmpty())
        return;
    m_listWidget->setActions(ActionIds::repaired(before));
    m_listWidget->select(problems.constFirst().row);
    m_listWidget->setFocus();
    setChanged(true);
    tellOfIds();
}

void EditActionsDialog::accept()
{
    bool isHeld = false;
    for (const ActionIds::Problem &problem : ActionIds::problems(ActionIds::of(actions()))) {
        isHeld = isHeld || ActionIds::isLost(problem.fault) || !m_toldIds.contains(problem.id);
        m_toldIds.insert(problem.id);
    }
    if (isHeld)
        m_ui.insist();
    else
        QDialog::accept();
}

QList<VelUIDesktopAction> EditActionsDialog::actions() const
{
    return m_listWidget->actions();
}

void EditActionsDialog::setTexts(const QString &addTitle, const QString &editTitle)
{
    m_listWidget->setTexts(addTitle, editTitle);
}

void EditActionsDialog::setChanged(bool changed)
{
    m_ui.setOkEnabled(changed);
}

} // namespace VelUI
