// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/FreeName.h>

#include <QDir>
#include <QFile>

Q_DECLARE_METATYPE(FreeName::Kind)

class tst_FreeName : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void countsFromNoNumberOn();
    void takesTheFirstThatIsFree();
    void looksAtWhatTheFolderHas();
    void passesOverALinkThatLeadsNowhere();
    void numbersWhatIsLikeAnother_data();
    void numbersWhatIsLikeAnother();
    void shortensWhatWouldBeTooLong_data();
    void shortensWhatWouldBeTooLong();
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

void tst_FreeName::numbersWhatIsLikeAnother_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<FreeName::Kind>("kind");
    QTest::addColumn<QStringList>("taken");
    QTest::addColumn<QString>("expected");
    using Kind = FreeName::Kind;
    QTest::newRow("entry") << QStringLiteral("a.desktop") << Kind::Entry << QStringList()
                           << QStringLiteral("a-2.desktop");
    QTest::newRow("taken") << QStringLiteral("a.desktop") << Kind::Entry
                           << QStringList{QStringLiteral("a-2.desktop"), QStringLiteral("a-3.desktop")}
                           << QStringLiteral("a-4.desktop");
    QTest::newRow("numbered") << QStringLiteral("a-2.desktop") << Kind::Entry << QStringList()
                              << QStringLiteral("a-2-2.desktop");
    QTest::newRow("domain") << QStringLiteral("org.x.y.desktop") << Kind::Entry << QStringList()
                            << QStringLiteral("org.x.y-2.desktop");
    QTest::newRow("no suffix") << QStringLiteral("a") << Kind::Entry << QStringList()
                               << QStringLiteral("a-2");
    QTest::newRow("hidden") << QStringLiteral(".a") << Kind::Entry << QStringList() << QStringLiteral(".a-2");
    QTest::newRow("folder") << QStringLiteral("a") << Kind::Folder << QStringList{QStringLiteral("a-2")}
                            << QStringLiteral("a-3");
    QTest::newRow("folder with a dot")
        << QStringLiteral("v1.5") << Kind::Folder << QStringList() << QStringLiteral("v1.5-2");
}

void tst_FreeName::numbersWhatIsLikeAnother()
{
    QFETCH(QString, name);
    QFETCH(FreeName::Kind, kind);
    QFETCH(QStringList, taken);
    QFETCH(QString, expected);
    QCOMPARE(FreeName::like(name, kind, [&taken](const QString &other) { return taken.contains(other); }),
             expected);
}

void tst_FreeName::shortensWhatWouldBeTooLong_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("expected");
    QTest::newRow("letters") << QString(247, QLatin1Char('a')) + QStringLiteral(".desktop")
                             << QString(245, QLatin1Char('a')) + QStringLiteral("-2.desktop");
    QTest::newRow("umlauts") << QString(123, QChar(0xe4)) + QStringLiteral(".desktop")
                             << QString(122, QChar(0xe4)) + QStringLiteral("-2.desktop");
    const QString smile = QString::fromUtf8("\xf0\x9f\x98\x80");
    QTest::newRow("smiles") << smile.repeated(61) + QStringLiteral(".desktopss")
                            << smile.repeated(60) + QStringLiteral("-2.desktopss");
    QTest::newRow("more smiles") << smile.repeated(61) + QStringLiteral("aaa.desktop")
                                 << smile.repeated(61) + QStringLiteral("a-2.desktop");
}

void tst_FreeName::shortensWhatWouldBeTooLong()
{
    QFETCH(QString, name);
    QFETCH(QString, expected);
    const QString found = FreeName::like(name, FreeName::Kind::Entry, [](const QString &) { return false; });
    QCOMPARE(found, expected);
    QVERIFY(QFile::encodeName(found).size() <= 255);
    write(found, "can be written");
}

VEL_TEST_GUILESS_MAIN(tst_FreeName)

#include "tst_FreeName.moc"
