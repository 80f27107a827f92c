// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IShortcutObject.h"
#include "TestCase.h"

#include <QMetaMethod>
#include <QMetaObject>

#include <cstring>

namespace {

// The least that an application has to give.
class LeastObject : public IShortcutObject
{
public:
    using IShortcutObject::IShortcutObject;

    QKeySequence objectKeySequence() const override { return m_inForce; }
    void setObjectKeySequence(const QKeySequence &key) override { m_inForce = key; }
    void setKeySequence(const QKeySequence &key) override { m_key = key; }
    void reset() override { m_key = objectKeySequence(); }
    QKeySequence keySequence() const override { return m_key; }
    void apply() override { setObjectKeySequence(m_key); }
    QString text() const override { return QStringLiteral("Text"); }
    QIcon icon() const override { return {}; }

private:
    QKeySequence m_inForce;
};

// The place of a virtual function in the table, as the common C++ ABI keeps it in the pointer.
template <typename Function>
std::ptrdiff_t slotOf(Function function)
{
    std::ptrdiff_t place = 0;
    std::memcpy(&place, &function, sizeof(place));
    return (place - 1) / std::ptrdiff_t(sizeof(void *));
}

} // namespace

class tst_IShortcutObject : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasOneMetaMethod();
    void keepsTheOrderOfItsVirtualFunctions();
    void beginsWithEmptyKeysAndNoGroup();
};

void tst_IShortcutObject::hasOneMetaMethod()
{
    const QMetaObject &meta = IShortcutObject::staticMetaObject;
    QCOMPARE(QLatin1String(meta.className()), QLatin1String("IShortcutObject"));
    QCOMPARE(meta.methodCount() - meta.methodOffset(), 1);
    QCOMPARE(meta.method(meta.methodOffset()).methodSignature(), QByteArray("deleteMe()"));
    QCOMPARE(meta.method(meta.methodOffset()).methodType(), QMetaMethod::Signal);
}

void tst_IShortcutObject::keepsTheOrderOfItsVirtualFunctions()
{
    using I = IShortcutObject;
    const QVector<std::ptrdiff_t> slots_ = {slotOf(&I::defaultKeySequence),
                                            slotOf(&I::objectKeySequence),
                                            slotOf(&I::setObjectKeySequence),
                                            slotOf(&I::setKeySequence),
                                            slotOf(&I::reset),
                                            slotOf(&I::keySequence),
                                            slotOf(&I::apply),
                                            slotOf(&I::name),
                                            slotOf(&I::group),
                                            slotOf(&I::text),
                                            slotOf(&I::icon)};
    for (int i = 1; i < slots_.size(); ++i)
        QCOMPARE(slots_.at(i), slots_.at(0) + i);
}

void tst_IShortcutObject::beginsWithEmptyKeysAndNoGroup()
{
    const LeastObject object(QStringLiteral("name"));
    QCOMPARE(object.name(), QStringLiteral("name"));
    QVERIFY(object.group().isEmpty());
    QVERIFY(object.defaultKeySequence().isEmpty());
    QVERIFY(object.keySequence().isEmpty());
    QVERIFY(!object.parent());
}

VEL_TEST_MAIN(tst_IShortcutObject)

#include "tst_IShortcutObject.moc"
