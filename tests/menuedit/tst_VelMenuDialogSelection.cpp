// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "VelMenuDialog.h"
#include "VelMenuView.h"

#include <QDialogButtonBox>
#include <QPushButton>

/// What the dialog tells of the selected entry.
class tst_VelMenuDialogSelection : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void allowsOkOnlyForEntries_data();
    void allowsOkOnlyForEntries();
    void looksOnlyAtWhatWasSelectedNow();
    void canBeAskedWithoutAButton();
    void tellsTheSelectedPath();
    void makesTheCommandLine_data();
    void makesTheCommandLine();
    void readsAFolderAsAnEntry();
};

void tst_VelMenuDialogSelection::allowsOkOnlyForEntries_data()
{
    QTest::addColumn<QString>("item");
    QTest::addColumn<bool>("isAllowed");
    QTest::newRow("entry") << "a.desktop" << true;
    QTest::newRow("folder") << "sub" << false;
    QTest::newRow("other file") << "notes.txt" << false;
    QTest::newRow("another case") << "b.DESKTOP" << false;
}

void tst_VelMenuDialogSelection::allowsOkOnlyForEntries()
{
    QFETCH(QString, item);
    QFETCH(bool, isAllowed);
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("sub/c.desktop"), QStringLiteral("C"));
    writeEntry(QStringLiteral("b.DESKTOP"), QStringLiteral("B"));
    write(QStringLiteral("menu/notes.txt"), "");
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 4));
    const auto *ok = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
    // From the other state each time.
    select(*view, menu() + (isAllowed ? QLatin1String("/sub") : QLatin1String("/a.desktop")));
    QCOMPARE(ok->isEnabled(), !isAllowed);
    select(*view, menu() + QLatin1Char('/') + item);
    QCOMPARE(ok->isEnabled(), isAllowed);
    view->selectionModel()->clearSelection();
    QVERIFY(!ok->isEnabled());
}

void tst_VelMenuDialogSelection::looksOnlyAtWhatWasSelectedNow()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    const auto *ok = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
    const QItemSelection entry(shown(*view, a), shown(*view, a));
    QVERIFY(QMetaObject::invokeMethod(&dialog, "selChanged", Q_ARG(QItemSelection, entry),
                                      Q_ARG(QItemSelection, entry)));
    QVERIFY(ok->isEnabled());
    dialog.selChanged(QItemSelection(), entry);
    QVERIFY(!ok->isEnabled());
}

void tst_VelMenuDialogSelection::canBeAskedWithoutAButton()
{
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, true, true);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    dialog.selChanged(QItemSelection(), QItemSelection());
    dialog.changed();
    dialog.applySlot();
    QVERIFY(!dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Apply));
    QCOMPARE(dialog.selectedItemPath(), a);
}

void tst_VelMenuDialogSelection::tellsTheSelectedPath()
{
    const QString a = writeEntry(QStringLiteral("sub/a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QCOMPARE(dialog.selectedItemPath(), QString());
    QCOMPARE(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr), QString());
    QVERIFY(open(*view, menu(), 1));
    QVERIFY(open(*view, menu() + QLatin1String("/sub"), 1));
    select(*view, a);
    QCOMPARE(dialog.selectedItemPath(), a);
    select(*view, menu() + QLatin1String("/sub"));
    QCOMPARE(dialog.selectedItemPath(), menu() + QLatin1String("/sub"));

    view->setModel(nullptr);
    QCOMPARE(dialog.selectedItemPath(), QString());
}

void tst_VelMenuDialogSelection::makesTheCommandLine_data()
{
    QTest::addColumn<QByteArray>("lines");
    QTest::addColumn<QString>("command");
    QTest::newRow("plain") << QByteArray("Exec=prog --flag\n") << "prog --flag";
    QTest::newRow("file") << QByteArray("Exec=prog %f\n") << "prog /f";
    QTest::newRow("url") << QByteArray("Exec=prog %u\n") << "prog http://u";
    QTest::newRow("files") << QByteArray("Exec=prog %F\n") << "prog /1 /2";
    QTest::newRow("urls") << QByteArray("Exec=prog %U\n") << "prog http://1 http://2";
    QTest::newRow("name") << QByteArray("Exec=prog %c\n") << "prog A";
    QTest::newRow("local name") << QByteArray("Name[en]=Local\nExec=prog %c\n") << "prog Local";
    QTest::newRow("icon") << QByteArray("Exec=prog %i\nIcon=pic\n") << "prog --icon pic";
    QTest::newRow("entry") << QByteArray("Exec=prog %k\n") << "prog @path@";
    QTest::newRow("window manager") << QByteArray("Exec=VELWM_QUIT %f now\n")
                                    << "vel-wmfunc VELWM_QUIT %f now\n";
    QTest::newRow("no function of it") << QByteArray("Exec=velwm_quit\n") << "velwm_quit";
    QTest::newRow("no command") << QByteArray() << "";
}

void tst_VelMenuDialogSelection::makesTheCommandLine()
{
    QFETCH(QByteArray, lines);
    QFETCH(QString, command);
    const QString a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"), lines);
    command.replace(QLatin1String("@path@"), a);
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    select(*view, a);
    const QStringList files{QStringLiteral("/1"), QStringLiteral("/2")};
    const QStringList urls{QStringLiteral("http://1"), QStringLiteral("http://2")};
    // Every argument stands as a word of its own in a shell, however it is quoted.
    QString made = dialog.selectedItemExec(QStringLiteral("/f"), QStringLiteral("http://u"), &files, &urls);
    made.remove(QLatin1Char('\'')).remove(QLatin1Char('"'));
    QCOMPARE(made, command);

    const QString bare = dialog.selectedItemExec(QString(), QString(), nullptr, nullptr);
    QVERIFY(!bare.contains(QLatin1String("http")) && !bare.contains(QLatin1String("/1")));
}

void tst_VelMenuDialogSelection::readsAFolderAsAnEntry()
{
    writeEntry(QStringLiteral("sub/a.desktop"), QStringLiteral("A"));
    VelMenuDialog dialog(menu(), -1, false, false);
    auto *view = dialog.findChild<VelMenuView *>();
    QVERIFY(open(*view, menu(), 1));
    select(*view, menu() + QLatin1String("/sub"));
    QCOMPARE(dialog.selectedItemExec(QString(), QString(), nullptr, nullptr), QString());
}

VEL_TEST_MAIN(tst_VelMenuDialogSelection)
#include "tst_VelMenuDialogSelection.moc"
