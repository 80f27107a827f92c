// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/ItemKey.h>

Q_DECLARE_METATYPE(ItemKey::Use)

/// What keys do to an item.
class tst_ItemKey : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesKeysByTheMenuAndTheItem_data();
    void takesKeysByTheMenuAndTheItem();
};

void tst_ItemKey::takesKeysByTheMenuAndTheItem_data()
{
    using ItemKey::Use;
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("modifiers");
    QTest::addColumn<Use>("entryToEdit");
    QTest::addColumn<Use>("folderToEdit");
    QTest::addColumn<Use>("entryToPick");
    QTest::addColumn<Use>("folderToPick");
    const auto row = [](const char *name, int key, Qt::KeyboardModifiers modifiers, Use entryToEdit,
                        Use folderToEdit, Use folderToPick) {
        QTest::newRow(name) << key << int(modifiers) << entryToEdit << folderToEdit << Use::None
                            << folderToPick;
    };
    row("Return", Qt::Key_Return, Qt::NoModifier, Use::Edit, Use::Toggle, Use::Toggle);
    row("Enter", Qt::Key_Enter, Qt::KeypadModifier, Use::Edit, Use::Toggle, Use::Toggle);
    row("F2", Qt::Key_F2, Qt::NoModifier, Use::Edit, Use::Edit, Use::None);
    row("Ctrl+Return", Qt::Key_Return, Qt::ControlModifier, Use::None, Use::None, Use::None);
    row("Shift+Enter", Qt::Key_Enter, Qt::KeypadModifier | Qt::ShiftModifier, Use::None, Use::None,
        Use::None);
    row("Alt+F2", Qt::Key_F2, Qt::AltModifier, Use::None, Use::None, Use::None);
    row("Escape", Qt::Key_Escape, Qt::NoModifier, Use::None, Use::None, Use::None);
    row("Right", Qt::Key_Right, Qt::NoModifier, Use::None, Use::None, Use::None);
}

void tst_ItemKey::takesKeysByTheMenuAndTheItem()
{
    QFETCH(int, key);
    QFETCH(int, modifiers);
    const auto use = [&](bool isEditable, bool isFolder) {
        return ItemKey::of(key, Qt::KeyboardModifiers(modifiers), isEditable, isFolder);
    };
    QTEST(use(true, false), "entryToEdit");
    QTEST(use(true, true), "folderToEdit");
    QTEST(use(false, false), "entryToPick");
    QTEST(use(false, true), "folderToPick");
}

VEL_TEST_GUILESS_MAIN(tst_ItemKey)

#include "tst_ItemKey.moc"
