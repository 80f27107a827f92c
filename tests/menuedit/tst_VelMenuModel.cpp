// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModalDriver.h"
#include "OnlyBelow.h"
#include "TestCase.h"

#include <menuedit/MenuClipboard.h>
#include <menuedit/VelMenuModel.h>

#include <QAbstractItemModelTester>
#include <QDir>
#include <QFileIconProvider>
#include <QMimeData>
#include <QSaveFile>
#include <QSet>
#include <QSignalSpy>

#include <memory>

class tst_VelMenuModel : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void hasOneColumnAndNamesThatAreNotEdited();
    void leavesRenamingToTheFileSystemModel();
    void hidesDotFiles();
    void showsNames_data();
    void showsNames();
    void marksHiddenEntries_data();
    void marksHiddenEntries();
    void keepsANameUntilItIsForgotten();
    void remembersNothingOfAFileThatIsGone();
    void readsAnEmptyNameAtEveryRequest();
    void showsANameThatWasSet();
    void announcesTheRowOfAForgottenName();
    void announcesTheFolderOfAForgottenDirectoryFile();
    void announcesAChangeOnDisk();
    void readsAnIconAnewOnlyForAChangedEntry();
    void livesWithOddFiles();
    void survivesAFolderThatVanishes();

    void refusesADrop_data();
    void refusesADrop();
    void touchesNothingInTheFilesOwnFolder();
    void knowsTheOwnFolderByAnotherPath();
    void copiesADroppedFile();
    void movesADroppedFile();
    void takesAllFilesOfADrop();
    void copiesADroppedFolderWithEverythingInIt();
    void takesBytesOfOtherEditors();
    void linksADroppedFile();
    void asksBeforeAnExistingTarget_data();
    void asksBeforeAnExistingTarget();
    void asksOnlyForTheFirstFile();
    void goesAwayWhileItAsks();
    void leavesRemovingRowsToNobody();

private:
    std::unique_ptr<VelMenuModel> modelOf(const QString &rootDir, int rows);
    QModelIndex indexOf(const QString &name) const { return m_model->index(path(name)); }
    QString shown(const QString &name) const { return indexOf(name).data().toString(); }
    bool drop(const QStringList &files, Qt::DropAction action, const QString &target, int row = -1);

    std::unique_ptr<VelMenuModel> m_model;
};

namespace {

QByteArray entry(const QByteArray &keys)
{
    return "[Desktop Entry]\nType=Application\nExec=true\n" + keys;
}

ModalDriver::Box overwriteBox(const QString &target)
{
    return {QMessageBox::Question, QStringLiteral("Attention"),
            QStringLiteral("%1 already exists. Overwrite?").arg(target), QMessageBox::Yes};
}

std::unique_ptr<QMimeData> urlsOf(const QStringList &files)
{
    QList<QUrl> urls;
    for (const QString &file : files)
        urls.append(QUrl::fromLocalFile(file));
    auto data = std::make_unique<QMimeData>();
    data->setUrls(urls);
    return data;
}

} // namespace

void tst_VelMenuModel::init()
{
    TestCase::init();
}

void tst_VelMenuModel::cleanup()
{
    m_model.reset();
    TestCase::cleanup();
}

std::unique_ptr<VelMenuModel> tst_VelMenuModel::modelOf(const QString &rootDir, int rows)
{
    auto model = std::make_unique<VelMenuModel>(rootDir, nullptr, nullptr);
    model->setReadOnly(false);
    const QModelIndex root = model->index(rootDir);
    if (!QTest::qWaitFor([&] { return model->rowCount(root) == rows; }))
        qWarning("%d rows instead of %d", model->rowCount(root), rows);
    return model;
}

bool tst_VelMenuModel::drop(const QStringList &files, Qt::DropAction action, const QString &target, int row)
{
    return m_model->dropMimeData(urlsOf(files).get(), action, row, row == -1 ? -1 : 0, indexOf(target));
}

