// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/PathEdit.h>

#include <QFileDialog>
#include <QHBoxLayout>
#include <QSignalSpy>
#include <QToolButton>

using namespace FormDriving;
using VelUI::PathEdit;

class tst_PathEdit : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void laysOutTheLineBeforeTheButton();
    void reportsEveryChangeOfTheText();
    void reportsTyping();
    void switchesToReadOnlyAndBack();
    void keepsTextsOfAnyKind_data();
    void keepsTextsOfAnyKind();
    void takesTheChosenFile();
    void changesNothingWhenTheChoiceIsCanceled();
    void givesTheKeysToTheLine();
};

void tst_PathEdit::laysOutTheLineBeforeTheButton()
{
    PathEdit edit;
    auto *layout = qobject_cast<QHBoxLayout *>(edit.layout());
    QVERIFY(layout);
    QCOMPARE(layout->contentsMargins(), QMargins());
    QCOMPARE(layout->itemAt(0)->widget(), edit.findChild<QLineEdit *>());
    auto *button = edit.findChild<QToolButton *>();
    QCOMPARE(layout->itemAt(1)->widget(), button);
    QCOMPARE(button->text(), QStringLiteral("..."));
    QCOMPARE(button->sizePolicy().horizontalPolicy(), QSizePolicy::Fixed);
    QCOMPARE(button->sizePolicy().verticalPolicy(), QSizePolicy::Preferred);
}

void tst_PathEdit::reportsEveryChangeOfTheText()
{
    PathEdit edit;
    QSignalSpy changed(&edit, &PathEdit::changed);
    edit.setText(QStringLiteral("/bin/true"));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(edit.text(), QStringLiteral("/bin/true"));
    edit.setText(QStringLiteral("/bin/true"));
    QCOMPARE(changed.count(), 1);
    edit.clear();
    QCOMPARE(changed.count(), 2);
    QCOMPARE(edit.text(), QString());
}

void tst_PathEdit::reportsTyping()
{
    PathEdit edit;
    QSignalSpy changed(&edit, &PathEdit::changed);
    QTest::keyClicks(edit.findChild<QLineEdit *>(), QStringLiteral("ls"));
    QCOMPARE(changed.count(), 2);
    QCOMPARE(edit.text(), QStringLiteral("ls"));
}

void tst_PathEdit::switchesToReadOnlyAndBack()
{
    PathEdit edit;
    edit.show();
    auto *line = edit.findChild<QLineEdit *>();
    auto *button = edit.findChild<QToolButton *>();
    edit.setReadOnly(true);
    QVERIFY(line->isReadOnly());
    QVERIFY(!button->isVisible());
    edit.setReadOnly(false);
    QVERIFY(!line->isReadOnly());
    QVERIFY(button->isVisible());
}

void tst_PathEdit::keepsTextsOfAnyKind_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("blanks") << QStringLiteral("  a  ");
    QTest::newRow("line feed") << QStringLiteral("a\nb");
    QTest::newRow("long") << QString(100000, QLatin1Char('a'));
}

void tst_PathEdit::keepsTextsOfAnyKind()
{
    QFETCH(QString, text);
    PathEdit edit;
    edit.setText(text);
    QCOMPARE(edit.text(), text);
}

void tst_PathEdit::takesTheChosenFile()
{
    PathEdit edit;
    edit.setText(QStringLiteral("before"));
    QSignalSpy changed(&edit, &PathEdit::changed);
    ModalDriver modal;
    modal.handle([&edit](QWidget *window) {
        auto *dialog = qobject_cast<QFileDialog *>(window);
        QVERIFY(dialog);
        QCOMPARE(dialog->windowTitle(), QStringLiteral("Choose application exec path"));
        QCOMPARE(dialog->directory().absolutePath(), QStringLiteral("/usr/bin"));
        QCOMPARE(dialog->fileMode(), QFileDialog::ExistingFile);
        QCOMPARE(dialog->parentWidget(), &edit);
        auto *name = dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"));
        name->setText(QStringLiteral("/usr/bin/env")); // typed, it would bring up completions
        QTest::keyClick(name, Qt::Key_Return);
    });
    edit.show();
    click(edit.findChild<QToolButton *>());
    QVERIFY(modal.finished());
    QCOMPARE(edit.text(), QStringLiteral("/usr/bin/env"));
    QCOMPARE(changed.count(), 1);
}

void tst_PathEdit::changesNothingWhenTheChoiceIsCanceled()
{
    PathEdit edit;
    edit.setText(QStringLiteral("before"));
    QSignalSpy changed(&edit, &PathEdit::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) { QTest::keyClick(window, Qt::Key_Escape); });
    edit.selectPathButtonClicked();
    QVERIFY(modal.finished());
    QCOMPARE(edit.text(), QStringLiteral("before"));
    QCOMPARE(changed.count(), 0);
}

void tst_PathEdit::givesTheKeysToTheLine()
{
    PathEdit edit;
    QCOMPARE(edit.focusProxy(), edit.findChild<QLineEdit *>());
}

VEL_TEST_MAIN(tst_PathEdit)

#include "tst_PathEdit.moc"
