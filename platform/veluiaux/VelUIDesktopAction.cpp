// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelUIDesktopAction.h>

#include <QSharedData>

class VelUIDesktopActionData : public QSharedData
{
public:
    QString id;
    QString name;
    QString localName;
    QString icon;
    QString localIcon;
    QString exec;
    QStringList onlyShowIn;
    QStringList notShowIn;
};

VelUIDesktopAction::VelUIDesktopAction()
    : d(new VelUIDesktopActionData)
{
}

VelUIDesktopAction::VelUIDesktopAction(const QString &id)
    : d(new VelUIDesktopActionData)
{
    d->id = id;
}

VelUIDesktopAction::VelUIDesktopAction(const VelUIDesktopAction &other) = default;
VelUIDesktopAction::VelUIDesktopAction(VelUIDesktopAction &&other) noexcept = default;
VelUIDesktopAction &VelUIDesktopAction::operator=(const VelUIDesktopAction &other) = default;
VelUIDesktopAction &VelUIDesktopAction::operator=(VelUIDesktopAction &&other) noexcept = default;
VelUIDesktopAction::~VelUIDesktopAction() = default;

bool VelUIDesktopAction::operator==(const VelUIDesktopAction &other) const
{
    return d == other.d
        || (d->id == other.d->id && d->name == other.d->name && d->localName == other.d->localName
            && d->icon == other.d->icon && d->localIcon == other.d->localIcon && d->exec == other.d->exec
            && d->onlyShowIn == other.d->onlyShowIn && d->notShowIn == other.d->notShowIn);
}

QString VelUIDesktopAction::getId() const
{
    return d->id;
}

QString VelUIDesktopAction::getName() const
{
    return d->name;
}

void VelUIDesktopAction::setName(const QString &value)
{
    d->name = value;
}

QString VelUIDesktopAction::getLocalName() const
{
    return d->localName;
}

void VelUIDesktopAction::setLocalName(const QString &value)
{
    d->localName = value;
}

QString VelUIDesktopAction::getIcon() const
{
    return d->icon;
}

void VelUIDesktopAction::setIcon(const QString &value)
{
    d->icon = value;
}

QString VelUIDesktopAction::getLocalIcon() const
{
    return d->localIcon;
}

void VelUIDesktopAction::setLocalIcon(const QString &value)
{
    d->localIcon = value;
}

QString VelUIDesktopAction::getExec() const
{
    return d->exec;
}

void VelUIDesktopAction::setExec(const QString &value)
{
    d->exec = value;
}

QStringList VelUIDesktopAction::getOnlyShowIn() const
{
    return d->onlyShowIn;
}

void VelUIDesktopAction::setOnlyShowIn(const QStringList &value)
{
    d->onlyShowIn = value;
}

QStringList VelUIDesktopAction::getNotShowIn() const
{
    return d->notShowIn;
}

void VelUIDesktopAction::setNotShowIn(const QStringList &value)
{
    d->notShowIn = value;
}