void tst_VelMenuModel::hasOneColumnAndNamesThatAreNotEdited()
{
    write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    m_model = modelOf(folder(), 1);

    QCOMPARE(m_model->columnCount(), 1);
    QCOMPARE(m_model->columnCount(m_model->index(folder())), 1);
    QCOMPARE(m_model->columnCount(indexOf(QStringLiteral("a.desktop"))), 1);
    QVERIFY(indexOf(QStringLiteral("a.desktop")).flags() & Qt::ItemIsEnabled);
    QVERIFY(!(indexOf(QStringLiteral("a.desktop")).flags() & Qt::ItemIsEditable));
}

void tst_VelMenuModel::leavesRenamingToTheFileSystemModel()
{
    write(QStringLiteral("a"), "a");
    m_model = modelOf(folder(), 1);

    // Which renames only what can be edited.
    QVERIFY(!m_model->setData(indexOf(QStringLiteral("a")), QStringLiteral("b")));
    QVERIFY(!m_model->setData(indexOf(QStringLiteral("a")), QStringLiteral("b"), Qt::DisplayRole));

    QCOMPARE(read(path(QStringLiteral("a"))), QByteArray("a"));
}

void tst_VelMenuModel::hidesDotFiles()
{
    write(QStringLiteral(".directory"), "[Desktop Entry]\nType=Directory\n");
    write(QStringLiteral(".hidden.desktop"), entry("Name=A\n"));
    write(QStringLiteral("a"), "a");
    m_model = modelOf(folder(), 1);

    QCOMPARE(m_model->index(0, 0, m_model->index(folder())).data().toString(), QStringLiteral("a"));
}

void tst_VelMenuModel::showsNames_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("row");
    QTest::addColumn<QString>("expected");
    const auto row = [](const char *title, const char *file, const QByteArray &bytes, const char *shown,
                        const char *expected) {
        QTest::newRow(title) << QString::fromUtf8(file) << bytes << QString::fromUtf8(shown)
                             << QString::fromUtf8(expected);
    };
    row("translated", "a.desktop", entry("Name=A\nName[en]=Local\nGenericName[en]=Kind\n"), "a.desktop",
        "Local");
    row("untranslated with its kind", "a.desktop", entry("Name=A\nGenericName[en]=Kind\n"), "a.desktop",
        "A Kind");
    row("without a name", "a.desktop", entry(""), "a.desktop", "");
    row("other file", "a.txt", "x", "a.txt", "a.txt");
    row("suffix in capitals", "a.DESKTOP", entry("Name=A\n"), "a.DESKTOP", "a.DESKTOP");
    row("folder", "d/x", "x", "d", "d");
    row("folder with names", "d/.directory",
        "[Desktop Entry]\nType=Directory\nName=D\nGenericName[en]=Kind\n", "d", "D Kind");
    row("folder without a name", "d/.directory", "[Desktop Entry]\nType=Directory\n", "d", "");
    row("folder called like an entry", "d.desktop/.directory", "[Desktop Entry]\nType=Directory\nName=D\n",
        "d.desktop", "D");
    row("empty folder called like an entry", "d.desktop/x", "x", "d.desktop", "");
    row("directory file that is a folder", "d/.directory/x", "x", "d", "");
    row("garbage", "a.desktop", QByteArray(1 << 20, '\x7f'), "a.desktop", "");
}

void tst_VelMenuModel::showsNames()
{
    QFETCH(QString, file);
    QFETCH(QByteArray, bytes);
    QFETCH(QString, row);
    QFETCH(QString, expected);
    write(file, bytes);
    m_model = modelOf(folder(), 1);

    QCOMPARE(shown(row), expected);
    QCOMPARE(indexOf(row).data(QFileSystemModel::FileNameRole).toString(), row);
    QCOMPARE(indexOf(row).data(QFileSystemModel::FilePathRole).toString(), path(row));
}

void tst_VelMenuModel::marksHiddenEntries_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("row");
    QTest::addColumn<bool>("hidden");
    const QString a = QStringLiteral("a.desktop");
    QTest::newRow("shown") << a << entry("Name=A\n") << a << false;
    QTest::newRow("hidden") << a << entry("Name=A\nHidden=true\n") << a << true;
    QTest::newRow("not displayed") << a << entry("Name=A\nNoDisplay=true\n") << a << false;
    QTest::newRow("another desktop's") << a << entry("Name=A\nOnlyShowIn=OTHER;\n") << a << true;
    QTest::newRow("not for this desktop") << a << entry("Name=A\nNotShowIn=VEL;\n") << a << true;
    QTest::newRow("program missing") << a << entry("Name=A\nTryExec=/missing/program\n") << a << false;
    QTest::newRow("hidden without a name") << a << entry("Hidden=true\n") << a << true;
    QTest::newRow("folder") << QStringLiteral("d/.directory")
                            << QByteArray("[Desktop Entry]\nType=Directory\nName=D\nHidden=true\n")
                            << QStringLiteral("d") << false;
    QTest::newRow("other file") << QStringLiteral("a.txt") << entry("Hidden=true\n")
                                << QStringLiteral("a.txt") << false;
}

