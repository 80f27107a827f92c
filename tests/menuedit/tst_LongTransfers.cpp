// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Freeze.h"
#include "HandsOnTestCase.h"
#include "OtherFileSystem.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QMessageBox>
#include <QMimeData>
#include <QProgressDialog>
#include <QPushButton>
#include <QSignalSpy>
#include <QTemporaryDir>

#include <atomic>
#include <functional>

#include <sys/syscall.h>
#include <unistd.h>

namespace {

const int Files = 3000;

// A disk that takes its time for each file while this lives.
class SlowDisk
{
public:
    SlowDisk() { s_delay = 1000; }
    ~SlowDisk() { s_delay = 0; }
    Q_DISABLE_COPY_MOVE(SlowDisk)

    static inline std::atomic<unsigned> s_delay = 0; // microseconds
};

QProgressDialog *progressWindow()
{
    const QWidgetList windows = QApplication::topLevelWidgets();
    for (QWidget *window : windows) {
        auto *dialog = qobject_cast<QProgressDialog *>(window);
        if (dialog && dialog->isVisible())
            return dialog;
    }
    return nullptr;
}

} // namespace

// In the place of the system's.
extern "C" int fsync(int)
{
    usleep(SlowDisk::s_delay);
    return 0;
}

extern "C" int renameat2(int folder, const char *name, int newFolder, const char *newName,
                         unsigned flags) noexcept
{
    usleep(SlowDisk::s_delay);
    return int(syscall(SYS_renameat2, folder, name, newFolder, newName, flags));
}

extern "C" int unlinkat(int folder, const char *name, int flags) noexcept
{
    usleep(SlowDisk::s_delay);
    return int(syscall(SYS_unlinkat, folder, name, flags));
}

/// Pastes of thousands of files, and what a person can do meanwhile.
class tst_LongTransfers : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void showsHowFarItIs();
    void leavesNothingWhenItIsCanceled_data();
    void leavesNothingWhenItIsCanceled();
    void leavesNothingWhenItsViewGoes_data();
    void leavesNothingWhenItsViewGoes();
    void leavesTheWindowAlive();
    void endsADeletionWhenItIsCanceled();
    void survivesItsViewWhileItDeletes();
    void tellsWhatStaysOfSeveral();
    void takesBackWhatWentIntoTheTrash();

private:
    void put(const QString &folder, bool asFiles, bool isCut);
    static void whenInSight(QObject *context, const std::function<void(QProgressDialog *)> &act);
    QString source(bool isElsewhere);
    void paste();
    void answerTheQuestion();

    QString m_sub;
    std::unique_ptr<QTemporaryDir> m_other;
};

void tst_LongTransfers::init()
{
    MenuTestCase::init();
    m_sub = writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"));
    QDir().mkpath(m_sub);
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
}

void tst_LongTransfers::cleanup()
{
    HandsOnTestCase::cleanup();
    m_other.reset();
}

// A folder of many files, on another file system if asked for and there is one.
QString tst_LongTransfers::source(bool isElsewhere)
{
    QString top = path(QStringLiteral("outside"));
    if (isElsewhere) {
        const QString other = otherFileSystem(folder());
        m_other = std::make_unique<QTemporaryDir>((other.isEmpty() ? folder() : other)
                                                  + QStringLiteral("/tst_LongTransfers-XXXXXX"));
        top = m_other->path();
    }
    QDir().mkpath(top + QStringLiteral("/big"));
    for (int i = 0; i < Files; ++i) {
        QFile file(top + QStringLiteral("/big/%1.desktop").arg(i, 4, 10, QLatin1Char('0')));
        if (!file.open(QIODevice::WriteOnly) || file.write(entryText(QString::number(i))) < 0)
            QTest::qFail("cannot write", __FILE__, __LINE__);
    }
    return top + QStringLiteral("/big");
}

void tst_LongTransfers::put(const QString &folder, bool asFiles, bool isCut)
{
    QList<QUrl> urls;
    const QStringList names = asFiles ? QDir(folder).entryList(QDir::Files) : QStringList(QString());
    for (const QString &name : names)
        urls.append(QUrl::fromLocalFile(name.isEmpty() ? folder : folder + QLatin1Char('/') + name));
    auto *data = new QMimeData;
    data->setUrls(urls);
    if (isCut)
        data->setData(QStringLiteral("text/uri-move-list"), data->data(QStringLiteral("text/uri-list")));
    QGuiApplication::clipboard()->setMimeData(data);
}

// Acts once the window is there and shows that some of it is done.
void tst_LongTransfers::whenInSight(QObject *context, const std::function<void(QProgressDialog *)> &act)
{
    auto *timer = new QTimer(context);
    connect(timer, &QTimer::timeout, context, [timer, act] {
        QProgressDialog *const window = progressWindow();
        if (!window || (window->maximum() > 0 && window->value() <= 0) || !window->isActiveWindow())
            return;
        timer->stop();
        act(window);
    });
    timer->start(10);
}

void tst_LongTransfers::paste()
{
    clickItem(m_sub);
    QTRY_VERIFY(action(view(), QStringLiteral("pasteAction"))->isEnabled());
    XDoTool::press(QStringLiteral("ctrl+v"));
}

