// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// previous_host VERSION: an application that derives from exported classes and keeps fields of its
// own behind theirs. It ends with 0 when it runs with the build of that version and all works.

#include <EditShortcutsDialog.h>
#include <ShortcutsModel.h>
#include <VelDesktopEntryEditDialog.h>
#include <VelMenuDialog.h>
#include <VelMenuView.h>
#include <VelRadioGroupBox.h>
#include <VelSettings.h>

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QSettings>
#include <QShortcut>
#include <QTemporaryDir>
#include <QTest>

#include <dlfcn.h>

#include <cstdio>

namespace {

int failures = 0;

void check(bool right, const char *what)
{
    if (!right) {
        ++failures;
        std::fprintf(stderr, "previous_host: %s\n", what);
    }
}

// Fields of the application lie right behind those of the library: they must not be written over.
template <typename Base>
class Derived : public Base
{
public:
    using Base::Base;

    quint64 before = 0x0123456789abcdef;
    QString own = QStringLiteral("mine");
    int events = 0;

    bool isWhole() const { return before == 0x0123456789abcdef && own == QLatin1String("mine"); }

protected:
    bool event(QEvent *event) override
    {
        ++events;
        return Base::event(event);
    }
};

const char *versionOfLibrary()
{
    using Function = const char *(*)();
    const auto added = reinterpret_cast<Function>(dlsym(RTLD_DEFAULT, "velAddedInTheNextBuild"));
    return added ? added() : "1.0";
}

void write(const QString &path, const QByteArray &content)
{
    QFile file(path);
    check(file.open(QIODevice::WriteOnly) && file.write(content) == content.size(), "cannot write a file");
}

void useRadioGroupBox()
{
    QWidget window;
    auto *first = new Derived<VelRadioGroupBox>(QStringLiteral("First"), &window);
    auto *second = new Derived<VelRadioGroupBox>(QStringLiteral("Second"), &window);
    first->setChecked(true);
    window.show();
    QTest::keyClick(second, Qt::Key_Space);
    check(second->isChecked() && !first->isChecked(), "the space key does not check the second box");
    check(first->isWhole() && second->isWhole() && second->events > 0,
          "the boxes wrote over the host's fields");
}

void useMenu(const QString &folder)
{
    Derived<VelMenuDialog> dialog(folder, 22, true, true);
    dialog.show();
    auto *view = dialog.findChild<VelMenuView *>();
    check(view != nullptr, "the menu dialog has no view");
    const bool listed =
        QTest::qWaitFor([view] { return view && view->model()->rowCount(view->rootIndex()) == 1; });
    check(listed, "the menu dialog does not list the entry");
    Derived<VelMenuView> own(folder, 16, false, nullptr);
    check(own.menuDir() == folder, "the view does not know its directory");
    check(dialog.isWhole() && own.isWhole(), "the menu wrote over the host's fields");
}

void useEntryDialog(const QString &path)
{
    Derived<VelDesktopEntryEditDialog> dialog;
    check(dialog.setDesktopEntryPath(path, false), "the entry cannot be read");
    dialog.show();
    check(dialog.windowTitle().contains(path), "the entry dialog does not show its file");
    check(dialog.isWhole() && dialog.events > 0, "the entry dialog wrote over the host's fields");
}

void useShortcuts(const QString &file)
{
    QSettings settings(file, QSettings::IniFormat);
    QWidget window;
    QShortcut shortcut(QKeySequence(Qt::CTRL | Qt::Key_K), &window);
    Derived<ShortcutsModel> model(&settings, QStringLiteral("Keys"));
    model.registerShortcut(QStringLiteral("Group"), &shortcut, QStringLiteral("Cut"), QStringLiteral("Cut"));
    Derived<EditShortcutsDialog> dialog(&model);
    dialog.show();
    check(model.rowCount() == 1, "the model does not hold the shortcut");
    check(model.isWhole() && dialog.isWhole(), "the shortcuts wrote over the host's fields");
}

void useSettings(const QString &file)
{
    write(file, "[Counter]\nRuns=41\n");
    VelSettings settings(file);
    check(settings.isParsed() && settings.value(QStringLiteral("Runs"), 0).toInt() == 41,
          "the settings are not read");
}

} // namespace

int main(int argc, char **argv)
{
    const QTemporaryDir folder;
    qputenv("HOME", QFile::encodeName(folder.path()));
    qputenv("XDG_CONFIG_HOME", QFile::encodeName(folder.path()));
    QApplication application(argc, argv);
    check(argc == 2 && qstrcmp(versionOfLibrary(), argv[1]) == 0, "runs with another build than asked for");

    const QString menu = folder.filePath(QStringLiteral("menu"));
    QDir().mkpath(menu);
    write(menu + QStringLiteral("/one.desktop"), "[Desktop Entry]\nType=Application\nName=One\nExec=true\n");
    useRadioGroupBox();
    useMenu(menu);
    useEntryDialog(menu + QStringLiteral("/one.desktop"));
    useShortcuts(folder.filePath(QStringLiteral("keys.ini")));
    useSettings(folder.filePath(QStringLiteral("counter")));
    return failures == 0 ? 0 : 1;
}
