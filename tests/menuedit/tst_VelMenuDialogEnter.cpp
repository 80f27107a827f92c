// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"
#include "ModalDriver.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QDialogButtonBox>
#include <QFileSystemModel>
#include <QItemSelectionModel>
#include <QKeyEvent>
#include <QPushButton>
#include <QSignalSpy>

/// What Return, Enter, F2 and a double click do to an item, by hand.
class tst_VelMenuDialogEnter : public HandsOnTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void editsAnEntry_data();
    void editsAnEntry();
    void opensAndClosesAFolder_data();
    void opensAndClosesAFolder();
    void editsAFolderByF2();
    void staysOpenWhereNothingMayBeChanged();
    void takesAHeldKeyOnce();
    void picksAnEntry_data();
    void picksAnEntry();
    void opensAndClosesAFolderToPickFrom_data();
    void opensAndClosesAFolderToPickFrom();
    void picksAnEntryByADoubleClick();
    void picksNoFolderByADoubleClick();
    void leavesItToTheButtonsWithoutAnItem();

private:
    static void keys();
    void openPicker();
    void clickInPicker(const QString &file);

    QString m_entry;
    QString m_folder;
    std::unique_ptr<VelMenuDialog> m_picker;
    VelMenuView *m_tree = nullptr;
};

namespace {

void expectEditor(ModalDriver &modal, const QString &recordFile)
{
    modal.handle([recordFile](QWidget *window) {
        auto *editor = qobject_cast<VelDesktopEntryEditDialog *>(window);
        QVERIFY(editor);
        QCOMPARE(editor->windowTitle(), QLatin1String("Desktop Entry ") + recordFile);
        editor->reject();
    });
}

} // namespace

void tst_VelMenuDialogEnter::init()
{
    HandsOnTestCase::init();
    m_entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    m_folder = writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"));
    writeEntry(QStringLiteral("sub/x.desktop"), QStringLiteral("X"));
}

void tst_VelMenuDialogEnter::cleanup()
{
    m_picker.reset();
    HandsOnTestCase::cleanup();
}

void tst_VelMenuDialogEnter::keys()
{
    QTest::addColumn<QString>("key");
    QTest::newRow("Return") << "Return";
    QTest::newRow("Enter") << "KP_Enter";
}

void tst_VelMenuDialogEnter::openPicker()
{
    m_picker = std::make_unique<VelMenuDialog>(menu(), 22, false, false, nullptr, Qt::Window);
    m_tree = m_picker->findChild<VelMenuView *>();
    m_picker->show();
    QVERIFY(QTest::qWaitForWindowActive(m_picker.get()));
    QVERIFY(open(*m_tree, menu(), 2));
}

void tst_VelMenuDialogEnter::clickInPicker(const QString &file)
{
    XDoTool::click(m_tree->viewport(), m_tree->visualRect(shown(*m_tree, file)).center());
    QTRY_COMPARE(m_tree->selectedPath(), file);
    QTRY_VERIFY(m_tree->hasFocus());
}

void tst_VelMenuDialogEnter::editsAnEntry_data()
{
    keys();
    QTest::newRow("F2") << "F2";
}

void tst_VelMenuDialogEnter::editsAnEntry()
{
    QFETCH(QString, key);
    openDialog(menu(), 2);
    clickItem(m_entry);
    ModalDriver modal;
    expectEditor(modal, m_entry);
    XDoTool::press(key);
    QTRY_VERIFY(modal.finished());
    QTRY_VERIFY(!QApplication::activeModalWidget());
    QVERIFY(dialog()->isVisible());
}

void tst_VelMenuDialogEnter::opensAndClosesAFolder_data()
{
    keys();
}

void tst_VelMenuDialogEnter::opensAndClosesAFolder()
{
    QFETCH(QString, key);
    openDialog(menu(), 2);
    clickItem(m_folder);
    const ModalDriver modal;
    XDoTool::press(key);
    QTRY_VERIFY(view().isExpanded(shown(view(), m_folder)));
    XDoTool::press(key);
    QTRY_VERIFY(!view().isExpanded(shown(view(), m_folder)));
    QVERIFY(dialog()->isVisible());
    QVERIFY(modal.finished());
}

void tst_VelMenuDialogEnter::editsAFolderByF2()
{
    openDialog(menu(), 2);
    clickItem(m_folder);
    ModalDriver modal;
    expectEditor(modal, m_folder + QLatin1String("/.directory"));
    XDoTool::press(QStringLiteral("F2"));
    QTRY_VERIFY(modal.finished());
    QVERIFY(!view().isExpanded(shown(view(), m_folder)));
}

