// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HandsOnTestCase.h"

#include "ModalDriver.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"
#include "XDoTool.h"

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QCursor>
#include <QMenu>
#include <QToolBar>

HandsOnTestCase::HandsOnTestCase() = default;

HandsOnTestCase::~HandsOnTestCase() = default;

void HandsOnTestCase::cleanup()
{
    QGuiApplication::clipboard()->clear();
    closeDialog();
    MenuTestCase::cleanup();
}

void HandsOnTestCase::openDialog(const QString &directory, int count)
{
    m_dialog = std::make_unique<VelMenuDialog>(directory, 22, true, true, nullptr, Qt::Window);
    m_view = m_dialog->findChild<VelMenuView *>();
    m_dialog->show();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    QVERIFY(open(*m_view, directory, count));
}

void HandsOnTestCase::closeDialog()
{
    m_view = nullptr;
    m_dialog.reset();
}

void HandsOnTestCase::clickAction(const char *name)
{
    auto *bar = m_dialog->findChild<QToolBar *>();
    QWidget *button = bar->widgetForAction(action(*m_view, QLatin1String(name)));
    QVERIFY(button && button->isVisible() && button->isEnabled());
    XDoTool::click(button);
}

void HandsOnTestCase::clickItem(const QString &file)
{
    XDoTool::click(m_view->viewport(), placeOf(file));
    QTRY_COMPARE(m_view->selectedPath(), file);
    QTRY_VERIFY(m_view->hasFocus() && m_dialog->isActiveWindow());
}

QPoint HandsOnTestCase::placeOf(const QString &file)
{
    const QRect area = m_view->visualRect(shown(*m_view, file));
    if (!m_view->viewport()->rect().contains(area.center()))
        QTest::qFail(qPrintable(file + QLatin1String(" is out of sight")), __FILE__, __LINE__);
    return {area.left() + 40, area.center().y()};
}

void HandsOnTestCase::pickInDropMenu(ModalDriver &modal, const QString &text)
{
    modal.handle([text](QWidget *window) {
        auto *menu = qobject_cast<QMenu *>(window);
        QVERIFY(menu);
        const QList<QAction *> actions = menu->actions();
        for (QAction *action : actions) {
            if (QString(action->text()).remove(QLatin1Char('&')) != text)
                continue;
            // For a mouse that hardly moved since the menu opened, Qt 6 closes it and does no more.
            QPoint place = menu->actionGeometry(action).center();
            const int far = QApplication::startDragDistance();
            if ((QCursor::pos() - menu->mapToGlobal(place)).manhattanLength() <= far)
                place.rx() += 2 * far;
            return XDoTool::click(menu, place);
        }
        QFAIL(qPrintable(QLatin1String("no entry ") + text));
    });
}
