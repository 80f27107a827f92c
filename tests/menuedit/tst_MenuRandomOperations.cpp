// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Random operations on a shown menu of 300 items against a plain model of what must be on disk
// and in which order it must be shown. VEL_TEST_ROUNDS sets another number of operations than
// 200, up to 2,000; VEL_TEST_SEED repeats a run.

#include "ExactTree.h"
#include "ModalDriver.h"
#include "RandomMenuTestCase.h"

#include <frame/DesktopEntryRecord.h>

#include <QAction>
#include <QClipboard>
#include <QMimeData>
#include <QPushButton>
#include <QRandomGenerator>
#include <QVector>

#include <algorithm>
#include <memory>

/// All operations of the view, mixed.
class tst_MenuRandomOperations : public RandomMenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void staysInStepWithAPlainModel();
    void takesBackAndDoesAgain();

private:
    /// Files that go into a folder, and where.
    struct Transfer
    {
        QStringList sources;
        bool isMove;
        QString folder;
        QString following; ///< null for nowhere, empty for the end
    };

    /// One of them, with what is decided about it.
    struct Arrival
    {
        QString source;
        QString target;
        bool isHere;
    };

    /// What was at some point of the history.
    struct State
    {
        MenuMirror mirror;
        ExactTree tree;
    };

    int begin();
    void finish();
    void compareView(const QByteArray &where);
    void step();
    bool turn(bool isUndo);
    void note();
    void create();
    void edit();
    void moveByOne();
    void remember();
    void paste();
    void drop();
    void remove();
    void stepWithSeveral();
    void selectSeveral(const QStringList &paths);
    void removeSeveral();
    void moveBlock();
    bool areThere(const QStringList &paths) const;
    bool predict(const Transfer &transfer, ModalDriver &modal);
    static bool isRefused(const MenuMirror &mirror, const Transfer &transfer);
    bool predictWithAssistance(const Transfer &transfer, ModalDriver &modal);
    bool settle(const Transfer &transfer, ModalDriver &modal, QVector<Arrival> &arrivals);
    QString answer(const QString &source, const QString &target, const Transfer &transfer, bool isPromised,
                   ModalDriver &modal);
    QString freeName(const QString &source, const QString &folder, const QStringList &taken) const;
    void arrive(const Transfer &transfer, const QVector<Arrival> &arrivals);
    void duplicate();

    QString m_remembered; // on the clipboard; null for nothing
    bool m_isCut = false;
    QVector<State> m_states;
    int m_index = 0; // of the state in force
};

void tst_MenuRandomOperations::create()
{
    const bool isFolder = chance(30);
    const bool isKept = chance(70);
    const QString selected = chance(20) ? QString() : any(shownPaths());
    if (m_mirror.kindOf(selected) == Kind::Link)
        return;
    const QString place =
        m_mirror.kindOf(selected) == Kind::Folder ? selected : MenuMirror::folderOf(selected);
    QString number;
    QString path;
    for (int n = 0; path.isEmpty() || m_mirror.contains(path); ++n) {
        number = n == 0 ? QString() : QString::number(n);
        path = MenuMirror::join(place,
                                isFolder ? QLatin1String("group") + number
                                         : QLatin1String("shortcut") + number + QLatin1String(".desktop"));
    }
    describe(QStringLiteral("create %1, kept %2").arg(path).arg(isKept));
    m_view->selectionModel()->clearSelection();
    if (!selected.isEmpty())
        selectItem(selected);
    const QString name = fresh();
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        if (isKept)
            fillIn(dialog, name, isFolder);
        else
            qobject_cast<QDialog *>(dialog)->reject();
    });
    if (isFolder)
        m_view->slotDirNew();
    else
        m_view->slotFileNew();
    QVERIFY2(modal.finished(), qPrintable(m_step));
    m_selected = isKept ? full(path) : QString::fromLatin1("");
    if (!isKept)
        return;
    // What the editor writes is its own affair, apart from what was entered.
    MenuMirror::Item &item = m_mirror.item(path);
    item.kind = isFolder ? Kind::Folder : Kind::File;
    const QString record = isFolder ? full(path) + QLatin1String("/.directory") : full(path);
    item.bytes = read(record);
    QCOMPARE(VelUIDesktopEntry(record).getLocalName(), name);
}

