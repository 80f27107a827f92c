// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include "ui_properties.h"

#include <QAction>
#include <QComboBox>
#include <QFile>
#include <QFileInfo>
#include <QLineEdit>
#include <QToolButton>
#include <QUiLoader>

#include <functional>
#include <memory>

namespace {

using Make = std::function<std::unique_ptr<QWidget>()>;

// A form of its file, made while the program runs.
std::unique_ptr<QWidget> loadedForm()
{
    QUiLoader loader;
    loader.clearPluginPaths();
    loader.addPluginPath(QFileInfo(QStringLiteral(VEL_PLUGIN)).absolutePath());
    QFile file(QStringLiteral(VEL_FORM));
    return std::unique_ptr<QWidget>(file.open(QIODevice::ReadOnly) ? loader.load(&file) : nullptr);
}

// The same form from the code that uic makes of it.
std::unique_ptr<QWidget> compiledForm()
{
    auto form = std::make_unique<QWidget>();
    Ui::PropertiesForm().setupUi(form.get());
    return form;
}

} // namespace

Q_DECLARE_METATYPE(Make)

// What is set in a form works there as it does in code, in both ways that a form is built.
class tst_FormProperties : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void ofTheMenuView_data() { addWays(); }
    void ofTheMenuView();
    void ofTheEntryForm_data() { addWays(); }
    void ofTheEntryForm();
    void ofTheRadioBoxes_data() { addWays(); }
    void ofTheRadioBoxes();

private:
    static void addWays();
};

void tst_FormProperties::addWays()
{
    QTest::addColumn<Make>("make");
    QTest::newRow("QUiLoader") << Make(loadedForm);
    QTest::newRow("uic") << Make(compiledForm);
}

void tst_FormProperties::ofTheMenuView()
{
    QFETCH(Make, make);
    const std::unique_ptr<QWidget> form = make();
    QVERIFY(form);
    auto *menu = form->findChild<VelMenuView *>(QStringLiteral("menu"));
    QVERIFY(menu);
    QCOMPARE(menu->menuDir(), QStringLiteral("/usr"));
    QCOMPARE(menu->itemIconSize(), 48);
    QCOMPARE(menu->iconSize(), QSize(48, 48));
    QVERIFY(menu->isEditable());
    QVERIFY(menu->findChild<QAction *>(QStringLiteral("cutAction")));
    QVERIFY(menu->assistance());
    QVERIFY(menu->undoAction());

    auto *plain = form->findChild<VelMenuView *>(QStringLiteral("plainMenu"));
    QVERIFY(plain);
    QCOMPARE(plain->property("itemIconSize").toInt(), -1);
    QCOMPARE(plain->property("menuDir").toString(), VelMenuView().menuDir());
    QVERIFY(!plain->property("editable").toBool());
    QVERIFY(plain->actions().isEmpty());
}

void tst_FormProperties::ofTheEntryForm()
{
    QFETCH(Make, make);
    const std::unique_ptr<QWidget> form = make();
    QVERIFY(form);
    auto *properties = form->findChild<VelDesktopEntryPropsWidget *>(QStringLiteral("properties"));
    QVERIFY(properties);
    QVERIFY(properties->isReadOnly());
    QCOMPARE(properties->type(), QStringLiteral("Link"));
    QVERIFY(properties->showURLInfoButton());
    QVERIFY(properties->assistance());

    auto *types = properties->findChild<QComboBox *>(QStringLiteral("typeComboBox"));
    QVERIFY(types);
    QCOMPARE(types->count(), 3);
    QCOMPARE(types->currentData().toString(), QStringLiteral("Link"));
    QVERIFY(!types->isEnabled());
    properties->setReadOnly(false);
    QVERIFY(types->isEnabled());
}

void tst_FormProperties::ofTheRadioBoxes()
{
    QFETCH(Make, make);
    const std::unique_ptr<QWidget> form = make();
    QVERIFY(form);
    auto *first = form->findChild<VelRadioGroupBox *>(QStringLiteral("first"));
    auto *second = form->findChild<VelRadioGroupBox *>(QStringLiteral("second"));
    QVERIFY(first && second);
    QCOMPARE(first->title(), QStringLiteral("&First"));
    QVERIFY(!first->isChecked() && second->isChecked());
    QVERIFY(!form->findChild<QLabel *>(QStringLiteral("firstLabel"))->isEnabled());
    QVERIFY(form->findChild<QLabel *>(QStringLiteral("secondLabel"))->isEnabled());

    first->setProperty("title", QStringLiteral("One"));
    QCOMPARE(first->title(), QStringLiteral("One"));
    QVERIFY(first->setProperty("checked", true));
    QVERIFY(first->isChecked() && !second->isChecked());
    QVERIFY(form->findChild<QLabel *>(QStringLiteral("firstLabel"))->isEnabled());
    QVERIFY(!form->findChild<QLabel *>(QStringLiteral("secondLabel"))->isEnabled());
    second->setChecked(true);
    QVERIFY(!first->isChecked() && second->isChecked());
}

VEL_TEST_MAIN(tst_FormProperties)

#include "tst_FormProperties.moc"
