// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/veluiaux_export.h>

#include <QMetaType>
#include <QSharedDataPointer>
#include <QString>
#include <QStringList>

class VelUIDesktopActionData;

class VELUIAUX_EXPORT VelUIDesktopAction
{
public:
    VelUIDesktopAction();
    explicit VelUIDesktopAction(const QString &id);
    VelUIDesktopAction(const VelUIDesktopAction &other);
    VelUIDesktopAction(VelUIDesktopAction &&other) noexcept;
    VelUIDesktopAction &operator=(const VelUIDesktopAction &other);
    VelUIDesktopAction &operator=(VelUIDesktopAction &&other) noexcept;
    ~VelUIDesktopAction();

    bool operator==(const VelUIDesktopAction &other) const;
    bool operator!=(const VelUIDesktopAction &other) const { return !(*this == other); }

    QString getId() const;
    QString getName() const;
    void setName(const QString &value);
    QString getLocalName() const;
    void setLocalName(const QString &value);
    QString getIcon() const;
    void setIcon(const QString &value);
    QString getLocalIcon() const;
    void setLocalIcon(const QString &value);
    QString getExec() const;
    void setExec(const QString &value);
    QStringList getOnlyShowIn() const;
    void setOnlyShowIn(const QStringList &value);
    QStringList getNotShowIn() const;
    void setNotShowIn(const QStringList &value);

private:
    QSharedDataPointer<VelUIDesktopActionData> d;
};

Q_DECLARE_TYPEINFO(VelUIDesktopAction, Q_MOVABLE_TYPE);
