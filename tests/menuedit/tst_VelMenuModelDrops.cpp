// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModalDriver.h"
#include "TestCase.h"

#include <VelMenuView.h>
#include <menuedit/VelMenuModel.h>

#include <QDir>
#include <QMessageBox>
#include <QMimeData>
#include <QPushButton>
#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QToolTip>
#include <QWindow>

#include <algorithm>
#include <memory>

#include <sys/stat.h>

/// Drops into a menu that is shown, with the list of the folder that they change.
class tst_VelMenuModelDrops : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void listsAFileBeforeTheRowItIsDroppedAt();
    void listsAFileLast();
    void leavesTheListForADropOnTheFolder();
    void readsTheListAnewOnlyForADropBetweenRows();
    void reordersWithinTheFolder();
    void unlistsAFileThatIsMovedOntoItsOwnFolder();
    void leavesTheListForACopyWithinTheFolder();
    void listsOnlyTheFirstOfSeveral();
    void selectsWhatWasDropped();
    void putsTheDirectoryFileBack_data();
    void putsTheDirectoryFileBack();
    void takesAwayADirectoryFileThatWasNotThere();
    void namesTheItemToOverwriteAsItIsWritten();
    void asksOverTheWindowOfTheView();
    void showsWhatCameInsteadOfWhatWent_data();
    void showsWhatCameInsteadOfWhatWent();
    void ordersAFolderThatCameByItsOwnList();
    void tellsAtTheItemThatItWasLeft();
    void keepsThePlaceWhenRowsGoWhileItAsks_data();
    void keepsThePlaceWhenRowsGoWhileItAsks();
    void tellsWhyAFolderIsRefused();

private:
    bool drop(const QStringList &files, Qt::DropAction action, int row);
    int rowOf(const QString &name) const { return source(name).row(); }
    QModelIndex source(const QString &name) const { return m_model->index(path(name)); }
    QByteArray list() const;
    QStringList shown() const;

    std::unique_ptr<VelMenuView> m_view;
    QSortFilterProxyModel *m_proxy = nullptr;
    VelMenuModel *m_model = nullptr;
};

namespace {

const QByteArray Directory = "# mine\n[Desktop Entry]\nType=Directory\nName=To\nSortOrder=c;b;a;\n";

} // namespace

void tst_VelMenuModelDrops::init()
{
    TestCase::init();
    for (const char *name : {"menu/to/a", "menu/to/b", "menu/to/c", "menu/from/x", "menu/from/y"})
        write(QString::fromUtf8(name), name);
    write(QStringLiteral("menu/to/.directory"), Directory);
    m_view = std::make_unique<VelMenuView>(path(QStringLiteral("menu")), -1, true);
    m_view->show();
    m_proxy = qobject_cast<QSortFilterProxyModel *>(m_view->model());
    m_model = qobject_cast<VelMenuModel *>(m_proxy->sourceModel());
    const auto isThere = [this](const QString &name, int rows) {
        const QModelIndex index = source(name);
        if (m_model->canFetchMore(index))
            m_model->fetchMore(index);
        return m_proxy->rowCount(m_proxy->mapFromSource(index)) == rows;
    };
    QTRY_VERIFY(isThere(QStringLiteral("menu"), 2));
    QTRY_VERIFY(isThere(QStringLiteral("menu/to"), 3));
    QTRY_VERIFY(isThere(QStringLiteral("menu/from"), 2));
    QCOMPARE(shown().join(QString()), QStringLiteral("cba"));
}

void tst_VelMenuModelDrops::cleanup()
{
    QToolTip::hideText();
    m_view.reset();
    TestCase::cleanup();
}

bool tst_VelMenuModelDrops::drop(const QStringList &files, Qt::DropAction action, int row)
{
    QList<QUrl> urls;
    for (const QString &file : files)
        urls.append(QUrl::fromLocalFile(path(file)));
    QMimeData data;
    data.setUrls(urls);
    return m_model->dropMimeData(&data, action, row, row == -1 ? -1 : 0, source(QStringLiteral("menu/to")));
}

QByteArray tst_VelMenuModelDrops::list() const
{
    const QList<QByteArray> lines = read(path(QStringLiteral("menu/to/.directory"))).split('\n');
    for (const QByteArray &line : lines) {
        if (line.startsWith("SortOrder="))
            return line.mid(10);
    }
    return QByteArray();
}

