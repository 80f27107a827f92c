// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/EditableListWidget.h>

#include <QHBoxLayout>
#include <QListWidget>
#include <QSignalSpy>
#include <QTranslator>

using namespace FormDriving;
using VelUI::EditableListWidget;

namespace {

struct Asked
{
    QWidget *parent = nullptr;
    QString title;
    QString label;
    QLineEdit::EchoMode mode = QLineEdit::Password;
    QString text;
};

Asked asked;
QString nextAnswer;

QString answerNext(QWidget *parent, const QString &title, const QString &label, QLineEdit::EchoMode mode,
                   const QString &text)
{
    asked = {parent, title, label, mode, text};
    return nextAnswer;
}

QString deleteTheAsker(QWidget *parent, const QString &, const QString &, QLineEdit::EchoMode,
                       const QString &)
{
    delete parent;
    return QStringLiteral("late");
}

// Names the context of every text that is looked up.
class ContextTranslator : public QTranslator
{
public:
    QString translate(const char *context, const char *source, const char *, int) const override
    {
        return QString::fromLatin1(context) + QLatin1Char('/') + QString::fromLatin1(source);
    }
    bool isEmpty() const override { return false; }
};

} // namespace

class tst_EditableListWidget : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void looksLikeItsForm();
    void looksUpItsTextsInTwoContexts();
    void keepsAnObjectNameOfTheOwner();
    void startsWithOnlyAddEnabled();
    void enablesTheButtonsByTheSelection_data();
    void enablesTheButtonsByTheSelection();
    void addsWhatWasTyped();
    void addsNothingForAnEmptyAnswer_data();
    void addsNothingForAnEmptyAnswer();
    void addsADuplicate();
    void editsTheCurrentItem();
    void leavesTheItemForAnEmptyAnswer();
    void editsNothingWithoutACurrentItem();
    void asksWithTheTextsGiven();
    void asksWithTheFunctionGiven();
    void fallsBackToThePlainPrompt();
    void deletesTheSelectedItems();
    void reportsADeletionOfNothing();
    void movesTheCurrentItemUp();
    void movesTheCurrentItemDown();
    void movesNothingWithoutACurrentItem();
    void keepsTheButtonsRightAfterEveryChange();
    void replacesTheItemsWhenStringsAreSet();
    void survivesItsDeletionBehindThePrompt();
};

void tst_EditableListWidget::looksLikeItsForm()
{
    EditableListWidget widget;
    QCOMPARE(widget.objectName(), QStringLiteral("EditableListWidget"));
    QCOMPARE(widget.windowTitle(), QStringLiteral("Form"));
    QCOMPARE(widget.size(), QSize(445, 180));
    auto *outer = qobject_cast<QHBoxLayout *>(widget.layout());
    QVERIFY(outer);
    QCOMPARE(outer->objectName(), QStringLiteral("horizontalLayout"));
    QCOMPARE(outer->contentsMargins(), QMargins());
    QCOMPARE(outer->itemAt(0)->widget(), child<QListWidget>(&widget, "listWidget"));
    auto *column = qobject_cast<QVBoxLayout *>(outer->itemAt(1)->layout());
    QVERIFY(column);
    QCOMPARE(column->objectName(), QStringLiteral("verticalLayout"));

    const QStringList names{QStringLiteral("addButton"),    QStringLiteral("editButton"),
                            QStringLiteral("deleteButton"), QString(),
                            QStringLiteral("upButton"),     QStringLiteral("downButton")};
    const QStringList texts{QStringLiteral("Add..."), QStringLiteral("Edit..."),
                            QStringLiteral("Delete"), QString(),
                            QStringLiteral("Up"),     QStringLiteral("Down")};
    QCOMPARE(column->count(), names.size());
    for (int i = 0; i < column->count(); ++i) {
        if (names.at(i).isEmpty()) {
            QSpacerItem *spacer = column->itemAt(i)->spacerItem();
            QVERIFY(spacer);
            QCOMPARE(spacer->sizeHint(), QSize(20, 13));
            QCOMPARE(spacer->sizePolicy().horizontalPolicy(), QSizePolicy::Minimum);
            QCOMPARE(spacer->sizePolicy().verticalPolicy(), QSizePolicy::Expanding);
            continue;
        }
        auto *button = qobject_cast<QPushButton *>(column->itemAt(i)->widget());
        QVERIFY(button);
        QCOMPARE(button->objectName(), names.at(i));
        QCOMPARE(button->text(), texts.at(i));
    }
}

