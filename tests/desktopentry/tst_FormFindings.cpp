// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDialogTestCase.h"
#include "FormDriving.h"
#include "XDoTool.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/FindingLine.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/KeyDescription.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>

#include <QAccessible>
#include <QDir>
#include <QFile>
#include <QLabel>
#include <QPushButton>
#include <QScrollArea>

#include <memory>

using namespace FormDriving;

namespace {

constexpr int Patience = 20000;

const QByteArray Good = "[Desktop Entry]\nType=Application\nName=Program\nExec=true\n";

// What is said about a key, line by line.
QStringList said(const QWidget *window, const char *key)
{
    QStringList sentences;
    for (const QLabel *label : window->findChildren<QLabel *>(QLatin1String("check_") + QLatin1String(key))) {
        if (label->isVisible())
            sentences.append(label->text());
    }
    return sentences;
}

VelUI::FindingLine *lineOf(const QWidget *window, const char *key)
{
    const auto *label = window->findChild<QLabel *>(QLatin1String("check_") + QLatin1String(key));
    return label ? qobject_cast<VelUI::FindingLine *>(label->parentWidget()) : nullptr;
}

QPushButton *fixButton(const QWidget *window, const char *key)
{
    const auto *line = lineOf(window, key);
    auto *button = line ? line->findChild<QPushButton *>(QStringLiteral("fixButton")) : nullptr;
    return button && button->isVisible() ? button : nullptr;
}

// The line of a field with a button.
QLineEdit *pathLine(const QWidget *window, const char *field)
{
    return child<QWidget>(window, field)->findChild<QLineEdit *>();
}

void typeText(const QString &text)
{
    const QStringList words = text.split(QLatin1Char(' '));
    for (int i = 0; i < words.size(); ++i) {
        if (i > 0)
            XDoTool::press(QStringLiteral("space"));
        if (!words.at(i).isEmpty())
            XDoTool::run(QStringLiteral("type --delay 5 -- %1").arg(words.at(i)));
    }
}

bool isInView(const QWidget *form, const QWidget *widget)
{
    const auto *area = form->findChild<QScrollArea *>(QStringLiteral("scrollArea"));
    const QRect place(widget->mapTo(area->viewport(), QPoint()), widget->size());
    return area->viewport()->rect().contains(place);
}

} // namespace

/// What the assisted entry editor says under its rows while the user types.
class tst_FormFindings : public EntryDialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void saysWhatIsWrongAsTheUserTypes();
    void saysNothingWithoutAssistance();
    void saysNothingAnyMoreWhenItIsSwitchedOff();
    void tellsOfAProgramThatIsNotThere();
    void putsAProgramWithABlankInQuotes();
    void saysSeveralThingsOfARowTogether();
    void showsHowBadItIsByAnIcon_data();
    void showsHowBadItIsByAnIcon();
    void describesTheFieldToThoseWhoDoNotSeeIt();
    void saysUnderTheActionsWhatAnActionIsAbout();
    void saysUnderTheLastRowWhatNoRowIsAbout();
    void goesToTheNextAndThePrevious();
    void keepsTheFieldInItsPlaceThatTheUserTypesIn();
    void looksAgainWhenTheUserComesBack();
    void staysWithTheFieldThatIsMeantAfterTheBox_data();
    void staysWithTheFieldThatIsMeantAfterTheBox();
    void offersNoRepairOfWhatIsReadOnly();
    void mendsAList();

private:
    std::unique_ptr<VelDesktopEntryEditDialog> edit(const QByteArray &bytes, bool assistance = true);
    QString makeProgram(const QString &name);
};

std::unique_ptr<VelDesktopEntryEditDialog> tst_FormFindings::edit(const QByteArray &bytes, bool assistance)
{
    auto dialog = std::make_unique<VelDesktopEntryEditDialog>();
    dialog->setAssistance(assistance);
    dialog->resize(700, 900);
    if (!dialog->setDesktopEntryPath(write(QStringLiteral("entry.desktop"), bytes)))
        return nullptr;
    dialog->show();
    dialog->activateWindow();
    return QTest::qWaitForWindowActive(dialog.get(), Patience) ? std::move(dialog) : nullptr;
}

