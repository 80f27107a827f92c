// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Who has a key: among the desktop's global shortcuts and among those of an application.

#include "Comparison.h"
#include "ShortcutsModel.h"
#include "VelKeyServer.h"

#include <KConfig>
#include <KConfigGroup>

#include <QAction>
#include <QApplication>
#include <QFile>
#include <QTemporaryDir>

#include <cstdio>

#define SI_NO_CONVERSION
#define SI_IMPLEMENTATION
#include <SimpleIni.h>

namespace {

volatile std::size_t sink = 0; // keeps the compiler from leaving the work out

QString writeShortcutFile(const QString &folder)
{
    // As a window manager writes it: quoted, every combination of modifiers, all common keys.
    const char *modifiers[] = {"None",       "Mod4", "Ctrl",           "Ctrl|Alt",
                               "Shift|Mod4", "Alt",  "Ctrl|Shift|Alt", "Shift"};
    const char *keys[] = {"Return", "space",  "Tab",           "Print",         "Left",     "Right",
                          "Up",     "Down",   "Prior",         "Next",          "Home",     "End",
                          "Insert", "Delete", "Escape",        "BackSpace",     "Menu",     "Pause",
                          "plus",   "minus",  "XF86AudioPlay", "XF86AudioMute", "XF86Mail", "KP_Enter",
                          "KP_5"};
    const QString path = folder + QStringLiteral("/keyshortcutrc");
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly))
        qFatal("cannot write the file");
    file.write("[ShortCutKeys]\n");
    QVector<QByteArray> all;
    for (char letter = 'a'; letter <= 'z'; ++letter)
        all.append(QByteArray(1, letter));
    for (int i = 1; i <= 12; ++i)
        all.append("F" + QByteArray::number(i));
    for (const char *key : keys)
        all.append(key);
    for (int i = 0; i < 300; ++i) {
        const int key = i % all.size();
        file.write("\"" + QByteArray(modifiers[(i / all.size() + key) % 8]) + '|' + all.at(key)
                   + "\"=\"VELWM_ACTION_" + QByteArray::number(i) + "\"\n");
    }
    return path;
}

std::size_t walkWithSimpleIni(const QByteArray &path)
{
    CSimpleIniA ini;
    FILE *file = std::fopen(path.constData(), "rb");
    if (!file)
        qFatal("cannot read the file");
    ini.LoadFile(file);
    std::fclose(file);
    std::size_t sum = 0;
    for (const auto &entry : *ini.GetSection("ShortCutKeys"))
        sum += std::strlen(entry.first.pItem) + std::strlen(entry.second);
    return sum;
}

std::size_t readWithKConfig(const QString &path)
{
    const KConfig config(path, KConfig::SimpleConfig);
    const KConfigGroup group = config.group("ShortCutKeys");
    std::size_t sum = 0;
    const QStringList keys = group.keyList();
    for (const QString &key : keys)
        sum += std::size_t(key.size() + group.readEntry(key, QString()).size());
    return sum;
}

bool compareLookUp(const QString &path)
{
    const QKeySequence absent(Qt::CTRL | Qt::Key_F30);
    if (!VelKeyServer::checkForGlobalShortcut(absent).isNull()
        || VelKeyServer::checkForGlobalShortcut(QKeySequence(Qt::META | Qt::Key_B)).isNull())
        qFatal("the file is not what it should be");
    Comparison comparison("global shortcut look-up, 300 entries, no match");
    comparison.add("checkForGlobalShortcut",
                   [&] { sink = sink + std::size_t(VelKeyServer::checkForGlobalShortcut(absent).size()); });
    const QByteArray localPath = QFile::encodeName(path);
    comparison.add(
        "SimpleIni load and walk", [&] { sink = sink + walkWithSimpleIni(localPath); }, 0.35);
    comparison.add(
        "KConfig read", [&] { sink = sink + readWithKConfig(path); }, 1.0);
    // Short measurements, so that few are cut by another process.
    comparison.setRepetitions(4);
    return comparison.run(61);
}

bool compareSearch()
{
    QObject owner;
    ShortcutsModel model(nullptr, QString());
    QList<QAction *> actions;
    for (int i = 0; i < 2000; ++i) {
        auto *action = new QAction(&owner);
        action->setShortcut(QKeySequence(Qt::CTRL | (Qt::Key_A + i % 26), Qt::Key_A + i / 26));
        model.registerAction(QString::number(i), action, QString::number(i % 10));
        actions.append(action);
    }
    const QKeySequence absent(Qt::Key_F30);
    Comparison comparison("hasKeySequence among 2,000, no match");
    comparison.add("hasKeySequence", [&] { sink = sink + (model.hasKeySequence(absent) ? 1 : 0); });
    comparison.add("a walk through the actions", [&] {
        for (const QAction *action : qAsConst(actions))
            sink = sink + (action->shortcut() == absent ? 1 : 0);
    });
    comparison.setRepetitions(10);
    return comparison.run(61);
}

} // namespace

int main(int argc, char **argv)
{
    const QTemporaryDir home;
    for (const char *variable : {"HOME", "XDG_CONFIG_HOME", "VEL_CONFIG_HOME"})
        qputenv(variable, QFile::encodeName(home.path()));
    QApplication application(argc, argv);
    const bool lookUpKept = compareLookUp(writeShortcutFile(home.path()));
    return compareSearch() && lookUpKept ? 0 : 1;
}