void tst_VelMenuModel::marksHiddenEntries()
{
    QFETCH(QString, file);
    QFETCH(QByteArray, bytes);
    QFETCH(QString, row);
    QFETCH(bool, hidden);
    qputenv("XDG_CURRENT_DESKTOP", "VEL");
    write(file, bytes);
    m_model = modelOf(folder(), 1);

    QCOMPARE(indexOf(row).data(Qt::UserRole), QVariant(hidden));
    QVERIFY(indexOf(row).data().isValid());
    QCOMPARE(indexOf(row).data(Qt::UserRole), QVariant(hidden));
}

void tst_VelMenuModel::keepsANameUntilItIsForgotten()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=Old\nHidden=true\n"));
    m_model = modelOf(folder(), 1);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("Old"));

    write(QStringLiteral("a.desktop"), entry("Name=New\n"));
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("Old"));
    QCOMPARE(indexOf(QStringLiteral("a.desktop")).data(Qt::UserRole), QVariant(true));

    m_model->forgetItemInfo(file);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("New"));
    QCOMPARE(indexOf(QStringLiteral("a.desktop")).data(Qt::UserRole), QVariant(false));
}

// Rows outlive their files until the watcher has seen it.
void tst_VelMenuModel::remembersNothingOfAFileThatIsGone()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    m_model = modelOf(folder(), 1);
    const QPersistentModelIndex index = indexOf(QStringLiteral("a.desktop"));
    QCOMPARE(index.data().toString(), QStringLiteral("A"));

    QVERIFY(QFile::remove(file));
    m_model->forgetItemInfo(file);
    QCOMPARE(index.data().toString(), QString());
    QCOMPARE(index.data(Qt::UserRole).toBool(), false);

    write(QStringLiteral("a.desktop"), entry("Name=B\nHidden=true\n"));
    QCOMPARE(index.data(Qt::UserRole).toBool(), true);
    QCOMPARE(index.data().toString(), QStringLiteral("B"));
}

void tst_VelMenuModel::readsAnEmptyNameAtEveryRequest()
{
    write(QStringLiteral("a.desktop"), entry(""));
    m_model = modelOf(folder(), 1);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QString());

    write(QStringLiteral("a.desktop"), entry("Name=A\n"));

    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("A"));
}

void tst_VelMenuModel::showsANameThatWasSet()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    m_model = modelOf(folder(), 1);

    m_model->setItemName(file, QStringLiteral("Chosen"));
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("Chosen"));

    m_model->forgetItemInfo(file);
    QCOMPARE(shown(QStringLiteral("a.desktop")), QStringLiteral("A"));
}

void tst_VelMenuModel::announcesTheRowOfAForgottenName()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    write(QStringLiteral("b.desktop"), entry("Name=B\n"));
    m_model = modelOf(folder(), 2);
    QSignalSpy changed(m_model.get(), &QAbstractItemModel::dataChanged);

    m_model->forgetItemInfo(file);

    QCOMPARE(changed.size(), 1);
    QCOMPARE(changed.first().at(0).toModelIndex(), indexOf(QStringLiteral("a.desktop")));
    QCOMPARE(changed.first().at(1).toModelIndex(), indexOf(QStringLiteral("a.desktop")));
}

