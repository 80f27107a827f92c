// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDialogTestCase.h"
#include "EntrySamples.h"
#include "FormDriving.h"
#include "XDoTool.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <VelMenuDialog.h>

#include <KIconButton>
#include <KIconDialog>

#include <QFileDialog>
#include <QPointer>
#include <QScrollArea>
#include <QToolButton>

#include <functional>

using namespace FormDriving;

/// The host takes the entry dialog or its form away while the user chooses something.
class tst_DeletionBehindChoosers : public EntryDialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void survivesItBehindTheFileChooser_data();
    void survivesItBehindTheFileChooser();
    void survivesItBehindTheFileChooserOfAnAction_data();
    void survivesItBehindTheFileChooserOfAnAction();
    void survivesItBehindAChooserOfTheAssistance_data();
    void survivesItBehindAChooserOfTheAssistance();
    void survivesItBehindTheIconChooser_data();
    void survivesItBehindTheIconChooser();
    void survivesItBehindTheMenuPicker_data();
    void survivesItBehindTheMenuPicker();

private:
    // Each as it is with the form alone taken away, and with the dialog around it.
    static void addRows();
    void takeAway(bool onlyTheForm);
    // Clicks again when the window was still being placed, until \a isDone.
    void clickButton(QWidget *button, const std::function<bool()> &isDone);

    QPointer<VelDesktopEntryEditDialog> m_dialog;
};

void tst_DeletionBehindChoosers::init()
{
    EntryDialogTestCase::init();
    m_dialog = new VelDesktopEntryEditDialog;
    QVERIFY(
        m_dialog->setDesktopEntryPath(write(QStringLiteral("a.desktop"), EntrySamples::fullApplication())));
    m_dialog->show();
    QTRY_VERIFY_WITH_TIMEOUT((m_dialog->activateWindow(), QTest::qWaitForWindowActive(m_dialog, 1000)),
                             20000);
}

void tst_DeletionBehindChoosers::cleanup()
{
    delete m_dialog;
    EntryDialogTestCase::cleanup();
}

void tst_DeletionBehindChoosers::addRows()
{
    QTest::addColumn<bool>("onlyTheForm");
    QTest::newRow("the dialog") << false;
    QTest::newRow("the form") << true;
}

void tst_DeletionBehindChoosers::takeAway(bool onlyTheForm)
{
    if (onlyTheForm)
        delete m_dialog->findChild<VelDesktopEntryPropsWidget *>();
    else
        delete m_dialog;
}

void tst_DeletionBehindChoosers::clickButton(QWidget *button, const std::function<bool()> &isDone)
{
    // What the assistance adds moves everything when it is laid out.
    for (int i = 0; i < 5; ++i)
        QCoreApplication::processEvents();
    auto *area = child<QScrollArea>(m_dialog, "scrollArea");
    if (area->widget()->isAncestorOf(button))
        area->ensureWidgetVisible(button);
    QTRY_VERIFY_WITH_TIMEOUT(button->visibleRegion().contains(button->rect().center()), 20000);
    const QPointer<QWidget> guarded(button);
    bool isSeen = false;
    for (int i = 0; i < 5 && guarded && !isSeen; ++i) {
        XDoTool::click(button);
        isSeen = QTest::qWaitFor(isDone, 8000);
    }
}

void tst_DeletionBehindChoosers::survivesItBehindTheFileChooser_data()
{
    addRows();
}

void tst_DeletionBehindChoosers::survivesItBehindTheFileChooser()
{
    QFETCH(bool, onlyTheForm);
    ModalDriver modal;
    modal.handle([this, onlyTheForm](QWidget *window) {
        QVERIFY(qobject_cast<QFileDialog *>(window));
        takeAway(onlyTheForm);
    });
    clickButton(child<QWidget>(m_dialog, "tryExecEdit")->findChild<QToolButton *>(),
                [&modal] { return modal.finished(); });
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QCOMPARE(m_dialog.isNull(), !onlyTheForm);
}

void tst_DeletionBehindChoosers::survivesItBehindTheFileChooserOfAnAction_data()
{
    addRows();
}

