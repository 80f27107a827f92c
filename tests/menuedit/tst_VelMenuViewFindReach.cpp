// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FindTestCase.h"
#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QDialog>
#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QLineEdit>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTimer>

#include <functional>

/// How far a search goes, what it costs, and what it leaves behind.
class tst_VelMenuViewFindReach : public FindTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void passesOverWhatAnUnopenedLinkLeadsTo();
    void searchesWhatWasOpenedBehindALink();
    void followsLinksWithinTheMenu();
    void leavesFoldersUnread();
    void leavesNoWatches();
    void answersSoonBesideALinkToALargeTree();
    void neverBlocksForLong();
    void endsAtItsLimitOfFolders();

private:
    void searchInVain(VelMenuView &view, const QString &text);
    void writeTree(const QString &folder, int folders, int each);
    static int watches();
    static qint64 longestBlock(const std::function<void()> &work);
};

// The two windows of a search that finds nothing.
void tst_VelMenuViewFindReach::searchInVain(VelMenuView &view, const QString &text)
{
    ModalDriver modal;
    modal.handle([&text](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(text);
        qobject_cast<QDialog *>(window)->accept();
    });
    modal.answer({QMessageBox::Information, QStringLiteral("Find"),
                  QStringLiteral("'%1' not found .").arg(text), QMessageBox::Close},
                 QMessageBox::Close);
    view.slotFind();
    QVERIFY(modal.finished());
    QVERIFY(view.selectedPath().isEmpty());
}

void tst_VelMenuViewFindReach::writeTree(const QString &folder, int folders, int each)
{
    for (int i = 0; i < folders; ++i) {
        const QString one = path(folder) + QStringLiteral("/f%1").arg(i);
        QVERIFY(QDir().mkpath(one));
        for (int j = 0; j < each; ++j)
            write(QStringLiteral("%1/f%2/e%3.desktop").arg(folder).arg(i).arg(j),
                  entryText(QStringLiteral("E")));
    }
}

int tst_VelMenuViewFindReach::watches()
{
    int count = 0;
    const QFileInfoList files = QDir(QStringLiteral("/proc/self/fdinfo")).entryInfoList(QDir::Files);
    for (const QFileInfo &info : files) {
        QFile file(info.filePath());
        if (file.open(QIODevice::ReadOnly))
            count += file.readAll().count("inotify wd:");
    }
    return count;
}

// The longest time in milliseconds in which the event loop did not turn.
qint64 tst_VelMenuViewFindReach::longestBlock(const std::function<void()> &work)
{
    QElapsedTimer clock;
    qint64 longest = 0;
    QTimer ticks;
    connect(&ticks, &QTimer::timeout, &ticks, [&] { longest = qMax(longest, clock.restart()); });
    ticks.start(1);
    clock.start();
    work();
    return qMax(longest, clock.elapsed());
}

void tst_VelMenuViewFindReach::passesOverWhatAnUnopenedLinkLeadsTo()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    write(QStringLiteral("outside/deep/x.desktop"), entryText(QStringLiteral("Needle")));
    QVERIFY(QFile::link(path(QStringLiteral("outside")), menu() + QLatin1String("/link")));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));

    searchInVain(view, QStringLiteral("needle"));

    QCOMPARE(files(view)->rowCount(files(view)->index(menu() + QLatin1String("/link"))), 0);
    // The link itself belongs to the menu.
    find(view, QStringLiteral("LINK"));
    QCOMPARE(view.selectedPath(), menu() + QLatin1String("/link"));
}

void tst_VelMenuViewFindReach::searchesWhatWasOpenedBehindALink()
{
    write(QStringLiteral("outside/open/x.desktop"), entryText(QStringLiteral("Needle open")));
    write(QStringLiteral("outside/closed/y.desktop"), entryText(QStringLiteral("Needle closed")));
    const QString link = menu() + QLatin1String("/link");
    QVERIFY(QFile::link(path(QStringLiteral("outside")), link));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    QVERIFY(open(view, link, 2));
    QVERIFY(open(view, link + QLatin1String("/open"), 1));

    find(view, QStringLiteral("needle"));

    QCOMPARE(view.selectedPath(), link + QLatin1String("/open/x.desktop"));
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), link + QLatin1String("/open/x.desktop"));
    QVERIFY(files(view)->canFetchMore(files(view)->index(link + QLatin1String("/closed"))));
}

