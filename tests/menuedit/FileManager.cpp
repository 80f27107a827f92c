// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileManager.h"

#include "GroupLeader.h"
#include "XDoTool.h"

#include <QClipboard>
#include <QDir>
#include <QFile>
#include <QGuiApplication>
#include <QImage>
#include <QMimeData>
#include <QPixmap>
#include <QScreen>
#include <QStandardPaths>
#include <QTest>

#include <csignal>

namespace {

const int Patience = 60000;

const char Settings[] = "[System]\nFallbackIconThemeName=breeze\n\n"
                        "[FolderView]\nMode=icon\nBigIconSize=128\nNoItemTooltip=true\n\n"
                        "[Window]\nSidePaneVisible=false\nAlwaysShowTabs=false\n"
                        "RememberWindowSize=false\nFixedWidth=700\nFixedHeight=500\n";

// All its windows in sight, also menus.
QList<QByteArray> windows()
{
    const QByteArray list = XDoTool::ask(QStringLiteral("search --onlyvisible --class ^pcmanfm-qt$"));
    return list.isEmpty() ? QList<QByteArray>() : list.split('\n');
}

// One value of what xdotool tells of a window in sight.
int geometry(const QByteArray &window, const QByteArray &name)
{
    const QList<QByteArray> lines =
        XDoTool::ask(QStringLiteral("getwindowgeometry --shell ") + QString::fromLatin1(window)).split('\n');
    for (const QByteArray &line : lines) {
        if (line.startsWith(name + '='))
            return line.mid(name.size() + 1).toInt();
    }
    return -1;
}

} // namespace

/// The message bus ends with the program.
class FileManager::Process : public GroupLeader
{
public:
    ~Process() override
    {
        if (state() == NotRunning)
            return;
        ::kill(pid_t(-processId()), SIGKILL);
        waitForFinished();
    }
};

FileManager::FileManager() = default;

FileManager::~FileManager() = default;

QString FileManager::obstacle()
{
    for (const char *program : {"pcmanfm-qt", "dbus-run-session"}) {
        if (QStandardPaths::findExecutable(QLatin1String(program)).isEmpty())
            return QLatin1String(program) + QLatin1String(" is not installed");
    }
    return QString();
}

bool FileManager::start(const QString &folder, const QPoint &corner)
{
    const QString config = QStandardPaths::writableLocation(QStandardPaths::ConfigLocation)
        + QLatin1String("/pcmanfm-qt/default");
    QFile file(config + QLatin1String("/settings.conf"));
    if (!QDir().mkpath(config) || !file.open(QIODevice::WriteOnly) || file.write(Settings) == -1)
        return false;
    file.close();

    // Now and then version 1.2.1 waits for ever for its own look at the folder, before it opens
    // a window.
    for (int patience = 5000; m_window.isEmpty() && patience <= 40000; patience += 5000) {
        startProcess(folder);
        findWindow(patience);
    }
    return !m_window.isEmpty() && moveWindow(corner) && activate()
        && QTest::qWaitFor([this] { return showsItem(); }, Patience);
}

// On a message bus of its own it neither meets another one of its kind nor starts services.
void FileManager::startProcess(const QString &folder)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("GIO_USE_VFS"), QStringLiteral("local"));
    environment.insert(QStringLiteral("GIO_USE_VOLUME_MONITOR"), QStringLiteral("unix"));
    m_process = std::make_unique<Process>();
    m_process->setProcessEnvironment(environment);
    m_process->setStandardOutputFile(QProcess::nullDevice());
    m_process->setStandardErrorFile(QProcess::nullDevice());
    m_process->start(QStringLiteral("dbus-run-session"),
                     {QStringLiteral("--"), QStringLiteral("pcmanfm-qt"), folder});
}

void FileManager::findWindow(int patience)
{
    const auto isThere = [this] {
        const QList<QByteArray> found = windows();
        m_window = found.size() == 1 ? found.constFirst() : QByteArray();
        return !m_window.isEmpty();
    };
    if (!QTest::qWaitFor(isThere, patience))
        m_window.clear();
}

// The window manager may take the window into its care, and place it, only now: both requests
// are made until they were heard.
bool FileManager::moveWindow(const QPoint &corner)
{
    return QTest::qWaitFor(
        [&] {
            if (geometry(m_window, "X") >= corner.x() && geometry(m_window, "X") < corner.x() + 10
                && geometry(m_window, "WIDTH") == 700)
                return true;
            XDoTool::ask(QStringLiteral("windowmove %1 %2 %3")
                             .arg(QString::fromLatin1(m_window))
                             .arg(corner.x())
                             .arg(corner.y()));
            return false;
        },
        Patience);
}

bool FileManager::activate()
{
    return QTest::qWaitFor(
        [this] {
            if (XDoTool::ask(QStringLiteral("getactivewindow")) == m_window)
                return true;
            XDoTool::ask(QStringLiteral("windowactivate ") + QString::fromLatin1(m_window));
            return false;
        },
        Patience);
}

// The item lies on a background of one color; the middle of a folder may be of one color, too.
bool FileManager::showsItem() const
{
    const int side = 96;
    const QImage picture = QGuiApplication::primaryScreen()
                               ->grabWindow(m_window.toULongLong(), ItemPlace.x() - side / 2,
                                            ItemPlace.y() - side / 2, side, side)
                               .toImage();
    if (picture.isNull())
        return false;
    const QRgb first = picture.pixel(0, 0);
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) {
            if (picture.pixel(x, y) != first)
                return true;
        }
    }
    return false;
}

// It takes a moment until it allows to copy what was selected, and copies the name before.
bool FileManager::putOnClipboard(const QString &keys)
{
    if (!activate())
        return false;
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.1 click 1").arg(onItem()));
    const auto hasUrl = [] {
        const QMimeData *data = QGuiApplication::clipboard()->mimeData();
        return data && data->hasUrls();
    };
    return QTest::qWaitFor(
        [&] {
            XDoTool::press(keys);
            return QTest::qWaitFor(hasUrl, 1000);
        },
        Patience);
}

void FileManager::paste()
{
    QVERIFY(activate());
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.1 click 1").arg(besideItem()));
    XDoTool::press(QStringLiteral("ctrl+v"));
}

QString FileManager::at(const QPoint &place) const
{
    return QStringLiteral("--window %1 %2 %3")
        .arg(QString::fromLatin1(m_window))
        .arg(place.x())
        .arg(place.y());
}

void FileManager::pickInDropMenu(Qt::DropAction action)
{
    QByteArray menu;
    QVERIFY(QTest::qWaitFor(
        [&] {
            QList<QByteArray> found = windows();
            found.removeOne(m_window);
            menu = found.size() == 1 ? found.constFirst() : QByteArray();
            return !menu.isEmpty();
        },
        Patience));
    // Copy, move, link and cancel. The version of Debian 13 closes the menu at a click and does nothing.
    XDoTool::press(action == Qt::CopyAction ? QStringLiteral("Down Return")
                                            : QStringLiteral("Down Down Return"));
}