void tst_EditableListWidget::looksUpItsTextsInTwoContexts()
{
    ContextTranslator translator;
    QCoreApplication::installTranslator(&translator);
    EditableListWidget widget;
    widget.setInputFunction(answerNext);
    nextAnswer.clear();
    widget.addAction();
    QCOMPARE(child<QPushButton>(&widget, "addButton")->text(), QStringLiteral("EditableListWidget/Add..."));
    QCOMPARE(child<QPushButton>(&widget, "downButton")->text(), QStringLiteral("EditableListWidget/Down"));
    QCOMPARE(widget.windowTitle(), QStringLiteral("EditableListWidget/Form"));
    QCOMPARE(asked.title, QStringLiteral("VelUI::EditableListWidget/Add string"));
    QCOMPARE(asked.label, QStringLiteral("VelUI::EditableListWidget/String:"));
    QCoreApplication::removeTranslator(&translator);
}

void tst_EditableListWidget::keepsAnObjectNameOfTheOwner()
{
    EditableListWidget widget;
    widget.setObjectName(QStringLiteral("mine"));
    QCOMPARE(widget.objectName(), QStringLiteral("mine"));
    QVERIFY(widget.inherits("VelUI::EditableListWidget"));
}

void tst_EditableListWidget::startsWithOnlyAddEnabled()
{
    EditableListWidget widget;
    QVERIFY(child<QPushButton>(&widget, "addButton")->isEnabled());
    for (const char *name : {"editButton", "deleteButton", "upButton", "downButton"})
        QVERIFY(!child<QPushButton>(&widget, name)->isEnabled());
}

void tst_EditableListWidget::enablesTheButtonsByTheSelection_data()
{
    QTest::addColumn<int>("count");
    QTest::addColumn<QList<int>>("selected");
    QTest::addColumn<QStringList>("enabled");
    const QString add = QStringLiteral("addButton"), edit = QStringLiteral("editButton"),
                  del = QStringLiteral("deleteButton"), up = QStringLiteral("upButton"),
                  down = QStringLiteral("downButton");
    QTest::newRow("nothing") << 3 << QList<int>{} << QStringList{add};
    QTest::newRow("first") << 3 << QList<int>{0} << QStringList{add, edit, del, down};
    QTest::newRow("middle") << 3 << QList<int>{1} << QStringList{add, edit, del, up, down};
    QTest::newRow("last") << 3 << QList<int>{2} << QStringList{add, edit, del, up};
    QTest::newRow("only one") << 1 << QList<int>{0} << QStringList{add, edit, del};
    QTest::newRow("two") << 3 << QList<int>{0, 1} << QStringList{add, del};
    QTest::newRow("all") << 3 << QList<int>{0, 1, 2} << QStringList{add, del};
}

void tst_EditableListWidget::enablesTheButtonsByTheSelection()
{
    QFETCH(int, count);
    QFETCH(QList<int>, selected);
    QFETCH(QStringList, enabled);
    EditableListWidget widget;
    auto *list = child<QListWidget>(&widget, "listWidget");
    list->setSelectionMode(QAbstractItemView::MultiSelection);
    for (int i = 0; i < count; ++i)
        list->addItem(QString::number(i));
    for (int row : selected)
        list->item(row)->setSelected(true);
    for (const QPushButton *button : widget.findChildren<QPushButton *>())
        QCOMPARE(button->isEnabled(), enabled.contains(button->objectName()));

    list->clearSelection();
    for (const QPushButton *button : widget.findChildren<QPushButton *>())
        QCOMPARE(button->isEnabled(), button->objectName() == QLatin1String("addButton"));
}

