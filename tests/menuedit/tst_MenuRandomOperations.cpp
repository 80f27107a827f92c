// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Random operations on a shown menu of 300 items against a plain model of what must be on disk
// and in which order it must be shown. VEL_TEST_ROUNDS sets another number of operations than
// 200, up to 2,000; VEL_TEST_SEED repeats a run.

#include "MenuMirror.h"
#include "MenuTestCase.h"
#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuView.h"

#include <frame/DesktopEntryRecord.h>

#include <QClipboard>
#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QLineEdit>
#include <QMimeData>
#include <QRandomGenerator>
#include <QSortFilterProxyModel>

#include <memory>
#include <random>

namespace {

constexpr int Items = 300;

} // namespace

/// All operations of the view, mixed.
class tst_MenuRandomOperations : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void staysInStepWithAPlainModel();

private:
    using Kind = MenuMirror::Kind;
    /// Files that go into a folder, and where.
    struct Transfer
    {
        QStringList sources;
        bool isMove;
        QString folder;
        QString following; ///< null for nowhere, empty for the end
    };

    void build();
    void buildItem(const QString &folder, int number);
    void step();
    void create();
    void edit();
    void moveByOne();
    void remember();
    void paste();
    void drop();
    void remove();
    bool predict(const Transfer &transfer, ModalDriver &modal);
    static bool isRefused(const MenuMirror &mirror, const Transfer &transfer);

    void selectItem(const QString &path);
    QString compare();
    QString compareRows(const QModelIndex &parent, const QString &folder);
    bool openAll(const QModelIndex &parent, const QString &folder);
    void describe(const QString &text) { m_step = text; }

    static void fillIn(QWidget *dialog, const QString &name, bool isFolder);
    QString full(const QString &relative) const
    {
        return relative.isEmpty() ? menu() : menu() + QLatin1Char('/') + relative;
    }
    QString fresh() { return QStringLiteral("Entry %1").arg(++m_counter, 5, 10, QLatin1Char('0')); }
    int number(int below) { return std::uniform_int_distribution<int>(0, below - 1)(m_random); }
    bool chance(int percent) { return number(100) < percent; }
    QString any(const QStringList &list) { return list.isEmpty() ? QString() : list.at(number(list.size())); }
    QStringList shownPaths() const;
    QStringList folders() const;

    std::mt19937 m_random;
    int m_counter = 0;
    std::unique_ptr<VelMenuView> m_view;
    MenuMirror m_mirror;
    QMap<QString, QStringList> m_rows; // the file names shown in each folder after the last step
    QString m_selected; // what must be selected; null when that does not matter
    QString m_remembered; // on the clipboard; null for nothing
    bool m_isCut = false;
    QString m_step;
};

// Names that are hard on URLs and shells, and the same ones in several folders.
void tst_MenuRandomOperations::buildItem(const QString &folder, int number)
{
    static const char *const patterns[] = {"e%1.desktop", "My Ж %1.desktop", "a b#%1?.desktop",
                                           "100%25 %1.desktop", "note%1.txt"};
    const QString name = QString::fromUtf8(patterns[number % 23 < 5 ? number % 23 : 0]).arg(number % 97);
    const QString path = full(MenuMirror::join(folder, name));
    const QString relative = QLatin1String("menu/") + MenuMirror::join(folder, name);
    if (QFileInfo::exists(path))
        return;
    if (number % 31 == 30)
        QFile::link(folder.isEmpty() ? this->path(QStringLiteral("outside/far.desktop"))
                                     : this->path(QStringLiteral("outside/group")),
                    path);
    else
        write(relative, entryText(fresh(), number % 29 == 28 ? "Hidden=true\n" : "Exec=true\n"));
}

void tst_MenuRandomOperations::build()
{
    write(QStringLiteral("outside/far.desktop"), entryText(QStringLiteral("Far")));
    write(QStringLiteral("outside/group/.directory"), "[Desktop Entry]\nType=Directory\nName=Outside\n");
    write(QStringLiteral("outside/group/in.desktop"), entryText(QStringLiteral("In")));
    const QStringList folders{QString(),
                              QStringLiteral("games"),
                              QStringLiteral("games/My Ж"),
                              QStringLiteral("games/My Ж/deep#1"),
                              QStringLiteral("office"),
                              QStringLiteral("office/games"),
                              QStringLiteral("tools"),
                              QStringLiteral("tools/tools")};
    for (int i = 0; i < folders.size(); ++i) {
        QDir().mkpath(full(folders.at(i)));
        const QByteArray order = i == 0 ? "e5.desktop;*;tools;" : i == 1 ? "*;e9.desktop;e1*;" : "";
        if (i % 4 != 3)
            writeFolder(folders.at(i), QStringLiteral("Folder %1").arg(i), order);
    }
    for (int i = 0; MenuMirror::ofDisk(menu()).paths().size() <= Items; ++i)
        buildItem(folders.at(number(folders.size())), i);
    m_mirror = MenuMirror::ofDisk(menu());
}

