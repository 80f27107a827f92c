// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/RowsChangedEvent.h>
#include <shortcuts/ShortcutsTreeView.h>

#include <QAction>
#include <QSignalSpy>
#include <QStandardItemModel>

#include <memory>

namespace {

const QKeySequence f1(Qt::Key_F1);
const QKeySequence f2(Qt::Key_F2);
const QKeySequence f3(Qt::Key_F3);

QString str(const char *text)
{
    return QString::fromLatin1(text);
}

} // namespace

class tst_ShortcutsTreeView : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void tellsWhichShortcutIsCurrent();
    void tellsThatAGroupIsCurrent();
    void saysNothingWhenTheCurrentItemStays();
    void setsTheKeyOfTheCurrentShortcut();
    void hasNoKeyWhileAGroupIsCurrent();
    void tellsOfAChangedKeyOfTheCurrentShortcut();
    void tellsOfAChangeOfTheFirstRowFromEitherColumn_data();
    void tellsOfAChangeOfTheFirstRowFromEitherColumn();
    void keepsQuietAboutOtherRows();
    void isAPlainTreeWithAnotherModel();
    void isAsWideAsItsWidestText_data();
    void isAsWideAsItsWidestText();
    void drawsOpenGroupsAsIfAllWereExpanded();
    void isToldOfRowsWhileItListensOnly();

    void hidesRowsThatAreEmptyWhenItOpens();
    void hidesRowsThatBecomeEmpty();
    void leavesTheCurrentShortcutWhenItGoes();
    void staysOnTheCurrentShortcutWhenRowsComeBeforeIt();
    void showsARowAgainThatIsUsedAgain();
    void showsARowThatIsRegisteredLater();
    void keepsItsModelWhenTheOneBeforeGoes();
    void outlivesItsModel();

    void showsWhatAFilterMatchesInItsGroups();
    void tellsHowManyShortcutsAFilterMatches();
    void opensGroupsWhileTheyAreFiltered();
    void leavesAFilteredRowUntilItIsSeenAgain();
    void staysWhereTheUserWentMeanwhile();
    void keepsTheCurrentRowWhileItsKeyChanges();
    void filtersWhatIsRegisteredLater();
    void selectsTheFirstShortcutThatIsSeen();

private:
    static ShortcutFilter filterFor(const char *text)
    {
        ShortcutFilter filter;
        filter.setText(str(text));
        return filter;
    }
    QModelIndex row(int group, int row, int column = 0) const
    {
        return m_model->index(row, column, m_model->index(group, 0));
    }
    QAction *addAction(const char *name, const char *group, const QKeySequence &key)
    {
        auto *action = new QAction(str(name), m_owner.get());
        action->setShortcut(key);
        m_model->registerAction(str(name), action, str(group));
        return action;
    }
    // What is seen, top to bottom.
    QStringList shownTexts() const
    {
        QStringList texts;
        for (QModelIndex index = m_model->index(0, 0); index.isValid(); index = m_view->indexBelow(index))
            texts.append(index.data().toString());
        return texts;
    }

    std::unique_ptr<ShortcutsModel> m_model;
    std::unique_ptr<ShortcutsTreeView> m_view;
    std::unique_ptr<QObject> m_owner;
    QAction *m_copy = nullptr;
    QAction *m_open = nullptr;
};

void tst_ShortcutsTreeView::init()
{
    TestCase::init();
    m_owner.reset(new QObject);
    m_model.reset(new ShortcutsModel(nullptr, QString()));
    m_open = addAction("open", "File", f1);
    addAction("save", "File", f2);
    m_copy = addAction("copy", "Edit", f3);
    m_view.reset(new ShortcutsTreeView);
    m_view->setModel(m_model.get());
    m_view->expandAll();
}

void tst_ShortcutsTreeView::cleanup()
{
    m_view.reset();
    m_model.reset();
    m_owner.reset();
    TestCase::cleanup();
}

void tst_ShortcutsTreeView::tellsWhichShortcutIsCurrent()
{
    m_model->setKeySequence(row(0, 0), f3);
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentShortcutChanged);
    QSignalSpy other(m_view.get(), &ShortcutsTreeView::currentItemIsNotShortcut);
    m_view->setCurrentIndex(row(0, 0));
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.at(0).at(0).value<QKeySequence>(), f1);
    QCOMPARE(spy.at(0).at(1).value<QKeySequence>(), f3);
    QCOMPARE(m_view->currentKeySequence(), f3);
    QVERIFY(m_view->isShortcutCurrent());
    m_view->setCurrentIndex(row(1, 0, 1));
    QCOMPARE(spy.count(), 2);
    QCOMPARE(spy.at(1).at(0).value<QKeySequence>(), f3);
    QCOMPARE(other.count(), 0);
}

