// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPages.h"
#include "GalleryWindow.h"
#include "ModalDriver.h"
#include "TestCase.h"
#include "XDoTool.h"
#include "editor/FileCommands.h"

#include <ShortcutsModel.h>
#include <VelRadioGroupBox.h>

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QDir>
#include <QFileDialog>
#include <QImage>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QProcess>
#include <QProcessEnvironment>
#include <QPushButton>
#include <QRegularExpression>
#include <QScreen>
#include <QSet>
#include <QSettings>
#include <QSpinBox>

#include <sys/resource.h>

#include <algorithm>
#include <csignal>
#include <memory>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

std::unique_ptr<GalleryWindow> openPage(const QString &name, const QString &settingsFile = QString())
{
    GalleryContext context;
    context.settingsFile = settingsFile;
    auto window = std::make_unique<GalleryWindow>(galleryPages(), context);
    if (!window->showPage(name))
        QTest::qFail("no such page", __FILE__, __LINE__);
    window->show();
    return window;
}

template <typename Widget>
Widget *child(const GalleryWindow &window, const char *name)
{
    auto *found = window.findChild<Widget *>(QLatin1String(name));
    if (!found)
        qFatal("no %s", name);
    return found;
}

void click(const GalleryWindow &window, QDialogButtonBox::StandardButton button)
{
    QTest::mouseClick(child<QDialogButtonBox>(window, "buttonBox")->button(button), Qt::LeftButton);
}

} // namespace

class tst_vel_gallery : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void namesItsPagesOnceAndPlainly();
    void showsEveryPageBesideItsCode();
    void doesNotShowAPageThatDoesNotExist();
    void listsHeadingsThatCannotBeChosen();
    void choosesARadioGroupBoxByTheKeyboard();
    void editsTheSettingsFileOnApply();
    void addsNoKeyUnasked();
    void takesBackEditsOnReset();
    void saysThatNoSettingsFileWasNamed();
    void saysThatTheSettingsFileCannotBeOpened();
    void givesAKeyThatIsNoActionsToTheUser();
    void writesPicturesInEveryCombination();
    void fitsOnASmallScreen();
    void showsItsHelpWithoutADisplay();
    void refusesAnUnknownOption_data();
    void refusesAnUnknownOption();
    void failsForAPageThatDoesNotExist();
    void failsWhenPicturesCannotBeWritten();
    void savesNoHalfOfATextToAFullDisk();

private:
    static QProcessEnvironment withoutADisplay();
};

void tst_vel_gallery::namesItsPagesOnceAndPlainly()
{
    QSet<QString> names;
    const QRegularExpression plain(s("^[a-z]+(-[a-z]+)*$"));
    for (const GalleryPage &page : galleryPages()) {
        QVERIFY2(plain.match(page.name).hasMatch(), qPrintable(page.name));
        QVERIFY2(!names.contains(page.name), qPrintable(page.name));
        names.insert(page.name);
        QVERIFY(!page.title.isEmpty() && !page.category.isEmpty() && !page.snippet.isEmpty());
    }
    QVERIFY(names.contains(s("radio-group-box")));
    QVERIFY(names.contains(s("settings")));
}

void tst_vel_gallery::showsEveryPageBesideItsCode()
{
    const auto pages = galleryPages();
    GalleryWindow window(pages, {});
    for (const GalleryPage &page : pages) {
        QVERIFY(window.showPage(page.name));
        QVERIFY(window.currentPage());
        QCOMPARE(child<QPlainTextEdit>(window, "codeView")->toPlainText(), page.snippet);
        QWidget *made = window.currentPage();
        QVERIFY(window.showPage(pages.constFirst().name));
        QVERIFY(window.showPage(page.name));
        QCOMPARE(window.currentPage(), made); // made once
    }
}

void tst_vel_gallery::doesNotShowAPageThatDoesNotExist()
{
    GalleryWindow window(galleryPages(), {});
    const QWidget *before = window.currentPage();
    QVERIFY(before);
    QVERIFY(!window.showPage(s("no-such-page")));
    QCOMPARE(window.currentPage(), before);
}

