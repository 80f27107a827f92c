// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "EntrySamples.h"
#include "FormDriving.h"
#include "TestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/ActionListEdit.h>
#include <desktopentry/FormLayout.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>
#include <frame/DesktopEntryRecord.h>

#include <KIconButton>

#include <QCheckBox>
#include <QComboBox>
#include <QListWidget>
#include <QPointer>
#include <QRadioButton>
#include <QScrollArea>
#include <QScrollBar>
#include <QSignalSpy>
#include <QToolButton>
#include <QTranslator>
#include <QWheelEvent>

using namespace FormDriving;
using namespace VelUI;

namespace {

const QString application = QStringLiteral("Application");
const QString link = QStringLiteral("Link");
const QString directory = QStringLiteral("Directory");

const ModalDriver::Box typeQuestion{
    QMessageBox::Question, QStringLiteral("Attention"),
    QStringLiteral("Desktop entry type was changed.\nSome field values may be lost...\nContinue?"),
    QMessageBox::Yes, QMessageBox::NoButton};

QComboBox *typeBox(const QWidget &form)
{
    return child<QComboBox>(&form, "typeComboBox");
}

// The labels of the rows that are shown, a "*" behind a bold one.
QStringList shownRows(const QWidget &form)
{
    auto *layout = form.findChild<FormLayout *>();
    QStringList rows;
    for (int row = 0; row < layout->rowCount(); ++row) {
        QLayoutItem *item = layout->itemAtPosition(row, 0);
        if (!item || item->widget()->isHidden())
            continue;
        if (auto *label = qobject_cast<QLabel *>(item->widget()))
            rows.append(label->text() + (label->font().bold() ? QStringLiteral("*") : QString()));
        else
            rows.append(qobject_cast<QAbstractButton *>(item->widget())->text());
    }
    return rows;
}

void chooseType(const QWidget &form, const QString &type)
{
    typeBox(form)->setCurrentIndex(typeBox(form)->findData(type));
}

QString spokenName(const QWidget *widget)
{
    if (!widget->accessibleName().isEmpty())
        return widget->accessibleName();
    const auto *button = qobject_cast<const QAbstractButton *>(widget);
    return button ? button->text() : QString();
}

// What Tab reaches from the first field on, until it leaves the form.
QStringList namesReachedByTab(QWidget *form)
{
    QStringList names;
    for (int i = 0; i < 80; ++i) {
        QWidget *focused = QApplication::focusWidget();
        if (!focused || !form->isAncestorOf(focused))
            break;
        names.append(spokenName(focused));
        QTest::keyClick(focused, Qt::Key_Tab);
    }
    return names;
}

// Every text twice as long.
class Doubler : public QTranslator
{
public:
    QString translate(const char *context, const char *source, const char *, int) const override
    {
        if (QLatin1String(context) != QLatin1String("VelDesktopEntryPropsWidgetPrivate"))
            return {};
        return QString::fromLatin1(source) + QLatin1Char(' ') + QString::fromLatin1(source);
    }
    bool isEmpty() const override { return false; }
};

} // namespace

class tst_VelDesktopEntryPropsWidget : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void startsAsAnEmptyApplication();
    void hasTheRowsInTheirOrder();
    void showsTheRowsOfTheType_data();
    void showsTheRowsOfTheType();
    void refusesATypeThatIsNotAllowed_data();
    void refusesATypeThatIsNotAllowed();
    void allowsAllTypesForAnEmptyList();
    void refillsTheTypesWithoutAsking();
    void loadsEveryKey();
    void savesEveryKey();
    void writesNothingForNull();
    void changesNothingInARecordThatItLoaded();
    void takesOnlyTheTypeOfAnInvalidRecord();
    void loadsARecordOfATypeThatIsNotAllowedAsTheCurrentOne();
    void asksBeforeTheTypeChanges();
    void takesClosingAndEscapingForYes_data();
    void takesClosingAndEscapingForYes();
    void restoresTheTypeOnAnyOtherAnswer();
    void survivesItsDeletionBehindTheQuestion();
    void emptiesTheRowsOfTheOldType();
    void keepsTheCommonRowsWhenTheTypeChanges();
    void savesNothingOfTheOldType();
    void ignoresTheWheelOverTheTypeWithoutFocus();
    void enablesTheListOfTheChosenButton();
    void choosesTheButtonByTheLists();
    void keepsBothListsWithoutASwitch();
    void emptiesTheOtherListAfterASwitch();
    void emptiesTheOtherListOfAnotherRecord();
    void namesTheListDialogs_data();
    void namesTheListDialogs();
    void namesTheActionDialogs();
    void asksForMimeTypesByExtension();
    void reportsAChangeInEveryField_data();
    void reportsAChangeInEveryField();
    void reportsAChosenIcon();
    void reportsLoadingByThePathFieldsOnly();
    void switchesToReadOnlyAndBack();
    void showsTheUrlButtonOnlyWhenAskedFor();
    void requestsInformationAboutTheUrl();
    void passesTheFrameStyleOn();
    void keepsOddValues_data();
    void keepsOddValues();
    void keepsAPastedLineFeed();
    void keepsOddActions();
    void reachesEveryRowByTab_data();
    void reachesEveryRowByTab();
    void scrollsToTheFocusedField_data();
    void scrollsToTheFocusedField();
    void staysWhereItIsUnderThePressedMouse();

private:
    VelUIDesktopEntry entry(const QByteArray &bytes, const QString &name = QStringLiteral("entry.desktop"));
    QByteArray saved(VelUIDesktopEntry &entry);
};

void tst_VelDesktopEntryPropsWidget::initTestCase()
{
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
}

void tst_VelDesktopEntryPropsWidget::init()
{
    TestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
}

void tst_VelDesktopEntryPropsWidget::cleanup()
{
    qputenv("LANG", "C.UTF-8");
    TestCase::cleanup();
}

VelUIDesktopEntry tst_VelDesktopEntryPropsWidget::entry(const QByteArray &bytes, const QString &name)
{
    VelUIDesktopEntry entry(write(name, bytes));
    if (!entry.load())
        qFatal("the sample does not load");
    return entry;
}