void tst_ShortcutsTreeView::tellsThatAGroupIsCurrent()
{
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentShortcutChanged);
    QSignalSpy other(m_view.get(), &ShortcutsTreeView::currentItemIsNotShortcut);
    m_view->setCurrentIndex(m_model->index(0, 0));
    QCOMPARE(other.count(), 1);
    m_view->setCurrentIndex(row(0, 0));
    m_view->setCurrentIndex(QModelIndex());
    QCOMPARE(other.count(), 2);
    QCOMPARE(spy.count(), 1);
}

void tst_ShortcutsTreeView::saysNothingWhenTheCurrentItemStays()
{
    m_view->setCurrentIndex(row(0, 0));
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentShortcutChanged);
    m_view->setCurrentIndex(row(0, 0));
    QCOMPARE(spy.count(), 0);

    // Not even when the selection tells of it.
    struct View : ShortcutsTreeView
    {
        using ShortcutsTreeView::currentChanged;
    } view;
    view.setModel(m_model.get());
    QSignalSpy shortcutSpy(&view, &ShortcutsTreeView::currentShortcutChanged);
    QSignalSpy groupSpy(&view, &ShortcutsTreeView::currentItemIsNotShortcut);
    view.currentChanged(row(0, 0), row(0, 0));
    view.currentChanged(m_model->index(0, 0), m_model->index(0, 0));
    QCOMPARE(shortcutSpy.count() + groupSpy.count(), 0);
    view.currentChanged(row(0, 0), QModelIndex());
    QCOMPARE(shortcutSpy.count(), 1);
}

void tst_ShortcutsTreeView::setsTheKeyOfTheCurrentShortcut()
{
    m_view->setCurrentIndex(row(0, 1));
    m_view->setKeySequence(QKeySequence(Qt::Key_F9));
    QCOMPARE(m_model->keySequence(row(0, 1)), QKeySequence(Qt::Key_F9));
    QCOMPARE(m_model->keySequence(row(0, 0)), f1);
}

void tst_ShortcutsTreeView::hasNoKeyWhileAGroupIsCurrent()
{
    QVERIFY(!m_view->isShortcutCurrent());
    m_view->setKeySequence(f3);
    m_view->setCurrentIndex(m_model->index(0, 0));
    m_view->setKeySequence(f3);
    QVERIFY(m_view->currentKeySequence().isEmpty());
    QCOMPARE(m_model->keySequence(row(0, 0)), f1);
}

void tst_ShortcutsTreeView::tellsOfAChangedKeyOfTheCurrentShortcut()
{
    m_view->setCurrentIndex(row(0, 1));
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentShortcutChanged);
    m_model->setKeySequence(row(0, 1), f3);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.at(0).at(0).value<QKeySequence>(), f2);
    QCOMPARE(spy.at(0).at(1).value<QKeySequence>(), f3);
    m_model->resetShortcuts();
    QVERIFY(spy.count() > 1);
    QCOMPARE(spy.constLast().at(1).value<QKeySequence>(), f2);
}

void tst_ShortcutsTreeView::tellsOfAChangeOfTheFirstRowFromEitherColumn_data()
{
    QTest::addColumn<int>("column");
    QTest::newRow("text") << 0;
    QTest::newRow("key") << 1;
}

void tst_ShortcutsTreeView::tellsOfAChangeOfTheFirstRowFromEitherColumn()
{
    QFETCH(int, column);
    m_view->setCurrentIndex(row(0, 0, column));
    m_model->setKeySequence(row(0, 0), f3);
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentShortcutChanged);
    m_model->restoreDefaults();
    QVERIFY(spy.count() > 0);
    QCOMPARE(spy.constLast().at(1).value<QKeySequence>(), f1);
}

void tst_ShortcutsTreeView::keepsQuietAboutOtherRows()
{
    m_view->setCurrentIndex(row(0, 1));
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentShortcutChanged);
    m_model->setKeySequence(row(0, 0), QKeySequence(Qt::Key_F9));
    m_model->setKeySequence(row(1, 0), QKeySequence(Qt::Key_F8));
    m_view->setCurrentIndex(m_model->index(0, 0));
    m_model->restoreDefaults();
    QCOMPARE(spy.count(), 0);
}

