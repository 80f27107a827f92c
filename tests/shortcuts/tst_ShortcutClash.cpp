// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyTestObject.h"
#include "QtMajor.h"
#include "ShortcutClash.h"
#include "ShortcutsModelTestCase.h"

#include <QDialog>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QMainWindow>
#include <QMenuBar>
#include <QProcess>
#include <QPushButton>
#include <QTabBar>
#include <VelRadioGroupBox.h>
#include <frame/QtMajor.h>

#include <X11/XKBlib.h>

class tst_ShortcutClash : public ShortcutsModelTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void findsNothingForNoKey_data();
    void findsNothingForNoKey();
    void findsNothingForAFreeKey();

    void namesEveryShortcutThatHasTheKey();
    void takesShortcutsOfOneNameForOne();
    void looksAtPendingKeys();
    void findsPrefixesBothWays();

    void tellsOfFurtherKeys();
    void findsTheMnemonicOfAMenu();
    void findsTheMnemonicOfAWidget_data();
    void findsTheMnemonicOfAWidget();
    void leavesOutMnemonicsThatDoNotWork();

    void namesStandardKeys_data();
    void namesStandardKeys();
    void findsGlobalKeys();
    void leavesOutIconActionsOfTheWindowManager();

    void findsKeysThatOneTypesWith_data();
    void findsKeysThatOneTypesWith();

    void findsKeysThatTheLayoutLacks_data();
    void findsKeysThatTheLayoutLacks();
    void findsLatinLettersInAnyLayoutOfTheUser();

    void ordersClashesByKind();

private:
    using Clashes = QVector<ShortcutClash>;

    Clashes find(const QKeySequence &key, const QWidget *window = nullptr) const
    {
        return ShortcutClash::find(*m_model, str("me"), key, window);
    }
    Clashes find(const char *key, const QWidget *window = nullptr) const
    {
        return find(QKeySequence(QString::fromUtf8(key)), window);
    }
    // The texts of the clashes of a kind.
    static QStringList texts(const Clashes &clashes, ShortcutClash::Kind kind);
    static void setLayout(const QString &name);
    void add(const char *name, const char *group, const QKeySequence &key)
    {
        m_model->registerShortcutObject(new KeyTestObject(str(name), str(group), key));
    }
};

void tst_ShortcutClash::init()
{
    ShortcutsModelTestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
}

void tst_ShortcutClash::cleanup()
{
    setLayout(str("us"));
    qunsetenv("VEL_CONFIG_HOME");
    ShortcutsModelTestCase::cleanup();
}

QStringList tst_ShortcutClash::texts(const Clashes &clashes, ShortcutClash::Kind kind)
{
    QStringList texts;
    for (const ShortcutClash &clash : clashes) {
        if (clash.kind == kind)
            texts.append(clash.text);
    }
    return texts;
}

void tst_ShortcutClash::setLayout(const QString &name)
{
    QCOMPARE(QProcess::execute(str("setxkbmap"), {name}), 0);
}

void tst_ShortcutClash::findsNothingForNoKey_data()
{
    QTest::addColumn<QKeySequence>("key");
    QTest::newRow("empty") << QKeySequence();
    QTest::newRow("unknown") << QKeySequence(Qt::Key_unknown);
    QTest::newRow("unknown second chord") << VelTest::keySequence(Qt::Key_F1, Qt::Key_unknown);
}

void tst_ShortcutClash::findsNothingForNoKey()
{
    QFETCH(QKeySequence, key);
    write(str("keyshortcutrc"), "[ShortCutKeys]\nNone+=act\nGibberish=act\n");
    add("other", "g", key);
    QVERIFY(find(key, m_window.get()).isEmpty());
}

void tst_ShortcutClash::findsNothingForAFreeKey()
{
    add("me", "g", QKeySequence());
    add("other", "g", f3);
    add("none", "g", QKeySequence());
    QVERIFY(find("Ctrl+J", m_window.get()).isEmpty());
    QVERIFY(find("Ctrl+J, Ctrl+K").isEmpty());
    QVERIFY(find("Shift+F9").isEmpty());
}

void tst_ShortcutClash::namesEveryShortcutThatHasTheKey()
{
    add("a", "g", QKeySequence(Qt::CTRL | Qt::Key_J));
    add("b", "h", QKeySequence(Qt::CTRL | Qt::Key_J));
    const Clashes clashes = find("Ctrl+J");
    QCOMPARE(clashes.size(), 2);
    QCOMPARE(clashes.at(0).kind, ShortcutClash::SameKey);
    QCOMPARE(clashes.at(0).otherName, str("a"));
    QCOMPARE(clashes.at(0).text, str("Shortcut 'Ctrl+J' is already used for action 'Text of a'."));
    QCOMPARE(clashes.at(1).otherName, str("b"));
}

