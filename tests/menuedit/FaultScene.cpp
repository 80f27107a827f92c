// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FaultScene.h"

#include "UndoScene.h"

#include <menuedit/FileTransfer.h>

#include <velintegration/startmenu.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QDirIterator>
#include <QFile>

#include <ctime>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

constexpr std::time_t age = 2 * 60 * 60;

bool isPartOf(const FaultScene::Tree &part, const FaultScene::Tree &whole)
{
    for (auto it = part.begin(); it != part.end(); ++it) {
        if (!whole.contains(it.key()) || whole.value(it.key()) != it.value())
            return false;
    }
    return true;
}

class SaveScene : public FaultScene
{
public:
    using FaultScene::FaultScene;

    bool step(int number) override
    {
        VelUIDesktopEntry record(file());
        record.setComment(comment(number));
        return record.save();
    }

    QString fault() const override
    {
        const QByteArray bytes = treeOf(path(QString())).value(QStringLiteral("x.desktop")).mid(1);
        return bytes == contents(0) || bytes == contents(1) ? QString()
                                                            : QStringLiteral("the record is not whole");
    }

protected:
    void fill() override { write(file(), contents(1)); }
    void nextOperation() override
    {
        step(0);
        step(1);
    }
    QStringList places() const override { return {path(QString())}; }

private:
    QString file() const { return path(QStringLiteral("x.desktop")); }
    static QString comment(int number)
    {
        return number % 2 ? QString(QStringLiteral("short")) : QString(9000, QLatin1Char('l'));
    }
    static QByteArray contents(int number)
    {
        return "[Desktop Entry]\nType=Application\nComment=" + comment(number).toUtf8() + "\nX-Other=1\n";
    }
};

class MoveScene : public FaultScene
{
public:
    using FaultScene::FaultScene;

    bool step(int number) override
    {
        const bool isBack = number % 2 != 0;
        return FileTransfer::transfer({isBack ? there() : here()},
                                      isBack ? path(QStringLiteral("from")) : otherPath(QStringLiteral("to")),
                                      FileTransfer::Action::Move)
            .succeeded();
    }

    QString fault() const override
    {
        const Tree one = treeOf(here());
        const Tree other = treeOf(there());
        if (!isPartOf(one, m_whole) || !isPartOf(other, m_whole))
            return QStringLiteral("a file is not whole");
        return one == m_whole || other == m_whole ? QString() : QStringLiteral("the folder is whole nowhere");
    }

protected:
    void fill() override
    {
        write(here() + QStringLiteral("/.directory"), "[Desktop Entry]\n");
        for (int i = 0; i < 12; ++i)
            write(here() + QStringLiteral("/sub%1/%2").arg(i % 3).arg(i),
                  QByteArray(1 + i * 20000, char('a' + i)));
        QDir().mkpath(otherPath(QStringLiteral("to")));
        m_whole = treeOf(here());
    }
    void nextOperation() override
    {
        write(path(QStringLiteral("next")), "next");
        for (const QString &place : places())
            FileTransfer::transfer({path(QStringLiteral("next"))}, place, FileTransfer::Action::Copy);
    }
    QStringList places() const override
    {
        return {path(QStringLiteral("from")), otherPath(QStringLiteral("to"))};
    }

private:
    QString here() const { return path(QStringLiteral("from/d")); }
    QString there() const { return otherPath(QStringLiteral("to/d")); }

    Tree m_whole;
};

class DropScene : public FaultScene
{
public:
    using FaultScene::FaultScene;

    bool step(int number) override
    {
        const QString target = path(QStringLiteral("to/%1").arg(number));
        return QDir().mkpath(target)
            && FileTransfer::transfer({path(QStringLiteral("from/a")), path(QStringLiteral("from/d"))},
                                      target, FileTransfer::Action::Copy)
                   .succeeded()
            && list(target, {QStringLiteral("*"), QStringLiteral("a"), QStringLiteral("d")});
    }

    QString fault() const override
    {
        if (treeOf(path(QStringLiteral("from"))) != m_whole)
            return QStringLiteral("what was dropped has changed");
        const QStringList targets =
            QDir(path(QStringLiteral("to"))).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
        for (const QString &target : targets) {
            const QString fault = faultOf(treeOf(path(QStringLiteral("to/") + target)));
            if (!fault.isEmpty())
                return fault;
        }
        return {};
    }

protected:
    void fill() override
    {
        write(path(QStringLiteral("from/a")), QByteArray(70000, 'a'));
        for (int i = 0; i < 5; ++i)
            write(path(QStringLiteral("from/d/%1").arg(i)), QByteArray(1 + i * 20000, char('a' + i)));
        QDir().mkpath(path(QStringLiteral("to")));
        m_whole = treeOf(path(QStringLiteral("from")));
    }
    void nextOperation() override
    {
        write(path(QStringLiteral("next")), "next");
        for (const QString &place : places()) {
            FileTransfer::transfer({path(QStringLiteral("next"))}, place, FileTransfer::Action::Copy);
            list(place, {QStringLiteral("*")});
        }
    }
    QStringList places() const override
    {
        QStringList places;
        const QFileInfoList targets =
            QDir(path(QStringLiteral("to"))).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot);
        for (const QFileInfo &target : targets)
            places.append(target.filePath());
        return places;
    }

