// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"
#include "XDoTool.h"

#include <desktopentry/choosers/ChoiceDialog.h>
#include <desktopentry/choosers/ChoiceSource.h>
#include <desktopentry/choosers/DesktopChooser.h>
#include <desktopentry/choosers/MimeTypeChooser.h>
#include <desktopentry/choosers/ProgramChooser.h>

#include <QAbstractItemView>
#include <QAccessible>
#include <QLabel>
#include <QSettings>
#include <QSignalSpy>
#include <QTreeView>

#include <private/qguiapplication_p.h>
#include <qpa/qplatformaccessibility.h>
#include <qpa/qplatformintegration.h>

using namespace FormDriving;
using namespace VelUI;

namespace {

constexpr int Patience = 20000;

QVector<Choice> animals()
{
    QVector<Choice> choices;
    for (const char *name : {"Ant", "Bee", "Beetle", "Cat", "Dog"}) {
        Choice choice;
        choice.value = QString::fromLatin1(name).toLower();
        choice.texts = QStringList{QLatin1String(name), choice.value};
        choices.append(choice);
    }
    return choices;
}

ChoiceDialog::Texts texts()
{
    return {QStringLiteral("Choose animals"),
            {QStringLiteral("Animal"), QStringLiteral("Key")},
            QStringLiteral("AnimalChooser")};
}

// A dialog on the screen.
class OpenDialog
{
public:
    explicit OpenDialog(ChoiceModel::Kind kind, const QStringList &chosen = {})
        : dialog(kind, texts(), nullptr)
        , filterEdit(child<QLineEdit>(&dialog, "filterEdit"))
        , view(child<QTreeView>(&dialog, "choiceView"))
        , countLabel(child<QLabel>(&dialog, "countLabel"))
        , stateLabel(child<QLabel>(&dialog, "stateLabel"))
    {
        dialog.model()->add(animals());
        dialog.setChosen(chosen);
        dialog.show();
        isActive = QTest::qWaitForWindowActive(&dialog, Patience);
    }

    // The rows that are shown, a "*" behind what is checked.
    QString rows() const
    {
        QStringList rows;
        const QAbstractItemModel *model = view->model();
        for (int row = 0; row < model->rowCount(); ++row) {
            const QModelIndex index = model->index(row, 0);
            const bool isChecked = index.data(Qt::CheckStateRole).toInt() == Qt::Checked;
            rows.append(index.data().toString() + (isChecked ? QStringLiteral("*") : QString()));
        }
        return rows.join(QLatin1Char(' '));
    }

    // Where \a row shows \a column, from the corner of the window's list.
    QPoint place(int row, int column) const
    {
        return view->visualRect(view->model()->index(row, column)).center();
    }

    ChoiceDialog dialog;
    QLineEdit *const filterEdit;
    QTreeView *const view;
    QLabel *const countLabel;
    QLabel *const stateLabel;
    bool isActive = false;
};

// Gives one animal with each step.
class SlowSource : public ChoiceSource
{
public:
    explicit SlowSource(int *steps)
        : m_steps(steps)
    {
    }
    bool read(ChoiceModel *model) override
    {
        model->add({animals().at(*m_steps)});
        return ++*m_steps < animals().size();
    }

private:
    int *const m_steps;
};

// Hears what a screen reader hears of boxes and alerts.
class Listener
{
public:
    Listener()
        : m_former(QAccessible::installUpdateHandler(hear))
    {
        platform()->setActive(true);
        heard().clear();
    }
    ~Listener()
    {
        QAccessible::installUpdateHandler(m_former);
        platform()->setActive(false);
    }

    static QStringList &heard()
    {
        static QStringList heard;
        return heard;
    }

private:
    static QPlatformAccessibility *platform()
    {
        return QGuiApplicationPrivate::platformIntegration()->accessibility();
    }
    static void hear(QAccessibleEvent *event)
    {
        QAccessibleInterface *const who = event->accessibleInterface();
        const QString name = who->text(QAccessible::Name);
        if (event->type() == QAccessible::Alert)
            heard().append(name);
        else if (event->type() == QAccessible::StateChanged
                 && static_cast<QAccessibleStateChangeEvent *>(event)->changedStates().checked)
            heard().append(
                name + (who->state().checked ? QStringLiteral(" checked") : QStringLiteral(" not checked")));
    }

    const QAccessible::UpdateHandler m_former;
};

} // namespace

