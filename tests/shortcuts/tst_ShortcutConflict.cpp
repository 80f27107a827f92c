// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "QtMajor.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/ShortcutConflict.h>

class tst_ShortcutConflict : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void knowsWhichGlobalActionsBlock_data();
    void knowsWhichGlobalActionsBlock();
    void looksAtGlobalShortcutsFirst();
    void looksAtTheModelBehindAnIconAction();
    void namesTheLocalHolder();
    void leavesEmptyAndUnknownKeysFree();
    void comparesWholeSequences();

private:
    ShortcutConflict find(const QKeySequence &key) const { return ShortcutConflict::find(*m_model, key); }

    QScopedPointer<ShortcutsModel> m_model;
};

void tst_ShortcutConflict::init()
{
    TestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    m_model.reset(new ShortcutsModel(nullptr, QString()));
    m_model->registerShortcutObject(
        new KeyTestObject(QStringLiteral("n"), QStringLiteral("g"), QKeySequence(Qt::Key_F1)));
    m_model->registerShortcutObject(new KeyTestObject(QStringLiteral("none"), QStringLiteral("g")));
    m_model->registerShortcutObject(
        new KeyTestObject(QStringLiteral("k"), QStringLiteral("g"),
                          VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C)));
}

void tst_ShortcutConflict::cleanup()
{
    m_model.reset();
    qunsetenv("VEL_CONFIG_HOME");
    TestCase::cleanup();
}

void tst_ShortcutConflict::knowsWhichGlobalActionsBlock_data()
{
    QTest::addColumn<bool>("blocks");
    for (const char *action :
         {"VELWM_MENU", "VELWM_icon_X", "velwm_ICON", "X_VELWM_ICON", "My_ICON", "VELWMICON", "anything"})
        QTest::newRow(action) << true;
    for (const char *action : {"VELWM_ICON", "VELWM_SHOW_ICONS", "VELWM_MY_ICONIFY", ""})
        QTest::newRow(action) << false;
}

void tst_ShortcutConflict::knowsWhichGlobalActionsBlock()
{
    QTEST(ShortcutConflict::blocksKey(QLatin1String(QTest::currentDataTag())), "blocks");
}

void tst_ShortcutConflict::looksAtGlobalShortcutsFirst()
{
    write(QStringLiteral("keyshortcutrc"), "[ShortCutKeys]\nF1=\"VELWM_MENU\"\n");
    const ShortcutConflict conflict = find(QKeySequence(Qt::Key_F1));
    QCOMPARE(conflict.kind, ShortcutConflict::Global);
    QCOMPARE(conflict.holder, QStringLiteral("VELWM_MENU"));
}

void tst_ShortcutConflict::looksAtTheModelBehindAnIconAction()
{
    write(QStringLiteral("keyshortcutrc"), "[ShortCutKeys]\nF1=VELWM_ICON\nF2=VELWM_ICON\n");
    QCOMPARE(find(QKeySequence(Qt::Key_F1)).kind, ShortcutConflict::Local);
    QCOMPARE(find(QKeySequence(Qt::Key_F2)).kind, ShortcutConflict::None);
}

void tst_ShortcutConflict::namesTheLocalHolder()
{
    const ShortcutConflict conflict = find(QKeySequence(Qt::Key_F1));
    QCOMPARE(conflict.kind, ShortcutConflict::Local);
    QCOMPARE(conflict.holder, QStringLiteral("Text of n"));
}

void tst_ShortcutConflict::leavesEmptyAndUnknownKeysFree()
{
    write(QStringLiteral("keyshortcutrc"), "[ShortCutKeys]\nNone+=act\nGibberish=act\n");
    QCOMPARE(find(QKeySequence()).kind, ShortcutConflict::None);
    QCOMPARE(find(QKeySequence(Qt::Key_unknown)).kind, ShortcutConflict::None);
    QCOMPARE(find(QKeySequence(Qt::Key_F5)).kind, ShortcutConflict::None);
}

void tst_ShortcutConflict::comparesWholeSequences()
{
    QCOMPARE(find(QKeySequence(Qt::CTRL | Qt::Key_K)).kind, ShortcutConflict::None);
    QCOMPARE(find(VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C)).kind,
             ShortcutConflict::Local);
}

VEL_TEST_MAIN(tst_ShortcutConflict)

#include "tst_ShortcutConflict.moc"
