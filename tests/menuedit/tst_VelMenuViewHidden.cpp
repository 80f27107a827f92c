// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "VelMenuView.h"

#include <frame/DesktopEntryRecord.h>

#include <QAction>
#include <QBrush>
#include <QFont>
#include <QMenu>
#include <QSignalSpy>

/// What the tree tells of entries that the menu does not show.
class tst_VelMenuViewHidden : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsNothingWithoutAssistance();
    void showsGrayWhatTheMenuDoesNotShow();
    void showsWhatIsLeftOutWhenAsked();
    void unselectsWhatIsLeftOutAgain();
    void showsTheFileNamesOfTheNameless();
    void filtersWhatIsShownOnly();
    void offersToHideAndToShowAgain();
    void isAsBeforeWithoutAssistance();

private:
    void writeAll();
    static QMenu *contextMenu(const VelMenuView &view) { return view.findChild<QMenu *>(); }
    static QAction *offered(const VelMenuView &view, const char *name);
};

void tst_VelMenuViewHidden::writeAll()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("b.desktop"), QStringLiteral("B"), "Exec=true\nNoDisplay=true\n");
    writeEntry(QStringLiteral("c.desktop"), QStringLiteral("C"), "Exec=true\nHidden=true\n");
    writeEntry(QStringLiteral("d.desktop"), QStringLiteral("D"), "Exec=true\nOnlyShowIn=<b>X</b>;\n");
}

// The entry of the context menu, if the menu has it as it would open now.
QAction *tst_VelMenuViewHidden::offered(const VelMenuView &view, const char *name)
{
    QMenu *menu = contextMenu(view);
    Q_EMIT menu->aboutToShow();
    const QList<QAction *> actions = menu->actions();
    for (QAction *action : actions) {
        if (action->objectName() == QLatin1String(name) && action->isVisible())
            return action;
    }
    return nullptr;
}

void tst_VelMenuViewHidden::tellsNothingWithoutAssistance()
{
    writeAll();
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    view.setHiddenShown(true);
    QCOMPARE(names(view, menu()).join(QString()), QStringLiteral("AB"));
    const QModelIndex b = shown(view, menu() + QLatin1String("/b.desktop"));
    for (const int role : {Qt::ForegroundRole, Qt::ToolTipRole, Qt::FontRole, Qt::AccessibleDescriptionRole})
        QVERIFY(!b.data(role).isValid());
    QVERIFY(!offered(view, "hideAction"));
}

void tst_VelMenuViewHidden::showsGrayWhatTheMenuDoesNotShow()
{
    writeAll();
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    const QModelIndex a = shown(view, menu() + QLatin1String("/a.desktop"));
    const QModelIndex b = shown(view, menu() + QLatin1String("/b.desktop"));
    QVERIFY(!a.data(Qt::ForegroundRole).isValid());
    QVERIFY(!a.data(Qt::ToolTipRole).isValid());
    QVERIFY(b.data(Qt::ForegroundRole).value<QColor>() != view.palette().color(QPalette::Text));
    QCOMPARE(b.data(Qt::ToolTipRole).toString(),
             QStringLiteral("Not in the menu: it is marked not to be displayed (NoDisplay)."));
    QCOMPARE(b.data(Qt::AccessibleDescriptionRole), b.data(Qt::ToolTipRole));
}

void tst_VelMenuViewHidden::showsWhatIsLeftOutWhenAsked()
{
    writeAll();
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setHiddenShown(true);
    QCOMPARE(names(view, menu()).join(QString()), QStringLiteral("ABCD"));
    for (const char *name : {"b", "c", "d"}) {
        const QModelIndex item =
            shown(view, menu() + QLatin1Char('/') + QLatin1String(name) + QLatin1String(".desktop"));
        QVERIFY2(item.data(Qt::ForegroundRole).isValid(), name);
        QVERIFY2(item.data(Qt::ToolTipRole).toString().contains(QLatin1String("Not in the menu")), name);
    }
    // No name of a desktop may look like rich text.
    QVERIFY(shown(view, menu() + QLatin1String("/d.desktop"))
                .data(Qt::ToolTipRole)
                .toString()
                .contains(QLatin1String("&lt;b&gt;X")));
    view.setHiddenShown(false);
    QCOMPARE(names(view, menu()).join(QString()), QStringLiteral("AB"));
}