/// Keyboard and mouse in the dialog of the choosers.
class tst_ChoiceDialog : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void choosesByTheKeyboardAlone();
    void choosesByTheMouse();
    void checksOnceWithADoubleClick();
    void filtersWhatIsTypedIntoTheList();
    void leavesTheListUpward();
    void clearsTheFilterBeforeItCloses();
    void takesOneByTypingAndReturn();
    void takesOneByADoubleClick();
    void offersNoneWhereNothingMatches();
    void readsWhileTheUserWorks();
    void speaksItsParts();
    void speaksWhatChanges();
    void remembersItsSize();
    void choosesAMimeTypeByItsSuffix();
    void marksTheDesktopOfTheSession();
    void choosesAProgram();
    void survivesItsParent();
};

void tst_ChoiceDialog::choosesByTheKeyboardAlone()
{
    OpenDialog open(ChoiceModel::Kind::Several, {QStringLiteral("dog"), QStringLiteral("unicorn")});
    QVERIFY(open.isActive);
    QCOMPARE(open.rows(), QStringLiteral("Dog* Ant Bee Beetle Cat"));
    QTRY_VERIFY_WITH_TIMEOUT(open.filterEdit->hasFocus(), Patience);
    XDoTool::run(QStringLiteral("key b e e"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Bee Beetle"), Patience);
    XDoTool::run(QStringLiteral("key Down Down space"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Bee Beetle*"), Patience);
    QCOMPARE(open.countLabel->text(), QStringLiteral("3 chosen"));
    XDoTool::run(QStringLiteral("key Return"));
    QTRY_COMPARE_WITH_TIMEOUT(open.dialog.isVisible(), false, Patience);
    QCOMPARE(open.dialog.result(), int(QDialog::Accepted));
    QCOMPARE(open.dialog.chosen(),
             (QStringList{QStringLiteral("dog"), QStringLiteral("unicorn"), QStringLiteral("beetle")}));
}

void tst_ChoiceDialog::choosesByTheMouse()
{
    OpenDialog open(ChoiceModel::Kind::Several, {QStringLiteral("dog")});
    QVERIFY(open.isActive);
    XDoTool::click(open.view->viewport(), open.place(1, 1));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Dog* Ant* Bee Beetle Cat"), Patience);
    // The box itself.
    const QRect first = open.view->visualRect(open.view->model()->index(0, 0));
    XDoTool::click(open.view->viewport(), {first.left() + 10, first.center().y()});
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Dog Ant* Bee Beetle Cat"), Patience);
    XDoTool::click(okButton(&open.dialog));
    QTRY_COMPARE_WITH_TIMEOUT(open.dialog.isVisible(), false, Patience);
    QCOMPARE(open.dialog.chosen(), QStringList(QStringLiteral("ant")));
}

void tst_ChoiceDialog::checksOnceWithADoubleClick()
{
    OpenDialog open(ChoiceModel::Kind::Several);
    QVERIFY(open.isActive);
    QSignalSpy changed(open.dialog.model(), &ChoiceModel::chosenChanged);
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.1 click --repeat 2 --delay 40 1")
                     .arg(XDoTool::at(open.view->viewport(), open.place(0, 0))));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Ant* Bee Beetle Cat Dog"), Patience);
    // One after it counts again.
    XDoTool::click(open.view->viewport(), open.place(1, 0));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Ant* Bee* Beetle Cat Dog"), Patience);
    QCOMPARE(changed.count(), 2);
}

void tst_ChoiceDialog::filtersWhatIsTypedIntoTheList()
{
    OpenDialog open(ChoiceModel::Kind::Several);
    QVERIFY(open.isActive);
    XDoTool::run(QStringLiteral("key Down"));
    QTRY_VERIFY_WITH_TIMEOUT(open.view->hasFocus(), Patience);
    QCOMPARE(open.view->currentIndex().data().toString(), QStringLiteral("Ant"));
    XDoTool::run(QStringLiteral("key c a"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Cat"), Patience);
    QVERIFY(open.filterEdit->hasFocus());
    XDoTool::run(QStringLiteral("key Down space BackSpace BackSpace"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Ant Bee Beetle Cat* Dog"), Patience);
}

void tst_ChoiceDialog::leavesTheListUpward()
{
    OpenDialog open(ChoiceModel::Kind::Several);
    QVERIFY(open.isActive);
    XDoTool::run(QStringLiteral("key Down Down Up"));
    QTRY_VERIFY_WITH_TIMEOUT(open.view->hasFocus() && open.view->currentIndex().row() == 0, Patience);
    XDoTool::run(QStringLiteral("key Up"));
    QTRY_VERIFY_WITH_TIMEOUT(open.filterEdit->hasFocus(), Patience);
}

void tst_ChoiceDialog::clearsTheFilterBeforeItCloses()
{
    OpenDialog open(ChoiceModel::Kind::Several);
    QVERIFY(open.isActive);
    XDoTool::run(QStringLiteral("key d Return space"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Dog*"), Patience);
    XDoTool::run(QStringLiteral("key Up Escape"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Ant Bee Beetle Cat Dog*"), Patience);
    QVERIFY(open.dialog.isVisible());
    XDoTool::run(QStringLiteral("key Escape"));
    QTRY_COMPARE_WITH_TIMEOUT(open.dialog.isVisible(), false, Patience);
    QCOMPARE(open.dialog.result(), int(QDialog::Rejected));
}

void tst_ChoiceDialog::takesOneByTypingAndReturn()
{
    OpenDialog open(ChoiceModel::Kind::One);
    QVERIFY(open.isActive);
    QVERIFY(!open.countLabel->isVisible());
    XDoTool::run(QStringLiteral("key b e e t Return"));
    QTRY_COMPARE_WITH_TIMEOUT(open.dialog.isVisible(), false, Patience);
    QCOMPARE(open.dialog.result(), int(QDialog::Accepted));
    QCOMPARE(open.dialog.chosen(), QStringList(QStringLiteral("beetle")));
}

void tst_ChoiceDialog::takesOneByADoubleClick()
{
    OpenDialog open(ChoiceModel::Kind::One);
    QVERIFY(open.isActive);
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.1 click --repeat 2 --delay 40 1")
                     .arg(XDoTool::at(open.view->viewport(), open.place(3, 1))));
    QTRY_COMPARE_WITH_TIMEOUT(open.dialog.isVisible(), false, Patience);
    QCOMPARE(open.dialog.chosen(), QStringList(QStringLiteral("cat")));
}

void tst_ChoiceDialog::offersNoneWhereNothingMatches()
{
    OpenDialog open(ChoiceModel::Kind::One);
    QVERIFY(open.isActive);
    QCOMPARE(open.stateLabel->text(), QString());
    open.filterEdit->setText(QStringLiteral("zebra"));
    QCOMPARE(open.stateLabel->text(), QStringLiteral("No match"));
    QVERIFY(!okButton(&open.dialog)->isEnabled());
    QCOMPARE(open.dialog.chosen(), QStringList());
    open.filterEdit->clear();
    QVERIFY(okButton(&open.dialog)->isEnabled());
    QCOMPARE(open.dialog.chosen(), QStringList(QStringLiteral("ant")));
}

void tst_ChoiceDialog::readsWhileTheUserWorks()
{
    int steps = 0;
    ChoiceDialog dialog(ChoiceModel::Kind::Several, texts(), nullptr);
    dialog.setChosen({QStringLiteral("dog")});
    dialog.read(std::make_unique<SlowSource>(&steps));
    QCOMPARE(steps, 0);
    QCOMPARE(child<QLabel>(&dialog, "stateLabel")->text(), QStringLiteral("Reading..."));
    // Between two steps the window hears of what came meanwhile.
    child<QLineEdit>(&dialog, "filterEdit")->setText(QStringLiteral("e"));
    QTRY_COMPARE_WITH_TIMEOUT(child<QLabel>(&dialog, "stateLabel")->text(), QString(), Patience);
    QCOMPARE(steps, 5);
    QCOMPARE(child<QTreeView>(&dialog, "choiceView")->model()->rowCount(), 2);
    QCOMPARE(dialog.chosen(), QStringList(QStringLiteral("dog")));
}

void tst_ChoiceDialog::speaksItsParts()
{
    ChoiceDialog dialog(ChoiceModel::Kind::Several, texts(), nullptr);
    dialog.model()->add(animals());
    QCOMPARE(child<QLineEdit>(&dialog, "filterEdit")->accessibleName(), QStringLiteral("Filter"));
    auto *view = child<QTreeView>(&dialog, "choiceView");
    QCOMPARE(view->accessibleName(), QStringLiteral("Choose animals"));
    QVERIFY(view->model()->setData(view->model()->index(0, 0), Qt::Checked, Qt::CheckStateRole));
    QCOMPARE(view->accessibleDescription(), QStringLiteral("1 chosen"));
}

void tst_ChoiceDialog::speaksWhatChanges()
{
    OpenDialog open(ChoiceModel::Kind::Several);
    QVERIFY(open.isActive);
    const Listener listener;
    XDoTool::run(QStringLiteral("key d Down space"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QStringLiteral("Dog*"), Patience);
    XDoTool::run(QStringLiteral("key space q"));
    QTRY_COMPARE_WITH_TIMEOUT(open.rows(), QString(), Patience);
    QCOMPARE(Listener::heard(),
             (QStringList{QStringLiteral("Dog checked"), QStringLiteral("Dog not checked"),
                          QStringLiteral("No match")}));
}

void tst_ChoiceDialog::remembersItsSize()
{
    {
        ChoiceDialog dialog(ChoiceModel::Kind::Several, texts(), nullptr);
        QCOMPARE(dialog.size(), QSize(680, 460));
        dialog.resize(600, 350);
    }
    const ChoiceDialog dialog(ChoiceModel::Kind::Several, texts(), nullptr);
    QCOMPARE(dialog.size(), QSize(600, 350));
    QSettings().remove(QStringLiteral("AnimalChooser"));
}

void tst_ChoiceDialog::choosesAMimeTypeByItsSuffix()
{
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QVERIFY(QTest::qWaitForWindowActive(window, Patience));
        QCOMPARE(window->windowTitle(), QStringLiteral("Choose MIME types"));
        auto *view = child<QTreeView>(window, "choiceView");
        XDoTool::run(QStringLiteral("key period p n g"));
        QTRY_COMPARE_WITH_TIMEOUT(view->model()->index(0, 0).data().toString(), QStringLiteral("image/png"),
                                  Patience);
        QTRY_COMPARE_WITH_TIMEOUT(child<QLabel>(window, "stateLabel")->text(), QString(), Patience);
        XDoTool::run(QStringLiteral("key Down space Return"));
    });
    const auto chosen = MimeTypeChooser::choose(nullptr, {QStringLiteral("x/unheard")});
    QVERIFY(modal.finished());
    QVERIFY(chosen.has_value());
    QCOMPARE(*chosen, (QStringList{QStringLiteral("x/unheard"), QStringLiteral("image/png")}));
}

void tst_ChoiceDialog::marksTheDesktopOfTheSession()
{
    qputenv("XDG_CURRENT_DESKTOP", "Sway:LXQt");
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        auto *view = child<QTreeView>(window, "choiceView");
        QStringList rows;
        for (int row = 0; row < 4; ++row)
            rows.append(view->model()->index(row, 0).data().toString() + QLatin1Char(':')
                        + view->model()->index(row, 1).data().toString());
        QCOMPARE(rows,
                 (QStringList{QStringLiteral("Old:"), QStringLiteral("X-Mine:Not registered"),
                              QStringLiteral("LXQt:This session"), QStringLiteral("Sway:This session")}));
        click(okButton(window));
    });
    const QStringList current{QStringLiteral("X-Mine"), QStringLiteral("Old")};
    const auto chosen = DesktopChooser::choose(nullptr, QStringLiteral("Only show in"), current);
    qunsetenv("XDG_CURRENT_DESKTOP");
    QVERIFY(modal.finished());
    QVERIFY(chosen.has_value());
    QCOMPARE(*chosen, current);
}

void tst_ChoiceDialog::choosesAProgram()
{
    QVERIFY(QFile::setPermissions(write(QStringLiteral("my program"), "#!/bin/sh\n"),
                                  QFile::ReadOwner | QFile::ExeOwner));
    const QByteArray path = qgetenv("PATH");
    qputenv("PATH", path + ':' + QFile::encodeName(folder()));
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QVERIFY(QTest::qWaitForWindowActive(window, Patience));
        auto *view = child<QTreeView>(window, "choiceView");
        QTRY_COMPARE_WITH_TIMEOUT(child<QLabel>(window, "stateLabel")->text(), QString(), Patience);
        XDoTool::run(QStringLiteral("key m y space p r o g r a m"));
        QTRY_COMPARE_WITH_TIMEOUT(view->currentIndex().data().toString(), QStringLiteral("my program"),
                                  Patience);
        XDoTool::run(QStringLiteral("key Return"));
    });
    const QString chosen = ProgramChooser::choose(nullptr);
    qputenv("PATH", path);
    QVERIFY(modal.finished());
    QCOMPARE(chosen, QStringLiteral("my program"));
}

void tst_ChoiceDialog::survivesItsParent()
{
    auto *parent = new QWidget;
    ModalDriver modal;
    modal.handle([parent](QWidget *) { delete parent; });
    QVERIFY(!MimeTypeChooser::choose(parent, {QStringLiteral("text/plain")}));
    QVERIFY(modal.finished());
}

VEL_TEST_MAIN(tst_ChoiceDialog)

#include "tst_ChoiceDialog.moc"