QStringList tst_VelMenuModelDrops::shown() const
{
    const QModelIndex parent = m_proxy->mapFromSource(source(QStringLiteral("menu/to")));
    QStringList names;
    for (int row = 0; row < m_proxy->rowCount(parent); ++row)
        names.append(m_proxy->index(row, 0, parent).data().toString());
    return names;
}

void tst_VelMenuModelDrops::listsAFileBeforeTheRowItIsDroppedAt()
{
    QVERIFY(drop({QStringLiteral("menu/from/x")}, Qt::MoveAction, rowOf(QStringLiteral("menu/to/b"))));

    QCOMPARE(list(), QByteArray("*;c;x;b;a;"));
    QTRY_COMPARE(shown().join(QString()), QStringLiteral("cxba"));
    QVERIFY(!QFile::exists(path(QStringLiteral("menu/from/x"))));
}

void tst_VelMenuModelDrops::listsAFileLast()
{
    QVERIFY(drop({QStringLiteral("menu/from/x")}, Qt::CopyAction, 3));

    QCOMPARE(list(), QByteArray("*;c;b;a;x;"));
    QTRY_COMPARE(shown().join(QString()), QStringLiteral("cbax"));
}

void tst_VelMenuModelDrops::leavesTheListForADropOnTheFolder()
{
    QVERIFY(drop({QStringLiteral("menu/from/x")}, Qt::CopyAction, -1));

    QCOMPARE(read(path(QStringLiteral("menu/to/.directory"))), Directory);
    QTRY_COMPARE(shown().join(QString()), QStringLiteral("cbax"));
}

void tst_VelMenuModelDrops::readsTheListAnewOnlyForADropBetweenRows()
{
    write(QStringLiteral("menu/to/.directory"), "[Desktop Entry]\nType=Directory\nSortOrder=a;b;c;\n");

    QVERIFY(drop({QStringLiteral("menu/from/x")}, Qt::CopyAction, -1));
    QTRY_COMPARE(shown().join(QString()), QStringLiteral("cbax"));

    QVERIFY(drop({QStringLiteral("menu/from/y")}, Qt::CopyAction, 0));
    QTRY_COMPARE(shown().size(), 5);
    QCOMPARE(shown().join(QString()), QString::fromLatin1(list().replace(';', "").mid(1)));
}

void tst_VelMenuModelDrops::reordersWithinTheFolder()
{
    QSignalSpy changed(m_view.get(), &VelMenuView::changed);

    QVERIFY(drop({QStringLiteral("menu/to/a")}, Qt::MoveAction, rowOf(QStringLiteral("menu/to/c"))));

    QCOMPARE(list(), QByteArray("*;a;c;b;"));
    QCOMPARE(shown().join(QString()), QStringLiteral("acb"));
    QCOMPARE(changed.size(), 1);
}

void tst_VelMenuModelDrops::unlistsAFileThatIsMovedOntoItsOwnFolder()
{
    QVERIFY(drop({QStringLiteral("menu/to/a")}, Qt::MoveAction, -1));

    QCOMPARE(list(), QByteArray("*;c;b;"));
    QCOMPARE(shown().join(QString()), QStringLiteral("acb"));
}

void tst_VelMenuModelDrops::leavesTheListForACopyWithinTheFolder()
{
    QVERIFY(drop({QStringLiteral("menu/to/a")}, Qt::CopyAction, rowOf(QStringLiteral("menu/to/c"))));

    QCOMPARE(read(path(QStringLiteral("menu/to/.directory"))), Directory);
    QCOMPARE(m_view->selectedPath(), path(QStringLiteral("menu/to/a")));
}

void tst_VelMenuModelDrops::listsOnlyTheFirstOfSeveral()
{
    QVERIFY(drop({QStringLiteral("menu/from/y"), QStringLiteral("menu/from/x")}, Qt::MoveAction,
                 rowOf(QStringLiteral("menu/to/b"))));

    QCOMPARE(list(), QByteArray("*;c;y;b;a;"));
    QTRY_COMPARE(shown().join(QString()), QStringLiteral("xcyba"));
}

void tst_VelMenuModelDrops::selectsWhatWasDropped()
{
    QSignalSpy changed(m_view.get(), &VelMenuView::changed);

    QVERIFY(drop({QStringLiteral("menu/from/x")}, Qt::MoveAction, 0));

    QTRY_COMPARE(m_view->selectedPath(), path(QStringLiteral("menu/to/x")));
    QCOMPARE(changed.size(), 1);
}

