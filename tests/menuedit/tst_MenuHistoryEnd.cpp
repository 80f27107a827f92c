// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "VelMenuView.h"

#include <QAction>

#include <memory>

#include <malloc.h>

/// The end of a view that has something to take back. What it ends with is compiled as for a release: the
/// compiler then leaves nothing behind that tells a member which has ended.
class tst_MenuHistoryEnd : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void endsWithStepsInTheHistory_data();
    void endsWithStepsInTheHistory();
};

// What is freed is filled, so that nobody can use it and not be noticed.
void tst_MenuHistoryEnd::init()
{
    MenuTestCase::init();
    mallopt(M_PERTURB, 0xa5);
}

void tst_MenuHistoryEnd::cleanup()
{
    mallopt(M_PERTURB, 0);
    MenuTestCase::cleanup();
}

void tst_MenuHistoryEnd::endsWithStepsInTheHistory_data()
{
    QTest::addColumn<bool>("isUndone");
    QTest::newRow("to undo") << false;
    QTest::newRow("to do again") << true;
}

void tst_MenuHistoryEnd::endsWithStepsInTheHistory()
{
    QFETCH(bool, isUndone);
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"));
    auto view = std::make_unique<VelMenuView>(menu(), -1, true);
    view->setAssistance(true);
    QVERIFY(open(*view, menu(), 2));
    select(*view, a);
    view->slotDown();
    QVERIFY(view->undoAction()->isEnabled());
    if (isUndone) {
        view->undoAction()->trigger();
        QVERIFY(view->redoAction()->isEnabled());
    }
    view.reset();
}

VEL_TEST_MAIN(tst_MenuHistoryEnd)

#include "tst_MenuHistoryEnd.moc"
