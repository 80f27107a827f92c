// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QDBusConnection>
#include <QDBusContext>
#include <QLabel>
#include <QLayout>
#include <QMenu>
#include <QUrl>

#include <csignal>
#include <cstdio>
#include <memory>

#include <sys/types.h>

/// A session bus for this program alone. Qt 6.5 asks for it when the application object is made, once for
/// all.
class SessionBus
{
public:
    SessionBus()
    {
        std::FILE *daemon = ::popen("dbus-daemon --session --fork --print-address=1 --print-pid=1", "r");
        char address[1024] = "";
        int pid = 0;
        if (daemon && std::fscanf(daemon, "%1023s %d", address, &pid) == 2) {
            m_pid = pid;
            s_address = address;
            qputenv("DBUS_SESSION_BUS_ADDRESS", s_address);
        }
        if (daemon)
            ::pclose(daemon);
    }
    ~SessionBus()
    {
        if (m_pid > 0)
            ::kill(m_pid, SIGTERM);
    }
    Q_DISABLE_COPY_MOVE(SessionBus)

    /// Empty when there is none.
    static QByteArray address() { return s_address; }

private:
    static inline QByteArray s_address;
    pid_t m_pid = 0;
};

/// The desktop's file manager as it is on the bus.
class FileManagerService : public QObject, protected QDBusContext
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.freedesktop.FileManager1")

public:
    explicit FileManagerService(bool refuses)
        : m_bus(QDBusConnection::connectToBus(QString::fromLatin1(SessionBus::address()),
                                              QStringLiteral("file manager")))
        , m_refuses(refuses)
    {
        if (!m_bus.registerObject(QStringLiteral("/org/freedesktop/FileManager1"), this,
                                  QDBusConnection::ExportAllSlots)
            || !m_bus.registerService(QStringLiteral("org.freedesktop.FileManager1")))
            QTest::qFail("cannot be on the bus", __FILE__, __LINE__);
    }
    ~FileManagerService() override { QDBusConnection::disconnectFromBus(QStringLiteral("file manager")); }
    Q_DISABLE_COPY_MOVE(FileManagerService)

    QStringList shown() const { return m_shown; }

public Q_SLOTS:
    void ShowItems(const QStringList &urls, const QString &startupId)
    {
        Q_UNUSED(startupId)
        m_shown += urls;
        if (m_refuses)
            sendErrorReply(QStringLiteral("org.example.Error"), QStringLiteral("no"));
    }

private:
    QDBusConnection m_bus;
    const bool m_refuses;
    QStringList m_shown;
};

/// The way from an item of the menu to its file, by hand.
class tst_ContainingFolder : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void asksTheFileManagerOnTheBus_data();
    void asksTheFileManagerOnTheBus();
    void opensTheFolderWhereThereIsNone_data();
    void opensTheFolderWhereThereIsNone();
    void tellsWhyItCouldNot_data();
    void tellsWhyItCouldNot();
    void showsSeveralItemsAtOnce_data();
    void showsSeveralItemsAtOnce();
    void needsAnItem();
    void isThereWithAssistanceOnly();

private:
    void installOpener(const QByteArray &script);
    void openAssisted(int count = 1);
    void choose();
    QAction *openAction() const;
    QString log() const { return path(QStringLiteral("log")); }
};

void tst_ContainingFolder::initTestCase()
{
    QVERIFY(!SessionBus::address().isEmpty());
}

void tst_ContainingFolder::init()
{
    HandsOnTestCase::init();
    qputenv("DBUS_SESSION_BUS_ADDRESS", SessionBus::address());
    installOpener("printf '%s|' \"$@\" >'" + QFile::encodeName(log()) + ".part'\nmv '"
                  + QFile::encodeName(log()) + ".part' '" + QFile::encodeName(log()) + "'\n");
}

void tst_ContainingFolder::cleanup()
{
    qunsetenv("DBUS_SESSION_BUS_ADDRESS");
    qputenv("PATH", "/usr/bin:/bin");
    HandsOnTestCase::cleanup();
}

void tst_ContainingFolder::installOpener(const QByteArray &script)
{
    const QString program = write(QStringLiteral("bin/vel-open"), "#!/bin/sh\n" + script);
    QVERIFY(QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))) + ":/usr/bin:/bin");
}

void tst_ContainingFolder::openAssisted(int count)
{
    writeEntry(QString::fromUtf8("my folder/\xc3\xa4 %41#.desktop"), QStringLiteral("A"));
    openDialog(menu(), count);
    dialog()->setAssistance(true);
    dialog()->layout()->activate();
    QCoreApplication::processEvents();
    view().setFocus();
    const QString folder = menu() + QLatin1String("/my folder");
    view().expand(shown(view(), folder));
    QVERIFY(open(view(), folder, 1));
}

QAction *tst_ContainingFolder::openAction() const
{
    const auto menus = view().findChildren<QMenu *>(QString(), Qt::FindDirectChildrenOnly);
    for (QMenu *menu : menus) {
        const QList<QAction *> actions = menu->actions();
        for (QAction *action : actions) {
            if (action->objectName() == QLatin1String("openFolderAction"))
                return action;
        }
    }
    return nullptr;
}

