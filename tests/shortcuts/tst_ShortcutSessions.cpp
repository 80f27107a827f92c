// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Random sessions with the shortcuts dialog, by mouse and keyboard, against a plain model of what
// must be in force, pending and saved after each step. VEL_TEST_ROUNDS sets another number of
// sessions than 50 without assistance and 50 with it; VEL_TEST_SEED, the seed of the first one,
// repeats a run.

#include "DialogHand.h"
#include "EditShortcutsDialog.h"
#include "ModalDriver.h"
#include "QtMajor.h"
#include "ShortcutsMirror.h"
#include "ShortcutsModel.h"
#include "TestCase.h"

#include <shortcuts/ClashLine.h>
#include <shortcuts/ShortcutsTreeView.h>

#include <QAction>
#include <QDialogButtonBox>
#include <QElapsedTimer>
#include <QKeySequenceEdit>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QScrollArea>
#include <QSettings>

#include <algorithm>
#include <memory>
#include <random>

namespace {

constexpr int Steps = 30;

// Few, so that they meet.
const int chords[] = {
    Qt::Key_F1,
    Qt::Key_F2,
    VelTest::keyNumber(Qt::CTRL | Qt::Key_J),
    VelTest::keyNumber(Qt::CTRL | Qt::Key_K),
    VelTest::keyNumber(Qt::META | Qt::Key_F3),
    VelTest::keyNumber(Qt::META | Qt::Key_F4),
    VelTest::keyNumber(Qt::ALT | Qt::SHIFT | Qt::Key_Up),
    Qt::Key_Escape,
    Qt::Key_Backspace,
    VelTest::keyNumber(Qt::CTRL | Qt::Key_Return),
};

const struct
{
    const char *group;
    const char *name;
    QKeySequence defaultKey;
} actionRows[] = {
    {"File", "close", VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::Key_F1)},
    {"File", "open", QKeySequence(Qt::Key_F1)},
    {"File", "save", QKeySequence(Qt::Key_F2)},
    {"Edit", "copy", QKeySequence(Qt::CTRL | Qt::Key_J)},
    {"Edit", "copy", QKeySequence(Qt::CTRL | Qt::Key_J)},
    {"Edit", "cut", QKeySequence()},
    {"Edit", "paste", QKeySequence()},
    {"View", "zoom", QKeySequence(Qt::Key_F9)},
};

} // namespace

class tst_ShortcutSessions : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void keepsWhatAPlainModelKeeps_data();
    void keepsWhatAPlainModelKeeps();

private:
    using Mirror = ShortcutsMirror;

    void runSession(quint32 seed);
    void begin();
    void restart();
    void step();
    void stepHidden();
    void stepHost();
    void stepAssisted();
    void takeKeyAway();
    void solveClash();
    void takeBack();
    void typeFilter();
    void clickSomeRow();
    void clickSomeButton();
    void pressSomeKey();
    void waitForTheEnd();
    void leave();
    void closeWindow();
    /// Says what the step does, for the message of a failure.
    void describe(const QString &text) { m_log.append(text); }
    /// Does something that must bring the messages and nothing else.
    void expect(const Mirror::Messages &messages, const std::function<void()> &act,
                Mirror::Answer answer = Mirror::Answer::Cancel);
    void activate();
    void compare();
    void compareWidgets();
    void compareSaved() const;
    /// The lines of clashes that others can be freed of.
    QVector<ClashLine *> lines() const;

    int random(int bound) { return std::uniform_int_distribution<int>(0, bound - 1)(m_random); }
    QModelIndex indexOf(int action) const;
    QPushButton *button(QDialogButtonBox::StandardButton which) const
    {
        return m_dialog->findChild<QDialogButtonBox *>(QStringLiteral("buttonBox"))->button(which);
    }
    template <typename Widget>
    Widget *child(const char *name) const
    {
        return m_dialog->findChild<Widget *>(QString::fromLatin1(name));
    }
    QKeySequenceEdit *field() const { return child<QKeySequenceEdit>("keyWidget"); }
    QString settingsPath() const { return path(QStringLiteral("keys.ini")); }

    std::mt19937 m_random;
    bool m_hasAssistance = false;
    QStringList m_log;
    QElapsedTimer m_sinceFirstChord;
    Mirror m_mirror;
    std::vector<std::unique_ptr<QAction>> m_actions;
    std::unique_ptr<QSettings> m_settings;
    std::unique_ptr<ShortcutsModel> m_model;
    std::unique_ptr<EditShortcutsDialog> m_dialog;
    std::unique_ptr<DialogHand> m_hand;
};