private:
    static bool list(const QString &target, const QStringList &order)
    {
        VelUIDesktopEntry record(target + QStringLiteral("/.directory"));
        record.setSortOrder(order);
        return record.save();
    }
    // Each item is there whole or not at all, and so is the order.
    QString faultOf(const Tree &target) const
    {
        const QByteArray order = target.value(QStringLiteral(".directory"));
        if (!order.isEmpty() && order != "=[Desktop Entry]\nSortOrder=*;a;d;\n"
            && order != "=[Desktop Entry]\nSortOrder=*;\n")
            return QStringLiteral("the order is not whole");
        Tree items;
        for (auto it = target.begin(); it != target.end(); ++it) {
            if (!it.key().startsWith(QLatin1Char('.')) && it.key() != QLatin1String("next"))
                items.insert(it.key(), it.value());
        }
        Tree expected;
        for (auto it = m_whole.begin(); it != m_whole.end(); ++it) {
            if (items.contains(it.key().section(QLatin1Char('/'), 0, 0)))
                expected.insert(it.key(), it.value());
        }
        return items == expected ? QString() : QStringLiteral("what was dropped is not whole");
    }

    Tree m_whole;
};

// Three menus in turn, so that each is told from the one before and the one after it.
class MenuScene : public FaultScene
{
public:
    using FaultScene::FaultScene;

    bool step(int number) override
    {
        return CreateStartMenu(QFile::encodeName(path(QStringLiteral("m/menu"))).constData(),
                               QFile::encodeName(templateOf(number)).constData());
    }

    QString fault() const override
    {
        const int menu = numberOf(QStringLiteral("menu"));
        const int previous = numberOf(QStringLiteral("menu.previous"));
        if (menu < 0)
            return QStringLiteral("the menu is not whole");
        if (previous < 0)
            return QStringLiteral("the previous menu is not whole");
        const QStringList kept = QDir(path(QStringLiteral("m")))
                                     .entryList({QStringLiteral(".menu.kept*")}, QDir::Dirs | QDir::Hidden);
        // The new one may stand in the place of the previous one while that lies aside.
        if (kept.isEmpty() || menu == (previous + 1) % Menus)
            return {};
        return numberOf(kept.constFirst()) >= 0 ? QString() : QStringLiteral("the previous menu is lost");
    }

protected:
    void fill() override
    {
        for (int i = 0; i < 60; ++i) {
            const QString name = QStringLiteral("/folder%1/%2.desktop").arg(i % 4).arg(i);
            for (int menu = 0; menu < Menus; ++menu) {
                if (i % (menu + 1) == 0)
                    write(templateOf(menu) + name,
                          "[Desktop Entry]\nType=Application\nExec=true\nName=" + QByteArray::number(menu)
                              + '\n');
            }
        }
        step(1);
        step(2);
    }
    void nextOperation() override { step(0); }
    QStringList places() const override { return {path(QStringLiteral("m"))}; }

private:
    static constexpr int Menus = 3;

    QString templateOf(int number) const { return path(QString::number(number % Menus)); }
    // Which of the menus that folder holds; -1 for none of them.
    int numberOf(const QString &folder) const
    {
        const Tree found = treeOf(path(QStringLiteral("m/") + folder));
        for (int menu = 0; menu < Menus; ++menu) {
            if (found == treeOf(templateOf(menu)))
                return menu;
        }
        return -1;
    }
};

void makeOld(const QString &path)
{
    const std::time_t then = std::time(nullptr) - age;
    const timespec times[] = {{then, 0}, {then, 0}};
    utimensat(AT_FDCWD, QFile::encodeName(path).constData(), times, AT_SYMLINK_NOFOLLOW);
}

} // namespace

std::unique_ptr<FaultScene> FaultScene::make(const QString &name, const QString &folder,
                                             const QString &otherFolder)
{
    if (name == QLatin1String("save"))
        return std::make_unique<SaveScene>(folder, otherFolder);
    if (name == QLatin1String("move"))
        return std::make_unique<MoveScene>(folder, otherFolder);
    if (name == QLatin1String("drop"))
        return std::make_unique<DropScene>(folder, otherFolder);
    if (name == QLatin1String("menu"))
        return std::make_unique<MenuScene>(folder, otherFolder);
    if (name == QLatin1String("undo"))
        return std::make_unique<UndoScene>(folder, otherFolder);
    return {};
}

FaultScene::FaultScene(const QString &folder, const QString &otherFolder)
    : m_folder(folder)
    , m_otherFolder(otherFolder)
{
}

void FaultScene::build()
{
    for (const QString &top : {m_folder, m_otherFolder}) {
        QDir(top).removeRecursively();
        QDir().mkpath(top);
    }
    fill();
}

void FaultScene::goOn()
{
    const QStringList left = strays();
    for (const QString &stray : left)
        makeOld(stray);
    nextOperation();
}

QStringList FaultScene::strays() const
{
    QStringList strays;
    const QStringList folders = places();
    for (const QString &folder : folders) {
        const QFileInfoList entries =
            QDir(folder).entryInfoList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
        for (const QFileInfo &entry : entries) {
            if (entry.fileName().startsWith(QLatin1Char('.'))
                && entry.fileName() != QLatin1String(".directory"))
                strays.append(entry.filePath());
        }
    }
    return strays;
}

FaultScene::Tree FaultScene::treeOf(const QString &folder)
{
    Tree tree;
    QDirIterator iterator(folder, QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                          QDirIterator::Subdirectories);
    while (iterator.hasNext()) {
        QFile file(iterator.next());
        const bool isFile = iterator.fileInfo().isFile() && file.open(QIODevice::ReadOnly);
        tree.insert(QDir(folder).relativeFilePath(iterator.filePath()),
                    isFile ? "=" + file.readAll() : QByteArray());
    }
    return tree;
}

void FaultScene::write(const QString &path, const QByteArray &bytes)
{
    QDir().mkpath(QFileInfo(path).path());
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size() || !file.flush())
        qWarning("cannot write %s", qPrintable(path));
}
