// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/check/RegisteredCategories.h>

#include <QSet>

using namespace RegisteredCategories;

Q_DECLARE_METATYPE(RegisteredCategories::Kind)

class tst_RegisteredCategories : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void areWhatTheSpecificationSays_data();
    void areWhatTheSpecificationSays();
    void standOnceEach();
    void goWithRegisteredOnes();
    void areFoundByTheLetter();
    void leaveOwnOnesToTheirOwners();
};

void tst_RegisteredCategories::areWhatTheSpecificationSays_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<Kind>("kind");
    QTest::addColumn<QVector<QStringList>>("related");
    const QStringList graphics{QStringLiteral("Graphics")};
    const QStringList office{QStringLiteral("Office")};
    QTest::newRow("main") << "Game" << Kind::Main << QVector<QStringList>();
    QTest::newRow("main that wants another")
        << "Audio" << Kind::Main << QVector<QStringList>{{QStringLiteral("AudioVideo")}};
    QTest::newRow("additional") << "Scanning" << Kind::Additional << QVector<QStringList>{graphics};
    QTest::newRow("one of two") << "Viewer" << Kind::Additional << QVector<QStringList>{graphics, office};
    QTest::newRow("both") << "OCR" << Kind::Additional
                          << QVector<QStringList>{{QStringLiteral("Graphics"), QStringLiteral("Scanning")}};
    QTest::newRow("with anything") << "ConsoleOnly" << Kind::Additional << QVector<QStringList>();
    QTest::newRow("reserved") << "TrayIcon" << Kind::Reserved << QVector<QStringList>();
    QTest::newRow("deprecated") << "Application" << Kind::Deprecated << QVector<QStringList>();
}

void tst_RegisteredCategories::areWhatTheSpecificationSays()
{
    QFETCH(QString, name);
    const Category *category = find(name);
    QVERIFY(category);
    QCOMPARE(category->name, name);
    QTEST(category->kind, "kind");
    QTEST(category->related, "related");
}

void tst_RegisteredCategories::standOnceEach()
{
    QSet<QString> names;
    int main = 0;
    for (const Category &category : all()) {
        QVERIFY2(!names.contains(category.name), qPrintable(category.name));
        names.insert(category.name);
        QCOMPARE(find(category.name), &category);
        main += isMain(category.name) ? 1 : 0;
    }
    QCOMPARE(main, 13);
    QVERIFY(names.size() > 120);
}

void tst_RegisteredCategories::goWithRegisteredOnes()
{
    for (const Category &category : all()) {
        for (const QStringList &list : category.related) {
            QVERIFY(!list.isEmpty());
            for (const QString &name : list)
                QVERIFY2(find(name) && name != category.name, qPrintable(category.name));
        }
    }
}

void tst_RegisteredCategories::areFoundByTheLetter()
{
    QVERIFY(!find(QStringLiteral("game")));
    QVERIFY(!find(QString()));
    QVERIFY(!find(QStringLiteral("Game ")));
    QVERIFY(!isMain(QStringLiteral("Scanning")));
}

void tst_RegisteredCategories::leaveOwnOnesToTheirOwners()
{
    QVERIFY(isExtension(QStringLiteral("X-Own")));
    QVERIFY(!isExtension(QStringLiteral("x-own")));
    QVERIFY(!isExtension(QStringLiteral("Game")));
    QVERIFY(!find(QStringLiteral("X-Own")));
}

VEL_TEST_GUILESS_MAIN(tst_RegisteredCategories)

#include "tst_RegisteredCategories.moc"
