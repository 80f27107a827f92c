// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/EntryFormAssistance.h>
#include <desktopentry/FieldEdit.h>
#include <desktopentry/FormLayout.h>
#include <desktopentry/VelDesktopEntryPropsWidgetPrivate.h>

#include <QPointer>
#include <QSignalSpy>
#include <QToolButton>

using namespace FormDriving;
using VelUI::EntryFormAssistance;
using VelUI::FormLayout;
using VelUI::FormRow;

/// What the assisted form gives to its parts: the rows, places in them, the record and news of it.
class tst_EntryFormAssistance : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isOffUntilItIsSwitchedOn();
    void leavesTheFormAsItWas();
    void knowsEveryRow();
    void namesEveryRowAsItsLabelDoes();
    void putsAButtonBehindItsField();
    void putsASentenceUnderItsField();
    void hidesWhatIsInARowWithTheRow();
    void comesToAButtonAfterItsField();
    void tellsOfEveryEdit_data();
    void tellsOfEveryEdit();
    void tellsOnceOfALoadedEntry();
    void tellsOfAnotherType();
    void givesTheEntryAsItWouldBeSaved();
    void editsAsTheUserDoes();

private:
    static EntryFormAssistance &assistance(VelDesktopEntryPropsWidget &form)
    {
        return *VelDesktopEntryPropsWidgetPrivate::of(form).assistance;
    }
    static QStringList places(const QWidget &form)
    {
        QStringList places;
        for (const QWidget *widget : form.findChildren<QWidget *>()) {
            if (!widget->isVisible())
                continue;
            QString place;
            QDebug(&place) << widget << widget->geometry();
            places.append(place);
        }
        return places;
    }
    static QList<QWidget *> chain(const QWidget &form)
    {
        QList<QWidget *> widgets;
        for (auto *next = form.nextInFocusChain(); next != &form; next = next->nextInFocusChain())
            widgets.append(next);
        return widgets;
    }
};

void tst_EntryFormAssistance::isOffUntilItIsSwitchedOn()
{
    VelDesktopEntryPropsWidget form;
    QVERIFY(!form.assistance());
    QCOMPARE(form.property("assistance"), QVariant(false));
    form.setAssistance(true);
    QVERIFY(form.assistance());
    form.setProperty("assistance", false);
    QVERIFY(!form.assistance());
}

void tst_EntryFormAssistance::leavesTheFormAsItWas()
{
    VelDesktopEntryPropsWidget form;
    form.resize(800, 400);
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    const QStringList former = places(form);
    const auto formerChain = chain(form);
    const QStringList formerRows = shownRows(form);

    form.setAssistance(true);
    EntryFormAssistance &parts = assistance(form);
    for (const FormRow &row : parts.rows()) {
        parts.addBeside(row, new QToolButton);
        parts.addBelow(row, new QLabel(QStringLiteral("note")));
    }
    QCoreApplication::processEvents();
    QVERIFY(places(form) != former);
    QCOMPARE(shownRows(form), formerRows);
    form.setAssistance(false);
    QTRY_COMPARE(places(form), former);
    QCOMPARE(chain(form), formerChain);
    QCOMPARE(shownRows(form), formerRows);
    QVERIFY(form.findChild<QLabel *>(QStringLiteral("note")) == nullptr);
    chooseType(form, application);
    form.setType(link, {});
    QVERIFY(!shownRows(form).contains(QStringLiteral("Exec:*")));
    QVERIFY(shownRows(form).contains(QStringLiteral("Url:*")));
}

void tst_EntryFormAssistance::knowsEveryRow()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    QStringList keys;
    for (const FormRow &row : assistance(form).rows())
        keys.append(row.isTranslation() ? row.key + QLatin1Char('*') : row.key);
    QCOMPARE(
        keys.join(QLatin1Char(' ')),
        QStringLiteral("Type Name Name* Icon Icon* Exec Terminal Path TryExec URL GenericName GenericName* "
                       "Comment Comment* NoDisplay Hidden OnlyShowIn NotShowIn MimeType Categories "
                       "Keywords Keywords* StartupNotify StartupWMClass Actions Version"));
    QCOMPARE(assistance(form).row(QStringLiteral("Exec"))->field->objectName(), QStringLiteral("execEdit"));
    QVERIFY(!assistance(form).row(QStringLiteral("X-Unknown")));
}

