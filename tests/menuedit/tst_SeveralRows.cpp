// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"
#include "ExactTree.h"
#include "ModalDriver.h"
#include "OlderListing.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"

#include <menuedit/FewLines.h>

#include <QAction>
#include <QClipboard>
#include <QDialogButtonBox>
#include <QDir>
#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QItemSelectionModel>
#include <QMimeData>
#include <QPushButton>
#include <QSignalSpy>

#include <memory>

#include <cerrno>
#include <cstring>

#include <sys/syscall.h>
#include <unistd.h>

namespace {

const char *theFirm = nullptr; // the name of a file that nobody can remove or move

bool isFirm(const char *path)
{
    if (!theFirm || !std::strstr(path, theFirm))
        return false;
    errno = EACCES;
    return true;
}

} // namespace

// In the place of the system's.
extern "C" int unlinkat(int folder, const char *name, int flags) noexcept
{
    return isFirm(name) ? -1 : int(syscall(SYS_unlinkat, folder, name, flags));
}

extern "C" int renameat2(int folder, const char *name, int newFolder, const char *newName,
                         unsigned flags) noexcept
{
    return isFirm(name) ? -1 : int(syscall(SYS_renameat2, folder, name, newFolder, newName, flags));
}

/// Several selected rows of a view.
class tst_SeveralRows : public EditTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void areNoneWithoutAssistance();
    void areNoneInAPicker();
    void leaveTheModeOfAHostAlone();
    void goWithTheMenu();
    void tellTheItemOfTheKeyboard();
    void enableWhatCanBeDoneToAll_data();
    void enableWhatCanBeDoneToAll();
    void areNotEditedByTheSlots();
    void goToTheClipboardFromTheTop();
    void areAskedAboutOnce_data();
    void areAskedAboutOnce();
    void areDeletedAsFarAsTheTrashGoes();
    void tellWhatCannotBeDeleted();
    void askNothingOfWhatHasGone();
    void areLeftWithTheKeyboardBesideThem_data();
    void areLeftWithTheKeyboardBesideThem();
    void followTheFilter();
    void comeBackIntoAFilter();
    void loseWhatIsHiddenAgain();
    void comeBackAfterAnOlderListing();
    void areManyAtOnce();
    void staySelectedAloneWhereOthersCome_data();
    void staySelectedAloneWhereOthersCome();
    void moveWithinOneFolder();
    void moveWhileAFilterIsSet();
    void pickNoEntry();
    void tellFewLines();

private:
    std::unique_ptr<VelMenuView> make(int count = 5);
    void add(VelMenuView &view, const QString &files) const;
    static QString selected(const VelMenuView &view);
    static QString enabled(const VelMenuView &view);
    QString in(const QString &file) const { return menu() + QLatin1Char('/') + file; }
    QString pathOf(const QString &name) const;
    QString rows(const VelMenuView &view, const QString &folder = QString()) const;
    QString trash() const { return path(QStringLiteral("data/Trash")); }

    QByteArray m_dataHome;
};

void tst_SeveralRows::init()
{
    EditTestCase::init();
    theFirm = nullptr;
    m_dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
    writeLetters("abcd");
    writeLetters("xy", QStringLiteral("games/"));
    writeFolder(QString(), QStringLiteral("Menu"), "games;a.desktop;b.desktop;c.desktop;d.desktop;");
    writeFolder(QStringLiteral("games"), QStringLiteral("Games"), "x.desktop;y.desktop;");
}

void tst_SeveralRows::cleanup()
{
    theFirm = nullptr;
    QGuiApplication::clipboard()->clear();
    qputenv("XDG_DATA_HOME", m_dataHome);
    EditTestCase::cleanup();
}

std::unique_ptr<VelMenuView> tst_SeveralRows::make(int count)
{
    auto view = std::make_unique<VelMenuView>(menu(), -1, true);
    view->setAssistance(true);
    view->resize(300, 400);
    view->show();
    open(*view, menu(), count);
    if (QFileInfo(in(QStringLiteral("games"))).isDir())
        open(*view, in(QStringLiteral("games")), 2);
    return view;
}

