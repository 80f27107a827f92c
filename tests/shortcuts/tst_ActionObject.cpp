// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <shortcuts/ActionObject.h>

#include <QRegExp>
#include <QSignalSpy>
#include <QWidget>

class tst_ActionObject : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesTheKeyOfTheActionAsDefault();
    void changesTheActionOnlyOnApply();
    void throwsAnEditAway();
    void takesItsGroupFromTheParent_data();
    void takesItsGroupFromTheParent();
    void leavesTheMnemonicMarksOut_data();
    void leavesTheMnemonicMarksOut();
    void showsTheActionAsItIsNow();
    void asksForItsRemovalWhenTheActionGoes();
    void survivesTheDeletionOfTheActionWhileItIsApplied();
    void declaresNothingOfItsOwn();
};

void tst_ActionObject::takesTheKeyOfTheActionAsDefault()
{
    QAction action(nullptr);
    action.setShortcuts({QKeySequence(Qt::Key_F5), QKeySequence(Qt::Key_F8)});
    const ActionObject object(QStringLiteral("n"), &action, QStringLiteral("g"));
    QCOMPARE(object.defaultKeySequence(), QKeySequence(Qt::Key_F5));
    QCOMPARE(object.objectKeySequence(), QKeySequence(Qt::Key_F5));
    QCOMPARE(object.name(), QStringLiteral("n"));
    QVERIFY(!object.parent());
}

void tst_ActionObject::changesTheActionOnlyOnApply()
{
    QAction action(nullptr);
    action.setShortcut(QKeySequence(Qt::Key_F5));
    ActionObject object(QStringLiteral("n"), &action, QStringLiteral("g"));
    object.setKeySequence(QKeySequence(Qt::Key_F6));
    QCOMPARE(action.shortcut(), QKeySequence(Qt::Key_F5));
    QCOMPARE(object.keySequence(), QKeySequence(Qt::Key_F6));
    object.apply();
    QCOMPARE(action.shortcut(), QKeySequence(Qt::Key_F6));
    QCOMPARE(object.defaultKeySequence(), QKeySequence(Qt::Key_F5));
}

void tst_ActionObject::throwsAnEditAway()
{
    QAction action(nullptr);
    action.setShortcut(QKeySequence(Qt::Key_F5));
    ActionObject object(QStringLiteral("n"), &action, QStringLiteral("g"));
    object.setKeySequence(QKeySequence(Qt::Key_F6));
    object.reset();
    QCOMPARE(object.keySequence(), QKeySequence(Qt::Key_F5));
}

void tst_ActionObject::takesItsGroupFromTheParent_data()
{
    QTest::addColumn<QString>("given");
    QTest::addColumn<QString>("parentName");
    QTest::addColumn<QString>("group");
    QTest::newRow("given") << QStringLiteral("File") << QStringLiteral("window") << QStringLiteral("File");
    QTest::newRow("parent") << QString() << QStringLiteral("window") << QStringLiteral("window");
    QTest::newRow("none") << QString() << QString() << QString();
}

void tst_ActionObject::takesItsGroupFromTheParent()
{
    QFETCH(QString, given);
    QFETCH(QString, parentName);
    QObject parent;
    parent.setObjectName(parentName);
    QAction action(&parent);
    const ActionObject object(QStringLiteral("n"), &action, given);
    QTEST(object.group(), "group");
    QAction orphan(nullptr);
    QCOMPARE(ActionObject(QStringLiteral("n"), &orphan, given).group(), given);
}

void tst_ActionObject::leavesTheMnemonicMarksOut_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("shown");
    QTest::newRow("mark and ampersand") << QStringLiteral("&Save && Quit") << QStringLiteral("Save & Quit");
    QTest::newRow("none") << QStringLiteral("Quit") << QStringLiteral("Quit");
    QTest::newRow("at the end") << QStringLiteral("Quit&") << QStringLiteral("Quit");
    QTest::newRow("three") << QStringLiteral("a&&&b") << QStringLiteral("a&&b");
    QTest::newRow("only ampersands") << QStringLiteral("&&&&") << QStringLiteral("&&&");
    QTest::newRow("two marks") << QStringLiteral("&a &b") << QStringLiteral("a b");
}

void tst_ActionObject::leavesTheMnemonicMarksOut()
{
    QFETCH(QString, text);
    QAction action(text, nullptr);
    const ActionObject object(QStringLiteral("n"), &action, QStringLiteral("g"));
    QTEST(object.text(), "shown");
    QCOMPARE(object.text(), QString(text).remove(QRegExp(QStringLiteral("&(?!&)"))));
}

void tst_ActionObject::showsTheActionAsItIsNow()
{
    QAction action(QStringLiteral("Play"), nullptr);
    const ActionObject object(QStringLiteral("n"), &action, QStringLiteral("g"));
    QVERIFY(object.icon().isNull());
    action.setText(QStringLiteral("&Pause"));
    QPixmap pixmap(16, 16);
    pixmap.fill(Qt::red);
    action.setIcon(QIcon(pixmap));
    QCOMPARE(object.text(), QStringLiteral("Pause"));
    QCOMPARE(object.icon().cacheKey(), action.icon().cacheKey());
}

void tst_ActionObject::asksForItsRemovalWhenTheActionGoes()
{
    auto *action = new QAction(QStringLiteral("Play"), this);
    ActionObject object(QStringLiteral("n"), action, QStringLiteral("g"));
    QSignalSpy spy(&object, &IShortcutObject::deleteMe);
    delete action;
    QCOMPARE(spy.count(), 1);
    QVERIFY(object.objectKeySequence().isEmpty());
    QVERIFY(object.text().isEmpty());
    QVERIFY(object.icon().isNull());
    object.setKeySequence(QKeySequence(Qt::Key_F6));
    object.apply();
}

void tst_ActionObject::survivesTheDeletionOfTheActionWhileItIsApplied()
{
    auto *action = new QAction(QStringLiteral("Play"), this);
    auto *object = new ActionObject(QStringLiteral("n"), action, QStringLiteral("g"));
    const QPointer<QObject> guard(object);
    connect(object, &IShortcutObject::deleteMe, this, [object] { delete object; });
    connect(action, &QAction::changed, this, [action] { delete action; });
    object->setKeySequence(QKeySequence(Qt::Key_F6));
    object->apply();
    QVERIFY(!guard);
}

void tst_ActionObject::declaresNothingOfItsOwn()
{
    const QMetaObject &meta = ActionObject::staticMetaObject;
    QCOMPARE(QLatin1String(meta.className()), QLatin1String("ActionObject"));
    QCOMPARE(meta.methodCount(), meta.methodOffset());
}

VEL_TEST_MAIN(tst_ActionObject)

#include "tst_ActionObject.moc"
