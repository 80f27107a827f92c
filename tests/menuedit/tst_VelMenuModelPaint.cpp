// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileCalls.h"
#include "TestCase.h"

#include <menuedit/VelMenuModel.h>
#include <menuedit/VelMenuProxyModel.h>

#include <QIcon>
#include <QSaveFile>

#include <memory>

/// What a row costs that was shown before.
class tst_VelMenuModelPaint : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void noticesALookAtAFile();
    void looksAtNoFileForAKnownRow_data();
    void looksAtNoFileForAKnownRow();
    void looksAtNoFileForAnEditedRow_data();
    void looksAtNoFileForAnEditedRow();
    void looksAtNoFileToSortAgain();
    void showsAnEditedIcon();
    void showsTheIconOfAFileThatWasReplacedAfterAnEdit();
    void showsTheIconOfAnEntryThatChangedAtOnce();
    void looksAtNoEntryBehindItsEnd();
    void showsTheNameOfARecordFileThatComes_data();
    void showsTheNameOfARecordFileThatComes();
    void forgetsARowThatGoes();

private:
    void show(int rows);
    QModelIndex indexOf(const QString &name) const { return m_model->index(path(name)); }
    static void ask(const QModelIndex &index);
    static QByteArray calls(const QModelIndex &index);

    std::unique_ptr<VelMenuModel> m_model;
};

namespace {

QByteArray entry(const QByteArray &keys)
{
    return "[Desktop Entry]\nType=Application\nExec=true\n" + keys;
}

QByteArray directory(const QByteArray &keys)
{
    return "[Desktop Entry]\nType=Directory\n" + keys;
}

QString iconName(const QModelIndex &index)
{
    return index.data(Qt::DecorationRole).value<QIcon>().name();
}

} // namespace

void tst_VelMenuModelPaint::init()
{
    TestCase::init();
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
}

void tst_VelMenuModelPaint::cleanup()
{
    m_model.reset();
    TestCase::cleanup();
}

void tst_VelMenuModelPaint::show(int rows)
{
    m_model = std::make_unique<VelMenuModel>(path(QStringLiteral("menu")), nullptr, nullptr);
    m_model->setReadOnly(false);
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("menu"))), rows);
}

// What a view and the sorting model ask for.
void tst_VelMenuModelPaint::ask(const QModelIndex &index)
{
    index.data(Qt::DisplayRole);
    index.data(Qt::DecorationRole);
    index.data(VelMenuModel::HiddenRole);
}

// The files that are looked at when \a index is shown again.
QByteArray tst_VelMenuModelPaint::calls(const QModelIndex &index)
{
    ask(index);
    const FileCalls calls;
    ask(index);
    return calls.all().join('\n');
}

void tst_VelMenuModelPaint::noticesALookAtAFile()
{
    const QString file = write(QStringLiteral("a"), "a");
    {
        const FileCalls calls;
        QVERIFY(QFileInfo::exists(file));
        QVERIFY(calls.all().join('\n').contains(QFile::encodeName(file)));
    }
    {
        const FileCalls calls;
        QCOMPARE(read(file), QByteArray("a"));
        QVERIFY(calls.all().join('\n').contains("open"));
    }
    {
        const FileCalls calls;
        QVERIFY(!QFileInfo(file).canonicalFilePath().isEmpty());
        QVERIFY(!calls.all().isEmpty());
    }
    {
        const FileCalls calls;
        QVERIFY(calls.all().isEmpty());
    }
}

void tst_VelMenuModelPaint::looksAtNoFileForAKnownRow_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("entry") << QStringLiteral("menu/a.desktop");
    QTest::newRow("hidden entry") << QStringLiteral("menu/hidden.desktop");
    QTest::newRow("other file") << QStringLiteral("menu/a.txt");
    QTest::newRow("folder with a name") << QStringLiteral("menu/named");
    QTest::newRow("folder without a name") << QStringLiteral("menu/plain");
    QTest::newRow("folder in a folder") << QStringLiteral("menu/plain/sub");
    QTest::newRow("link to an entry") << QStringLiteral("menu/link.desktop");
    QTest::newRow("link to a folder") << QStringLiteral("menu/link");
    QTest::newRow("link to a folder without a name") << QStringLiteral("menu/plainlink");
}

