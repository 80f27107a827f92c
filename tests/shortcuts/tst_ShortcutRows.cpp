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

VEL_TEST_GUILESS_MAIN(tst_ShortcutRows)

#include "tst_ShortcutRows.moc"
