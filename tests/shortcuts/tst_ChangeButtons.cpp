// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <shortcuts/ChangeButtons.h>

#include <QDialogButtonBox>
#include <QPushButton>

class tst_ChangeButtons : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void followWhatIsChanged();
    void areEnabledWhileAChordIsRecorded_data();
    void areEnabledWhileAChordIsRecorded();
    void takeWhatIsToldMeanwhile();

private:
    bool areEnabled() const
    {
        const bool isOkEnabled = m_box.button(QDialogButtonBox::Ok)->isEnabled();
        return isOkEnabled && m_box.button(QDialogButtonBox::Reset)->isEnabled();
    }
    bool areDisabled() const
    {
        const bool isOkEnabled = m_box.button(QDialogButtonBox::Ok)->isEnabled();
        return !isOkEnabled && !m_box.button(QDialogButtonBox::Reset)->isEnabled();
    }

    QDialogButtonBox m_box{QDialogButtonBox::Ok | QDialogButtonBox::Cancel | QDialogButtonBox::Reset};
};

void tst_ChangeButtons::followWhatIsChanged()
{
    ChangeButtons buttons(&m_box);
    buttons.setChanged(false);
    QVERIFY(areDisabled());
    QVERIFY(!buttons.isChanged());
    buttons.setChanged(true);
    QVERIFY(areEnabled());
    QVERIFY(buttons.isChanged());
    QVERIFY(m_box.button(QDialogButtonBox::Cancel)->isEnabled());
}

void tst_ChangeButtons::areEnabledWhileAChordIsRecorded_data()
{
    QTest::addColumn<bool>("changed");
    QTest::newRow("unchanged before") << false;
    QTest::newRow("changed before") << true;
}

void tst_ChangeButtons::areEnabledWhileAChordIsRecorded()
{
    QFETCH(bool, changed);
    ChangeButtons buttons(&m_box);
    buttons.setChanged(changed);
    for (int round = 0; round < 2; ++round) {
        buttons.setRecording(true);
        buttons.setRecording(true);
        QVERIFY(areEnabled());
        buttons.setRecording(false);
        buttons.setRecording(false);
        QCOMPARE(areEnabled(), changed);
        QCOMPARE(areDisabled(), !changed);
    }
}

void tst_ChangeButtons::takeWhatIsToldMeanwhile()
{
    ChangeButtons buttons(&m_box);
    buttons.setChanged(true);
    buttons.setRecording(true);
    buttons.setChanged(false);
    QVERIFY(areEnabled());
    buttons.setRecording(false);
    QVERIFY(areDisabled());
    buttons.setRecording(true);
    buttons.setChanged(true);
    buttons.setRecording(false);
    QVERIFY(areEnabled());
}

VEL_TEST_MAIN(tst_ChangeButtons)

#include "tst_ChangeButtons.moc"
