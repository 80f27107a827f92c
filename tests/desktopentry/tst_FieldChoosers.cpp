// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"
#include "XDoTool.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>

#include <QMenu>
#include <QScrollArea>
#include <QScrollBar>
#include <QSignalSpy>
#include <QToolButton>
#include <QTreeView>

using namespace FormDriving;
using VelUI::PathEdit;
using VelUI::StringListEdit;

namespace {

constexpr int Patience = 20000;

// An assisted form on the screen.
class OpenForm
{
public:
    explicit OpenForm(const VelUIDesktopEntry &entry = VelUIDesktopEntry())
        : form(new VelDesktopEntryPropsWidget)
    {
        form->setAssistance(true);
        form->loadFrom(entry);
        form->resize(640, 720);
        form->show();
        isActive = QTest::qWaitForWindowActive(form, Patience);
    }
    ~OpenForm() { delete form; }

    QToolButton *button(const char *key) const
    {
        return child<QToolButton>(form, QByteArray(QByteArray("chooseButton_") + key).constData());
    }
    QLineEdit *line(const char *field) const { return child<QWidget>(form, field)->findChild<QLineEdit *>(); }

    const QPointer<VelDesktopEntryPropsWidget> form;
    bool isActive = false;
};

// The next window is a chooser: types \a words, checks what stands first, and presses Return.
void chooseFirst(ModalDriver &modal, const QString &keys, const QString &first)
{
    modal.handle([keys, first](QWidget *window) {
        QVERIFY(QTest::qWaitForWindowActive(window, Patience));
        auto *view = child<QTreeView>(window, "choiceView");
        XDoTool::run(QStringLiteral("key ") + keys);
        QTRY_COMPARE_WITH_TIMEOUT(view->model()->index(0, 0).data().toString(), first, Patience);
        XDoTool::run(QStringLiteral("key Down space Return"));
        QTRY_VERIFY_WITH_TIMEOUT(!window->isVisible(), Patience);
    });
}

// The names of the buttons that are shown, a "-" behind those that are disabled.
QStringList namesOfButtons(const QWidget *form)
{
    QStringList names;
    for (const QToolButton *button : form->findChildren<QToolButton *>()) {
        const QString object = button->objectName();
        if (button->isVisibleTo(form)
            && (object.startsWith(QLatin1String("chooseButton_"))
                || object == QLatin1String("fieldCodeButton")))
            names.append(button->accessibleName() + (button->isEnabled() ? QString() : QStringLiteral("-")));
    }
    names.sort();
    return names;
}

const QStringList ButtonsOfApplications{
    QStringLiteral("Choose Categories"),   QStringLiteral("Choose Exec"),
    QStringLiteral("Choose MIME type"),    QStringLiteral("Choose Not show in-"),
    QStringLiteral("Choose Only show in"), QStringLiteral("Choose Try exec"),
    QStringLiteral("Insert a field code"),
};

} // namespace

/// The buttons of the assisted form that choose the value of a field.
class tst_FieldChoosers : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void areThereWithAssistanceAlone();
    void leaveTheOtherFieldsTheirRoom();
    void followTheTypeOfTheEntry();
    void followTheChosenListOfDesktops();
    void areGoneWhileTheFormIsReadOnly();
    void chooseCategoriesByTheKeyboardAlone();
    void chooseAMimeTypeByTheMouse();
    void stayInViewWhenTheyWereClicked();
    void chooseADesktop();
    void changeNothingWhenCanceled();
    void changeNothingWhenTheSameIsChosen();
    void insertAFieldCodeAtTheCursor();
    void keepTheCommandThatTheTabKeySelected();
    void putAProgramInTheCommand();
    void nameTheProgramToTry();
    void surviveTheForm();
    void surviveTheEndOfAssistance();

private:
    void useProgram(const QString &name);
};

void tst_FieldChoosers::useProgram(const QString &name)
{
    QVERIFY(QFile::setPermissions(write(name, "#!/bin/sh\n"), QFile::ReadOwner | QFile::ExeOwner));
    qputenv("PATH", qgetenv("PATH") + ':' + QFile::encodeName(folder()));
}

void tst_FieldChoosers::areThereWithAssistanceAlone()
{
    VelDesktopEntryPropsWidget form;
    QCOMPARE(namesOfButtons(&form), QStringList());
    form.setAssistance(true);
    QCOMPARE(namesOfButtons(&form), ButtonsOfApplications);
    form.setAssistance(false);
    QCOMPARE(namesOfButtons(&form), QStringList());
    form.setAssistance(true);
    QCOMPARE(namesOfButtons(&form), ButtonsOfApplications);
}