QString tst_FormFindings::makeProgram(const QString &name)
{
    const QString program = write(name, "#!/bin/sh\n");
    QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    return program;
}

void tst_FormFindings::saysWhatIsWrongAsTheUserTypes()
{
    const auto dialog = edit(Good);
    QVERIFY(dialog);
    QVERIFY(said(dialog.get(), "Exec").isEmpty());
    QLineEdit *exec = pathLine(dialog.get(), "execEdit");
    XDoTool::click(exec);
    QTRY_VERIFY_WITH_TIMEOUT(exec->hasFocus(), Patience);
    XDoTool::press(QStringLiteral("End"));
    typeText(QStringLiteral(" 'a"));
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Exec"),
                              QStringList(QStringLiteral("''' has to stand in double quotes.")), Patience);
    XDoTool::run(QStringLiteral("key BackSpace key BackSpace"));
    QTRY_VERIFY_WITH_TIMEOUT(said(dialog.get(), "Exec").isEmpty(), Patience);
}

void tst_FormFindings::saysNothingWithoutAssistance()
{
    const auto dialog = edit(Good + "Icon=a.png\nCategories=Nonsense;\n", false);
    QVERIFY(dialog);
    QTest::keyClicks(pathLine(dialog.get(), "execEdit"), QStringLiteral(" 'a"));
    QCoreApplication::processEvents();
    QVERIFY(dialog->findChildren<VelUI::FindingLine *>().isEmpty());
}

void tst_FormFindings::saysNothingAnyMoreWhenItIsSwitchedOff()
{
    const auto dialog = edit(Good + "Icon=a.png\n");
    QVERIFY(dialog);
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Icon").size(), 1, Patience);
    auto *icon = child<VelUI::IconEdit>(dialog.get(), "iconEdit");
    QVERIFY(!icon->accessibleDescription().isEmpty());
    dialog->setAssistance(false);
    QTRY_VERIFY_WITH_TIMEOUT(dialog->findChildren<VelUI::FindingLine *>().isEmpty(), Patience);
    QVERIFY(icon->accessibleDescription().isEmpty());
}

void tst_FormFindings::tellsOfAProgramThatIsNotThere()
{
    const auto dialog = edit(Good);
    QVERIFY(dialog);
    QLineEdit *exec = pathLine(dialog.get(), "execEdit");
    XDoTool::click(exec);
    QTRY_VERIFY_WITH_TIMEOUT(exec->hasFocus(), Patience);
    XDoTool::press(QStringLiteral("End"));
    typeText(QStringLiteral("xyz"));
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Exec"),
                              QStringList(QStringLiteral("There is no program 'truexyz'.")), Patience);
}

void tst_FormFindings::putsAProgramWithABlankInQuotes()
{
    const QString program = makeProgram(QStringLiteral("My Program/run it"));
    const auto dialog = edit(Good);
    QVERIFY(dialog);
    QLineEdit *exec = pathLine(dialog.get(), "execEdit");
    XDoTool::click(exec);
    QTRY_VERIFY_WITH_TIMEOUT(exec->hasFocus(), Patience);
    XDoTool::press(QStringLiteral("ctrl+a"));
    typeText(program + QStringLiteral(" %f"));
    QTRY_COMPARE_WITH_TIMEOUT(
        said(dialog.get(), "Exec"),
        QStringList(QStringLiteral("The path of the program has a blank: it has to stand in quotes.")),
        Patience);
    QVERIFY(fixButton(dialog.get(), "Exec"));
    QCOMPARE(fixButton(dialog.get(), "Exec")->toolTip(), QStringLiteral("Put it in quotes"));
    XDoTool::click(fixButton(dialog.get(), "Exec"));
    const QString quoted = QLatin1Char('"') + program + QStringLiteral("\" %f");
    QTRY_COMPARE_WITH_TIMEOUT(exec->text(), quoted, Patience);
    QTRY_VERIFY_WITH_TIMEOUT(said(dialog.get(), "Exec").isEmpty(), Patience);
    QVERIFY(exec->hasFocus());
    XDoTool::click(okButton(dialog.get()));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog->isVisible(), Patience);
    QByteArray expected = Good;
    QCOMPARE(read(path(QStringLiteral("entry.desktop"))), expected.replace("true", quoted.toUtf8()));
}