QByteArray tst_VelDesktopEntryPropsWidget::saved(VelUIDesktopEntry &entry)
{
    const QString target = path(QStringLiteral("saved.desktop"));
    entry.setFilePath(target);
    if (!entry.save())
        qFatal("the sample cannot be saved");
    return read(target);
}

void tst_VelDesktopEntryPropsWidget::startsAsAnEmptyApplication()
{
    VelDesktopEntryPropsWidget form;
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QStringList types;
    for (int i = 0; i < typeBox(form)->count(); ++i) {
        types.append(typeBox(form)->itemData(i, Qt::UserRole).toString());
        QCOMPARE(typeBox(form)->itemText(i), types.constLast());
        QVERIFY(!typeBox(form)->itemIcon(i).isNull());
    }
    QCOMPARE(types, QStringList({application, link, directory}));
    for (const QLineEdit *line : form.findChildren<QLineEdit *>())
        QCOMPARE(line->text(), QString());
    for (const QCheckBox *box : form.findChildren<QCheckBox *>())
        QVERIFY(!box->isChecked());
    QVERIFY(child<QRadioButton>(&form, "onlyShowInButton")->isChecked());
    QVERIFY(!child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
    QVERIFY(form.findChild<QScrollArea *>());
}

void tst_VelDesktopEntryPropsWidget::hasTheRowsInTheirOrder()
{
    VelDesktopEntryPropsWidget form;
    auto *layout = form.findChild<FormLayout *>();
    QStringList rows;
    for (int row = 0; row < layout->rowCount(); ++row) {
        if (!layout->itemAtPosition(row, 0))
            continue;
        QWidget *left = layout->itemAtPosition(row, 0)->widget();
        auto *label = qobject_cast<QLabel *>(left);
        QLayoutItem *right = layout->itemAtPosition(row, 1);
        const QObject *field = right->widget() ? static_cast<QObject *>(right->widget()) : right->layout();
        rows.append((label ? label->text() : qobject_cast<QAbstractButton *>(left)->text()) + QLatin1Char(' ')
                    + QString::fromLatin1(field->metaObject()->className()));
        if (label && label->font().weight() == 75)
            rows.last().append(QLatin1Char('*'));
    }
    const QStringList expected{
        QStringLiteral("Type: QComboBox"),
        QStringLiteral("Name: QLineEdit*"),
        QStringLiteral("Name [de]: QLineEdit"),
        QStringLiteral("Icon: VelUI::IconEdit"),
        QStringLiteral("Icon [de]: VelUI::IconEdit"),
        QStringLiteral("Exec: VelUI::PathEdit*"),
        QStringLiteral("Terminal QCheckBox"),
        QStringLiteral("Path: QLineEdit"),
        QStringLiteral("Try exec: VelUI::PathEdit"),
        QStringLiteral("Url: QHBoxLayout*"),
        QStringLiteral("Generic name: QLineEdit"),
        QStringLiteral("Generic name [de]: QLineEdit"),
        QStringLiteral("Comment: QLineEdit"),
        QStringLiteral("Comment [de]: QLineEdit"),
        QStringLiteral("No display QCheckBox"),
        QStringLiteral("Hidden QCheckBox"),
        QStringLiteral("Only show in VelUI::StringListEdit"),
        QStringLiteral("Not show in VelUI::StringListEdit"),
        QStringLiteral("MIME type: VelUI::StringListEdit"),
        QStringLiteral("Categories: VelUI::StringListEdit"),
        QStringLiteral("Keywords: VelUI::StringListEdit"),
        QStringLiteral("Keywords [de]: VelUI::StringListEdit"),
        QStringLiteral("Startup notify QCheckBox"),
        QStringLiteral("Startup WM class: QLineEdit"),
        QStringLiteral("Actions: VelUI::ActionListEdit"),
        QStringLiteral("Version: QLineEdit"),
    };
    QCOMPARE(rows, expected);
}

void tst_VelDesktopEntryPropsWidget::showsTheRowsOfTheType_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QStringList>("allowed");
    QTest::addColumn<bool>("typeRow");
    QTest::newRow("application") << application << QStringList() << true;
    QTest::newRow("link") << link << QStringList() << true;
    QTest::newRow("directory") << directory << QStringList() << true;
    QTest::newRow("application alone") << application << QStringList{application} << true;
    QTest::newRow("link alone") << link << QStringList{link} << true;
    QTest::newRow("directory alone") << directory << QStringList{directory} << false;
    QTest::newRow("one of two") << directory << QStringList{directory, link} << true;
}

void tst_VelDesktopEntryPropsWidget::showsTheRowsOfTheType()
{
    QFETCH(QString, type);
    QFETCH(QStringList, allowed);
    QFETCH(bool, typeRow);
    VelDesktopEntryPropsWidget form;
    form.setType(type, allowed);
    QCOMPARE(typeBox(form)->currentData().toString(), type);
    QCOMPARE(typeBox(form)->count(), allowed.isEmpty() ? 3 : allowed.size());

    const QStringList rows = shownRows(form);
    QCOMPARE(rows.contains(QStringLiteral("Type:")), typeRow);
    for (const char *row : {"Exec:*", "Terminal", "Path:", "Try exec:", "MIME type:", "Categories:",
                            "Keywords:", "Keywords [de]:", "Startup notify", "Startup WM class:", "Actions:"})
        QCOMPARE(rows.contains(QLatin1String(row)), type == application);
    QCOMPARE(rows.contains(QStringLiteral("Url:*")), type == link);
    for (const char *row :
         {"Name:*", "Name [de]:", "Icon:", "Icon [de]:", "Generic name:", "Generic name [de]:", "Comment:",
          "Comment [de]:", "No display", "Hidden", "Only show in", "Not show in", "Version:"})
        QVERIFY2(rows.contains(QLatin1String(row)), row);
    QCOMPARE(child<StringListEdit>(&form, "keywordsEdit")->isHidden(), type != application);
    QCOMPARE(child<QLineEdit>(&form, "urlEdit")->isHidden(), type != link);
}