QStringList tst_MenuRandomOperations::shownPaths() const
{
    QStringList paths;
    for (auto it = m_rows.cbegin(); it != m_rows.cend(); ++it) {
        for (const QString &name : *it)
            paths.append(MenuMirror::join(it.key(), name));
    }
    return paths;
}

QStringList tst_MenuRandomOperations::folders() const
{
    QStringList result;
    const QStringList paths = m_mirror.paths();
    for (const QString &path : paths) {
        if (m_mirror.kindOf(path) == Kind::Folder)
            result.append(path);
    }
    return result;
}

void tst_MenuRandomOperations::selectItem(const QString &path)
{
    select(*m_view, full(path));
    QCOMPARE(m_view->selectedPath(), full(path));
}

void tst_MenuRandomOperations::fillIn(QWidget *dialog, const QString &name, bool isFolder)
{
    const QStringList fields = isFolder
        ? QStringList{QStringLiteral("nameEdit"), QStringLiteral("localNameEdit")}
        : QStringList{QStringLiteral("nameEdit"), QStringLiteral("localNameEdit"),
                      QStringLiteral("execEdit")};
    for (const QString &field : fields) {
        auto *widget = dialog->findChild<QWidget *>(field);
        QVERIFY(widget);
        auto *line = qobject_cast<QLineEdit *>(widget);
        if (!line)
            line = widget->findChild<QLineEdit *>();
        QVERIFY(line);
        line->setText(field == QLatin1String("execEdit") ? QStringLiteral("true") : name);
    }
    auto *editor = qobject_cast<VelDesktopEntryEditDialog *>(dialog);
    QVERIFY(editor);
    editor->accept();
    QCOMPARE(editor->result(), int(QDialog::Accepted));
}

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
    QVERIFY(modal.finished());
    m_selected = isKept ? full(path) : QString::fromLatin1("");
    if (!isKept)
        return;
    // What the editor writes is its own affair, apart from what was entered.
    MenuMirror::Item &item = m_mirror.item(path);
    item.kind = isFolder ? Kind::Folder : Kind::File;
    const QString record = isFolder ? full(path) + QLatin1String("/.directory") : full(path);
    item.bytes = read(record);
    QCOMPARE(VelUIDesktopEntry(record).getLocalName(), name);
    if (isFolder)
        item.shownFirst = QLatin1String("Group") + number;
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
    QVERIFY(modal.finished());
    m_selected = full(path);
    if (!isSaved)
        return;
    const QStringList order = m_mirror.sortOrderOf(path);
    const QString record = isFolder ? full(path) + QLatin1String("/.directory") : full(path);
    m_mirror.item(path).bytes = read(record);
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
    const int to = isUp ? std::max(row - 1, 0) : std::min(row + 1, rows.size() - 1);
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

// Carries the transfer out in the plain model, and announces the question that comes.
bool tst_MenuRandomOperations::predict(const Transfer &transfer, ModalDriver &modal)
{
    const QString first = transfer.sources.constFirst();
    const QString name = MenuMirror::nameOf(first);
    const QString target = MenuMirror::join(transfer.folder, name);
    const bool isOwnFolder = MenuMirror::folderOf(first) == transfer.folder;
    if (!isOwnFolder && m_mirror.contains(target))
        modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                      QStringLiteral("%1 already exists. Overwrite?").arg(full(target)), QMessageBox::Yes,
                      QMessageBox::NoButton},
                     QMessageBox::Yes);
    if (isOwnFolder ? !m_mirror.contains(first) : isRefused(m_mirror, transfer))
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
        if (isOwnFolder || MenuMirror::folderOf(source) == transfer.folder)
            continue;
        if (transfer.isMove)
            m_mirror.move(source, to);
        else
            m_mirror.copy(source, to);
    }
    m_selected = m_mirror.isHidden(target) ? QString::fromLatin1("") : full(target);
    return true;
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
    QVERIFY(modal.finished());
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
    QVERIFY(modal.finished());
}

