// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/FolderWatch.h>
#include <menuedit/VelMenuModel.h>

#include <QDir>
#include <QMimeData>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTreeView>
#include <QUrl>

#include <cstdio>
#include <memory>

#include <sys/stat.h>

/// Folders whose rows are there, and what happens to them behind the model's back.
class tst_FolderWatch : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void followsAFolderThatIsRenamed_data();
    void followsAFolderThatIsRenamed();
    void followsAnotherFolderAtTheOldPlace();
    void followsTheRootWhenItsOnlyFolderGoes();
    void keepsSelectionAndExpansionMeanwhile();
    void looksAnewOnceForAllThatGo();
    void seesWhatComesInThePlaceOfAMovedFolder();
    void followsAFolderThatCannotBeMoved();
    void staysAtARootThatIsGone();
    void hearsOfAFolderThatWaitedToBeRead();

private:
    bool load(const QString &folder, const QString &names);
    QString shown(const QString &folder) const;
    bool shows(const QString &folder, const QString &names);

    std::unique_ptr<VelMenuModel> m_model;
};

void tst_FolderWatch::init()
{
    TestCase::init();
    for (const char *name : {"menu/d/a", "menu/d/sub/b", "menu/other/c"})
        write(QLatin1String(name), "x");
    m_model = std::make_unique<VelMenuModel>(path(QStringLiteral("menu")), nullptr, nullptr);
    m_model->setReadOnly(false);
    QVERIFY(load(QStringLiteral("menu"), QStringLiteral("d other")));
    QVERIFY(load(QStringLiteral("menu/d"), QStringLiteral("a sub")));
    QVERIFY(load(QStringLiteral("menu/d/sub"), QStringLiteral("b")));
    QVERIFY(load(QStringLiteral("menu/other"), QStringLiteral("c")));
}

void tst_FolderWatch::cleanup()
{
    m_model.reset();
    TestCase::cleanup();
}

QString tst_FolderWatch::shown(const QString &folder) const
{
    const QModelIndex parent = m_model->index(path(folder));
    QStringList names;
    for (int row = 0; row < m_model->rowCount(parent); ++row)
        names.append(m_model->index(row, 0, parent).data(QFileSystemModel::FileNameRole).toString());
    names.sort();
    return names.join(QLatin1Char(' '));
}

bool tst_FolderWatch::shows(const QString &folder, const QString &names)
{
    return QTest::qWaitFor([&] { return shown(folder) == names; });
}

bool tst_FolderWatch::load(const QString &folder, const QString &names)
{
    const QModelIndex index = m_model->index(path(folder));
    if (m_model->canFetchMore(index))
        m_model->fetchMore(index);
    return shows(folder, names);
}

void tst_FolderWatch::followsAFolderThatIsRenamed_data()
{
    QTest::addColumn<QString>("target");
    QTest::newRow("beside") << "menu/e";
    QTest::newRow("into another") << "menu/other/e";
}

void tst_FolderWatch::followsAFolderThatIsRenamed()
{
    QFETCH(QString, target);
    QVERIFY(QDir().rename(path(QStringLiteral("menu/d")), path(target)));
    QVERIFY(shows(QStringLiteral("menu"),
                  target == QLatin1String("menu/e") ? QStringLiteral("e other") : QStringLiteral("other")));
    QVERIFY(load(target, QStringLiteral("a sub")));
    QVERIFY(load(target + QStringLiteral("/sub"), QStringLiteral("b")));

    write(target + QStringLiteral("/new"), "x");
    QVERIFY(shows(target, QStringLiteral("a new sub")));
    write(target + QStringLiteral("/sub/new"), "x");
    QVERIFY(shows(target + QStringLiteral("/sub"), QStringLiteral("b new")));
    QVERIFY(QFile::remove(path(target + QStringLiteral("/a"))));
    QVERIFY(shows(target, QStringLiteral("new sub")));
    write(QStringLiteral("menu/other/new"), "x");
    QTRY_VERIFY(shown(QStringLiteral("menu/other")).contains(QLatin1String("new")));
}

void tst_FolderWatch::followsAnotherFolderAtTheOldPlace()
{
    QVERIFY(QDir().rename(path(QStringLiteral("menu/d")), path(QStringLiteral("menu/e"))));
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("e other")));
    QVERIFY(load(QStringLiteral("menu/e"), QStringLiteral("a sub")));
    write(QStringLiteral("menu/d/x"), "x");
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("d e other")));
    QVERIFY(load(QStringLiteral("menu/d"), QStringLiteral("x")));

    write(QStringLiteral("menu/d/y"), "x");
    write(QStringLiteral("menu/e/z"), "x");

    QVERIFY(shows(QStringLiteral("menu/d"), QStringLiteral("x y")));
    QVERIFY(shows(QStringLiteral("menu/e"), QStringLiteral("a sub z")));
}

void tst_FolderWatch::followsTheRootWhenItsOnlyFolderGoes()
{
    m_model = std::make_unique<VelMenuModel>(path(QStringLiteral("menu")), nullptr, nullptr);
    QVERIFY(load(QStringLiteral("menu"), QStringLiteral("d other")));
    QVERIFY(load(QStringLiteral("menu/d"), QStringLiteral("a sub")));
    QVERIFY(QDir().rename(path(QStringLiteral("menu/d")), path(QStringLiteral("e"))));
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("other")));
    QSignalSpy loads(m_model.get(), &QFileSystemModel::directoryLoaded);
    QTRY_VERIFY(!loads.isEmpty());
    QCOMPARE(m_model->rootPath(), path(QStringLiteral("menu")));

    write(QStringLiteral("menu/new"), "x");

    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("new other")));
}