void tst_ShortcutClash::takesShortcutsOfOneNameForOne()
{
    add("me", "g", QKeySequence(Qt::CTRL | Qt::Key_J));
    add("me", "h", QKeySequence(Qt::CTRL | Qt::Key_J));
    QVERIFY(find("Ctrl+J").isEmpty());
    QVERIFY(find("Ctrl+J, Ctrl+K").isEmpty());
}

void tst_ShortcutClash::looksAtPendingKeys()
{
    add("a", "g", QKeySequence(Qt::CTRL | Qt::Key_J));
    m_model->setKeySequence(row(0, 0), QKeySequence(Qt::CTRL | Qt::Key_M));
    QVERIFY(find("Ctrl+J").isEmpty());
    QCOMPARE(find("Ctrl+M").size(), 1);
    delete addAction("b", "g", QKeySequence(Qt::CTRL | Qt::Key_J));
    QVERIFY(find("Ctrl+J").isEmpty());
}

void tst_ShortcutClash::findsPrefixesBothWays()
{
    add("long", "g", VelTest::keySequence(Qt::CTRL | Qt::Key_J, Qt::CTRL | Qt::Key_D));
    add("short", "g", QKeySequence(Qt::CTRL | Qt::Key_L));
    Clashes clashes = find("Ctrl+J");
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).kind, ShortcutClash::Prefix);
    QCOMPARE(clashes.at(0).otherName, str("long"));
    QCOMPARE(clashes.at(0).text,
             str("Shortcut 'Ctrl+J, Ctrl+D' of action 'Text of long' begins with 'Ctrl+J'."));
    clashes = find("Ctrl+L, Ctrl+D");
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).kind, ShortcutClash::Prefix);
    QCOMPARE(clashes.at(0).otherName, str("short"));
    QCOMPARE(clashes.at(0).text,
             str("Shortcut 'Ctrl+L, Ctrl+D' begins with 'Ctrl+L', the shortcut of action 'Text of short'."));
    QVERIFY(find("Ctrl+J, Ctrl+L").isEmpty());
}

void tst_ShortcutClash::tellsOfFurtherKeys()
{
    const QKeySequence ctrlJ(Qt::CTRL | Qt::Key_J);
    QAction *action = addAction("many", "g", QKeySequence(Qt::CTRL | Qt::Key_L));
    action->setShortcuts({action->shortcut(), ctrlJ, VelTest::keySequence(Qt::CTRL | Qt::Key_M, Qt::Key_F9)});
    Clashes clashes = find("Ctrl+J");
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).kind, ShortcutClash::SameKey);
    QCOMPARE(clashes.at(0).otherName, str("many"));
    QCOMPARE(clashes.at(0).text, str("Shortcut 'Ctrl+J' is a further shortcut of action 'Text of many'."));
    clashes = find("Ctrl+M");
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).kind, ShortcutClash::Prefix);
    QCOMPARE(clashes.at(0).otherName, str("many"));
    QCOMPARE(clashes.at(0).text, str("Shortcut 'Ctrl+M, F9' of action 'Text of many' begins with 'Ctrl+M'."));
    clashes = find("Ctrl+J, F9");
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).text,
             str("Shortcut 'Ctrl+J, F9' begins with 'Ctrl+J', the shortcut of action 'Text of many'."));
    // As the first key it is told once, as that.
    m_model->setKeySequence(row(0, 0), ctrlJ);
    clashes = find("Ctrl+J");
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).text, str("Shortcut 'Ctrl+J' is already used for action 'Text of many'."));
    QVERIFY(ShortcutClash::find(*m_model, str("many"), ctrlJ).isEmpty());
}

void tst_ShortcutClash::findsTheMnemonicOfAMenu()
{
    QMainWindow window;
    window.menuBar()->addMenu(str("&File && more"));
    window.menuBar()->addMenu(str("&Hidden"))->menuAction()->setVisible(false);
    Clashes clashes = find("Alt+F", &window);
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).kind, ShortcutClash::Mnemonic);
    QCOMPARE(clashes.at(0).text, str("Shortcut 'Alt+F' opens the menu 'File & more'."));
    QCOMPARE(clashes.at(0).otherName, QString());
    QCOMPARE(texts(find("Alt+F, Ctrl+J", &window), ShortcutClash::Mnemonic).size(), 1);
    QVERIFY(find("Ctrl+J, Alt+F", &window).isEmpty());
    QVERIFY(find("Ctrl+Alt+F", &window).isEmpty());
    QVERIFY(find("Alt+H", &window).isEmpty());
    QVERIFY(find("Alt+M", &window).isEmpty());
    QVERIFY(find("Alt+F").isEmpty());
    QVERIFY(find("Alt+F", m_window.get()).isEmpty());
}

