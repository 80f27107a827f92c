// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModalDriver.h"
#include "TransferTestCase.h"
#include "VelMenuView.h"

#include <QAction>
#include <QDragEnterEvent>
#include <QDropEvent>
#include <QMenu>
#include <QMimeData>
#include <QSignalSpy>

/// Drops on the view and the question that they ask.
class tst_VelMenuViewDrop : public TransferTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void asksWhatToDoWithADrop_data();
    void asksWhatToDoWithADrop();
    void listsADropBetweenTwoRowsThere();
    void tellsTheSourceWhatWasDone();
    void offersWhatTheSourceAllows_data();
    void offersWhatTheSourceAllows();
    void offersTheChoiceAtTheDrop();
    void takesAClickOfAMouseThatWasNotSeen();
    void goesAwayWhileItAsksWhatToDo();
    void removesNothingAfterADrag();

private:
    void dropAt(VelMenuView &view, const QString &source, const QPointF &at, const QString &choice,
                Qt::DropActions allowed);
    void dropOn(VelMenuView &view, const QString &source, const QString &target, const QString &choice,
                Qt::DropActions allowed = Qt::CopyAction | Qt::MoveAction | Qt::LinkAction);

    Qt::DropAction m_told = Qt::IgnoreAction;
    bool m_isAccepted = false;
};

void tst_VelMenuViewDrop::dropOn(VelMenuView &view, const QString &source, const QString &target,
                                 const QString &choice, Qt::DropActions allowed)
{
    dropAt(view, source, view.visualRect(shown(view, target)).center(), choice, allowed);
}

void tst_VelMenuViewDrop::dropAt(VelMenuView &view, const QString &source, const QPointF &at,
                                 const QString &choice, Qt::DropActions allowed)
{
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(source)});
    QDragEnterEvent enter(at.toPoint(), allowed, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(view.viewport(), &enter);
    QDragMoveEvent move(at.toPoint(), allowed, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(view.viewport(), &move);
    ModalDriver modal;
    modal.handle([&choice](QWidget *window) {
        auto *choices = qobject_cast<QMenu *>(window);
        QVERIFY(choices);
        const QList<QAction *> actions = choices->actions();
        for (QAction *one : actions) {
            if (!choice.isEmpty() && one->text() == choice) {
                choices->setActiveAction(one);
                QTest::keyClick(choices, Qt::Key_Return);
                return;
            }
        }
        QTest::keyClick(choices, Qt::Key_Escape);
    });
    QDropEvent event(at, allowed, &data, Qt::LeftButton, Qt::NoModifier);
    event.setDropAction(Qt::MoveAction);
    event.ignore();
    QCoreApplication::sendEvent(view.viewport(), &event);
    QVERIFY(modal.finished());
    m_told = event.dropAction();
    m_isAccepted = event.isAccepted();
}

void tst_VelMenuViewDrop::asksWhatToDoWithADrop_data()
{
    QTest::addColumn<QString>("choice");
    QTest::addColumn<bool>("isThere");
    QTest::addColumn<bool>("isHere");
    QTest::newRow("move") << "Move" << true << false;
    QTest::newRow("copy") << "Copy" << true << true;
    QTest::newRow("cancel") << "Cancel" << false << true;
    QTest::newRow("dismiss") << "" << false << true;
}

void tst_VelMenuViewDrop::asksWhatToDoWithADrop()
{
    QFETCH(QString, choice);
    QFETCH(bool, isThere);
    QFETCH(bool, isHere);
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    QSignalSpy changes(&view, &VelMenuView::changed);
    dropOn(view, m_a, m_sub, choice);
    QCOMPARE(QFile::exists(m_sub + QLatin1String("/a.desktop")), isThere);
    QCOMPARE(QFile::exists(m_a), isHere);
    QCOMPARE(m_isAccepted, isThere);
    QCOMPARE(changes.count(), isThere ? 1 : 0);
    if (!isThere)
        QCOMPARE(m_told, Qt::IgnoreAction);
}

void tst_VelMenuViewDrop::listsADropBetweenTwoRowsThere()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    QVERIFY(open(view, m_sub, 3));
    QTRY_COMPARE(names(view, m_sub).join(QString()), QStringLiteral("XYZ"));
    const QRect y = view.visualRect(shown(view, m_sub + QLatin1String("/y.desktop")));
    dropAt(view, m_a, QPointF(y.center().x(), y.top()), QStringLiteral("Copy"),
           Qt::MoveAction | Qt::CopyAction);
    QCOMPARE(sortOrderOf(m_sub), QByteArray("*;x.desktop;a.desktop;y.desktop;z.desktop;"));
    QTRY_COMPARE(names(view, m_sub).join(QString()), QStringLiteral("XAYZ"));
}

