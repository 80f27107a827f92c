// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/VelUIDesktopAction.h>
#include <veluiaux/veluiaux_export.h>

#include <QList>
#include <QSharedDataPointer>
#include <QString>
#include <QStringList>

class VelUIDesktopEntryData;

class VELUIAUX_EXPORT VelUIDesktopEntry
{
public:
    using SuitableError = int;
    using DisplayableError = int;

    class VELUIAUX_EXPORT ExecFormatString
    {
    public:
        explicit ExecFormatString(const QString &exec);

        ExecFormatString &filePath(const QString &path);
        ExecFormatString &url(const QString &url);
        ExecFormatString &appName(const QString &name);
        ExecFormatString &icon(const QString &icon);
        ExecFormatString &desktopFilePath(const QString &path);
        ExecFormatString &filePathList(const QStringList &paths);
        ExecFormatString &urlList(const QStringList &urls);

        operator QString() const;

    private:
        QString m_exec;
    };

    explicit VelUIDesktopEntry(const QString &path = QString());
    VelUIDesktopEntry(const VelUIDesktopEntry &other);
    VelUIDesktopEntry(VelUIDesktopEntry &&other) noexcept;
    VelUIDesktopEntry &operator=(const VelUIDesktopEntry &other);
    VelUIDesktopEntry &operator=(VelUIDesktopEntry &&other) noexcept;
    ~VelUIDesktopEntry();

    void setFilePath(const QString &path);
    bool load();
    bool save();
    bool isValid() const;
    void inheritFrom(const VelUIDesktopEntry &other);
    bool isSuitable(SuitableError *error) const;
    bool isDisplayable(DisplayableError *error) const;

    QString getType() const;
    void setType(const QString &type);

    QString getName() const;
    void setName(const QString &value);
    QString getLocalName() const;
    void setLocalName(const QString &value);
    QString getGenericName() const;
    void setGenericName(const QString &value);
    QString getLocalGenericName() const;
    void setLocalGenericName(const QString &value);
    QString getComment() const;
    void setComment(const QString &value);
    QString getLocalComment() const;
    void setLocalComment(const QString &value);
    QString getIcon() const;
    void setIcon(const QString &value);
    QString getLocalIcon() const;
    void setLocalIcon(const QString &value);
    QString getExec() const;
    void setExec(const QString &value);
    QString getTryExec() const;
    void setTryExec(const QString &value);
    QString getPath() const;
    void setPath(const QString &value);
    QString getURL() const;
    void setURL(const QString &value);
    QString getStartupWMClass() const;
    void setStartupWMClass(const QString &value);
    QString getVersion() const;
    void setVersion(const QString &value);
    bool getTerminal() const;
    void setTerminal(bool value);
    bool getNoDisplay() const;
    void setNoDisplay(bool value);
    bool getHidden() const;
    void setHidden(bool value);
    bool getStartupNotify() const;
    void setStartupNotify(bool value);
    QStringList getOnlyShowIn() const;
    void setOnlyShowIn(const QStringList &value);
    QStringList getNotShowIn() const;
    void setNotShowIn(const QStringList &value);
    QStringList getMimeType() const;
    void setMimeType(const QStringList &value);
    QStringList getCategories() const;
    void setCategories(const QStringList &value);
    QStringList getKeywords() const;
    void setKeywords(const QStringList &value);
    QStringList getLocalKeywords() const;
    void setLocalKeywords(const QStringList &value);
    QStringList getSortOrder() const;
    void setSortOrder(const QStringList &value);
    QList<VelUIDesktopAction> getActions() const;
    void setActions(const QList<VelUIDesktopAction> &actions);

private:
    QSharedDataPointer<VelUIDesktopEntryData> d;
};
