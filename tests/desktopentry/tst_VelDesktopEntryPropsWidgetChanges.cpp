// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/ActionListEdit.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/StringListEdit.h>

#include <KIconButton>

#include <QCheckBox>
#include <QListWidget>
#include <QSignalSpy>

using namespace FormDriving;
using namespace VelUI;

/// What the form reports as a change.
class tst_VelDesktopEntryPropsWidgetChanges : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void reportsAChangeInEveryField_data();
    void reportsAChangeInEveryField();
    void reportsAChosenIcon();
    void reportsLoadingByThePathFieldsOnly();
};

void tst_VelDesktopEntryPropsWidgetChanges::reportsAChangeInEveryField_data()
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

void tst_VelDesktopEntryPropsWidgetChanges::reportsAChangeInEveryField()
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

void tst_VelDesktopEntryPropsWidgetChanges::reportsAChosenIcon()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    Q_EMIT child<IconEdit>(&form, "iconEdit")
        ->findChild<KIconButton *>()
        ->iconChanged(QStringLiteral("folder"));
    QCOMPARE(changed.count(), 1);
}

void tst_VelDesktopEntryPropsWidgetChanges::reportsLoadingByThePathFieldsOnly()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nComment=b\nIcon=c\nKeywords=d;\n"
                        "Terminal=true\nHidden=true\n"));
    QCOMPARE(changed.count(), 0);
    form.loadFrom(entry("[Desktop Entry]\nType=Application\nName=a\nExec=true\n"));
    QVERIFY(changed.count() > 0);
}

VEL_TEST_MAIN(tst_VelDesktopEntryPropsWidgetChanges)

#include "tst_VelDesktopEntryPropsWidgetChanges.moc"
