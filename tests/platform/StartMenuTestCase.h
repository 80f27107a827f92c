// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TestCase.h"

#include <velintegration/startmenu.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QFileInfo>

/// The fixture of the tests of the start menu: a home of applications and what is made of them.
class StartMenuTestCase : public TestCase
{
    Q_OBJECT

public:
    using TestCase::TestCase;

protected Q_SLOTS:
    void init();
    void cleanup();

protected:
    /// The path of the menu.
    QString menu() const { return path(QStringLiteral("config/vel/startmenu")); }
    /// A path in the menu.
    QString inMenu(const QString &name) const { return menu() + QLatin1Char('/') + name; }
    /// Makes the menu.
    bool create() const { return CreateStartMenu(QFile::encodeName(menu()).constData(), nullptr); }
    /// Writes the entry of an application.
    QString install(const QString &name, const QByteArray &categories, const QByteArray &more = QByteArray())
    {
        return write(QStringLiteral("home/applications/") + name,
                     "[Desktop Entry]\nType=Application\nName=" + QFileInfo(name).completeBaseName().toUtf8()
                         + "\nExec=true\nCategories=" + categories + '\n' + more);
    }
    /// What a folder holds.
    static QStringList names(const QString &folder)
    {
        return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                                      QDir::Name);
    }
    /// Everything below a folder, with the bytes of the files.
    static QMap<QString, QByteArray> tree(const QString &folder);
    /// The list of a folder.
    QStringList sortOrder(const QString &folder) const
    {
        return VelUIDesktopEntry(folder + QStringLiteral("/.directory")).getSortOrder();
    }
};