void tst_VelMenuModel::announcesTheFolderOfAForgottenDirectoryFile()
{
    const QString file = write(QStringLiteral("d/.directory"), "[Desktop Entry]\nType=Directory\nName=D\n");
    write(QStringLiteral("d/x"), "x");
    m_model = modelOf(folder(), 1);
    QCOMPARE(shown(QStringLiteral("d")), QStringLiteral("D"));
    m_model->fetchMore(indexOf(QStringLiteral("d")));
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("d"))), 1);
    QSignalSpy changed(m_model.get(), &QAbstractItemModel::dataChanged);

    write(QStringLiteral("d/.directory"), "[Desktop Entry]\nType=Directory\nName=New\n");
    m_model->forgetItemInfo(file);

    QCOMPARE(changed.size(), 1);
    QCOMPARE(changed.first().at(0).toModelIndex(), indexOf(QStringLiteral("d")));
    QCOMPARE(shown(QStringLiteral("d")), QStringLiteral("D"));
    QCOMPARE(m_model->rowCount(indexOf(QStringLiteral("d"))), 1);

    m_model->forgetItemInfo(path(QStringLiteral("d")));
    QCOMPARE(shown(QStringLiteral("d")), QStringLiteral("New"));
}

void tst_VelMenuModel::announcesAChangeOnDisk()
{
    for (const char *name : {"a1.desktop", "a2.desktop", "a10.desktop", "b.desktop"})
        write(QString::fromUtf8(name), entry("Name=A\n"));
    m_model = modelOf(folder(), 4);
    OnlyBelow below(m_model.get(), folder());
    const QAbstractItemModelTester tester(&below, QAbstractItemModelTester::FailureReportingMode::Fatal);
    // By name and at once: while files are replaced, rows come and go.
    QSet<QString> announced;
    const QObject context;
    connect(m_model.get(), &QAbstractItemModel::dataChanged, &context,
            [&announced](const QModelIndex &first, const QModelIndex &last) {
                for (int row = first.row(); row <= last.row(); ++row)
                    announced.insert(first.sibling(row, 0).data(QFileSystemModel::FileNameRole).toString());
            });

    for (const char *name : {"a1.desktop", "a2.desktop", "a10.desktop"}) {
        QSaveFile file(path(QString::fromUtf8(name)));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(entry("Name=Another\n"));
        QVERIFY(file.commit());
    }

    for (const char *name : {"a1.desktop", "a2.desktop", "a10.desktop"})
        QTRY_VERIFY_WITH_TIMEOUT(announced.contains(QString::fromUtf8(name)), 20000);
}

void tst_VelMenuModel::readsAnIconAnewOnlyForAChangedEntry()
{
    const QString file = write(QStringLiteral("a.desktop"), entry("Name=A\nIcon=folder\n"));
    m_model = modelOf(folder(), 1);
    const auto icon = [&] { return m_model->iconProvider()->icon(QFileInfo(file)); };
    // Younger than the clock can tell, the file might have changed.
    QTRY_COMPARE(icon().cacheKey(), icon().cacheKey());
    const QIcon before = icon();

    write(QStringLiteral("a.desktop"), entry("Name=A\nIcon=go-up\n"));

    QVERIFY(icon().cacheKey() != before.cacheKey());
    QVERIFY(QFile::remove(file));
    QVERIFY(icon().cacheKey() != before.cacheKey());
}

void tst_VelMenuModel::livesWithOddFiles()
{
    write(QStringLiteral("garbage.desktop"), QByteArray(1 << 20, '\0'));
    write(QStringLiteral("large.desktop"), QByteArray((1 << 20) + 1, '='));
    write(QStringLiteral("d.desktop/x"), "x");
    write(QStringLiteral("e/.directory/x"), "x");
    write(QStringLiteral("two\nlines.desktop"), entry("Name=Two\n"));
    write(QStringLiteral("latin.desktop"), entry("Name=\xe4\n"));
    QVERIFY(QFile::link(path(QStringLiteral("missing")), path(QStringLiteral("dangling.desktop"))));
    QVERIFY(QFile::link(folder(), path(QStringLiteral("loop"))));
    m_model = modelOf(folder(), 7);
    OnlyBelow below(m_model.get(), folder());
    const QAbstractItemModelTester tester(&below, QAbstractItemModelTester::FailureReportingMode::Fatal);

    const QModelIndex root = m_model->index(folder());
    for (int row = 0; row < m_model->rowCount(root); ++row) {
        const QModelIndex index = m_model->index(row, 0, root);
        QVERIFY(index.data().isValid());
        QVERIFY(index.data(Qt::UserRole).isValid());
        m_model->fetchMore(index);
    }
    QCOMPARE(shown(QStringLiteral("two\nlines.desktop")), QStringLiteral("Two"));
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("loop"))), 7);
}