void tst_FormFindings::saysSeveralThingsOfARowTogether()
{
    const auto dialog = edit("[Desktop Entry]\nType=Application\nName=Program\nExec=true %x %d %f %F\n");
    QVERIFY(dialog);
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Exec").size(), 3, Patience);
    // The worst first.
    QVERIFY(said(dialog.get(), "Exec").constLast().contains(QStringLiteral("'%d'")));
}

void tst_FormFindings::showsHowBadItIsByAnIcon_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("spoken");
    QTest::newRow("error") << QByteArray("Icon=a.png\n") << "Icon"
                           << "Error: The name of an icon has no suffix like '.png'.";
    QTest::newRow("warning") << QByteArray("Path=relative\n") << "Path"
                             << "Warning: The path of a folder begins with '/'.";
    QTest::newRow("hint") << QByteArray("Comment=program\n") << "Comment"
                          << "Hint: The comment says no more than the name.";
}

void tst_FormFindings::showsHowBadItIsByAnIcon()
{
    QFETCH(QByteArray, keys);
    QFETCH(QString, key);
    QFETCH(QString, spoken);
    const auto dialog = edit(Good + keys);
    QVERIFY(dialog);
    const QByteArray name = key.toLatin1();
    QTRY_VERIFY_WITH_TIMEOUT(lineOf(dialog.get(), name.constData()), Patience);
    const VelUI::FindingLine *line = lineOf(dialog.get(), name.constData());
    QCOMPARE(line->spoken(), spoken);
    QCOMPARE(line->accessibleName(), spoken);
    const QLabel *icon = line->findChildren<QLabel *>().constFirst();
    QVERIFY(icon->pixmap(Qt::ReturnByValue).width() > 0);
    QCOMPARE(icon->accessibleName(), spoken.section(QLatin1Char(':'), 0, 0));
}

void tst_FormFindings::describesTheFieldToThoseWhoDoNotSeeIt()
{
    const auto dialog = edit(Good + "Icon=a.png\n");
    QVERIFY(dialog);
    QLineEdit *icon = child<VelUI::IconEdit>(dialog.get(), "iconEdit")->findChild<QLineEdit *>();
    const QString description = KeyDescription::of(QStringLiteral("Icon"))
        + QStringLiteral(" Error: The name of an icon has no suffix like '.png'.");
    QTRY_COMPARE_WITH_TIMEOUT(icon->accessibleDescription(), description, Patience);
    QAccessibleInterface *face = QAccessible::queryAccessibleInterface(icon);
    QVERIFY(face);
    QCOMPARE(face->text(QAccessible::Description), description);
    XDoTool::click(fixButton(dialog.get(), "Icon"));
    QTRY_COMPARE_WITH_TIMEOUT(icon->text(), QStringLiteral("a"), Patience);
    QTRY_VERIFY_WITH_TIMEOUT(!icon->accessibleDescription().contains(QStringLiteral("suffix")), Patience);
}

void tst_FormFindings::saysUnderTheActionsWhatAnActionIsAbout()
{
    const auto dialog = edit(Good + "Actions=new;\n\n[Desktop Action new]\nName=New\nExec=true %x\n");
    QVERIFY(dialog);
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Actions"),
                              QStringList(QStringLiteral("new: There is no field code '%x'.")), Patience);
    auto *actions = child<QLineEdit>(dialog.get(), "actionListShow");
    QVERIFY(actions->accessibleDescription().contains(QStringLiteral("'%x'")));
    XDoTool::click(fixButton(dialog.get(), "Actions"));
    QTRY_VERIFY_WITH_TIMEOUT(said(dialog.get(), "Actions").isEmpty(), Patience);
    XDoTool::click(okButton(dialog.get()));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog->isVisible(), Patience);
    QCOMPARE(read(path(QStringLiteral("entry.desktop"))),
             Good + "Actions=new;\n\n[Desktop Action new]\nName=New\nExec=true %%x\n");
}

