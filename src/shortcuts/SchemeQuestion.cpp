// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SchemeQuestion.h"

#include "IShortcutObject.h"
#include "ShortcutRows.h"
#include "VelKeyServer.h"

#include <frame/GuardedDialog.h>

#include <QCheckBox>
#include <QMessageBox>
#include <QPushButton>

using ShortcutScheme::OnClash;

SchemeQuestion::SchemeQuestion(const ShortcutsModel *model, QWidget *window)
    : m_model(model)
    , m_window(window)
{
}

OnClash SchemeQuestion::ask(const QString &name, const QString &otherName, const QKeySequence &key)
{
    if (m_forAll)
        return *m_forAll;
    if (!m_model)
        return OnClash::Cancel;
    GuardedDialog<QMessageBox> box(QMessageBox::Question, tr("Import keys"), question(name, otherName, key),
                                   QMessageBox::Cancel, m_window.data());
    box->setTextFormat(Qt::PlainText);
    // A global shortcut cannot be cleared from here.
    const QPushButton *replace =
        otherName.isEmpty() ? nullptr : box->addButton(tr("&Replace"), QMessageBox::AcceptRole);
    QPushButton *skip = box->addButton(tr("&Skip"), QMessageBox::AcceptRole);
    box->setDefaultButton(skip);
    auto *forAll = new QCheckBox(tr("&Do the same with all further ones"));
    box->setCheckBox(forAll);
    box.exec();
    if (!box.isAlive())
        return OnClash::Cancel;
    const QAbstractButton *clicked = box->clickedButton();
    if (clicked != skip && (!replace || clicked != replace))
        return OnClash::Cancel;
    const OnClash answer = clicked == skip ? OnClash::Skip : OnClash::Replace;
    if (forAll->isChecked())
        m_forAll = answer;
    return answer;
}

QString SchemeQuestion::question(const QString &name, const QString &otherName, const QKeySequence &key) const
{
    const QString shownKey = key.toString(QKeySequence::PortableText);
    if (otherName.isEmpty())
        return tr("The file has shortcut '%1' for action '%2', but the global action '%3' has it. "
                  "Skip leaves action '%2' as it is; Cancel takes nothing over.")
            .arg(shownKey, textOf(name), VelKeyServer::checkForGlobalShortcut(key));
    return tr("The file has shortcut '%1' for action '%2', but action '%3' has it, too. "
              "Replace takes it away from action '%3', Skip leaves action '%2' as it is; "
              "Cancel takes nothing over.")
        .arg(shownKey, textOf(name), textOf(otherName));
}

// What the user knows an action by.
QString SchemeQuestion::textOf(const QString &name) const
{
    for (int group = 0; group < m_model->rowCount(); ++group) {
        const auto objects = ShortcutRows::ofGroup(*m_model, group);
        for (const IShortcutObject *object : objects) {
            if (object && object->name() == name)
                return object->text();
        }
    }
    return name;
}
