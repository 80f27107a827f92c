// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileManager.h"
#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <frame/QtMajor.h>

#include <QAction>
#include <QClipboard>
#include <QCursor>
#include <QDrag>
#include <QDropEvent>
#include <QMimeData>
#include <QTimer>
#include <QUrl>

namespace {

const QMimeData *clipboard()
{
    return QGuiApplication::clipboard()->mimeData();
}

// The answer of what lies under a drag of ours, as it is shown.
bool mayDrop()
{
    const QCursor *cursor = QGuiApplication::overrideCursor();
    return cursor && cursor->shape() != Qt::ForbiddenCursor;
}

// Moves the mouse there, and a little each time.
bool moved(const QString &place)
{
    XDoTool::run(QStringLiteral("mousemove %1 mousemove_relative 1 0 sleep 0.1").arg(place));
    return true;
}

/// Sees where a drag comes by.
class DragWatch : public QObject
{
public:
    explicit DragWatch(QWidget *widget) { widget->installEventFilter(this); }
    QPoint last() const { return m_last; }

    bool eventFilter(QObject *object, QEvent *event) override
    {
        if (event->type() == QEvent::DragMove)
            m_last = QtMajor::positionOf(*static_cast<QDropEvent *>(event)).toPoint();
        return QObject::eventFilter(object, event);
    }

private:
    QPoint m_last;
};

} // namespace

/// The menu editor beside a file manager, another program made by others.
class tst_FileManager : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void pastesWhatTheFileManagerOffers_data();
    void pastesWhatTheFileManagerOffers();
    void offersItemsToTheFileManager_data();
    void offersItemsToTheFileManager();
    void takesADragFromTheFileManager_data();
    void takesADragFromTheFileManager();
    void givesADragToTheFileManager_data();
    void givesADragToTheFileManager();

private:
    bool showBoth();
    void dragFromFileManager(const QPoint &target);
    void dragToFileManager(const QString &file);
    void dropInFileManager();
    static QString writeAt(const QString &path, const QByteArray &bytes);
    static QByteArray contentOf(const QString &path);
    QPoint upperEdgeOf(const QString &file);
    QString inMenu(const QString &file) const { return m_menu + QLatin1Char('/') + file; }
    QString outside(const QString &file) const { return m_outside + QLatin1Char('/') + file; }
    QString shownNames() const { return names(view(), m_menu).join(QLatin1Char(' ')); }

    std::unique_ptr<FileManager> m_manager;
    // Names that differ from their URLs.
    const QString m_odd = QStringLiteral("odd #1 50% %41 äß.desktop");
    QString m_menu;
    QString m_outside;
};

void tst_FileManager::initTestCase()
{
    const QString obstacle = FileManager::obstacle();
    if (!obstacle.isEmpty())
        QSKIP(qPrintable(obstacle));
}

