// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <VelMenuView.h>
#include <VelRadioGroupBox.h>

#include <QFile>
#include <QFileInfo>
#include <QIcon>
#include <QLabel>
#include <QPluginLoader>
#include <QUiLoader>
#include <QXmlStreamReader>
#include <QtUiPlugin/QDesignerCustomWidgetCollectionInterface>

#include <memory>

class tst_WidgetCollection : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void offersTheThreeWidgets();
    void describesEveryWidget();
    void newWidgetsAreWellFormed();
    void formsLoadWithTheWidgetsInside();
    void tellsWhatIsForTheProgramAlone();
    void helpTellsOfCheckedInForms();

private:
    QList<QDesignerCustomWidgetInterface *> widgets();
};

QList<QDesignerCustomWidgetInterface *> tst_WidgetCollection::widgets()
{
    QPluginLoader loader(QStringLiteral(VEL_PLUGIN));
    auto *collection = qobject_cast<QDesignerCustomWidgetCollectionInterface *>(loader.instance());
    if (!collection) {
        QTest::qFail(qPrintable(loader.errorString()), __FILE__, __LINE__);
        return {};
    }
    return collection->customWidgets();
}

void tst_WidgetCollection::offersTheThreeWidgets()
{
    QStringList names;
    for (const QDesignerCustomWidgetInterface *widget : widgets())
        names.append(widget->name());
    QCOMPARE(names,
             QStringList({QStringLiteral("VelMenuView"), QStringLiteral("VelRadioGroupBox"),
                          QStringLiteral("VelDesktopEntryPropsWidget")}));
}

void tst_WidgetCollection::describesEveryWidget()
{
    for (const QDesignerCustomWidgetInterface *widget : widgets()) {
        QVERIFY2(!widget->toolTip().isEmpty(), qPrintable(widget->name()));
        QVERIFY2(!widget->whatsThis().isEmpty(), qPrintable(widget->name()));
        QVERIFY2(!widget->icon().pixmap(22).isNull(), qPrintable(widget->name()));
        QCOMPARE(widget->includeFile(), widget->name() + QStringLiteral(".h"));
        QCOMPARE(widget->isContainer(), widget->name() == QLatin1String("VelRadioGroupBox"));
    }
}

void tst_WidgetCollection::newWidgetsAreWellFormed()
{
    for (QDesignerCustomWidgetInterface *widget : widgets()) {
        QXmlStreamReader reader(widget->domXml());
        bool named = false;
        while (!reader.atEnd()) {
            if (reader.readNext() == QXmlStreamReader::StartElement
                && reader.name() == QLatin1String("widget"))
                named = reader.attributes().value(QLatin1String("class")) == widget->name();
        }
        QVERIFY2(!reader.hasError(), qPrintable(widget->name() + reader.errorString()));
        QVERIFY2(named, qPrintable(widget->name()));
        const std::unique_ptr<QWidget> made(widget->createWidget(nullptr));
        QCOMPARE(QString::fromLatin1(made->metaObject()->className()), widget->name());
    }
}

void tst_WidgetCollection::formsLoadWithTheWidgetsInside()
{
    QUiLoader loader;
    loader.clearPluginPaths();
    loader.addPluginPath(QFileInfo(QStringLiteral(VEL_PLUGIN)).absolutePath());
    QFile file(QStringLiteral(VEL_FORM));
    QVERIFY(file.open(QIODevice::ReadOnly));

    const std::unique_ptr<QWidget> form(loader.load(&file));
    QVERIFY2(form, qPrintable(loader.errorString()));
    auto *menu = form->findChild<VelMenuView *>(QStringLiteral("menu"));
    QVERIFY(menu);
    QVERIFY(menu->alternatingRowColors());
    auto *byHand = form->findChild<VelRadioGroupBox *>(QStringLiteral("byHand"));
    QVERIFY(byHand);
    QCOMPARE(byHand->title(), QStringLiteral("By &hand"));
    QVERIFY(byHand->findChild<QLabel *>(QStringLiteral("label")));
    QVERIFY(!byHand->isChecked());
    QVERIFY(form->findChild<VelRadioGroupBox *>(QStringLiteral("byMachine"))->isChecked());
    QVERIFY(form->findChild<VelDesktopEntryPropsWidget *>(QStringLiteral("properties")));
}

// Else Designer would have a directory and the name of a type translated.
void tst_WidgetCollection::tellsWhatIsForTheProgramAlone()
{
    QStringList untranslated;
    for (const QDesignerCustomWidgetInterface *widget : widgets()) {
        QXmlStreamReader reader(widget->domXml());
        while (!reader.atEnd()) {
            if (reader.readNext() == QXmlStreamReader::StartElement
                && reader.name() == QLatin1String("stringpropertyspecification")
                && reader.attributes().value(QLatin1String("notr")) == QLatin1String("true"))
                untranslated.append(widget->name() + QLatin1Char('.')
                                    + reader.attributes().value(QLatin1String("name")).toString());
        }
    }
    QCOMPARE(untranslated,
             QStringList(
                 {QStringLiteral("VelMenuView.menuDir"), QStringLiteral("VelDesktopEntryPropsWidget.type")}));
}

void tst_WidgetCollection::helpTellsOfCheckedInForms()
{
    for (const QDesignerCustomWidgetInterface *widget : widgets()) {
        if (widget->name() == QLatin1String("VelRadioGroupBox"))
            QVERIFY(widget->whatsThis().contains(QLatin1String("\"checked\"")));
    }
}

VEL_TEST_MAIN(tst_WidgetCollection)

#include "tst_WidgetCollection.moc"
