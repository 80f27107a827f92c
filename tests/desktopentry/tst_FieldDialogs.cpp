// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>

#include <QComboBox>
#include <QListWidget>
#include <QMenu>
#include <QSettings>
#include <QToolButton>

using namespace FormDriving;

namespace {

const QByteArray Contents = "[Desktop Entry]\nType=Application\nName=x\nExec=x\nKeywords=a;\nActions=one;\n"
                            "[Desktop Action one]\nName=One\nExec=one\n";

// The next window: notes its size, takes another one, and does the rest.
void resize(
    ModalDriver &modal, QSize *found, const QSize &size,
    const std::function<void(QWidget *)> &act = [](QWidget *window) { click(cancelButton(window)); })
{
    modal.handle([found, size, act](QWidget *window) {
        *found = window->size();
        window->resize(size);
        QTRY_COMPARE(window->size(), size);
        act(window);
    });
}

void editFirstAction(QWidget *window)
{
    auto *list = window->findChild<QListWidget *>();
    list->setCurrentRow(0);
    child<QPushButton>(window, "editButton")->click();
    click(cancelButton(window));
}

} // namespace

/// The dialogs of the assisted form's fields: the sizes that they remember, and their choosers.
class tst_FieldDialogs : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void haveThePlainSizesWithoutAssistance();
    void rememberTheirSizesWithAssistance();
    void keepTheirSizesFromOneFormToTheNext();
    void rememberTheirSizesInAnotherLanguage();
    void giveChoosersToTheFieldsOfAnAction_data();
    void giveChoosersToTheFieldsOfAnAction();
    void doNotHoldTheFormThatGoes();

private:
    struct Sizes
    {
        QSize list;
        QSize actions;
        QSize action;
    };
    Sizes openAll(bool assistance, const Sizes &next);
};

// Opens the dialogs of a list, of the actions and of one action, and gives them other sizes.
tst_FieldDialogs::Sizes tst_FieldDialogs::openAll(bool assistance, const Sizes &next)
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(assistance);
    form.loadFrom(entry(Contents));
    form.show();
    Sizes found;
    ModalDriver modal;
    resize(modal, &found.list, next.list);
    child<QWidget>(&form, "keywordsEdit")->findChild<QToolButton *>()->click();
    resize(modal, &found.actions, next.actions, editFirstAction);
    resize(modal, &found.action, next.action);
    child<QWidget>(&form, "actionsEdit")->findChild<QToolButton *>()->click();
    if (!modal.finished())
        QTest::qFail("not every dialog opened", __FILE__, __LINE__);
    return found;
}

void tst_FieldDialogs::haveThePlainSizesWithoutAssistance()
{
    const Sizes other{{500, 350}, {510, 360}, {520, 470}};
    const Sizes first = openAll(false, other);
    QCOMPARE(first.list, QSize(400, 300));
    QCOMPARE(first.actions, QSize(400, 300));
    const Sizes second = openAll(false, other);
    QCOMPARE(second.list, first.list);
    QCOMPARE(second.actions, first.actions);
    QCOMPARE(second.action, first.action);
    QVERIFY(QSettings().allKeys().isEmpty());
}

void tst_FieldDialogs::rememberTheirSizesWithAssistance()
{
    const Sizes plain = openAll(false, {{500, 350}, {510, 360}, {520, 470}});
    const Sizes first = openAll(true, {{530, 380}, {540, 390}, {550, 500}});
    QCOMPARE(first.list, plain.list);
    QCOMPARE(first.actions, plain.actions);
    QVERIFY(first.action.width() > plain.action.width()); // of the buttons
    QCOMPARE(first.action.height(), plain.action.height());
    const Sizes second = openAll(true, {{400, 300}, {400, 300}, {550, 500}});
    QCOMPARE(second.list, QSize(530, 380));
    QCOMPARE(second.actions, QSize(540, 390));
    QCOMPARE(second.action, QSize(550, 500));
}

