// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/choosers/ChoiceFilter.h>
#include <desktopentry/choosers/ChoiceModel.h>

#include <QAbstractItemModelTester>
#include <QSignalSpy>

using namespace VelUI;

namespace {

Choice choice(const char *value, const QString &text, int group = 0)
{
    Choice choice;
    choice.value = QLatin1String(value);
    choice.texts = QStringList{text, QStringLiteral("about ") + text};
    choice.group = group;
    return choice;
}

const QStringList Headers{QStringLiteral("Thing"), QStringLiteral("Remark")};

// What is shown, a "*" behind what is checked.
QString shown(const QAbstractItemModel &model)
{
    QStringList rows;
    for (int row = 0; row < model.rowCount(); ++row) {
        const QModelIndex index = model.index(row, 0);
        const bool isChecked = index.data(Qt::CheckStateRole).toInt() == Qt::Checked;
        rows.append(index.data().toString() + (isChecked ? QStringLiteral("*") : QString()));
    }
    return rows.join(QLatin1Char('|'));
}

} // namespace

/// The choices, and the order and filter in which they are shown.
class tst_ChoiceModel : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void checksTheBoxOfTheFirstColumnAlone();
    void hasNoBoxesWhereOneIsChosen();
    void sortsTheChosenFirstThenByGroupAndText();
    void staysInOrderWhileBoxesAreChecked();
    void findsAllWordsInAnyOrderWithoutCaseAndAccents_data();
    void findsAllWordsInAnyOrderWithoutCaseAndAccents();
    void putsFirstWhatTheTypedBegins();
    void putsFirstWhatUsuallyHasTheTypedSuffix_data();
    void putsFirstWhatUsuallyHasTheTypedSuffix();
    void findsWhatIsReadLater();
};

void tst_ChoiceModel::checksTheBoxOfTheFirstColumnAlone()
{
    ChoiceModel model(ChoiceModel::Kind::Several, Headers);
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    QSignalSpy chosenChanged(&model, &ChoiceModel::chosenChanged);
    model.add({choice("b", QStringLiteral("Bee")), choice("a", QStringLiteral("Ant"))});
    model.setChosen({QStringLiteral("x"), QStringLiteral("a")});
    QCOMPARE(shown(model), QStringLiteral("Bee|Ant*"));
    QCOMPARE(chosenChanged.count(), 0);

    QVERIFY(!model.setData(model.index(0, 1), Qt::Checked, Qt::CheckStateRole));
    QVERIFY(!model.setData(model.index(0, 0), QStringLiteral("Wasp")));
    QVERIFY(model.setData(model.index(0, 0), Qt::Checked, Qt::CheckStateRole));
    QVERIFY(model.setData(model.index(1, 0), Qt::Unchecked, Qt::CheckStateRole));
    QCOMPARE(shown(model), QStringLiteral("Bee*|Ant"));
    QCOMPARE(chosenChanged.count(), 2);
    QCOMPARE(model.chosen().values(), (QStringList{QStringLiteral("x"), QStringLiteral("b")}));
    QCOMPARE(model.headerData(1, Qt::Horizontal).toString(), QStringLiteral("Remark"));
    QVERIFY(model.hasValue(QStringLiteral("b")));
    QVERIFY(!model.hasValue(QStringLiteral("Bee")));
}

void tst_ChoiceModel::hasNoBoxesWhereOneIsChosen()
{
    ChoiceModel model(ChoiceModel::Kind::One, Headers);
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.add({choice("b", QStringLiteral("Bee"))});
    QVERIFY(!model.index(0, 0).data(Qt::CheckStateRole).isValid());
    QVERIFY(!model.flags(model.index(0, 0)).testFlag(Qt::ItemIsUserCheckable));
    QVERIFY(!model.setData(model.index(0, 0), Qt::Checked, Qt::CheckStateRole));
}

void tst_ChoiceModel::sortsTheChosenFirstThenByGroupAndText()
{
    ChoiceModel model(ChoiceModel::Kind::Several, Headers);
    model.add({choice("c", QStringLiteral("Cat"), 1), choice("b", QStringLiteral("bee")),
               choice("a2", QStringLiteral("Ant")), choice("a1", QStringLiteral("ant")),
               choice("d", QStringLiteral("Dog"), 1)});
    model.setChosen({QStringLiteral("d")});
    ChoiceFilter filter(&model);
    const QAbstractItemModelTester tester(&filter, QAbstractItemModelTester::FailureReportingMode::QtTest);
    QCOMPARE(shown(filter), QStringLiteral("Dog*|ant|Ant|bee|Cat"));
    QCOMPARE(model.at(filter.modelRow(filter.index(1, 0))).value, QStringLiteral("a1"));
}