void tst_ShortcutsTreeView::isAPlainTreeWithAnotherModel()
{
    QStandardItemModel other(2, 2);
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentShortcutChanged);
    QSignalSpy groupSpy(m_view.get(), &ShortcutsTreeView::currentItemIsNotShortcut);
    m_view->setModel(&other);
    m_view->setCurrentIndex(other.index(1, 1));
    m_view->setKeySequence(f1);
    other.setData(other.index(1, 1), 5);
    QVERIFY(m_view->currentKeySequence().isEmpty());
    QCOMPARE(other.index(1, 1).data().toInt(), 5);
    QCOMPARE(spy.count() + groupSpy.count(), 0);
    m_view->setModel(nullptr);
    m_view->setKeySequence(f1);
}

void tst_ShortcutsTreeView::isAsWideAsItsWidestText_data()
{
    QTest::addColumn<QString>("widest");
    QTest::addColumn<bool>("hasIcon");
    QTest::newRow("many equal ones") << str("999") << false;
    QTest::newRow("wide letters") << str("WWWWWWWW WWWWW") << false;
    QTest::newRow("icon") << str("wwwwwwwww") << true;
    QTest::newRow("kerning") << str("AVAVAVAVAVAVAV") << false;
    QTest::newRow("Arabic")
        << QString::fromUtf8("\xd8\xa7\xd9\x84\xd8\xb3\xd9\x84\xd8\xa7\xd9\x85 ").repeated(5) << false;
    QTest::newRow("Greek") << QString::fromUtf8("\xce\xa9\xce\xb8\xce\xbb").repeated(12) << false;
}

void tst_ShortcutsTreeView::isAsWideAsItsWidestText()
{
    QFETCH(QString, widest);
    QFETCH(bool, hasIcon);
    for (int i = 100; i < 900; ++i)
        addAction(qPrintable(QString::number(i)), "Numbers", QKeySequence());
    QAction *action = addAction("x", "Numbers", QKeySequence());
    action->setText(widest);
    QPixmap pixmap(16, 16);
    pixmap.fill(Qt::red);
    if (hasIcon)
        action->setIcon(QIcon(pixmap));

    // A plain tree looks at every row of so few.
    QTreeView plain;
    plain.setModel(m_model.get());
    ShortcutsTreeView view;
    view.setModel(m_model.get());
    for (QTreeView *tree : {&plain, static_cast<QTreeView *>(&view)}) {
        tree->expandAll();
        tree->resizeColumnToContents(0);
    }
    QCOMPARE(view.columnWidth(0), plain.columnWidth(0));
    view.collapseAll();
    plain.collapseAll();
    view.resizeColumnToContents(0);
    plain.resizeColumnToContents(0);
    QCOMPARE(view.columnWidth(0), plain.columnWidth(0));
}

void tst_ShortcutsTreeView::drawsOpenGroupsAsIfAllWereExpanded()
{
    QPixmap red(16, 16);
    red.fill(Qt::red);
    QPixmap blue(16, 16);
    blue.fill(Qt::blue);
    QIcon icon(red);
    icon.addPixmap(blue, QIcon::Normal, QIcon::On);
    m_open->setIcon(icon);

    QVector<QImage> pictures;
    ShortcutsTreeView opened;
    opened.setModel(m_model.get());
    opened.openAllGroups();
    QTreeView plain;
    plain.setModel(m_model.get());
    plain.expandAll();
    for (QTreeView *tree : {&plain, static_cast<QTreeView *>(&opened)}) {
        tree->resize(300, 200);
        tree->setColumnWidth(0, 200);
        pictures.append(tree->grab().toImage());
    }
    QCOMPARE(pictures.at(1), pictures.at(0));
    // And the view remembers the groups alone.
    QVERIFY(opened.isExpanded(m_model->index(0, 0)) && opened.isExpanded(m_model->index(1, 0)));
    QVERIFY(plain.isExpanded(row(0, 0)));
    QVERIFY(!opened.isExpanded(row(0, 0)));
}

namespace {

class RowsCounter : public QObject
{
public:
    int count = 0;

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        count += event->type() == RowsChangedEvent::eventType() ? 1 : 0;
        return QObject::eventFilter(watched, event);
    }
};

} // namespace

void tst_ShortcutsTreeView::isToldOfRowsWhileItListensOnly()
{
    RowsCounter counter;
    ShortcutsModel model(nullptr, QString());
    model.installEventFilter(&counter);
    const auto registerOne = [&](const char *name) {
        model.registerAction(str(name), new QAction(str(name), m_owner.get()), str("Edit"));
    };
    registerOne("a");
    QCOMPARE(counter.count, 0);
    {
        ShortcutsTreeView view;
        view.setModel(&model);
        registerOne("b");
        QCOMPARE(counter.count, 1);
        view.setModel(nullptr);
        registerOne("c");
        QCOMPARE(counter.count, 1);
        view.setModel(&model);
        registerOne("d");
        QCOMPARE(counter.count, 2);
    }
    registerOne("e");
    QCOMPARE(counter.count, 2);
    model.removeEventFilter(&counter);
}

