// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The tree of the assisted dialog: keys in view, changes and the way back.

#include "QtMajor.h"
#include "RecordingTestCase.h"

#include <QAccessible>
#include <QHeaderView>
#include <QMenu>
#include <QScreen>
#include <QSettings>
#include <QTextDocument>
#include <QToolTip>

namespace {

const QString sizes = QStringLiteral("EditShortcutsDialog/");

} // namespace

class tst_TreeAssistance : public RecordingTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void keepsKeysInViewBesideALongName();
    void keepsKeysInViewInANarrowWindow();
    void makesRoomForALongKey();
    void remembersSizeAndColumn();
    void cutsARememberedSizeToTheScreen();
    void leavesAPlainDialogItsSize();
    void showsFurtherKeys();
    void keepsTheHeightOfAChangedRow();
    void paintsTheNameOfAChangedRowAnew();
    void takesAnEditBackWithItsButton();
    void takesAnOlderChangeBackToTheDefaultKey();
    void takesNothingBackFromBesideTheButton();
    void takesAnEditBackByKeyboard();
    void takesAnEditBackFromTheMenu();
    void tellsScreenReadersOfChanges();
    void tellsACutNameInFull();

private:
    QRect keyCell(const char *name) const { return tree()->visualRect(row(name).siblingAtColumn(1)); }
    // Where the button of a changed row is.
    QPoint button(const char *name) const
    {
        const QRect cell = keyCell(name);
        return {cell.right() - cell.height() / 2, cell.center().y()};
    }
    using DialogTestCase::button;
    void clickButton(const char *name) { XDoTool::click(tree()->viewport(), button(name)); }
    void edit(const char *name, const QKeySequence &key)
    {
        select(name);
        m_dialog->checkEnteredKeySequence(key);
        QCOMPARE(pendingKey(name), key);
        QVERIFY(isChanged());
    }
    // Whether both columns are within the view, to the last pixel.
    bool areColumnsInView() const
    {
        return tree()->columnWidth(0) + tree()->columnWidth(1) == tree()->viewport()->width()
            && tree()->columnWidth(1) > 0 && tree()->columnWidth(0) > 0;
    }
};

void tst_TreeAssistance::init()
{
    DialogTestCase::init();
    addAction("a-long-one", "Edit", QKeySequence(Qt::Key_F8))
        ->setText(QString(60, QLatin1Char('W')) + str(" <b>&&</b>"));
    m_dialog->setAssistance(true);
    m_dialog->show();
    m_dialog->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
}

void tst_TreeAssistance::cleanup()
{
    QSettings().clear();
    RecordingTestCase::cleanup();
}

void tst_TreeAssistance::keepsKeysInViewBesideALongName()
{
    QTRY_VERIFY(areColumnsInView());
    QVERIFY(tree()->columnWidth(1) >= static_cast<QAbstractItemView *>(tree())->sizeHintForColumn(1));
    QVERIFY(tree()->columnWidth(0) > tree()->columnWidth(1));
}

void tst_TreeAssistance::keepsKeysInViewInANarrowWindow()
{
    m_dialog->resize(m_dialog->minimumSizeHint());
    QTRY_VERIFY(areColumnsInView());
    m_dialog->resize(1000, 600);
    QTRY_VERIFY(tree()->viewport()->width() > 900 && areColumnsInView());
    tree()->header()->resizeSection(0, 5000);
    QVERIFY(areColumnsInView());
    tree()->header()->resizeSection(1, 5000);
    QVERIFY(areColumnsInView());
    tree()->header()->resizeSection(1, 0);
    QVERIFY(areColumnsInView());
}

void tst_TreeAssistance::makesRoomForALongKey()
{
    const int before = tree()->columnWidth(1);
    const int chord = Qt::CTRL | Qt::ALT | Qt::SHIFT | Qt::META;
    edit("copy", VelTest::keySequence(chord | Qt::Key_A, chord | Qt::Key_B));
    QVERIFY(tree()->columnWidth(1) > before);
    QVERIFY(areColumnsInView());
    m_dialog->processButtonBox(DialogTestCase::button(QDialogButtonBox::Reset));
    QTRY_COMPARE(tree()->columnWidth(1), before);
}

