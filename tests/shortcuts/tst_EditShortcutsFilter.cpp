// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The filter above the tree, as a person uses it.

#include "QtMajor.h"
#include "RecordingTestCase.h"

#include <QLineEdit>

class tst_EditShortcutsFilter : public RecordingTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void beginsInTheFilter();
    void filtersWhileOneTypes();
    void findsAKeyAsItIsWritten();
    void saysThatNothingMatches();
    void leadsDownIntoTheTree_data();
    void leadsDownIntoTheTree();
    void isReachedFromTheTree();
    void goesBeforeEscapeCloses();
    void presentsWhoHasThePressedKeys();
    void continuesASequenceThatIsPressed();
    void looksForKeysThatWouldDoSomethingElse();
    void bringsTheTextBackAfterPressingKeys();
    void leavesTheFieldWithTabWhileKeysArePressed();
    void showsChangedShortcutsOnly();
    void disablesTheKeyOfARowThatIsNotSeen();
    void isFirstOnTheWayOfTheTabKey();

private:
    QLineEdit *filterEdit() const { return child<QLineEdit>("filterEdit"); }
    QAbstractButton *pressKeysButton() const { return child<QAbstractButton>("pressKeysButton"); }
    QAbstractButton *changedOnlyButton() const { return child<QAbstractButton>("changedOnlyButton"); }
    QLabel *noMatchLabel() const { return child<QLabel>("noMatchLabel"); }

    // The names of the actions that are seen.
    QString shown() const
    {
        QStringList names;
        for (const char *name : {"open", "print", "save", "copy", "cut"}) {
            const QModelIndex index = row(name);
            if (!tree()->isRowHidden(index.row(), index.parent())
                && !tree()->isRowHidden(index.parent().row(), {}))
                names.append(str(name));
        }
        return names.join(QLatin1Char(' '));
    }
    void type(const char *text) const { XDoTool::run(str("type --delay 20 ") + str(text)); }
    void pressKeys(const char *keys)
    {
        XDoTool::click(pressKeysButton());
        QTRY_VERIFY(pressKeysButton()->isChecked() && filterEdit()->hasFocus());
        XDoTool::press(str(keys));
    }
};

void tst_EditShortcutsFilter::init()
{
    DialogTestCase::init();
    m_dialog->setAssistance(true);
    m_dialog->show();
    m_dialog->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
}

void tst_EditShortcutsFilter::beginsInTheFilter()
{
    QVERIFY(filterEdit()->hasFocus());
    QCOMPARE(shown(), str("open print save copy cut"));
    QVERIFY(!pressKeysButton()->isChecked());
    QVERIFY(!changedOnlyButton()->isChecked());
    QVERIFY(!noMatchLabel()->isVisible());
}

void tst_EditShortcutsFilter::filtersWhileOneTypes()
{
    type("FILE");
    QTRY_COMPARE(shown(), str("open print save"));
    XDoTool::run(str("key space type --delay 20 pri"));
    QTRY_COMPARE(shown(), str("print"));
    XDoTool::press(str("ctrl+a"));
    XDoTool::press(str("BackSpace"));
    QTRY_COMPARE(shown(), str("open print save copy cut"));
}

void tst_EditShortcutsFilter::findsAKeyAsItIsWritten()
{
    type("ctrl+k");
    QTRY_COMPARE(shown(), str("cut"));
}

void tst_EditShortcutsFilter::saysThatNothingMatches()
{
    type("zzz");
    QTRY_VERIFY(noMatchLabel()->isVisible());
    QCOMPARE(shown(), QString());
    QCOMPARE(noMatchLabel()->text(), str("No action matches the filter."));
    XDoTool::press(str("Escape"));
    QTRY_VERIFY(!noMatchLabel()->isVisible());
    pressKeys("F12");
    QTRY_VERIFY(noMatchLabel()->isVisible());
    QCOMPARE(noMatchLabel()->text(), str("No action has the shortcut F12."));
}

void tst_EditShortcutsFilter::leadsDownIntoTheTree_data()
{
    QTest::addColumn<QString>("key");
    for (const char *key : {"Down", "Next", "Return", "KP_Enter"})
        QTest::newRow(key) << str(key);
}

void tst_EditShortcutsFilter::leadsDownIntoTheTree()
{
    QFETCH(QString, key);
    m_dialog->setChanged(true);
    type("copy");
    QTRY_COMPARE(shown(), str("copy"));
    XDoTool::press(key);
    QTRY_VERIFY(tree()->hasFocus());
    QCOMPARE(tree()->currentIndex(), row("copy"));
    QVERIFY(groupBox()->isEnabled());
    QVERIFY(m_dialog->isVisible());
}

void tst_EditShortcutsFilter::isReachedFromTheTree()
{
    tree()->setFocus();
    XDoTool::press(str("ctrl+f"));
    QTRY_VERIFY(filterEdit()->hasFocus());
    type("cut");
    QTRY_COMPARE(shown(), str("cut"));
    tree()->setFocus();
    XDoTool::press(str("ctrl+f"));
    QTRY_COMPARE(filterEdit()->selectedText(), str("cut"));
}