// The path of an item by its short name.
QString tst_SeveralRows::pathOf(const QString &name) const
{
    const QString file = name == QLatin1String("games") ? name : name + QLatin1String(".desktop");
    return in(name == QLatin1String("x") || name == QLatin1String("y") ? QLatin1String("games/") + file
                                                                       : file);
}

// Selects further items, the last of which gets the keyboard.
void tst_SeveralRows::add(VelMenuView &view, const QString &files) const
{
    const QStringList names = files.split(QLatin1Char(' '), Qt::SkipEmptyParts);
    for (const QString &name : names)
        view.selectionModel()->setCurrentIndex(shown(view, pathOf(name)), QItemSelectionModel::Select);
}

QString tst_SeveralRows::selected(const VelMenuView &view)
{
    QStringList names;
    const QModelIndexList rows = view.selectionModel()->selectedIndexes();
    for (const QModelIndex &row : rows)
        names.append(row.data().toString());
    names.sort();
    return names.join(QLatin1Char(' '));
}

QString tst_SeveralRows::enabled(const VelMenuView &view)
{
    QStringList names;
    for (const char *name : {"dirNew", "edit", "delete", "execute", "cut", "copy", "paste", "up", "down"}) {
        if (action(view, QLatin1String(name) + QLatin1String("Action"))->isEnabled())
            names.append(QLatin1String(name));
    }
    return names.join(QLatin1Char(' '));
}

QString tst_SeveralRows::rows(const VelMenuView &view, const QString &folder) const
{
    return names(view, folder.isEmpty() ? menu() : in(folder)).join(QLatin1Char(' '));
}

void tst_SeveralRows::areNoneWithoutAssistance()
{
    VelMenuView plain(menu(), -1, true);
    QCOMPARE(plain.selectionMode(), QAbstractItemView::SingleSelection);
    const auto view = make();
    QCOMPARE(view->selectionMode(), QAbstractItemView::ExtendedSelection);
    add(*view, QStringLiteral("a b c"));
    QCOMPARE(selected(*view), QStringLiteral("A B C"));
    view->setAssistance(false);
    QCOMPARE(view->selectionMode(), QAbstractItemView::SingleSelection);
    QCOMPARE(selected(*view), QStringLiteral("C"));
    QCOMPARE(enabled(*view), QStringLiteral("dirNew edit delete execute cut copy up down"));
}

void tst_SeveralRows::areNoneInAPicker()
{
    VelMenuView picker(menu(), -1, false);
    picker.setAssistance(true);
    QCOMPARE(picker.selectionMode(), QAbstractItemView::SingleSelection);
    // Nor where an editor becomes one.
    const auto view = make();
    view->init(menu(), -1, false, nullptr);
    QVERIFY(view->assistance());
    QCOMPARE(view->selectionMode(), QAbstractItemView::SingleSelection);
    view->init(menu(), -1, true, nullptr);
    QCOMPARE(view->selectionMode(), QAbstractItemView::ExtendedSelection);
}

void tst_SeveralRows::leaveTheModeOfAHostAlone()
{
    VelMenuView view(menu(), -1, true);
    view.setSelectionMode(QAbstractItemView::NoSelection);
    view.setAssistance(true);
    QCOMPARE(view.selectionMode(), QAbstractItemView::NoSelection);
    view.setAssistance(false);
    QCOMPARE(view.selectionMode(), QAbstractItemView::NoSelection);
}

void tst_SeveralRows::goWithTheMenu()
{
    const auto view = make();
    add(*view, QStringLiteral("a x"));
    view->init(menu(), -1, true, nullptr);
    QCOMPARE(selected(*view), QString());
    QVERIFY(open(*view, menu(), 5));
    add(*view, QStringLiteral("a b"));
    QCOMPARE(selected(*view), QStringLiteral("A B"));
}