void tst_ShortcutSessions::begin()
{
    QFile::remove(settingsPath());
    m_log.clear();
    m_mirror = Mirror();
    for (const auto &row : actionRows)
        m_mirror.add(QString::fromLatin1(row.group), QString::fromLatin1(row.name),
                     QStringLiteral("Text of %1").arg(QLatin1String(row.name)), row.defaultKey);
    m_mirror.addGlobal(QKeySequence(Qt::META | Qt::Key_F3), QStringLiteral("VELWM_RUN"));
    m_mirror.addGlobal(QKeySequence(Qt::META | Qt::Key_F4), QStringLiteral("VELWM_SHOW_ICON"));
    restart();
}

void tst_ShortcutSessions::restart()
{
    describe(QStringLiteral("restart"));
    m_hand.reset();
    m_dialog.reset();
    m_model.reset();
    m_actions.clear();
    m_settings.reset(new QSettings(settingsPath(), QSettings::IniFormat));
    m_model.reset(new ShortcutsModel(m_settings.get(), QStringLiteral("Shortcuts")));
    for (const auto &row : actionRows) {
        m_actions.push_back(
            std::make_unique<QAction>(QStringLiteral("Text &of %1").arg(QLatin1String(row.name))));
        m_actions.back()->setShortcut(row.defaultKey);
        m_model->registerAction(QString::fromLatin1(row.name), m_actions.back().get(),
                                QString::fromLatin1(row.group));
    }
    m_dialog.reset(new EditShortcutsDialog(m_model.get()));
    m_dialog->setAssistance(m_hasAssistance);
    m_hand.reset(new DialogHand(m_dialog.get()));
    m_mirror.hasAssistance = m_hasAssistance;
    m_mirror.restart();
}

// Rows are sorted as the table of actions is.
QModelIndex tst_ShortcutSessions::indexOf(int action) const
{
    const QString group = m_mirror.actions[std::size_t(action)].group;
    int groupRow = 0;
    while (m_model->index(groupRow, 0).data().toString() != group)
        ++groupRow;
    int row = 0;
    for (int i = 0; i < action; ++i) {
        if (m_mirror.actions[std::size_t(i)].group == group && m_mirror.rowOf(i) == i)
            ++row;
    }
    return m_model->index(row, 0, m_model->index(groupRow, 0));
}

// What a window manager does when a window appears, or a message over it goes.
void tst_ShortcutSessions::activate()
{
    if (!m_dialog->isVisible())
        return;
    m_dialog->activateWindow();
    QApplication::setActiveWindow(m_dialog.get());
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
}

void tst_ShortcutSessions::expect(const Mirror::Messages &messages, const std::function<void()> &act,
                                  Mirror::Answer answer)
{
    ModalDriver modal;
    for (const Mirror::Told &told : messages) {
        if (told.kind == Mirror::Message::Question) {
            const auto press = answer == Mirror::Answer::Yes ? QMessageBox::Yes
                : answer == Mirror::Answer::No               ? QMessageBox::No
                                                             : QMessageBox::Cancel;
            modal.answer({QMessageBox::Warning, QStringLiteral("Apply changes"),
                          QStringLiteral("Some shortcuts have been changed. Do you want to apply changes?"),
                          QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel, QMessageBox::Cancel},
                         press);
            continue;
        }
        const QString text = told.kind == Mirror::Message::Global
            ? QStringLiteral("Shortcut '%1' is already used for global action '%2'.")
            : QStringLiteral("Shortcut '%1' is already used for action '%2'. Please try another.");
        modal.answer({QMessageBox::Critical, QStringLiteral("Shortcuts conflict"),
                      text.arg(told.key, told.holder), QMessageBox::Ok},
                     QMessageBox::Ok);
    }
    act();
    const bool isOver =
        QTest::qWaitFor([&] { return modal.finished() && !QApplication::activeModalWidget(); });
    QVERIFY2(isOver, "a message did not come");
    activate();
}

