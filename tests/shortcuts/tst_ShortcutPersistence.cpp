// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "QtMajor.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <QAction>
#include <QSettings>
#include <QShortcut>
#include <QSignalSpy>
#include <QTranslator>
#include <QWidget>

#include <memory>

namespace {

const QKeySequence f1(Qt::Key_F1);
const QKeySequence f2(Qt::Key_F2);
const QKeySequence f3(Qt::Key_F3);
const QKeySequence chords = VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_C);

QString str(const char *text)
{
    return QString::fromLatin1(text);
}

// The German name of a key, in force while it lives.
class GermanKeys : public QTranslator
{
    Q_OBJECT

public:
    GermanKeys() { QCoreApplication::installTranslator(this); }
    ~GermanKeys() override { QCoreApplication::removeTranslator(this); }

    QString translate(const char *context, const char *source, const char *, int) const override
    {
        return qstrcmp(context, "QShortcut") == 0 && qstrcmp(source, "Ctrl") == 0 ? str("Strg") : QString();
    }
    bool isEmpty() const override { return false; }
};

} // namespace

class tst_ShortcutPersistence : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void putsSavedKeysOnWhatIsRegistered();
    void savesOneKeyOfSeveral();
    void readsSavedTexts_data();
    void readsSavedTexts();
    void readsSavedTextsInTheLanguageOfTheDesktop_data();
    void readsSavedTextsInTheLanguageOfTheDesktop();
    void readsOnlyItsOwnGroup_data();
    void readsOnlyItsOwnGroup();
    void leavesWhatIsRegisteredAlone();
    void addsToWhatWasLoadedBefore();
    void savesTheKeysInForce();
    void savesDefaultsAndEmptyKeysToo();
    void savesIntoItsGroup_data();
    void savesIntoItsGroup();
    void leavesOtherNamesInTheSettings();
    void savesTheFirstObjectOfAName();
    void skipsNamesWithoutObjects();
    void remembersWhatItSaved();
    void bringsEverythingBackAfterARestart();
    void neverSavesByItself();
    void survivesMissingSettings();

    void commitsEveryObjectSilently();
    void announcesResetAndRestorePerGroup();
    void announcesAGroupThatLostItsShortcuts();
    void restoresDefaultsOnlyOnCommit();

private:
    QAction *addAction(ShortcutsModel *model, const char *name, const QKeySequence &key = QKeySequence(),
                       const char *group = "g");

    std::unique_ptr<QSettings> m_settings;
    std::unique_ptr<QWidget> m_window;
};

void tst_ShortcutPersistence::init()
{
    TestCase::init();
    m_window.reset(new QWidget);
    m_settings.reset(new QSettings(path(str("app.conf")), QSettings::IniFormat));
}

void tst_ShortcutPersistence::cleanup()
{
    m_settings.reset();
    m_window.reset();
    TestCase::cleanup();
}

QAction *tst_ShortcutPersistence::addAction(ShortcutsModel *model, const char *name, const QKeySequence &key,
                                            const char *group)
{
    auto *action = new QAction(str(name), m_window.get());
    action->setShortcut(key);
    model->registerAction(str(name), action, str(group));
    return action;
}

void tst_ShortcutPersistence::putsSavedKeysOnWhatIsRegistered()
{
    m_settings->setValue(str("Keys/a"), str("F2"));
    m_settings->setValue(str("Keys/b"), str("Ctrl+K, Ctrl+C"));
    ShortcutsModel model(m_settings.get(), str("Keys"));
    const QAction *action = addAction(&model, "a", f1);
    auto *shortcut = new QShortcut(f1, m_window.get());
    model.registerShortcut(str("b"), shortcut, str("B"), str("g"));
    const QAction *twin = addAction(&model, "a", f3, "other");
    const QAction *unsaved = addAction(&model, "c", f3);

    QCOMPARE(action->shortcut(), f2);
    QCOMPARE(shortcut->key(), chords);
    QCOMPARE(twin->shortcut(), f2);
    QCOMPARE(unsaved->shortcut(), f3);
    const QModelIndex group = model.index(0, 0);
    QCOMPARE(model.keySequence(model.index(0, 0, group)), f2);
    QCOMPARE(model.defaultKeySequence(model.index(0, 0, group)), f1);
    QCOMPARE(model.keySequence(model.index(1, 0, group)), chords);
    QCOMPARE(model.defaultKeySequence(model.index(1, 0, group)), f1);
}