void tst_SeveralRows::tellTheItemOfTheKeyboard()
{
    const auto view = make();
    add(*view, QStringLiteral("d b"));
    QCOMPARE(view->selectedPath(), pathOf(QStringLiteral("b")));
    QSignalSpy selections(view.get(), QOverload<const QString &>::of(&VelMenuView::selectionChanged));
    view->selectionModel()->setCurrentIndex(shown(*view, pathOf(QStringLiteral("d"))),
                                            QItemSelectionModel::NoUpdate);
    QCOMPARE(view->selectedPath(), pathOf(QStringLiteral("d")));
    QTRY_COMPARE(selections.count(), 1);
    QCOMPARE(selections.takeLast().constFirst().toString(), pathOf(QStringLiteral("d")));
    // Beside what is selected, the first counts.
    view->selectionModel()->setCurrentIndex(shown(*view, pathOf(QStringLiteral("c"))),
                                            QItemSelectionModel::NoUpdate);
    QCOMPARE(view->selectedPath(), pathOf(QStringLiteral("b")));
    QTRY_COMPARE(selections.count(), 1);
    QCOMPARE(selections.takeLast().constFirst().toString(), pathOf(QStringLiteral("b")));
    QCOMPARE(view->selectedItem(), files(*view)->index(pathOf(QStringLiteral("b"))));
}

void tst_SeveralRows::enableWhatCanBeDoneToAll_data()
{
    QTest::addColumn<QString>("items");
    QTest::addColumn<QString>("expected");
    QTest::newRow("one") << "a"
                         << "dirNew edit delete execute cut copy up down";
    QTest::newRow("side by side") << "b a"
                                  << "dirNew delete cut copy up down";
    QTest::newRow("at the top") << "a games"
                                << "dirNew delete cut copy down";
    QTest::newRow("at the bottom") << "c d b"
                                   << "dirNew delete cut copy up";
    QTest::newRow("both ends") << "games d"
                               << "dirNew delete cut copy up down";
    QTest::newRow("all") << "a b c d games"
                         << "dirNew delete cut copy";
    QTest::newRow("two folders") << "x a"
                                 << "dirNew delete cut copy";
}

void tst_SeveralRows::enableWhatCanBeDoneToAll()
{
    QFETCH(QString, items);
    QFETCH(QString, expected);
    const auto view = make();
    add(*view, items);
    QCOMPARE(enabled(*view), expected);
    const WithoutPermission none;
    view->setActionsEnabled();
    QCOMPARE(enabled(*view), QString());
}

void tst_SeveralRows::areNotEditedByTheSlots()
{
    const auto view = make();
    add(*view, QStringLiteral("a b"));
    const ModalDriver modal;
    QVERIFY(!view->slotEdit());
    view->slotExe();
    QVERIFY(modal.finished());
}

void tst_SeveralRows::goToTheClipboardFromTheTop()
{
    const auto view = make();
    add(*view, QStringLiteral("d y a games"));
    view->slotCut();
    const QMimeData *data = QGuiApplication::clipboard()->mimeData();
    QStringList paths;
    for (const char *name : {"games", "a", "d"})
        paths.append(QUrl::fromLocalFile(pathOf(QLatin1String(name))).toString());
    QStringList found;
    const QList<QUrl> urls = view->dndUrls(data, view->dndFormat(data));
    for (const QUrl &url : urls)
        found.append(QLatin1String("file://") + QDir::cleanPath(QLatin1Char('/') + url.host() + url.path()));
    QCOMPARE(found, paths);
    QCOMPARE(view->dndFormat(data), QStringLiteral("text/uri-move-list"));
    // What a host puts there is one item, as ever.
    view->FillClipboard(view->selectedItem(), Qt::CopyAction);
    QCOMPARE(QGuiApplication::clipboard()->mimeData()->urls().size(), 1);
}

void tst_SeveralRows::areAskedAboutOnce_data()
{
    QTest::addColumn<bool>("isSure");
    QTest::newRow("yes") << true;
    QTest::newRow("no") << false;
}