void tst_MenuRandomOperations::edit()
{
    const QString path = any(shownPaths());
    const bool isFolder = m_mirror.kindOf(path) == Kind::Folder;
    const bool isSaved = chance(70);
    if (m_mirror.kindOf(path) == Kind::Link || (!isFolder && !path.endsWith(QLatin1String(".desktop"))))
        return;
    describe(QStringLiteral("edit %1, saved %2").arg(path).arg(isSaved));
    selectItem(path);
    const QString name = fresh();
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        if (isSaved)
            fillIn(dialog, name, isFolder);
        else
            qobject_cast<QDialog *>(dialog)->reject();
    });
    QCOMPARE(m_view->slotEdit(), isSaved);
    QVERIFY2(modal.finished(), qPrintable(m_step));
    m_selected = full(path);
    if (!isSaved)
        return;
    const QStringList order = m_mirror.sortOrderOf(path);
    const QString record = isFolder ? full(path) + QLatin1String("/.directory") : full(path);
    m_mirror.item(path).bytes = read(record);
    m_mirror.item(path).shownFirst.clear();
    QCOMPARE(VelUIDesktopEntry(record).getLocalName(), name);
    QCOMPARE(m_mirror.sortOrderOf(path), order);
}

void tst_MenuRandomOperations::moveByOne()
{
    const bool isUp = chance(50);
    const QString path = any(shownPaths());
    describe(QStringLiteral("%1 %2").arg(QLatin1String(isUp ? "up" : "down"), path));
    selectItem(path);
    const QString folder = MenuMirror::folderOf(path);
    const QString name = MenuMirror::nameOf(path);
    QStringList rows = m_rows.value(folder);
    const int row = rows.indexOf(name);
    const int to = isUp ? std::max(row - 1, 0) : std::min(row + 1, int(rows.size()) - 1);
    if (isUp)
        m_view->slotUp();
    else
        m_view->slotDown();
    m_mirror.list(folder, rows, name, isUp ? rows.at(to) : rows.value(row + 2, QString::fromLatin1("")));
    rows.move(row, to);
    QCOMPARE(m_mirror.sortOrderOf(folder), QStringList{QStringLiteral("*")} + rows);
    m_selected = full(path);
}

void tst_MenuRandomOperations::remember()
{
    m_remembered = any(shownPaths());
    m_isCut = chance(50);
    describe(QStringLiteral("%1 %2").arg(QLatin1String(m_isCut ? "cut" : "copy"), m_remembered));
    selectItem(m_remembered);
    if (m_isCut)
        m_view->slotCut();
    else
        m_view->slotCopy();
    m_selected = full(m_remembered);
}

bool tst_MenuRandomOperations::isRefused(const MenuMirror &mirror, const Transfer &transfer)
{
    QStringList names;
    for (const QString &source : transfer.sources) {
        const QString name = MenuMirror::nameOf(source);
        if (!mirror.contains(source))
            return true;
        if (mirror.kindOf(source) == Kind::Folder && MenuMirror::isBelow(transfer.folder, source))
            return true;
        if (MenuMirror::folderOf(source) == transfer.folder)
            continue;
        if (mirror.contains(MenuMirror::join(transfer.folder, name)) || names.contains(name))
            return true;
        names.append(name);
    }
    return false;
}

bool tst_MenuRandomOperations::areThere(const QStringList &paths) const
{
    return std::all_of(paths.begin(), paths.end(),
                       [this](const QString &path) { return m_mirror.contains(path); });
}

