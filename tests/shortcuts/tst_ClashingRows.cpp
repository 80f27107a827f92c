// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "ShortcutsModelTestCase.h"

#include <shortcuts/ClashingRows.h>

class tst_ClashingRows : public ShortcutsModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void areThoseOfEqualKeysAndOfBeginnings();
    void areNoneForNoKey();
    void coverAllGroupsOfAName();
    void leadToFurtherKeysButDoNotCountThem();
    void leaveOutWhatIsGone();

private:
    void add(const char *name, const char *group, const char *key)
    {
        m_model->registerShortcutObject(
            new KeyTestObject(str(name), str(group), QKeySequence(QString::fromLatin1(key))));
    }
    QStringList names(const char *key) const
    {
        QStringList names = ClashingRows::of(*m_model, QKeySequence(str(key))).keys();
        names.sort();
        return names;
    }
};

void tst_ClashingRows::areThoseOfEqualKeysAndOfBeginnings()
{
    add("equal", "g", "Ctrl+J");
    add("longer", "g", "Ctrl+J, Ctrl+D");
    add("none", "g", "");
    add("other", "g", "Ctrl+K");
    add("reverse", "g", "Ctrl+D, Ctrl+J");
    QCOMPARE(names("Ctrl+J"), (QStringList{str("equal"), str("longer")}));
    QCOMPARE(names("Ctrl+J, Ctrl+D"), (QStringList{str("equal"), str("longer")}));
    QCOMPARE(names("Ctrl+J, Ctrl+X"), QStringList{str("equal")});
    QCOMPARE(names("F9"), QStringList());
}

void tst_ClashingRows::areNoneForNoKey()
{
    add("none", "g", "");
    add("one", "g", "Ctrl+J");
    QVERIFY(ClashingRows::of(*m_model, QKeySequence()).isEmpty());
}

void tst_ClashingRows::coverAllGroupsOfAName()
{
    add("a", "g", "F1");
    add("b", "g", "F9");
    add("b", "h", "F9");
    add("b", "i", "F8");
    const ClashingRows::Rows rows = ClashingRows::of(*m_model, QKeySequence(Qt::Key_F9)).value(str("b"));
    QCOMPARE(rows.first, row(0, 1));
    QCOMPARE(rows.pending, (QVector<QPersistentModelIndex>{row(0, 1), row(1, 0)}));
}

void tst_ClashingRows::leadToFurtherKeysButDoNotCountThem()
{
    addAction("a", "g", f1)->setShortcuts({f1, f2});
    const ClashingRows::Rows rows = ClashingRows::of(*m_model, f2).value(str("a"));
    QCOMPARE(rows.first, row(0, 0));
    QVERIFY(rows.pending.isEmpty());
    m_model->setKeySequence(row(0, 0), f2);
    QCOMPARE(ClashingRows::of(*m_model, f2).value(str("a")).pending.size(), 1);
}

void tst_ClashingRows::leaveOutWhatIsGone()
{
    delete addAction("a", "g", f1);
    QVERIFY(ClashingRows::of(*m_model, f1).isEmpty());
}

VEL_TEST_MAIN(tst_ClashingRows)

#include "tst_ClashingRows.moc"