void tst_vel_gallery::listsHeadingsThatCannotBeChosen()
{
    GalleryWindow window(galleryPages(), {});
    const auto *list = child<QListWidget>(window, "pageList");
    QSet<QString> categories;
    for (const GalleryPage &page : galleryPages())
        categories.insert(page.category);
    int headings = 0;
    for (int row = 0; row < list->count(); ++row) {
        if (!(list->item(row)->flags() & Qt::ItemIsSelectable)) {
            ++headings;
            QVERIFY(categories.contains(list->item(row)->text()));
        }
    }
    QCOMPARE(headings, categories.size());
}

void tst_vel_gallery::choosesARadioGroupBoxByTheKeyboard()
{
    const auto window = openPage(s("radio-group-box"));
    window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window.get()));
    const auto *manual = child<VelRadioGroupBox>(*window, "manualBox");
    auto *none = child<VelRadioGroupBox>(*window, "noneBox");
    QVERIFY(manual->isChecked());
    // From the list by Tab through what is enabled.
    child<QListWidget>(*window, "pageList")->setFocus();
    for (int i = 0; i < 20 && window->focusWidget() != none; ++i)
        QTest::keyClick(window->focusWidget(), Qt::Key_Tab);
    QCOMPARE(window->focusWidget(), none);
    QTest::keyClick(none, Qt::Key_Space);
    QVERIFY(none->isChecked() && !manual->isChecked());
}

void tst_vel_gallery::editsTheSettingsFileOnApply()
{
    const QByteArray before("[Theme]\nflat=false\nfont=Sans\nother=kept\nsize=10\n");
    const QString file = write(s("rc"), before);
    const auto window = openPage(s("settings"), file);
    QCOMPARE(child<QLineEdit>(*window, "sectionEdit")->text(), s("Theme"));
    QCOMPARE(child<QLineEdit>(*window, "fontEdit")->text(), s("Sans"));
    QCOMPARE(child<QSpinBox>(*window, "sizeSpinBox")->value(), 10);
    QVERIFY(!child<QCheckBox>(*window, "flatCheckBox")->isChecked());

    child<QLineEdit>(*window, "sectionEdit")->setText(s("Other theme"));
    child<QLineEdit>(*window, "fontEdit")->setText(s("Sans Serif"));
    child<QSpinBox>(*window, "sizeSpinBox")->setValue(12);
    child<QCheckBox>(*window, "flatCheckBox")->setChecked(true);
    QCOMPARE(read(file), before);
    click(*window, QDialogButtonBox::Apply);
    const QByteArray after("[Other theme]\nflat=true\nfont=\"Sans Serif\"\nother=kept\nsize=12\n");
    QCOMPARE(read(file), after);
    QCOMPARE(child<QPlainTextEdit>(*window, "fileView")->toPlainText().toUtf8(), after);
}

void tst_vel_gallery::addsNoKeyUnasked()
{
    const QByteArray bytes("# comment\n[Theme]\nother=1\n");
    const QString file = write(s("rc"), bytes);
    const auto window = openPage(s("settings"), file);
    click(*window, QDialogButtonBox::Apply);
    QCOMPARE(read(file), bytes);
}

void tst_vel_gallery::takesBackEditsOnReset()
{
    const QByteArray bytes("[Theme]\nsize=10\n");
    const QString file = write(s("rc"), bytes);
    const auto window = openPage(s("settings"), file);
    child<QSpinBox>(*window, "sizeSpinBox")->setValue(12);
    click(*window, QDialogButtonBox::Reset);
    QCOMPARE(child<QSpinBox>(*window, "sizeSpinBox")->value(), 10);
    QCOMPARE(read(file), bytes);
}

void tst_vel_gallery::saysThatNoSettingsFileWasNamed()
{
    const auto window = openPage(s("settings"));
    QCOMPARE(child<QLabel>(*window, "stateLabel")->text(),
             s("Name a settings file on the command line to edit it here."));
    QVERIFY(!child<QDialogButtonBox>(*window, "buttonBox")->isEnabled());
    QVERIFY(!child<QLineEdit>(*window, "fontEdit")->isEnabled());
}

void tst_vel_gallery::saysThatTheSettingsFileCannotBeOpened()
{
    const auto window = openPage(s("settings"), path(s("none")));
    QCOMPARE(child<QLabel>(*window, "stateLabel")->text(), path(s("none")) + s(" cannot be opened."));
    QVERIFY(!child<QDialogButtonBox>(*window, "buttonBox")->isEnabled());
}