void tst_VelMenuViewDrop::tellsTheSourceWhatWasDone()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    // A source that is told of a move takes its file away.
    dropOn(view, m_a, m_sub, QStringLiteral("Copy"));
    QCOMPARE(m_told, Qt::CopyAction);
    QVERIFY(QFile::remove(m_sub + QLatin1String("/a.desktop")));
    dropOn(view, m_a, m_sub, QStringLiteral("Move"));
    QCOMPARE(m_told, Qt::MoveAction);
}

void tst_VelMenuViewDrop::offersWhatTheSourceAllows_data()
{
    QTest::addColumn<int>("allowed");
    QTest::addColumn<QStringList>("enabled");
    QTest::newRow("all") << int(Qt::CopyAction | Qt::MoveAction | Qt::LinkAction)
                         << QStringList{QStringLiteral("Move"), QStringLiteral("Copy"),
                                        QStringLiteral("Cancel")};
    QTest::newRow("copy") << int(Qt::CopyAction)
                          << QStringList{QStringLiteral("Copy"), QStringLiteral("Cancel")};
    QTest::newRow("move") << int(Qt::MoveAction)
                          << QStringList{QStringLiteral("Move"), QStringLiteral("Cancel")};
    QTest::newRow("link") << int(Qt::LinkAction) << QStringList{QStringLiteral("Cancel")};
}

void tst_VelMenuViewDrop::offersWhatTheSourceAllows()
{
    QFETCH(int, allowed);
    QFETCH(QStringList, enabled);
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(open(view, menu(), 2));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(m_a)});
    QDropEvent event(view.visualRect(shown(view, m_sub)).center(), Qt::DropActions(allowed), &data,
                     Qt::LeftButton, Qt::NoModifier);
    ModalDriver modal;
    QStringList found;
    modal.handle([&found](QWidget *window) {
        const QList<QAction *> actions = window->actions();
        for (const QAction *one : actions) {
            if (!one->isSeparator() && one->isEnabled())
                found.append(one->text());
        }
        QTest::keyClick(window, Qt::Key_Escape);
    });
    view.dropEvent(&event);
    QVERIFY(modal.finished());
    QCOMPARE(found, enabled);
    QVERIFY(QFile::exists(m_a));
}

void tst_VelMenuViewDrop::offersTheChoiceAtTheDrop()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(m_a)});
    QDropEvent event(QPointF(10.6, 20.4), Qt::MoveAction | Qt::CopyAction, &data, Qt::LeftButton,
                     Qt::NoModifier);
    const QPoint expected = view.viewport()->mapToGlobal(QPoint(11, 20));
    ModalDriver modal;
    modal.handle([expected](QWidget *window) {
        auto *choices = qobject_cast<QMenu *>(window);
        QVERIFY(choices);
        QCOMPARE(choices->pos(), expected);
        const QList<QAction *> actions = choices->actions();
        QStringList texts;
        for (const QAction *one : actions)
            texts.append(one->isSeparator() ? QStringLiteral("-") : one->text());
        QCOMPARE(texts.join(QLatin1Char('|')), QStringLiteral("Move|Copy|-|Cancel"));
        QCOMPARE(actions.constLast()->icon().name(), QStringLiteral("dialog-cancel"));
        choices->close();
    });
    view.dropEvent(&event);
    QVERIFY(modal.finished());
    QVERIFY(!event.isAccepted() || event.dropAction() == Qt::IgnoreAction);
}

// It has dragged the file out of another program's window.
void tst_VelMenuViewDrop::takesAClickOfAMouseThatWasNotSeen()
{
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 2));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(m_a)});
    QDropEvent event(view.visualRect(shown(view, m_sub)).center(), Qt::CopyAction, &data, Qt::LeftButton,
                     Qt::NoModifier);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *choices = qobject_cast<QMenu *>(window);
        QVERIFY(choices);
        QTest::mouseClick(choices, Qt::LeftButton, Qt::NoModifier,
                          choices->actionGeometry(choices->actions().at(1)).center());
    });
    view.dropEvent(&event);
    QVERIFY(modal.finished());
    QCOMPARE(event.dropAction(), Qt::CopyAction);
}

void tst_VelMenuViewDrop::goesAwayWhileItAsksWhatToDo()
{
    auto *view = new VelMenuView(menu(), -1, true);
    view->show();
    QVERIFY(QTest::qWaitForWindowExposed(view));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(m_a)});
    QDropEvent event(QPointF(10, 20), Qt::MoveAction | Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    ModalDriver modal;
    modal.handle([view](QWidget *) { delete view; });
    view->dropEvent(&event);
    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(m_a));
}

void tst_VelMenuViewDrop::removesNothingAfterADrag()
{
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    // What the base class calls for the source of a move.
    QVERIFY(!view.model()->removeRows(0, 1, view.rootIndex()));
    QVERIFY(QFile::exists(m_a));
    QVERIFY(QFile::exists(m_sub));
}

VEL_TEST_MAIN(tst_VelMenuViewDrop)
#include "tst_VelMenuViewDrop.moc"