void tst_SeveralRows::areAskedAboutOnce()
{
    QFETCH(bool, isSure);
    write(QStringLiteral("data/Trash"), "no folder");
    const auto view = make();
    add(*view, QStringLiteral("a c x games"));
    QSignalSpy changes(view.get(), &VelMenuView::changed);
    ModalDriver modal;
    modal.answer({QMessageBox::Warning, QStringLiteral("Attention"),
                  QStringLiteral("There is no trash for 3 of these items. They would be deleted for good: "
                                 "this cannot be undone. Delete them?"),
                  QMessageBox::Yes | QMessageBox::No, QMessageBox::No},
                 isSure ? QMessageBox::Yes : QMessageBox::No);
    view->slotDel();
    QVERIFY(modal.finished());
    QTRY_COMPARE(rows(*view), isSure ? QStringLiteral("B D") : QStringLiteral("Games A B C D"));
    QCOMPARE(selected(*view), isSure ? QString() : QStringLiteral("A C Games"));
    QCOMPARE(changes.count(), isSure ? 1 : 0);
    QVERIFY(!view->undoAction()->isEnabled());
}

void tst_SeveralRows::areDeletedAsFarAsTheTrashGoes()
{
    const auto view = make();
    const ExactTree before = ExactTree::of(menu());
    add(*view, QStringLiteral("a c games"));
    theFirm = "c.desktop";
    ModalDriver modal;
    modal.answer({QMessageBox::Warning, QStringLiteral("Attention"),
                  QStringLiteral("There is no trash for C. It would be deleted for good: this cannot be "
                                 "undone. Delete it?"),
                  QMessageBox::Yes | QMessageBox::No, QMessageBox::No},
                 QMessageBox::No);
    view->slotDel();
    QVERIFY(modal.finished());
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo deletion of 2 items (3 entries)"));
    QTRY_COMPARE(rows(*view), QStringLiteral("B C D"));
    // What stays is selected still.
    QCOMPARE(selected(*view), QStringLiteral("C"));
    theFirm = nullptr;
    view->undoAction()->trigger();
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
}

void tst_SeveralRows::tellWhatCannotBeDeleted()
{
    write(QStringLiteral("data/Trash"), "no folder");
    const auto view = make();
    theFirm = "x.desktop";
    add(*view, QStringLiteral("a games d"));
    QSignalSpy told(view.get(), &VelMenuView::told);
    QSignalSpy changes(view.get(), &VelMenuView::changed);
    ModalDriver modal;
    modal.handle([](QWidget *box) { qobject_cast<QMessageBox *>(box)->button(QMessageBox::Yes)->click(); });
    view->slotDel();
    QVERIFY(modal.finished());
    QCOMPARE(
        everythingIn(menu()),
        QStringList({QStringLiteral(".directory"), QStringLiteral("b.desktop"), QStringLiteral("c.desktop"),
                     QStringLiteral("games"), QStringLiteral("games/x.desktop")}));
    QCOMPARE(told.count(), 1);
    QCOMPARE(
        told.constFirst(),
        QVariantList(
            {QStringLiteral("%1 cannot be deleted: Permission denied").arg(pathOf(QStringLiteral("x"))), 2}));
    QCOMPARE(changes.count(), 1);
    // Which has no name of its own any more.
    QCOMPARE(selected(*view), QStringLiteral("games"));
}

void tst_SeveralRows::askNothingOfWhatHasGone()
{
    const auto view = make();
    add(*view, QStringLiteral("a b c"));
    QVERIFY(QFile::remove(pathOf(QStringLiteral("b"))));
    const ModalDriver modal;
    view->slotDel();
    QVERIFY(modal.finished());
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo deletion of 2 items"));
    QTRY_COMPARE(rows(*view), QStringLiteral("Games D"));
}

void tst_SeveralRows::areLeftWithTheKeyboardBesideThem_data()
{
    QTest::addColumn<QString>("items");
    QTest::addColumn<QString>("current");
    QTest::newRow("in the middle") << "b a"
                                   << "C";
    QTest::newRow("at the bottom") << "c d"
                                   << "B";
    QTest::newRow("apart") << "b d a"
                           << "C";
    QTest::newRow("all of a folder") << "x y"
                                     << "Games";
    QTest::newRow("in two folders") << "a x"
                                    << "Y";
    QTest::newRow("in two folders, from the inside") << "x a"
                                                     << "B";
    QTest::newRow("folder and inner") << "games x"
                                      << "A";
}