void tst_vel_gallery::givesAKeyThatIsNoActionsToTheUser()
{
    const auto textAfter = [](const GalleryWindow &window, Qt::Key key, Qt::KeyboardModifiers modifiers) {
        auto *editor = child<QPlainTextEdit>(window, "editor");
        editor->setPlainText(s("one\ntwo\n"));
        QTest::keyClick(editor, key, modifiers);
        return editor->toPlainText();
    };
    const Qt::KeyboardModifiers controlShift = Qt::ControlModifier | Qt::ShiftModifier;
    auto window = openPage(s("shortcuts"));
    QCOMPARE(textAfter(*window, Qt::Key_K, controlShift), s("two\n"));
    QCOMPARE(textAfter(*window, Qt::Key_F8, Qt::ShiftModifier), s("one\ntwo\n"));

    auto *model = child<ShortcutsModel>(*window, "shortcutsModel");
    IShortcutObject *key = model->hasKeySequence(QKeySequence(s("Ctrl+Shift+K")));
    QVERIFY(key);
    QCOMPARE(key->text(), s("Delete the whole line"));
    key->setKeySequence(QKeySequence(s("Shift+F8")));
    model->commitChanges();
    QCOMPARE(textAfter(*window, Qt::Key_F8, Qt::ShiftModifier), s("two\n"));
    QSettings settings(s("vel-gallery"), s("vel-gallery"));
    model->saveKeys(&settings, s("Shortcuts"));

    window = openPage(s("shortcuts"));
    QCOMPARE(textAfter(*window, Qt::Key_F8, Qt::ShiftModifier), s("two\n"));
    QCOMPARE(textAfter(*window, Qt::Key_K, controlShift), s("one\ntwo\n"));
    settings.clear();
}

void tst_vel_gallery::writesPicturesInEveryCombination()
{
    QProcess gallery;
    const QString pictures = path(s("new/pictures"));
    gallery.start(s(VEL_GALLERY), {s("--page"), s("radio-group-box"), s("--screenshots"), pictures});
    QVERIFY(gallery.waitForFinished());
    QCOMPARE(gallery.exitCode(), 0);
    QStringList expected;
    for (const char *palette : {"dark", "light"}) {
        for (const char *direction : {"ltr", "rtl"}) {
            for (const char *scale : {"1", "2"})
                expected.append(s("radio-group-box-%1-%2-%3.png").arg(s(palette), s(direction), s(scale)));
        }
    }
    QCOMPARE(QDir(pictures).entryList(QDir::Files, QDir::Name), expected);

    const QDir folder(pictures);
    const QImage light(folder.filePath(s("radio-group-box-light-ltr-1.png")));
    const QImage dark(folder.filePath(s("radio-group-box-dark-ltr-1.png")));
    const QImage mirrored(folder.filePath(s("radio-group-box-light-rtl-1.png")));
    const QImage large(folder.filePath(s("radio-group-box-light-ltr-2.png")));
    QVERIFY(light.pixelColor(2, 2).lightness() > 150);
    QVERIFY(dark.pixelColor(2, 2).lightness() < 100);
    QVERIFY(mirrored != light);
    QCOMPARE(large.size(), 2 * light.size());
}

void tst_vel_gallery::fitsOnASmallScreen()
{
    QProcess gallery;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    // The window would be 1375 pixels wide.
    environment.insert(s("QT_SCALE_FACTOR"), s("1.25"));
    gallery.setProcessEnvironment(environment);
    gallery.start(s(VEL_GALLERY), {s("--page"), s("radio-group-box")});
    QVERIFY(gallery.waitForStarted());
    // The window that was found may be another one by the time that it is asked.
    QByteArray geometry;
    const bool isKnown = QTest::qWaitFor(
        [&] {
            const QByteArray window =
                XDoTool::ask(s("search --sync --onlyvisible --pid %1").arg(gallery.processId()));
            geometry =
                XDoTool::ask(s("getwindowgeometry ") + QString::fromLatin1(window.split('\n').constLast()));
            return geometry.contains("Geometry");
        },
        20000);
    gallery.terminate();
    QVERIFY(isKnown);
    QVERIFY(gallery.waitForFinished());
    const QRegularExpressionMatch size =
        QRegularExpression(s("Geometry: (\\d+)x(\\d+)")).match(QString::fromLatin1(geometry));
    QVERIFY2(size.hasMatch(), geometry.constData());
    const QSize screen = QGuiApplication::primaryScreen()->size();
    QVERIFY2(size.captured(1).toInt() <= screen.width(), geometry.constData());
    QVERIFY2(size.captured(2).toInt() <= screen.height(), geometry.constData());
}

