// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "EntrySamples.h"
#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/ActionListEdit.h>
#include <desktopentry/FormLayout.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>

#include <KIconButton>

#include <QCheckBox>
#include <QComboBox>
#include <QListWidget>
#include <QRadioButton>
#include <QScrollArea>
#include <QSignalSpy>
#include <QToolButton>

using namespace FormDriving;
using namespace VelUI;

/// What the form is made of, and its switches.
class tst_VelDesktopEntryPropsWidget : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void startsAsAnEmptyApplication();
    void hasTheRowsInTheirOrder();
    void namesTheListDialogs_data();
    void namesTheListDialogs();
    void namesTheActionDialogs();
    void asksForMimeTypesByExtension();
    void switchesToReadOnlyAndBack();
    void leavesTheFieldsWhenTheSwitchStandsThereAlready();
    void showsTheUrlButtonOnlyWhenAskedFor();
    void requestsInformationAboutTheUrl();
    void passesTheFrameStyleOn();
};

void tst_VelDesktopEntryPropsWidget::startsAsAnEmptyApplication()
{
    VelDesktopEntryPropsWidget form;
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QStringList types;
    for (int i = 0; i < typeBox(form)->count(); ++i) {
        types.append(typeBox(form)->itemData(i, Qt::UserRole).toString());
        QCOMPARE(typeBox(form)->itemText(i), types.constLast());
        QVERIFY(!typeBox(form)->itemIcon(i).isNull());
    }
    QCOMPARE(types, QStringList({application, link, directory}));
    for (const QLineEdit *line : form.findChildren<QLineEdit *>())
        QCOMPARE(line->text(), QString());
    for (const QCheckBox *box : form.findChildren<QCheckBox *>())
        QVERIFY(!box->isChecked());
    QVERIFY(child<QRadioButton>(&form, "onlyShowInButton")->isChecked());
    QVERIFY(!child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
    QVERIFY(form.findChild<QScrollArea *>());
}

void tst_VelDesktopEntryPropsWidget::hasTheRowsInTheirOrder()
{
    VelDesktopEntryPropsWidget form;
    auto *layout = form.findChild<FormLayout *>();
    QStringList rows;
    for (int row = 0; row < layout->rowCount(); ++row) {
        if (!layout->itemAtPosition(row, 0))
            continue;
        QWidget *left = layout->itemAtPosition(row, 0)->widget();
        auto *label = qobject_cast<QLabel *>(left);
        QLayoutItem *right = layout->itemAtPosition(row, 1);
        const QObject *field = right->widget() ? static_cast<QObject *>(right->widget()) : right->layout();
        rows.append((label ? label->text() : qobject_cast<QAbstractButton *>(left)->text()) + QLatin1Char(' ')
                    + QString::fromLatin1(field->metaObject()->className()));
        if (label && label->font().weight() == QFont::Bold)
            rows.last().append(QLatin1Char('*'));
    }
    const QStringList expected{
        QStringLiteral("Type: QComboBox"),
        QStringLiteral("Name: QLineEdit*"),
        QStringLiteral("Name [de]: QLineEdit"),
        QStringLiteral("Icon: VelUI::IconEdit"),
        QStringLiteral("Icon [de]: VelUI::IconEdit"),
        QStringLiteral("Exec: VelUI::PathEdit*"),
        QStringLiteral("Terminal QCheckBox"),
        QStringLiteral("Path: QLineEdit"),
        QStringLiteral("Try exec: VelUI::PathEdit"),
        QStringLiteral("Url: QHBoxLayout*"),
        QStringLiteral("Generic name: QLineEdit"),
        QStringLiteral("Generic name [de]: QLineEdit"),
        QStringLiteral("Comment: QLineEdit"),
        QStringLiteral("Comment [de]: QLineEdit"),
        QStringLiteral("No display QCheckBox"),
        QStringLiteral("Hidden QCheckBox"),
        QStringLiteral("Only show in VelUI::StringListEdit"),
        QStringLiteral("Not show in VelUI::StringListEdit"),
        QStringLiteral("MIME type: VelUI::StringListEdit"),
        QStringLiteral("Categories: VelUI::StringListEdit"),
        QStringLiteral("Keywords: VelUI::StringListEdit"),
        QStringLiteral("Keywords [de]: VelUI::StringListEdit"),
        QStringLiteral("Startup notify QCheckBox"),
        QStringLiteral("Startup WM class: QLineEdit"),
        QStringLiteral("Actions: VelUI::ActionListEdit"),
        QStringLiteral("Version: QLineEdit"),
    };
    QCOMPARE(rows, expected);
}

void tst_VelDesktopEntryPropsWidget::namesTheListDialogs_data()
{
    QTest::addColumn<QString>("field");
    QTest::addColumn<QStringList>("texts");
    const auto row = [](const char *field, std::initializer_list<const char *> texts) {
        QStringList list;
        for (const char *text : texts)
            list.append(QString::fromLatin1(text));
        QTest::newRow(field) << QString::fromLatin1(field) << list;
    };
    row("onlyShowInEdit",
        {"Only show in", "Only show in", "Add desktop environment:", "Only show in",
         "Edit desktop environment:"});
    row("notShowInEdit",
        {"Not show in", "Not show in", "Add desktop environment:", "Not show in",
         "Edit desktop environment:"});
    row("mimeTypeEdit",
        {"MIME type", "Add MIME type", "MIME type or file name extension:", "Edit MIME type",
         "MIME type or file name extension:"});
    row("categoriesEdit", {"Categories", "Add category", "Category:", "Edit category", "Category:"});
    row("keywordsEdit", {"Keywords", "Add keyword", "Keyword:", "Edit keyword", "Keyword:"});
    row("localKeywordsEdit", {"Keywords", "Add keyword", "Keyword:", "Edit keyword", "Keyword:"});
}

void tst_VelDesktopEntryPropsWidget::namesTheListDialogs()
{
    QFETCH(QString, field);
    QFETCH(QStringList, texts);
    VelDesktopEntryPropsWidget form;
    auto *list = form.findChild<StringListEdit *>(field);
    list->setStrings({QStringLiteral("a/b")});
    QString title;
    Prompt add;
    Prompt edit;
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        title = window->windowTitle();
        answerPrompt(modal, QString(), &add);
        click(child<QPushButton>(window, "addButton"));
        window->findChild<QListWidget *>()->setCurrentRow(0);
        answerPrompt(modal, QString(), &edit);
        click(child<QPushButton>(window, "editButton"));
        window->close();
    });
    list->editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(QStringList({title, add.title, add.label, edit.title, edit.label}), texts);
    QCOMPARE(edit.text, QStringLiteral("a/b"));
}

