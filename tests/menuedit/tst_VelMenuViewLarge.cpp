// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"

#include "ModalDriver.h"
#include "VelMenuView.h"

#include <QClipboard>
#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QMimeData>
#include <QPointer>
#include <QScrollBar>
#include <QSignalSpy>

#include <functional>
#include <memory>

#include <sys/inotify.h>
#include <unistd.h>

namespace {

constexpr int Entries = 5000;
constexpr int Rows = Entries + 2; // and two folders

/// Counts how often entries of a folder are opened.
class OpenCounter
{
public:
    explicit OpenCounter(const QString &folder)
        : m_inotify(inotify_init1(IN_NONBLOCK))
    {
        if (inotify_add_watch(m_inotify, QFile::encodeName(folder).constData(), IN_OPEN) < 0)
            QTest::qFail("cannot watch the folder", __FILE__, __LINE__);
    }
    ~OpenCounter() { close(m_inotify); }
    Q_DISABLE_COPY_MOVE(OpenCounter)

    /// How often an entry was opened since the last call.
    int take()
    {
        int count = 0;
        alignas(inotify_event) char buffer[65536];
        for (;;) {
            const ssize_t size = read(m_inotify, buffer, sizeof buffer);
            if (size <= 0)
                return count;
            for (ssize_t at = 0; at < size;) {
                const auto *event = reinterpret_cast<const inotify_event *>(buffer + at);
                if (event->mask & IN_Q_OVERFLOW)
                    count += Entries;
                if (event->len > 0 && QByteArray(event->name).endsWith(".desktop"))
                    ++count;
                at += ssize_t(sizeof *event + event->len);
            }
        }
    }

private:
    int m_inotify;
};

} // namespace

/// One change in a folder of 5,000 entries.
class tst_VelMenuViewLarge : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void readsOnlyWhatChanged_data();
    void readsOnlyWhatChanged();

private:
    void act(VelMenuView &view, const QString &operation);
    void writeMenu();
};

void tst_VelMenuViewLarge::readsOnlyWhatChanged_data()
{
    QTest::addColumn<QString>("operation");
    for (const char *operation : {"up", "down", "paste", "delete"})
        QTest::newRow(operation) << QString::fromLatin1(operation);
}

void tst_VelMenuViewLarge::act(VelMenuView &view, const QString &operation)
{
    ModalDriver modal;
    if (operation == QLatin1String("up"))
        view.slotUp();
    else if (operation == QLatin1String("down"))
        view.slotDown();
    else if (operation == QLatin1String("paste"))
        view.slotPaste();
    else {
        modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                      QStringLiteral("Are you sure to delete it?"), QMessageBox::Yes | QMessageBox::No,
                      QMessageBox::Yes},
                     QMessageBox::Yes);
        view.slotDel();
    }
    QVERIFY(modal.finished());
}

void tst_VelMenuViewLarge::writeMenu()
{
    // As long as real ones are with their translations, which is too much to be kept in memory.
    QByteArray more = "Exec=true\n";
    for (int i = 0; i < 60; ++i)
        more += "Comment[" + QByteArray::number(i) + "]=What this program is there for, in some language\n";
    for (int i = 0; i < Entries; ++i)
        writeEntry(QStringLiteral("e%1.desktop").arg(i, 4, 10, QLatin1Char('0')),
                   QStringLiteral("E%1").arg(i, 4, 10, QLatin1Char('0')), more);
    for (const char *folder : {"open", "open/inner", "shut"})
        writeEntry(QLatin1String(folder) + QLatin1String("/i.desktop"), QStringLiteral("I"));
}

void tst_VelMenuViewLarge::readsOnlyWhatChanged()
{
    QFETCH(QString, operation);
    const QString foreign = write(QStringLiteral("outside/n.desktop"), entryText(QStringLiteral("E2500a")));
    writeMenu();
    // What is read younger is read once more, as it may have changed within the clock's tick.
    const QDateTime written = QFileInfo(menu() + QLatin1String("/shut/i.desktop")).lastModified();
    QTRY_VERIFY(written.msecsTo(QDateTime::currentDateTime()) > 50);
    VelMenuView view(menu(), 22, true);
    view.resize(400, 500);
    view.show();
    QVERIFY(open(view, menu(), Rows));
    QVERIFY(open(view, menu() + QLatin1String("/open"), 2));
    QVERIFY(open(view, menu() + QLatin1String("/open/inner"), 1));
    const QString item = menu() + QLatin1String("/e2500.desktop");
    view.showAndSelect(item);
    QTRY_VERIFY(view.viewport()->rect().contains(view.visualRect(shown(view, item))));
    auto *data = new QMimeData;
    data->setUrls({QUrl::fromLocalFile(foreign)});
    QGuiApplication::clipboard()->setMimeData(data);

    const int scrolled = view.verticalScrollBar()->value();
    OpenCounter opened(menu());
    QSignalSpy loads(files(view), &QFileSystemModel::directoryLoaded);
    QElapsedTimer timer;
    timer.start();
    act(view, operation);
    view.repaint();
    const qint64 repainted = timer.elapsed();
    // The folder is listed again because of the change.
    QTRY_VERIFY_WITH_TIMEOUT(!loads.isEmpty(), 20000);
    const int rows = operation == QLatin1String("paste") ? Rows + 1
        : operation == QLatin1String("delete")           ? Rows - 1
                                                         : Rows;
    QTRY_COMPARE(names(view, menu()).size(), rows);
    QCoreApplication::processEvents();
    view.repaint();
    const int reads = opened.take();
    qInfo("%s: repainted after %lld ms, quiet after %lld ms, %d entries opened", qPrintable(operation),
          static_cast<long long>(repainted), static_cast<long long>(timer.elapsed()), reads);
    // At most what is in sight.
    QVERIFY2(reads <= 25, qPrintable(QString::number(reads)));
    QVERIFY(qAbs(view.verticalScrollBar()->value() - scrolled) <= 2);
    QCOMPARE(names(view, menu()).size(), rows);
    QCOMPARE(view.selectedPath(),
             operation == QLatin1String("paste")        ? menu() + QLatin1String("/n.desktop")
                 : operation == QLatin1String("delete") ? QString()
                                                        : item);
    QVERIFY(view.isExpanded(shown(view, menu() + QLatin1String("/open"))));
    QVERIFY(view.isExpanded(shown(view, menu() + QLatin1String("/open/inner"))));
    QVERIFY(!view.isExpanded(shown(view, menu() + QLatin1String("/shut"))));
    QGuiApplication::clipboard()->clear();
}

VEL_TEST_MAIN(tst_VelMenuViewLarge)
#include "tst_VelMenuViewLarge.moc"
