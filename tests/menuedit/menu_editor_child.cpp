// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// menu_editor_child MENU MODE [ARGUMENT]
//
// Edits a menu through the view's own slots, always in the same way, while something goes wrong:
//   step           nothing; waits for a line of input after each step
//   run            nothing here; the program is ended from outside
//   limit BYTES    no file may grow beyond so many bytes
//   nobody         the rights of the superuser are given up first
// Prints "ready", "done NUMBER" after each step and "end".

#include <VelDesktopEntryEditDialog.h>
#include <VelMenuView.h>

#include <QAbstractButton>
#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QLineEdit>
#include <QMessageBox>
#include <QPointer>
#include <QSortFilterProxyModel>
#include <QTimer>

#include <csignal>
#include <cstdio>

#include <grp.h>
#include <sys/resource.h>
#include <unistd.h>

namespace {

/// Does in the windows that open what a user would do, and gives up what cannot be saved.
class User : public QObject
{
public:
    User()
    {
        connect(&m_timer, &QTimer::timeout, this, &User::look);
        m_timer.start(2);
    }

    QString name;

private:
    void look()
    {
        QWidget *window = QApplication::activeModalWidget();
        if (auto *box = qobject_cast<QMessageBox *>(window)) {
            QAbstractButton *yes = box->button(QMessageBox::Yes);
            (yes ? yes : box->buttons().constFirst())->click();
        } else if (auto *editor = qobject_cast<VelDesktopEntryEditDialog *>(window)) {
            if (editor == m_tried) {
                editor->reject();
                return;
            }
            m_tried = editor;
            fill(editor);
            // Not from here: the box that may open is to be seen by the timer as well.
            QTimer::singleShot(0, editor, &QDialog::accept);
        }
    }

    void fill(QWidget *editor) const
    {
        for (const char *field : {"nameEdit", "localNameEdit", "execEdit"}) {
            auto *widget = editor->findChild<QWidget *>(QLatin1String(field));
            auto *line = qobject_cast<QLineEdit *>(widget);
            if (!line && widget)
                line = widget->findChild<QLineEdit *>();
            if (line && !line->isHidden())
                line->setText(QLatin1String(field) == QLatin1String("execEdit") ? QStringLiteral("true")
                                                                                : name);
        }
    }

    QTimer m_timer;
    QPointer<VelDesktopEntryEditDialog> m_tried;
};

class Editing
{
public:
    explicit Editing(const QString &menu)
        : m_menu(menu)
        , m_view(menu, -1, true)
    {
        m_view.resize(300, 500);
        m_view.show();
        settle();
    }

    static constexpr int Steps = 26;
    void step(int number);
    void settle();

private:
    QString full(const QString &path) const { return m_menu + QLatin1Char('/') + path; }
    QModelIndex shown(const QString &path) const
    {
        const auto *proxy = qobject_cast<QSortFilterProxyModel *>(m_view.model());
        return proxy->mapFromSource(qobject_cast<QFileSystemModel *>(proxy->sourceModel())->index(path));
    }
    bool select(const QString &path);
    bool isSettled(const QString &folder);
    void paste(const QString &path, bool isCut, const QString &to);

    QString m_menu;
    VelMenuView m_view;
    User m_user;
};

bool Editing::select(const QString &path)
{
    if (!QFileInfo::exists(full(path)))
        return false;
    m_view.showAndSelect(full(path));
    return m_view.selectedPath() == full(path);
}

bool Editing::isSettled(const QString &folder)
{
    const QModelIndex index = shown(folder);
    if (!m_view.isExpanded(index) && index != m_view.rootIndex()) {
        m_view.expand(index);
        return false;
    }
    const QFileInfoList children = QDir(folder).entryInfoList(QDir::AllEntries | QDir::NoDotAndDotDot);
    if (m_view.model()->rowCount(index) != children.size())
        return false;
    for (const QFileInfo &child : children) {
        if (child.isDir() && !isSettled(child.filePath()))
            return false;
    }
    return true;
}

void Editing::settle()
{
    QElapsedTimer timer;
    timer.start();
    do {
        QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
    } while (!isSettled(m_menu) && timer.elapsed() < 10000);
}

void Editing::paste(const QString &path, bool isCut, const QString &to)
{
    if (!select(path))
        return;
    if (isCut)
        m_view.slotCut();
    else
        m_view.slotCopy();
    if (select(to))
        m_view.slotPaste();
}

void Editing::step(int number)
{
    const int round = number / 13;
    const auto numbered = [round](const char *text, int more = 0) {
        return QString::fromLatin1(text).arg(round + more);
    };
    m_user.name = QStringLiteral("Name %1").arg(number);
    switch (number % 13) {
    case 0:
        return select(numbered("a%1.desktop", 5)) ? m_view.slotUp() : void();
    case 1:
        return select(QStringLiteral("games")) ? m_view.slotFileNew() : void();
    case 2:
        if (select(numbered("games/g%1.desktop", 1)))
            m_view.slotEdit();
        return;
    case 3:
        return paste(numbered("a%1.desktop"), true, QStringLiteral("office/o0.desktop"));
    case 4:
        return paste(numbered("office/o%1.desktop", 3), false, QStringLiteral("games/deep"));
    case 5:
        return paste(QStringLiteral("games"), false, QStringLiteral("office"));
    case 6:
        return paste(numbered("office/o%1.desktop", 1), true, QStringLiteral("a8.desktop"));
    case 7:
        return select(numbered("games/g%1.desktop", 5)) ? m_view.slotDel() : void();
    case 8:
        return select(QStringLiteral("games/g0.desktop")) ? m_view.slotDown() : void();
    case 9:
        return select(QStringLiteral("office")) ? m_view.slotDirNew() : void();
    case 10:
        return round == 0 ? paste(QStringLiteral("tools"), true, QStringLiteral("games"))
                          : paste(QStringLiteral("games/tools"), true, QStringLiteral("office"));
    case 11:
        if (select(QStringLiteral("games")))
            m_view.slotEdit();
        return;
    default:
        return select(QStringLiteral("office/games")) ? m_view.slotDel() : void();
    }
}

void say(const QByteArray &text)
{
    std::puts(text.constData());
    std::fflush(stdout);
}

void limitFiles(const char *bytes)
{
    std::signal(SIGXFSZ, SIG_IGN);
    const rlim_t size = strtoul(bytes, nullptr, 10);
    const rlimit limit{size, size};
    setrlimit(RLIMIT_FSIZE, &limit);
}

bool becomeNobody()
{
    constexpr uid_t Nobody = 65534;
    return setgroups(0, nullptr) == 0 && setgid(Nobody) == 0 && setuid(Nobody) == 0;
}

// The offscreen platform complains about every window.
void keepQuiet(QtMsgType, const QMessageLogContext &, const QString &message)
{
    if (!message.startsWith(QLatin1String("This plugin does not support")))
        std::fprintf(stderr, "%s\n", qPrintable(message));
}

} // namespace

int main(int argc, char **argv)
{
    if (argc < 3)
        return 2;
    const QByteArray mode = argv[2];
    if (mode == "nobody" && getuid() == 0 && !becomeNobody())
        return 3;
    qInstallMessageHandler(keepQuiet);
    const QApplication application(argc, argv);
    Editing editing(QFile::decodeName(argv[1]));
    if (mode == "limit" && argc > 3)
        limitFiles(argv[3]);
    say("ready");
    for (int i = 0; i < Editing::Steps; ++i) {
        editing.step(i);
        editing.settle();
        say("done " + QByteArray::number(i));
        if (mode == "step")
            (void)std::getchar();
    }
    say("end");
    return 0;
}
