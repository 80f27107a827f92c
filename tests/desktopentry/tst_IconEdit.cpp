// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/IconEdit.h>

#include <KIconButton>
#include <KIconDialog>

#include <QHBoxLayout>
#include <QListView>
#include <QSignalSpy>

using namespace FormDriving;
using VelUI::IconEdit;

class tst_IconEdit : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void laysOutTheLineBeforeTheButton();
    void setsTextAndIconWithoutASignal();
    void takesWhatTheButtonReports();
    void takesTheIconThatTheUserChoosesInTheChooser();
    void typingChangesTheNameOnly();
    void switchesTheButtonAlone();
    void keepsAnUnknownName();
};

void tst_IconEdit::initTestCase()
{
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
}

void tst_IconEdit::laysOutTheLineBeforeTheButton()
{
    IconEdit edit;
    auto *layout = qobject_cast<QHBoxLayout *>(edit.layout());
    QVERIFY(layout);
    QCOMPARE(layout->contentsMargins(), QMargins());
    QCOMPARE(layout->itemAt(0)->widget(), edit.findChild<QLineEdit *>());
    auto *button = edit.findChild<KIconButton *>();
    QCOMPARE(layout->itemAt(1)->widget(), button);
    QCOMPARE(button->minimumSize(), QSize(40, 40));
    QCOMPARE(button->maximumSize(), QSize(40, 40));
    QCOMPARE(button->iconSize(), 32);
}

void tst_IconEdit::setsTextAndIconWithoutASignal()
{
    IconEdit edit;
    QSignalSpy changed(&edit, &IconEdit::iconChanged);
    edit.setIcon(QStringLiteral("folder"));
    QCOMPARE(edit.icon(), QStringLiteral("folder"));
    QCOMPARE(edit.findChild<QLineEdit *>()->text(), QStringLiteral("folder"));
    QCOMPARE(edit.findChild<KIconButton *>()->icon(), QStringLiteral("folder"));
    QCOMPARE(changed.count(), 0);
}

void tst_IconEdit::takesWhatTheButtonReports()
{
    IconEdit edit;
    QSignalSpy changed(&edit, &IconEdit::iconChanged);
    Q_EMIT edit.findChild<KIconButton *>()->iconChanged(QStringLiteral("document-open"));
    QCOMPARE(edit.icon(), QStringLiteral("document-open"));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().toString(), QStringLiteral("document-open"));
}

void tst_IconEdit::takesTheIconThatTheUserChoosesInTheChooser()
{
    IconEdit edit;
    edit.setIcon(QStringLiteral("folder"));
    edit.show();
    QVERIFY(QTest::qWaitForWindowActive(&edit));
    QSignalSpy changed(&edit, &IconEdit::iconChanged);
    click(edit.findChild<KIconButton *>());
    KIconDialog *chooser = nullptr;
    QTRY_VERIFY((chooser = edit.findChild<KIconDialog *>()) && chooser->isVisible());
    auto *canvas = chooser->findChild<QListView *>();
    QVERIFY(canvas);
    QTRY_VERIFY(canvas->model()->rowCount() > 20);
    canvas->setCurrentIndex(canvas->model()->index(7, 0));
    QTest::keyClick(canvas, Qt::Key_Return);
    QTRY_COMPARE(changed.count(), 1);
    QVERIFY(!edit.icon().isEmpty());
    QVERIFY(edit.icon() != QLatin1String("folder"));
    QCOMPARE(changed.first().first().toString(), edit.icon());
    QCOMPARE(edit.findChild<KIconButton *>()->icon(), edit.icon());
}

void tst_IconEdit::typingChangesTheNameOnly()
{
    IconEdit edit;
    edit.setIcon(QStringLiteral("folder"));
    QSignalSpy changed(&edit, &IconEdit::iconChanged);
    QSignalSpy edited(edit.findChild<QLineEdit *>(), &QLineEdit::textEdited);
    retype(edit.findChild<QLineEdit *>(), QStringLiteral("go-up"));
    QCOMPARE(edit.icon(), QStringLiteral("go-up"));
    QCOMPARE(edit.findChild<KIconButton *>()->icon(), QStringLiteral("folder"));
    QCOMPARE(changed.count(), 0);
    QVERIFY(edited.count() > 0);
}

void tst_IconEdit::switchesTheButtonAlone()
{
    IconEdit edit;
    edit.setReadOnly(true);
    QVERIFY(!edit.findChild<KIconButton *>()->isEnabled());
    QVERIFY(!edit.findChild<QLineEdit *>()->isReadOnly());
    edit.setReadOnly(false);
    QVERIFY(edit.findChild<KIconButton *>()->isEnabled());
}

void tst_IconEdit::keepsAnUnknownName()
{
    IconEdit edit;
    edit.setIcon(QStringLiteral("no-such-icon.png "));
    QCOMPARE(edit.icon(), QStringLiteral("no-such-icon.png "));
    edit.setIcon(QString());
    QCOMPARE(edit.icon(), QString());
}

VEL_TEST_MAIN(tst_IconEdit)

#include "tst_IconEdit.moc"