void tst_FolderWatch::keepsSelectionAndExpansionMeanwhile()
{
    QTreeView view;
    view.setModel(m_model.get());
    view.setRootIndex(m_model->index(path(QStringLiteral("menu"))));
    const QString other = path(QStringLiteral("menu/other"));
    view.expand(m_model->index(other));
    view.setCurrentIndex(m_model->index(other + QStringLiteral("/c")));
    QSignalSpy loads(m_model.get(), &QFileSystemModel::directoryLoaded);

    QVERIFY(QDir().rename(path(QStringLiteral("menu/d")), path(QStringLiteral("e"))));

    QTRY_VERIFY(loads.contains(QVariantList{other}));
    QVERIFY(view.isExpanded(m_model->index(other)));
    QCOMPARE(view.currentIndex(), m_model->index(other + QStringLiteral("/c")));
    QCOMPARE(view.selectionModel()->selectedIndexes(), QModelIndexList{view.currentIndex()});
}

void tst_FolderWatch::looksAnewOnceForAllThatGo()
{
    QSignalSpy roots(m_model.get(), &QFileSystemModel::rootPathChanged);
    for (const char *name : {"d", "other"})
        QVERIFY(QDir().rename(path(QLatin1String("menu/") + QLatin1String(name)), path(QLatin1String(name))));
    QVERIFY(shows(QStringLiteral("menu"), QString()));
    // Away from the root and back, and once more for what may have waited to be read.
    QTRY_COMPARE(roots.count(), 4);
    QVERIFY(!roots.wait(500));
}

void tst_FolderWatch::seesWhatComesInThePlaceOfAMovedFolder()
{
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(path(QStringLiteral("menu/d")))});
    const QModelIndex other = m_model->index(path(QStringLiteral("menu/other")));
    QVERIFY(m_model->dropMimeData(&data, Qt::MoveAction, -1, -1, other));
    // Its row has not gone yet.
    write(QStringLiteral("menu/d/x"), "x");

    QVERIFY(load(QStringLiteral("menu/d"), QStringLiteral("x")));

    write(QStringLiteral("menu/d/y"), "x");
    QVERIFY(shows(QStringLiteral("menu/d"), QStringLiteral("x y")));
    QVERIFY(load(QStringLiteral("menu/other/d"), QStringLiteral("a sub")));
    write(QStringLiteral("menu/other/d/z"), "x");
    QVERIFY(shows(QStringLiteral("menu/other/d"), QStringLiteral("a sub z")));
}

void tst_FolderWatch::followsAFolderThatCannotBeMoved()
{
    const QTemporaryDir elsewhere(QStringLiteral("/dev/shm/tst_FolderWatch"));
    const QString file = write(QStringLiteral("file"), "x");
    if (!elsewhere.isValid()
        || ::rename(QFile::encodeName(file).constData(),
                    QFile::encodeName(elsewhere.filePath(QStringLiteral("file"))).constData())
            == 0)
        QSKIP("needs another file system in /dev/shm");
    // Such a thing cannot be copied, and so not be moved there.
    QCOMPARE(mkfifo(QFile::encodeName(path(QStringLiteral("menu/d/pipe"))).constData(), 0600), 0);
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(path(QStringLiteral("menu/d")))});
    const QModelIndex target = m_model->index(elsewhere.path());
    QVERIFY(!m_model->dropMimeData(&data, Qt::MoveAction, -1, -1, target));

    write(QStringLiteral("menu/d/new"), "x");
    write(QStringLiteral("menu/d/sub/new"), "x");

    QVERIFY(shows(QStringLiteral("menu/d"), QStringLiteral("a new sub")));
    QVERIFY(shows(QStringLiteral("menu/d/sub"), QStringLiteral("b new")));
}

void tst_FolderWatch::staysAtARootThatIsGone()
{
    QSignalSpy roots(m_model.get(), &QFileSystemModel::rootPathChanged);
    connect(m_model.get(), &QAbstractItemModel::rowsRemoved, this,
            [this] { QVERIFY(QDir(path(QStringLiteral("menu"))).removeRecursively()); });
    QVERIFY(QDir(path(QStringLiteral("menu/d"))).removeRecursively());
    QTRY_VERIFY(!QFile::exists(path(QStringLiteral("menu"))));
    QVERIFY(!roots.wait(500));
    QCOMPARE(m_model->rootPath(), path(QStringLiteral("menu")));
}

// The model does not watch a folder that it is told to read when that one waits for its turn to be read.
void tst_FolderWatch::hearsOfAFolderThatWaitedToBeRead()
{
    for (int i = 0; i < 20000; ++i)
        write(QStringLiteral("large/%1").arg(i), "");
    QVERIFY(QDir(path(QString())).mkdir(QStringLiteral("next")));
    FolderWatch watch(m_model.get());

    // Until the large one was read, the others wait.
    m_model->fetchMore(m_model->index(path(QStringLiteral("large"))));
    m_model->fetchMore(m_model->index(path(QStringLiteral("next"))));
    write(QStringLiteral("menu/other/first"), "x");
    QCoreApplication::processEvents();
    watch.setOn(false);
    watch.setOn(true);
    QVERIFY(shows(QStringLiteral("menu/other"), QStringLiteral("c first")));

    write(QStringLiteral("menu/other/second"), "x");
    QVERIFY(shows(QStringLiteral("menu/other"), QStringLiteral("c first second")));
}

VEL_TEST_MAIN(tst_FolderWatch)

#include "tst_FolderWatch.moc"