void tst_ShortcutPersistence::savesOneKeyOfSeveral()
{
    QSettings settings(path(str("settings.ini")), QSettings::IniFormat);
    const auto start = [&settings](QAction *action) {
        action->setShortcuts({f1, f2, f3});
        auto model = std::make_unique<ShortcutsModel>(&settings, QString());
        model->registerAction(str("a"), action, str("File"));
        return model;
    };
    QAction first(nullptr);
    auto model = start(&first);
    model->setKeySequence(model->index(0, 0, model->index(0, 0)), f3);
    model->commitChanges();
    model->saveKeys(&settings, QString());
    QCOMPARE(settings.value(str("a")), QVariant(str("F3")));

    QAction second(nullptr);
    model = start(&second);
    QCOMPARE(second.shortcuts(), (QList<QKeySequence>{f3, f2}));
    model->restoreDefaults();
    model->commitChanges();
    QCOMPARE(second.shortcuts(), (QList<QKeySequence>{f1, f2, f3}));
}

void tst_ShortcutPersistence::readsSavedTexts_data()
{
    QTest::addColumn<QVariant>("saved");
    QTest::addColumn<QKeySequence>("key");
    QTest::newRow("empty") << QVariant(QString()) << QKeySequence();
    QTest::newRow("unparsable") << QVariant(str("Gibberish")) << QKeySequence();
    QTest::newRow("none") << QVariant(str("None")) << QKeySequence();
    QTest::newRow("unparsable part") << QVariant(str("Ctrl+K, Gibberish")) << QKeySequence();
    QTest::newRow("unknown modifier") << QVariant(str("Hyper+K")) << QKeySequence();
    QTest::newRow("list") << QVariant(QStringList{str("F1"), str("F2")}) << QKeySequence();
    QTest::newRow("chords") << QVariant(str("Ctrl+K, Ctrl+C")) << chords;
    QTest::newRow("comma") << QVariant(str("Ctrl+,")) << QKeySequence(Qt::CTRL | Qt::Key_Comma);
    QTest::newRow("shift") << QVariant(str("Ctrl+Shift+F5"))
                           << QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_F5);
}

void tst_ShortcutPersistence::readsSavedTexts()
{
    QFETCH(QVariant, saved);
    m_settings->setValue(str("a"), saved);
    ShortcutsModel model(m_settings.get(), QString());
    const QKeySequence shortcut = addAction(&model, "a", f1)->shortcut();
    QTEST(shortcut, "key");
    QCOMPARE(shortcut.isEmpty(), shortcut.count() == 0);
}

void tst_ShortcutPersistence::readsSavedTextsInTheLanguageOfTheDesktop_data()
{
    QTest::addColumn<QString>("saved");
    QTest::newRow("translated") << str("Strg+F2");
    QTest::newRow("portable") << str("Ctrl+F2");
}

void tst_ShortcutPersistence::readsSavedTextsInTheLanguageOfTheDesktop()
{
    QFETCH(QString, saved);
    const GermanKeys german;
    m_settings->setValue(str("a"), saved);
    ShortcutsModel model(m_settings.get(), QString());
    QCOMPARE(addAction(&model, "a", f1)->shortcut(), QKeySequence(Qt::CTRL | Qt::Key_F2));
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("a")), QVariant(str("Ctrl+F2")));
}

void tst_ShortcutPersistence::readsOnlyItsOwnGroup_data()
{
    QTest::addColumn<QString>("group");
    QTest::addColumn<QKeySequence>("key");
    QTest::newRow("none") << QString() << f1;
    QTest::newRow("group") << str("Keys") << f2;
    QTest::newRow("subgroup") << str("Keys/Sub") << f3;
    QTest::newRow("missing") << str("Missing") << QKeySequence();
}

void tst_ShortcutPersistence::readsOnlyItsOwnGroup()
{
    QFETCH(QString, group);
    QFETCH(QKeySequence, key);
    m_settings->setValue(str("a"), str("F1"));
    m_settings->setValue(str("Keys/a"), str("F2"));
    m_settings->setValue(str("Keys/Sub/a"), str("F3"));
    ShortcutsModel model(m_settings.get(), group);
    QCOMPARE(addAction(&model, "a")->shortcut(), key);
    QVERIFY(m_settings->group().isEmpty());
}

void tst_ShortcutPersistence::leavesWhatIsRegisteredAlone()
{
    ShortcutsModel model(m_settings.get(), QString());
    const QAction *early = addAction(&model, "a", f1);
    m_settings->setValue(str("a"), str("F2"));
    model.loadKeys(m_settings.get(), QString());
    QCOMPARE(early->shortcut(), f1);
    QCOMPARE(addAction(&model, "a", f1)->shortcut(), f2);
}

