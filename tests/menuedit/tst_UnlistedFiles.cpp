// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OddName.h"
#include "TestCase.h"

#include <menuedit/VelMenuModel.h>

#include <QDir>
#include <QSignalSpy>

#include <memory>

#include <sys/stat.h>

/// Folders that hold names which are no text, too.
class tst_UnlistedFiles : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void showsAllBesideNamesThatAreNoText();
    void leavesOutWhatAnyMenuLeavesOut();
    void followsWhatGoesAndComes();
    void comesToRestWithAFolderOpened();
    void takesATextThatLooksLikeNone();

private:
    bool load(const QString &folder, const QString &names);
    QString shown(const QString &folder) const;
    bool shows(const QString &folder, const QString &names);
    void makeOddNames();

    std::unique_ptr<VelMenuModel> m_model;
};

void tst_UnlistedFiles::init()
{
    TestCase::init();
    for (const char *name : {"menu/a", "menu/b", "menu/c", "menu/sub/x", "menu/sub/y"})
        write(QLatin1String(name), "x");
    makeOddNames();
    m_model = std::make_unique<VelMenuModel>(path(QStringLiteral("menu")), nullptr, nullptr);
}

void tst_UnlistedFiles::cleanup()
{
    m_model.reset();
    TestCase::cleanup();
}

void tst_UnlistedFiles::makeOddNames()
{
    for (int i = 0; i < 8; ++i) {
        writeOddName(path(QStringLiteral("menu")), i);
        writeOddName(path(QStringLiteral("menu/sub")), i);
    }
}

QString tst_UnlistedFiles::shown(const QString &folder) const
{
    const QModelIndex parent = m_model->index(path(folder));
    QStringList names;
    for (int row = 0; row < m_model->rowCount(parent); ++row) {
        const QModelIndex index = m_model->index(row, 0, parent);
        if (!m_model->isGone(index))
            names.append(index.data(QFileSystemModel::FileNameRole).toString());
    }
    names.sort();
    return names.join(QLatin1Char(' '));
}

bool tst_UnlistedFiles::shows(const QString &folder, const QString &names)
{
    return QTest::qWaitFor([&] { return shown(folder) == names; });
}

bool tst_UnlistedFiles::load(const QString &folder, const QString &names)
{
    const QModelIndex index = m_model->index(path(folder));
    if (m_model->canFetchMore(index))
        m_model->fetchMore(index);
    return shows(folder, names);
}

void tst_UnlistedFiles::showsAllBesideNamesThatAreNoText()
{
    QVERIFY(load(QStringLiteral("menu"), QStringLiteral("a b c sub")));
    QVERIFY(load(QStringLiteral("menu/sub"), QStringLiteral("x y")));
}

void tst_UnlistedFiles::leavesOutWhatAnyMenuLeavesOut()
{
    write(QStringLiteral("menu/.directory"), "x");
    QVERIFY(QDir().mkpath(path(QStringLiteral("menu/.folder"))));
    QVERIFY(QFile::link(QStringLiteral("nowhere"), path(QStringLiteral("menu/dangling"))));
    QVERIFY(QFile::link(QStringLiteral("sub"), path(QStringLiteral("menu/link"))));
    QCOMPARE(::mkfifo(QFile::encodeName(path(QStringLiteral("menu/pipe"))).constData(), 0600), 0);
    QVERIFY(load(QStringLiteral("menu"), QStringLiteral("a b c link sub")));
    // Not later either, when the folder has changed.
    write(QStringLiteral("menu/d"), "x");
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("a b c d link sub")));
}

void tst_UnlistedFiles::followsWhatGoesAndComes()
{
    QVERIFY(load(QStringLiteral("menu"), QStringLiteral("a b c sub")));
    QVERIFY(QFile::remove(path(QStringLiteral("menu/b"))));
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("a c sub")));
    write(QStringLiteral("menu/b"), "x");
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("a b c sub")));
    QVERIFY(QFile::rename(path(QStringLiteral("menu/c")), path(QStringLiteral("menu/d"))));
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("a b d sub")));
    // Then there is none left to end at.
    const QDir menu(path(QStringLiteral("menu")));
    for (int i = 0; i < 8; ++i) {
        const std::string odd =
            QFile::encodeName(menu.path()).toStdString() + "/raw\xff" + std::to_string(i) + ".desktop";
        QCOMPARE(::remove(odd.c_str()), 0);
    }
    QVERIFY(QFile::remove(path(QStringLiteral("menu/a"))));
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("b d sub")));
}

void tst_UnlistedFiles::comesToRestWithAFolderOpened()
{
    QVERIFY(load(QStringLiteral("menu"), QStringLiteral("a b c sub")));
    QVERIFY(load(QStringLiteral("menu/sub"), QStringLiteral("x y")));
    QVERIFY(QFile::remove(path(QStringLiteral("menu/b"))));
    QVERIFY(shows(QStringLiteral("menu"), QStringLiteral("a c sub")));
    // Longer than the watch on moved folders waits.
    const QSignalSpy changes(m_model.get(), &QAbstractItemModel::rowsRemoved);
    QTRY_VERIFY([&] {
        const int before = changes.count();
        QTest::qWait(1000);
        return changes.count() == before;
    }());
    QCOMPARE(shown(QStringLiteral("menu")), QStringLiteral("a c sub"));
    QVERIFY(load(QStringLiteral("menu/sub"), QStringLiteral("x y")));
}

void tst_UnlistedFiles::takesATextThatLooksLikeNone()
{
    const QString name = QStringLiteral("menu/") + QChar(QChar::ReplacementCharacter);
    write(name, "x");
    QVERIFY(load(QStringLiteral("menu"), QStringLiteral("a b c sub ") + QChar(QChar::ReplacementCharacter)));
}

VEL_TEST_MAIN(tst_UnlistedFiles)

#include "tst_UnlistedFiles.moc"