void tst_FieldChoosers::leaveTheOtherFieldsTheirRoom()
{
    const OpenForm open;
    QVERIFY(open.isActive);
    const auto end = [&open](const QWidget *widget) {
        return widget->mapTo(open.form, widget->rect().bottomRight()).x();
    };
    QTRY_COMPARE_WITH_TIMEOUT(end(child<QWidget>(open.form, "nameEdit")), end(open.button("TryExec")),
                              Patience);
    QCOMPARE(end(child<QToolButton>(open.form, "fieldCodeButton")), end(open.button("TryExec")));
    QVERIFY(end(child<QWidget>(open.form, "tryExecEdit")) < end(open.button("TryExec")));
}

void tst_FieldChoosers::followTheTypeOfTheEntry()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.setType(link, {});
    QCOMPARE(namesOfButtons(&form),
             (QStringList{QStringLiteral("Choose Not show in-"), QStringLiteral("Choose Only show in")}));
    form.setType(application, {});
    QCOMPARE(namesOfButtons(&form), ButtonsOfApplications);
}

void tst_FieldChoosers::followTheChosenListOfDesktops()
{
    const OpenForm open;
    child<QAbstractButton>(open.form, "notShowInButton")->click();
    QVERIFY(!open.button("OnlyShowIn")->isEnabled());
    QVERIFY(open.button("NotShowIn")->isEnabled());
}

void tst_FieldChoosers::areGoneWhileTheFormIsReadOnly()
{
    const OpenForm open;
    open.form->setReadOnly(true);
    QCOMPARE(namesOfButtons(open.form), QStringList());
    // Nor does the keyboard reach them.
    open.line("categoriesEdit")->setFocus();
    QTest::keyClick(open.line("categoriesEdit"), Qt::Key_Down, Qt::AltModifier);
    open.form->setAssistance(false);
    open.form->setAssistance(true);
    QCOMPARE(namesOfButtons(open.form), QStringList());
    open.form->setReadOnly(false);
    QCOMPARE(namesOfButtons(open.form), ButtonsOfApplications);
}

void tst_FieldChoosers::chooseCategoriesByTheKeyboardAlone()
{
    const OpenForm open;
    QVERIFY(open.isActive);
    open.form->loadFrom(entry("[Desktop Entry]\nType=Application\nName=x\nExec=x\nCategories=X-Mine;Qt;\n"));
    auto *field = child<StringListEdit>(open.form, "categoriesEdit");
    QSignalSpy changed(open.form, &VelDesktopEntryPropsWidget::changed);
    field->setFocus();
    QTRY_VERIFY_WITH_TIMEOUT(open.line("categoriesEdit")->hasFocus(), Patience);
    ModalDriver modal;
    chooseFirst(modal, QStringLiteral("g a m e s"), QStringLiteral("Games"));
    XDoTool::run(QStringLiteral("key alt+Down"));
    QTRY_COMPARE_WITH_TIMEOUT(changed.count(), 1, Patience);
    chooseFirst(modal, QStringLiteral("C a r d G a m e"), QStringLiteral("Card games"));
    // Past the button that edits the list.
    XDoTool::run(QStringLiteral("key Tab Tab space"));
    QTRY_COMPARE_WITH_TIMEOUT(changed.count(), 2, Patience);
    QVERIFY(modal.finished());
    QCOMPARE(field->strings(),
             (QStringList{QStringLiteral("X-Mine"), QStringLiteral("Qt"), QStringLiteral("Game"),
                          QStringLiteral("CardGame")}));
    VelUIDesktopEntry record =
        entry("[Desktop Entry]\nType=Application\nName=x\nExec=x\nCategories=X-Mine;Qt;\n");
    open.form->saveTo(&record);
    QCOMPARE(saved(record),
             QByteArray("[Desktop Entry]\nType=Application\nName=x\nExec=x\n"
                        "Categories=X-Mine;Qt;Game;CardGame;\n"));
}