void tst_MenuRandomOperations::remove()
{
    const QString path = any(shownPaths());
    const bool isSure = chance(80);
    // Large folders would leave little to go on with.
    if (m_mirror.kindOf(path) == Kind::Folder && m_mirror.childrenOf(path).size() > 12 && chance(90))
        return;
    describe(QStringLiteral("delete %1, sure %2").arg(path).arg(isSure));
    selectItem(path);
    ModalDriver modal;
    modal.answer({QMessageBox::Question, QStringLiteral("Attention"),
                  QStringLiteral("Are you sure to delete it?"), QMessageBox::Yes | QMessageBox::No,
                  QMessageBox::Yes},
                 isSure ? QMessageBox::Yes : QMessageBox::No);
    m_view->slotDel();
    QVERIFY(modal.finished());
    m_selected = isSure ? QString::fromLatin1("") : full(path);
    if (isSure)
        m_mirror.remove(path);
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
    else if (what < 93)
        edit();
    else
        remove();
}

bool tst_MenuRandomOperations::openAll(const QModelIndex &parent, const QString &folder)
{
    bool isOpen = true;
    const QAbstractItemModel &model = *m_view->model();
    for (int row = 0; row < model.rowCount(parent); ++row) {
        const QModelIndex index = model.index(row, 0, parent);
        const QString path = MenuMirror::join(folder, index.data(QFileSystemModel::FileNameRole).toString());
        if (m_mirror.kindOf(path) != Kind::Folder || !m_mirror.contains(path))
            continue;
        if (!m_view->isExpanded(index)) {
            m_view->model()->fetchMore(index);
            m_view->expand(index);
            isOpen = false;
        }
        isOpen = openAll(index, path) && isOpen;
    }
    return isOpen;
}

QString tst_MenuRandomOperations::compareRows(const QModelIndex &parent, const QString &folder)
{
    const QAbstractItemModel &model = *m_view->model();
    QStringList names;
    QString fault;
    for (int row = 0; row < model.rowCount(parent) && fault.isEmpty(); ++row) {
        const QModelIndex index = model.index(row, 0, parent);
        const QString name = index.data(QFileSystemModel::FileNameRole).toString();
        const QString path = MenuMirror::join(folder, name);
        names.append(name);
        if (m_mirror.contains(path) && index.data().toString() != m_mirror.shownName(path))
            fault = QStringLiteral("%1 is shown as %2 instead of %3")
                        .arg(path, index.data().toString(), m_mirror.shownName(path));
        if (m_mirror.contains(path) && m_mirror.kindOf(path) == Kind::Folder && fault.isEmpty())
            fault = compareRows(index, path);
    }
    m_rows.insert(folder, names);
    return fault.isEmpty() ? m_mirror.faultOf(folder, names) : fault;
}

// What differs between the view and the plain model; empty when nothing does.
QString tst_MenuRandomOperations::compare()
{
    const QModelIndex root = m_view->rootIndex();
    openAll(root, QString());
    m_rows.clear();
    QString fault = compareRows(root, QString());
    if (fault.isEmpty() && !m_selected.isNull() && m_view->selectedPath() != m_selected)
        fault =
            QStringLiteral("selected is \"%1\" instead of \"%2\"").arg(m_view->selectedPath(), m_selected);
    return fault;
}

void tst_MenuRandomOperations::staysInStepWithAPlainModel()
{
    const int wanted = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS");
    const int rounds = wanted > 0 ? std::min(wanted, 2000) : 200;
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : QRandomGenerator::global()->generate() & 0x7fffffff;
    qInfo("seed %u, %d rounds", seed, rounds);
    m_random.seed(seed);
    build();
    const MenuMirror outside = MenuMirror::ofDisk(path(QStringLiteral("outside")));
    m_view = std::make_unique<VelMenuView>(menu(), -1, true);
    m_view->resize(400, 600);
    m_view->show();
    for (int i = 0; i <= rounds && !QTest::currentTestFailed(); ++i) {
        if (i > 0)
            step();
        const QByteArray where = QByteArray::number(i) + ": " + m_step.toUtf8() + '\n';
        const QString onDisk = MenuMirror::difference(m_mirror, MenuMirror::ofDisk(menu()));
        QVERIFY2(onDisk.isEmpty(), (where + onDisk.toUtf8()).constData());
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
        m_mirror.keepFolderNames();
    }
    QCOMPARE(MenuMirror::difference(outside, MenuMirror::ofDisk(path(QStringLiteral("outside")))), QString());
    QGuiApplication::clipboard()->clear();
    m_view.reset();
}

VEL_TEST_MAIN(tst_MenuRandomOperations)
#include "tst_MenuRandomOperations.moc"