void tst_ShortcutClash::findsTheMnemonicOfAWidget_data()
{
    QTest::addColumn<QString>("key");
    QTest::newRow("button") << str("Alt+B");
    QTest::newRow("label") << str("Alt+L");
    QTest::newRow("group box") << str("Alt+G");
    QTest::newRow("tab") << str("Alt+T");
}

void tst_ShortcutClash::findsTheMnemonicOfAWidget()
{
    QFETCH(QString, key);
    QWidget window;
    new QPushButton(str("Text of &b"), &window);
    QLabel label(str("Text of &l"), &window);
    QLineEdit edit(&window);
    label.setBuddy(&edit);
    new QGroupBox(str("Text of &g"), &window);
    QTabBar tabs(&window);
    tabs.addTab(str("Text of &t"));
    const Clashes clashes = find(QKeySequence(key), &window);
    QCOMPARE(texts(clashes, ShortcutClash::Mnemonic),
             QStringList{
                 str("Shortcut '%1' leads to 'Text of %2' in the window.").arg(key, key.right(1).toLower())});
    QCOMPARE(clashes.size(), 1);
}

void tst_ShortcutClash::leavesOutMnemonicsThatDoNotWork()
{
    QWidget window;
    QLabel label(str("&Label without a buddy"), &window);
    VelRadioGroupBox box(str("&Radio group"), &window);
    auto *hidden = new QPushButton(str("&Hidden"), &window);
    hidden->hide();
    QDialog dialog(&window);
    new QPushButton(str("&Dialog"), &dialog);
    for (const char *key : {"Alt+L", "Alt+R", "Alt+H", "Alt+D"})
        QVERIFY2(find(key, &window).isEmpty(), key);
    QCOMPARE(find("Alt+D", &dialog).size(), 1);
}

void tst_ShortcutClash::namesStandardKeys_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("name");
    const auto add = [](const char *key, const char *name) { QTest::newRow(key) << str(key) << str(name); };
    add("Ctrl+S", "Save");
    add("Ctrl+C", "Copy");
    add("F1", "Help");
    add("F5", "Refresh");
    add("Ctrl+Home", "Move the cursor");
    add("Shift+Left", "Select text");
    add("Ctrl+Backspace", "Edit text");
    add("Esc", "Cancel");
}

void tst_ShortcutClash::namesStandardKeys()
{
    QFETCH(QString, key);
    QFETCH(QString, name);
    const QString text = str("Shortcut '%1' is the standard shortcut for '%2'.").arg(key, name);
    const Clashes clashes = find(QKeySequence(key));
    QCOMPARE(texts(clashes, ShortcutClash::StandardKey), QStringList{text});
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(texts(find(QKeySequence(key + str(", Ctrl+J"))), ShortcutClash::StandardKey), QStringList{text});
}

void tst_ShortcutClash::findsGlobalKeys()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nCtrl+F8=\"VELWM_MENU\"\n");
    const Clashes clashes = find("Ctrl+F8");
    QCOMPARE(clashes.size(), 1);
    QCOMPARE(clashes.at(0).kind, ShortcutClash::GlobalKey);
    QCOMPARE(clashes.at(0).text, str("Shortcut 'Ctrl+F8' is already used for global action 'VELWM_MENU'."));
    QVERIFY(find("Ctrl+F9").isEmpty());
}

void tst_ShortcutClash::leavesOutIconActionsOfTheWindowManager()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nCtrl+F8=VELWM_ICON\n");
    QVERIFY(find("Ctrl+F8").isEmpty());
}

void tst_ShortcutClash::findsKeysThatOneTypesWith_data()
{
    QTest::addColumn<QKeySequence>("key");
    QTest::addColumn<bool>("types");
    for (const char *key : {"A", "Shift+A", "7", "+", "Space", "Num+5", "J, Ctrl+J"})
        QTest::newRow(key) << QKeySequence(str(key)) << true;
    for (const char *key : {"Ctrl+A", "Alt+7", "Meta+Shift+A", "F7", "Del", "Return", "Tab", "Ctrl+J, J"})
        QTest::newRow(key) << QKeySequence(str(key)) << false;
    QTest::newRow("umlaut") << QKeySequence(Qt::Key_Adiaeresis) << true;
    QTest::newRow("Cyrillic") << QKeySequence(0x416) << true;
}