void tst_VelMenuDialogEnter::staysOpenWhereNothingMayBeChanged()
{
    QVERIFY(QFile::setPermissions(menu(),
                                  QFile::ReadOwner | QFile::ExeOwner | QFile::ReadOther | QFile::ExeOther));
    openDialog(menu(), 2);
    {
        const WithoutPermission nobody;
        clickItem(m_entry);
        QTRY_VERIFY(!action(view(), QStringLiteral("editAction"))->isEnabled());
        const ModalDriver modal;
        QSignalSpy told(&view(), &VelMenuView::told);
        XDoTool::press(QStringLiteral("Return"));
        QTRY_COMPARE(told.size(), 1);
        QCOMPARE(told.at(0).at(0).toString(),
                 QStringLiteral("%1 cannot be edited, because the folder %2 may not be written.")
                     .arg(m_entry, menu()));
        XDoTool::press(QStringLiteral("F2"));
        QTRY_COMPARE(told.size(), 2);
        QVERIFY(modal.finished());
        QVERIFY(dialog()->isVisible());
    }
    QVERIFY(QFile::setPermissions(menu(), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
}

void tst_VelMenuDialogEnter::takesAHeldKeyOnce()
{
    openDialog(menu(), 2);
    clickItem(m_folder);
    // Not by hand: on a busy machine the repetitions of the X server come as further presses.
    for (const bool isRepetition : {false, true, true}) {
        QKeyEvent press(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier, QStringLiteral("\r"), isRepetition);
        QCoreApplication::sendEvent(&view(), &press);
        QVERIFY(press.isAccepted());
        QVERIFY(view().isExpanded(shown(view(), m_folder)));
    }
    QVERIFY(dialog()->isVisible());
}

void tst_VelMenuDialogEnter::picksAnEntry_data()
{
    keys();
}

void tst_VelMenuDialogEnter::picksAnEntry()
{
    QFETCH(QString, key);
    openPicker();
    clickInPicker(m_entry);
    XDoTool::press(key);
    QTRY_VERIFY(!m_picker->isVisible());
    QCOMPARE(m_picker->result(), int(QDialog::Accepted));
    QCOMPARE(m_picker->selectedItemPath(), m_entry);
}

void tst_VelMenuDialogEnter::opensAndClosesAFolderToPickFrom_data()
{
    keys();
}

void tst_VelMenuDialogEnter::opensAndClosesAFolderToPickFrom()
{
    QFETCH(QString, key);
    openPicker();
    clickInPicker(m_folder);
    XDoTool::press(key);
    QTRY_VERIFY(m_tree->isExpanded(shown(*m_tree, m_folder)));
    XDoTool::press(key);
    QTRY_VERIFY(!m_tree->isExpanded(shown(*m_tree, m_folder)));
    XDoTool::press(QStringLiteral("F2"));
    QVERIFY(m_picker->isVisible());
}

void tst_VelMenuDialogEnter::picksAnEntryByADoubleClick()
{
    openPicker();
    XDoTool::run(QLatin1String("mousemove ")
                 + XDoTool::at(m_tree->viewport(), m_tree->visualRect(shown(*m_tree, m_entry)).center())
                 + QLatin1String(" click --repeat 2 --delay 60 1"));
    QTRY_VERIFY(!m_picker->isVisible());
    QCOMPARE(m_picker->result(), int(QDialog::Accepted));
    QCOMPARE(m_picker->selectedItemPath(), m_entry);
}

void tst_VelMenuDialogEnter::picksNoFolderByADoubleClick()
{
    const QString odd = writeFolder(QStringLiteral("odd.desktop"), QStringLiteral("Odd"));
    writeEntry(QStringLiteral("odd.desktop/y.desktop"), QStringLiteral("Y"));
    m_picker = std::make_unique<VelMenuDialog>(menu(), 22, false, false, nullptr, Qt::Window);
    m_tree = m_picker->findChild<VelMenuView *>();
    m_picker->show();
    QVERIFY(QTest::qWaitForWindowActive(m_picker.get()));
    QVERIFY(open(*m_tree, menu(), 3));
    XDoTool::run(QLatin1String("mousemove ")
                 + XDoTool::at(m_tree->viewport(), m_tree->visualRect(shown(*m_tree, odd)).center())
                 + QLatin1String(" click --repeat 2 --delay 60 1"));
    QTRY_VERIFY(m_tree->isExpanded(shown(*m_tree, odd)));
    QVERIFY(m_picker->isVisible());
}

void tst_VelMenuDialogEnter::leavesItToTheButtonsWithoutAnItem()
{
    openPicker();
    m_tree->setFocus();
    m_tree->selectionModel()->clear();
    m_picker->findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok)->setEnabled(true);
    XDoTool::press(QStringLiteral("Return"));
    QTRY_VERIFY(!m_picker->isVisible());
}

VEL_TEST_MAIN(tst_VelMenuDialogEnter)

#include "tst_VelMenuDialogEnter.moc"