void tst_ShortcutsTreeView::hidesRowsThatAreEmptyWhenItOpens()
{
    delete m_copy;
    ShortcutsTreeView view;
    view.setModel(m_model.get());
    QVERIFY(view.isRowHidden(0, m_model->index(0, 0)));
    QVERIFY(!view.isRowHidden(1, m_model->index(0, 0)));
    QVERIFY(view.isRowHidden(0, m_model->index(1, 0)));
}

void tst_ShortcutsTreeView::hidesRowsThatBecomeEmpty()
{
    m_view->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_view.get()));
    delete m_copy;
    QTRY_COMPARE(shownTexts(), QStringList({str("File"), str("open"), str("save")}));
    delete m_open;
    QTRY_COMPARE(shownTexts(), QStringList({str("File"), str("save")}));
}

void tst_ShortcutsTreeView::leavesTheCurrentShortcutWhenItGoes()
{
    m_view->setCurrentIndex(row(1, 0));
    QSignalSpy spy(m_view.get(), &ShortcutsTreeView::currentItemIsNotShortcut);
    delete m_copy;
    QVERIFY(m_view->currentKeySequence().isEmpty());
    m_view->setKeySequence(f1);
    QTRY_COMPARE(spy.count(), 1);
    QVERIFY(!m_view->currentIndex().isValid());
}

void tst_ShortcutsTreeView::staysOnTheCurrentShortcutWhenRowsComeBeforeIt()
{
    QAction *early = addAction("a", "Edit", QKeySequence(Qt::Key_F9));
    m_view->setCurrentIndex(row(0, 0));
    QCOMPARE(m_view->currentKeySequence(), f1);
    // Now there is an empty "a" in front of "open".
    delete early;
    QCOMPARE(m_view->currentIndex().row(), 1);
    QCOMPARE(m_view->currentKeySequence(), f1);
    m_view->setKeySequence(QKeySequence(Qt::Key_F8));
    QCOMPARE(m_model->hasKeySequence(QKeySequence(Qt::Key_F8))->name(), str("open"));
    QTRY_COMPARE(shownTexts(),
                 QStringList({str("File"), str("open"), str("save"), str("Edit"), str("copy")}));
}

void tst_ShortcutsTreeView::showsARowAgainThatIsUsedAgain()
{
    delete m_copy;
    QTRY_VERIFY(m_view->isRowHidden(0, m_model->index(1, 0)));
    addAction("copy", "Edit", f2);
    QTRY_COMPARE(shownTexts(),
                 QStringList({str("File"), str("open"), str("save"), str("Edit"), str("copy")}));
}

void tst_ShortcutsTreeView::showsARowThatIsRegisteredLater()
{
    m_view->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_view.get()));
    QCOMPARE(shownTexts().size(), 5);
    addAction("paste", "Edit", QKeySequence(Qt::Key_F4));
    QTRY_COMPARE(
        shownTexts(),
        QStringList({str("File"), str("open"), str("save"), str("Edit"), str("copy"), str("paste")}));
}

void tst_ShortcutsTreeView::keepsItsModelWhenTheOneBeforeGoes()
{
    ShortcutsModel other(nullptr, QString());
    m_view->setModel(&other);
    m_model.reset();
    QCOMPARE(m_view->model(), &other);
    m_view->setModel(nullptr);
}

void tst_ShortcutsTreeView::outlivesItsModel()
{
    m_view->setCurrentIndex(row(0, 0));
    delete m_copy;
    m_model.reset();
    QCoreApplication::processEvents();
    m_view->setKeySequence(f1);
    QVERIFY(m_view->currentKeySequence().isEmpty());
}

void tst_ShortcutsTreeView::showsWhatAFilterMatchesInItsGroups()
{
    m_view->setFilter(filterFor("open"));
    QCOMPARE(shownTexts(), (QStringList{str("File"), str("open")}));
    m_view->setFilter(filterFor("edit"));
    QVERIFY(m_view->isRowHidden(0, {}));
    QVERIFY(!m_view->isRowHidden(0, m_model->index(1, 0)));
    m_view->setFilter(ShortcutFilter());
    QCOMPARE(shownTexts().size(), 5);
}