void tst_VelMenuModel::survivesAFolderThatVanishes()
{
    write(QStringLiteral("d/a.desktop"), entry("Name=A\n"));
    write(QStringLiteral("e/b.desktop"), entry("Name=B\n"));
    m_model = modelOf(folder(), 2);
    OnlyBelow below(m_model.get(), folder());
    const QAbstractItemModelTester tester(&below, QAbstractItemModelTester::FailureReportingMode::Fatal);
    m_model->fetchMore(indexOf(QStringLiteral("d")));
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("d"))), 1);

    QVERIFY(QDir(path(QStringLiteral("d"))).removeRecursively());
    m_model->forgetItemInfo(path(QStringLiteral("d/a.desktop")));
    m_model->forgetItemInfo(path(QStringLiteral("d/.directory")));

    QTRY_COMPARE(m_model->rowCount(m_model->index(folder())), 1);
    QCOMPARE(shown(QStringLiteral("e/b.desktop")), QStringLiteral("B"));
}

void tst_VelMenuModel::refusesADrop_data()
{
    QTest::addColumn<QStringList>("files");
    QTest::addColumn<QString>("target");
    QTest::addColumn<int>("action");
    const QString a = QStringLiteral("from/a");
    const QString to = QStringLiteral("to");
    const auto row = [](const char *title, const QStringList &files, const QString &target,
                        Qt::DropAction action) { QTest::newRow(title) << files << target << int(action); };
    row("nothing to do", {a}, to, Qt::IgnoreAction);
    row("source gone", {QStringLiteral("from/missing")}, to, Qt::MoveAction);
    row("second source gone", {a, QStringLiteral("from/missing")}, to, Qt::MoveAction);
    row("folder into itself", {QStringLiteral("from")}, QStringLiteral("from"), Qt::MoveAction);
    row("folder below itself", {QStringLiteral("from")}, QStringLiteral("from/sub"), Qt::CopyAction);
    row("onto a file", {a}, QStringLiteral("to/b"), Qt::CopyAction);
}

void tst_VelMenuModel::refusesADrop()
{
    QFETCH(QStringList, files);
    QFETCH(QString, target);
    QFETCH(int, action);
    write(QStringLiteral("from/a"), "a");
    write(QStringLiteral("from/sub/s"), "s");
    write(QStringLiteral("to/b"), "b");
    m_model = modelOf(folder(), 2);
    QSignalSpy changed(m_model.get(), &VelMenuModel::changed);
    for (QString &file : files)
        file = path(file);

    QVERIFY(!drop(files, Qt::DropAction(action), target));
    QVERIFY(!m_model->dropMimeData(nullptr, Qt::CopyAction, -1, -1, indexOf(target)));
    QVERIFY(
        !m_model->dropMimeData(std::make_unique<QMimeData>().get(), Qt::CopyAction, -1, -1, indexOf(target)));
    QVERIFY(!m_model->dropMimeData(urlsOf(files).get(), Qt::CopyAction, -1, -1, QModelIndex()));
    QVERIFY(!drop({}, Qt::CopyAction, target));
    QMimeData remote;
    remote.setUrls({QUrl(QStringLiteral("http://example.org/x"))});
    QVERIFY(!m_model->dropMimeData(&remote, Qt::CopyAction, -1, -1, indexOf(target)));
    m_model->setReadOnly(true);
    QVERIFY(!drop({path(QStringLiteral("from/a"))}, Qt::MoveAction, QStringLiteral("to")));

    QCOMPARE(changed.size(), 0);
    QCOMPARE(read(path(QStringLiteral("from/a"))), QByteArray("a"));
    QCOMPARE(read(path(QStringLiteral("from/sub/s"))), QByteArray("s"));
    QCOMPARE(
        QDir(path(QStringLiteral("to"))).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
        QStringList{QStringLiteral("b")});
}

