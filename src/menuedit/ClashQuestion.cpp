// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClashQuestion.h"

#include "EntryDisplay.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/GuardedDialog.h>

#include <QCheckBox>
#include <QCoreApplication>
#include <QFileInfo>
#include <QHash>
#include <QMessageBox>
#include <QPushButton>

namespace {

using Choice = NameClash::Choice;

QString shownName(const QString &path)
{
    const QFileInfo info(path);
    const QString file = EntryDisplay::describingFile(path, info.isDir());
    const QString name = file.isEmpty() ? QString() : EntryDisplay::shownName(VelUIDesktopEntry(file));
    return name.isEmpty() ? info.fileName() : name;
}

// What the user knows it by, and what it is about.
QString fullName(const QString &path)
{
    const QString name = shownName(path);
    const QString fileName = QFileInfo(path).fileName();
    return name == fileName ? name : QStringLiteral("%1 (%2)").arg(name, fileName);
}

QString textOf(const NameClash &clash)
{
    const QString folder = shownName(QFileInfo(clash.target).path());
    switch (clash.kind) {
    case NameClash::Kind::IsThere:
        return QCoreApplication::translate(
                   "MenuDrop",
                   "The folder '%1' already has '%2'. Keep both gives the new one another file name, Replace "
                   "puts the old one into the trash, Skip leaves the new one where it is; Cancel leaves "
                   "everything as it is.")
            .arg(folder, fullName(clash.target));
    case NameClash::Kind::HoldsThem:
        return QCoreApplication::translate(
                   "MenuDrop",
                   "The folder '%1' already has '%2', which the new one comes from. Keep both gives the new "
                   "one another file name, Skip leaves it where it is; Cancel leaves everything as it is.")
            .arg(folder, fullName(clash.target));
    case NameClash::Kind::IsPromised:
        return QCoreApplication::translate(
                   "MenuDrop",
                   "Another one that comes to the folder '%1' has the same file name as '%2'. Keep both "
                   "gives this one another file name, Skip leaves it where it is; Cancel leaves everything "
                   "as it is.")
            .arg(folder, fullName(clash.source));
    }
    return QString();
}

class ClashBox : public QMessageBox
{
public:
    ClashBox(const NameClash &clash, QWidget *parent)
        : QMessageBox(Question, QCoreApplication::translate("MenuDrop", "Name already taken"), textOf(clash),
                      Cancel, parent)
    {
        setTextFormat(Qt::PlainText);
        offer(Choice::KeepBoth, "keepBothButton", QCoreApplication::translate("MenuDrop", "&Keep both"));
        if (clash.isReplaceable())
            offer(Choice::Replace, "replaceButton", QCoreApplication::translate("MenuDrop", "&Replace"));
        offer(Choice::Skip, "skipButton", QCoreApplication::translate("MenuDrop", "&Skip"));
        if (!clash.isOneOfSeveral)
            return;
        m_forAll = new QCheckBox(
            QCoreApplication::translate("MenuDrop", "&Do the same with all further ones"), this);
        m_forAll->setObjectName(QStringLiteral("forAllCheckBox"));
        setCheckBox(m_forAll);
    }

    NameClash::Answer answer() const
    {
        return {m_choices.value(clickedButton(), Choice::Cancel), m_forAll && m_forAll->isChecked()};
    }

private:
    // The first is what Enter means.
    void offer(Choice choice, const char *name, const QString &text)
    {
        QPushButton *const button = addButton(text, AcceptRole);
        button->setObjectName(QLatin1String(name));
        if (m_choices.isEmpty())
            setDefaultButton(button);
        m_choices.insert(button, choice);
    }

    QHash<QAbstractButton *, Choice> m_choices;
    QCheckBox *m_forAll = nullptr;
};

} // namespace

NameClash::Answer ClashQuestion::ask(QWidget *parent, const NameClash &clash)
{
    GuardedDialog<ClashBox> box(clash, parent);
    box.exec();
    return box.isAlive() ? box->answer() : NameClash::Answer();
}