void tst_TreeAssistance::remembersSizeAndColumn()
{
    m_dialog->resize(700, 555);
    const QRect border = tree()->header()->rect();
    const int x = tree()->columnWidth(0);
    XDoTool::run(str("mousemove %1 sleep 0.1 mousedown 1 sleep 0.1 mousemove %2 sleep 0.1 mouseup 1")
                     .arg(XDoTool::at(tree()->header(), {x, border.center().y()}),
                          XDoTool::at(tree()->header(), {x - 80, border.center().y()})));
    QTRY_VERIFY(qAbs(tree()->columnWidth(0) - (x - 80)) < 5);
    const int keys = tree()->columnWidth(1);
    QVERIFY(areColumnsInView());
    m_dialog->reject();
    QCOMPARE(QSettings().value(sizes + str("Width")).toInt(), 700);

    EditShortcutsDialog next(m_model.get());
    next.setAssistance(true);
    next.show();
    QVERIFY(QTest::qWaitForWindowExposed(&next));
    QCOMPARE(next.size(), QSize(700, 555));
    QCOMPARE(next.findChild<QTreeView *>(str("treeView"))->columnWidth(1), keys);
}

void tst_TreeAssistance::cutsARememberedSizeToTheScreen()
{
    QSettings settings;
    settings.setValue(sizes + str("Width"), 90000);
    settings.setValue(sizes + str("Height"), 90000);
    EditShortcutsDialog next(m_model.get());
    next.setAssistance(true);
    QCOMPARE(next.size(), next.screen()->availableSize());
    settings.setValue(sizes + str("Width"), str("wide"));
    settings.setValue(sizes + str("Height"), -7);
    EditShortcutsDialog other(m_model.get());
    other.setAssistance(true);
    other.show();
    QVERIFY(QTest::qWaitForWindowExposed(&other));
    QVERIFY(other.width() >= other.minimumSizeHint().width());
}

void tst_TreeAssistance::leavesAPlainDialogItsSize()
{
    m_dialog->resize(700, 555);
    m_dialog->setAssistance(false);
    m_dialog->resize(650, 520);
    m_dialog->hide();
    QCOMPARE(QSettings().value(sizes + str("Width")).toInt(), 700);
    QVERIFY(tree()->header()->stretchLastSection());
    const EditShortcutsDialog plain(m_model.get());
    QCOMPARE(plain.size(), QSize(614, 504));
}

void tst_TreeAssistance::showsFurtherKeys()
{
    const int before = tree()->columnWidth(1);
    QAction *paste = addAction("paste", "Edit", QKeySequence());
    paste->setShortcuts({QKeySequence(Qt::CTRL | Qt::Key_V), QKeySequence(Qt::CTRL | Qt::ALT | Qt::Key_F12)});
    m_model->resetShortcuts();
    QTRY_VERIFY(tree()->columnWidth(1) > before);
    QCOMPARE(m_model->data(row("paste").siblingAtColumn(1)).toString(), str("Ctrl+V"));
}

void tst_TreeAssistance::keepsTheHeightOfAChangedRow()
{
    const int height = tree()->visualRect(row("open")).height();
    m_model->setKeySequence(row("open"), f9);
    tree()->doItemsLayout();
    QCOMPARE(tree()->visualRect(row("open")).height(), height);
}

void tst_TreeAssistance::paintsTheNameOfAChangedRowAnew()
{
    const auto isShownAsItIs = [this] {
        const QRect name = tree()->visualRect(row("open"));
        const QPoint place = tree()->viewport()->mapTo(m_dialog.get(), name.topLeft());
        const QPixmap shown = m_dialog->screen()->grabWindow(m_dialog->winId(), place.x(), place.y(),
                                                             name.width(), name.height());
        return shown.toImage() == tree()->viewport()->grab(name).toImage();
    };
    // What comes changes neither the height of the row nor the width of the columns.
    QPixmap icon(24, 24);
    icon.fill(Qt::red);
    tree()->setIconSize(icon.size());
    open->setIcon(icon);
    m_model->setKeySequence(row("copy"), QKeySequence(str("Ctrl+K, Ctrl+Alt+Shift+F12")));
    tree()->doItemsLayout();
    QCoreApplication::processEvents();
    tree()->viewport()->repaint();
    QTRY_VERIFY(isShownAsItIs());
    m_model->setKeySequence(row("open"), f9);
    QTRY_VERIFY(isShownAsItIs());
}

void tst_TreeAssistance::takesAnEditBackWithItsButton()
{
    edit("open", f9);
    edit("save", QKeySequence());
    select("copy");
    clickButton("open");
    QTRY_COMPARE(pendingKey("open"), f1);
    QVERIFY(isChanged());
    clickButton("save");
    QTRY_COMPARE(pendingKey("save"), f2);
    QVERIFY(!isChanged());
    QCOMPARE(tree()->currentIndex().siblingAtColumn(0), row("save"));
}