// Carries the transfer out in the plain model, and announces the question that comes.
bool tst_MenuRandomOperations::predict(const Transfer &transfer, ModalDriver &modal)
{
    if (m_view->assistance())
        return predictWithAssistance(transfer, modal);
    const QString first = transfer.sources.constFirst();
    const QString name = MenuMirror::nameOf(first);
    const QString target = MenuMirror::join(transfer.folder, name);
    const bool isOwnFolder = MenuMirror::folderOf(first) == transfer.folder;
    if (!isOwnFolder && m_mirror.contains(target))
        modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                      QStringLiteral("%1 already exists. Overwrite?").arg(full(target)), QMessageBox::Yes,
                      QMessageBox::NoButton},
                     QMessageBox::Yes);
    const bool isOrder =
        std::all_of(transfer.sources.begin(), transfer.sources.end(),
                    [&](const QString &source) { return MenuMirror::folderOf(source) == transfer.folder; });
    if (isOrder ? !m_mirror.contains(first) : isRefused(m_mirror, transfer))
        return false;
    const bool isListed = isOwnFolder ? transfer.isMove : !transfer.following.isNull();
    if (isListed)
        m_mirror.list(transfer.folder, m_rows.value(transfer.folder), name, transfer.following);
    // A folder that is moved is read again, within its folder too.
    if (isOwnFolder && transfer.isMove) {
        for (const QString &source : transfer.sources) {
            if (m_mirror.contains(source))
                m_mirror.item(source).shownFirst.clear();
        }
    }
    for (const QString &source : transfer.sources) {
        const QString to = MenuMirror::join(transfer.folder, MenuMirror::nameOf(source));
        if (MenuMirror::folderOf(source) == transfer.folder)
            continue;
        if (transfer.isMove)
            m_mirror.move(source, to);
        else
            m_mirror.copy(source, to);
    }
    m_selected = m_mirror.isHidden(target) ? QString::fromLatin1("") : full(target);
    return true;
}

// The same where the user decides about each name that is taken, and all are listed.
bool tst_MenuRandomOperations::predictWithAssistance(const Transfer &transfer, ModalDriver &modal)
{
    const auto isHere = [&](const QString &source) {
        return MenuMirror::folderOf(source) == transfer.folder;
    };
    const bool areAllHere = std::all_of(transfer.sources.begin(), transfer.sources.end(), isHere);
    for (const QString &source : transfer.sources) {
        const bool isInside =
            m_mirror.kindOf(source) == Kind::Folder && MenuMirror::isBelow(transfer.folder, source);
        if (isInside && !areAllHere)
            return false;
    }
    if (!areThere(transfer.sources))
        return false;
    QVector<Arrival> arrivals;
    if (!settle(transfer, modal, arrivals) || arrivals.isEmpty())
        return false;
    arrive(transfer, arrivals);
    const auto first = std::find_if(arrivals.begin(), arrivals.end(), [this](const Arrival &arrival) {
        return !m_mirror.isHidden(arrival.target);
    });
    m_selected = first == arrivals.end() ? QString::fromLatin1("") : full(first->target);
    return true;
}

// False where the user cancels.
bool tst_MenuRandomOperations::settle(const Transfer &transfer, ModalDriver &modal,
                                      QVector<Arrival> &arrivals)
{
    QStringList promised;
    for (const QString &source : transfer.sources) {
        QString name = MenuMirror::nameOf(source);
        const QString target = MenuMirror::join(transfer.folder, name);
        const bool isHere = MenuMirror::folderOf(source) == transfer.folder;
        if (!isHere && (m_mirror.contains(target) || promised.contains(name))) {
            const QString button = answer(source, target, transfer, promised.contains(name), modal);
            if (button.isEmpty())
                return false;
            if (button == QLatin1String("skipButton"))
                continue;
            QStringList taken = promised;
            for (const QString &other : transfer.sources)
                taken.append(MenuMirror::nameOf(other));
            if (button == QLatin1String("keepBothButton"))
                name = freeName(source, transfer.folder, taken);
        }
        promised.append(name);
        arrivals.append({source, MenuMirror::join(transfer.folder, name), isHere});
    }
    return true;
}