void tst_VelMenuViewFindReach::followsLinksWithinTheMenu()
{
    const QString needle = writeEntry(QStringLiteral("b/x.desktop"), QStringLiteral("Needle"));
    QVERIFY(QFile::link(QStringLiteral("b"), menu() + QLatin1String("/a")));
    VelMenuView view(menu(), -1, true);
    find(view, QStringLiteral("needle"));
    QCOMPARE(view.selectedPath(), menu() + QLatin1String("/a/x.desktop"));
    QVERIFY(view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), needle);
}

void tst_VelMenuViewFindReach::leavesFoldersUnread()
{
    const QString needle = writeEntry(QStringLiteral("b/x.desktop"), QStringLiteral("Needle"));
    writeEntry(QStringLiteral("a/b/y.desktop"), QStringLiteral("Hay"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    find(view, QStringLiteral("needle"));
    QCOMPARE(view.selectedPath(), needle);
    QVERIFY(files(view)->canFetchMore(files(view)->index(menu() + QLatin1String("/a"))));
    QCOMPARE(files(view)->rowCount(files(view)->index(menu() + QLatin1String("/a"))), 0);
}

void tst_VelMenuViewFindReach::leavesNoWatches()
{
    writeTree(QStringLiteral("menu"), 200, 1);
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 200));
    const int before = watches();
    QVERIFY(before > 0);
    searchInVain(view, QStringLiteral("needle"));
    QCOMPARE(watches(), before);
}

void tst_VelMenuViewFindReach::answersSoonBesideALinkToALargeTree()
{
    writeEntry(QStringLiteral("a/x.desktop"), QStringLiteral("Needle"));
    // In memory where that can be had: a disk takes minutes to make and to remove it.
    QTemporaryDir large(QFileInfo(QStringLiteral("/dev/shm")).isWritable()
                            ? QStringLiteral("/dev/shm/vel-XXXXXX")
                            : path(QStringLiteral("XXXXXX")));
    for (int i = 0; i < 20000; ++i)
        QVERIFY(QDir(large.path()).mkdir(QString::number(i)));
    QVERIFY(QFile::link(large.path(), menu() + QLatin1String("/link")));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    const int before = watches();
    QElapsedTimer timer;
    timer.start();
    const qint64 block = longestBlock([&] { find(view, QStringLiteral("needle")); });
    QVERIFY2(timer.elapsed() < 1000, qPrintable(QString::number(timer.elapsed())));
    QVERIFY2(block < 200, qPrintable(QString::number(block)));
    QCOMPARE(view.selectedPath(), menu() + QLatin1String("/a/x.desktop"));
    QVERIFY(watches() <= before + 1);
}

void tst_VelMenuViewFindReach::neverBlocksForLong()
{
    writeTree(QStringLiteral("menu"), 100, 20);
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 100));
    const qint64 block = longestBlock([&] { searchInVain(view, QStringLiteral("needle")); });
    QVERIFY2(block < 200, qPrintable(QString::number(block)));
}

void tst_VelMenuViewFindReach::endsAtItsLimitOfFolders()
{
    writeMaze();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 9));
    const QSignalSpy told(&view, &VelMenuView::told);
    QElapsedTimer timer;
    timer.start();
    searchInVain(view, QStringLiteral("needle"));
    QVERIFY2(timer.elapsed() < 15000, qPrintable(QString::number(timer.elapsed())));
    QCOMPARE(told.count(), 1);
    QVERIFY(
        told.constFirst().constFirst().toString().contains(QLatin1String("Only a part of it was searched.")));
    QCOMPARE(told.constFirst().constLast().toInt(), 1);
}

VEL_TEST_MAIN(tst_VelMenuViewFindReach)
#include "tst_VelMenuViewFindReach.moc"
