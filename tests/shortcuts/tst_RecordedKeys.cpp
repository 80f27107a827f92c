// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What the keys of a keyboard record: as the X server sends them, held ones included.

#include "QtMajor.h"
#include "RecordingTestCase.h"

#include <QKeyEvent>
#include <QProcess>
#include <QSettings>

namespace {

const QKeySequence f9(Qt::Key_F9);

// Another keyboard layout for as long as it lives.
class Layout
{
public:
    explicit Layout(const QString &name) { set(name); }
    ~Layout() { set(QStringLiteral("us")); }
    Q_DISABLE_COPY(Layout)

private:
    static void set(const QString &name)
    {
        QCOMPARE(QProcess::execute(QStringLiteral("setxkbmap"), {name}), 0);
        // Asked for after the new map was announced.
        XDoTool::ask(QStringLiteral("getmouselocation"));
    }
};

} // namespace

class tst_RecordedKeys : public RecordingTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void recordsNothingForAKeyThatIsNoChord_data();
    void recordsNothingForAKeyThatIsNoChord();
    void showsNoDeadKeyOfAShiftedOne();
    void recordsAKeyWithSuperAsOneChord();
    void checksAKeyWithSuperAgainstGlobalKeys();
    void checksAKeyWithSuperAgainstOtherActions();
    void keepsAKeyWithSuperOverARestart();
    void recordsWhatAKeyGivesWithAltGr();
    void goesOnRecordingAfterAKeyThatIsNoChord();
    void recordsAHeldKeyOnce();
    void keepsTheFirstChordWhileTheSecondIsHeld();
    void knowsAHeldKeyThatIsNotCalledRepeated();
    void namesTheHolderOfAKeyAsItIsWritten();
};

void tst_RecordedKeys::recordsNothingForAKeyThatIsNoChord_data()
{
    QTest::addColumn<QString>("layout");
    QTest::addColumn<QString>("script");
    QTest::newRow("Super") << str("us") << str("key Super_L");
    QTest::newRow("right Super") << str("us") << str("key Super_R");
    QTest::newRow("Hyper") << str("us") << str("key Hyper_L");
    // Twice: the lock is to be off again.
    QTest::newRow("Caps Lock") << str("us") << str("key Caps_Lock sleep 0.1 key Caps_Lock");
    QTest::newRow("Num Lock") << str("us") << str("key Num_Lock sleep 0.1 key Num_Lock");
    QTest::newRow("Scroll Lock") << str("us") << str("key Scroll_Lock sleep 0.1 key Scroll_Lock");
    QTest::newRow("Compose") << str("us") << str("key Multi_key");
    QTest::newRow("AltGr") << str("de") << str("key ISO_Level3_Shift");
    QTest::newRow("dead acute") << str("de") << str("key dead_acute");
    QTest::newRow("Ctrl+dead acute") << str("de") << str("key ctrl+dead_acute");
    QTest::newRow("dead circumflex") << str("de") << str("key ctrl+dead_circumflex");
    QTest::newRow("Ctrl and Shift") << str("us") << str("keydown ctrl key shift keyup ctrl");
}

void tst_RecordedKeys::recordsNothingForAKeyThatIsNoChord()
{
    QFETCH(QString, layout);
    QFETCH(QString, script);
    const Layout keyboard(layout);
    m_model->setKeySequence(row("open"), f9);
    record("open");
    XDoTool::run(script);
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(keyWidget()->keySequence(), f9);
    QVERIFY(!isChanged());
}

// The key gives a degree sign, and a dead circumflex without Shift.
void tst_RecordedKeys::showsNoDeadKeyOfAShiftedOne()
{
    const Layout keyboard(str("de"));
    m_model->setKeySequence(row("open"), f9);
    record("open");
    XDoTool::run(str("keydown ctrl keydown shift key 49 keyup shift keyup ctrl"));
    QCOMPARE(keyWidget()->keySequence(), f9);
    QVERIFY(!isChanged());
}

void tst_RecordedKeys::recordsAKeyWithSuperAsOneChord()
{
    record("open");
    XDoTool::run(str("keydown Super_L key j keyup Super_L"));
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::META | Qt::Key_J));
    QVERIFY(isChanged());

    record("save");
    XDoTool::run(str("keydown Super_L key k key l keyup Super_L"));
    QTRY_COMPARE(pendingKey("save"), VelTest::keySequence(Qt::META | Qt::Key_K, Qt::META | Qt::Key_L));
}

void tst_RecordedKeys::checksAKeyWithSuperAgainstGlobalKeys()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nMod4|j=VELWM_RUN\n");
    record("open");
    ModalDriver modal;
    modal.answer(globalConflict("Meta+J", "VELWM_RUN"), QMessageBox::Ok);
    XDoTool::run(str("keydown Super_L key j keyup Super_L"));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QCOMPARE(pendingKey("open"), QKeySequence(Qt::Key_F1));
}