void tst_EntryFormAssistance::namesEveryRowAsItsLabelDoes()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    auto *layout = form.findChild<FormLayout *>();
    for (const FormRow &row : assistance(form).rows()) {
        QWidget *const first = layout->itemAtPosition(row.number * 2, 0)->widget();
        const auto *label = qobject_cast<QLabel *>(first);
        const auto *button = qobject_cast<QAbstractButton *>(first);
        QCOMPARE(label ? label->text() : button->text() + QLatin1Char(':'), row.label + QLatin1Char(':'));
    }
}

void tst_EntryFormAssistance::putsAButtonBehindItsField()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    const FormRow &row = *assistance(form).row(QStringLiteral("Exec"));
    auto *button = new QToolButton;
    assistance(form).addBeside(row, button);
    QCoreApplication::processEvents();
    const QRect place(button->mapTo(&form, QPoint()), button->size());
    const QRect field(row.field->mapTo(&form, QPoint()), row.field->size());
    QVERIFY(button->isVisible());
    QVERIFY(place.left() > field.right());
    QVERIFY(place.top() <= field.center().y() && place.bottom() >= field.center().y());
}

void tst_EntryFormAssistance::putsASentenceUnderItsField()
{
    VelDesktopEntryPropsWidget form;
    // An empty form has something to say by itself.
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nExec=true\n"));
    form.setAssistance(true);
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    const FormRow &row = *assistance(form).row(QStringLiteral("Path"));
    const QWidget *const next = assistance(form).row(QStringLiteral("TryExec"))->field;
    const int formerGap = next->y() - row.field->geometry().bottom();
    const QPointer<QLabel> sentence(new QLabel(QStringLiteral("There is no such program.")));
    sentence->hide();
    assistance(form).addBelow(row, sentence);
    QCoreApplication::processEvents();
    QCOMPARE(next->y() - row.field->geometry().bottom(), formerGap);

    const int formerWidth = row.field->width();
    sentence->show();
    QCoreApplication::processEvents();
    QCOMPARE(row.field->width(), formerWidth);
    const int top = sentence->mapTo(form.findChild<QWidget *>(QStringLiteral("content")), QPoint()).y();
    QVERIFY(top > row.field->geometry().bottom());
    QVERIFY(top + sentence->height() <= next->y());

    delete sentence;
    QCoreApplication::processEvents();
    QCOMPARE(next->y() - row.field->geometry().bottom(), formerGap);
}

void tst_EntryFormAssistance::hidesWhatIsInARowWithTheRow()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    form.show();
    const FormRow &row = *assistance(form).row(QStringLiteral("Exec"));
    auto *button = new QToolButton;
    auto *sentence = new QLabel(QStringLiteral("sentence"));
    auto *hidden = new QLabel(QStringLiteral("nothing to say"));
    hidden->hide();
    assistance(form).addBeside(row, button);
    assistance(form).addBelow(row, sentence);
    assistance(form).addBelow(row, hidden);
    QVERIFY(button->isVisible() && sentence->isVisible());
    form.setType(link, {});
    QVERIFY(!assistance(form).isShown(row));
    QVERIFY(!button->isVisible() && !sentence->isVisible());
    form.setType(application, {});
    QVERIFY(assistance(form).isShown(row));
    QVERIFY(button->isVisible() && sentence->isVisible() && !hidden->isVisible());
}