void tst_FieldDialogs::keepTheirSizesFromOneFormToTheNext()
{
    QSettings().setValue(QStringLiteral("EditStringsDialog/Width"), 444);
    QSettings().setValue(QStringLiteral("EditStringsDialog/Height"), 333);
    QCOMPARE(openAll(true, {{400, 300}, {400, 300}, {550, 500}}).list, QSize(444, 333));
    QCOMPARE(openAll(false, {{410, 310}, {400, 300}, {550, 500}}).list, QSize(400, 300));
    QCOMPARE(QSettings().value(QStringLiteral("EditStringsDialog/Width")).toInt(), 400);
}

void tst_FieldDialogs::rememberTheirSizesInAnotherLanguage()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=x\nExec=x\nKeywords[ja]=b;\n"));
    form.show();
    auto *languages = child<QComboBox>(&form, "languageBox");
    languages->setCurrentIndex(languages->findData(QStringLiteral("ja")));
    QSize found;
    for (const QSize &size : {QSize(600, 400), QSize(500, 400)}) {
        ModalDriver modal;
        resize(modal, &found, size);
        child<QWidget>(&form, "otherKeywordsEdit")->findChild<QToolButton *>()->click();
        QVERIFY(modal.finished());
    }
    QCOMPARE(found, QSize(600, 400));
}

void tst_FieldDialogs::giveChoosersToTheFieldsOfAnAction_data()
{
    QTest::addColumn<bool>("assistance");
    QTest::addColumn<QString>("tabs");
    QTest::newRow("plain") << false << "lineEdit selectPathButton buttonBox";
    QTest::newRow("assisted") << true
                              << "lineEdit selectPathButton chooseButton_Exec fieldCodeButton buttonBox";
}

void tst_FieldDialogs::giveChoosersToTheFieldsOfAnAction()
{
    QFETCH(bool, assistance);
    QFETCH(QString, tabs);
    VelDesktopEntryPropsWidget form;
    form.setAssistance(assistance);
    form.loadFrom(entry(Contents));
    form.show();
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *list = window->findChild<QListWidget *>();
        list->setCurrentRow(0);
        child<QPushButton>(window, "editButton")->click();
        click(okButton(window)->isEnabled() ? okButton(window) : cancelButton(window));
    });
    QStringList reached;
    modal.handle([&reached, assistance](QWidget *window) {
        QVERIFY(QTest::qWaitForWindowActive(window));
        child<QWidget>(window, "execEdit")->setFocus();
        do {
            reached.append(window->focusWidget()->objectName());
            QTest::keyClick(window->focusWidget(), Qt::Key_Tab);
        } while (!qobject_cast<QPushButton *>(window->focusWidget()) && reached.size() < 9);
        reached.append(window->focusWidget()->parentWidget()->objectName());
        QCOMPARE(window->findChild<QWidget *>(QStringLiteral("chooseButton_OnlyShowIn")) != nullptr,
                 assistance);
        QCOMPARE(window->findChild<QWidget *>(QStringLiteral("chooseButton_NotShowIn")) != nullptr,
                 assistance);
        if (assistance)
            child<QToolButton>(window, "fieldCodeButton")->menu()->actions().first()->trigger();
        click(assistance ? okButton(window) : cancelButton(window));
    });
    child<QWidget>(&form, "actionsEdit")->findChild<QToolButton *>()->click();
    QVERIFY(modal.finished());
    QCOMPARE(reached.join(QLatin1Char(' ')), tabs);
    VelUIDesktopEntry record = entry(Contents);
    form.saveTo(&record);
    QCOMPARE(record.getActions().first().getExec(),
             assistance ? QStringLiteral("one %f") : QStringLiteral("one"));
}

void tst_FieldDialogs::doNotHoldTheFormThatGoes()
{
    auto *form = new VelDesktopEntryPropsWidget;
    form->setAssistance(true);
    ModalDriver modal;
    modal.handle([form](QWidget *) { delete form; });
    child<QWidget>(form, "keywordsEdit")->findChild<QToolButton *>()->click();
    QVERIFY(modal.finished());
}

VEL_TEST_MAIN(tst_FieldDialogs)

#include "tst_FieldDialogs.moc"