// Before a deletion.
void tst_LongTransfers::answerTheQuestion()
{
    auto *timer = new QTimer(this);
    connect(timer, &QTimer::timeout, timer, [timer] {
        auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
        if (!box)
            return;
        timer->deleteLater();
        box->button(QMessageBox::Yes)->click();
    });
    timer->start(10);
}

void tst_LongTransfers::showsHowFarItIs()
{
    const QString big = source(false);
    openDialog(menu(), 2);
    put(big, false, false);
    const SlowDisk slow;
    QString text;
    int maximum = 0;
    QElapsedTimer timer;
    qint64 shown = -1;
    QObject context;
    whenInSight(&context, [&](QProgressDialog *window) {
        text = window->labelText();
        maximum = window->maximum();
        shown = timer.elapsed();
    });
    clickItem(m_sub);
    timer.start();
    view().slotPaste();
    QCOMPARE(text, QStringLiteral("Copying files..."));
    QCOMPARE(maximum, Files + 1);
    QVERIFY2(shown >= 500, qPrintable(QString::number(shown)));
    QVERIFY(!progressWindow());
    QCOMPARE(everythingIn(m_sub + QStringLiteral("/big")).size(), Files);
}

void tst_LongTransfers::leavesNothingWhenItIsCanceled_data()
{
    QTest::addColumn<bool>("asFiles");
    QTest::addColumn<bool>("isCut");
    QTest::addColumn<bool>("byButton");
    QTest::newRow("a copied folder, by Escape") << false << false << false;
    QTest::newRow("copied files, by its button") << true << false << true;
    QTest::newRow("a folder from another file system") << false << true << false;
}

void tst_LongTransfers::leavesNothingWhenItIsCanceled()
{
    QFETCH(bool, asFiles);
    QFETCH(bool, isCut);
    QFETCH(bool, byButton);
    const QString big = source(isCut);
    openDialog(menu(), 2);
    put(big, asFiles, isCut);
    const QStringList before = everythingIn(menu());
    QSignalSpy changes(&view(), &VelMenuView::changed);
    bool wasCanceled = false;
    const SlowDisk slow;
    whenInSight(&view(), [&](QProgressDialog *window) {
        wasCanceled = true;
        if (byButton)
            XDoTool::click(window->findChild<QPushButton *>());
        else
            XDoTool::press(QStringLiteral("Escape"));
    });
    paste();
    QTRY_VERIFY_WITH_TIMEOUT(wasCanceled, 30000);
    QTRY_VERIFY_WITH_TIMEOUT(!progressWindow(), 30000);
    QCOMPARE(everythingIn(menu()), before);
    QCOMPARE(everythingIn(big).size(), Files);
    QCOMPARE(changes.count(), 0);
    QVERIFY(!QGuiApplication::overrideCursor());
    QVERIFY(dialog()->isVisible());
    // A cut was not pasted.
    QCOMPARE(view().dndFormat(QGuiApplication::clipboard()->mimeData()).contains(QLatin1String("move")),
             isCut);
}

void tst_LongTransfers::leavesNothingWhenItsViewGoes_data()
{
    leavesNothingWhenItIsCanceled_data();
}

void tst_LongTransfers::leavesNothingWhenItsViewGoes()
{
    QFETCH(bool, asFiles);
    QFETCH(bool, isCut);
    const QString big = source(isCut);
    openDialog(menu(), 2);
    put(big, asFiles, isCut);
    const QStringList before = everythingIn(menu());
    clickItem(m_sub);
    bool isGone = false;
    QObject context;
    whenInSight(&context, [&](QProgressDialog *) {
        closeDialog();
        isGone = true;
    });
    {
        const SlowDisk slow;
        view().slotPaste();
    }
    QVERIFY(isGone);
    QVERIFY(!progressWindow());
    QVERIFY(!QGuiApplication::overrideCursor());
    QCOMPARE(everythingIn(menu()), before);
    QCOMPARE(everythingIn(big).size(), Files);
}

void tst_LongTransfers::leavesTheWindowAlive()
{
    const QString big = source(false);
    openDialog(menu(), 2);
    QVERIFY(open(view(), m_sub, 0));
    put(big, true, false);
    const Freeze freeze;
    clickItem(m_sub);
    view().slotPaste();
    QTRY_COMPARE(view().model()->rowCount(shown(view(), m_sub)), Files);
    QCOMPARE(everythingIn(m_sub).size(), Files + 1);
    qInfo("%d files: the window stood still for %lld ms at most", Files,
          static_cast<long long>(freeze.longest()));
    QVERIFY(freeze.longest() < 2000);
}