void tst_VelDesktopEntryPropsWidget::refusesATypeThatIsNotAllowed_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QStringList>("allowed");
    QTest::newRow("empty") << QString() << QStringList{link};
    QTest::newRow("not in the list") << directory << QStringList{application, link};
    QTest::newRow("other case") << QStringLiteral("link") << QStringList{application, link};
    QTest::newRow("unknown") << QStringLiteral("Service") << QStringList();
}

void tst_VelDesktopEntryPropsWidget::refusesATypeThatIsNotAllowed()
{
    QFETCH(QString, type);
    QFETCH(QStringList, allowed);
    VelDesktopEntryPropsWidget form;
    form.setType(type, allowed);
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QCOMPARE(typeBox(form)->count(), 3);
    QVERIFY(shownRows(form).contains(QStringLiteral("Exec:*")));
}

void tst_VelDesktopEntryPropsWidget::allowsAllTypesForAnEmptyList()
{
    VelDesktopEntryPropsWidget form;
    form.setType(link, {link});
    QCOMPARE(typeBox(form)->count(), 1);
    form.setType(link, {});
    QCOMPARE(typeBox(form)->count(), 3);
    QCOMPARE(typeBox(form)->currentData().toString(), link);
}

void tst_VelDesktopEntryPropsWidget::refillsTheTypesWithoutAsking()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    form.setType(link, {directory, link});
    form.setType(directory, {});
    form.setType(application, {application});
    QVERIFY(modal.finished());
    QCOMPARE(changed.count(), 0);
}

void tst_VelDesktopEntryPropsWidget::loadsEveryKey()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    const auto line = [&form](const char *name) {
        auto *widget = child<QWidget>(&form, name);
        auto *self = qobject_cast<QLineEdit *>(widget);
        return (self ? self : widget->findChild<QLineEdit *>())->text();
    };
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QCOMPARE(line("nameEdit"), QStringLiteral("Full"));
    QCOMPARE(line("localNameEdit"), QStringLiteral("Voll"));
    QCOMPARE(line("iconEdit"), QStringLiteral("folder"));
    QCOMPARE(line("localIconEdit"), QStringLiteral("folder-de"));
    QCOMPARE(line("execEdit"), QStringLiteral("/bin/sh -c true %u"));
    QVERIFY(child<QCheckBox>(&form, "terminalCheckBox")->isChecked());
    QCOMPARE(line("pathEdit"), QStringLiteral("/tmp"));
    QCOMPARE(line("tryExecEdit"), QStringLiteral("/bin/sh"));
    QCOMPARE(line("genericNameEdit"), QStringLiteral("Generic"));
    QCOMPARE(line("localGenericNameEdit"), QStringLiteral("Allgemein"));
    QCOMPARE(line("commentEdit"), QStringLiteral("Does all"));
    QCOMPARE(line("localCommentEdit"), QStringLiteral("Macht alles"));
    QVERIFY(!child<QCheckBox>(&form, "noDisplayCheckBox")->isChecked());
    QVERIFY(!child<QCheckBox>(&form, "hiddenCheckBox")->isChecked());
    QCOMPARE(line("onlyShowInEdit"), QStringLiteral("VEL;Other;"));
    QCOMPARE(line("notShowInEdit"), QString());
    QCOMPARE(line("mimeTypeEdit"), QStringLiteral("text/plain;image/png;"));
    QCOMPARE(line("categoriesEdit"), QStringLiteral("Utility;Qt;"));
    QCOMPARE(line("keywordsEdit"), QStringLiteral("one;two;"));
    QCOMPARE(line("localKeywordsEdit"), QStringLiteral("eins;zwei;"));
    QVERIFY(child<QCheckBox>(&form, "startupNotifyCheckBox")->isChecked());
    QCOMPARE(line("startupWMClassEdit"), QStringLiteral("Full"));
    QCOMPARE(line("actionsEdit"), QStringLiteral("new;quit;"));
    QCOMPARE(line("versionEdit"), QStringLiteral("1.5"));

    form.loadFrom(entry(EntrySamples::link()));
    QCOMPARE(typeBox(form)->currentData().toString(), link);
    QCOMPARE(line("urlEdit"), QStringLiteral("https://www.freedesktop.org"));
    QCOMPARE(line("execEdit"), QString());
}

void tst_VelDesktopEntryPropsWidget::savesEveryKey()
{
    VelDesktopEntryPropsWidget form;
    const VelUIDesktopEntry full = entry(EntrySamples::fullApplication());
    form.loadFrom(full);
    VelUIDesktopEntry copy;
    form.saveTo(&copy);
    QCOMPARE(copy.getType(), application);
    QCOMPARE(copy.getName(), full.getName());
    QCOMPARE(copy.getLocalName(), full.getLocalName());
    QCOMPARE(copy.getIcon(), full.getIcon());
    QCOMPARE(copy.getLocalIcon(), full.getLocalIcon());
    QCOMPARE(copy.getExec(), full.getExec());
    QCOMPARE(copy.getTerminal(), true);
    QCOMPARE(copy.getPath(), full.getPath());
    QCOMPARE(copy.getTryExec(), full.getTryExec());
    QCOMPARE(copy.getGenericName(), full.getGenericName());
    QCOMPARE(copy.getLocalGenericName(), full.getLocalGenericName());
    QCOMPARE(copy.getComment(), full.getComment());
    QCOMPARE(copy.getLocalComment(), full.getLocalComment());
    QCOMPARE(copy.getOnlyShowIn(), full.getOnlyShowIn());
    QCOMPARE(copy.getMimeType(), full.getMimeType());
    QCOMPARE(copy.getCategories(), full.getCategories());
    QCOMPARE(copy.getKeywords(), full.getKeywords());
    QCOMPARE(copy.getLocalKeywords(), full.getLocalKeywords());
    QCOMPARE(copy.getStartupNotify(), true);
    QCOMPARE(copy.getStartupWMClass(), full.getStartupWMClass());
    QCOMPARE(ActionSamples::ids(copy.getActions()), ActionSamples::ids(full.getActions()));
    QCOMPARE(copy.getVersion(), full.getVersion());

    child<QCheckBox>(&form, "noDisplayCheckBox")->click();
    child<QCheckBox>(&form, "hiddenCheckBox")->click();
    form.saveTo(&copy);
    QVERIFY(copy.getNoDisplay() && copy.getHidden());

    form.loadFrom(entry(EntrySamples::link()));
    VelUIDesktopEntry page;
    form.saveTo(&page);
    QCOMPARE(page.getType(), link);
    QCOMPARE(page.getURL(), QStringLiteral("https://www.freedesktop.org"));
}