void tst_ChoiceModel::staysInOrderWhileBoxesAreChecked()
{
    ChoiceModel model(ChoiceModel::Kind::Several, Headers);
    model.add({choice("a", QStringLiteral("Ant")), choice("b", QStringLiteral("Bee"))});
    model.setChosen({QStringLiteral("b")});
    ChoiceFilter filter(&model);
    QVERIFY(filter.setData(filter.index(0, 0), Qt::Unchecked, Qt::CheckStateRole));
    QVERIFY(filter.setData(filter.index(1, 0), Qt::Checked, Qt::CheckStateRole));
    QCOMPARE(shown(filter), QStringLiteral("Bee|Ant*"));
}

void tst_ChoiceModel::findsAllWordsInAnyOrderWithoutCaseAndAccents_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("found");
    QTest::newRow("nothing") << QString() << QStringLiteral("Ant|B\u00fcro");
    QTest::newRow("accent") << QStringLiteral("BURO") << QStringLiteral("B\u00fcro");
    QTest::newRow("value") << QStringLiteral("Office") << QStringLiteral("B\u00fcro");
    QTest::newRow("further words") << QStringLiteral("insect") << QStringLiteral("Ant");
    QTest::newRow("any order, any column") << QStringLiteral("insect ABOUT an") << QStringLiteral("Ant");
    QTest::newRow("all words") << QStringLiteral("insect office") << QString();
}

void tst_ChoiceModel::findsAllWordsInAnyOrderWithoutCaseAndAccents()
{
    QFETCH(QString, typed);
    QFETCH(QString, found);
    ChoiceModel model(ChoiceModel::Kind::Several, Headers);
    Choice ant = choice("a", QStringLiteral("Ant"));
    ant.words = QStringLiteral("Insect");
    model.add({ant, choice("Office", QStringLiteral("B\u00fcro"))});
    ChoiceFilter filter(&model);
    filter.setTyped(typed);
    QCOMPARE(shown(filter), found);
}

void tst_ChoiceModel::putsFirstWhatTheTypedBegins()
{
    ChoiceModel model(ChoiceModel::Kind::Several, Headers);
    model.add({choice("1", QStringLiteral("again")), choice("2", QStringLiteral("Git gui")),
               choice("3", QStringLiteral("the git")), choice("4", QStringLiteral("git")),
               choice("5", QStringLiteral("gio"))});
    ChoiceFilter filter(&model);
    const QAbstractItemModelTester tester(&filter, QAbstractItemModelTester::FailureReportingMode::QtTest);
    filter.setTyped(QStringLiteral(" GIT "));
    QCOMPARE(shown(filter), QStringLiteral("git|Git gui|the git"));
    filter.setTyped(QString());
    QCOMPARE(shown(filter), QStringLiteral("again|gio|git|Git gui|the git"));
}

void tst_ChoiceModel::putsFirstWhatUsuallyHasTheTypedSuffix_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("found");
    QTest::newRow("suffix") << QStringLiteral(".png") << QStringLiteral("image/png|image/apng");
    QTest::newRow("pattern") << QStringLiteral("*.PNG") << QStringLiteral("image/png|image/apng");
    QTest::newRow("begun") << QStringLiteral(".pn") << QStringLiteral("image/apng|image/png");
    QTest::newRow("first of two") << QStringLiteral(".htm") << QStringLiteral("text/x-first|text/html");
    QTest::newRow("no suffix") << QStringLiteral("image") << QStringLiteral("image/apng|image/png");
}

void tst_ChoiceModel::putsFirstWhatUsuallyHasTheTypedSuffix()
{
    QFETCH(QString, typed);
    QFETCH(QString, found);
    ChoiceModel model(ChoiceModel::Kind::Several, Headers);
    const auto type = [](const char *name, const QString &patterns) {
        Choice choice;
        choice.value = QLatin1String(name);
        choice.texts = QStringList{choice.value, QStringLiteral("File"), patterns};
        return choice;
    };
    model.add({type("image/apng", QStringLiteral("*.apng, *.png")),
               type("image/png", QStringLiteral("*.png")), type("text/html", QStringLiteral("*.html, *.htm")),
               type("text/x-first", QStringLiteral("*.htm, *.first"))});
    ChoiceFilter filter(&model);
    filter.setTyped(typed);
    QCOMPARE(shown(filter), found);
}

void tst_ChoiceModel::findsWhatIsReadLater()
{
    ChoiceModel model(ChoiceModel::Kind::Several, Headers);
    ChoiceFilter filter(&model);
    const QAbstractItemModelTester tester(&filter, QAbstractItemModelTester::FailureReportingMode::QtTest);
    filter.setTyped(QStringLiteral("bee"));
    model.add({choice("a", QStringLiteral("Ant")), choice("b", QStringLiteral("bee 2"))});
    QCOMPARE(shown(filter), QStringLiteral("bee 2"));
    model.change(0, choice("a", QStringLiteral("Bee 1")));
    QCOMPARE(shown(filter), QStringLiteral("Bee 1|bee 2"));
    model.change(1, choice("b", QStringLiteral("Wasp")));
    QCOMPARE(shown(filter), QStringLiteral("Bee 1"));
}

VEL_TEST_GUILESS_MAIN(tst_ChoiceModel)

#include "tst_ChoiceModel.moc"