void tst_VelMenuModel::touchesNothingInTheFilesOwnFolder()
{
    const QString file = write(QStringLiteral("to/a"), "a");
    m_model = modelOf(folder(), 1);
    QSignalSpy changed(m_model.get(), &VelMenuModel::changed);

    QVERIFY(drop({file}, Qt::CopyAction, QStringLiteral("to")));
    QVERIFY(drop({file}, Qt::MoveAction, QStringLiteral("to")));

    QCOMPARE(changed.size(), 2);
    QCOMPARE(read(file), QByteArray("a"));
    QCOMPARE(
        QDir(path(QStringLiteral("to"))).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
        QStringList{QStringLiteral("a")});
}

void tst_VelMenuModel::knowsTheOwnFolderByAnotherPath()
{
    write(QStringLiteral("to/a"), "a");
    QVERIFY(QFile::link(path(QStringLiteral("to")), path(QStringLiteral("alias"))));
    m_model = modelOf(folder(), 2);

    QVERIFY(drop({path(QStringLiteral("alias/a"))}, Qt::CopyAction, QStringLiteral("to")));

    QCOMPARE(read(path(QStringLiteral("to/a"))), QByteArray("a"));
}

void tst_VelMenuModel::copiesADroppedFile()
{
    const QString file = write(QStringLiteral("from/a.desktop"), entry("Name=A\n"));
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);
    QSignalSpy changed(m_model.get(), &VelMenuModel::changed);

    QVERIFY(drop({file}, Qt::CopyAction, QStringLiteral("to")));

    QCOMPARE(changed.size(), 1);
    QCOMPARE(read(path(QStringLiteral("to/a.desktop"))), read(file));
    QCOMPARE(shown(QStringLiteral("to/a.desktop")), QStringLiteral("A"));
}

void tst_VelMenuModel::movesADroppedFile()
{
    const QString file = write(QStringLiteral("from/a.desktop"), entry("Name=Old\nHidden=true\n"));
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);
    QCOMPARE(shown(QStringLiteral("from/a.desktop")), QStringLiteral("Old"));
    QSignalSpy changed(m_model.get(), &VelMenuModel::changed);

    QVERIFY(drop({file}, Qt::MoveAction, QStringLiteral("to")));

    QCOMPARE(changed.size(), 1);
    QVERIFY(!QFile::exists(file));
    QCOMPARE(read(path(QStringLiteral("to/a.desktop"))), entry("Name=Old\nHidden=true\n"));
    // The name of what was there is forgotten.
    write(QStringLiteral("from/a.desktop"), entry("Name=New\n"));
    QCOMPARE(shown(QStringLiteral("from/a.desktop")), QStringLiteral("New"));
    QCOMPARE(indexOf(QStringLiteral("from/a.desktop")).data(Qt::UserRole), QVariant(false));
}

void tst_VelMenuModel::takesAllFilesOfADrop()
{
    const QStringList names{QStringLiteral("a.desktop"), QStringLiteral("b.desktop"),
                            QStringLiteral("c.desktop")};
    QStringList files;
    for (const QString &name : names)
        files.append(write(QLatin1String("from/") + name, entry("Name=Old\n")));
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);
    for (const QString &name : names)
        QCOMPARE(shown(QLatin1String("from/") + name), QStringLiteral("Old"));

    QVERIFY(drop(files, Qt::MoveAction, QStringLiteral("to")));

    // At once, before the folder is read.
    QCOMPARE(m_model->rowCount(indexOf(QStringLiteral("to"))), 3);
    QCOMPARE(QDir(path(QStringLiteral("to"))).entryList(QDir::Files), names);
    QVERIFY(QDir(path(QStringLiteral("from"))).isEmpty());
    for (const QString &name : names) {
        write(QLatin1String("from/") + name, entry("Name=New\n"));
        QCOMPARE(shown(QLatin1String("from/") + name), QStringLiteral("New"));
    }
}

void tst_VelMenuModel::copiesADroppedFolderWithEverythingInIt()
{
    write(QStringLiteral("from/.directory"), "[Desktop Entry]\nName=From\n");
    write(QStringLiteral("from/sub/a"), "a");
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);

    QVERIFY(drop({path(QStringLiteral("from"))}, Qt::CopyAction, QStringLiteral("to")));

    QCOMPARE(read(path(QStringLiteral("to/from/sub/a"))), QByteArray("a"));
    QCOMPARE(read(path(QStringLiteral("to/from/.directory"))), QByteArray("[Desktop Entry]\nName=From\n"));
    QCOMPARE(read(path(QStringLiteral("from/sub/a"))), QByteArray("a"));
    QCOMPARE(shown(QStringLiteral("to/from")), QStringLiteral("From"));
}

