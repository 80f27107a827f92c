// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What a menu holds after an editor that could not go on: every file its old or its new
// content, nothing missing. VEL_TEST_FULL kills the editor 200 times instead of 20.

#include "MenuMirror.h"
#include "MenuTestCase.h"

#include <QElapsedTimer>
#include <QProcess>
#include <QRandomGenerator>
#include <QVector>

#include <unistd.h>

/// Full disks, missing rights and sudden ends.
class tst_MenuFaults : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void losesNothingWhenItIsKilled();
    void losesNothingOnAFullDisk_data();
    void losesNothingOnAFullDisk();
    void changesNothingWithoutPermission_data();
    void changesNothingWithoutPermission();

private:
    void start(QProcess &editor, const QStringList &arguments);
    bool finish(QProcess &editor);
    void follow(QVector<MenuMirror> &states, qint64 &milliseconds);
    QString kill(const QVector<MenuMirror> &states, qint64 delay);
    static QString faultBetween(const MenuMirror &before, const MenuMirror &after, MenuMirror &found);
    static QSet<QByteArray> contentsOf(MenuMirror &mirror);
    void buildMenu();

    int m_editors = 0;
};

void tst_MenuFaults::init()
{
    MenuTestCase::init();
    buildMenu();
}

void tst_MenuFaults::buildMenu()
{
    QVERIFY(QDir(menu()).removeRecursively());
    const struct
    {
        const char *folder;
        const char *prefix;
        int count;
    } folders[] = {
        {"", "a", 10}, {"games/", "g", 8}, {"games/deep/", "d", 3}, {"office/", "o", 6}, {"tools/", "t", 3}};
    for (const auto &folder : folders) {
        QByteArray order;
        for (int i = 0; i < folder.count; ++i) {
            const QString file = QStringLiteral("%1%2.desktop").arg(QLatin1String(folder.prefix)).arg(i);
            writeEntry(QLatin1String(folder.folder) + file, file.toUpper(),
                       "Exec=true\nX-Filler=" + QByteArray(i % 3 * 3000, 'x') + '\n');
            order += file.toUtf8() + ';';
        }
        writeFolder(QString::fromLatin1(folder.folder), QString::fromLatin1(folder.prefix), order);
    }
}

void tst_MenuFaults::start(QProcess &editor, const QStringList &arguments)
{
    // Settings of its own: a killed one may have left the lock of its settings behind.
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("XDG_CONFIG_HOME"),
                       path(QStringLiteral("settings%1").arg(++m_editors)));
    editor.setProcessEnvironment(environment);
    editor.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    editor.start(QStringLiteral(VEL_EDITOR_CHILD), QStringList{menu()} + arguments);
    QVERIFY(editor.waitForStarted());
    while (editor.readLine() != "ready\n")
        QVERIFY(editor.canReadLine() || editor.waitForReadyRead(60000));
}

bool tst_MenuFaults::finish(QProcess &editor)
{
    return (editor.state() == QProcess::NotRunning || editor.waitForFinished(120000))
        && editor.exitStatus() == QProcess::NormalExit && editor.exitCode() == 0;
}

// What the menu holds after each step when nothing goes wrong.
void tst_MenuFaults::follow(QVector<MenuMirror> &states, qint64 &milliseconds)
{
    states.append(MenuMirror::ofDisk(menu()));
    QProcess editor;
    start(editor, {QStringLiteral("step")});
    QElapsedTimer timer;
    timer.start();
    for (;;) {
        QVERIFY(editor.canReadLine() || editor.waitForReadyRead(60000));
        const QByteArray line = editor.readLine();
        if (line == "end\n")
            break;
        if (!line.startsWith("done"))
            continue;
        states.append(MenuMirror::ofDisk(menu()));
        editor.write("\n");
    }
    milliseconds = timer.elapsed();
    QVERIFY(finish(editor));
}

