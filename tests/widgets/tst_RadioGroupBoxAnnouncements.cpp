// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <VelRadioGroupBox.h>

#include <QAccessible>
#include <QWidget>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

// The title of each box whose checked state was announced, and what it was by then.
QStringList announced;

} // namespace

// Stands in for Qt's own, which tells nothing to anybody while no screen reader runs. Asks for
// the interface at every event, as a screen reader does.
void QAccessible::updateAccessibility(QAccessibleEvent *event)
{
    const QAccessibleInterface *interface = event->accessibleInterface();
    const auto *box = qobject_cast<const VelRadioGroupBox *>(event->object());
    if (!box || !interface || event->type() != QAccessible::StateChanged)
        return;
    if (static_cast<QAccessibleStateChangeEvent *>(event)->changedStates().checked)
        announced.append(box->title() + (interface->state().checked ? s(" on") : s(" off")));
}

class tst_RadioGroupBoxAnnouncements : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsEveryChangeOfTheGroup();
    void isARadioButtonThoughItsTitleWasAnnouncedBefore();
};

void tst_RadioGroupBoxAnnouncements::tellsEveryChangeOfTheGroup()
{
    QWidget parent;
    VelRadioGroupBox one(s("One"), &parent);
    VelRadioGroupBox two(s("Two"), &parent);
    one.setChecked(true);
    announced.clear();
    QTest::keyClick(&two, Qt::Key_Space);
    QCOMPARE(announced, QStringList({s("One off"), s("Two on")}));
    QTest::keyClick(&two, Qt::Key_Space);
    QCOMPARE(announced.size(), 2); // chosen already
    two.setChecked(false);
    QCOMPARE(announced.mid(2), QStringList{s("Two off")});
}

void tst_RadioGroupBoxAnnouncements::isARadioButtonThoughItsTitleWasAnnouncedBefore()
{
    // The base class announces the title while there is no more than a group box.
    VelRadioGroupBox box(s("Title"), nullptr);
    const QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(&box);
    QCOMPARE(interface->role(), QAccessible::RadioButton);
    QCOMPARE(interface->text(QAccessible::Name), s("Title"));
}

VEL_TEST_MAIN(tst_RadioGroupBoxAnnouncements)

#include "tst_RadioGroupBoxAnnouncements.moc"
