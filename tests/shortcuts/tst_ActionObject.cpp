// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <shortcuts/ActionObject.h>

#include <QRegularExpression>
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
    void keepsFurtherKeys_data();
    void keepsFurtherKeys();
    void firesByAFurtherKeyThatBecameTheFirst();
    void takesWhatTheApplicationSetsMeanwhile();
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
    QCOMPARE(object.text(), QString(text).remove(QRegularExpression(QStringLiteral("&(?!&)"))));
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

void tst_ActionObject::keepsFurtherKeys_data()
{
    QTest::addColumn<QStringList>("keys"); // put on the action one after the other
    QTest::addColumn<QString>("all"); // that it has in the end
    QTest::newRow("another") << QStringList{QStringLiteral("F6")} << QStringLiteral("F6 F8 F9");
    QTest::newRow("none") << QStringList{QString()} << QStringLiteral("F8 F9");
    QTest::newRow("none, then another")
        << QStringList{QString(), QStringLiteral("F6")} << QStringLiteral("F6 F8 F9");
    QTest::newRow("a further one") << QStringList{QStringLiteral("F8")} << QStringLiteral("F8 F9");
    QTest::newRow("a further one, then another")
        << QStringList{QStringLiteral("F8"), QStringLiteral("F6")} << QStringLiteral("F6 F8 F9");
    QTest::newRow("one further one after the other")
        << QStringList{QStringLiteral("F9"), QStringLiteral("F8"), QStringLiteral("F5")}
        << QStringLiteral("F5 F8 F9");
    QTest::newRow("a further one twice, then none")
        << QStringList{QStringLiteral("F8"), QStringLiteral("F8"), QString()} << QStringLiteral("F8 F9");
}

void tst_ActionObject::keepsFurtherKeys()
{
    QFETCH(QStringList, keys);
    QAction action(nullptr);
    action.setShortcuts(
        {QKeySequence(Qt::Key_F5), QKeySequence(Qt::Key_F8), QKeySequence(), QKeySequence(Qt::Key_F9)});
    ActionObject object(QStringLiteral("n"), &action, QStringLiteral("g"));
    object.reset();
    QCOMPARE(object.furtherKeys(), (QList<QKeySequence>{QKeySequence(Qt::Key_F8), QKeySequence(Qt::Key_F9)}));
    for (const QString &key : qAsConst(keys)) {
        object.setKeySequence(QKeySequence(key));
        object.apply();
        QCOMPARE(object.objectKeySequence(), QKeySequence(key));
    }
    QStringList all;
    for (const QKeySequence &key : action.shortcuts()) {
        if (!key.isEmpty())
            all.append(key.toString());
    }
    QTEST(all.join(QLatin1Char(' ')), "all");
    // Those that are shown beside the pending key, which is the first.
    all.removeOne(keys.constLast());
    QStringList further;
    for (const QKeySequence &key : object.furtherKeys())
        further.append(key.toString());
    QCOMPARE(further, all);
}

// Qt fires nothing by a key that an action has twice.
void tst_ActionObject::firesByAFurtherKeyThatBecameTheFirst()
{
    QWidget window;
    auto *action = new QAction(&window);
    window.addAction(action);
    action->setShortcuts({QKeySequence(Qt::Key_F5), QKeySequence(Qt::Key_F8)});
    ActionObject object(QStringLiteral("n"), action, QStringLiteral("g"));
    object.setKeySequence(QKeySequence(Qt::Key_F8));
    QVERIFY(object.furtherKeys().isEmpty());
    object.apply();
    window.show();
    window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&window));
    const QSignalSpy spy(action, &QAction::triggered);
    QTest::keyClick(&window, Qt::Key_F8);
    QCOMPARE(spy.count(), 1);
    QTest::keyClick(&window, Qt::Key_F5);
    QCOMPARE(spy.count(), 1);
}

void tst_ActionObject::takesWhatTheApplicationSetsMeanwhile()
{
    QAction action(nullptr);
    action.setShortcuts({QKeySequence(Qt::Key_F5), QKeySequence(Qt::Key_F8)});
    ActionObject object(QStringLiteral("n"), &action, QStringLiteral("g"));
    object.setObjectKeySequence(QKeySequence(Qt::Key_F8));
    action.setShortcuts({QKeySequence(Qt::Key_F3), QKeySequence(Qt::Key_F4)});
    object.setObjectKeySequence(QKeySequence(Qt::Key_F6));
    QCOMPARE(action.shortcuts(), (QList<QKeySequence>{QKeySequence(Qt::Key_F6), QKeySequence(Qt::Key_F4)}));
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