QSet<QByteArray> tst_MenuFaults::contentsOf(MenuMirror &mirror)
{
    QSet<QByteArray> contents;
    const QStringList paths = mirror.paths();
    for (const QString &path : paths) {
        if (!path.startsWith(QLatin1Char('.')) && !path.contains(QLatin1String("/.")))
            contents.insert(mirror.item(path).bytes);
    }
    return contents;
}

// What is wrong with a menu that was left between two states; empty when nothing is.
QString tst_MenuFaults::faultBetween(const MenuMirror &before, const MenuMirror &after, MenuMirror &found)
{
    MenuMirror old = before;
    MenuMirror fresh = after;
    const QStringList paths = found.paths();
    for (const QString &path : paths) {
        if (path.startsWith(QLatin1Char('.')) || path.contains(QLatin1String("/.")))
            continue;
        const bool isOld = old.contains(path) && old.item(path) == found.item(path);
        const bool isNew = fresh.contains(path) && fresh.item(path) == found.item(path);
        // A new folder and its record come one after the other, and go in the other order.
        const bool isBare = found.kindOf(path) == MenuMirror::Kind::Folder && found.item(path).bytes.isNull()
            && old.contains(path) != fresh.contains(path);
        // A new entry is first written, then edited.
        const bool isDraft = !old.contains(path) && fresh.contains(path)
            && (found.item(path).bytes.contains("\nName=Shortcut")
                || found.item(path).bytes.contains("\nName=Group"));
        if (!isOld && !isNew && !isBare && !isDraft)
            return QStringLiteral("%1 holds %2").arg(path, QString::fromUtf8(found.item(path).bytes));
    }
    for (const QString &path : before.paths()) {
        if (after.contains(path) && !found.contains(path))
            return QLatin1String("missing: ") + path;
    }
    const QSet<QByteArray> lost = (contentsOf(old) & contentsOf(fresh)) - contentsOf(found);
    return lost.isEmpty() ? QString() : QLatin1String("lost: ") + QString::fromUtf8(*lost.cbegin());
}

QString tst_MenuFaults::kill(const QVector<MenuMirror> &states, qint64 delay)
{
    buildMenu();
    QProcess editor;
    start(editor, {QStringLiteral("run")});
    editor.waitForFinished(int(delay));
    editor.kill();
    editor.waitForFinished();
    const int steps = int(editor.readAllStandardOutput().count("done "));
    MenuMirror found = MenuMirror::ofDisk(menu());
    const QString fault =
        faultBetween(states.at(steps), states.at(std::min(steps + 1, int(states.size()) - 1)), found);
    return fault.isEmpty() ? fault : QStringLiteral("after %1 steps, %2").arg(steps).arg(fault);
}

void tst_MenuFaults::losesNothingWhenItIsKilled()
{
    QVector<MenuMirror> states;
    qint64 milliseconds = 0;
    follow(states, milliseconds);
    if (QTest::currentTestFailed())
        return;
    for (int i = 1; i < states.size(); ++i) {
        // A step that does nothing would test nothing.
        QVERIFY2(!MenuMirror::difference(states.at(i - 1), states.at(i)).isEmpty(),
                 qPrintable(QStringLiteral("step %1 changes nothing").arg(i - 1)));
    }
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : QRandomGenerator::global()->generate() & 0x7fffffff;
    const int kills = qEnvironmentVariableIsSet("VEL_TEST_FULL") ? 200 : 20;
    qInfo("seed %u, %d kills within %lld ms", seed, kills, static_cast<long long>(milliseconds));
    QRandomGenerator random(seed);
    for (int i = 0; i < kills; ++i) {
        const QString fault = kill(states, random.bounded(int(milliseconds) + 1));
        QVERIFY2(fault.isEmpty(), qPrintable(fault));
        if (QTest::currentTestFailed())
            return;
    }
}