// The button that is pressed in the question; none to cancel.
QString tst_MenuRandomOperations::answer(const QString &source, const QString &target,
                                         const Transfer &transfer, bool isPromised, ModalDriver &modal)
{
    const bool isHolding =
        std::any_of(transfer.sources.begin(), transfer.sources.end(),
                    [&](const QString &other) { return MenuMirror::isBelow(other, target); });
    QStringList buttons{QStringLiteral("keepBothButton"), QStringLiteral("skipButton"), QString()};
    if (!isPromised && !isHolding)
        buttons += {QStringLiteral("replaceButton"), QStringLiteral("replaceButton")};
    const QString button = any(buttons);
    describe(m_step + QStringLiteral("\n%1: %2").arg(source, button));
    const bool isReplaceable = buttons.size() > 3;
    modal.handle([button, isReplaceable](QWidget *window) {
        QCOMPARE(window->windowTitle(), QStringLiteral("Name already taken"));
        QCOMPARE(window->findChild<QPushButton *>(QStringLiteral("replaceButton")) != nullptr, isReplaceable);
        if (button.isEmpty())
            window->close();
        else
            window->findChild<QPushButton *>(button)->click();
    });
    return button;
}

QString tst_MenuRandomOperations::freeName(const QString &source, const QString &folder,
                                           const QStringList &taken) const
{
    const QString name = MenuMirror::nameOf(source);
    const int dot = QFileInfo(full(source)).isDir() ? -1 : name.lastIndexOf(QLatin1Char('.'));
    for (int n = 2;; ++n) {
        const QString number = QStringLiteral("-%1").arg(n);
        const QString other = dot > 0 ? name.left(dot) + number + name.mid(dot) : name + number;
        if (!taken.contains(other) && !m_mirror.contains(MenuMirror::join(folder, other)))
            return other;
    }
}

void tst_MenuRandomOperations::arrive(const Transfer &transfer, const QVector<Arrival> &arrivals)
{
    QStringList names;
    bool isAnyHere = false;
    for (const Arrival &arrival : arrivals) {
        isAnyHere = isAnyHere || arrival.isHere;
        if (transfer.isMove || !arrival.isHere)
            names.append(MenuMirror::nameOf(arrival.target));
    }
    const bool isListed = transfer.following.isNull() ? transfer.isMove && isAnyHere : !names.isEmpty();
    if (isListed)
        m_mirror.list(transfer.folder, m_rows.value(transfer.folder), names, transfer.following);
    for (const Arrival &arrival : arrivals) {
        if (arrival.isHere)
            continue;
        m_mirror.remove(arrival.target);
        if (transfer.isMove)
            m_mirror.move(arrival.source, arrival.target);
        else
            m_mirror.copy(arrival.source, arrival.target);
    }
}

void tst_MenuRandomOperations::duplicate()
{
    const QString path = any(shownPaths());
    if (!m_view->assistance()
        || (m_mirror.kindOf(path) == Kind::Folder && m_mirror.childrenOf(path).size() > 12))
        return;
    describe(QStringLiteral("duplicate %1").arg(path));
    selectItem(path);
    const QString folder = MenuMirror::folderOf(path);
    const QString name = freeName(path, folder, {});
    action(*m_view, QStringLiteral("duplicateAction"))->trigger();
    const QStringList rows = m_rows.value(folder);
    m_mirror.list(folder, rows, name,
                  rows.value(rows.indexOf(MenuMirror::nameOf(path)) + 1, QString::fromLatin1("")));
    m_mirror.copy(path, MenuMirror::join(folder, name));
    m_selected = full(MenuMirror::join(folder, name));
}