void tst_FieldChoosers::chooseAMimeTypeByTheMouse()
{
    // Of which nothing is to be said that would move the rows.
    const OpenForm open(entry("[Desktop Entry]\nType=Application\nName=x\nExec=true\nCategories=Utility;\n"));
    QVERIFY(open.isActive);
    auto *field = child<StringListEdit>(open.form, "mimeTypeEdit");
    QSignalSpy changed(open.form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QVERIFY(QTest::qWaitForWindowActive(window, Patience));
        auto *view = child<QTreeView>(window, "choiceView");
        XDoTool::run(QStringLiteral("key i m a g e slash p n g"));
        QTRY_COMPARE_WITH_TIMEOUT(view->model()->rowCount(), 1, Patience);
        XDoTool::click(view->viewport(), view->visualRect(view->model()->index(0, 1)).center());
        QTRY_COMPARE_WITH_TIMEOUT(view->model()->index(0, 0).data(Qt::CheckStateRole).toInt(),
                                  int(Qt::Checked), Patience);
        XDoTool::click(okButton(window));
        QTRY_VERIFY_WITH_TIMEOUT(!window->isVisible(), Patience);
    });
    field->setFocus(); // brings it into view
    QTRY_VERIFY_WITH_TIMEOUT(!open.button("MimeType")->visibleRegion().isEmpty(), Patience);
    XDoTool::click(open.button("MimeType"));
    QTRY_COMPARE_WITH_TIMEOUT(changed.count(), 1, Patience);
    QVERIFY(modal.finished());
    QCOMPARE(field->strings(), QStringList(QStringLiteral("image/png")));
}

void tst_FieldChoosers::stayInViewWhenTheyWereClicked()
{
    const OpenForm open(entry("[Desktop Entry]\nType=Application\nName=x\nExec=true\nCategories=Utility;\n"));
    QVERIFY(open.isActive);
    open.form->setFocus();
    auto *area = child<QScrollArea>(open.form, "scrollArea");
    QToolButton *const chooser = open.button("MimeType");
    open.form->resize(open.form->width(), 250); // too little for all rows
    QTRY_VERIFY_WITH_TIMEOUT(area->verticalScrollBar()->maximum() > 0, Patience);
    area->ensureWidgetVisible(chooser);
    QTRY_VERIFY_WITH_TIMEOUT(!chooser->visibleRegion().isEmpty(), Patience);
    const int scrolled = area->verticalScrollBar()->value();
    QVERIFY(scrolled > 0);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QVERIFY(QTest::qWaitForWindowActive(window, Patience));
        XDoTool::run(QStringLiteral("key Escape"));
        QTRY_VERIFY_WITH_TIMEOUT(!window->isVisible(), Patience);
    });
    XDoTool::click(chooser);
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), Patience);
    QTRY_VERIFY_WITH_TIMEOUT(chooser->hasFocus(), Patience);
    QCOMPARE(area->verticalScrollBar()->value(), scrolled);
}

void tst_FieldChoosers::chooseADesktop()
{
    const OpenForm open;
    QVERIFY(open.isActive);
    auto *field = child<StringListEdit>(open.form, "onlyShowInEdit");
    ModalDriver modal;
    chooseFirst(modal, QStringLiteral("l x q t"), QStringLiteral("LXQt"));
    open.button("OnlyShowIn")->click();
    QVERIFY(modal.finished());
    QCOMPARE(field->strings(), QStringList(QStringLiteral("LXQt")));
}

void tst_FieldChoosers::changeNothingWhenCanceled()
{
    const OpenForm open;
    QSignalSpy changed(open.form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    for (const char *key : {"Exec", "TryExec", "MimeType", "Categories", "OnlyShowIn"}) {
        modal.handle([](QWidget *window) { click(cancelButton(window)); });
        open.button(key)->click();
    }
    QVERIFY(modal.finished());
    QCOMPARE(changed.count(), 0);
}

void tst_FieldChoosers::changeNothingWhenTheSameIsChosen()
{
    const OpenForm open;
    auto *field = child<StringListEdit>(open.form, "categoriesEdit");
    const QStringList odd{QStringLiteral("b"), QStringLiteral("a"), QStringLiteral("b")};
    field->setStrings(odd);
    QSignalSpy changed(open.form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) { click(okButton(window)); });
    open.button("Categories")->click();
    QVERIFY(modal.finished());
    QCOMPARE(changed.count(), 0);
    QCOMPARE(field->strings(), odd);
}

