// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/EditStringsDialog.h>
#include <desktopentry/StringListEdit.h>

#include <QHBoxLayout>
#include <QListWidget>
#include <QSignalSpy>
#include <QToolButton>

using namespace FormDriving;
using VelUI::EditStringsDialog;
using VelUI::StringListEdit;

namespace {

QString answerX(QWidget *, const QString &, const QString &, QLineEdit::EchoMode, const QString &)
{
    return QStringLiteral("x");
}

QLineEdit *display(const StringListEdit &edit)
{
    return child<QLineEdit>(&edit, "stringListShow");
}

} // namespace

class tst_StringListEdit : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void looksLikeItsForm();
    void showsTheListAsAnEntryWritesIt_data();
    void showsTheListAsAnEntryWritesIt();
    void isReadOnlyAgainAfterEverySetting();
    void clearsWithoutASignal();
    void hidesTheButtonWhenReadOnly();
    void takesTheAcceptedList();
    void keepsTheListWhenCanceled();
    void namesTheDialogByTheTitle();
    void givesItsTextsToTheDialog_data();
    void givesItsTextsToTheDialog();
    void leavesTheTextsOfTheDialogWithoutOwn();
    void givesItsFunctionToTheDialog();
    void survivesItsDeletionBehindTheDialog();
};

void tst_StringListEdit::looksLikeItsForm()
{
    StringListEdit edit;
    QCOMPARE(edit.objectName(), QStringLiteral("StringListEdit"));
    QCOMPARE(edit.windowTitle(), QStringLiteral("Form"));
    QCOMPARE(edit.size(), QSize(571, 32));
    auto *layout = qobject_cast<QHBoxLayout *>(edit.layout());
    QVERIFY(layout);
    QCOMPARE(layout->objectName(), QStringLiteral("horizontalLayout"));
    QCOMPARE(layout->contentsMargins(), QMargins());
    QCOMPARE(layout->itemAt(0)->widget(), display(edit));
    QVERIFY(display(edit)->isReadOnly());
    auto *button = child<QToolButton>(&edit, "editStringsButton");
    QCOMPARE(layout->itemAt(1)->widget(), button);
    QCOMPARE(button->text(), QStringLiteral("..."));
    QCOMPARE(button->sizePolicy().horizontalPolicy(), QSizePolicy::Fixed);
    QCOMPARE(button->sizePolicy().verticalPolicy(), QSizePolicy::Preferred);
}

void tst_StringListEdit::showsTheListAsAnEntryWritesIt_data()
{
    QTest::addColumn<QStringList>("strings");
    QTest::addColumn<QString>("shown");
    QTest::newRow("empty") << QStringList() << QString();
    QTest::newRow("one") << QStringList{QStringLiteral("x")} << QStringLiteral("x;");
    QTest::newRow("two") << QStringList{QStringLiteral("a"), QStringLiteral("b")} << QStringLiteral("a;b;");
    QTest::newRow("an empty item") << QStringList{QString()} << QStringLiteral(";");
    const QString big(40000, QLatin1Char('m'));
    QTest::newRow("long") << QStringList{big} << big + QLatin1Char(';');
}

void tst_StringListEdit::showsTheListAsAnEntryWritesIt()
{
    QFETCH(QStringList, strings);
    QFETCH(QString, shown);
    StringListEdit edit;
    QSignalSpy changed(&edit, &StringListEdit::changed);
    edit.setStrings({QStringLiteral("before")});
    edit.setStrings(strings);
    QCOMPARE(edit.strings(), strings);
    QCOMPARE(display(edit)->text(), shown);
    QCOMPARE(changed.count(), 0);
}

void tst_StringListEdit::isReadOnlyAgainAfterEverySetting()
{
    StringListEdit edit;
    display(edit)->setReadOnly(false);
    edit.setStrings({});
    QVERIFY(display(edit)->isReadOnly());
}

void tst_StringListEdit::clearsWithoutASignal()
{
    StringListEdit edit;
    edit.setStrings({QStringLiteral("a")});
    QSignalSpy changed(&edit, &StringListEdit::changed);
    edit.clear();
    QCOMPARE(edit.strings(), QStringList());
    QCOMPARE(display(edit)->text(), QString());
    QCOMPARE(changed.count(), 0);
}

void tst_StringListEdit::hidesTheButtonWhenReadOnly()
{
    StringListEdit edit;
    edit.setStrings({QStringLiteral("a")});
    edit.show();
    auto *button = child<QToolButton>(&edit, "editStringsButton");
    edit.setReadOnly(true);
    QVERIFY(!button->isVisible());
    QCOMPARE(display(edit)->text(), QStringLiteral("a;"));
    edit.setReadOnly(false);
    QVERIFY(button->isVisible());
    QVERIFY(display(edit)->isReadOnly());
}

