// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/EntryFormAssistance.h>
#include <desktopentry/KeyDescription.h>
#include <desktopentry/VelDesktopEntryPropsWidgetPrivate.h>

#include <QAccessible>
#include <QComboBox>

#include <functional>

using namespace FormDriving;

/// The assisted form as screen readers see it: every field has a name and is described.
class tst_EntryFormAccessibility : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void namesAndDescribesEveryField_data();
    void namesAndDescribesEveryField();
    void describesEveryKey();
    void describesNothingWithoutAssistance();

private:
    using Visit = std::function<void(QAccessibleInterface *)>;

    static void walk(QAccessibleInterface *object, const Visit &visit)
    {
        visit(object);
        for (int i = 0; i < object->childCount(); ++i) {
            if (QAccessibleInterface *child = object->child(i))
                walk(child, visit);
        }
    }
    static bool isField(QAccessible::Role role)
    {
        return role == QAccessible::EditableText || role == QAccessible::ComboBox
            || role == QAccessible::CheckBox || role == QAccessible::RadioButton;
    }
    static bool isButton(QAccessible::Role role)
    {
        return role == QAccessible::PushButton || role == QAccessible::ButtonMenu
            || role == QAccessible::ButtonDropDown;
    }
    static QString nameOf(QAccessibleInterface *object)
    {
        QString name;
        QDebug(&name) << object->object();
        return name;
    }
};

void tst_EntryFormAccessibility::namesAndDescribesEveryField_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QString>("language");

    for (const QString &type : {application, link, directory}) {
        for (const char *language : {"", "fr"})
            QTest::addRow("%s %s", qPrintable(type), language) << type << QString::fromLatin1(language);
    }
}

void tst_EntryFormAccessibility::namesAndDescribesEveryField()
{
    QFETCH(QString, type);
    QFETCH(QString, language);
    VelDesktopEntryEditDialog dialog;
    dialog.setAssistance(true);
    QVERIFY(dialog.setDesktopEntryPath(write(QStringLiteral("a.desktop"),
                                             "[Desktop Entry]\nType=" + type.toLatin1()
                                                 + "\nName=a\nName[fr]=b\nExec=/bin/sh\nURL=file:///\n")));
    dialog.show();
    QVERIFY(QTest::qWaitForWindowExposed(&dialog));
    auto *box = child<QComboBox>(&dialog, "languageBox");
    box->setCurrentIndex(box->findData(language));

    int fields = 0;
    int buttons = 0;
    walk(QAccessible::queryAccessibleInterface(&dialog), [&](QAccessibleInterface *object) {
        const auto *widget = qobject_cast<QWidget *>(object->object());
        if (!widget || !widget->isVisible())
            return;
        if (isField(object->role())) {
            ++fields;
            QVERIFY2(!object->text(QAccessible::Name).isEmpty(), qPrintable(nameOf(object)));
            QVERIFY2(!object->text(QAccessible::Description).isEmpty(), qPrintable(nameOf(object)));
        } else if (isButton(object->role())) {
            ++buttons;
            QVERIFY2(!object->text(QAccessible::Name).isEmpty(), qPrintable(nameOf(object)));
        }
    });
    QVERIFY2(fields >= (type == application ? 27 : 16), qPrintable(QString::number(fields)));
    QVERIFY(buttons >= 8);
}

void tst_EntryFormAccessibility::describesEveryKey()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    const auto &rows = VelDesktopEntryPropsWidgetPrivate::of(form).assistance->rows();
    for (const VelUI::FormRow &row : rows) {
        const QString text = KeyDescription::of(row.key);
        QVERIFY2(text.endsWith(QLatin1Char('.')), qPrintable(row.key));
        QVERIFY(row.field->accessibleDescription().startsWith(text));
        QCOMPARE(row.field->accessibleDescription() == text, !row.isTranslation());
    }
}

void tst_EntryFormAccessibility::describesNothingWithoutAssistance()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nExec=true\nCategories=Nonsense;\n"));
    const auto descriptions = [&form] {
        QStringList texts;
        for (const QWidget *widget : form.findChildren<QWidget *>())
            texts << widget->accessibleName() << widget->accessibleDescription() << widget->toolTip();
        return texts;
    };
    const QStringList former = descriptions();
    form.setAssistance(true);
    // What is wrong with the entry is a part of the description.
    QTRY_VERIFY_WITH_TIMEOUT(child<QWidget>(&form, "categoriesEdit")->accessibleDescription()
                                 != KeyDescription::of(QStringLiteral("Categories")),
                             20000);
    form.setAssistance(false);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCOMPARE(descriptions(), former);
}

VEL_TEST_MAIN(tst_EntryFormAccessibility)

#include "tst_EntryFormAccessibility.moc"