void tst_RecordedKeys::checksAKeyWithSuperAgainstOtherActions()
{
    m_model->setKeySequence(row("save"), QKeySequence(Qt::META | Qt::Key_J));
    record("open");
    ModalDriver modal;
    modal.answer(localConflict("Meta+J", "Text of save"), QMessageBox::Ok);
    XDoTool::run(str("keydown Super_L key j keyup Super_L"));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QCOMPARE(pendingKey("open"), QKeySequence(Qt::Key_F1));
}

void tst_RecordedKeys::keepsAKeyWithSuperOverARestart()
{
    record("open");
    XDoTool::run(str("keydown Super_L key j keyup Super_L"));
    QTRY_VERIFY(isChanged());
    QTRY_VERIFY(pendingKey("open") != QKeySequence(Qt::Key_F1));
    XDoTool::click(button(QDialogButtonBox::Ok));
    QTRY_VERIFY(!m_dialog->isVisible());

    QSettings settings(path(str("keys.ini")), QSettings::IniFormat);
    m_model->saveKeys(&settings, str("Shortcuts"));
    settings.sync();
    QSettings reread(settings.fileName(), QSettings::IniFormat);
    ShortcutsModel next(&reread, str("Shortcuts"));
    QAction action;
    next.registerAction(str("open"), &action, str("File"));
    QCOMPARE(action.shortcut(), QKeySequence(Qt::META | Qt::Key_J));
}

void tst_RecordedKeys::recordsWhatAKeyGivesWithAltGr()
{
    const Layout keyboard(str("de"));
    record("open");
    XDoTool::run(str("keydown ISO_Level3_Shift key q keyup ISO_Level3_Shift"));
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::Key_At));
}

void tst_RecordedKeys::goesOnRecordingAfterAKeyThatIsNoChord()
{
    record("open");
    XDoTool::run(str("key ctrl+k key Caps_Lock key Caps_Lock key ctrl+d"));
    QTRY_COMPARE(pendingKey("open"), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_D));
}

void tst_RecordedKeys::recordsAHeldKeyOnce()
{
    record("open");
    XDoTool::run(str("keydown ctrl keydown j sleep 1.2 keyup j keyup ctrl"));
    QCOMPARE(keyWidget()->keySequence(), QKeySequence(Qt::CTRL | Qt::Key_J));
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::CTRL | Qt::Key_J));

    // Without a modifier too.
    record("save");
    XDoTool::run(str("keydown F8 sleep 1.2 keyup F8"));
    QTRY_COMPARE(pendingKey("save"), QKeySequence(Qt::Key_F8));
}

void tst_RecordedKeys::keepsTheFirstChordWhileTheSecondIsHeld()
{
    record("open");
    XDoTool::run(str("key ctrl+k keydown ctrl keydown d sleep 1.5 keyup d keyup ctrl"));
    QTRY_COMPARE(pendingKey("open"), VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_D));
    QVERIFY(keysStay());
    QCOMPARE(keyWidget()->keySequence(), pendingKey("open"));
}

void tst_RecordedKeys::knowsAHeldKeyThatIsNotCalledRepeated()
{
    record("open");
    const auto send = [this](QEvent::Type type, unsigned long time) {
        QKeyEvent event(type, Qt::Key_D, Qt::ControlModifier);
        event.setTimestamp(time);
        QCoreApplication::sendEvent(keyWidget(), &event);
    };
    send(QEvent::KeyPress, 1000);
    send(QEvent::KeyRelease, 1660);
    send(QEvent::KeyPress, 1660);
    send(QEvent::KeyRelease, 1700);
    QCOMPARE(keyWidget()->keySequence(), QKeySequence(Qt::CTRL | Qt::Key_D));
    send(QEvent::KeyPress, 1701);
    QCOMPARE(keyWidget()->keySequence(), VelTest::keySequence(Qt::CTRL | Qt::Key_D, Qt::CTRL | Qt::Key_D));
}

void tst_RecordedKeys::namesTheHolderOfAKeyAsItIsWritten()
{
    record("open");
    save->setText(str("<b>Save</b> <i>all</i>"));
    ModalDriver modal;
    modal.answerWith(localConflict("F2", "<b>Save</b> <i>all</i>"), [](QMessageBox *box) {
        QCOMPARE(box->textFormat(), Qt::PlainText);
        box->button(QMessageBox::Ok)->click();
    });
    XDoTool::press(str("F2"));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
}

VEL_TEST_MAIN(tst_RecordedKeys)

#include "tst_RecordedKeys.moc"