void tst_VelDesktopEntryPropsWidget::writesNothingForNull()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::link()));
    form.saveTo(nullptr);
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Page"));
}

void tst_VelDesktopEntryPropsWidget::changesNothingInARecordThatItLoaded()
{
    for (const QByteArray &bytes :
         {EntrySamples::fullApplication(), EntrySamples::link(), EntrySamples::directory()}) {
        VelDesktopEntryPropsWidget form;
        VelUIDesktopEntry record = entry(bytes);
        form.loadFrom(record);
        form.saveTo(&record);
        QVERIFY(record.save());
        QCOMPARE(read(path(QStringLiteral("entry.desktop"))), bytes);
    }
}

void tst_VelDesktopEntryPropsWidget::takesOnlyTheTypeOfAnInvalidRecord()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    VelUIDesktopEntry invalid;
    invalid.setType(directory);
    invalid.setName(QStringLiteral("ignored"));
    QVERIFY(!invalid.isValid());
    form.loadFrom(invalid);
    QCOMPARE(typeBox(form)->currentData().toString(), directory);
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Full"));
}

void tst_VelDesktopEntryPropsWidget::loadsARecordOfATypeThatIsNotAllowedAsTheCurrentOne()
{
    VelDesktopEntryPropsWidget form;
    form.setType(directory, {directory});
    form.loadFrom(entry(EntrySamples::link()));
    QCOMPARE(typeBox(form)->currentData().toString(), directory);
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Page"));
    QCOMPARE(child<QLineEdit>(&form, "urlEdit")->text(), QString());
}

void tst_VelDesktopEntryPropsWidget::asksBeforeTheTypeChanges()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    // The new type is in place when the change is told.
    VelUIDesktopEntry toldRecord;
    connect(&form, &VelDesktopEntryPropsWidget::changed, &form,
            [&form, &toldRecord] { form.saveTo(&toldRecord); });
    ModalDriver modal;
    modal.answerWith(typeQuestion, [&form](QMessageBox *box) {
        QCOMPARE(box->parentWidget(), &form);
        QCOMPARE(box->buttons().size(), 1);
        QVERIFY(shownRows(form).contains(QStringLiteral("Exec:*")));
        box->button(QMessageBox::Yes)->click();
    });
    typeBox(form)->setFocus();
    QTest::keyClick(typeBox(form), Qt::Key_Down);
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), link);
    QVERIFY(shownRows(form).contains(QStringLiteral("Url:*")));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(toldRecord.getType(), link);
}

void tst_VelDesktopEntryPropsWidget::takesClosingAndEscapingForYes_data()
{
    QTest::addColumn<bool>("escape");
    QTest::newRow("escape") << true;
    QTest::newRow("close") << false;
}

void tst_VelDesktopEntryPropsWidget::takesClosingAndEscapingForYes()
{
    QFETCH(bool, escape);
    VelDesktopEntryPropsWidget form;
    ModalDriver modal;
    modal.answerWith(typeQuestion, [escape](QMessageBox *box) {
        if (escape)
            QTest::keyClick(box, Qt::Key_Escape);
        else
            box->close();
    });
    chooseType(form, directory);
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), directory);
    QVERIFY(!shownRows(form).contains(QStringLiteral("Exec:*")));
}

void tst_VelDesktopEntryPropsWidget::restoresTheTypeOnAnyOtherAnswer()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    modal.answerWith(typeQuestion, [](QMessageBox *box) { box->done(QMessageBox::No); });
    chooseType(form, directory);
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QCOMPARE(child<PathEdit>(&form, "execEdit")->text(), QStringLiteral("/bin/sh -c true %u"));
    QCOMPARE(changed.count(), 0);
}

void tst_VelDesktopEntryPropsWidget::survivesItsDeletionBehindTheQuestion()
{
    auto *form = new VelDesktopEntryPropsWidget;
    const QPointer<QWidget> alive(form);
    const QPointer<QComboBox> box(typeBox(*form));
    ModalDriver modal;
    modal.answerWith(typeQuestion, [form](QMessageBox *) { delete form; });
    chooseType(*form, directory);
    QVERIFY(modal.finished());
    QVERIFY(!alive);
    QTRY_VERIFY(!box);
}

void tst_VelDesktopEntryPropsWidget::emptiesTheRowsOfTheOldType()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    form.setType(directory, {});
    form.setType(application, {});
    for (const char *name : {"execEdit", "tryExecEdit"})
        QCOMPARE(child<PathEdit>(&form, name)->text(), QString());
    for (const char *name : {"pathEdit", "startupWMClassEdit"})
        QCOMPARE(child<QLineEdit>(&form, name)->text(), QString());
    for (const char *name : {"terminalCheckBox", "startupNotifyCheckBox"})
        QVERIFY(!child<QCheckBox>(&form, name)->isChecked());
    for (const char *name : {"mimeTypeEdit", "categoriesEdit", "keywordsEdit", "localKeywordsEdit"})
        QCOMPARE(child<StringListEdit>(&form, name)->strings(), QStringList());
    QVERIFY(child<ActionListEdit>(&form, "actionsEdit")->actions().isEmpty());

    form.loadFrom(entry(EntrySamples::link()));
    form.setType(application, {});
    form.setType(link, {});
    QCOMPARE(child<QLineEdit>(&form, "urlEdit")->text(), QString());
}

