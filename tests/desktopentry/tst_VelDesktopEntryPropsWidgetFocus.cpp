// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>

#include <QAbstractButton>
#include <QComboBox>
#include <QScrollArea>
#include <QScrollBar>
#include <QTranslator>
#include <QVBoxLayout>

using namespace FormDriving;

namespace {

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

// Repeats the texts of the form: all of them, or the one that it is told.
class Repeater : public QTranslator
{
public:
    explicit Repeater(int times, const QString &only = QString())
        : m_times(times)
        , m_only(only)
    {
    }
    QString translate(const char *context, const char *source, const char *, int) const override
    {
        const QString text = QString::fromLatin1(source);
        if (QLatin1String(context) != QLatin1String("VelDesktopEntryPropsWidgetPrivate")
            || (!m_only.isEmpty() && text != m_only))
            return {};
        return QString(text + QLatin1Char(' ')).repeated(m_times);
    }
    bool isEmpty() const override { return false; }

private:
    const int m_times;
    const QString m_only;
};

} // namespace

/// The way of the keyboard through the form, and what is in view.
class tst_VelDesktopEntryPropsWidgetFocus : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void reachesEveryRowByTab_data();
    void reachesEveryRowByTab();
    void scrollsToTheFocusedField_data();
    void scrollsToTheFocusedField();
    void staysWhereItIsUnderThePressedMouse();
    void fitsIntoItsWindowWithLongNamesOfTypes();
    void keepsTheRowsTogetherInATallWindow();
};

void tst_VelDesktopEntryPropsWidgetFocus::reachesEveryRowByTab_data()
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

void tst_VelDesktopEntryPropsWidgetFocus::reachesEveryRowByTab()
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

void tst_VelDesktopEntryPropsWidgetFocus::scrollsToTheFocusedField_data()
{
    QTest::addColumn<bool>("longLabels");
    QTest::newRow("English") << false;
    QTest::newRow("labels twice as long") << true;
}

void tst_VelDesktopEntryPropsWidgetFocus::scrollsToTheFocusedField()
{
    QFETCH(bool, longLabels);
    Repeater doubler(2);
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

void tst_VelDesktopEntryPropsWidgetFocus::staysWhereItIsUnderThePressedMouse()
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

void tst_VelDesktopEntryPropsWidgetFocus::fitsIntoItsWindowWithLongNamesOfTypes()
{
    Repeater repeater(20, application);
    QCoreApplication::installTranslator(&repeater);
    VelDesktopEntryPropsWidget form;
    QCoreApplication::removeTranslator(&repeater);
    form.resize(560, 380);
    form.show();
    QVERIFY(typeBox(form)->currentText().size() > 200);
    QCOMPARE(form.findChild<QScrollArea *>()->horizontalScrollBar()->maximum(), 0);
}

void tst_VelDesktopEntryPropsWidgetFocus::keepsTheRowsTogetherInATallWindow()
{
    VelDesktopEntryPropsWidget form;
    form.setType(directory, {});
    form.resize(560, 2000);
    form.show();
    QVERIFY(child<QLineEdit>(&form, "versionEdit")->geometry().bottom() < 1000);
}

VEL_TEST_MAIN(tst_VelDesktopEntryPropsWidgetFocus)

#include "tst_VelDesktopEntryPropsWidgetFocus.moc"
