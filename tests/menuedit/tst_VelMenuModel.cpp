// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModelTestCase.h"
#include "OnlyBelow.h"

#include <QAbstractItemModelTester>
#include <QDir>
#include <QFileIconProvider>
#include <QSaveFile>
#include <QSet>

/// The rows of a menu and what becomes of them on disk.
class tst_VelMenuModel : public ModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasOneColumnAndNamesThatAreNotEdited();
    void leavesRenamingToTheFileSystemModel();
    void hidesDotFiles();
    void announcesAChangeOnDisk();
    void readsAnIconAnewOnlyForAChangedEntry();
    void tellsTheFolderOfRowsThatAreHeld();
    void livesWithOddFiles();
    void survivesAFolderThatVanishes();
    void leavesRemovingRowsToNobody();
    void holdsItsRowsUntilTheyChange();
};

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

void tst_VelMenuModel::tellsTheFolderOfRowsThatAreHeld()
{
    for (const char *name : {"menu/a/x", "menu/a/y", "menu/b/x", "menu/b/y"})
        write(QLatin1String(name), "x");
    m_model = modelOf(path(QStringLiteral("menu")), 2);
    const QPersistentModelIndex held = indexOf(QStringLiteral("menu/a"));
    const QPersistentModelIndex other = indexOf(QStringLiteral("menu/b"));
    for (const QModelIndex &folder : {QModelIndex(held), QModelIndex(other)}) {
        m_model->fetchMore(folder);
        QTRY_COMPARE(m_model->rowCount(folder), 2);
    }
    m_model->holdRows(held);
    for (int row = 0; row < 2; ++row) {
        QCOMPARE(m_model->index(row, 0, held).parent(), QModelIndex(held));
        QCOMPARE(m_model->index(row, 0, other).parent(), QModelIndex(other));
    }
    QCOMPARE(other.parent(), indexOf(QStringLiteral("menu")));
    const QPersistentModelIndex row = m_model->index(1, 0, held);

    // The folder gets another row.
    write(QStringLiteral("menu/0/x"), "x");
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("menu"))), 3);
    m_model->sort(0);
    QCOMPARE(QModelIndex(row).parent(), indexOf(QStringLiteral("menu/a")));
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

// After a drag its source removes the rows that were moved: the files are moved already.
void tst_VelMenuModel::leavesRemovingRowsToNobody()
{
    const QString file = write(QStringLiteral("a"), "a");
    m_model = modelOf(folder(), 1);

    QVERIFY(!m_model->removeRow(0, m_model->index(folder())));

    QCOMPARE(read(file), QByteArray("a"));
}

void tst_VelMenuModel::holdsItsRowsUntilTheyChange()
{
    for (const char *name : {"b", "d", "f"})
        write(QLatin1String(name), "x");
    write(QStringLiteral("z/y"), "x");
    m_model = modelOf(folder(), 4);
    const QModelIndex root = m_model->index(folder());
    const auto names = [&] {
        QStringList found;
        for (int row = 0; row < m_model->rowCount(root); ++row)
            found.append(m_model->fileName(m_model->index(row, 0, root)));
        found.sort();
        return found;
    };
    const QStringList before = names();
    m_model->holdRows(root);
    for (int round = 0; round < 2; ++round) {
        QCOMPARE(names(), before);
        QCOMPARE(m_model->index(0, 2, root), m_model->index(0, 0, root));
        QVERIFY(!m_model->index(4, 0, root).isValid());
        QVERIFY(!m_model->index(-1, 0, root).isValid());
        QVERIFY(!m_model->index(0, 7, root).isValid());
        QVERIFY(m_model->index(0, 0).isValid() && m_model->index(0, 0) != m_model->index(0, 0, root));
    }
    write(QStringLiteral("a"), "x");
    QVERIFY(QFile::remove(path(QStringLiteral("d"))));
    QTRY_COMPARE(
        names(),
        (QStringList{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("f"), QStringLiteral("z")}));
}

VEL_TEST_MAIN(tst_VelMenuModel)
#include "tst_VelMenuModel.moc"