void tst_LongTransfers::endsADeletionWhenItIsCanceled()
{
    const QString big = source(false);
    QVERIFY(QDir().rename(big, m_sub + QStringLiteral("/big")));
    openDialog(menu(), 2);
    clickItem(m_sub);
    QSignalSpy told(&view(), &VelMenuView::told);
    const SlowDisk slow;
    answerTheQuestion();
    bool wasCanceled = false;
    whenInSight(&view(), [&](QProgressDialog *window) {
        QCOMPARE(window->labelText(), QStringLiteral("Deleting files..."));
        wasCanceled = true;
        XDoTool::press(QStringLiteral("Escape"));
    });
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_COMPARE_WITH_TIMEOUT(told.count(), 1, 30000);
    QVERIFY(wasCanceled);
    QCOMPARE(told.constFirst().at(0).toString(),
             QStringLiteral("The deletion of %1 was canceled. What was not yet deleted is still there.")
                 .arg(m_sub));
    const int left = everythingIn(m_sub).size();
    QVERIFY2(left > 0 && left < Files, qPrintable(QString::number(left)));
}

void tst_LongTransfers::survivesItsViewWhileItDeletes()
{
    const QString big = source(false);
    QVERIFY(QDir().rename(big, m_sub + QStringLiteral("/big")));
    openDialog(menu(), 2);
    clickItem(m_sub);
    bool isGone = false;
    QObject context;
    whenInSight(&context, [&](QProgressDialog *) {
        closeDialog();
        isGone = true;
    });
    const SlowDisk slow;
    answerTheQuestion();
    view().slotDel();
    QVERIFY(isGone);
    QVERIFY(!progressWindow());
    QVERIFY(!QGuiApplication::overrideCursor());
}

// Of several that no trash takes, those that are not yet deleted stay.
void tst_LongTransfers::tellsWhatStaysOfSeveral()
{
    const QByteArray dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    write(QStringLiteral("data/Trash"), "no folder");
    const QString big = source(false);
    QVERIFY(QDir().rename(big, m_sub + QStringLiteral("/big")));
    const QString z = writeEntry(QStringLiteral("z.desktop"), QStringLiteral("Z"));
    openDialog(menu(), 3);
    view().setAssistance(true);
    clickItem(z);
    view().setFocus();
    XDoTool::press(QStringLiteral("ctrl+a"));
    QTRY_COMPARE(view().selectionModel()->selectedIndexes().size(), 3);
    QSignalSpy told(&view(), &VelMenuView::told);
    const SlowDisk slow;
    answerTheQuestion();
    bool wasCanceled = false;
    whenInSight(&view(), [&](QProgressDialog *window) {
        QCOMPARE(window->labelText(), QStringLiteral("Deleting files..."));
        wasCanceled = true;
        XDoTool::press(QStringLiteral("Escape"));
    });
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_COMPARE_WITH_TIMEOUT(told.count(), 1, 30000);
    QVERIFY(wasCanceled);
    QCOMPARE(told.constFirst().at(0).toString(),
             QStringLiteral("The deletion was canceled. Still there, in whole or in part: Sub, A, Z."));
    QCOMPARE(told.constFirst().at(1).toInt(), 1);
    const int left = everythingIn(m_sub).size();
    QVERIFY2(left > 0 && left < Files, qPrintable(QString::number(left)));
    QVERIFY(QFile::exists(z));
    QCOMPARE(view().selectionModel()->selectedIndexes().size(), 3);
    qputenv("XDG_DATA_HOME", dataHome);
}

// What went is a step of its own.
void tst_LongTransfers::takesBackWhatWentIntoTheTrash()
{
    const QByteArray dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    const QString big = source(false);
    QVERIFY(QDir().rename(big, m_sub + QStringLiteral("/big")));
    openDialog(menu(), 2);
    QVERIFY(open(view(), m_sub, 1));
    QVERIFY(open(view(), m_sub + QStringLiteral("/big"), Files));
    view().setAssistance(true);
    const QModelIndex folder = shown(view(), m_sub + QStringLiteral("/big"));
    view().selectionModel()->select(
        QItemSelection(view().model()->index(0, 0, folder), view().model()->index(Files - 1, 0, folder)),
        QItemSelectionModel::ClearAndSelect);
    QSignalSpy told(&view(), &VelMenuView::told);
    bool wasCanceled = false;
    const SlowDisk slow;
    whenInSight(&view(), [&](QProgressDialog *window) {
        QCOMPARE(window->maximum(), Files);
        wasCanceled = true;
        XDoTool::press(QStringLiteral("Escape"));
    });
    view().setFocus();
    view().slotDel();
    QVERIFY(wasCanceled);
    QCOMPARE(told.count(), 2);
    const int left = everythingIn(m_sub + QStringLiteral("/big")).size();
    QVERIFY2(left > 0 && left < Files, qPrintable(QString::number(left)));
    QCOMPARE(told.constFirst().at(0).toString(), QStringLiteral("%1 items were deleted.").arg(Files - left));
    QCOMPARE(told.constLast().at(0).toString(),
             QStringLiteral("The deletion was canceled. %1 items are still there, in whole or in part.")
                 .arg(left));
    view().undoAction()->trigger();
    QCOMPARE(everythingIn(m_sub + QStringLiteral("/big")).size(), Files);
    qputenv("XDG_DATA_HOME", dataHome);
}

VEL_TEST_MAIN(tst_LongTransfers)
#include "tst_LongTransfers.moc"