void tst_FileManager::init()
{
    HandsOnTestCase::init();
    const QString menuName = QStringLiteral("menu ü #2 100%");
    m_menu = path(menuName);
    m_outside = path(QStringLiteral("outside ö #3 %20"));
    QDir().mkpath(m_outside);
    for (const char *name : {"a", "b", "c", "games/x"})
        write(menuName + QLatin1Char('/') + QLatin1String(name) + QLatin1String(".desktop"),
              entryText(QString::fromLatin1(name).toUpper()));
    write(menuName + QLatin1String("/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Menu\nSortOrder=games;a.desktop;b.desktop;c.desktop;\n");
    write(menuName + QLatin1String("/games/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Games\nSortOrder=x.desktop;\n");
}

void tst_FileManager::cleanup()
{
    m_manager.reset();
    HandsOnTestCase::cleanup();
}

QString tst_FileManager::writeAt(const QString &path, const QByteArray &bytes)
{
    QDir().mkpath(QFileInfo(path).absolutePath());
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        QTest::qFail(qPrintable(QLatin1String("cannot write ") + path), __FILE__, __LINE__);
    return path;
}

// What a file holds, or the names of what a folder holds.
QByteArray tst_FileManager::contentOf(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll()
                                          : everythingIn(path).join(QLatin1Char('\n')).toUtf8();
}

QPoint tst_FileManager::upperEdgeOf(const QString &file)
{
    return {placeOf(file).x(), view().visualRect(shown(view(), file)).top() + 1};
}

// Side by side, with bare screen between them.
bool tst_FileManager::showBoth()
{
    openDialog(m_menu, QDir(m_menu).entryList(QDir::AllEntries | QDir::NoDotAndDotDot).size());
    dialog()->move(0, 0);
    m_manager = std::make_unique<FileManager>();
    return QTest::qWaitFor([this] { return dialog()->frameGeometry().right() < 450; })
        && m_manager->start(m_outside, {540, 20}) && !QTest::currentTestFailed();
}

void tst_FileManager::pastesWhatTheFileManagerOffers_data()
{
    QTest::addColumn<QString>("keys");
    QTest::addColumn<bool>("isFolder");
    QTest::newRow("copied entry") << QStringLiteral("ctrl+c") << false;
    QTest::newRow("copied folder") << QStringLiteral("ctrl+c") << true;
    QTest::newRow("cut entry") << QStringLiteral("ctrl+x") << false;
}

// A cut of other programs counts as a copy: they do not mark it in a way that is ours.
void tst_FileManager::pastesWhatTheFileManagerOffers()
{
    QFETCH(QString, keys);
    QFETCH(bool, isFolder);
    const QString name = isFolder ? QFileInfo(m_odd).completeBaseName() : m_odd;
    const QString inside = isFolder ? name + QLatin1String("/z.desktop") : name;
    writeAt(outside(inside), entryText(QStringLiteral("Odd")));
    QVERIFY(showBoth());
    QVERIFY(m_manager->putOnClipboard(keys));
    QCOMPARE(clipboard()->urls(), QList<QUrl>{QUrl::fromLocalFile(outside(name))});
    QCOMPARE(clipboard()->hasFormat(QStringLiteral("application/x-kde-cutselection")),
             keys == QLatin1String("ctrl+x"));

    clickItem(inMenu(QStringLiteral("b.desktop")));
    QTRY_VERIFY(action(view(), QStringLiteral("pasteAction"))->isEnabled());
    XDoTool::press(QStringLiteral("ctrl+v"));
    QTRY_VERIFY(QFile::exists(inMenu(inside)));
    QCOMPARE(read(inMenu(inside)), entryText(QStringLiteral("Odd")));
    QCOMPARE(sortOrderOf(m_menu), "*;games;a.desktop;" + name.toUtf8() + ";b.desktop;c.desktop;");
    QTRY_COMPARE(shownNames(), QStringLiteral("Games A %1 B C").arg(isFolder ? name : QStringLiteral("Odd")));
    QTRY_COMPARE(view().selectedPath(), inMenu(name));
    QCOMPARE(read(outside(inside)), entryText(QStringLiteral("Odd")));
}

void tst_FileManager::offersItemsToTheFileManager_data()
{
    QTest::addColumn<QString>("keys");
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("shown");
    QTest::newRow("copied entry") << QStringLiteral("ctrl+c") << m_odd << QStringLiteral("Games A B C Odd");
    QTest::newRow("cut entry") << QStringLiteral("ctrl+x") << m_odd << QStringLiteral("Games A B C");
    QTest::newRow("copied folder") << QStringLiteral("ctrl+c") << QStringLiteral("games")
                                   << QStringLiteral("Games A B C Odd");
    QTest::newRow("cut folder") << QStringLiteral("ctrl+x") << QStringLiteral("games")
                                << QStringLiteral("A B C Odd");
}

void tst_FileManager::offersItemsToTheFileManager()
{
    QFETCH(QString, keys);
    QFETCH(QString, file);
    QFETCH(QString, shown);
    writeAt(inMenu(m_odd), entryText(QStringLiteral("Odd")));
    writeAt(outside(QStringLiteral("there.desktop")), entryText(QStringLiteral("There")));
    QVERIFY(showBoth());
    const bool isCut = keys == QLatin1String("ctrl+x");
    const QByteArray content = contentOf(inMenu(file));

    clickItem(inMenu(file));
    XDoTool::press(keys);
    QTRY_COMPARE(view().dndFormat(clipboard()),
                 isCut ? QStringLiteral("text/uri-move-list") : QStringLiteral("text/uri-list"));
    m_manager->paste();
    QTRY_VERIFY_WITH_TIMEOUT(QFileInfo::exists(outside(file)), 30000);
    QTRY_COMPARE(contentOf(outside(file)), content);
    QTRY_COMPARE(QFileInfo::exists(inMenu(file)), !isCut);
    QTRY_COMPARE(shownNames(), shown);
}

void tst_FileManager::takesADragFromTheFileManager_data()
{
    QTest::addColumn<QString>("choice");
    QTest::addColumn<bool>("intoFolder");
    QTest::newRow("copy between entries") << QStringLiteral("Copy") << false;
    QTest::newRow("move between entries") << QStringLiteral("Move") << false;
    QTest::newRow("copy into a folder") << QStringLiteral("Copy") << true;
    QTest::newRow("move into a folder") << QStringLiteral("Move") << true;
    QTest::newRow("cancel") << QStringLiteral("Cancel") << true;
}

void tst_FileManager::takesADragFromTheFileManager()
{
    QFETCH(QString, choice);
    QFETCH(bool, intoFolder);
    const QString source = writeAt(outside(m_odd), entryText(QStringLiteral("Odd")));
    QVERIFY(showBoth());
    const QString games = inMenu(QStringLiteral("games"));
    const QString b = inMenu(QStringLiteral("b.desktop"));
    const QStringList before = everythingIn(m_menu);

    ModalDriver modal;
    pickInDropMenu(modal, choice);
    dragFromFileManager(intoFolder ? placeOf(games) : upperEdgeOf(b));
    QTRY_VERIFY(modal.finished());
    const QString target = (intoFolder ? games : m_menu) + QLatin1Char('/') + m_odd;
    if (choice == QLatin1String("Cancel")) {
        QTRY_VERIFY(!QApplication::activePopupWidget());
        QCOMPARE(everythingIn(m_menu), before);
        QVERIFY(QFile::exists(source));
        return;
    }
    QTRY_VERIFY(QFile::exists(target));
    QCOMPARE(read(target), entryText(QStringLiteral("Odd")));
    QTRY_COMPARE(view().selectedPath(), target);
    QCOMPARE(QFile::exists(source), choice == QLatin1String("Copy"));
    QCOMPARE(sortOrderOf(games), QByteArray("x.desktop;"));
    QCOMPARE(sortOrderOf(m_menu),
             intoFolder ? QByteArray("games;a.desktop;b.desktop;c.desktop;")
                        : "*;games;a.desktop;" + m_odd.toUtf8() + ";b.desktop;c.desktop;");
    QTRY_COMPARE(shownNames(),
                 intoFolder ? QStringLiteral("Games A B C") : QStringLiteral("Games A Odd B C"));
}

// The item goes to the place in the view.
void tst_FileManager::dragFromFileManager(const QPoint &target)
{
    const DragWatch watch(view().viewport());
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.2 mousedown 1 sleep 0.2 mousemove_relative 8 4 "
                                "sleep 0.1 mousemove_relative 8 4 sleep 0.1")
                     .arg(m_manager->onItem()));
    // Until the view has answered that it may be dropped here.
    int step = 0;
    const bool hasArrived = QTest::qWaitFor(
        [&] {
            const QPoint place = target + QPoint(step++ % 2, 0);
            XDoTool::run(QStringLiteral("mousemove %1 sleep 0.1").arg(XDoTool::at(view().viewport(), place)));
            return watch.last().y() == target.y() && qAbs(watch.last().x() - target.x()) <= 1;
        },
        30000);
    XDoTool::run(QStringLiteral("mouseup 1"));
    QVERIFY(hasArrived);
}