void tst_ShortcutSessions::clickSomeRow()
{
    const int action = random(int(m_actions.size()) + 1) - 1;
    QModelIndex index = m_model->index(random(m_model->rowCount()), 0);
    if (action >= 0)
        index = indexOf(m_mirror.rowOf(action));
    if (child<ShortcutsTreeView>("treeView")->isRowHidden(index.row(), index.parent())
        || (action >= 0 && !m_mirror.isSeen(action)))
        return;
    describe(QStringLiteral("click on row %1").arg(index.data().toString()));
    const int row = action < 0 ? -1 : m_mirror.rowOf(action);
    expect(m_mirror.clickRow(row), [&] { m_hand->clickRow(child<ShortcutsTreeView>("treeView"), index); });
}

void tst_ShortcutSessions::clickSomeButton()
{
    const struct
    {
        Mirror::Button button;
        QDialogButtonBox::StandardButton standard;
    } buttons[] = {{Mirror::Ok, QDialogButtonBox::Ok},
                   {Mirror::Reset, QDialogButtonBox::Reset},
                   {Mirror::RestoreDefaults, QDialogButtonBox::RestoreDefaults},
                   {Mirror::Cancel, QDialogButtonBox::Cancel}};
    const auto &pressed = buttons[random(4)];
    describe(QStringLiteral("click on ") + button(pressed.standard)->text());
    expect(m_mirror.click(pressed.button), [&] { m_hand->click(button(pressed.standard)); });
}

void tst_ShortcutSessions::pressSomeKey()
{
    if (!m_mirror.isFieldEnabled() && m_mirror.current >= 0) {
        describe(QStringLiteral("choose a key of one's own"));
        expect(m_mirror.clickCustom(), [&] { m_hand->clickNearStart(child<QRadioButton>("customKeyRB")); });
    }
    if (!m_mirror.isFieldEnabled())
        return;
    if (!field()->hasFocus())
        m_hand->clickNearStart(field());
    QVERIFY(field()->hasFocus());
    if (random(10) == 0) {
        describe(QStringLiteral("press keys that are none"));
        m_hand->press(random(2) ? Qt::Key_CapsLock : Qt::Key_Control);
        return;
    }
    if (!m_mirror.isRecording() || m_mirror.isHeld())
        m_sinceFirstChord.start();
    const int chord = chords[random(int(std::size(chords)))];
    describe(QStringLiteral("press ") + QKeySequence(chord).toString());
    const bool isFull = m_mirror.isNextTheLast();
    expect(m_mirror.press(chord), [&] {
        m_hand->press(chord);
        // Whether the field ends by itself depends on which keys it got.
        if (isFull)
            m_hand->press(Qt::Key_Tab);
    });
}

void tst_ShortcutSessions::waitForTheEnd()
{
    describe(QStringLiteral("wait until the recording ends"));
    const bool wasRecording = m_mirror.isRecording();
    expect(m_mirror.pause(), [&] {
        if (wasRecording)
            QTest::qWait(1200);
    });
}

void tst_ShortcutSessions::leave()
{
    if (random(20) == 0) {
        waitForTheEnd();
    } else if (random(2)) {
        describe(QStringLiteral("press Tab"));
        if (field()->hasFocus())
            expect(m_mirror.pause(), [&] { m_hand->press(Qt::Key_Tab); });
    } else if (m_mirror.current >= 0) {
        describe(QStringLiteral("choose the default key"));
        expect(m_mirror.clickDefault(), [&] { m_hand->clickNearStart(child<QRadioButton>("defaultKeyRB")); });
    }
}

void tst_ShortcutSessions::takeKeyAway()
{
    describe(QStringLiteral("choose none"));
    expect(m_mirror.clickNone(), [&] { m_hand->click(child<QPushButton>("noneButton")); });
}

QVector<ClashLine *> tst_ShortcutSessions::lines() const
{
    QVector<ClashLine *> lines;
    const auto all = child<QScrollArea>("clashBox")->findChildren<ClashLine *>();
    for (ClashLine *line : all) {
        if (line->isVisible() && line->content().canTakeOver)
            lines.append(line);
    }
    return lines;
}