void tst_VelDesktopEntryPropsWidget::namesTheActionDialogs()
{
    VelDesktopEntryPropsWidget form;
    auto *list = child<ActionListEdit>(&form, "actionsEdit");
    list->setActions(ActionSamples::actions({"a"}));
    QStringList titles;
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        titles.append(window->windowTitle());
        const auto note = [&titles](QWidget *inner) {
            titles.append(inner->windowTitle());
            inner->close();
        };
        modal.handle(note);
        click(child<QPushButton>(window, "addButton"));
        window->findChild<QListWidget *>()->setCurrentRow(0);
        modal.handle(note);
        click(child<QPushButton>(window, "editButton"));
        window->close();
    });
    list->editActions();
    QVERIFY(modal.finished());
    QCOMPARE(titles,
             QStringList(
                 {QStringLiteral("Actions"), QStringLiteral("Add action"), QStringLiteral("Edit action")}));
}

void tst_VelDesktopEntryPropsWidget::asksForMimeTypesByExtension()
{
    VelDesktopEntryPropsWidget form;
    ModalDriver modal;
    modal.handle([&modal](QWidget *window) {
        answerPrompt(modal, QStringLiteral("png"));
        click(child<QPushButton>(window, "addButton"));
        answerPrompt(modal, QStringLiteral("x-odd/type"));
        click(child<QPushButton>(window, "addButton"));
        click(okButton(window));
    });
    child<StringListEdit>(&form, "mimeTypeEdit")->editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(child<StringListEdit>(&form, "mimeTypeEdit")->strings(),
             QStringList({QStringLiteral("image/png"), QStringLiteral("x-odd/type")}));
}

