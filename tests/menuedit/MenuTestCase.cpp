// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"

#include "VelMenuView.h"

#include <velcore/dirs.h>

#include <QAction>
#include <QDirIterator>
#include <QFileSystemModel>
#include <QIcon>
#include <QSignalSpy>
#include <QSortFilterProxyModel>

#include <unistd.h>

void MenuTestCase::init()
{
    TestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(path(QStringLiteral("config"))));
    QDir().mkpath(menu());
    // A theme with an icon of the editor's own on top of one with all the others.
    write(QStringLiteral("icons/menutest/index.theme"),
          "[Icon Theme]\nName=menutest\nInherits=breeze\nDirectories=22\n[22]\nSize=22\n");
    QPixmap pixmap(22, 22);
    pixmap.fill(Qt::red);
    QDir().mkpath(path(QStringLiteral("icons/menutest/22")));
    QVERIFY(pixmap.save(path(QStringLiteral("icons/menutest/22/velmenuedit.png"))));
    QIcon::setThemeSearchPaths({path(QStringLiteral("icons")), QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("menutest"));
}

QString MenuTestCase::startMenu()
{
    return QString::fromStdString(GetVelDir(VelDir::StartMenu));
}

QByteArray MenuTestCase::entryText(const QString &name, const QByteArray &more)
{
    return "[Desktop Entry]\nType=Application\nName=" + name.toUtf8() + '\n' + more;
}

QString MenuTestCase::writeEntry(const QString &file, const QString &name, const QByteArray &more)
{
    return write(QLatin1String("menu/") + file, entryText(name, more));
}

QString MenuTestCase::writeFolder(const QString &folder, const QString &name, const QByteArray &sortOrder)
{
    QByteArray text = "[Desktop Entry]\nType=Directory\nName=" + name.toUtf8() + '\n';
    if (!sortOrder.isEmpty())
        text += "SortOrder=" + sortOrder + '\n';
    const QString file = QLatin1String("menu/") + folder + QLatin1String("/.directory");
    return QFileInfo(write(file, text)).absolutePath();
}

QByteArray MenuTestCase::sortOrderOf(const QString &folder) const
{
    QFile file(folder + QLatin1String("/.directory"));
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QList<QByteArray> lines = file.readAll().split('\n');
    for (const QByteArray &line : lines) {
        if (line.startsWith("SortOrder="))
            return line.mid(10);
    }
    return {};
}

QStringList MenuTestCase::everythingIn(const QString &folder)
{
    QStringList all;
    QDirIterator it(folder, QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                    QDirIterator::Subdirectories);
    while (it.hasNext())
        all.append(it.next().mid(folder.size() + 1));
    all.sort();
    return all;
}

QSortFilterProxyModel *MenuTestCase::proxy(const VelMenuView &view)
{
    return qobject_cast<QSortFilterProxyModel *>(view.model());
}

QFileSystemModel *MenuTestCase::files(const VelMenuView &view)
{
    return qobject_cast<QFileSystemModel *>(proxy(view)->sourceModel());
}

QModelIndex MenuTestCase::shown(const VelMenuView &view, const QString &path)
{
    return proxy(view)->mapFromSource(files(view)->index(path));
}

QStringList MenuTestCase::names(const VelMenuView &view, const QString &folder)
{
    const QModelIndex parent = shown(view, folder);
    QStringList result;
    for (int row = 0; parent.isValid() && row < view.model()->rowCount(parent); ++row)
        result.append(view.model()->index(row, 0, parent).data().toString());
    return result;
}

bool MenuTestCase::open(VelMenuView &view, const QString &folder, int count)
{
    const QModelIndex parent = shown(view, folder);
    view.model()->fetchMore(parent);
    view.expand(parent);
    return QTest::qWaitFor([&] { return view.model()->rowCount(shown(view, folder)) == count; }, 10000);
}

void MenuTestCase::select(VelMenuView &view, const QString &path)
{
    view.selectionModel()->setCurrentIndex(shown(view, path), QItemSelectionModel::ClearAndSelect);
}

QAction *MenuTestCase::action(const VelMenuView &view, const QString &name)
{
    const QList<QAction *> actions = view.actions();
    for (QAction *action : actions) {
        if (action->objectName() == name)
            return action;
    }
    return nullptr;
}

QStringList MenuTestCase::enabledActions(const VelMenuView &view)
{
    QStringList result;
    const QList<QAction *> actions = view.actions();
    for (QAction *action : actions) {
        if (action->isEnabled())
            result.append(action->objectName());
    }
    return result;
}

WithoutPermission::WithoutPermission()
{
    // access(2) asks for the real user, open(2) for the effective one.
    if (geteuid() == 0 && setresuid(65534, 0, 0) != 0)
        QTest::qFail("cannot change the real user", __FILE__, __LINE__);
}

WithoutPermission::~WithoutPermission()
{
    if (geteuid() == 0 && setresuid(0, 0, 0) != 0)
        QTest::qFail("cannot change the real user back", __FILE__, __LINE__);
}
