// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuTestCase.h"
#include "VelMenuView.h"

/// A menu where no MIME types are installed: a program of its own, as Qt keeps the types that it
/// has read once.
class tst_MenuWithoutMimeTypes : public MenuTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void showsAllItems();
    void showsWhatComesLater();
};

void tst_MenuWithoutMimeTypes::init()
{
    MenuTestCase::init();
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("none"))));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(path(QStringLiteral("none"))));
}

void tst_MenuWithoutMimeTypes::showsAllItems()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    writeEntry(QStringLiteral("sub/b.desktop"), QStringLiteral("B"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 2));
    QVERIFY(open(view, menu() + QLatin1String("/sub"), 1));
}

void tst_MenuWithoutMimeTypes::showsWhatComesLater()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    view.show();
    QVERIFY(open(view, menu(), 1));
    writeEntry(QStringLiteral("later.desktop"), QStringLiteral("Later"));
    QTRY_VERIFY(names(view, menu()).contains(QStringLiteral("Later")));
}

VEL_TEST_MAIN(tst_MenuWithoutMimeTypes)

#include "tst_MenuWithoutMimeTypes.moc"
