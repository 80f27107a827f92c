// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The gallery's text editor and its keys, with the keyboard and mouse of the X server.

#include "GalleryPages.h"
#include "GalleryWindow.h"
#include "ModalDriver.h"
#include "TestCase.h"
#include "XDoTool.h"

#include <EditShortcutsDialog.h>

#include <QAction>
#include <QDialogButtonBox>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPointer>
#include <QProcess>
#include <QPushButton>
#include <QRadioButton>
#include <QSettings>
#include <QTimer>
#include <QTreeView>

#include <memory>

namespace {

QString str(const char *text)
{
    return QString::fromLatin1(text);
}

// A step that fails leaves no dialog open.
class DialogEnd
{
public:
    explicit DialogEnd(QWidget *dialog)
        : m_dialog(qobject_cast<QDialog *>(dialog))
    {
    }
    ~DialogEnd()
    {
        if (m_dialog && m_dialog->isVisible())
            m_dialog->reject();
    }
    Q_DISABLE_COPY(DialogEnd)

private:
    const QPointer<QDialog> m_dialog;
};

// A window manager moves a window a moment after it appeared; clicks would miss it.
void waitUntilSettled(QWidget *window)
{
    QTRY_VERIFY_WITH_TIMEOUT((window->activateWindow(), window->isActiveWindow()), 10000);
    const QString ask =
        QStringLiteral("mousemove %1 getmouselocation --shell").arg(XDoTool::at(window, {5, 5}));
    const auto isWhereItShows = [&] {
        const QByteArrayList found = XDoTool::ask(ask).split('\n');
        const QPoint place = window->mapToGlobal(QPoint(5, 5));
        return found.contains("X=" + QByteArray::number(place.x()))
            && found.contains("Y=" + QByteArray::number(place.y()));
    };
    QTRY_VERIFY_WITH_TIMEOUT(isWhereItShows(), 10000);
}

} // namespace

class tst_vel_gallery_shortcuts : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void reassignsAnActionAndFindsItAgain_data();
    void reassignsAnActionAndFindsItAgain();
    void exportsAndImportsKeys();

private:
    void start();
    void xdotool(const QStringList &arguments);
    void press(const char *key) { xdotool({str("key"), str(key)}); }
    void click(QWidget *widget, const QPoint &position);
    void click(QWidget *widget) { click(widget, widget->rect().center()); }
    void clickRow(QWidget *dialog, const QString &text);
    void clickButton(QWidget *dialog, QDialogButtonBox::StandardButton button);
    void record(QWidget *dialog, const char *key);
    void leaveKey(QWidget *dialog);
    void openDialog(bool isAssisted);
    void reassign(bool isAssisted);
    void restoreDefaults();
    // Presses a key in a fresh text, whose first word tells whether it was put into capitals.
    QString textAfter(const char *key);
    QString savedKey() const;

    std::unique_ptr<GalleryWindow> m_window;
};

void tst_vel_gallery_shortcuts::init()
{
    TestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    write(str("keyshortcutrc"), "[ShortCutKeys]\n\"None|Ctrl|Alt|j\"=\"VELWM_RUN\"\n");
    QSettings(str("vel-gallery"), str("vel-gallery")).clear();
    start();
}

void tst_vel_gallery_shortcuts::cleanup()
{
    m_window.reset();
    qunsetenv("VEL_CONFIG_HOME");
    TestCase::cleanup();
}

void tst_vel_gallery_shortcuts::start()
{
    m_window.reset();
    m_window.reset(new GalleryWindow(galleryPages(), {}));
    m_window->resize(1000, 700);
    QVERIFY(m_window->showPage(str("shortcuts")));
    m_window->show();
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
}

void tst_vel_gallery_shortcuts::xdotool(const QStringList &arguments)
{
    QProcess process;
    process.start(str("xdotool"), arguments);
    QVERIFY(process.waitForFinished());
    QCOMPARE(process.exitCode(), 0);
}

void tst_vel_gallery_shortcuts::click(QWidget *widget, const QPoint &position)
{
    const QPoint place = widget->mapToGlobal(position);
    xdotool(
        {str("mousemove"), QString::number(place.x()), QString::number(place.y()), str("click"), str("1")});
}