void tst_ShortcutPersistence::addsToWhatWasLoadedBefore()
{
    m_settings->setValue(str("One/a"), str("F1"));
    m_settings->setValue(str("One/b"), str("F1"));
    m_settings->setValue(str("Two/a"), str("F2"));
    ShortcutsModel model(m_settings.get(), str("One"));
    model.loadKeys(m_settings.get(), str("Two"));
    QCOMPARE(addAction(&model, "a")->shortcut(), f2);
    QCOMPARE(addAction(&model, "b")->shortcut(), f1);
}

void tst_ShortcutPersistence::savesTheKeysInForce()
{
    ShortcutsModel model(m_settings.get(), QString());
    addAction(&model, "a", f1);
    model.setKeySequence(model.index(0, 0, model.index(0, 0)), f2);
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("a")), QVariant(str("F1")));
    model.commitChanges();
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("a")), QVariant(str("F2")));

    // Canceled edits.
    model.setKeySequence(model.index(0, 0, model.index(0, 0)), f3);
    model.resetShortcuts();
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("a")), QVariant(str("F2")));
}

void tst_ShortcutPersistence::savesDefaultsAndEmptyKeysToo()
{
    ShortcutsModel model(m_settings.get(), QString());
    addAction(&model, "a", f1);
    addAction(&model, "b", QKeySequence());
    addAction(&model, "c", chords);
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->allKeys(), QStringList({str("a"), str("b"), str("c")}));
    QCOMPARE(m_settings->value(str("a")), QVariant(str("F1")));
    QCOMPARE(m_settings->value(str("b")), QVariant(QString(str(""))));
    QCOMPARE(m_settings->value(str("c")), QVariant(str("Ctrl+K, Ctrl+C")));
}

void tst_ShortcutPersistence::savesIntoItsGroup_data()
{
    QTest::addColumn<QString>("group");
    QTest::addColumn<QString>("key");
    QTest::newRow("none") << QString() << str("a");
    QTest::newRow("group") << str("Keys") << str("Keys/a");
}

void tst_ShortcutPersistence::savesIntoItsGroup()
{
    QFETCH(QString, group);
    QFETCH(QString, key);
    ShortcutsModel model(m_settings.get(), group);
    addAction(&model, "a", f1);
    QVERIFY(QMetaObject::invokeMethod(&model, "saveKeys", Q_ARG(QSettings *, m_settings.get()),
                                      Q_ARG(QString, group)));
    QCOMPARE(m_settings->allKeys(), QStringList(key));
    QVERIFY(m_settings->group().isEmpty());
}

void tst_ShortcutPersistence::leavesOtherNamesInTheSettings()
{
    m_settings->setValue(str("old"), str("F9"));
    m_settings->setValue(str("Geometry/x"), 5);
    ShortcutsModel model(m_settings.get(), QString());
    addAction(&model, "a", f1);
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("old")), QVariant(str("F9")));
    QCOMPARE(m_settings->value(str("Geometry/x")), QVariant(5));
}

void tst_ShortcutPersistence::savesTheFirstObjectOfAName()
{
    ShortcutsModel model(m_settings.get(), QString());
    addAction(&model, "a", f1);
    addAction(&model, "a", f2);
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("a")), QVariant(str("F1")));

    ShortcutsModel next(m_settings.get(), QString());
    QCOMPARE(addAction(&next, "a", f2)->shortcut(), f1);
    QCOMPARE(addAction(&next, "a", f3)->shortcut(), f1);
}

void tst_ShortcutPersistence::skipsNamesWithoutObjects()
{
    m_settings->setValue(str("a"), str("F2"));
    ShortcutsModel model(m_settings.get(), QString());
    delete addAction(&model, "a", f1, "File");
    addAction(&model, "b", f1, "Edit");
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("a")), QVariant(str("F2")));
    QCOMPARE(m_settings->value(str("b")), QVariant(str("F1")));
}

void tst_ShortcutPersistence::remembersWhatItSaved()
{
    ShortcutsModel model(m_settings.get(), QString());
    addAction(&model, "a", f1)->setShortcut(f2);
    QCOMPARE(addAction(&model, "a", f3)->shortcut(), f3);
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(addAction(&model, "a", f3)->shortcut(), f2);
}