void tst_VelMenuModelDrops::putsTheDirectoryFileBack_data()
{
    QTest::addColumn<int>("row");
    QTest::newRow("on the folder") << -1;
    QTest::newRow("at the top") << 0;
    QTest::newRow("at the end") << 3;
}

void tst_VelMenuModelDrops::putsTheDirectoryFileBack()
{
    QFETCH(int, row);
    // Such a thing can be moved within a file system, but not be copied.
    QVERIFY(mkfifo(QFile::encodeName(path(QStringLiteral("menu/from/pipe"))).constData(), 0600) == 0);
    QSignalSpy changed(m_view.get(), &VelMenuView::changed);

    QVERIFY(!drop({QStringLiteral("menu/from/x"), QStringLiteral("menu/from/pipe")}, Qt::CopyAction, row));

    QCOMPARE(read(path(QStringLiteral("menu/to/.directory"))), Directory);
    QVERIFY(!QFile::exists(path(QStringLiteral("menu/to/x"))));
    QCOMPARE(changed.size(), 0);
    QVERIFY(!QToolTip::text().isEmpty());
}

void tst_VelMenuModelDrops::takesAwayADirectoryFileThatWasNotThere()
{
    QVERIFY(QFile::remove(path(QStringLiteral("menu/to/.directory"))));
    QVERIFY(mkfifo(QFile::encodeName(path(QStringLiteral("menu/from/pipe"))).constData(), 0600) == 0);

    QVERIFY(!drop({QStringLiteral("menu/from/pipe")}, Qt::CopyAction, 0));

    QVERIFY(!QFile::exists(path(QStringLiteral("menu/to/.directory"))));
}

void tst_VelMenuModelDrops::namesTheItemToOverwriteAsItIsWritten()
{
    const QString name = QStringLiteral("<b>x<br>");
    write(QStringLiteral("menu/from/") + name, "new");
    const QString target = write(QStringLiteral("menu/to/") + name, "old");
    ModalDriver modal;
    modal.answerWith({QMessageBox::Question, QStringLiteral("Attention"),
                      QStringLiteral("%1 already exists. Overwrite?").arg(target), QMessageBox::Yes},
                     [](QMessageBox *box) {
                         QCOMPARE(box->textFormat(), Qt::PlainText);
                         box->button(QMessageBox::Yes)->click();
                     });

    QVERIFY(!drop({QStringLiteral("menu/from/") + name}, Qt::MoveAction, 0));

    QVERIFY(modal.finished());
}

void tst_VelMenuModelDrops::asksOverTheWindowOfTheView()
{
    write(QStringLiteral("menu/to/x"), "old");
    ModalDriver modal;
    modal.handle([this](QWidget *box) {
        QCOMPARE(box->parentWidget(), m_view.get());
        QCOMPARE(box->windowHandle()->transientParent(), m_view->windowHandle());
        qobject_cast<QMessageBox *>(box)->button(QMessageBox::Yes)->click();
    });

    QVERIFY(!drop({QStringLiteral("menu/from/x")}, Qt::MoveAction, 0));

    QVERIFY(modal.finished());
}

void tst_VelMenuModelDrops::showsWhatCameInsteadOfWhatWent_data()
{
    QTest::addColumn<QByteArray>("more");
    QTest::newRow("another name") << QByteArray();
    QTest::newRow("hidden") << QByteArray("Hidden=true\n");
}

void tst_VelMenuModelDrops::showsWhatCameInsteadOfWhatWent()
{
    QFETCH(QByteArray, more);
    const QByteArray head = "[Desktop Entry]\nType=Application\nExec=true\nName=";
    const QString target = write(QStringLiteral("menu/to/d.desktop"), head + "Old\n" + more);
    write(QStringLiteral("menu/from/d.desktop"), head + "New\n");
    QTRY_COMPARE(m_model->rowCount(source(QStringLiteral("menu/to"))), 4);
    QTRY_COMPARE(shown().contains(QStringLiteral("Old")), more.isEmpty());
    QVERIFY(QFile::remove(target)); // nobody has noticed yet

    QVERIFY(drop({QStringLiteral("menu/from/d.desktop")}, Qt::MoveAction, -1));

    QVERIFY(shown().contains(QStringLiteral("New")));
    QVERIFY(!shown().contains(QStringLiteral("Old")));
}