void tst_FileManager::givesADragToTheFileManager_data()
{
    QTest::addColumn<int>("action");
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("shown");
    QTest::newRow("copied entry") << int(Qt::CopyAction) << m_odd << QStringLiteral("Games A B C Odd");
    QTest::newRow("moved entry") << int(Qt::MoveAction) << m_odd << QStringLiteral("Games A B C");
    QTest::newRow("moved folder") << int(Qt::MoveAction) << QStringLiteral("games")
                                  << QStringLiteral("A B C Odd");
}

void tst_FileManager::givesADragToTheFileManager()
{
    QFETCH(int, action);
    QFETCH(QString, file);
    QFETCH(QString, shown);
    writeAt(inMenu(m_odd), entryText(QStringLiteral("Odd")));
    writeAt(outside(QStringLiteral("there.desktop")), entryText(QStringLiteral("There")));
    QVERIFY(showBoth());
    const QByteArray content = contentOf(inMenu(file));

    dragToFileManager(inMenu(file));
    if (QTest::currentTestFailed())
        return;
    m_manager->pickInDropMenu(Qt::DropAction(action));
    QTRY_VERIFY_WITH_TIMEOUT(QFileInfo::exists(outside(file)), 30000);
    QTRY_COMPARE(contentOf(outside(file)), content);
    QTRY_COMPARE(QFileInfo::exists(inMenu(file)), action == Qt::CopyAction);
    QTRY_COMPARE(shownNames(), shown);
}

// A drag has an event loop of its own: what follows its start is done from within.
void tst_FileManager::dragToFileManager(const QString &file)
{
    bool isDone = false;
    QTimer watch;
    connect(&watch, &QTimer::timeout, this, [&] {
        if (!view().findChild<QDrag *>())
            return;
        watch.stop();
        dropInFileManager();
        isDone = true;
    });
    watch.start(10);
    const QString start = XDoTool::at(view().viewport(), placeOf(file));
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.2 mousedown 1 sleep 0.2").arg(start));
    QVERIFY(QTest::qWaitFor(
        [&] {
            if (watch.isActive())
                XDoTool::run(QStringLiteral("mousemove_relative 8 2 sleep 0.1"));
            return isDone;
        },
        30000));
}

// Over the bare screen first: only then a cursor that allows it is the file manager's answer.
void tst_FileManager::dropInFileManager()
{
    const QString screen = XDoTool::at(dialog(), {470, 300});
    const bool isAccepted = QTest::qWaitFor([&] { return moved(screen) && !mayDrop(); }, 30000)
        && QTest::qWaitFor([&] { return moved(m_manager->besideItem()) && mayDrop(); }, 30000);
    XDoTool::run(QStringLiteral("mouseup 1"));
    QVERIFY(isAccepted);
}

VEL_TEST_MAIN(tst_FileManager)
#include "tst_FileManager.moc"
