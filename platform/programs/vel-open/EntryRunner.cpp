// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryRunner.h"

#include "BusActivation.h"
#include "CommandWords.h"
#include "HeldFile.h"
#include "ProgramStart.h"
#include "Terminal.h"

#include <WindowManagerCommand.h>
#include <velintegration/wmcommand.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QFile>
#include <QFileInfo>

#include <memory>

#include <X11/Xlib.h>

namespace {

const QByteArray ByteOrderMark("\xEF\xBB\xBF");

struct CloseDisplay
{
    void operator()(Display *display) const { XCloseDisplay(display); }
};

// The record has no say in how an application is started, so this key is read here.
bool isBusActivatable(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return false;
    bool inEntry = false;
    bool result = false;
    while (!file.atEnd()) {
        QByteArray line = file.readLine().trimmed();
        if (line.startsWith(ByteOrderMark))
            line.remove(0, ByteOrderMark.size());
        if (line.startsWith('['))
            inEntry = line == "[Desktop Entry]";
        const int equals = line.indexOf('=');
        if (inEntry && line.left(equals).trimmed() == "DBusActivatable")
            result = line.mid(equals + 1).trimmed() == "true";
    }
    return result;
}

QString sendToWindowManager(const QString &exec)
{
    const std::unique_ptr<Display, CloseDisplay> display(XOpenDisplay(nullptr));
    if (SendCommandToWM(display.get(), (exec.toLocal8Bit() + '\n').constData()))
        return {};
    return display
        ? QStringLiteral("no window manager takes commands here")
        : QStringLiteral("there is no display, and no window manager takes commands on the session bus");
}

QString filledIn(const VelUIDesktopEntry &entry, const QString &path)
{
    const QString localName = entry.getLocalName();
    return VelUIDesktopEntry::ExecFormatString(entry.getExec())
        .appName(localName.isEmpty() ? entry.getName() : localName)
        .icon(entry.getIcon())
        .desktopFilePath(path);
}

QString runCommand(const VelUIDesktopEntry &entry, const QString &path)
{
    QStringList words = commandWords(filledIn(entry, path)).value_or(QStringList());
    if (words.isEmpty())
        return QStringLiteral("cannot understand the command \"%1\"").arg(entry.getExec());
    if (entry.getTerminal()) {
        // A terminal would open all the same and say it there, for a moment.
        QString problem = whyNotExecutable(words.first(), entry.getPath());
        if (!problem.isEmpty())
            return problem;
        const QStringList terminal = terminalWords();
        if (terminal.isEmpty())
            return QStringLiteral("there is no terminal");
        words = terminal + words;
    }
    return startProgram(words, entry.getPath());
}

QString runApplication(const VelUIDesktopEntry &entry, const HeldFile &file, const QString &path)
{
    if (isBusActivatable(file.path()) && activateOnBus(path))
        return {};
    const QString exec = entry.getExec();
    if (exec.isEmpty())
        return QStringLiteral("there is no command in it");
    return isWindowManagerCommand(exec) ? sendToWindowManager(exec) : runCommand(entry, path);
}

QString openLink(const QString &url)
{
    if (url.isEmpty())
        return QStringLiteral("there is no URL in it");
    // The program that opens it would take it for an option.
    if (url.startsWith(QLatin1Char('-')))
        return QStringLiteral("its URL %1 begins with \"-\", as no URL does").arg(url);
    return openWithDesktop(url);
}

QString runEntryFile(const QString &path, Trust trust)
{
    const HeldFile file(path);
    if (!file.isOpen())
        return file.error();
    const QString whyNot = trust == Trust::Given ? QString() : file.whyNotTrusted();
    if (!whyNot.isEmpty())
        return whyNot;
    VelUIDesktopEntry entry(file.path());
    if (!entry.load())
        return QStringLiteral("is no desktop entry");
    const QString type = entry.getType();
    if (type == QLatin1String("Application"))
        return runApplication(entry, file, path);
    if (type == QLatin1String("Link"))
        return openLink(entry.getURL());
    if (type == QLatin1String("Directory"))
        return openWithDesktop(QFileInfo(path).absolutePath());
    return QStringLiteral("is neither an application nor a link nor a folder");
}

} // namespace

QString runEntry(const QString &path, Trust trust)
{
    const QFileInfo file(path);
    if (!file.exists())
        return QStringLiteral("no such file or folder");
    // Absolute, it cannot be taken for an option either.
    const QString absolutePath = file.absoluteFilePath();
    const bool isEntry = !file.isDir() && path.endsWith(QLatin1String(".desktop"));
    return isEntry ? runEntryFile(absolutePath, trust) : openWithDesktop(absolutePath);
}