void tst_VelMenuModelDrops::ordersAFolderThatCameByItsOwnList()
{
    write(QStringLiteral("menu/from/to/a"), "a");
    write(QStringLiteral("menu/from/to/b"), "b");
    write(QStringLiteral("menu/from/to/c"), "c");
    write(QStringLiteral("menu/from/to/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Other\nSortOrder=b;c;a;\n");
    QVERIFY(QDir(path(QStringLiteral("menu/to"))).removeRecursively()); // nobody has noticed yet
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(path(QStringLiteral("menu/from/to")))});

    QVERIFY(m_model->dropMimeData(&data, Qt::MoveAction, -1, -1, source(QStringLiteral("menu"))));

    QTRY_COMPARE(shown().join(QString()), QStringLiteral("bca"));
    QTRY_COMPARE(m_proxy->mapFromSource(source(QStringLiteral("menu/to"))).data().toString(),
                 QStringLiteral("Other"));
}

void tst_VelMenuModelDrops::tellsAtTheItemThatItWasLeft()
{
    const QString target = write(QStringLiteral("menu/to/x"), "old");
    ModalDriver modal;
    modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                  QStringLiteral("%1 already exists. Overwrite?").arg(target), QMessageBox::Yes},
                 QMessageBox::Yes);

    QVERIFY(!drop({QStringLiteral("menu/from/x")}, Qt::MoveAction, 0));

    QVERIFY(modal.finished());
    QCOMPARE(read(target), QByteArray("old"));
    QCOMPARE(read(path(QStringLiteral("menu/from/x"))), QByteArray("menu/from/x"));
    QCOMPARE(read(path(QStringLiteral("menu/to/.directory"))), Directory);
    QTRY_COMPARE(QToolTip::text(), QStringLiteral("%1 exists and was left as it is.").arg(target));
}

void tst_VelMenuModelDrops::keepsThePlaceWhenRowsGoWhileItAsks_data()
{
    QTest::addColumn<bool>("atTheEnd");
    QTest::newRow("between rows") << false;
    QTest::newRow("at the end") << true;
}

void tst_VelMenuModelDrops::keepsThePlaceWhenRowsGoWhileItAsks()
{
    QFETCH(bool, atTheEnd);
    const QString target = write(QStringLiteral("menu/to/x"), "old");
    QTRY_COMPARE(shown().join(QString()), QStringLiteral("cbax"));
    // The rows of the files need not be in order: one goes that stands above the place.
    QStringList files{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")};
    std::sort(files.begin(), files.end(), [this](const QString &left, const QString &right) {
        return rowOf(QLatin1String("menu/to/") + left) < rowOf(QLatin1String("menu/to/") + right);
    });
    const QString following = files.constLast();
    QString expected = QStringLiteral("cba").remove(files.constFirst());
    expected.insert(atTheEnd ? 2 : expected.indexOf(following), QLatin1Char('x'));
    ModalDriver modal;
    modal.handle([&](QWidget *box) {
        QVERIFY(QFile::remove(target));
        QVERIFY(QFile::remove(path(QLatin1String("menu/to/") + files.constFirst())));
        QTRY_COMPARE(m_model->rowCount(source(QStringLiteral("menu/to"))), 2);
        qobject_cast<QMessageBox *>(box)->button(QMessageBox::Yes)->click();
    });

    QVERIFY(drop({QStringLiteral("menu/from/x")}, Qt::MoveAction,
                 atTheEnd ? 4 : rowOf(QLatin1String("menu/to/") + following)));

    QVERIFY(modal.finished());
    QCOMPARE(read(target), QByteArray("menu/from/x"));
    QCOMPARE(QString::fromLatin1(list().replace(';', "")), QLatin1Char('*') + expected);
}

void tst_VelMenuModelDrops::tellsWhyAFolderIsRefused()
{
    QVERIFY(!drop({QStringLiteral("menu/to")}, Qt::MoveAction, 0));

    QCOMPARE(QToolTip::text(),
             QStringLiteral("%1 cannot be put into itself.").arg(path(QStringLiteral("menu/to"))));
    QCOMPARE(read(path(QStringLiteral("menu/to/.directory"))), Directory);
}

VEL_TEST_MAIN(tst_VelMenuModelDrops)

#include "tst_VelMenuModelDrops.moc"
