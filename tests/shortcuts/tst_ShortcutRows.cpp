// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/ShortcutRows.h>

class tst_ShortcutRows : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void haveTheOrderOfTheModel();
    void showTheFirstOfSeveralObjects();
    void areEmptyWhenTheirShortcutIsGone();
    void areFoundByTheirIndex();
    void findsAnEditAnywhere();
    void findsAnEditOfOneThatSharesARow();
    void findsNoEditInAModelOfGoneShortcuts();

private:
    KeyTestObject *add(const char *name, const char *group)
    {
        auto *object = new KeyTestObject(QString::fromLatin1(name), QString::fromLatin1(group));
        m_model->registerShortcutObject(object);
        return object;
    }

    std::unique_ptr<ShortcutsModel> m_model;
};

void tst_ShortcutRows::init()
{
    TestCase::init();
    m_model = std::make_unique<ShortcutsModel>(nullptr, QString());
}

void tst_ShortcutRows::haveTheOrderOfTheModel()
{
    add("save", "File");
    add("copy", "Edit");
    add("open", "File");
    for (int group = 0; group < m_model->rowCount(); ++group) {
        const QModelIndex parent = m_model->index(group, 0);
        const auto rows = ShortcutRows::ofGroup(*m_model, group);
        QCOMPARE(rows.size(), m_model->rowCount(parent));
        for (int row = 0; row < rows.size(); ++row)
            QCOMPARE(rows.at(row)->text(), m_model->index(row, 0, parent).data().toString());
    }
    QVERIFY(ShortcutRows::empty(*m_model).isEmpty());
}

void tst_ShortcutRows::showTheFirstOfSeveralObjects()
{
    const IShortcutObject *first = add("open", "File");
    add("open", "File");
    const QVector<const IShortcutObject *> expected{first};
    QCOMPARE(ShortcutRows::ofGroup(*m_model, 0), expected);
}

void tst_ShortcutRows::areEmptyWhenTheirShortcutIsGone()
{
    KeyTestObject *open = add("open", "File");
    const IShortcutObject *save = add("save", "File");
    add("copy", "Edit");
    Q_EMIT open->deleteMe();
    // Its name comes to every group.
    const QVector<QPair<int, int>> empty{{0, 0}, {1, 1}};
    QCOMPARE(ShortcutRows::empty(*m_model), empty);
    const QVector<const IShortcutObject *> rows{nullptr, save};
    QCOMPARE(ShortcutRows::ofGroup(*m_model, 0), rows);
}

void tst_ShortcutRows::areFoundByTheirIndex()
{
    KeyTestObject *save = add("save", "File");
    const QModelIndex group = m_model->index(0, 0);
    for (int column = 0; column < 2; ++column)
        QCOMPARE(ShortcutRows::at(*m_model, m_model->index(0, column, group)), save);
    QVERIFY(!ShortcutRows::at(*m_model, group));
    QVERIFY(!ShortcutRows::at(*m_model, {}));
    const QModelIndex index = m_model->index(0, 0, group);
    Q_EMIT save->deleteMe();
    QVERIFY(!ShortcutRows::at(*m_model, index));
}

void tst_ShortcutRows::findsAnEditAnywhere()
{
    ShortcutsModel model(nullptr, QString());
    QVERIFY(!ShortcutRows::isAnyEdited(model));
    model.registerShortcutObject(new KeyTestObject(QStringLiteral("open"), QStringLiteral("File")));
    auto *copy = new KeyTestObject(QStringLiteral("copy"), QStringLiteral("Edit"));
    model.registerShortcutObject(copy);
    QVERIFY(!ShortcutRows::isAnyEdited(model));
    copy->setKeySequence(QKeySequence(Qt::Key_F9));
    QVERIFY(ShortcutRows::isAnyEdited(model));
    copy->apply();
    QVERIFY(!ShortcutRows::isAnyEdited(model));
}

void tst_ShortcutRows::findsAnEditOfOneThatSharesARow()
{
    ShortcutsModel model(nullptr, QString());
    model.registerShortcutObject(new KeyTestObject(QStringLiteral("copy"), QStringLiteral("Edit")));
    auto *twin = new KeyTestObject(QStringLiteral("copy"), QStringLiteral("Edit"));
    model.registerShortcutObject(twin);
    twin->setKeySequence(QKeySequence(Qt::Key_F9));
    QVERIFY(ShortcutRows::isAnyEdited(model));
}

void tst_ShortcutRows::findsNoEditInAModelOfGoneShortcuts()
{
    ShortcutsModel model(nullptr, QString());
    auto *object = new KeyTestObject(QStringLiteral("open"), QStringLiteral("File"));
    model.registerShortcutObject(object);
    object->setKeySequence(QKeySequence(Qt::Key_F9));
    Q_EMIT object->deleteMe();
    QVERIFY(!ShortcutRows::isAnyEdited(model));
}

VEL_TEST_GUILESS_MAIN(tst_ShortcutRows)

#include "tst_ShortcutRows.moc"
