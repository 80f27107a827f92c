// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogTestCase.h"

#include <QVBoxLayout>

/// What the dialog has beyond its plain form, and that it goes without a trace.
class tst_EditShortcutsAssistance : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isOffAtFirst();
    void isAProperty();
    void leavesThePlainFormBehind();
    void keepsPendingKeysWhenItGoes();

private:
    // Class and name of all that the dialog consists of, and what its layout holds.
    QStringList parts() const
    {
        QStringList names;
        const auto children = m_dialog->findChildren<QObject *>();
        for (const QObject *child : children)
            names.append(str(child->metaObject()->className()) + QLatin1Char(' ') + child->objectName());
        names.sort();
        const QLayout *layout = m_dialog->layout();
        for (int i = 0; i < layout->count(); ++i)
            names.append(layout->itemAt(i)->widget()->objectName());
        return names;
    }
};

void tst_EditShortcutsAssistance::isOffAtFirst()
{
    QVERIFY(!m_dialog->assistance());
    QCOMPARE(m_dialog->layout()->count(), 3);
}

void tst_EditShortcutsAssistance::isAProperty()
{
    QVERIFY(m_dialog->setProperty("assistance", true));
    QVERIFY(m_dialog->assistance());
    QCOMPARE(m_dialog->property("assistance"), QVariant(true));
}

void tst_EditShortcutsAssistance::leavesThePlainFormBehind()
{
    select("open");
    const QStringList plain = parts();
    for (int round = 0; round < 3; ++round) {
        m_dialog->setAssistance(true);
        m_dialog->setAssistance(true);
        m_dialog->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_dialog.get()));
        m_dialog->setAssistance(false);
        QVERIFY(!m_dialog->assistance());
        QCOMPARE(parts(), plain);
    }
}

void tst_EditShortcutsAssistance::keepsPendingKeysWhenItGoes()
{
    m_dialog->setAssistance(true);
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    m_dialog->setAssistance(false);
    QCOMPARE(pendingKey("open"), f9);
    QVERIFY(isChanged());
    m_dialog->slotReject();
    QCOMPARE(pendingKey("open"), f1);
}

VEL_TEST_MAIN(tst_EditShortcutsAssistance)

#include "tst_EditShortcutsAssistance.moc"