void tst_EditShortcutsFilter::goesBeforeEscapeCloses()
{
    type("copy");
    QTRY_COMPARE(shown(), str("copy"));
    XDoTool::press(str("Down"));
    QTRY_VERIFY(tree()->hasFocus());
    XDoTool::press(str("Escape"));
    QTRY_COMPARE(shown(), str("open print save copy cut"));
    QVERIFY(m_dialog->isVisible());
    XDoTool::click(changedOnlyButton());
    QTRY_COMPARE(shown(), QString());
    XDoTool::press(str("Escape"));
    QTRY_COMPARE(shown(), str("open print save copy cut"));
    QVERIFY(m_dialog->isVisible());
    XDoTool::press(str("Escape"));
    QTRY_VERIFY(!m_dialog->isVisible());
}

void tst_EditShortcutsFilter::presentsWhoHasThePressedKeys()
{
    pressKeys("F2");
    QTRY_COMPARE(shown(), str("save"));
    QCOMPARE(filterEdit()->text(), str("F2"));
    QVERIFY(keysStay()); // the next key is no second chord
    XDoTool::press(str("ctrl+k"));
    QTRY_COMPARE(shown(), str("cut"));
    XDoTool::press(str("Escape"));
    QTRY_VERIFY(!pressKeysButton()->isChecked());
    QCOMPARE(shown(), str("open print save copy cut"));
    QVERIFY(m_dialog->isVisible());
    QCOMPARE(filterEdit()->text(), QString());
}

void tst_EditShortcutsFilter::continuesASequenceThatIsPressed()
{
    m_model->setKeySequence(row("print"), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_D));
    pressKeys("ctrl+k");
    QTRY_COMPARE(shown(), str("print cut"));
    QVERIFY(keysStay());
    XDoTool::run(str("key ctrl+k key ctrl+c"));
    QTRY_COMPARE(shown(), str("cut"));
    QCOMPARE(filterEdit()->text(),
             VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C).toString());
}

void tst_EditShortcutsFilter::looksForKeysThatWouldDoSomethingElse()
{
    m_dialog->setChanged(true);
    m_model->setKeySequence(row("copy"), QKeySequence(Qt::CTRL | Qt::Key_F));
    m_model->setKeySequence(row("open"), QKeySequence(Qt::Key_Return));
    pressKeys("ctrl+f");
    QTRY_COMPARE(shown(), str("copy"));
    QVERIFY(keysStay());
    XDoTool::press(str("Return"));
    QTRY_COMPARE(shown(), str("open"));
    QVERIFY(m_dialog->isVisible());
    QVERIFY(keysStay());
    XDoTool::press(str("Shift_L"));
    XDoTool::press(str("exclam"));
    QTRY_COMPARE(filterEdit()->text(), str("!"));
}

void tst_EditShortcutsFilter::bringsTheTextBackAfterPressingKeys()
{
    type("copy");
    QTRY_COMPARE(shown(), str("copy"));
    pressKeys("F2");
    QTRY_COMPARE(shown(), str("save"));
    QVERIFY(!filterEdit()->isClearButtonEnabled());
    XDoTool::click(pressKeysButton());
    QTRY_COMPARE(shown(), str("copy"));
    QCOMPARE(filterEdit()->text(), str("copy"));
    QVERIFY(!filterEdit()->isReadOnly());
    QVERIFY(filterEdit()->isClearButtonEnabled());
}

void tst_EditShortcutsFilter::leavesTheFieldWithTabWhileKeysArePressed()
{
    pressKeys("F2");
    QTRY_COMPARE(shown(), str("save"));
    XDoTool::press(str("Tab"));
    QTRY_VERIFY(pressKeysButton()->hasFocus());
    XDoTool::press(str("shift+Tab"));
    QTRY_VERIFY(filterEdit()->hasFocus());
    QCOMPARE(shown(), str("save"));
}

void tst_EditShortcutsFilter::showsChangedShortcutsOnly()
{
    XDoTool::click(changedOnlyButton());
    QTRY_COMPARE(shown(), QString());
    m_model->setKeySequence(row("save"), f9);
    QTRY_COMPARE(shown(), str("save"));
    m_model->commitChanges();
    m_model->setKeySequence(row("open"), QKeySequence());
    QTRY_COMPARE(shown(), str("open save"));
    XDoTool::click(changedOnlyButton());
    QTRY_COMPARE(shown(), str("open print save copy cut"));
}

void tst_EditShortcutsFilter::disablesTheKeyOfARowThatIsNotSeen()
{
    select("open");
    filterEdit()->setFocus();
    type("copy");
    QTRY_COMPARE(shown(), str("copy"));
    QVERIFY(!groupBox()->isEnabled());
    XDoTool::press(str("Escape"));
    QTRY_COMPARE(tree()->currentIndex(), row("open"));
    QVERIFY(groupBox()->isEnabled());
}

void tst_EditShortcutsFilter::isFirstOnTheWayOfTheTabKey()
{
    select("open");
    QStringList names;
    for (int i = 0; i < 6; ++i) {
        names.append(m_dialog->focusWidget()->objectName());
        XDoTool::press(str("Tab"));
        QTRY_VERIFY(m_dialog->focusWidget()->objectName() != names.constLast());
    }
    QCOMPARE(names.join(QLatin1Char(' ')).section(QLatin1Char(' '), 0, 3),
             str("filterEdit pressKeysButton changedOnlyButton schemesButton"));
    QCOMPARE(names.indexOf(str("treeView")), names.indexOf(str("defaultKeyRB")) - 1);
}

VEL_TEST_MAIN(tst_EditShortcutsFilter)

#include "tst_EditShortcutsFilter.moc"