void tst_VelMenuModel::takesBytesOfOtherEditors()
{
    const QString file = write(QStringLiteral("From Here/50% #1?.desktop"), entry("Name=A\n"));
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);
    const MenuClipboard::ItemData data(file, Qt::MoveAction);

    QVERIFY(m_model->dropMimeData(&data, Qt::MoveAction, -1, -1, indexOf(QStringLiteral("to"))));

    QCOMPARE(shown(QStringLiteral("to/50% #1?.desktop")), QStringLiteral("A"));
    QVERIFY(!QFile::exists(file));
}

void tst_VelMenuModel::linksADroppedFile()
{
    const QString file = write(QStringLiteral("from/a"), "a");
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);

    QVERIFY(drop({file}, Qt::LinkAction, QStringLiteral("to")));

    QCOMPARE(QFile::symLinkTarget(path(QStringLiteral("to/a"))), file);
}

void tst_VelMenuModel::asksBeforeAnExistingTarget_data()
{
    QTest::addColumn<int>("answer");
    QTest::newRow("yes") << int(QMessageBox::Yes);
    QTest::newRow("no") << int(QMessageBox::No);
    QTest::newRow("rejected") << 0;
}

void tst_VelMenuModel::asksBeforeAnExistingTarget()
{
    QFETCH(int, answer);
    const QString file = write(QStringLiteral("from/a"), "new");
    const QString target = write(QStringLiteral("to/a"), "old");
    m_model = modelOf(folder(), 2);
    QSignalSpy changed(m_model.get(), &VelMenuModel::changed);
    ModalDriver modal;
    modal.answerWith(overwriteBox(target), [answer](QMessageBox *box) { box->done(answer); });

    QVERIFY(!drop({file}, Qt::MoveAction, QStringLiteral("to")));

    QVERIFY(modal.finished());
    QCOMPARE(changed.size(), 0);
    QCOMPARE(read(file), QByteArray("new"));
    QCOMPARE(read(target), QByteArray("old"));
}

void tst_VelMenuModel::asksOnlyForTheFirstFile()
{
    const QString first = write(QStringLiteral("from/a"), "new");
    const QString second = write(QStringLiteral("from/b"), "new");
    const QString target = write(QStringLiteral("to/b"), "old");
    m_model = modelOf(folder(), 2);
    ModalDriver modal;

    QVERIFY(!drop({first, second}, Qt::CopyAction, QStringLiteral("to")));

    QVERIFY(modal.finished());
    QCOMPARE(read(target), QByteArray("old"));
    QVERIFY(!QFile::exists(path(QStringLiteral("to/a"))));
}

void tst_VelMenuModel::goesAwayWhileItAsks()
{
    const QString file = write(QStringLiteral("from/a"), "new");
    const QString target = write(QStringLiteral("to/a"), "old");
    m_model = modelOf(folder(), 2);
    ModalDriver modal;
    modal.answerWith(overwriteBox(target), [this](QMessageBox *box) {
        m_model.reset();
        box->done(QMessageBox::Yes);
    });

    VelMenuModel *model = m_model.get();
    QVERIFY(
        !model->dropMimeData(urlsOf({file}).get(), Qt::MoveAction, -1, -1, indexOf(QStringLiteral("to"))));

    QVERIFY(modal.finished());
    QCOMPARE(read(file), QByteArray("new"));
    QCOMPARE(read(target), QByteArray("old"));
}

// After a drag its source removes the rows that were moved: the files are moved already.
void tst_VelMenuModel::leavesRemovingRowsToNobody()
{
    const QString file = write(QStringLiteral("a"), "a");
    m_model = modelOf(folder(), 1);

    QVERIFY(!m_model->removeRow(0, m_model->index(folder())));

    QCOMPARE(read(file), QByteArray("a"));
}

VEL_TEST_MAIN(tst_VelMenuModel)

#include "tst_VelMenuModel.moc"