void tst_FormFindings::saysUnderTheLastRowWhatNoRowIsAbout()
{
    const auto dialog = edit(Good + "DBusActivatable=true\nURL=x\n[Own]\n");
    QVERIFY(dialog);
    QTRY_COMPARE_WITH_TIMEOUT(
        said(dialog.get(), "File"),
        QStringList(QStringLiteral("There is no group 'Own'; one of your own has to begin with 'X-'.")),
        Patience);
    QCOMPARE(said(dialog.get(), "DBusActivatable").size(), 1);
    QVERIFY(
        said(dialog.get(), "DBusActivatable").constFirst().startsWith(QStringLiteral("DBusActivatable: ")));
    QCOMPARE(said(dialog.get(), "URL").size(), 1);
}

void tst_FormFindings::goesToTheNextAndThePrevious()
{
    const auto dialog = edit(Good + "Icon=a.png\nCategories=Nonsense;\nVersion=9\n");
    QVERIFY(dialog);
    dialog->resize(560, 300);
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Version").size(), 1, Patience);
    QWidget *icon = child<VelUI::IconEdit>(dialog.get(), "iconEdit")->findChild<QLineEdit *>();
    QWidget *categories =
        child<VelUI::StringListEdit>(dialog.get(), "categoriesEdit")->findChild<QLineEdit *>();
    QWidget *version = line(dialog.get(), "versionEdit");
    QTRY_VERIFY_WITH_TIMEOUT(line(dialog.get(), "nameEdit")->hasFocus(), Patience);
    for (QWidget *next : {icon, categories, version, icon}) {
        XDoTool::press(QStringLiteral("F8"));
        QTRY_VERIFY_WITH_TIMEOUT(next->hasFocus(), Patience);
        QTRY_VERIFY_WITH_TIMEOUT(isInView(dialog.get(), next), Patience);
    }
    QTRY_VERIFY_WITH_TIMEOUT(isInView(dialog.get(), lineOf(dialog.get(), "Icon")), Patience);
    for (QWidget *previous : {version, categories}) {
        XDoTool::press(QStringLiteral("shift+F8"));
        QTRY_VERIFY_WITH_TIMEOUT(previous->hasFocus(), Patience);
    }
    QTRY_VERIFY_WITH_TIMEOUT(isInView(dialog.get(), lineOf(dialog.get(), "Categories")), Patience);
}

void tst_FormFindings::keepsTheFieldInItsPlaceThatTheUserTypesIn()
{
    const auto dialog = edit(Good + "Icon=a.png\n");
    QVERIFY(dialog);
    dialog->resize(560, 300);
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Icon").size(), 1, Patience);
    QLineEdit *version = line(dialog.get(), "versionEdit");
    version->setFocus();
    QTRY_VERIFY_WITH_TIMEOUT(isInView(dialog.get(), version), Patience);
    const QPoint place = version->mapTo(dialog.get(), QPoint());
    pathLine(dialog.get(), "execEdit")->setText(QStringLiteral("true 'a' %x"));
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Exec").size(), 2, Patience);
    QCOMPARE(version->mapTo(dialog.get(), QPoint()), place);
    pathLine(dialog.get(), "execEdit")->setText(QStringLiteral("true"));
    QTRY_VERIFY_WITH_TIMEOUT(said(dialog.get(), "Exec").isEmpty(), Patience);
    QVERIFY(isInView(dialog.get(), version));
}

void tst_FormFindings::looksAgainWhenTheUserComesBack()
{
    const auto dialog = edit("[Desktop Entry]\nType=Application\nName=Program\nExec="
                             + path(QStringLiteral("run")).toUtf8() + '\n');
    QVERIFY(dialog);
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Exec").size(), 1, Patience);
    makeProgram(QStringLiteral("run"));
    QTest::qWait(5500); // answers are taken for good so long
    Q_EMIT qApp->applicationStateChanged(Qt::ApplicationActive);
    QTRY_VERIFY_WITH_TIMEOUT(said(dialog.get(), "Exec").isEmpty(), Patience);
}