void tst_MenuRandomOperations::paste()
{
    const QString selected = any(shownPaths());
    if (m_mirror.kindOf(selected) == Kind::Link)
        return;
    const bool isInto = m_mirror.kindOf(selected) == Kind::Folder;
    const QString folder = isInto ? selected : MenuMirror::folderOf(selected);
    describe(QStringLiteral("paste %1 at %2, cut %3").arg(m_remembered, selected).arg(m_isCut));
    selectItem(selected);
    m_selected = full(selected);
    ModalDriver modal;
    const bool isDone = !m_remembered.isNull()
        && predict({{m_remembered}, m_isCut, folder, isInto ? QString() : MenuMirror::nameOf(selected)},
                   modal);
    m_view->slotPaste();
    QVERIFY2(modal.finished(), qPrintable(m_step));
    if (isDone && m_isCut)
        m_remembered.clear();
    const QMimeData *data = QGuiApplication::clipboard()->mimeData();
    QCOMPARE(m_view->dndFormat(data).isEmpty(), m_remembered.isNull());
}

void tst_MenuRandomOperations::drop()
{
    const QStringList all = m_mirror.paths();
    Transfer transfer{{any(all)}, chance(50), any(folders()), QString()};
    const QString second = any(all);
    if (chance(30) && !MenuMirror::isBelow(second, transfer.sources.constFirst())
        && !MenuMirror::isBelow(transfer.sources.constFirst(), second))
        transfer.sources.append(second);
    if (transfer.sources.contains(QString()))
        return;
    const QStringList rows = m_rows.value(transfer.folder);
    const int row = number(rows.size() + 2) - 1;
    if (row >= 0)
        transfer.following = rows.value(row, QString::fromLatin1(""));
    describe(QStringLiteral("drop %1 in %2 at %3, move %4")
                 .arg(transfer.sources.join(QLatin1String(" and ")), transfer.folder)
                 .arg(row)
                 .arg(transfer.isMove));
    QList<QUrl> urls;
    for (const QString &source : qAsConst(transfer.sources))
        urls.append(QUrl::fromLocalFile(full(source)));
    QMimeData data;
    data.setUrls(urls);
    ModalDriver modal;
    m_selected.clear();
    const bool isDone = predict(transfer, modal);
    QCOMPARE(m_view->model()->dropMimeData(&data, transfer.isMove ? Qt::MoveAction : Qt::CopyAction, row,
                                           std::min(row, 0), shown(*m_view, full(transfer.folder))),
             isDone);
    QVERIFY2(modal.finished(), qPrintable(m_step));
}

void tst_MenuRandomOperations::remove()
{
    const QString path = any(shownPaths());
    bool isSure = chance(80);
    // Large folders would leave little to go on with.
    if (m_mirror.kindOf(path) == Kind::Folder && m_mirror.childrenOf(path).size() > 12 && chance(90))
        return;
    describe(QStringLiteral("delete %1, sure %2").arg(path).arg(isSure));
    selectItem(path);
    ModalDriver modal;
    // With assistance it can be taken back, and nobody is asked.
    if (m_view->assistance())
        isSure = true;
    else
        modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                      QStringLiteral("Are you sure to delete it?"), QMessageBox::Yes | QMessageBox::No,
                      QMessageBox::Yes},
                     isSure ? QMessageBox::Yes : QMessageBox::No);
    m_view->slotDel();
    QVERIFY2(modal.finished(), qPrintable(m_step));
    m_selected = isSure ? QString::fromLatin1("") : full(path);
    if (isSure)
        m_mirror.remove(path);
}

// As Ctrl and clicks do, in any order.
void tst_MenuRandomOperations::selectSeveral(const QStringList &paths)
{
    m_view->selectionModel()->clearSelection();
    for (const QString &path : paths)
        m_view->selectionModel()->setCurrentIndex(shown(*m_view, full(path)), QItemSelectionModel::Select);
    QCOMPARE(m_view->selectionModel()->selectedIndexes().size(), paths.size());
    QCOMPARE(m_view->selectedPath(), full(paths.constLast()));
}