void tst_VelDesktopEntryPropsWidget::keepsTheCommonRowsWhenTheTypeChanges()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    form.setType(directory, {});
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Full"));
    QCOMPARE(child<QLineEdit>(&form, "localCommentEdit")->text(), QStringLiteral("Macht alles"));
    QCOMPARE(child<IconEdit>(&form, "iconEdit")->icon(), QStringLiteral("folder"));
    QCOMPARE(child<StringListEdit>(&form, "onlyShowInEdit")->strings().size(), 2);
    QCOMPARE(child<QLineEdit>(&form, "versionEdit")->text(), QStringLiteral("1.5"));
}

void tst_VelDesktopEntryPropsWidget::savesNothingOfTheOldType()
{
    VelDesktopEntryPropsWidget form;
    VelUIDesktopEntry record = entry(EntrySamples::fullApplication());
    form.loadFrom(record);
    ModalDriver modal;
    modal.answer(typeQuestion, QMessageBox::Yes);
    chooseType(form, directory);
    QVERIFY(modal.finished());
    form.saveTo(&record);
    QVERIFY(record.save());
    const QByteArray bytes = read(path(QStringLiteral("entry.desktop")));
    QVERIFY(bytes.contains("Type=Directory\n"));
    for (const char *key : {"Exec", "TryExec", "Path", "Terminal", "MimeType", "Categories", "Keywords",
                            "StartupNotify", "StartupWMClass", "Actions", "[Desktop Action"})
        QVERIFY2(!bytes.contains(QByteArray("\n") + key), key);
    QVERIFY(bytes.contains("X-Vendor-Key=keep me\n"));
    QVERIFY(bytes.contains("[X-Group]\nKey=Value\n"));
    QVERIFY(bytes.contains("Name[fr]=Plein\n"));
}

void tst_VelDesktopEntryPropsWidget::ignoresTheWheelOverTheTypeWithoutFocus()
{
    VelDesktopEntryPropsWidget form;
    form.resize(400, 200);
    form.show();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    child<QLineEdit>(&form, "nameEdit")->setFocus();
    ModalDriver modal;
    const QPointF at(5, 5);
    QWheelEvent event(at, typeBox(form)->mapToGlobal(at.toPoint()), QPoint(), QPoint(0, -120), Qt::NoButton,
                      Qt::NoModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(typeBox(form), &event);
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    // What the box ignores goes on to the form, which scrolls.
    QVERIFY(!event.isAccepted());
}

void tst_VelDesktopEntryPropsWidget::enablesTheListOfTheChosenButton()
{
    VelDesktopEntryPropsWidget form;
    auto *only = child<StringListEdit>(&form, "onlyShowInEdit");
    auto *no = child<StringListEdit>(&form, "notShowInEdit");
    child<QRadioButton>(&form, "notShowInButton")->click();
    QVERIFY(!only->isEnabled() && no->isEnabled());
    QVERIFY(!child<QRadioButton>(&form, "onlyShowInButton")->isChecked());
    child<QRadioButton>(&form, "onlyShowInButton")->click();
    QVERIFY(only->isEnabled() && !no->isEnabled());
}

void tst_VelDesktopEntryPropsWidget::choosesTheButtonByTheLists()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry("[Desktop Entry]\nType=Directory\nName=a\nNotShowIn=X;\n"));
    QVERIFY(child<QRadioButton>(&form, "notShowInButton")->isChecked());
    QVERIFY(child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
    form.loadFrom(entry("[Desktop Entry]\nType=Directory\nName=a\n"));
    QVERIFY(child<QRadioButton>(&form, "onlyShowInButton")->isChecked());
    QVERIFY(!child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
}

void tst_VelDesktopEntryPropsWidget::keepsBothListsWithoutASwitch()
{
    const QByteArray bytes = "[Desktop Entry]\nType=Directory\nName=a\nOnlyShowIn=X;\nNotShowIn=Y;\n";
    VelUIDesktopEntry record = entry(bytes);
    VelDesktopEntryPropsWidget form;
    form.loadFrom(record);
    child<QLineEdit>(&form, "nameEdit")->setText(QStringLiteral("b"));
    form.saveTo(&record);
    QVERIFY(record.save());
    QCOMPARE(read(path(QStringLiteral("entry.desktop"))), QByteArray(bytes).replace("Name=a", "Name=b"));
}

void tst_VelDesktopEntryPropsWidget::emptiesTheOtherListAfterASwitch()
{
    VelUIDesktopEntry record =
        entry("[Desktop Entry]\nType=Directory\nName=a\nOnlyShowIn=X;\nNotShowIn=Y;\n");
    VelDesktopEntryPropsWidget form;
    form.loadFrom(record);
    child<QRadioButton>(&form, "onlyShowInButton")->click();
    form.saveTo(&record);
    QCOMPARE(record.getOnlyShowIn(), QStringList({QStringLiteral("X")}));
    QCOMPARE(record.getNotShowIn(), QStringList());
    child<QRadioButton>(&form, "notShowInButton")->click();
    form.saveTo(&record);
    QCOMPARE(record.getOnlyShowIn(), QStringList());
    QCOMPARE(record.getNotShowIn(), QStringList({QStringLiteral("Y")}));
}

void tst_VelDesktopEntryPropsWidget::emptiesTheOtherListOfAnotherRecord()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry("[Desktop Entry]\nType=Directory\nName=a\nNotShowIn=Y;\n"));
    VelUIDesktopEntry target =
        entry("[Desktop Entry]\nType=Directory\nName=b\nOnlyShowIn=X;\n", QStringLiteral("b"));
    form.saveTo(&target);
    QCOMPARE(target.getNotShowIn(), QStringList({QStringLiteral("Y")}));
    QCOMPARE(target.getOnlyShowIn(), QStringList());
}