void tst_SeveralRows::areLeftWithTheKeyboardBesideThem()
{
    QFETCH(QString, items);
    QFETCH(QString, current);
    const auto view = make();
    add(*view, items);
    view->slotDel();
    QCOMPARE(selected(*view), QString());
    QCOMPARE(view->currentIndex().data().toString(), current);
    for (const QString &name : items.split(QLatin1Char(' ')))
        QTRY_VERIFY(!names(*view, menu()).contains(name.toUpper()));
    QTest::qWait(100);
    QCOMPARE(selected(*view), QString());
    QCOMPARE(view->currentIndex().data().toString(), current);
}

// Nobody would see what is about to be deleted.
void tst_SeveralRows::followTheFilter()
{
    const auto view = make();
    add(*view, QStringLiteral("b x d a"));
    view->setFilter(QStringLiteral("b"));
    QTRY_COMPARE(rows(*view), QStringLiteral("B"));
    QCOMPARE(selected(*view), QStringLiteral("B"));
    view->setFilter(QString());
    QTRY_COMPARE(rows(*view), QStringLiteral("Games A B C D"));
    QTest::qWait(50);
    QCOMPARE(selected(*view), QStringLiteral("B"));
}

void tst_SeveralRows::comeBackIntoAFilter()
{
    const ExactTree before = ExactTree::of(menu());
    const auto view = make();
    view->setFilter(QStringLiteral("true"));
    QTRY_COMPARE(rows(*view), QStringLiteral("Games A B C D"));
    QTRY_COMPARE(rows(*view, QStringLiteral("games")), QStringLiteral("X Y"));
    add(*view, QStringLiteral("a c x"));
    view->slotDel();
    QTRY_COMPARE(rows(*view), QStringLiteral("Games B D"));
    view->setFilter(QStringLiteral("b"));
    QTRY_COMPARE(rows(*view), QStringLiteral("B"));
    view->undoAction()->trigger();
    QTRY_COMPARE(rows(*view), QStringLiteral("Games A B C"));
    QTRY_COMPARE(rows(*view, QStringLiteral("games")), QStringLiteral("X"));
    QTRY_COMPARE(selected(*view), QStringLiteral("A C X"));
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    view->slotCut();
    select(*view, pathOf(QStringLiteral("b")));
    QTRY_VERIFY(action(*view, QStringLiteral("pasteAction"))->isEnabled());
}

void tst_SeveralRows::loseWhatIsHiddenAgain()
{
    writeEntry(QStringLiteral("h.desktop"), QStringLiteral("H"), "Exec=true\nHidden=true\n");
    const auto view = make();
    view->setHiddenShown(true);
    QTRY_COMPARE(names(*view, menu()).size(), 6);
    add(*view, QStringLiteral("a h b"));
    QCOMPARE(selected(*view), QStringLiteral("A B H"));
    view->setHiddenShown(false);
    QTRY_COMPARE(names(*view, menu()).size(), 5);
    QCOMPARE(selected(*view), QStringLiteral("A B"));
    view->slotDel();
    QVERIFY(QFile::exists(pathOf(QStringLiteral("h"))));
    view->setHiddenShown(true);
    QTRY_COMPARE(names(*view, menu()).size(), 4);
    // And what is hidden is deleted and comes back like all else.
    add(*view, QStringLiteral("c h"));
    const ExactTree before = ExactTree::of(menu());
    view->slotDel();
    QVERIFY(!QFile::exists(pathOf(QStringLiteral("h"))));
    view->undoAction()->trigger();
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    QTRY_COMPARE(selected(*view), QStringLiteral("C H"));
}

