// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "StartMenuTestCase.h"

#include <velintegration/startmenufollowing.h>

/// The fixture of the tests of updates: applications come and go, and the user edits the menu.
class StartMenuUpdateTestCase : public StartMenuTestCase
{
    Q_OBJECT

public:
    using StartMenuTestCase::StartMenuTestCase;

protected:
    /// Updates the menu; \a templateDir is a folder below folder().
    bool update(const char *templateDir = nullptr) const;
    void uninstall(const QString &name) const;
    /// The user gives a folder another order.
    void order(const QString &folderName, const QByteArray &list);
    /// The entries of the menu, by their paths in it, sorted.
    QStringList entries() const;
    /// When everything below a folder was changed last.
    static QMap<QString, QString> times(const QString &folder);
};