void tst_VelDesktopEntryPropsWidget::namesTheListDialogs_data()
{
    QTest::addColumn<QString>("field");
    QTest::addColumn<QStringList>("texts");
    const auto row = [](const char *field, std::initializer_list<const char *> texts) {
        QStringList list;
        for (const char *text : texts)
            list.append(QString::fromLatin1(text));
        QTest::newRow(field) << QString::fromLatin1(field) << list;
    };
    row("onlyShowInEdit",
        {"Only show in", "Only show in", "Add desktop environment:", "Only show in",
         "Edit desktop environment:"});
    row("notShowInEdit",
        {"Not show in", "Not show in", "Add desktop environment:", "Not show in",
         "Edit desktop environment:"});
    row("mimeTypeEdit",
        {"MIME type", "Add MIME type", "MIME type or file name extension:", "Edit MIME type",
         "MIME type or file name extension:"});
    row("categoriesEdit", {"Categories", "Add category", "Category:", "Edit category", "Category:"});
    row("keywordsEdit", {"Keywords", "Add keyword", "Keyword:", "Edit keyword", "Keyword:"});
    row("localKeywordsEdit", {"Keywords", "Add keyword", "Keyword:", "Edit keyword", "Keyword:"});
}

void tst_VelDesktopEntryPropsWidget::namesTheListDialogs()
{
    QFETCH(QString, field);
    QFETCH(QStringList, texts);
    VelDesktopEntryPropsWidget form;
    auto *list = form.findChild<StringListEdit *>(field);
    list->setStrings({QStringLiteral("a/b")});
    QString title;
    Prompt add;
    Prompt edit;
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        title = window->windowTitle();
        answerPrompt(modal, QString(), &add);
        click(child<QPushButton>(window, "addButton"));
        window->findChild<QListWidget *>()->setCurrentRow(0);
        answerPrompt(modal, QString(), &edit);
        click(child<QPushButton>(window, "editButton"));
        window->close();
    });
    list->editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(QStringList({title, add.title, add.label, edit.title, edit.label}), texts);
    QCOMPARE(edit.text, QStringLiteral("a/b"));
}

void tst_VelDesktopEntryPropsWidget::namesTheActionDialogs()
{
    VelDesktopEntryPropsWidget form;
    auto *list = child<ActionListEdit>(&form, "actionsEdit");
    list->setActions(ActionSamples::actions({"a"}));
    QStringList titles;
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        titles.append(window->windowTitle());
        const auto note = [&titles](QWidget *inner) {
            titles.append(inner->windowTitle());
            inner->close();
        };
        modal.handle(note);
        click(child<QPushButton>(window, "addButton"));
        window->findChild<QListWidget *>()->setCurrentRow(0);
        modal.handle(note);
        click(child<QPushButton>(window, "editButton"));
        window->close();
    });
    list->editActions();
    QVERIFY(modal.finished());
    QCOMPARE(titles,
             QStringList(
                 {QStringLiteral("Actions"), QStringLiteral("Add action"), QStringLiteral("Edit action")}));
}

void tst_VelDesktopEntryPropsWidget::asksForMimeTypesByExtension()
{
    VelDesktopEntryPropsWidget form;
    ModalDriver modal;
    modal.handle([&modal](QWidget *window) {
        answerPrompt(modal, QStringLiteral("png"));
        click(child<QPushButton>(window, "addButton"));
        answerPrompt(modal, QStringLiteral("x-odd/type"));
        click(child<QPushButton>(window, "addButton"));
        click(okButton(window));
    });
    child<StringListEdit>(&form, "mimeTypeEdit")->editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(child<StringListEdit>(&form, "mimeTypeEdit")->strings(),
             QStringList({QStringLiteral("image/png"), QStringLiteral("x-odd/type")}));
}

void tst_VelDesktopEntryPropsWidget::reportsAChangeInEveryField_data()
{
    QTest::addColumn<QString>("field");
    QTest::addColumn<QString>("type");
    for (const char *name :
         {"nameEdit",           "localNameEdit",        "iconEdit",          "localIconEdit",
          "execEdit",           "terminalCheckBox",     "pathEdit",          "tryExecEdit",
          "genericNameEdit",    "localGenericNameEdit", "commentEdit",       "localCommentEdit",
          "noDisplayCheckBox",  "hiddenCheckBox",       "onlyShowInEdit",    "mimeTypeEdit",
          "categoriesEdit",     "keywordsEdit",         "localKeywordsEdit", "startupNotifyCheckBox",
          "startupWMClassEdit", "actionsEdit",          "versionEdit"})
        QTest::newRow(name) << QString::fromLatin1(name) << application;
    QTest::newRow("urlEdit") << QStringLiteral("urlEdit") << link;
}

void tst_VelDesktopEntryPropsWidget::reportsAChangeInEveryField()
{
    QFETCH(QString, field);
    QFETCH(QString, type);
    VelDesktopEntryPropsWidget form;
    form.setType(type, {});
    auto *widget = form.findChild<QWidget *>(field);
    QVERIFY(widget);
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    if (auto *box = qobject_cast<QCheckBox *>(widget)) {
        QTest::keyClick(box, Qt::Key_Space);
    } else if (auto *list = qobject_cast<StringListEdit *>(widget)) {
        modal.handle([&modal](QWidget *window) {
            answerPrompt(modal, QStringLiteral("a/b"));
            click(child<QPushButton>(window, "addButton"));
            click(okButton(window));
        });
        list->editStrings();
    } else if (auto *actions = qobject_cast<ActionListEdit *>(widget)) {
        actions->setActions(ActionSamples::actions({"a"}));
        modal.handle([](QWidget *window) {
            window->findChild<QListWidget *>()->setCurrentRow(0);
            click(child<QPushButton>(window, "deleteButton"));
            click(okButton(window));
        });
        actions->editActions();
    } else {
        auto *line = qobject_cast<QLineEdit *>(widget);
        QTest::keyClicks(line ? line : widget->findChild<QLineEdit *>(), QStringLiteral("x"));
    }
    QVERIFY(modal.finished());
    QVERIFY(changed.count() > 0);
}