// What the model does with a listing made before the items.
void tst_SeveralRows::comeBackAfterAnOlderListing()
{
    const auto view = make();
    add(*view, QStringLiteral("a b d"));
    QVERIFY(takeOlderListing(files(*view), menu(), {QStringLiteral("c.desktop"), QStringLiteral("games")}));
    QCOMPARE(rows(*view), QStringLiteral("Games C"));
    QCOMPARE(selected(*view), QString());
    writeEntry(QStringLiteral("e.desktop"), QStringLiteral("E"));
    QTRY_COMPARE(names(*view, menu()).size(), 6);
    QTRY_COMPARE(selected(*view), QStringLiteral("A B D"));

    // Unless something else has been selected meanwhile.
    QVERIFY(takeOlderListing(files(*view), menu(), {QStringLiteral("c.desktop"), QStringLiteral("games")}));
    select(*view, pathOf(QStringLiteral("c")));
    writeEntry(QStringLiteral("f.desktop"), QStringLiteral("F"));
    QTRY_COMPARE(names(*view, menu()).size(), 7);
    QTest::qWait(50);
    QCOMPARE(selected(*view), QStringLiteral("C"));
}

void tst_SeveralRows::areManyAtOnce()
{
    const int count = 1000;
    for (int i = 0; i < count; ++i)
        writeEntry(QStringLiteral("many/%1.desktop").arg(i, 4, 10, QLatin1Char('0')), QStringLiteral("M"));
    const ExactTree before = ExactTree::of(menu());
    const auto view = make(6);
    const QString many = in(QStringLiteral("many"));
    QVERIFY(open(*view, many, count));
    const QModelIndex folder = shown(*view, many);
    QElapsedTimer timer;
    const auto lap = [&](const char *what) { qInfo("%s: %lld ms", what, timer.restart()); };
    timer.start();
    view->selectionModel()->select(
        QItemSelection(view->model()->index(0, 0, folder), view->model()->index(count - 1, 0, folder)),
        QItemSelectionModel::ClearAndSelect);
    lap("select");
    view->slotCut();
    lap("cut");
    view->grab();
    lap("paint");
    view->slotDel();
    lap("delete");
    QCOMPARE(view->undoAction()->text(), QStringLiteral("Undo deletion of 1000 items"));
    QTRY_COMPARE_WITH_TIMEOUT(view->model()->rowCount(shown(*view, many)), 0, 20000);
    QCOMPARE(QDir(many).count(), 2U);
    timer.restart();
    view->undoAction()->trigger();
    lap("undo");
    QTRY_COMPARE_WITH_TIMEOUT(view->selectionModel()->selectedIndexes().size(), count, 20000);
    lap("selected");
    QCOMPARE(before.difference(ExactTree::of(menu())), QString());
    timer.restart();
    view->redoAction()->trigger();
    lap("redo");
    QCOMPARE(QDir(many).count(), 2U);
}

void tst_SeveralRows::staySelectedAloneWhereOthersCome_data()
{
    QTest::addColumn<bool>("isFiltered");
    QTest::newRow("a filter is taken away") << true;
    QTest::newRow("hidden entries are shown") << false;
}

// All of a folder, and so many that they are not remembered one by one
void tst_SeveralRows::staySelectedAloneWhereOthersCome()
{
    QFETCH(bool, isFiltered);
    const int count = 1100;
    for (int i = 0; i < count; ++i) {
        const QString number = QStringLiteral("%1").arg(i, 4, 10, QLatin1Char('0'));
        writeEntry(QLatin1String("many/") + number + QLatin1String("a.desktop"),
                   number + QLatin1String(" hit"));
        if (i % 4 == 0)
            writeEntry(QLatin1String("many/") + number + QLatin1String("b.desktop"),
                       number + QLatin1String(" miss"), isFiltered ? "" : "Hidden=true\n");
    }
    const auto view = make(6);
    const QString many = in(QStringLiteral("many"));
    const int all = count + count / 4;
    QVERIFY(open(*view, many, isFiltered ? all : count));
    if (isFiltered)
        view->setFilter(QStringLiteral("hit"));
    QTRY_COMPARE_WITH_TIMEOUT(view->model()->rowCount(shown(*view, many)), count, 20000);
    const QModelIndex folder = shown(*view, many);
    view->selectionModel()->select(
        QItemSelection(view->model()->index(0, 0, folder), view->model()->index(count - 1, 0, folder)),
        QItemSelectionModel::ClearAndSelect);

    if (isFiltered)
        view->setFilter(QString());
    else
        view->setHiddenShown(true);
    QTRY_COMPARE_WITH_TIMEOUT(view->model()->rowCount(shown(*view, many)), all, 20000);
    const QModelIndexList rows = view->selectionModel()->selectedIndexes();
    QCOMPARE(rows.size(), count);
    for (const QModelIndex &row : rows)
        QVERIFY(row.data().toString().endsWith(QLatin1String("hit")));
}