void tst_FieldChoosers::insertAFieldCodeAtTheCursor()
{
    const OpenForm open;
    QVERIFY(open.isActive);
    auto *line = open.line("execEdit");
    line->setText(QStringLiteral("viewer  --full"));
    line->setFocus();
    line->setCursorPosition(7);
    QSignalSpy edited(line, &QLineEdit::textEdited);
    ModalDriver modal;
    modal.handle([](QWidget *menu) {
        QVERIFY(qobject_cast<QMenu *>(menu));
        XDoTool::run(QStringLiteral("key Down Down Return"));
        QTRY_VERIFY_WITH_TIMEOUT(!menu->isVisible(), Patience);
    });
    // The button that looks for a file, and the one that chooses a program lie between.
    XDoTool::run(QStringLiteral("key Tab Tab Tab space"));
    QTRY_COMPARE_WITH_TIMEOUT(line->text(), QStringLiteral("viewer %F --full"), Patience);
    QVERIFY(modal.finished());
    QCOMPARE(edited.count(), 1);
    QTRY_VERIFY_WITH_TIMEOUT(line->hasFocus(), Patience);
    QCOMPARE(line->cursorPosition(), 9);
    line->undo();
    QCOMPARE(line->text(), QStringLiteral("viewer  --full"));
}

void tst_FieldChoosers::keepTheCommandThatTheTabKeySelected()
{
    const OpenForm open;
    auto *line = open.line("execEdit");
    line->setText(QStringLiteral("viewer"));
    line->selectAll();
    const QList<QAction *> actions = child<QToolButton>(open.form, "fieldCodeButton")->menu()->actions();
    actions.first()->trigger();
    QCOMPARE(line->text(), QStringLiteral("viewer %f"));
    line->setSelection(7, 2);
    actions.at(3)->trigger();
    QCOMPARE(line->text(), QStringLiteral("viewer %U"));
}

void tst_FieldChoosers::putAProgramInTheCommand()
{
    useProgram(QStringLiteral("my viewer"));
    const OpenForm open;
    QVERIFY(open.isActive);
    auto *field = child<PathEdit>(open.form, "execEdit");
    field->setText(QStringLiteral("viewer --full %f"));
    QSignalSpy edited(open.line("execEdit"), &QLineEdit::textEdited);
    ModalDriver modal;
    chooseFirst(modal, QStringLiteral("m y space v i e w e r"), QStringLiteral("my viewer"));
    open.button("Exec")->click();
    QVERIFY(modal.finished());
    QCOMPARE(field->text(), QStringLiteral("\"my viewer\" --full %f"));
    QCOMPARE(edited.count(), 1);
}

void tst_FieldChoosers::nameTheProgramToTry()
{
    useProgram(QStringLiteral("my viewer"));
    const OpenForm open;
    QVERIFY(open.isActive);
    auto *field = child<PathEdit>(open.form, "tryExecEdit");
    field->setText(QStringLiteral("old"));
    ModalDriver modal;
    chooseFirst(modal, QStringLiteral("m y space v i e w e r"), QStringLiteral("my viewer"));
    open.button("TryExec")->click();
    QVERIFY(modal.finished());
    QCOMPARE(field->text(), QStringLiteral("my viewer"));
}

void tst_FieldChoosers::surviveTheForm()
{
    for (const char *key : {"Exec", "MimeType", "Categories", "OnlyShowIn"}) {
        const OpenForm open;
        ModalDriver modal;
        modal.handle([&open](QWidget *) { delete open.form; });
        open.button(key)->click();
        QVERIFY(modal.finished());
        QVERIFY(!open.form);
    }
}

void tst_FieldChoosers::surviveTheEndOfAssistance()
{
    const OpenForm open;
    ModalDriver modal;
    modal.handle([&open](QWidget *window) {
        open.form->setAssistance(false);
        child<QLineEdit>(window, "filterEdit")->setText(QStringLiteral("lxqt"));
        auto *view = child<QTreeView>(window, "choiceView");
        QVERIFY(view->model()->setData(view->model()->index(0, 0), Qt::Checked, Qt::CheckStateRole));
        click(okButton(window));
    });
    open.button("OnlyShowIn")->click();
    QVERIFY(modal.finished());
    QCOMPARE(child<StringListEdit>(open.form, "onlyShowInEdit")->strings(),
             QStringList(QStringLiteral("LXQt")));
}

VEL_TEST_MAIN(tst_FieldChoosers)

#include "tst_FieldChoosers.moc"