void tst_vel_gallery_shortcuts::clickRow(QWidget *dialog, const QString &text)
{
    auto *tree = dialog->findChild<QTreeView *>(str("treeView"));
    const auto found = tree->model()->match(tree->model()->index(0, 0), Qt::DisplayRole, text, 1,
                                            Qt::MatchExactly | Qt::MatchRecursive);
    QCOMPARE(found.size(), 1);
    tree->scrollTo(found.constFirst(), QAbstractItemView::PositionAtCenter);
    click(tree->viewport(), tree->visualRect(found.constFirst()).center());
    QTRY_COMPARE(tree->currentIndex().siblingAtColumn(0), found.constFirst());
}

void tst_vel_gallery_shortcuts::clickButton(QWidget *dialog, QDialogButtonBox::StandardButton button)
{
    click(dialog->findChild<QDialogButtonBox *>(str("buttonBox"))->button(button));
}

void tst_vel_gallery_shortcuts::record(QWidget *dialog, const char *key)
{
    auto *keyWidget = dialog->findChild<QKeySequenceEdit *>(str("keyWidget"));
    // A busy window manager may leave the keyboard with the message box that has just gone.
    QTRY_VERIFY((dialog->activateWindow(), dialog->isActiveWindow()));
    click(keyWidget);
    QTRY_VERIFY(keyWidget->hasFocus());
    press(key);
}

QString tst_vel_gallery_shortcuts::textAfter(const char *key)
{
    auto *editor = m_window->findChild<QPlainTextEdit *>(str("editor"));
    auto *last = m_window->findChild<QLabel *>(str("lastCommand"));
    last->clear();
    editor->setPlainText(str("some text"));
    m_window->activateWindow();
    if (!QTest::qWaitForWindowActive(m_window.get()))
        return str("the window is not active");
    editor->setFocus();
    press(key);
    // A key that does nothing gives no sign, so that only time tells.
    const bool wasUsed = QTest::qWaitFor([last] { return !last->text().isEmpty(); }, 1000);
    Q_UNUSED(wasUsed)
    return editor->toPlainText();
}

QString tst_vel_gallery_shortcuts::savedKey() const
{
    const QSettings settings(str("vel-gallery"), str("vel-gallery"));
    return settings.value(str("Shortcuts/word-upper"), str("(not saved)")).toString();
}

// The assisted dialog refuses a key when the user leaves it.
void tst_vel_gallery_shortcuts::leaveKey(QWidget *dialog)
{
    if (auto *filter = dialog->findChild<QLineEdit *>(str("filterEdit"))) {
        auto *keyWidget = dialog->findChild<QKeySequenceEdit *>(str("keyWidget"));
        QTRY_VERIFY(!keyWidget->keySequence().isEmpty());
        click(filter);
    }
}

void tst_vel_gallery_shortcuts::openDialog(bool isAssisted)
{
    if (isAssisted)
        press("ctrl+F12");
    else
        QTimer::singleShot(0, m_window->findChild<QAction *>(str("configure-shortcuts-plain")),
                           &QAction::trigger);
}

// Tries two keys that are taken, then a free one.
void tst_vel_gallery_shortcuts::reassign(bool isAssisted)
{
    ModalDriver modal;
    int boxes = 0;
    const auto count = [&boxes](QMessageBox *box) {
        ++boxes;
        box->button(QMessageBox::Ok)->click();
    };
    modal.handle([&](QWidget *dialog) {
        const DialogEnd end(dialog);
        waitUntilSettled(dialog);
        auto *shortcuts = qobject_cast<EditShortcutsDialog *>(dialog);
        QVERIFY(shortcuts);
        QCOMPARE(shortcuts->assistance(), isAssisted);
        auto *keyWidget = dialog->findChild<QKeySequenceEdit *>(str("keyWidget"));
        clickRow(dialog, str("To upper case"));
        auto *custom = dialog->findChild<QRadioButton *>(str("customKeyRB"));
        click(custom, QPoint(10, custom->height() / 2));
        QTRY_VERIFY(keyWidget->isEnabled());
        record(dialog, "F3");
        leaveKey(dialog);
        QTRY_COMPARE(boxes, 1);
        record(dialog, "ctrl+alt+j");
        leaveKey(dialog);
        QTRY_COMPARE(boxes, 2);
        record(dialog, "ctrl+shift+F8");
        auto *ok = dialog->findChild<QDialogButtonBox *>(str("buttonBox"))->button(QDialogButtonBox::Ok);
        QTRY_VERIFY(ok->isEnabled());
        clickButton(dialog, QDialogButtonBox::Ok);
        QTRY_VERIFY(!dialog->isVisible());
    });
    modal.answerWith(
        {QMessageBox::Critical, str("Shortcuts conflict"),
         str("Shortcut 'F3' is already used for action 'Find selected again'. Please try another.")},
        count);
    modal.answerWith({QMessageBox::Critical, str("Shortcuts conflict"),
                      str("Shortcut 'Ctrl+Alt+J' is already used for global action 'VELWM_RUN'.")},
                     count);
    openDialog(isAssisted);
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished() && !QApplication::activeModalWidget(), 30000);
}