void tst_VelDesktopEntryPropsWidget::reportsAChosenIcon()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    Q_EMIT child<IconEdit>(&form, "iconEdit")
        ->findChild<KIconButton *>()
        ->iconChanged(QStringLiteral("folder"));
    QCOMPARE(changed.count(), 1);
}

void tst_VelDesktopEntryPropsWidget::reportsLoadingByThePathFieldsOnly()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nComment=b\nIcon=c\nKeywords=d;\n"));
    QCOMPARE(changed.count(), 0);
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nExec=true\n"));
    QVERIFY(changed.count() > 0);
}

void tst_VelDesktopEntryPropsWidget::switchesToReadOnlyAndBack()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    form.show();
    for (const bool on : {true, false}) {
        form.setReadOnly(on);
        form.setReadOnly(on);
        QCOMPARE(typeBox(form)->isEnabled(), !on);
        for (const QLineEdit *line : form.findChildren<QLineEdit *>()) {
            const bool display = line->objectName().endsWith(QLatin1String("ListShow"));
            QCOMPARE(line->isReadOnly(), on || display);
        }
        for (const QCheckBox *box : form.findChildren<QCheckBox *>())
            QCOMPARE(box->isEnabled(), !on);
        for (const QRadioButton *button : form.findChildren<QRadioButton *>())
            QCOMPARE(button->isEnabled(), !on);
        for (const KIconButton *button : form.findChildren<KIconButton *>())
            QCOMPARE(button->isEnabled(), !on);
        for (const StringListEdit *list : form.findChildren<StringListEdit *>())
            QCOMPARE(list->findChild<QToolButton *>()->isVisible(), !on);
        for (const PathEdit *list : form.findChildren<PathEdit *>())
            QCOMPARE(list->findChild<QToolButton *>()->isVisible(), !on);
        QCOMPARE(child<QToolButton>(&form, "editActionsButton")->isVisible(), !on);
    }
    QVERIFY(!child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Full"));
}

void tst_VelDesktopEntryPropsWidget::showsTheUrlButtonOnlyWhenAskedFor()
{
    VelDesktopEntryPropsWidget form;
    form.show();
    auto *button = child<QToolButton>(&form, "urlInfoButton");
    QVERIFY(!button->isVisible());
    form.setType(link, {});
    QVERIFY(child<QLineEdit>(&form, "urlEdit")->isVisible());
    QVERIFY(!button->isVisible());
    form.setShowURLInfoButton(true);
    QVERIFY(button->isVisible());
    form.setShowURLInfoButton(true);
    QVERIFY(button->isVisible());
    form.setType(application, {});
    QVERIFY(!button->isVisible());
    form.setType(link, {});
    QVERIFY(button->isVisible());
    form.setShowURLInfoButton(false);
    QVERIFY(!button->isVisible());
}

void tst_VelDesktopEntryPropsWidget::requestsInformationAboutTheUrl()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::link()));
    form.setShowURLInfoButton(true);
    form.show();
    QSignalSpy requested(&form, &VelDesktopEntryPropsWidget::requestedURLInfo);
    click(child<QToolButton>(&form, "urlInfoButton"));
    QCOMPARE(requested.count(), 1);
    QCOMPARE(requested.first().first().toString(), QStringLiteral("https://www.freedesktop.org"));
}

void tst_VelDesktopEntryPropsWidget::passesTheFrameStyleOn()
{
    VelDesktopEntryPropsWidget form;
    form.setFrameStyle(QFrame::Box | QFrame::Plain);
    QCOMPARE(form.findChild<QScrollArea *>()->frameStyle(), QFrame::Box | QFrame::Plain);
}

void tst_VelDesktopEntryPropsWidget::keepsOddValues_data()
{
    QTest::addColumn<QString>("value");
    QTest::newRow("leading blanks") << QStringLiteral("  two");
    QTest::newRow("trailing blanks") << QStringLiteral("two  ");
    QTest::newRow("tab") << QStringLiteral("\ta\tb");
    QTest::newRow("semicolons") << QStringLiteral("a;b;;c\\;");
    QTest::newRow("backslashes") << QStringLiteral("\\n \\s \\\\ \\x");
    QTest::newRow("line feed") << QStringLiteral("one\ntwo\r\nthree");
    QTest::newRow("group") << QStringLiteral("a\n[Desktop Action x]\nExec=rm");
    QTest::newRow("other scripts") << QString::fromUtf8("Ж שלום 漢字 \xF0\x9F\x98\x80");
    QTest::newRow("long") << QString(40000, QLatin1Char('x'));
}

void tst_VelDesktopEntryPropsWidget::keepsOddValues()
{
    QFETCH(QString, value);
    VelDesktopEntryPropsWidget form;
    VelUIDesktopEntry record = entry(EntrySamples::fullApplication());
    form.loadFrom(record);
    const QStringList lines{QStringLiteral("nameEdit"), QStringLiteral("localNameEdit"),
                            QStringLiteral("localCommentEdit"), QStringLiteral("pathEdit")};
    for (const QString &name : lines)
        form.findChild<QLineEdit *>(name)->setText(value);
    child<PathEdit>(&form, "execEdit")->setText(value);
    child<StringListEdit>(&form, "localKeywordsEdit")->setStrings({value, QStringLiteral("b"), value});
    form.saveTo(&record);
    saved(record);

    VelUIDesktopEntry again(path(QStringLiteral("saved.desktop")));
    QVERIFY(again.load());
    VelDesktopEntryPropsWidget other;
    other.loadFrom(again);
    for (const QString &name : lines)
        QCOMPARE(other.findChild<QLineEdit *>(name)->text(), value);
    QCOMPARE(child<PathEdit>(&other, "execEdit")->text(), value);
    QCOMPARE(child<StringListEdit>(&other, "localKeywordsEdit")->strings(),
             QStringList({value, QStringLiteral("b"), value}));
    QCOMPARE(ActionSamples::ids(again.getActions()),
             QStringList({QStringLiteral("new"), QStringLiteral("quit")}));
}