void tst_VelMenuModelPaint::looksAtNoFileForAKnownRow()
{
    QFETCH(QString, name);
    write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=folder\n"));
    write(QStringLiteral("menu/hidden.desktop"), entry("Name=A\nHidden=true\n"));
    write(QStringLiteral("menu/a.txt"), "a");
    write(QStringLiteral("menu/named/.directory"), directory("Name=Named\nIcon=folder\n"));
    QDir().mkpath(path(QStringLiteral("menu/plain/sub")));
    write(QStringLiteral("outside/named/.directory"), directory("Name=Linked\n"));
    QDir().mkpath(path(QStringLiteral("outside/plain")));
    const QString entryFile = write(QStringLiteral("outside/b.desktop"), entry("Name=B\n"));
    QVERIFY(QFile::link(entryFile, path(QStringLiteral("menu/link.desktop"))));
    QVERIFY(QFile::link(path(QStringLiteral("outside/named")), path(QStringLiteral("menu/link"))));
    QVERIFY(QFile::link(path(QStringLiteral("outside/plain")), path(QStringLiteral("menu/plainlink"))));
    show(8);
    const QModelIndex index = indexOf(name);
    QVERIFY(index.isValid());

    QCOMPARE(calls(index), QByteArray());
    // Still so when the folder was read once more.
    write(QStringLiteral("menu/new"), "new");
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("menu"))), 9);
    QCOMPARE(calls(index), QByteArray());
}

void tst_VelMenuModelPaint::looksAtNoFileForAnEditedRow_data()
{
    QTest::addColumn<QString>("edited");
    QTest::addColumn<QString>("row");
    QTest::newRow("entry") << QStringLiteral("menu/a.desktop") << QStringLiteral("menu/a.desktop");
    QTest::newRow("folder") << QStringLiteral("menu/d/.directory") << QStringLiteral("menu/d");
}

void tst_VelMenuModelPaint::looksAtNoFileForAnEditedRow()
{
    QFETCH(QString, edited);
    QFETCH(QString, row);
    write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=folder\n"));
    write(QStringLiteral("menu/d/.directory"), directory("Name=D\n"));
    show(2);

    m_model->forgetItemInfo(path(edited));

    QCOMPARE(calls(indexOf(row)), QByteArray());
}

void tst_VelMenuModelPaint::looksAtNoFileToSortAgain()
{
    write(QStringLiteral("menu/.directory"), directory("SortOrder=b.desktop;*;\n"));
    for (const char *name : {"a", "b", "c"})
        write(QStringLiteral("menu/%1.desktop").arg(QLatin1String(name)), entry("Name=N\n"));
    write(QStringLiteral("menu/d/.directory"), directory("Name=D\n"));
    QDir().mkpath(path(QStringLiteral("menu/plain")));
    show(5);
    VelMenuProxyModel proxy(nullptr);
    proxy.setSourceModel(m_model.get());
    proxy.sort(0, Qt::DescendingOrder);
    const auto rows = [&] { return proxy.rowCount(proxy.mapFromSource(indexOf(QStringLiteral("menu")))); };
    QCOMPARE(rows(), 5);

    const FileCalls calls;
    proxy.sort(-1);
    proxy.sort(0, Qt::DescendingOrder);
    proxy.invalidate();

    QCOMPARE(calls.all().join('\n'), QByteArray());
}

void tst_VelMenuModelPaint::showsAnEditedIcon()
{
    const QString file = write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=folder\n"));
    const QString record = write(QStringLiteral("menu/d/.directory"), directory("Icon=folder\n"));
    show(2);
    QCOMPARE(iconName(indexOf(QStringLiteral("menu/a.desktop"))), QStringLiteral("folder"));
    QCOMPARE(iconName(indexOf(QStringLiteral("menu/d"))), QStringLiteral("folder"));

    write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=go-up\n"));
    write(QStringLiteral("menu/d/.directory"), directory("Icon=go-down\n"));
    m_model->forgetItemInfo(file);
    m_model->forgetItemInfo(record);

    QCOMPARE(iconName(indexOf(QStringLiteral("menu/a.desktop"))), QStringLiteral("go-up"));
    QCOMPARE(iconName(indexOf(QStringLiteral("menu/d"))), QStringLiteral("go-down"));
}