void tst_MenuFaults::losesNothingOnAFullDisk_data()
{
    QTest::addColumn<QString>("bytes");
    QTest::newRow("nothing fits") << "0";
    QTest::newRow("a part fits") << "40";
    QTest::newRow("small files fit") << "1000";
}

// What was moved is there, what could not be written is as it was, and nothing half-written is left.
void tst_MenuFaults::losesNothingOnAFullDisk()
{
    QFETCH(QString, bytes);
    MenuMirror before = MenuMirror::ofDisk(menu());
    QProcess editor;
    start(editor, {QStringLiteral("limit"), bytes});
    QVERIFY(finish(editor));
    MenuMirror found = MenuMirror::ofDisk(menu());
    const QSet<QByteArray> known = contentsOf(before);
    const int limit = bytes.toInt();
    const QStringList paths = found.paths();
    for (const QString &path : paths) {
        QVERIFY2(!MenuMirror::nameOf(path).startsWith(QLatin1Char('.')), qPrintable(path));
        const QByteArray content = found.item(path).bytes;
        const bool isWhole = content.size() <= limit && content.startsWith("[Desktop Entry]\nType=")
            && content.contains("\nName=") && content.endsWith('\n');
        QVERIFY2(known.contains(content) || content.isNull() || isWhole,
                 qPrintable(path + QLatin1String(" holds ") + QString::fromUtf8(content)));
    }
    // The only entries that may be gone are those that were deleted or could be saved anew.
    const QStringList all = before.paths();
    for (const QString &path : all) {
        const bool isDeleted =
            path.contains(QLatin1String("games/g5")) || path.contains(QLatin1String("games/g6"));
        if (!isDeleted && before.kindOf(path) == MenuMirror::Kind::File
            && before.item(path).bytes.size() > limit)
            QVERIFY2(contentsOf(found).contains(before.item(path).bytes), qPrintable(path));
    }
}

void tst_MenuFaults::changesNothingWithoutPermission_data()
{
    QTest::addColumn<QStringList>("writable");
    QTest::newRow("anywhere") << QStringList();
    QTest::newRow("but in one folder") << QStringList{QStringLiteral("office")};
    QTest::newRow("in the folders below") << QStringList{QString(), QStringLiteral("tools")};
}

void tst_MenuFaults::changesNothingWithoutPermission()
{
    if (getuid() != 0)
        QSKIP("only the superuser can become somebody else");
    QFETCH(QStringList, writable);
    // Somebody else has to come as far as the menu.
    for (QString above = menu(); above.size() > 1; above = QFileInfo(above).absolutePath()) {
        if (!QFile::setPermissions(above, QFile::permissions(above) | QFile::ReadOther | QFile::ExeOther))
            QSKIP("the menu cannot be made readable");
    }
    for (const QString &folder : qAsConst(writable)) {
        const QString path = folder.isEmpty() ? menu() : menu() + QLatin1Char('/') + folder;
        QVERIFY(chown(QFile::encodeName(path).constData(), 65534, 65534) == 0);
    }
    MenuMirror before = MenuMirror::ofDisk(menu());
    QProcess editor;
    start(editor, {QStringLiteral("nobody")});
    QVERIFY(finish(editor));
    MenuMirror found = MenuMirror::ofDisk(menu());
    const QStringList all = before.paths();
    for (const QString &path : all) {
        if (path.isEmpty() || writable.contains(MenuMirror::folderOf(path)) || writable.contains(path))
            continue;
        QVERIFY2(found.contains(path) && found.item(path) == before.item(path), qPrintable(path));
    }
    const QSet<QByteArray> lost = contentsOf(before) - contentsOf(found);
    if (writable.isEmpty())
        QCOMPARE(MenuMirror::difference(before, found), QString());
    for (const QByteArray &content : lost)
        QVERIFY2(content.contains("Type=Directory"), content.constData());
}

VEL_TEST_MAIN(tst_MenuFaults)
#include "tst_MenuFaults.moc"