void tst_MenuRandomOperations::removeSeveral()
{
    QStringList paths;
    const QStringList all = shownPaths();
    const int wanted = 2 + number(4);
    for (int i = 0; i < 20 && paths.size() < wanted; ++i) {
        // Sometimes with what lies in a folder among them.
        const QString path =
            !paths.isEmpty() && chance(30) ? any(m_mirror.childrenOf(paths.constLast())) : any(all);
        const bool isLarge =
            m_mirror.kindOf(path) == Kind::Folder && m_mirror.childrenOf(path).size() > 12 && chance(90);
        if (all.contains(path) && !paths.contains(path) && !isLarge)
            paths.append(path);
    }
    if (paths.size() < 2)
        return;
    describe(QStringLiteral("delete %1").arg(paths.join(QLatin1String(" and "))));
    selectSeveral(paths);
    const ModalDriver modal;
    m_view->slotDel();
    QVERIFY2(modal.finished(), qPrintable(m_step));
    m_selected = QString::fromLatin1("");
    for (const QString &path : qAsConst(paths)) {
        if (m_mirror.contains(path))
            m_mirror.remove(path);
    }
}

// One after the other past what is not moved, until the end is reached.
void tst_MenuRandomOperations::moveBlock()
{
    const QString folder = any(folders());
    QStringList rows = m_rows.value(folder);
    if (rows.size() < 3)
        return;
    QStringList moved;
    for (int i = 2 + number(4); i > 0; --i) {
        const QString name = any(rows);
        if (!moved.contains(name))
            moved.append(name);
    }
    if (moved.size() < 2)
        return;
    const bool isUp = chance(50);
    QStringList paths;
    for (const QString &name : qAsConst(moved))
        paths.append(MenuMirror::join(folder, name));
    describe(
        QStringLiteral("%1 %2").arg(QLatin1String(isUp ? "up" : "down"), paths.join(QLatin1String(" and "))));
    selectSeveral(paths);
    if (isUp)
        m_view->slotUp();
    else
        m_view->slotDown();
    m_selected = full(paths.constLast());
    const QStringList before = rows;
    for (int i = 1; i < rows.size(); ++i) {
        const int row = isUp ? i : rows.size() - 1 - i;
        const int next = isUp ? row - 1 : row + 1;
        if (moved.contains(rows.at(row)) && !moved.contains(rows.at(next)))
            rows.swapItemsAt(row, next);
    }
    if (rows == before)
        return;
    m_mirror.list(folder, rows, rows.constLast(), QString::fromLatin1(""));
    QCOMPARE(m_mirror.sortOrderOf(folder), QStringList{QStringLiteral("*")} + rows);
}

void tst_MenuRandomOperations::stepWithSeveral()
{
    m_step.clear();
    m_selected.clear();
    if (m_mirror.paths().size() > Items - 100 && chance(50))
        removeSeveral();
    else
        moveBlock();
}

void tst_MenuRandomOperations::step()
{
    m_step.clear();
    m_selected.clear();
    const int size = m_mirror.paths().size();
    const int what = number(size > Items + 60 ? 140 : 100);
    if (what < (size < Items - 60 ? 40 : 18))
        create();
    else if (what < 45)
        moveByOne();
    else if (what < 58)
        remember();
    else if (what < 75)
        paste();
    else if (what < 88)
        drop();
    else if (what < 91)
        edit();
    else if (what < 94)
        duplicate();
    else
        remove();
}

int tst_MenuRandomOperations::begin()
{
    const int wanted = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS");
    const int rounds = wanted > 0 ? std::min(wanted, 2000) : 200;
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : QRandomGenerator::global()->generate() & 0x7fffffff;
    qInfo("seed %u, %d rounds", seed, rounds);
    m_random.seed(seed);
    m_step.clear();
    m_selected.clear();
    build();
    m_view = std::make_unique<VelMenuView>(menu(), -1, true);
    m_view->resize(400, 600);
    m_view->show();
    return rounds;
}