void tst_VelMenuModelPaint::showsTheIconOfAFileThatWasReplacedAfterAnEdit()
{
    const QString file = write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=folder\n"));
    show(1);
    m_model->forgetItemInfo(file);
    QCOMPARE(iconName(indexOf(QStringLiteral("menu/a.desktop"))), QStringLiteral("folder"));

    QSaveFile other(file);
    QVERIFY(other.open(QIODevice::WriteOnly));
    other.write(entry("Name=A\nIcon=go-up\n"));
    QVERIFY(other.commit());

    QTRY_COMPARE(iconName(indexOf(QStringLiteral("menu/a.desktop"))), QStringLiteral("go-up"));
}

void tst_VelMenuModelPaint::showsTheIconOfAnEntryThatChangedAtOnce()
{
    write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=folder\n"));
    QTRY_VERIFY(FileIdentity(path(QStringLiteral("menu"))).isSettled());
    show(1);

    // In place, so that only the entry tells of it, and not before the folder is listed again.
    write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=go-up\n"));
    write(QStringLiteral("menu/b.desktop"), entry("Name=B\n"));
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("menu"))), 2);

    QTRY_COMPARE(iconName(indexOf(QStringLiteral("menu/a.desktop"))), QStringLiteral("go-up"));
}

void tst_VelMenuModelPaint::looksAtNoEntryBehindItsEnd()
{
    const QString file = write(QStringLiteral("menu/a.desktop"), entry("Name=A\nIcon=folder\n"));
    QTRY_VERIFY(FileIdentity(path(QStringLiteral("menu"))).isSettled());
    show(1);
    m_model.reset();

    const FileCalls calls;
    QTest::qWait(200);
    QVERIFY(!calls.all().join('\n').contains(QFile::encodeName(file)));
}

void tst_VelMenuModelPaint::showsTheNameOfARecordFileThatComes_data()
{
    QTest::addColumn<QString>("told");
    QTest::newRow("written here") << QStringLiteral("menu/d");
    QTest::newRow("edited here") << QStringLiteral("menu/d/.directory");
    QTest::newRow("written by another program") << QString();
}

void tst_VelMenuModelPaint::showsTheNameOfARecordFileThatComes()
{
    QFETCH(QString, told);
    write(QStringLiteral("menu/d/a.desktop"), entry("Name=A\n"));
    show(1);
    const QModelIndex folder = indexOf(QStringLiteral("menu/d"));
    m_model->fetchMore(folder);
    QTRY_COMPARE(m_model->rowCount(folder), 1);
    QCOMPARE(folder.data().toString(), QStringLiteral("d"));

    write(QStringLiteral("menu/d/.directory"), directory("Name=New\n"));
    if (told == QLatin1String("menu/d"))
        m_model->noteRecordFile(path(told));
    else if (!told.isEmpty())
        m_model->forgetItemInfo(path(told));

    if (told.isEmpty())
        QTRY_COMPARE(folder.data().toString(), QStringLiteral("New"));
    QCOMPARE(folder.data().toString(), QStringLiteral("New"));
}

// Another entry at the same place is shown as what it is.
void tst_VelMenuModelPaint::forgetsARowThatGoes()
{
    const auto fill = [this](const QByteArray &name) {
        write(QStringLiteral("menu/a.desktop"), entry("Name=" + name + '\n'));
        write(QStringLiteral("menu/d/.directory"), directory("Name=" + name + '\n'));
        write(QStringLiteral("menu/d/b.desktop"), entry("Name=" + name + '\n'));
    };
    const auto shown = [this](const char *name) {
        return indexOf(QString::fromUtf8(name)).data().toString();
    };
    fill("Old");
    show(2);
    m_model->fetchMore(indexOf(QStringLiteral("menu/d")));
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("menu/d"))), 1);
    for (const char *name : {"menu/a.desktop", "menu/d", "menu/d/b.desktop"})
        QCOMPARE(shown(name), QStringLiteral("Old"));

    QVERIFY(QFile::remove(path(QStringLiteral("menu/a.desktop"))));
    QVERIFY(QDir(path(QStringLiteral("menu/d"))).removeRecursively());
    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("menu"))), 0);
    fill("New");

    QTRY_COMPARE(m_model->rowCount(indexOf(QStringLiteral("menu"))), 2);
    for (const char *name : {"menu/a.desktop", "menu/d", "menu/d/b.desktop"})
        QCOMPARE(shown(name), QStringLiteral("New"));
}

VEL_TEST_MAIN(tst_VelMenuModelPaint)

#include "tst_VelMenuModelPaint.moc"
