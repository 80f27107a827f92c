// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FindTestCase.h"
#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QElapsedTimer>
#include <QFileSystemModel>
#include <QLabel>
#include <QLineEdit>
#include <QProgressDialog>
#include <QPushButton>
#include <QTimer>

#include <functional>
#include <memory>

/// A long search, and the person who waits for it.
class tst_MenuFindByHand : public FindTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void showsAWindowAfterHalfASecond();
    void endsByEscape_data();
    void endsByEscape();
    void endsByTheButton();
    void endsWhenTheEditorIsClosed();
    void takesNoOtherKeysMeanwhile();

private:
    void search(const std::function<void()> &meanwhile);
    QProgressDialog *progress() const { return m_dialog->findChild<QProgressDialog *>(); }

    std::unique_ptr<VelMenuDialog> m_dialog;
    VelMenuView *m_view = nullptr;
    qint64 m_elapsed = 0;
};

void tst_MenuFindByHand::init()
{
    FindTestCase::init();
    writeMaze();
    m_dialog = std::make_unique<VelMenuDialog>(menu(), 22, true, true, nullptr, Qt::Window);
    m_view = m_dialog->findChild<VelMenuView *>();
    m_dialog->show();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    QVERIFY(open(*m_view, menu(), 9));
    select(*m_view, menu() + QLatin1String("/m3"));
    m_view->setFocus();
}

void tst_MenuFindByHand::cleanup()
{
    m_dialog.reset();
    FindTestCase::cleanup();
}

// Types a text that is nowhere; what is done meanwhile begins once the search tells of itself.
void tst_MenuFindByHand::search(const std::function<void()> &meanwhile)
{
    QTimer look;
    bool isBegun = false;
    connect(&look, &QTimer::timeout, &look, [&] {
        if (isBegun || !progress() || !progress()->isActiveWindow())
            return;
        isBegun = true;
        meanwhile();
    });
    look.start(10);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(QStringLiteral("needle"));
        QVERIFY(QTest::qWaitForWindowActive(window));
        XDoTool::press(QStringLiteral("Return"));
    });
    QElapsedTimer timer;
    timer.start();
    m_view->slotFind();
    m_elapsed = timer.elapsed();
    QVERIFY(isBegun);
    QVERIFY(modal.finished());
    QVERIFY(!progress());
    QVERIFY(!QGuiApplication::overrideCursor());
}

void tst_MenuFindByHand::showsAWindowAfterHalfASecond()
{
    search([this] {
        QCOMPARE(progress()->windowTitle(), QStringLiteral("Find"));
        auto *label = progress()->findChild<QLabel *>();
        QCOMPARE(label->text(), QStringLiteral("Searching the menu for 'needle'..."));
        QCOMPARE(label->textFormat(), Qt::PlainText);
        QVERIFY(!QGuiApplication::overrideCursor());
        XDoTool::press(QStringLiteral("Escape"));
    });
}

void tst_MenuFindByHand::endsByEscape_data()
{
    QTest::addColumn<bool>("atTheEditor");
    QTest::newRow("at the window of the search") << false;
    QTest::newRow("at the editor") << true;
}

void tst_MenuFindByHand::endsByEscape()
{
    QFETCH(bool, atTheEditor);
    const QString selected = m_view->selectedPath();
    search([&] {
        if (atTheEditor) {
            m_dialog->activateWindow();
            m_dialog->raise();
            QTRY_VERIFY(m_dialog->isActiveWindow() || !progress());
        }
        XDoTool::press(QStringLiteral("Escape"));
    });
    QVERIFY2(m_elapsed < 5000, qPrintable(QString::number(m_elapsed)));
    QCOMPARE(m_view->selectedPath(), selected);
    QVERIFY(m_dialog->isVisible());
    QVERIFY(files(*m_view)->canFetchMore(files(*m_view)->index(menu() + QLatin1String("/m0"))));
}

void tst_MenuFindByHand::endsByTheButton()
{
    search([this] { XDoTool::click(progress()->findChild<QPushButton *>()); });
    QVERIFY(m_dialog->isVisible());
}

void tst_MenuFindByHand::endsWhenTheEditorIsClosed()
{
    search([this] {
        XDoTool::run(QStringLiteral("windowactivate --sync %1 key alt+F4").arg(m_dialog->winId()));
    });
    QVERIFY2(m_elapsed < 5000, qPrintable(QString::number(m_elapsed)));
}

void tst_MenuFindByHand::takesNoOtherKeysMeanwhile()
{
    search([this] {
        m_dialog->activateWindow();
        QTRY_VERIFY(m_dialog->isActiveWindow() || !progress());
        XDoTool::press(QStringLiteral("Delete"));
        XDoTool::press(QStringLiteral("Escape"));
    });
    QVERIFY(QFileInfo::exists(menu() + QLatin1String("/m3")));
}

VEL_TEST_MAIN(tst_MenuFindByHand)
#include "tst_MenuFindByHand.moc"
