// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "UndoScene.h"

#include <menuedit/FileTransfer.h>
#include <menuedit/FolderOrder.h>
#include <menuedit/KeptThing.h>
#include <menuedit/ReplacedThings.h>
#include <menuedit/StepRecorder.h>

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>

#include <unistd.h>

namespace {

QByteArray contents(const QByteArray &comment)
{
    return "[Desktop Entry]\nType=Application\nComment=" + comment + "\nX-Other=1\n";
}

// Back, there again and back, so that all is as it was.
bool turn(FileStep step)
{
    return !step.isEmpty() && !step.undo() && !step.redo() && !step.undo();
}

} // namespace

bool UndoScene::step(int number)
{
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    // Killed early, each process begins with another one.
    switch ((number + getpid()) % 6) {
    case 0:
        return remove();
    case 1:
        return edit();
    case 2:
        return replace();
    case 3:
        return move();
    case 4:
        return duplicate();
    default:
        return create();
    }
}

bool UndoScene::remove()
{
    StepRecorder recorder;
    for (const QString &item : {games(), path(QStringLiteral("menu/a.desktop"))}) {
        auto kept = KeptThing::inTrash(item);
        if (!kept)
            return false;
        recorder.deleted(item, std::move(kept));
    }
    return turn(recorder.finish());
}

bool UndoScene::edit()
{
    StepRecorder recorder;
    const QString file = path(QStringLiteral("menu/x.desktop"));
    recorder.mayWrite(file);
    VelUIDesktopEntry record(file);
    record.setComment(QString(9000, QLatin1Char('l')));
    return record.save() && turn(recorder.finish());
}

// Across file systems, with the order of the folder that it comes into.
bool UndoScene::move()
{
    StepRecorder recorder;
    recorder.mayMove(games(), otherPath(QStringLiteral("to/games")));
    return FileTransfer::transfer({games()}, otherPath(QStringLiteral("to")), FileTransfer::Action::Move)
               .succeeded()
        && turn(recorder.finish());
}

bool UndoScene::create()
{
    StepRecorder recorder;
    recorder.mayMake(path(QStringLiteral("menu/copy/games")));
    QDir().mkpath(path(QStringLiteral("menu/copy")));
    return FileTransfer::transfer({games()}, path(QStringLiteral("menu/copy")), FileTransfer::Action::Copy)
               .succeeded()
        && turn(recorder.finish());
}

// Another entry comes in place of one.
bool UndoScene::replace()
{
    StepRecorder recorder;
    const QString source = path(QStringLiteral("new/a.desktop"));
    const QString target = path(QStringLiteral("menu/a.desktop"));
    ReplacedThings replaced;
    if (!replaced.putAway(target))
        return false;
    recorder.mayMove(source, target);
    FileProgress nobody;
    if (!FileTransfer::transfer({{source, target}}, FileTransfer::Action::Move, nobody).succeeded())
        return false;
    std::vector<ReplacedThings::Thing> things = replaced.take();
    for (ReplacedThings::Thing &thing : things)
        recorder.deleted(thing.path, std::move(thing.kept));
    return turn(recorder.finish());
}

// Beside itself, with a place in the order.
bool UndoScene::duplicate()
{
    StepRecorder recorder;
    const QString copy = games() + QStringLiteral("-2");
    recorder.mayMake(copy);
    recorder.mayWrite(path(QStringLiteral("menu/.directory")));
    FileProgress nobody;
    return FileTransfer::transfer({{games(), copy}}, FileTransfer::Action::Copy, nobody).succeeded()
        && FolderOrder::write(path(QStringLiteral("menu")),
                              {QStringLiteral("*"), QStringLiteral("games"), QStringLiteral("games-2")})
        && turn(recorder.finish());
}

// Everything is whole, at its place or where it was put away.
QString UndoScene::fault() const
{
    const QByteArray record = treeOf(path(QStringLiteral("menu"))).value(QStringLiteral("x.desktop")).mid(1);
    if (record != contents("short") && record != contents(QByteArray(9000, 'l')))
        return QStringLiteral("the record is not whole");
    const QString trash = path(QStringLiteral("data/Trash/files"));
    QStringList found{games(), otherPath(QStringLiteral("to/games"))};
    const QStringList trashed = QDir(trash).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
    for (const QString &name : trashed)
        found.append(trash + QLatin1Char('/') + name);
    bool isWhole = false;
    for (const QString &place : qAsConst(found))
        isWhole = isWhole || treeOf(place) == m_games;
    if (!isWhole)
        return QStringLiteral("the folder is whole nowhere");
    const QList<QByteArray> entries = treeOf(path(QStringLiteral("menu"))).values() + treeOf(trash).values()
        + treeOf(path(QStringLiteral("new"))).values();
    return entries.contains('=' + contents("a")) && entries.contains('=' + contents("new"))
        ? QString()
        : QStringLiteral("an entry is gone");
}

void UndoScene::fill()
{
    write(path(QStringLiteral("menu/x.desktop")), contents("short"));
    write(path(QStringLiteral("menu/a.desktop")), contents("a"));
    write(path(QStringLiteral("new/a.desktop")), contents("new"));
    write(games() + QStringLiteral("/.directory"), "[Desktop Entry]\n");
    for (int i = 0; i < 12; ++i)
        write(games() + QStringLiteral("/sub%1/%2").arg(i % 3).arg(i),
              QByteArray(1 + i * 2000, char('a' + i)));
    QDir().mkpath(otherPath(QStringLiteral("to")));
    m_games = treeOf(games());
}

void UndoScene::nextOperation()
{
    write(path(QStringLiteral("next")), "next");
    for (const QString &place : places()) {
        FileTransfer::transfer({path(QStringLiteral("next"))}, place, FileTransfer::Action::Copy);
        VelUIDesktopEntry record(place + QStringLiteral("/.directory"));
        record.setComment(QStringLiteral("next"));
        record.save();
    }
}

QStringList UndoScene::places() const
{
    return {path(QStringLiteral("menu")), path(QStringLiteral("menu/copy")), otherPath(QStringLiteral("to"))};
}