void tst_StringListEdit::takesTheAcceptedList()
{
    StringListEdit edit;
    edit.setStrings({QStringLiteral("a"), QStringLiteral("b")});
    edit.setInputFunction(answerX);
    edit.show();
    QSignalSpy changed(&edit, &StringListEdit::changed);
    ModalDriver modal;
    modal.handle([&edit](QWidget *window) {
        auto *dialog = qobject_cast<EditStringsDialog *>(window);
        QVERIFY(dialog);
        QCOMPARE(dialog->parentWidget(), &edit);
        QCOMPARE(dialog->strings(), QStringList({QStringLiteral("a"), QStringLiteral("b")}));
        dialog->findChild<QListWidget *>()->setCurrentRow(0);
        click(child<QPushButton>(dialog, "deleteButton"));
        click(child<QPushButton>(dialog, "addButton"));
        QCOMPARE(edit.strings(), QStringList({QStringLiteral("a"), QStringLiteral("b")}));
        click(okButton(dialog));
    });
    click(child<QToolButton>(&edit, "editStringsButton"));
    QVERIFY(modal.finished());
    QCOMPARE(edit.strings(), QStringList({QStringLiteral("b"), QStringLiteral("x")}));
    QCOMPARE(display(edit)->text(), QStringLiteral("b;x;"));
    QCOMPARE(changed.count(), 1);
}

void tst_StringListEdit::keepsTheListWhenCanceled()
{
    StringListEdit edit;
    edit.setStrings({QStringLiteral("a")});
    QSignalSpy changed(&edit, &StringListEdit::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        window->findChild<QListWidget *>()->setCurrentRow(0);
        click(child<QPushButton>(window, "deleteButton"));
        click(cancelButton(window));
    });
    edit.editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(edit.strings(), QStringList({QStringLiteral("a")}));
    QCOMPARE(changed.count(), 0);
}

void tst_StringListEdit::namesTheDialogByTheTitle()
{
    StringListEdit edit;
    QStringList titles;
    ModalDriver modal;
    const auto note = [&titles](QWidget *window) {
        titles.append(window->windowTitle());
        window->close();
    };
    modal.handle(note);
    modal.handle(note);
    edit.editStrings();
    edit.setTexts(QStringLiteral("Categories"), QString(), QString(), QString(), QString());
    edit.editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(titles, QStringList({QString(), QStringLiteral("Categories")}));
}

void tst_StringListEdit::givesItsTextsToTheDialog_data()
{
    QTest::addColumn<QStringList>("texts");
    const QStringList all{QStringLiteral("add title"), QStringLiteral("add label"),
                          QStringLiteral("edit title"), QStringLiteral("edit label")};
    QTest::newRow("all") << all;
    // One alone makes the others of the dialog give way too.
    for (int i = 0; i < all.size(); ++i) {
        QStringList texts{QString(), QString(), QString(), QString()};
        texts[i] = all.at(i);
        QTest::newRow(qPrintable(all.at(i))) << texts;
    }
    QTest::newRow("set to nothing") << QStringList{QStringLiteral(""), QString(), QString(), QString()};
}

void tst_StringListEdit::givesItsTextsToTheDialog()
{
    QFETCH(QStringList, texts);
    StringListEdit edit;
    edit.setStrings({QStringLiteral("a")});
    edit.setTexts(QStringLiteral("title"), texts.at(0), texts.at(1), texts.at(2), texts.at(3));
    Prompt add;
    Prompt change;
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        answerPrompt(modal, QString(), &add);
        click(child<QPushButton>(window, "addButton"));
        window->findChild<QListWidget *>()->setCurrentRow(0);
        answerPrompt(modal, QString(), &change);
        click(child<QPushButton>(window, "editButton"));
        window->close();
    });
    edit.editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(QStringList({add.title, add.label, change.title, change.label}), texts);
}

void tst_StringListEdit::leavesTheTextsOfTheDialogWithoutOwn()
{
    StringListEdit edit;
    edit.setTexts(QStringLiteral("title"), QString(), QString(), QString(), QString());
    Prompt prompt;
    ModalDriver modal;
    modal.handle([&modal, &prompt](QWidget *window) {
        answerPrompt(modal, QString(), &prompt);
        click(child<QPushButton>(window, "addButton"));
        window->close();
    });
    edit.editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(prompt.title, QStringLiteral("Add string"));
    QCOMPARE(prompt.label, QStringLiteral("String:"));
}

void tst_StringListEdit::givesItsFunctionToTheDialog()
{
    StringListEdit edit;
    edit.setInputFunction(answerX);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        click(child<QPushButton>(window, "addButton"));
        click(okButton(window));
    });
    edit.editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(edit.strings(), QStringList({QStringLiteral("x")}));
}

void tst_StringListEdit::survivesItsDeletionBehindTheDialog()
{
    QPointer<StringListEdit> edit(new StringListEdit);
    ModalDriver modal;
    modal.handle([&edit](QWidget *) { delete edit; });
    edit->editStrings();
    QVERIFY(modal.finished());
    QVERIFY(!edit);
}

VEL_TEST_MAIN(tst_StringListEdit)

#include "tst_StringListEdit.moc"
