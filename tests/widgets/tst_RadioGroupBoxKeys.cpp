// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Keys and buttons that are held, and mnemonics, as the X server sends them.

#include "TestCase.h"
#include "XDoTool.h"

#include <VelRadioGroupBox.h>

#include <QKeyEvent>
#include <QPushButton>
#include <QSignalSpy>
#include <QStyleOptionGroupBox>
#include <QVBoxLayout>

#include <memory>

namespace {

QString s(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

class OpenBox : public VelRadioGroupBox
{
    Q_OBJECT

public:
    using VelRadioGroupBox::VelRadioGroupBox;

    bool isSunken() const { return option().state & QStyle::State_Sunken; }
    QPoint indicator() const
    {
        const QStyleOptionGroupBox groupBox = option();
        return style()
            ->subControlRect(QStyle::CC_GroupBox, &groupBox, QStyle::SC_GroupBoxCheckBox, this)
            .center();
    }

private:
    QStyleOptionGroupBox option() const
    {
        QStyleOptionGroupBox result;
        initStyleOption(&result);
        return result;
    }
};

// Counts the releases of keys that a widget sees.
class ReleaseCounter : public QObject
{
    Q_OBJECT

public:
    explicit ReleaseCounter(QWidget *widget) { widget->installEventFilter(this); }

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::KeyRelease)
            ++(static_cast<QKeyEvent *>(event)->isAutoRepeat() ? repeated : count);
        return QObject::eventFilter(watched, event);
    }

    int count = 0;
    int repeated = 0;
};

} // namespace

class tst_RadioGroupBoxKeys : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void comesUpWhenTheFocusLeavesWhileSpaceIsHeld();
    void comesUpWhenItIsDisabledWhilePressed_data();
    void comesUpWhenItIsDisabledWhilePressed();
    void comesUpWhenItIsHiddenWhilePressed();
    void staysDownWhileSpaceIsHeld();
    void leavesItsLetterToOtherWidgets_data();
    void leavesItsLetterToOtherWidgets();

private:
    std::unique_ptr<QWidget> m_window;
    OpenBox *m_first = nullptr;
    OpenBox *m_second = nullptr;
    QPushButton *m_find = nullptr;
};

void tst_RadioGroupBoxKeys::init()
{
    TestCase::init();
    m_window = std::make_unique<QWidget>();
    auto *layout = new QVBoxLayout(m_window.get());
    m_first = new OpenBox(s("&First"), m_window.get());
    m_find = new QPushButton(s("&Find"), m_window.get());
    m_second = new OpenBox(s("Second"), m_window.get());
    for (QWidget *widget :
         {static_cast<QWidget *>(m_first), static_cast<QWidget *>(m_find), static_cast<QWidget *>(m_second)})
        layout->addWidget(widget);
    m_window->resize(300, 240);
    m_window->show();
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    m_first->setFocus();
    QTRY_VERIFY(m_first->hasFocus());
}

void tst_RadioGroupBoxKeys::cleanup()
{
    m_window.reset();
    TestCase::cleanup();
}

void tst_RadioGroupBoxKeys::comesUpWhenTheFocusLeavesWhileSpaceIsHeld()
{
    XDoTool::run(s("keydown space"));
    QTRY_VERIFY(m_first->isSunken());
    XDoTool::run(s("key Tab"));
    QTRY_VERIFY(!m_first->hasFocus());
    QVERIFY(!m_first->isSunken());
    XDoTool::run(s("keyup space"));
    QVERIFY(!m_first->isSunken());
    QVERIFY(!m_first->isChecked());
}

void tst_RadioGroupBoxKeys::comesUpWhenItIsDisabledWhilePressed_data()
{
    QTest::addColumn<bool>("byMouse");
    QTest::newRow("by Space") << false;
    QTest::newRow("by the mouse") << true;
}

void tst_RadioGroupBoxKeys::comesUpWhenItIsDisabledWhilePressed()
{
    QFETCH(bool, byMouse);
    if (byMouse)
        XDoTool::run(s("mousemove %1 sleep 0.1 mousedown 1").arg(XDoTool::at(m_first, m_first->indicator())));
    else
        XDoTool::run(s("keydown space"));
    QTRY_VERIFY(m_first->isSunken());
    m_first->setEnabled(false);
    QVERIFY(!m_first->isSunken());
    XDoTool::run(byMouse ? s("mouseup 1") : s("keyup space"));
    m_first->setEnabled(true);
    QVERIFY(!m_first->isSunken());
    QVERIFY(!m_first->isChecked());
}

void tst_RadioGroupBoxKeys::comesUpWhenItIsHiddenWhilePressed()
{
    XDoTool::run(s("keydown space"));
    QTRY_VERIFY(m_first->isSunken());
    m_first->hide();
    XDoTool::run(s("keyup space"));
    m_first->show();
    QVERIFY(!m_first->isSunken());
}

void tst_RadioGroupBoxKeys::staysDownWhileSpaceIsHeld()
{
    ReleaseCounter releases(m_first);
    do {
        XDoTool::run(s("keyup space sleep 0.1"));
        m_second->setChecked(true);
        releases.count = 0;
        XDoTool::run(s("keydown space sleep 1.2"));
        // On a busy machine Qt sees a repetition in two parts, a release and a press: once more.
    } while (releases.count > 0);
    QVERIFY(releases.repeated > 3);
    QVERIFY(m_first->isSunken());
    QVERIFY(!m_first->isChecked());
    XDoTool::run(s("keyup space"));
    QTRY_VERIFY(m_first->isChecked());
    QVERIFY(!m_first->isSunken());
}

void tst_RadioGroupBoxKeys::leavesItsLetterToOtherWidgets_data()
{
    QTest::addColumn<QString>("when");
    for (const char *when :
         {"constructed", "set later", "set by name", "set while it is hidden", "made later"})
        QTest::newRow(when) << s(when);
}

void tst_RadioGroupBoxKeys::leavesItsLetterToOtherWidgets()
{
    QFETCH(QString, when);
    if (when == s("set later")) {
        m_second->setTitle(s("&Files"));
    } else if (when == s("set by name")) {
        m_second->setProperty("title", s("&Folders"));
    } else if (when == s("set while it is hidden")) {
        m_second->hide();
        m_second->setTitle(s("&Fields"));
        new QPushButton(s("&Other"), m_window.get());
        m_second->show();
    } else if (when == s("made later")) {
        auto *box = new OpenBox(m_window.get());
        box->setTitle(s("&Form"));
        m_window->layout()->addWidget(box);
        QTRY_VERIFY(box->isVisible());
    }
    m_window->grab();
    QSignalSpy clicked(m_find, &QPushButton::clicked);
    for (int i = 0; i < 4; ++i) {
        XDoTool::press(s("alt+f"));
        QTRY_COMPARE(clicked.count(), i + 1);
    }
    QVERIFY(!m_first->isChecked());
    QVERIFY(!m_second->isChecked());
}

VEL_TEST_MAIN(tst_RadioGroupBoxKeys)

#include "tst_RadioGroupBoxKeys.moc"
