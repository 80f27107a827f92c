// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Shortcuts, groups and models that go or come while they are in use.

#include "DialogTestCase.h"
#include "KeyTestObject.h"

#include <QPointer>
#include <QSignalSpy>

namespace {

// Takes an action with it.
class OwningObject : public KeyTestObject
{
public:
    OwningObject(const QString &name, QAction *action)
        : KeyTestObject(name, QStringLiteral("Owners"))
        , m_action(action)
    {
    }
    ~OwningObject() override
    {
        delete m_action;
        // What it wraps is gone, too.
        Q_EMIT deleteMe();
    }
    Q_DISABLE_COPY(OwningObject)

private:
    const QPointer<QAction> m_action;
};

} // namespace

class tst_ShortcutsThatGo : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void deletesEachObjectOnceWhenObjectsDeleteActions();
    void deletesAnObjectOnceThatAsksForItAgain();
};

void tst_ShortcutsThatGo::deletesEachObjectOnceWhenObjectsDeleteActions()
{
    // The order is that of addresses; some of many are deleted before the actions they own.
    m_dialog.reset();
    for (int i = 0; i < 40; ++i) {
        QAction *action = addAction(qPrintable(str("owned %1").arg(i)), "File", QKeySequence());
        m_model->registerShortcutObject(new OwningObject(str("owner %1").arg(i), action));
    }
    m_model.reset();
    QCOMPARE(m_owner->findChildren<QAction *>().size(), 5);
}

void tst_ShortcutsThatGo::deletesAnObjectOnceThatAsksForItAgain()
{
    auto *object = new OwningObject(str("owner"), nullptr);
    m_model->registerShortcutObject(object);
    QSignalSpy spy(object, &QObject::destroyed);
    Q_EMIT object->deleteMe();
    QCOMPARE(spy.count(), 1);
}

VEL_TEST_MAIN(tst_ShortcutsThatGo)

#include "tst_ShortcutsThatGo.moc"