void tst_ShortcutSessions::solveClash()
{
    describe(QStringLiteral("look who has ") + m_mirror.shownKey().toString());
    const auto areHoldersTold = [this] {
        QStringList told;
        for (const ClashLine *line : lines())
            told.append(line->content().otherName);
        QStringList holders = m_mirror.holders();
        std::sort(told.begin(), told.end());
        std::sort(holders.begin(), holders.end());
        return told == holders;
    };
    QVERIFY(QTest::qWaitFor(areHoldersTold, 1000));
    if (m_mirror.holders().isEmpty())
        return;
    const ClashLine *line = lines().at(random(lines().size()));
    const QString name = line->content().otherName;
    QPushButton *pressed = line->buttons().at(random(2));
    describe(QStringLiteral("%1: %2").arg(pressed->text(), name));
    const bool isGoTo = pressed == line->buttons().constFirst();
    child<QScrollArea>("clashBox")->ensureWidgetVisible(pressed);
    expect(isGoTo ? m_mirror.goTo(name) : m_mirror.takeOver(name), [&] { m_hand->click(pressed); });
}

void tst_ShortcutSessions::takeBack()
{
    clickSomeRow();
    if (m_mirror.current < 0 || !child<ShortcutsTreeView>("treeView")->hasFocus())
        return;
    describe(QStringLiteral("take back"));
    expect(m_mirror.takeBack(), [&] { m_hand->press(Qt::Key_Backspace); });
}

void tst_ShortcutSessions::typeFilter()
{
    const char *const texts[] = {"", "", "file", "edit", "view", "cut", "text", "zzz"};
    const QString text = QString::fromLatin1(texts[random(int(std::size(texts)))]);
    describe(QStringLiteral("filter \"%1\"").arg(text));
    // The tree chooses a group when it gets the focus while nothing is current.
    if (m_mirror.current < 0 && child<ShortcutsTreeView>("treeView")->currentIndex().isValid())
        m_mirror.forgetLeftRow();
    expect(m_mirror.setFilter(text), [&] {
        m_hand->clickNearStart(child<QLineEdit>("filterEdit"));
        m_hand->press(VelTest::keyNumber(Qt::CTRL | Qt::Key_A));
        m_hand->press(Qt::Key_Delete);
        for (const QChar letter : text)
            m_hand->press(letter.toUpper().unicode());
    });
    QCOMPARE(child<QLineEdit>("filterEdit")->text(), text);
}

void tst_ShortcutSessions::stepAssisted()
{
    switch (random(4)) {
    case 0:
        if (m_mirror.current >= 0)
            takeKeyAway();
        break;
    case 1:
        if (m_mirror.current >= 0)
            solveClash();
        break;
    case 2:
        takeBack();
        break;
    default:
        typeFilter();
        break;
    }
}

void tst_ShortcutSessions::closeWindow()
{
    const auto answer = Mirror::Answer(random(3));
    describe(QStringLiteral("close, answer %1").arg(int(answer)));
    expect(
        m_mirror.close(answer), [&] { m_dialog->close(); }, answer);
}

void tst_ShortcutSessions::stepHost()
{
    switch (random(4)) {
    case 0:
        describe(QStringLiteral("reject()"));
        expect(m_mirror.reject(), [&] { m_dialog->reject(); });
        break;
    case 1:
        describe(QStringLiteral("done(Rejected)"));
        expect(m_mirror.done(false), [&] { m_dialog->done(QDialog::Rejected); });
        break;
    case 2:
        describe(QStringLiteral("accept()"));
        expect(m_mirror.done(true), [&] { m_dialog->accept(); });
        break;
    default:
        describe(QStringLiteral("hide()"));
        expect(m_mirror.hide(), [&] { m_dialog->hide(); });
        break;
    }
}

void tst_ShortcutSessions::stepHidden()
{
    if (random(3) == 0) {
        restart();
        return;
    }
    describe(QStringLiteral("show"));
    m_mirror.show();
    m_dialog->show();
    activate();
}

void tst_ShortcutSessions::step()
{
    // On a busy machine: the field will end the recording in the middle of what comes next.
    constexpr int MostOfARecording = 500;
    if (m_mirror.isRecording() && !m_mirror.isHeld() && m_sinceFirstChord.elapsed() > MostOfARecording)
        waitForTheEnd();
    if (random(12) == 0) {
        describe(QStringLiteral("save"));
        m_mirror.save();
        m_model->saveKeys(m_settings.get(), QStringLiteral("Shortcuts"));
        compareSaved();
        return;
    }
    if (!m_mirror.isVisible) {
        stepHidden();
        return;
    }
    if (m_hasAssistance && random(4) == 0) {
        stepAssisted();
        return;
    }
    const int choice = random(100);
    if (choice < 25)
        clickSomeRow();
    else if (choice < 65)
        pressSomeKey();
    else if (choice < 77)
        leave();
    else if (choice < 91)
        clickSomeButton();
    else if (choice < 96)
        closeWindow();
    else
        stepHost();
}

