// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModalDriver.h"
#include "ModelTestCase.h"

#include <menuedit/MenuClipboard.h>
#include <menuedit/VelMenuModel.h>

#include <QDir>
#include <QMimeData>
#include <QSignalSpy>

#include <memory>

/// What a drop does to the files, and what it asks.
class tst_VelMenuModelDropFiles : public ModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
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

private:
    bool drop(const QStringList &files, Qt::DropAction action, const QString &target, int row = -1);
};

namespace {

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

bool tst_VelMenuModelDropFiles::drop(const QStringList &files, Qt::DropAction action, const QString &target,
                                     int row)
{
    return m_model->dropMimeData(urlsOf(files).get(), action, row, row == -1 ? -1 : 0, indexOf(target));
}

void tst_VelMenuModelDropFiles::refusesADrop_data()
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

void tst_VelMenuModelDropFiles::refusesADrop()
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

void tst_VelMenuModelDropFiles::touchesNothingInTheFilesOwnFolder()
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

void tst_VelMenuModelDropFiles::knowsTheOwnFolderByAnotherPath()
{
    write(QStringLiteral("to/a"), "a");
    QVERIFY(QFile::link(path(QStringLiteral("to")), path(QStringLiteral("alias"))));
    m_model = modelOf(folder(), 2);

    QVERIFY(drop({path(QStringLiteral("alias/a"))}, Qt::CopyAction, QStringLiteral("to")));

    QCOMPARE(read(path(QStringLiteral("to/a"))), QByteArray("a"));
}

void tst_VelMenuModelDropFiles::copiesADroppedFile()
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

void tst_VelMenuModelDropFiles::movesADroppedFile()
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

void tst_VelMenuModelDropFiles::takesAllFilesOfADrop()
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

void tst_VelMenuModelDropFiles::copiesADroppedFolderWithEverythingInIt()
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

void tst_VelMenuModelDropFiles::takesBytesOfOtherEditors()
{
    const QString file = write(QStringLiteral("From Here/50% #1?.desktop"), entry("Name=A\n"));
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);
    const MenuClipboard::ItemData data(file, Qt::MoveAction);

    QVERIFY(m_model->dropMimeData(&data, Qt::MoveAction, -1, -1, indexOf(QStringLiteral("to"))));

    QCOMPARE(shown(QStringLiteral("to/50% #1?.desktop")), QStringLiteral("A"));
    QVERIFY(!QFile::exists(file));
}

void tst_VelMenuModelDropFiles::linksADroppedFile()
{
    const QString file = write(QStringLiteral("from/a"), "a");
    QDir(folder()).mkdir(QStringLiteral("to"));
    m_model = modelOf(folder(), 2);

    QVERIFY(drop({file}, Qt::LinkAction, QStringLiteral("to")));

    QCOMPARE(QFile::symLinkTarget(path(QStringLiteral("to/a"))), file);
}

void tst_VelMenuModelDropFiles::asksBeforeAnExistingTarget_data()
{
    QTest::addColumn<int>("answer");
    QTest::newRow("yes") << int(QMessageBox::Yes);
    QTest::newRow("no") << int(QMessageBox::No);
    QTest::newRow("rejected") << 0;
}

void tst_VelMenuModelDropFiles::asksBeforeAnExistingTarget()
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

void tst_VelMenuModelDropFiles::asksOnlyForTheFirstFile()
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

void tst_VelMenuModelDropFiles::goesAwayWhileItAsks()
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

VEL_TEST_MAIN(tst_VelMenuModelDropFiles)
#include "tst_VelMenuModelDropFiles.moc"