void tst_EditableListWidget::addsWhatWasTyped()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a")});
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    ModalDriver modal;
    Prompt prompt;
    answerPrompt(modal, QStringLiteral("b;c"), &prompt);
    click(child<QPushButton>(&widget, "addButton"));
    QVERIFY(modal.finished());
    QCOMPARE(prompt.title, QStringLiteral("Add string"));
    QCOMPARE(prompt.label, QStringLiteral("String:"));
    QCOMPARE(prompt.text, QString());
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("a"), QStringLiteral("b;c")}));
    QCOMPARE(changed.count(), 1);
}

void tst_EditableListWidget::addsNothingForAnEmptyAnswer_data()
{
    QTest::addColumn<QString>("answer");
    QTest::newRow("canceled") << QString();
    QTest::newRow("nothing typed") << QStringLiteral("");
}

void tst_EditableListWidget::addsNothingForAnEmptyAnswer()
{
    QFETCH(QString, answer);
    EditableListWidget widget;
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    ModalDriver modal;
    answerPrompt(modal, answer);
    click(child<QPushButton>(&widget, "addButton"));
    QVERIFY(modal.finished());
    QCOMPARE(widget.strings(), QStringList());
    QCOMPARE(changed.count(), 0);
}

void tst_EditableListWidget::addsADuplicate()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a")});
    widget.setInputFunction(answerNext);
    nextAnswer = QStringLiteral("a");
    widget.addAction();
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("a"), QStringLiteral("a")}));
}

void tst_EditableListWidget::editsTheCurrentItem()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")});
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(1);
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    ModalDriver modal;
    Prompt prompt;
    answerPrompt(modal, QStringLiteral("x"), &prompt);
    click(child<QPushButton>(&widget, "editButton"));
    QVERIFY(modal.finished());
    QCOMPARE(prompt.title, QStringLiteral("Edit string"));
    QCOMPARE(prompt.label, QStringLiteral("String:"));
    QCOMPARE(prompt.text, QStringLiteral("b"));
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("a"), QStringLiteral("x"), QStringLiteral("c")}));
    QCOMPARE(changed.count(), 1);
}

void tst_EditableListWidget::leavesTheItemForAnEmptyAnswer()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a")});
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    ModalDriver modal;
    answerPrompt(modal, QStringLiteral(""));
    answerPrompt(modal, QString());
    widget.editAction();
    widget.editAction();
    QVERIFY(modal.finished());
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("a")}));
    QCOMPARE(changed.count(), 0);
}

void tst_EditableListWidget::editsNothingWithoutACurrentItem()
{
    EditableListWidget widget;
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    ModalDriver modal;
    widget.editAction();
    QVERIFY(modal.finished());
    QCOMPARE(changed.count(), 0);
}

void tst_EditableListWidget::asksWithTheTextsGiven()
{
    EditableListWidget widget;
    widget.setTexts(QStringLiteral("add title"), QStringLiteral("add label"), QStringLiteral("edit title"),
                    QStringLiteral("edit label"));
    widget.setStrings({QStringLiteral("a")});
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    ModalDriver modal;
    Prompt add;
    Prompt edit;
    answerPrompt(modal, QString(), &add);
    answerPrompt(modal, QString(), &edit);
    widget.addAction();
    widget.editAction();
    QVERIFY(modal.finished());
    QCOMPARE(add.title, QStringLiteral("add title"));
    QCOMPARE(add.label, QStringLiteral("add label"));
    QCOMPARE(edit.title, QStringLiteral("edit title"));
    QCOMPARE(edit.label, QStringLiteral("edit label"));
}

void tst_EditableListWidget::asksWithTheFunctionGiven()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a")});
    widget.setInputFunction(answerNext);
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    nextAnswer = QStringLiteral("b");

    widget.addAction();
    QCOMPARE(asked.parent, &widget);
    QCOMPARE(asked.title, QStringLiteral("Add string"));
    QCOMPARE(asked.mode, QLineEdit::Normal);
    QCOMPARE(asked.text, QString());
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    widget.editAction();
    QCOMPARE(asked.title, QStringLiteral("Edit string"));
    QCOMPARE(asked.mode, QLineEdit::Normal);
    QCOMPARE(asked.text, QStringLiteral("a"));
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("b"), QStringLiteral("b")}));
}

