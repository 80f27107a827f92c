// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <shortcuts/ShortcutObject.h>

#include <QSignalSpy>
#include <QWidget>

class tst_ShortcutObject : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesTheKeyOfTheShortcutAsDefault();
    void changesTheShortcutOnlyOnApply();
    void throwsAnEditAway();
    void takesItsGroupFromTheParent_data();
    void takesItsGroupFromTheParent();
    void showsTheGivenText();
    void asksForItsRemovalWhenTheShortcutGoes();
    void declaresNothingOfItsOwn();
};

void tst_ShortcutObject::takesTheKeyOfTheShortcutAsDefault()
{
    QWidget window;
    QShortcut shortcut(QKeySequence(Qt::Key_F5), &window);
    const ShortcutObject object(QStringLiteral("n"), &shortcut, QString(), QString());
    QCOMPARE(object.defaultKeySequence(), QKeySequence(Qt::Key_F5));
    QCOMPARE(object.objectKeySequence(), QKeySequence(Qt::Key_F5));
    QCOMPARE(object.name(), QStringLiteral("n"));
    QVERIFY(!object.parent());
}

void tst_ShortcutObject::changesTheShortcutOnlyOnApply()
{
    QWidget window;
    QShortcut shortcut(QKeySequence(Qt::Key_F5), &window);
    ShortcutObject object(QStringLiteral("n"), &shortcut, QString(), QString());
    object.setKeySequence(QKeySequence(Qt::Key_F6));
    QCOMPARE(shortcut.key(), QKeySequence(Qt::Key_F5));
    QCOMPARE(object.keySequence(), QKeySequence(Qt::Key_F6));
    object.apply();
    QCOMPARE(shortcut.key(), QKeySequence(Qt::Key_F6));
    QCOMPARE(object.defaultKeySequence(), QKeySequence(Qt::Key_F5));

    object.setObjectKeySequence(QKeySequence(Qt::Key_F7));
    QCOMPARE(shortcut.key(), QKeySequence(Qt::Key_F7));
    QCOMPARE(object.keySequence(), QKeySequence(Qt::Key_F6));
}

void tst_ShortcutObject::throwsAnEditAway()
{
    QWidget window;
    QShortcut shortcut(QKeySequence(Qt::Key_F5), &window);
    ShortcutObject object(QStringLiteral("n"), &shortcut, QString(), QString());
    object.setKeySequence(QKeySequence(Qt::Key_F6));
    object.reset();
    QCOMPARE(object.keySequence(), QKeySequence(Qt::Key_F5));
}

void tst_ShortcutObject::takesItsGroupFromTheParent_data()
{
    QTest::addColumn<QString>("given");
    QTest::addColumn<QString>("parentName");
    QTest::addColumn<QString>("group");
    QTest::newRow("given") << QStringLiteral("File") << QStringLiteral("window") << QStringLiteral("File");
    QTest::newRow("parent") << QString() << QStringLiteral("window") << QStringLiteral("window");
    QTest::newRow("none") << QString() << QString() << QString();
}

void tst_ShortcutObject::takesItsGroupFromTheParent()
{
    QFETCH(QString, given);
    QFETCH(QString, parentName);
    QWidget window;
    window.setObjectName(parentName);
    QShortcut shortcut(&window);
    const ShortcutObject object(QStringLiteral("n"), &shortcut, QString(), given);
    QTEST(object.group(), "group");
}

void tst_ShortcutObject::showsTheGivenText()
{
    QWidget window;
    QShortcut shortcut(&window);
    const ShortcutObject object(QStringLiteral("n"), &shortcut, QStringLiteral("Go && &up"), QString());
    QCOMPARE(object.text(), QStringLiteral("Go && &up"));
    QVERIFY(object.icon().isNull());
}

void tst_ShortcutObject::asksForItsRemovalWhenTheShortcutGoes()
{
    QWidget window;
    auto *shortcut = new QShortcut(QKeySequence(Qt::Key_F5), &window);
    ShortcutObject object(QStringLiteral("n"), shortcut, QString(), QString());
    QSignalSpy spy(&object, &IShortcutObject::deleteMe);
    delete shortcut;
    QCOMPARE(spy.count(), 1);
    QVERIFY(object.objectKeySequence().isEmpty());
    object.setKeySequence(QKeySequence(Qt::Key_F6));
    object.apply();
    object.reset();
    QVERIFY(object.keySequence().isEmpty());
}

void tst_ShortcutObject::declaresNothingOfItsOwn()
{
    const QMetaObject &meta = ShortcutObject::staticMetaObject;
    QCOMPARE(QLatin1String(meta.className()), QLatin1String("ShortcutObject"));
    QCOMPARE(meta.methodCount(), meta.methodOffset());
}

VEL_TEST_MAIN(tst_ShortcutObject)

#include "tst_ShortcutObject.moc"