void tst_ShortcutPersistence::bringsEverythingBackAfterARestart()
{
    const QVector<QKeySequence> keys = {
        f1,
        chords,
        QKeySequence(),
        QKeySequence(Qt::CTRL | Qt::Key_Comma),
        QKeySequence(Qt::CTRL | Qt::Key_Plus),
        QKeySequence(Qt::META | Qt::ALT | Qt::SHIFT | Qt::CTRL | Qt::Key_Backslash),
        VelTest::keySequence(Qt::Key_Comma, Qt::Key_Comma, Qt::Key_Semicolon, Qt::Key_At),
        QKeySequence(Qt::Key_Adiaeresis),
        QKeySequence(int(Qt::KeypadModifier) | int(Qt::Key_5)),
        QKeySequence(Qt::Key_VolumeUp)};
    {
        ShortcutsModel model(m_settings.get(), str("Keys"));
        for (int i = 0; i < keys.size(); ++i)
            addAction(&model, qPrintable(QString::number(i)), keys.at(i));
        model.saveKeys(m_settings.get(), str("Keys"));
        m_settings->sync();
    }
    m_settings.reset(new QSettings(path(str("app.conf")), QSettings::IniFormat));
    ShortcutsModel model(m_settings.get(), str("Keys"));
    for (int i = 0; i < keys.size(); ++i)
        QCOMPARE(addAction(&model, qPrintable(QString::number(i)), f2)->shortcut(), keys.at(i));
}

void tst_ShortcutPersistence::neverSavesByItself()
{
    {
        ShortcutsModel model(m_settings.get(), QString());
        addAction(&model, "a", f1);
        model.setKeySequence(model.index(0, 0, model.index(0, 0)), f2);
        model.commitChanges();
        model.restoreDefaults();
        model.resetShortcuts();
    }
    QVERIFY(m_settings->allKeys().isEmpty());
}

void tst_ShortcutPersistence::survivesMissingSettings()
{
    ShortcutsModel model(nullptr, str("Keys"));
    addAction(&model, "a", f1);
    model.loadKeys(nullptr, QString());
    model.saveKeys(nullptr, QString());
    QCOMPARE(model.rowCount(), 1);
}

void tst_ShortcutPersistence::commitsEveryObjectSilently()
{
    ShortcutsModel model(m_settings.get(), QString());
    QAction *first = addAction(&model, "a", f1);
    QAction *second = addAction(&model, "a", f2);
    const QAction *other = addAction(&model, "b", f3, "h");
    model.setKeySequence(model.index(0, 0, model.index(1, 0)), f1);
    first->setShortcut(f3);
    second->setShortcut(f3);
    QSignalSpy spy(&model, &QAbstractItemModel::dataChanged);
    model.commitChanges();
    QCOMPARE(first->shortcut(), f1);
    QCOMPARE(second->shortcut(), f2);
    QCOMPARE(other->shortcut(), f1);
    QCOMPARE(spy.count(), 0);
}

void tst_ShortcutPersistence::announcesResetAndRestorePerGroup()
{
    ShortcutsModel model(m_settings.get(), QString());
    addAction(&model, "a", f1, "one");
    addAction(&model, "b", f1, "two");
    addAction(&model, "c", f1, "two");
    QSignalSpy spy(&model, &QAbstractItemModel::dataChanged);
    const auto verify = [&] {
        QCOMPARE(spy.count(), 2);
        for (int group = 0; group < 2; ++group) {
            const QModelIndex parent = model.index(group, 0);
            QCOMPARE(spy.at(group).at(0).toModelIndex(), model.index(0, 1, parent));
            QCOMPARE(spy.at(group).at(1).toModelIndex(), model.index(group, 1, parent));
            QVERIFY(spy.at(group).at(2).value<QVector<int>>().isEmpty());
        }
        spy.clear();
    };
    model.resetShortcuts();
    verify();
    model.restoreDefaults();
    verify();
}

void tst_ShortcutPersistence::announcesAGroupThatLostItsShortcuts()
{
    ShortcutsModel model(m_settings.get(), QString());
    delete addAction(&model, "a", f1);
    QSignalSpy spy(&model, &QAbstractItemModel::dataChanged);
    model.resetShortcuts();
    model.restoreDefaults();
    QCOMPARE(spy.count(), 2);
    QCOMPARE(spy.at(0).at(1).toModelIndex(), model.index(0, 1, model.index(0, 0)));
}

void tst_ShortcutPersistence::restoresDefaultsOnlyOnCommit()
{
    m_settings->setValue(str("a"), str("F2"));
    ShortcutsModel model(m_settings.get(), QString());
    const QAction *action = addAction(&model, "a", f1);
    model.restoreDefaults();
    QCOMPARE(model.keySequence(model.index(0, 0, model.index(0, 0))), f1);
    QCOMPARE(action->shortcut(), f2);
    model.saveKeys(m_settings.get(), QString());
    QCOMPARE(m_settings->value(str("a")), QVariant(str("F2")));
    model.commitChanges();
    QCOMPARE(action->shortcut(), f1);
}

VEL_TEST_MAIN(tst_ShortcutPersistence)

#include "tst_ShortcutPersistence.moc"