void tst_ShortcutClash::findsKeysThatOneTypesWith()
{
    QFETCH(QKeySequence, key);
    QFETCH(bool, types);
    const QString chord = QKeySequence(key[0]).toString(QKeySequence::NativeText);
    const QString text = str("With '%1' as a shortcut this key cannot be typed into texts.").arg(chord);
    QCOMPARE(texts(find(key), ShortcutClash::BareKey), types ? QStringList{text} : QStringList());
}

void tst_ShortcutClash::findsKeysThatTheLayoutLacks_data()
{
    QTest::addColumn<QString>("layout");
    QTest::addColumn<QKeySequence>("key");
    QTest::addColumn<QString>("lacking");
    const auto add = [](const char *layout, const char *key, bool lacks) {
        const QString text = QString::fromUtf8(key);
        QTest::newRow(qPrintable(str(layout) + str(" ") + text))
            << str(layout) << QKeySequence(text) << (lacks ? text : QString());
    };
    add("us", "Ctrl+J", false);
    add("us", "Ctrl+{", false);
    add("us", "Ctrl+Ä", true);
    add("us", "Ctrl+Ж", true);
    add("us", "Ctrl+€", true);
    add("de", "Ctrl+Ä", false);
    add("de", "Ctrl+ß", false);
    add("de", "Ctrl+{", false);
    add("de", "Ctrl+@", false);
    add("de", "Ctrl+€", false);
    add("fr", "Ctrl+É", false);
    add("fr", "Ctrl+Ñ", true);
    add("fr(oss)", "Ctrl+Œ", false);
    add("ru", "Ctrl+Ж", false);
    add("ru", "Ctrl+Ё", false);
    add("ru", "Ctrl+J", true);
    add("ru", "Ctrl+7", false);
    add("ua", "Ctrl+Є", false);
    add("gr", "Ctrl+Σ", false);
    add("gr", "Ctrl+Ω", false);
    add("pl", "Ctrl+Ł", false);
    add("il", "Ctrl+א", false);
    for (const char *layout : {"us", "de", "ru", "jp"}) {
        for (const char *key : {"F9", "Ctrl+Ins", "Ctrl+PgUp", "Ctrl+Space", "Media Play"})
            add(layout, key, false);
    }
    QTest::newRow("second chord") << str("us")
                                  << VelTest::keySequence(Qt::CTRL | Qt::Key_J, Qt::CTRL | Qt::Key_Adiaeresis)
                                  << QString::fromUtf8("Ctrl+Ä");
    QTest::newRow("no key of X11") << str("us") << QKeySequence(Qt::Key_Camera) << QString();
}

void tst_ShortcutClash::findsKeysThatTheLayoutLacks()
{
    QFETCH(QString, layout);
    QFETCH(QString, lacking);
    QFETCH(QKeySequence, key);
    setLayout(layout);
    const QString text = str("The current keyboard layout cannot produce '%1'.").arg(lacking);
    QCOMPARE(texts(find(key), ShortcutClash::NotOnLayout),
             lacking.isEmpty() ? QStringList() : QStringList{text});
}

void tst_ShortcutClash::findsLatinLettersInAnyLayoutOfTheUser()
{
    setLayout(str("ru,us"));
    QVERIFY(find("Ctrl+J").isEmpty());
    QVERIFY(find("Ctrl+Ж").isEmpty());
    XkbLockGroup(QtMajor::x11Display(), XkbUseCoreKbd, 1);
    QVERIFY(find("Ctrl+J").isEmpty());
    QCOMPARE(texts(find("Ctrl+Ж"), ShortcutClash::NotOnLayout).size(), 1);
    XkbLockGroup(QtMajor::x11Display(), XkbUseCoreKbd, 0);
}

void tst_ShortcutClash::ordersClashesByKind()
{
    setLayout(str("ru"));
    write(str("keyshortcutrc"), "[ShortCutKeys]\nS=\"VELWM_MENU\"\nAlt+F4=\"VELWM_CLOSE\"\n");
    add("long", "g", VelTest::keySequence(Qt::Key_S, Qt::Key_F9));
    add("same", "g", QKeySequence(Qt::Key_S));
    QVector<int> kinds;
    for (const ShortcutClash &clash : find("S"))
        kinds.append(clash.kind);
    QCOMPARE(kinds,
             (QVector<int>{ShortcutClash::SameKey, ShortcutClash::Prefix, ShortcutClash::GlobalKey,
                           ShortcutClash::BareKey, ShortcutClash::NotOnLayout}));
}

VEL_TEST_MAIN(tst_ShortcutClash)

#include "tst_ShortcutClash.moc"