void tst_TreeAssistance::takesAnOlderChangeBackToTheDefaultKey()
{
    m_model->setKeySequence(row("open"), f9);
    m_model->commitChanges();
    m_dialog->processButtonBox(DialogTestCase::button(QDialogButtonBox::RestoreDefaults));
    m_dialog->setChanged(false);
    QVERIFY(!DialogTestCase::button(QDialogButtonBox::RestoreDefaults)->isEnabled());
    clickButton("open");
    QTRY_COMPARE(pendingKey("open"), f9);
    QVERIFY(DialogTestCase::button(QDialogButtonBox::RestoreDefaults)->isEnabled());
    QVERIFY(!isChanged());
    QVERIFY(keysStay()); // the next click is no double one
    clickButton("open");
    QTRY_COMPARE(pendingKey("open"), f1);
    QCOMPARE(open->shortcut(), f9);
    QVERIFY(isChanged());
    clickButton("open"); // a double click
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), f1);
    clickButton("open");
    QTRY_COMPARE(pendingKey("open"), f9);
    QVERIFY(!isChanged());
}

void tst_TreeAssistance::takesNothingBackFromBesideTheButton()
{
    edit("open", f9);
    XDoTool::click(tree()->viewport(), keyCell("open").center());
    XDoTool::run(str("mousemove %1 sleep 0.1 mousedown 1 sleep 0.1 mousemove %2 sleep 0.1 mouseup 1")
                     .arg(XDoTool::at(tree()->viewport(), button("open")),
                          XDoTool::at(tree()->viewport(), keyCell("open").center())));
    clickButton("save");
    QTRY_COMPARE(tree()->currentIndex().siblingAtColumn(0), row("save"));
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(pendingKey("save"), f2);
}

void tst_TreeAssistance::takesAnEditBackByKeyboard()
{
    edit("open", f9);
    tree()->setFocus();
    XDoTool::press(str("BackSpace"));
    QTRY_COMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
    XDoTool::press(str("BackSpace"));
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), f1);
}

void tst_TreeAssistance::takesAnEditBackFromTheMenu()
{
    edit("open", f9);
    tree()->setFocus();
    ModalDriver modal;
    modal.handle([](QWidget *menu) {
        const QList<QAction *> actions = qobject_cast<QMenu *>(menu)->actions();
        QCOMPARE(actions.size(), 1);
        QVERIFY(actions.constFirst()->isEnabled());
        XDoTool::run(QStringLiteral("key Down key Return"));
    });
    XDoTool::press(str("Menu"));
    QTRY_COMPARE(pendingKey("open"), f1);
    QVERIFY(modal.finished());
}

void tst_TreeAssistance::tellsScreenReadersOfChanges()
{
    edit("open", f9);
    edit("save", QKeySequence());
    const auto spoken = [this](const char *name, int column) {
        return row(name).siblingAtColumn(column).data(Qt::AccessibleTextRole).toString();
    };
    QCOMPARE(spoken("open", 0), str("Text of open, changed"));
    QCOMPARE(spoken("open", 1), str("F9, changed"));
    QCOMPARE(spoken("save", 1), str("No shortcut, changed"));
    QCOMPARE(row("save").data(Qt::AccessibleDescriptionRole).toString(), str("The default shortcut is F2."));
    QCOMPARE(spoken("copy", 0), QString());
    QVERIFY(!m_model->index(0, 0).data(Qt::AccessibleTextRole).isValid());

    const QAccessibleInterface *table = QAccessible::queryAccessibleInterface(tree());
    QVERIFY(table);
    QStringList names;
    for (int i = 0; i < table->childCount(); ++i)
        names.append(table->child(i)->text(QAccessible::Name));
    QVERIFY2(names.contains(str("Text of open, changed")), qPrintable(names.join(QLatin1Char('|'))));

    m_dialog->setAssistance(false);
    QVERIFY(!row("open").data(Qt::AccessibleTextRole).isValid());
    QVERIFY(!row("open").data(Qt::AccessibleDescriptionRole).isValid());
}

void tst_TreeAssistance::tellsACutNameInFull()
{
    const QModelIndex index = m_model->index(0, 0, m_model->index(1, 0));
    QVERIFY(index.data().toString().startsWith(str("WWW")));
    XDoTool::run(str("mousemove ") + XDoTool::at(tree()->viewport(), tree()->visualRect(index).center()));
    QTRY_VERIFY(QToolTip::isVisible());
    QTextDocument shown;
    shown.setHtml(QToolTip::text());
    QCOMPARE(shown.toPlainText(), index.data().toString());
    QToolTip::hideText();
    QTRY_VERIFY(!QToolTip::isVisible());
    edit("copy", f9);
    XDoTool::run(str("mousemove ") + XDoTool::at(tree()->viewport(), button("copy")));
    QTRY_COMPARE(QToolTip::text(), str("Back to F3"));
}

VEL_TEST_MAIN(tst_TreeAssistance)

#include "tst_TreeAssistance.moc"
