// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/FreeName.h>

#include <QDir>
#include <QFile>

class tst_FreeName : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void countsFromNoNumberOn();
    void takesTheFirstThatIsFree();
    void looksAtWhatTheFolderHas();
    void passesOverALinkThatLeadsNowhere();
};

void tst_FreeName::countsFromNoNumberOn()
{
    QStringList asked;
    FreeName::first(FreeName::Kind::Entry, [&asked](const QString &name) {
        asked.append(name);
        return asked.size() < 12;
    });
    QCOMPARE(asked.mid(0, 3),
             QStringList({QStringLiteral("shortcut.desktop"), QStringLiteral("shortcut1.desktop"),
                          QStringLiteral("shortcut2.desktop")}));
    QCOMPARE(asked.last(), QStringLiteral("shortcut11.desktop"));
}

void tst_FreeName::takesTheFirstThatIsFree()
{
    const auto taken = [](const QString &name) { return name != QLatin1String("group3"); };

    const FreeName::Name name = FreeName::first(FreeName::Kind::Folder, taken);

    QCOMPARE(name.fileName, QStringLiteral("group3"));
    QCOMPARE(name.number, QStringLiteral("3"));
}

void tst_FreeName::looksAtWhatTheFolderHas()
{
    QCOMPARE(FreeName::firstIn(folder(), FreeName::Kind::Entry).fileName, QStringLiteral("shortcut.desktop"));
    QCOMPARE(FreeName::firstIn(folder(), FreeName::Kind::Entry).number, QString());
    write(QStringLiteral("shortcut.desktop"), "");
    QCOMPARE(FreeName::firstIn(folder(), FreeName::Kind::Entry).fileName,
             QStringLiteral("shortcut1.desktop"));
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("group")));
    QVERIFY(QDir(folder()).mkdir(QStringLiteral("group1")));
    QCOMPARE(FreeName::firstIn(folder(), FreeName::Kind::Folder).fileName, QStringLiteral("group2"));
}

void tst_FreeName::passesOverALinkThatLeadsNowhere()
{
    QVERIFY(QFile::link(path(QStringLiteral("missing")), path(QStringLiteral("shortcut.desktop"))));

    QCOMPARE(FreeName::firstIn(folder(), FreeName::Kind::Entry).fileName,
             QStringLiteral("shortcut1.desktop"));
}

VEL_TEST_GUILESS_MAIN(tst_FreeName)

#include "tst_FreeName.moc"