void tst_FormFindings::staysWithTheFieldThatIsMeantAfterTheBox_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("field");
    const QByteArray start = "[Desktop Entry]\nType=Application\n";
    QTest::newRow("program") << start + "Name=a\nExec=/no/such/program\n"
                             << "can't find executable"
                             << "execEdit";
    QTest::newRow("no command") << start + "Name=a\n"
                                << "no executable"
                                << "execEdit";
    QTest::newRow("open quote") << start + "Name=a\nExec=true \"\n"
                                << "wrong/incomplete desktop entry"
                                << "execEdit";
    QTest::newRow("try exec") << start + "Name=a\nExec=true\nTryExec=nosuchprogram\n"
                              << "can't find try executable"
                              << "tryExecEdit";
    QTest::newRow("name") << start + "Exec=true\n"
                          << "wrong/incomplete desktop entry"
                          << "nameEdit";
    QTest::newRow("address") << QByteArray("[Desktop Entry]\nType=Link\nName=a\nURL=/no/such/file\n")
                             << "can't find URL"
                             << "urlEdit";
    QTest::newRow("type") << QByteArray("[Desktop Entry]\nType=FSDevice\nName=a\n")
                          << "wrong/incomplete desktop entry"
                          << "typeComboBox";
}

void tst_FormFindings::staysWithTheFieldThatIsMeantAfterTheBox()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, text);
    QFETCH(QString, field);
    const auto dialog = edit(bytes);
    QVERIFY(dialog);
    dialog->resize(560, 300);
    line(dialog.get(), "versionEdit")->setFocus();
    ModalDriver modal;
    modal.answer(warning(text), QMessageBox::Ok);
    XDoTool::click(okButton(dialog.get()));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), Patience);
    QVERIFY(dialog->isVisible());
    QTRY_VERIFY_WITH_TIMEOUT(dialog->focusWidget(), Patience);
    const QWidget *meant = dialog->findChild<QWidget *>(field);
    QVERIFY(meant);
    QTRY_VERIFY_WITH_TIMEOUT(meant == dialog->focusWidget() || meant->isAncestorOf(dialog->focusWidget()),
                             Patience);
    QTRY_VERIFY_WITH_TIMEOUT(isInView(dialog.get(), meant), Patience);
}

void tst_FormFindings::offersNoRepairOfWhatIsReadOnly()
{
    const auto dialog = edit(Good + "Icon=a.png\n");
    QVERIFY(dialog);
    QTRY_VERIFY_WITH_TIMEOUT(fixButton(dialog.get(), "Icon"), Patience);
    child<VelDesktopEntryPropsWidget>(dialog.get(), "props")->setReadOnly(true);
    QTRY_VERIFY_WITH_TIMEOUT(!fixButton(dialog.get(), "Icon"), Patience);
    QCOMPARE(said(dialog.get(), "Icon").size(), 1);
}

void tst_FormFindings::mendsAList()
{
    const auto dialog = edit(Good + "Categories=game;Audio;\n");
    QVERIFY(dialog);
    QTRY_COMPARE_WITH_TIMEOUT(said(dialog.get(), "Categories").size(), 2, Patience);
    XDoTool::click(fixButton(dialog.get(), "Categories"));
    auto *categories = child<VelUI::StringListEdit>(dialog.get(), "categoriesEdit");
    QTRY_COMPARE_WITH_TIMEOUT(categories->strings().constFirst(), QStringLiteral("Game"), Patience);
    QTRY_VERIFY_WITH_TIMEOUT(
        said(dialog.get(), "Categories").constFirst().contains(QStringLiteral("AudioVideo")), Patience);
    XDoTool::click(fixButton(dialog.get(), "Categories"));
    QTRY_COMPARE_WITH_TIMEOUT(categories->strings().size(), 3, Patience);
    QVERIFY(dialog->isWindowModified());
    XDoTool::click(okButton(dialog.get()));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog->isVisible(), Patience);
    QCOMPARE(read(path(QStringLiteral("entry.desktop"))), Good + "Categories=Game;Audio;AudioVideo;\n");
}

VEL_TEST_MAIN(tst_FormFindings)

#include "tst_FormFindings.moc"