void tst_DeletionBehindChoosers::survivesItBehindTheFileChooserOfAnAction()
{
    QFETCH(bool, onlyTheForm);
    ModalDriver modal;
    modal.handle([this, onlyTheForm, &modal](QWidget *actions) {
        modal.handle([this, onlyTheForm, &modal](QWidget *action) {
            modal.handle([this, onlyTheForm](QWidget *window) {
                QVERIFY(qobject_cast<QFileDialog *>(window));
                takeAway(onlyTheForm);
            });
            click(child<QWidget>(action, "execEdit")->findChild<QToolButton *>());
        });
        click(child<QPushButton>(actions, "addButton"));
    });
    clickButton(child<QToolButton>(m_dialog, "editActionsButton"), [&modal] { return modal.finished(); });
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QCOMPARE(m_dialog.isNull(), !onlyTheForm);
}

void tst_DeletionBehindChoosers::survivesItBehindAChooserOfTheAssistance_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<bool>("onlyTheForm");
    for (const char *button : {"chooseButton_Exec", "chooseButton_TryExec", "chooseButton_MimeType",
                               "chooseButton_Categories", "chooseButton_OnlyShowIn", "newLanguageButton"}) {
        QTest::addRow("%s, the dialog", button) << QString::fromLatin1(button) << false;
        QTest::addRow("%s, the form", button) << QString::fromLatin1(button) << true;
    }
}

void tst_DeletionBehindChoosers::survivesItBehindAChooserOfTheAssistance()
{
    QFETCH(QString, button);
    QFETCH(bool, onlyTheForm);
    // Nothing is to be said of it, which would move the rows.
    QVERIFY(m_dialog->setDesktopEntryPath(
        write(QStringLiteral("b.desktop"), plainApplication + "Categories=Utility;\n")));
    m_dialog->setAssistance(true);
    ModalDriver modal;
    modal.handle([this, onlyTheForm](QWidget *) { takeAway(onlyTheForm); });
    clickButton(child<QToolButton>(m_dialog, qPrintable(button)), [&modal] { return modal.finished(); });
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QCOMPARE(m_dialog.isNull(), !onlyTheForm);
}

void tst_DeletionBehindChoosers::survivesItBehindTheIconChooser_data()
{
    addRows();
}

// The chooser of icons, and that of files behind it.
void tst_DeletionBehindChoosers::survivesItBehindTheIconChooser()
{
    QFETCH(bool, onlyTheForm);
    clickButton(child<QWidget>(m_dialog, "iconEdit")->findChild<KIconButton *>(), [this] {
        auto *opened = m_dialog->findChild<KIconDialog *>();
        return opened && opened->isVisible();
    });
    KIconDialog *chooser = nullptr;
    QTRY_VERIFY_WITH_TIMEOUT((chooser = m_dialog->findChild<KIconDialog *>()) && chooser->isVisible(), 20000);
    QVERIFY(QTest::qWaitForWindowActive(chooser, 20000));
    QPushButton *browse = nullptr;
    for (auto *button : chooser->findChildren<QPushButton *>()) {
        if (button->text().contains(QLatin1String("Browse")))
            browse = button;
    }
    QVERIFY(browse);
    // The window manager may still be placing the chooser.
    const auto isOpen = [chooser] { return chooser->findChild<QFileDialog *>() != nullptr; };
    bool isSeen = false;
    for (int i = 0; i < 5 && !isSeen; ++i) {
        XDoTool::click(browse);
        isSeen = QTest::qWaitFor(isOpen, 4000);
    }
    QVERIFY(isSeen);
    QVERIFY(QTest::qWaitForWindowActive(chooser->findChild<QFileDialog *>(), 20000));
    takeAway(onlyTheForm);
    QCOMPARE(m_dialog.isNull(), !onlyTheForm);
    QCoreApplication::processEvents();
}

void tst_DeletionBehindChoosers::survivesItBehindTheMenuPicker_data()
{
    addRows();
}

void tst_DeletionBehindChoosers::survivesItBehindTheMenuPicker()
{
    QFETCH(bool, onlyTheForm);
    ModalDriver modal;
    modal.handle([this, onlyTheForm, &modal](QWidget *window) {
        QVERIFY(qobject_cast<VelMenuDialog *>(window));
        // It tells the window manager when it goes; nobody takes the command here.
        modal.answer(warning(QStringLiteral("Can't send command to vel-wm")), QMessageBox::Ok);
        takeAway(onlyTheForm);
        if (onlyTheForm)
            window->close();
    });
    clickButton(child<QPushButton>(m_dialog, "copyButton"), [&modal] { return modal.finished(); });
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    QCOMPARE(m_dialog.isNull(), !onlyTheForm);
}

VEL_TEST_MAIN(tst_DeletionBehindChoosers)

#include "tst_DeletionBehindChoosers.moc"