void tst_ShortcutSessions::compareSaved() const
{
    m_settings->sync();
    QSettings settings(settingsPath(), QSettings::IniFormat);
    settings.beginGroup(QStringLiteral("Shortcuts"));
    QCOMPARE(settings.childKeys().size(), int(m_mirror.saved.size()));
    for (const auto &entry : m_mirror.saved)
        QCOMPARE(settings.value(entry.first).toString(), entry.second);
}

void tst_ShortcutSessions::compareWidgets()
{
    QCOMPARE(m_dialog->isVisible(), m_mirror.isVisible);
    QCOMPARE(button(QDialogButtonBox::Ok)->isEnabled(), m_mirror.isOkEnabled());
    QCOMPARE(button(QDialogButtonBox::Reset)->isEnabled(), m_mirror.isOkEnabled());
    QCOMPARE(button(QDialogButtonBox::RestoreDefaults)->isEnabled(), m_mirror.canRestore);
    QCOMPARE(field()->isEnabled(), m_mirror.isFieldEnabled());
    const QModelIndex current = child<ShortcutsTreeView>("treeView")->currentIndex();
    QCOMPARE(m_model->isShortcutItem(current), m_mirror.current >= 0);
    if (m_mirror.current < 0)
        return;
    QCOMPARE(current, indexOf(m_mirror.current));
    QCOMPARE(child<QRadioButton>("defaultKeyRB")->isChecked(), m_mirror.isDefaultChosen);
}

void tst_ShortcutSessions::compare()
{
    for (std::size_t i = 0; i < m_actions.size(); ++i) {
        const Mirror::Action &action = m_mirror.actions[i];
        const QByteArray name = action.name.toLatin1() + ": ";
        const QKeySequence inForce = m_actions[i]->shortcut();
        QVERIFY2(inForce == action.inForce, name + inForce.toString().toUtf8() + " is in force");
        if (m_mirror.rowOf(int(i)) != int(i))
            continue;
        const QKeySequence pending = m_model->keySequence(indexOf(int(i)));
        QVERIFY2(pending == action.pending, name + pending.toString().toUtf8() + " is pending");
    }
    compareWidgets();
}

void tst_ShortcutSessions::runSession(quint32 seed)
{
    m_random.seed(seed);
    begin();
    for (int i = 0; i < Steps && !QTest::currentTestFailed(); ++i) {
        step();
        if (!QTest::currentTestFailed())
            compare();
    }
    if (!QTest::currentTestFailed())
        compareSaved();
    if (QTest::currentTestFailed())
        qInfo("failed in the session of seed %u: %s", seed, qPrintable(m_log.join(QStringLiteral(", "))));
    m_hand.reset();
    m_dialog.reset();
    m_model.reset();
    m_settings.reset();
}

void tst_ShortcutSessions::keepsWhatAPlainModelKeeps_data()
{
    QTest::addColumn<bool>("hasAssistance");
    QTest::newRow("plain") << false;
    QTest::newRow("with assistance") << true;
}

void tst_ShortcutSessions::keepsWhatAPlainModelKeeps()
{
    QFETCH(bool, hasAssistance);
    m_hasAssistance = hasAssistance;
    const int rounds = qEnvironmentVariableIntValue("VEL_TEST_ROUNDS") > 0
        ? qEnvironmentVariableIntValue("VEL_TEST_ROUNDS")
        : 50;
    const quint32 seed = qEnvironmentVariableIsSet("VEL_TEST_SEED")
        ? quint32(qEnvironmentVariableIntValue("VEL_TEST_SEED"))
        : std::random_device()() & 0x3fffffff;
    qInfo("seed %u, %d sessions", seed, rounds);
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(folder()));
    write(QStringLiteral("keyshortcutrc"), "[ShortCutKeys]\nMeta|F3=VELWM_RUN\nMeta|F4=VELWM_SHOW_ICON\n");
    for (int i = 0; i < rounds && !QTest::currentTestFailed(); ++i)
        runSession(seed + quint32(i));
    qunsetenv("VEL_CONFIG_HOME");
    // The clear button of the filter fades; the animation goes a moment after the button.
    constexpr int LongerThanAFade = 300;
    QTest::qWait(LongerThanAFade);
}

VEL_TEST_MAIN(tst_ShortcutSessions)

#include "tst_ShortcutSessions.moc"