void tst_VelDesktopEntryPropsWidget::keepsAPastedLineFeed()
{
    VelDesktopEntryPropsWidget form;
    child<QLineEdit>(&form, "nameEdit")->insert(QStringLiteral("a\nb"));
    VelUIDesktopEntry record;
    form.saveTo(&record);
    QCOMPARE(record.getName(), QStringLiteral("a\nb"));
    QVERIFY(saved(record).contains("Name=a\\nb\n"));
}

void tst_VelDesktopEntryPropsWidget::keepsOddActions()
{
    VelUIDesktopAction action(QStringLiteral("odd;id"));
    action.setName(QStringLiteral("  a;b\nc\\n"));
    action.setExec(QStringLiteral(" run \\ %u\t"));
    action.setOnlyShowIn({QStringLiteral("a;b"), QStringLiteral(" c")});
    VelDesktopEntryPropsWidget form;
    VelUIDesktopEntry record = entry(EntrySamples::fullApplication());
    form.loadFrom(record);
    child<ActionListEdit>(&form, "actionsEdit")->setActions({action});
    form.saveTo(&record);
    saved(record);

    VelUIDesktopEntry again(path(QStringLiteral("saved.desktop")));
    QVERIFY(again.load());
    form.loadFrom(again);
    const QList<VelUIDesktopAction> actions = child<ActionListEdit>(&form, "actionsEdit")->actions();
    QCOMPARE(actions.size(), 1);
    QCOMPARE(actions.constFirst().getId(), action.getId());
    QCOMPARE(actions.constFirst().getName(), action.getName());
    QCOMPARE(actions.constFirst().getExec(), action.getExec());
    QCOMPARE(actions.constFirst().getOnlyShowIn(), action.getOnlyShowIn());
}

void tst_VelDesktopEntryPropsWidget::reachesEveryRowByTab_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QString>("names");
    const QString head = QStringLiteral("Type|Name|Name [de]|Icon|Edit Icon|Icon [de]|Edit Icon [de]|");
    const QString middle =
        QStringLiteral("Generic name|Generic name [de]|Comment|Comment [de]|No display|Hidden|"
                       "Only show in|Only show in|Edit Only show in|Not show in|");
    QTest::newRow("application")
        << application
        << head + QStringLiteral("Exec|Edit Exec|Terminal|Path|Try exec|Edit Try exec|") + middle
            + QStringLiteral(
                "MIME type|Edit MIME type|Categories|Edit Categories|Keywords|Edit Keywords|"
                "Keywords [de]|Edit Keywords [de]|Startup notify|Startup WM class|Actions|Edit Actions|"
                "Version");
    QTest::newRow("link") << link
                          << head + QStringLiteral("Url|Information about the URL|") + middle
            + QStringLiteral("Version");
    QTest::newRow("directory") << directory << head + middle + QStringLiteral("Version");
}

void tst_VelDesktopEntryPropsWidget::reachesEveryRowByTab()
{
    QFETCH(QString, type);
    QFETCH(QString, names);
    QWidget window;
    auto *layout = new QVBoxLayout(&window);
    auto *form = new VelDesktopEntryPropsWidget(&window);
    layout->addWidget(form);
    layout->addWidget(new QPushButton(&window));
    form->setType(type, {});
    form->setShowURLInfoButton(true);
    window.show();
    QVERIFY(QTest::qWaitForWindowActive(&window));
    typeBox(*form)->setFocus();
    QCOMPARE(namesReachedByTab(form).join(QLatin1Char('|')), names);
}

void tst_VelDesktopEntryPropsWidget::scrollsToTheFocusedField_data()
{
    QTest::addColumn<bool>("longLabels");
    QTest::newRow("English") << false;
    QTest::newRow("labels twice as long") << true;
}

void tst_VelDesktopEntryPropsWidget::scrollsToTheFocusedField()
{
    QFETCH(bool, longLabels);
    Doubler doubler;
    if (longLabels)
        QCoreApplication::installTranslator(&doubler);
    VelDesktopEntryPropsWidget form;
    QCoreApplication::removeTranslator(&doubler);
    form.resize(560, 380);
    form.show();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    auto *area = form.findChild<QScrollArea *>();
    QCOMPARE(area->horizontalScrollBar()->maximum(), 0);
    QVERIFY(area->verticalScrollBar()->maximum() > 0);

    const auto inView = [area](const QWidget *field) {
        const QRect rect(field->mapTo(area->viewport(), QPoint()), field->size());
        return area->viewport()->rect().contains(rect);
    };
    typeBox(form)->setFocus();
    for (int i = 0; i < 60; ++i) {
        QWidget *focused = QApplication::focusWidget();
        QVERIFY2(inView(focused), qPrintable(spokenName(focused)));
        QTest::keyClick(focused, Qt::Key_Tab);
    }
    // By other ways than Tab, too.
    child<QLineEdit>(&form, "versionEdit")->setFocus();
    QVERIFY(inView(child<QLineEdit>(&form, "versionEdit")));
    child<QLineEdit>(&form, "nameEdit")->setFocus();
    QVERIFY(inView(child<QLineEdit>(&form, "nameEdit")));
}

void tst_VelDesktopEntryPropsWidget::staysWhereItIsUnderThePressedMouse()
{
    VelDesktopEntryPropsWidget form;
    form.resize(560, 380);
    form.show();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    auto *bar = form.findChild<QScrollArea *>()->verticalScrollBar();
    auto *name = child<QLineEdit>(&form, "nameEdit");
    bar->setValue(name->y() + name->height() / 2); // half of it out of view
    const int before = bar->value();
    QTest::mousePress(name, Qt::LeftButton, Qt::NoModifier, QPoint(5, name->height() - 3));
    QVERIFY(name->hasFocus());
    QCOMPARE(bar->value(), before);
    QTest::mouseRelease(name, Qt::LeftButton, Qt::NoModifier, QPoint(5, name->height() - 3));
}

VEL_TEST_MAIN(tst_VelDesktopEntryPropsWidget)

#include "tst_VelDesktopEntryPropsWidget.moc"