void tst_ContainingFolder::choose()
{
    ModalDriver modal;
    pickInDropMenu(modal, QStringLiteral("Open containing folder"));
    XDoTool::press(QStringLiteral("Menu"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
}

void tst_ContainingFolder::asksTheFileManagerOnTheBus_data()
{
    QTest::addColumn<QString>("item");
    QTest::addColumn<QString>("url");
    QTest::newRow("folder") << "my folder"
                            << "my%20folder";
    QTest::newRow("entry") << QString::fromUtf8("my folder/\xc3\xa4 %41#.desktop")
                           << "my%20folder/%C3%A4%20%2541%23.desktop";
}

void tst_ContainingFolder::asksTheFileManagerOnTheBus()
{
    QFETCH(QString, item);
    QFETCH(QString, url);
    const FileManagerService service(false);
    openAssisted();
    clickItem(menu() + QLatin1Char('/') + item);
    choose();
    const QString start = QString::fromLatin1(QUrl::fromLocalFile(menu() + QLatin1Char('/')).toEncoded());
    QTRY_COMPARE_WITH_TIMEOUT(service.shown(), QStringList{start + url}, 20000);
    QTest::qWait(200);
    QVERIFY(!QFile::exists(log()));
    QCOMPARE(dialog()->findChild<QLabel *>(QStringLiteral("messageLabel"))->text(), QString());
}

void tst_ContainingFolder::opensTheFolderWhereThereIsNone_data()
{
    QTest::addColumn<bool>("hasBus");
    QTest::addColumn<bool>("hasService");
    QTest::newRow("it refuses") << true << true;
    QTest::newRow("nobody on the bus") << true << false;
    QTest::newRow("no bus") << false << false;
}

void tst_ContainingFolder::opensTheFolderWhereThereIsNone()
{
    QFETCH(bool, hasBus);
    QFETCH(bool, hasService);
    if (!hasBus)
        qunsetenv("DBUS_SESSION_BUS_ADDRESS");
    const std::unique_ptr<FileManagerService> service(hasService ? new FileManagerService(true) : nullptr);
    openAssisted();
    clickItem(menu() + QString::fromUtf8("/my folder/\xc3\xa4 %41#.desktop"));
    choose();
    QTRY_VERIFY_WITH_TIMEOUT(QFile::exists(log()), 20000);
    QCOMPARE(read(log()), "--exec|" + QFile::encodeName(menu()) + "/my folder|");
    QVERIFY(!service || service->shown().size() == 1);
}

void tst_ContainingFolder::tellsWhyItCouldNot_data()
{
    QTest::addColumn<QByteArray>("script");
    QTest::addColumn<QString>("reason");
    QTest::newRow("nothing opens it")
        << QByteArray("echo \"vel-open: $2: nothing opens $2\" >&2\nexit 1\n") << "nothing opens %1";
    QTest::newRow("no program") << QByteArray() << "the program vel-open cannot be run";
}

void tst_ContainingFolder::tellsWhyItCouldNot()
{
    QFETCH(QByteArray, script);
    QFETCH(QString, reason);
    installOpener(script);
    if (script.isEmpty())
        QVERIFY(QFile::remove(path(QStringLiteral("bin/vel-open"))));
    openAssisted();
    clickItem(menu() + QLatin1String("/my folder"));
    choose();
    reason.replace(QLatin1String("%1"), menu());
    auto *message = dialog()->findChild<QLabel *>(QStringLiteral("messageLabel"));
    QTRY_COMPARE_WITH_TIMEOUT(message->text(),
                              QStringLiteral("The folder %1 was not opened: %2.").arg(menu(), reason), 20000);
}

void tst_ContainingFolder::showsSeveralItemsAtOnce_data()
{
    QTest::addColumn<bool>("hasService");
    QTest::newRow("file manager") << true;
    QTest::newRow("none") << false;
}

void tst_ContainingFolder::showsSeveralItemsAtOnce()
{
    QFETCH(bool, hasService);
    installOpener("echo \"$2\" >>'" + QFile::encodeName(log()) + "'\n");
    const std::unique_ptr<FileManagerService> service(hasService ? new FileManagerService(false) : nullptr);
    for (const char *name : {"b", "c", "d"})
        writeEntry(QStringLiteral("%1.desktop").arg(QLatin1String(name)), QLatin1String(name));
    openAssisted(4);
    clickItem(menu() + QString::fromUtf8("/my folder/\xc3\xa4 %41#.desktop"));
    XDoTool::press(QStringLiteral("shift+Down"));
    XDoTool::press(QStringLiteral("shift+Down"));
    QTRY_COMPARE_WITH_TIMEOUT(view().selectionModel()->selectedIndexes().size(), 3, 20000);
    choose();
    if (service) {
        QTRY_COMPARE_WITH_TIMEOUT(service->shown().size(), 3, 20000);
        QVERIFY(service->shown().constLast().endsWith(QLatin1String("/menu/c.desktop")));
        return;
    }
    const QByteArray both = QFile::encodeName(menu()) + "/my folder\n" + QFile::encodeName(menu()) + '\n';
    QTRY_COMPARE_WITH_TIMEOUT(QFileInfo(log()).size(), qint64(both.size()), 20000);
    QVERIFY(read(log()).contains(QFile::encodeName(menu()) + '\n'));
}

void tst_ContainingFolder::needsAnItem()
{
    openAssisted();
    QVERIFY(!view().selectedItem().isValid());
    ModalDriver modal;
    bool isEnabled = true;
    modal.handle([&](QWidget *menu) {
        isEnabled = openAction()->isEnabled();
        menu->close();
    });
    XDoTool::press(QStringLiteral("Menu"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QVERIFY(!isEnabled);
}

void tst_ContainingFolder::isThereWithAssistanceOnly()
{
    openAssisted();
    QVERIFY(openAction());
    QVERIFY(!view().actions().contains(openAction()));
    dialog()->setAssistance(false);
    QVERIFY(!openAction());
}

int main(int argc, char **argv)
{
    VelTest::TestEnvironment environment;
    const SessionBus bus;
    QApplication application(argc, argv);
    tst_ContainingFolder test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_ContainingFolder.moc"