void tst_SeveralRows::moveWithinOneFolder()
{
    const auto view = make();
    add(*view, QStringLiteral("a x"));
    view->slotUp();
    QCOMPARE(rows(*view), QStringLiteral("Games A B C D"));
    QVERIFY(!view->undoAction()->isEnabled());
    select(*view, pathOf(QStringLiteral("a")));
    add(*view, QStringLiteral("c"));
    view->slotDown();
    QCOMPARE(rows(*view), QStringLiteral("Games B A D C"));
    QCOMPARE(selected(*view), QStringLiteral("A C"));
    view->slotDown();
    QCOMPARE(rows(*view), QStringLiteral("Games B D A C"));
    view->undoAction()->trigger();
    view->undoAction()->trigger();
    QCOMPARE(rows(*view), QStringLiteral("Games A B C D"));
}

// Past what can be seen; what is left out keeps its place.
void tst_SeveralRows::moveWhileAFilterIsSet()
{
    for (const char *name : {"b", "c"})
        writeEntry(QLatin1String(name) + QLatin1String(".desktop"), QString::fromLatin1(name).toUpper(),
                   "Exec=other\n");
    const auto view = make();
    view->setFilter(QStringLiteral("true"));
    QTRY_COMPARE(rows(*view), QStringLiteral("Games A D"));
    add(*view, QStringLiteral("a d"));
    view->slotUp();
    QTRY_COMPARE(rows(*view), QStringLiteral("A D Games"));
    view->setFilter(QString());
    QTRY_COMPARE(rows(*view), QStringLiteral("A D Games B C"));
}

void tst_SeveralRows::pickNoEntry()
{
    VelMenuDialog dialog(menu(), -1, true, false);
    auto *view = dialog.findChild<VelMenuView *>();
    const QPushButton *ok = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
    dialog.setAssistance(true);
    dialog.show();
    QVERIFY(open(*view, menu(), 5));
    add(*view, QStringLiteral("a"));
    QVERIFY(ok->isEnabled());
    add(*view, QStringLiteral("b"));
    QVERIFY(!ok->isEnabled());
    QCOMPARE(dialog.selectedItemPath(), pathOf(QStringLiteral("b")));
    view->selectionModel()->select(shown(*view, pathOf(QStringLiteral("b"))), QItemSelectionModel::Deselect);
    QVERIFY(ok->isEnabled());
    QCOMPARE(dialog.selectedItemPath(), pathOf(QStringLiteral("a")));
    add(*view, QStringLiteral("games"));
    view->selectionModel()->select(shown(*view, pathOf(QStringLiteral("a"))), QItemSelectionModel::Deselect);
    QVERIFY(!ok->isEnabled());
}

void tst_SeveralRows::tellFewLines()
{
    QStringList lines;
    for (int i = 1; i <= 4; ++i)
        lines.append(QString::number(i));
    QCOMPARE(FewLines::of(lines), QStringLiteral("1\n2\n3\n4"));
    lines.append(QStringLiteral("5"));
    QCOMPARE(FewLines::of(lines), QStringLiteral("1\n2\n3\nAnd 2 more."));
    QCOMPARE(FewLines::of({}), QString());
}

VEL_TEST_MAIN(tst_SeveralRows)
#include "tst_SeveralRows.moc"