void tst_EntryFormAssistance::comesToAButtonAfterItsField()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    const FormRow &row = *assistance(form).row(QStringLiteral("Name"));
    auto *fix = new QToolButton;
    auto *first = new QToolButton;
    auto *second = new QToolButton;
    for (QToolButton *button : {fix, first, second})
        button->setFocusPolicy(Qt::StrongFocus);
    assistance(form).addBelow(row, fix);
    assistance(form).addBeside(row, first);
    assistance(form).addBeside(row, second);
    QList<QWidget *> reached = chain(form);
    reached.erase(std::remove_if(reached.begin(), reached.end(),
                                 [](QWidget *widget) { return !(widget->focusPolicy() & Qt::TabFocus); }),
                  reached.end());
    const int at = reached.indexOf(row.field);
    QVERIFY(at >= 0);
    QCOMPARE(reached.mid(at + 1, 3), QList<QWidget *>({first, second, fix}));
}

void tst_EntryFormAssistance::tellsOfEveryEdit_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QVariant>("value");

    QTest::newRow("line") << QStringLiteral("Name") << QVariant(QStringLiteral("other"));
    QTest::newRow("path") << QStringLiteral("Exec") << QVariant(QStringLiteral("other"));
    QTest::newRow("icon") << QStringLiteral("Icon") << QVariant(QStringLiteral("other"));
    QTest::newRow("box") << QStringLiteral("Terminal") << QVariant(true);
    QTest::newRow("list") << QStringLiteral("Categories") << QVariant(QStringList{QStringLiteral("Qt")});
}

void tst_EntryFormAssistance::tellsOfEveryEdit()
{
    QFETCH(QString, key);
    QFETCH(QVariant, value);
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    QWidget *const field = assistance(form).row(key)->field;
    const QSignalSpy told(&assistance(form), &EntryFormAssistance::recordChanged);
    const QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    VelUI::FieldEdit::setValue(field, value);
    QCOMPARE(VelUI::FieldEdit::value(field), value);
    QVERIFY(!told.isEmpty());
    QVERIFY(!changed.isEmpty());

    const int former = told.size();
    VelUI::FieldEdit::setValue(field, value);
    QCOMPARE(told.size(), former);
}

void tst_EntryFormAssistance::tellsOnceOfALoadedEntry()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    const QSignalSpy told(&assistance(form), &EntryFormAssistance::recordChanged);
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nExec=b\nTryExec=c\nCategories=Qt;\n"));
    QCOMPARE(told.size(), 1);
}

void tst_EntryFormAssistance::tellsOfAnotherType()
{
    VelDesktopEntryPropsWidget form;
    form.setAssistance(true);
    const QSignalSpy told(&assistance(form), &EntryFormAssistance::recordChanged);
    form.setType(link, {});
    QVERIFY(!told.isEmpty());
    QCOMPARE(assistance(form).record().getType(), link);
}

void tst_EntryFormAssistance::givesTheEntryAsItWouldBeSaved()
{
    VelDesktopEntryPropsWidget form;
    const QByteArray bytes =
        "# kept\n[Desktop Entry]\nType=Application\nName=a\nName[fr]=f\nX-Own=1\nExec=b\n";
    VelUIDesktopEntry loaded = entry(bytes);
    form.loadFrom(loaded);
    form.setAssistance(true);
    QCOMPARE(assistance(form).record().contents(), bytes);
    retype(child<QLineEdit>(&form, "nameEdit"), QStringLiteral("new"));
    const QByteArray text = assistance(form).record().contents();
    QCOMPARE(text, QByteArray(bytes).replace("Name=a", "Name=new"));
    form.saveTo(&loaded);
    QCOMPARE(saved(loaded), text);
}

void tst_EntryFormAssistance::editsAsTheUserDoes()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nName[de]=a\nExec=b\n"));
    VelUI::FieldEdit::setValue(child<QLineEdit>(&form, "nameEdit"), QStringLiteral("both"));
    QCOMPARE(child<QLineEdit>(&form, "localNameEdit")->text(), QStringLiteral("both"));
}

VEL_TEST_MAIN(tst_EntryFormAssistance)
#include "tst_EntryFormAssistance.moc"