void tst_vel_gallery_shortcuts::restoreDefaults()
{
    ModalDriver modal;
    modal.handle([&](QWidget *dialog) {
        const DialogEnd end(dialog);
        waitUntilSettled(dialog);
        clickButton(dialog, QDialogButtonBox::RestoreDefaults);
        auto *ok = dialog->findChild<QDialogButtonBox *>(str("buttonBox"))->button(QDialogButtonBox::Ok);
        QTRY_VERIFY(ok->isEnabled());
        clickButton(dialog, QDialogButtonBox::Ok);
        QTRY_VERIFY(!dialog->isVisible());
    });
    press("ctrl+F12");
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished() && !QApplication::activeModalWidget(), 30000);
}

void tst_vel_gallery_shortcuts::reassignsAnActionAndFindsItAgain_data()
{
    QTest::addColumn<bool>("isAssisted");
    QTest::newRow("assisted") << true;
    QTest::newRow("plain") << false;
}

void tst_vel_gallery_shortcuts::reassignsAnActionAndFindsItAgain()
{
    QFETCH(bool, isAssisted);
    QCOMPARE(textAfter("F7"), str("SOME text"));
    QCOMPARE(textAfter("ctrl+shift+F8"), str("some text"));
    QCOMPARE(savedKey(), str("(not saved)"));

    reassign(isAssisted);
    QCOMPARE(textAfter("ctrl+shift+F8"), str("SOME text"));
    QCOMPARE(textAfter("F7"), str("some text"));
    QCOMPARE(savedKey(), str("Ctrl+Shift+F8"));

    start();
    QCOMPARE(textAfter("ctrl+shift+F8"), str("SOME text"));
    QCOMPARE(textAfter("F7"), str("some text"));

    restoreDefaults();
    QCOMPARE(savedKey(), str("F7"));
    start();
    QCOMPARE(textAfter("F7"), str("SOME text"));
    QCOMPARE(textAfter("ctrl+shift+F8"), str("some text"));
}

void tst_vel_gallery_shortcuts::exportsAndImportsKeys()
{
    ModalDriver modal;
    const auto choose = [&modal, this](const char *name) {
        modal.handle([file = path(str(name))](QWidget *window) {
            window->findChild<QLineEdit *>(str("fileNameEdit"))->setText(file);
            qobject_cast<QDialog *>(window)->accept();
        });
    };
    const auto trigger = [this](const char *name) { m_window->findChild<QAction *>(str(name))->trigger(); };
    choose("keys.ini");
    trigger("export-keys");
    QByteArray keys = read(path(str("keys.ini")));
    QVERIFY2(keys.contains("word-upper=\"F7\""), keys.constData());
    write(str("keys.ini"), keys.replace("word-upper=\"F7\"", "word-upper=\"Ctrl+Shift+F8\""));
    choose("keys.ini");
    trigger("import-keys");
    QVERIFY(modal.finished());
    QCOMPARE(savedKey(), str("Ctrl+Shift+F8"));
    QCOMPARE(textAfter("ctrl+shift+F8"), str("SOME text"));
    choose("keys.html");
    trigger("sheet-html");
    QVERIFY(read(path(str("keys.html"))).contains("To upper case"));
}

VEL_TEST_MAIN(tst_vel_gallery_shortcuts)

#include "tst_vel_gallery_shortcuts.moc"