void tst_MenuRandomOperations::finish()
{
    QGuiApplication::clipboard()->clear();
    m_remembered.clear();
    m_view.reset();
}

void tst_MenuRandomOperations::compareView(const QByteArray &where)
{
    // A folder is opened once the view has had the time to draw it.
    QCoreApplication::processEvents();
    QString shownWrong;
    if (!QTest::qWaitFor(
            [&] {
                shownWrong = compare();
                return shownWrong.isEmpty();
            },
            15000))
        QTest::qFail((where + shownWrong.toUtf8()).constData(), __FILE__, __LINE__);
}

void tst_MenuRandomOperations::staysInStepWithAPlainModel()
{
    const int rounds = begin();
    const MenuMirror outside = MenuMirror::ofDisk(path(QStringLiteral("outside")));
    for (int i = 0; i <= rounds && !QTest::currentTestFailed(); ++i) {
        if (i > 0)
            step();
        const QByteArray where = QByteArray::number(i) + ": " + m_step.toUtf8() + '\n';
        const QString onDisk = MenuMirror::difference(m_mirror, MenuMirror::ofDisk(menu()));
        QVERIFY2(onDisk.isEmpty(), (where + onDisk.toUtf8()).constData());
        compareView(where);
        m_mirror.keepFolderNames();
    }
    QCOMPARE(MenuMirror::difference(outside, MenuMirror::ofDisk(path(QStringLiteral("outside")))), QString());
    finish();
}

// Goes to the state before or after; false where there is none.
bool tst_MenuRandomOperations::turn(bool isUndo)
{
    const int index = m_index + (isUndo ? -1 : 1);
    if (index < 0 || index >= m_states.size())
        return false;
    QAction *action = isUndo ? m_view->undoAction() : m_view->redoAction();
    describe(action->text());
    m_selected.clear();
    action->trigger();
    m_index = index;
    m_mirror = m_states.at(m_index).mirror;
    return true;
}

// Notes what an operation came to, unless it came to nothing.
void tst_MenuRandomOperations::note()
{
    if (MenuMirror::difference(m_states.at(m_index).mirror, m_mirror).isEmpty())
        return;
    m_states.resize(m_index + 1);
    m_states.append({m_mirror, ExactTree::of(menu())});
    ++m_index;
}

void tst_MenuRandomOperations::takesBackAndDoesAgain()
{
    const int rounds = begin();
    m_view->setAssistance(true);
    m_states = {{m_mirror, ExactTree::of(menu())}};
    m_index = 0;
    int turns = 0;
    for (int i = 0; i <= rounds && !QTest::currentTestFailed(); ++i) {
        const int what = i > 0 ? number(100) : 100;
        if ((what < 20 && turn(true)) || (what >= 20 && what < 33 && turn(false)))
            ++turns;
        else if (what >= 88 && what < 100)
            stepWithSeveral();
        else if (i > 0)
            step();
        note();
        const QByteArray where = QByteArray::number(i) + ": " + m_step.toUtf8() + '\n';
        const QString onDisk = m_states.at(m_index).tree.difference(ExactTree::of(menu()), {"*"});
        QVERIFY2(onDisk.isEmpty(), (where + onDisk.toUtf8()).constData());
        // What is shown of a folder is read again whenever it changes.
        for (const QString &item : m_mirror.paths())
            m_mirror.item(item).shownFirst.clear();
        compareView(where);
    }
    while (!QTest::currentTestFailed() && turn(true)) { }
    QCOMPARE(m_states.constFirst().tree.difference(ExactTree::of(menu()), {"*"}), QString());
    QVERIFY(!m_view->undoAction()->isEnabled());
    qInfo("%d times to and fro, then back through %d states", turns, int(m_states.size()));
    finish();
}

VEL_TEST_MAIN(tst_MenuRandomOperations)
#include "tst_MenuRandomOperations.moc"
