// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"
#include "TestCase.h"

#include <frame/QtMajor.h>
#include <shortcuts/KeyboardLayout.h>

// Without X11; tst_ShortcutClash sets layouts of the X server.
class tst_KeyboardLayout : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void letsEveryKeyPassWithoutX11();
};

void tst_KeyboardLayout::letsEveryKeyPassWithoutX11()
{
    QVERIFY(!QtMajor::x11Display());
    for (const int chord : {VelTest::keyNumber(Qt::CTRL | Qt::Key_J), int(Qt::CTRL) | 0x416, int(Qt::Key_F35),
                            int(Qt::Key_unknown)})
        QVERIFY(KeyboardLayout::produces(chord));
}

VEL_TEST_MAIN(tst_KeyboardLayout)

#include "tst_KeyboardLayout.moc"