void tst_ShortcutsTreeView::tellsHowManyShortcutsAFilterMatches()
{
    QVector<int> counts;
    const auto tell = [&counts](int count) { counts.append(count); };
    m_view->setFilter(filterFor("file"), tell);
    QCOMPARE(counts, (QVector<int>{2}));
    m_model->setKeySequence(row(0, 0), f3);
    QTRY_COMPARE(counts, (QVector<int>{2, 2}));
    m_view->setFilter(filterFor("none of these"), tell);
    QCOMPARE(counts, (QVector<int>{2, 2, 0}));
    QVERIFY(m_view->isRowHidden(0, {}));
    QVERIFY(m_view->isRowHidden(1, {}));
}

void tst_ShortcutsTreeView::opensGroupsWhileTheyAreFiltered()
{
    m_view->collapse(m_model->index(0, 0));
    m_view->setFilter(filterFor("open"));
    QCOMPARE(shownTexts(), (QStringList{str("File"), str("open")}));
    m_view->setFilter(filterFor("save"));
    QVERIFY(m_view->isExpanded(m_model->index(0, 0)));
    m_view->setFilter(ShortcutFilter());
    QVERIFY(!m_view->isExpanded(m_model->index(0, 0)));
    QVERIFY(m_view->isExpanded(m_model->index(1, 0)));
}

void tst_ShortcutsTreeView::leavesAFilteredRowUntilItIsSeenAgain()
{
    m_view->setCurrentIndex(row(0, 0));
    QSignalSpy other(m_view.get(), &ShortcutsTreeView::currentItemIsNotShortcut);
    m_view->setFilter(filterFor("save"));
    QCOMPARE(other.count(), 1);
    QVERIFY(!m_view->currentIndex().isValid());
    m_view->setFilter(filterFor("s"));
    QVERIFY(!m_view->isShortcutCurrent());
    m_view->setFilter(ShortcutFilter());
    QCOMPARE(m_view->currentIndex(), row(0, 0));
    QVERIFY(m_view->selectionModel()->isSelected(row(0, 0)));
}

void tst_ShortcutsTreeView::staysWhereTheUserWentMeanwhile()
{
    m_view->setCurrentIndex(row(0, 0));
    m_view->setFilter(filterFor("copy"));
    m_view->setCurrentIndex(row(1, 0));
    m_view->setFilter(ShortcutFilter());
    QCOMPARE(m_view->currentIndex(), row(1, 0));
}

void tst_ShortcutsTreeView::keepsTheCurrentRowWhileItsKeyChanges()
{
    int lookups = 0;
    m_view->setFilter(filterFor("f1"), [&lookups](int) { ++lookups; });
    QCOMPARE(shownTexts(), (QStringList{str("File"), str("open")}));
    m_view->setCurrentIndex(row(0, 0));
    m_model->setKeySequence(row(0, 0), QKeySequence(Qt::Key_F9));
    m_model->setKeySequence(row(1, 0), f1);
    QTRY_COMPARE(lookups, 2);
    QCOMPARE(m_view->currentIndex(), row(0, 0));
    QVERIFY(!m_view->isRowHidden(0, m_model->index(0, 0)));
    QVERIFY(!m_view->isRowHidden(0, m_model->index(1, 0)));
    m_view->setFilter(filterFor("f1 "));
    QVERIFY(m_view->isRowHidden(0, {}));
}

void tst_ShortcutsTreeView::filtersWhatIsRegisteredLater()
{
    m_view->setFilter(filterFor("new"));
    addAction("new one", "File", QKeySequence());
    addAction("another one", "File", QKeySequence());
    addAction("a new group's", "Help", QKeySequence());
    QTRY_COMPARE(shownTexts().size(), 4);
    QVERIFY(m_view->isRowHidden(0, m_model->index(0, 0)));
}

void tst_ShortcutsTreeView::selectsTheFirstShortcutThatIsSeen()
{
    m_view->setFilter(filterFor("none of these"));
    m_view->selectFirstShortcut();
    QVERIFY(!m_view->currentIndex().isValid());
    m_view->setFilter(filterFor("copy"));
    m_view->setCurrentIndex(m_model->index(1, 0));
    m_view->selectFirstShortcut();
    QCOMPARE(m_view->currentIndex(), row(1, 0));
    m_view->setFilter(ShortcutFilter());
    m_view->selectFirstShortcut();
    QCOMPARE(m_view->currentIndex(), row(1, 0));
}

VEL_TEST_MAIN(tst_ShortcutsTreeView)

#include "tst_ShortcutsTreeView.moc"