QProcessEnvironment tst_vel_gallery::withoutADisplay()
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(s("QT_QPA_PLATFORM"), s("xcb"));
    environment.remove(s("DISPLAY"));
    return environment;
}

void tst_vel_gallery::showsItsHelpWithoutADisplay()
{
    QProcess gallery;
    gallery.setProcessEnvironment(withoutADisplay());
    gallery.start(s(VEL_GALLERY), {s("--help")});
    QVERIFY(gallery.waitForFinished());
    QCOMPARE(gallery.exitCode(), 0);
    QCOMPARE(gallery.readAllStandardError(), QByteArray());
    QVERIFY(gallery.readAllStandardOutput().contains("--screenshots"));
}

void tst_vel_gallery::refusesAnUnknownOption_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<bool>("hasDisplay");
    QTest::newRow("alone") << QStringList{s("--nonsense")} << true;
    QTest::newRow("beside help, without a display") << QStringList{s("--help"), s("--nonsense")} << false;
}

void tst_vel_gallery::refusesAnUnknownOption()
{
    QFETCH(QStringList, arguments);
    QFETCH(bool, hasDisplay);
    QProcess gallery;
    if (!hasDisplay)
        gallery.setProcessEnvironment(withoutADisplay());
    gallery.start(s(VEL_GALLERY), arguments);
    QVERIFY(gallery.waitForFinished());
    QCOMPARE(gallery.exitCode(), 2);
    QCOMPARE(gallery.readAllStandardError(), QByteArray("vel-gallery: Unknown option 'nonsense'.\n"));
}

void tst_vel_gallery::failsForAPageThatDoesNotExist()
{
    QProcess gallery;
    gallery.start(s(VEL_GALLERY), {s("--page"), s("no-such-page")});
    QVERIFY(gallery.waitForFinished());
    QCOMPARE(gallery.exitCode(), 1);
    QCOMPARE(gallery.readAllStandardError(), QByteArray("vel-gallery: there is no page no-such-page\n"));
}

void tst_vel_gallery::failsWhenPicturesCannotBeWritten()
{
    const QString file = write(s("file"), "");
    QProcess gallery;
    gallery.start(s(VEL_GALLERY), {s("--screenshots"), file});
    QVERIFY(gallery.waitForFinished());
    QCOMPARE(gallery.exitCode(), 1);
    QVERIFY(gallery.readAllStandardError().startsWith("vel-gallery: cannot make the folder "));
    QCOMPARE(read(file), QByteArray());
}

void tst_vel_gallery::savesNoHalfOfATextToAFullDisk()
{
    const QString file = path(s("text"));
    QPlainTextEdit editor(s("More than the disk takes."));
    const auto commands = fileCommands();
    const auto save = std::find_if(commands.begin(), commands.end(), [](const EditorCommand &command) {
        return command.name == s("file-save");
    });
    QVERIFY(save != commands.end());
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        auto *const dialog = qobject_cast<QFileDialog *>(window);
        QVERIFY(dialog);
        dialog->findChild<QLineEdit *>()->setText(file);
        static_cast<QDialog *>(dialog)->accept();
    });
    modal.answer({QMessageBox::Warning, s("Save"), s("Cannot write %1.").arg(file), QMessageBox::Ok},
                 QMessageBox::Ok);
    // As on a full disk, no file can grow beyond some bytes.
    rlimit before = {};
    getrlimit(RLIMIT_FSIZE, &before);
    const rlimit small = {4, before.rlim_max};
    const auto handler = std::signal(SIGXFSZ, SIG_IGN);
    setrlimit(RLIMIT_FSIZE, &small);
    save->run(&editor);
    setrlimit(RLIMIT_FSIZE, &before);
    std::signal(SIGXFSZ, handler);
    QVERIFY(modal.finished());
    QVERIFY(!QFile::exists(file));
}

VEL_TEST_MAIN(tst_vel_gallery)

#include "tst_vel_gallery.moc"