void tst_EditableListWidget::fallsBackToThePlainPrompt()
{
    EditableListWidget widget;
    widget.setInputFunction(nullptr);
    ModalDriver modal;
    answerPrompt(modal, QStringLiteral("x"));
    widget.addAction();
    QVERIFY(modal.finished());
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("x")}));
}

void tst_EditableListWidget::deletesTheSelectedItems()
{
    EditableListWidget widget;
    auto *list = child<QListWidget>(&widget, "listWidget");
    list->setSelectionMode(QAbstractItemView::MultiSelection);
    widget.setStrings({QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")});
    list->item(0)->setSelected(true);
    list->item(2)->setSelected(true);
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    click(child<QPushButton>(&widget, "deleteButton"));
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("b")}));
    QCOMPARE(changed.count(), 1);
}

void tst_EditableListWidget::reportsADeletionOfNothing()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a")});
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    widget.deleteActions();
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("a")}));
    QCOMPARE(changed.count(), 1);
}

void tst_EditableListWidget::movesTheCurrentItemUp()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")});
    auto *list = child<QListWidget>(&widget, "listWidget");
    list->setCurrentRow(2);
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    click(child<QPushButton>(&widget, "upButton"));
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("a"), QStringLiteral("c"), QStringLiteral("b")}));
    QCOMPARE(list->currentRow(), 1);
    QCOMPARE(changed.count(), 1);
}

void tst_EditableListWidget::movesTheCurrentItemDown()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")});
    auto *list = child<QListWidget>(&widget, "listWidget");
    list->setCurrentRow(0);
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    click(child<QPushButton>(&widget, "downButton"));
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("b"), QStringLiteral("a"), QStringLiteral("c")}));
    QCOMPARE(list->currentRow(), 1);
    QCOMPARE(changed.count(), 1);
}

void tst_EditableListWidget::movesNothingWithoutACurrentItem()
{
    EditableListWidget widget;
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    widget.upAction();
    widget.downAction();
    QCOMPARE(changed.count(), 0);
}

void tst_EditableListWidget::keepsTheButtonsRightAfterEveryChange()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a"), QStringLiteral("b")});
    widget.setInputFunction(answerNext);
    auto *list = child<QListWidget>(&widget, "listWidget");
    auto *up = child<QPushButton>(&widget, "upButton");
    auto *down = child<QPushButton>(&widget, "downButton");

    list->setCurrentRow(1);
    QVERIFY(up->isEnabled() && !down->isEnabled());
    click(up);
    QVERIFY(!up->isEnabled() && down->isEnabled());
    click(down);
    QVERIFY(up->isEnabled() && !down->isEnabled());
    nextAnswer = QStringLiteral("c");
    widget.addAction();
    QVERIFY(up->isEnabled() && !down->isEnabled()); // the new one is selected
    list->setCurrentRow(0);
    widget.deleteActions();
    QCOMPARE(list->selectedItems().size(), 1);
    QVERIFY(!up->isEnabled() && down->isEnabled());
}

void tst_EditableListWidget::replacesTheItemsWhenStringsAreSet()
{
    EditableListWidget widget;
    widget.setStrings({QStringLiteral("a"), QStringLiteral("b")});
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    QSignalSpy changed(&widget, &EditableListWidget::changed);
    widget.setStrings({QStringLiteral("x")});
    QCOMPARE(widget.strings(), QStringList({QStringLiteral("x")}));
    QVERIFY(!child<QPushButton>(&widget, "editButton")->isEnabled());
    QCOMPARE(changed.count(), 0);
}

void tst_EditableListWidget::survivesItsDeletionBehindThePrompt()
{
    auto *adding = new EditableListWidget;
    adding->setInputFunction(deleteTheAsker);
    adding->addAction();

    auto *editing = new EditableListWidget;
    editing->setStrings({QStringLiteral("a")});
    child<QListWidget>(editing, "listWidget")->setCurrentRow(0);
    editing->setInputFunction(deleteTheAsker);
    const QPointer<EditableListWidget> alive(editing);
    editing->editAction();
    QVERIFY(!alive);
}

VEL_TEST_MAIN(tst_EditableListWidget)

#include "tst_EditableListWidget.moc"