void tst_VelMenuViewHidden::unselectsWhatIsLeftOutAgain()
{
    writeAll();
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setHiddenShown(true);
    select(view, menu() + QLatin1String("/c.desktop"));
    view.setHiddenShown(false);
    QVERIFY(view.selectedPath().isEmpty());
    QVERIFY(!action(view, QStringLiteral("deleteAction"))->isEnabled());
}

void tst_VelMenuViewHidden::showsTheFileNamesOfTheNameless()
{
    writeEntry(QStringLiteral("n.desktop"), QString());
    write(QStringLiteral("menu/m.desktop"), "nonsense");
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 2));
    QCOMPARE(names(view, menu()).join(QString()), QString());
    view.setAssistance(true);
    QCOMPARE(names(view, menu()), (QStringList{QStringLiteral("m.desktop"), QStringLiteral("n.desktop")}));
    const QModelIndex malformed = shown(view, menu() + QLatin1String("/m.desktop"));
    QVERIFY(malformed.data(Qt::FontRole).value<QFont>().italic());
    QCOMPARE(malformed.data(Qt::ToolTipRole).toString(),
             QStringLiteral("This file is not a desktop entry, whatever its name says."));
    QCOMPARE(shown(view, menu() + QLatin1String("/n.desktop")).data(Qt::ToolTipRole).toString(),
             QStringLiteral("This entry has no name. The name of its file is shown."));
}

void tst_VelMenuViewHidden::filtersWhatIsShownOnly()
{
    writeAll();
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setFilter(QStringLiteral("c.desktop"));
    QTRY_VERIFY(names(view, menu()).isEmpty());
    view.setHiddenShown(true);
    QTRY_COMPARE(names(view, menu()), QStringList{QStringLiteral("C")});
    view.setHiddenShown(false);
    QTRY_VERIFY(names(view, menu()).isEmpty());
}

void tst_VelMenuViewHidden::offersToHideAndToShowAgain()
{
    writeAll();
    QDir().mkpath(menu() + QLatin1String("/folder"));
    VelMenuView view(menu(), -1, true);
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 3));
    const QString a = menu() + QLatin1String("/a.desktop");
    const QSignalSpy told(&view, &VelMenuView::told);
    const QSignalSpy changes(&view, &VelMenuView::changed);
    select(view, a);
    QVERIFY(!offered(view, "showAgainAction"));
    offered(view, "hideAction")->trigger();
    QVERIFY(VelUIDesktopEntry(a).getNoDisplay());
    QCOMPARE(view.selectedPath(), a);
    QVERIFY(shown(view, a).data(Qt::ForegroundRole).isValid());
    QCOMPARE(changes.count(), 1);
    QCOMPARE(told.constLast().constFirst().toString(),
             QStringLiteral("A is hidden: the menu no longer shows it."));

    QVERIFY(!offered(view, "hideAction"));
    offered(view, "showAgainAction")->trigger();
    QVERIFY(!shown(view, a).data(Qt::ForegroundRole).isValid());
    QCOMPARE(told.constLast().constFirst().toString(), QStringLiteral("The menu shows A again."));

    view.undoAction()->trigger();
    QVERIFY(VelUIDesktopEntry(a).getNoDisplay());
    QTRY_VERIFY(shown(view, a).data(Qt::ForegroundRole).isValid());
    view.undoAction()->trigger();
    QTRY_VERIFY(!shown(view, a).data(Qt::ForegroundRole).isValid());

    view.setHiddenShown(true);
    select(view, menu() + QLatin1String("/d.desktop"));
    offered(view, "showAgainAction")->trigger();
    view.setHiddenShown(false);
    QCOMPARE(names(view, menu()).join(QString()), QStringLiteral("folderABD"));

    select(view, menu() + QLatin1String("/folder"));
    QVERIFY(!offered(view, "hideAction")->isEnabled());
}

void tst_VelMenuViewHidden::isAsBeforeWithoutAssistance()
{
    writeAll();
    VelMenuView view(menu(), -1, true);
    const QList<QAction *> actions = view.actions();
    const int entries = contextMenu(view)->actions().size();
    view.setAssistance(true);
    QVERIFY(open(view, menu(), 2));
    view.setHiddenShown(true);
    view.setAssistance(false);
    QCOMPARE(view.actions(), actions);
    QCOMPARE(contextMenu(view)->actions().size(), entries);
    QCOMPARE(names(view, menu()).join(QString()), QStringLiteral("AB"));
}

VEL_TEST_MAIN(tst_VelMenuViewHidden)
#include "tst_VelMenuViewHidden.moc"
