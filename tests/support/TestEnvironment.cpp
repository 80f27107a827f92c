// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestEnvironment.h"

#include <QDir>
#include <QFileInfo>

namespace VelTest {

TestEnvironment *TestEnvironment::s_instance = nullptr;

TestEnvironment::TestEnvironment()
{
    if (!m_root.isValid())
        qFatal("TestEnvironment: no temporary folder: %s", qPrintable(m_root.errorString()));
    s_instance = this;

    const struct
    {
        const char *variable;
        const char *folder;
    } folders[] = {
        {"HOME", "home"},
        {"XDG_CONFIG_HOME", "home/.config"},
        {"XDG_DATA_HOME", "home/.local/share"},
        {"XDG_CACHE_HOME", "home/.cache"},
        {"XDG_STATE_HOME", "home/.local/state"},
        {"XDG_RUNTIME_DIR", "run"},
        {"XDG_CONFIG_DIRS", "etc"},
        {"TMPDIR", "tmp"},
    };
    for (const auto &folder : folders) {
        const QString path = root() + QLatin1Char('/') + QLatin1String(folder.folder);
        QDir().mkpath(path);
        qputenv(folder.variable, QFile::encodeName(path));
    }
    QFile::setPermissions(root() + QStringLiteral("/run"),
                          QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);

    qputenv("XDG_DATA_DIRS", "/usr/local/share:/usr/share");
    qputenv("LANG", "C.UTF-8");
    qputenv("QT_STYLE_OVERRIDE", "fusion");
    for (const char *variable :
         {"LANGUAGE", "LC_ALL", "LC_MESSAGES", "LC_COLLATE", "LC_CTYPE", "VEL_CONFIG_HOME", "VEL_DATA_DIR",
          "VEL_SESSION", "XDG_CURRENT_DESKTOP", "DESKTOP_SESSION", "KDE_FULL_SESSION", "KDE_SESSION_VERSION",
          "QT_QPA_PLATFORMTHEME", "QT_SCALE_FACTOR", "QT_FONT_DPI", "DBUS_SESSION_BUS_ADDRESS", "TERMINAL"})
        qunsetenv(variable);
}

TestEnvironment::~TestEnvironment()
{
    s_instance = nullptr;
}

TestEnvironment &TestEnvironment::instance()
{
    Q_ASSERT(s_instance);
    return *s_instance;
}

QString TestEnvironment::root() const
{
    return QFileInfo(m_root.path()).canonicalFilePath();
}

QString TestEnvironment::home() const
{
    return root() + QStringLiteral("/home");
}

} // namespace VelTest