void tst_VelDesktopEntryPropsWidget::switchesToReadOnlyAndBack()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    form.show();
    for (const bool on : {true, false}) {
        form.setReadOnly(on);
        form.setReadOnly(on);
        QCOMPARE(typeBox(form)->isEnabled(), !on);
        for (const QLineEdit *line : form.findChildren<QLineEdit *>()) {
            const bool display = line->objectName().endsWith(QLatin1String("ListShow"));
            QCOMPARE(line->isReadOnly(), on || display);
        }
        for (const QCheckBox *box : form.findChildren<QCheckBox *>())
            QCOMPARE(box->isEnabled(), !on);
        for (const QRadioButton *button : form.findChildren<QRadioButton *>())
            QCOMPARE(button->isEnabled(), !on);
        for (const KIconButton *button : form.findChildren<KIconButton *>())
            QCOMPARE(button->isEnabled(), !on);
        for (const StringListEdit *list : form.findChildren<StringListEdit *>())
            QCOMPARE(list->findChild<QToolButton *>()->isVisible(), !on);
        for (const PathEdit *list : form.findChildren<PathEdit *>())
            QCOMPARE(list->findChild<QToolButton *>()->isVisible(), !on);
        QCOMPARE(child<QToolButton>(&form, "editActionsButton")->isVisible(), !on);
    }
    QVERIFY(!child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Full"));
}

void tst_VelDesktopEntryPropsWidget::leavesTheFieldsWhenTheSwitchStandsThereAlready()
{
    VelDesktopEntryPropsWidget form;
    form.setType(link, {});
    auto *name = child<QLineEdit>(&form, "nameEdit");
    name->setReadOnly(true);
    form.setReadOnly(false);
    QVERIFY(name->isReadOnly());
    auto *button = child<QToolButton>(&form, "urlInfoButton");
    button->setVisible(true);
    form.setShowURLInfoButton(false);
    QVERIFY(!button->isHidden());
}

void tst_VelDesktopEntryPropsWidget::showsTheUrlButtonOnlyWhenAskedFor()
{
    VelDesktopEntryPropsWidget form;
    form.show();
    auto *button = child<QToolButton>(&form, "urlInfoButton");
    QVERIFY(!button->isVisible());
    form.setType(link, {});
    QVERIFY(child<QLineEdit>(&form, "urlEdit")->isVisible());
    QVERIFY(!button->isVisible());
    form.setShowURLInfoButton(true);
    QVERIFY(button->isVisible());
    form.setShowURLInfoButton(true);
    QVERIFY(button->isVisible());
    form.setType(application, {});
    QVERIFY(!button->isVisible());
    form.setType(link, {});
    QVERIFY(button->isVisible());
    form.setShowURLInfoButton(false);
    QVERIFY(!button->isVisible());
}

void tst_VelDesktopEntryPropsWidget::requestsInformationAboutTheUrl()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::link()));
    form.setShowURLInfoButton(true);
    form.show();
    QSignalSpy requested(&form, &VelDesktopEntryPropsWidget::requestedURLInfo);
    click(child<QToolButton>(&form, "urlInfoButton"));
    QCOMPARE(requested.count(), 1);
    QCOMPARE(requested.first().first().toString(), QStringLiteral("https://www.freedesktop.org"));
}

void tst_VelDesktopEntryPropsWidget::passesTheFrameStyleOn()
{
    VelDesktopEntryPropsWidget form;
    form.setFrameStyle(QFrame::Box | QFrame::Plain);
    QCOMPARE(form.findChild<QScrollArea *>()->frameStyle(), QFrame::Box | QFrame::Plain);
}

VEL_TEST_MAIN(tst_VelDesktopEntryPropsWidget)

#include "tst_VelDesktopEntryPropsWidget.moc"
