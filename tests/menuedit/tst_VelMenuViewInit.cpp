// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditTestCase.h"
#include "ModalDriver.h"

#include "VelMenuView.h"

#include <QAction>
#include <QClipboard>
#include <QFileSystemModel>
#include <QLineEdit>
#include <QMenu>
#include <QMessageBox>
#include <QMimeData>
#include <QPushButton>
#include <QSignalSpy>

/// A view that is given another directory while an operation of it waits for the user.
class tst_VelMenuViewInit : public EditTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void keepsANewEntryThatIsAcceptedAfterwards();
    void takesANewEntryBackThatIsCanceledAfterwards();
    void deletesNothing();
    void pastesNothing();
    void forgetsWhatWasSearched();
    void replacesTheActionsAgainAndAgain();

private:
    QString m_other;
};

void tst_VelMenuViewInit::init()
{
    EditTestCase::init();
    m_other = QFileInfo(write(QStringLiteral("other/o.desktop"), entryText(QStringLiteral("O")))).path();
}

void tst_VelMenuViewInit::keepsANewEntryThatIsAcceptedAfterwards()
{
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        view.init(m_other, -1, true, nullptr);
        accept(window);
    });

    QVERIFY(view.createNew(false));

    QVERIFY(modal.finished());
    QCOMPARE(view.menuDir(), m_other);
    QVERIFY(QFile::exists(menu() + QLatin1String("/shortcut.desktop")));
}

void tst_VelMenuViewInit::takesANewEntryBackThatIsCanceledAfterwards()
{
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        view.init(m_other, -1, true, nullptr);
        reject(window);
    });

    QVERIFY(!view.createNew(true));

    QVERIFY(modal.finished());
    QCOMPARE(everythingIn(menu()), QStringList());
}

void tst_VelMenuViewInit::deletesNothing()
{
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    ModalDriver modal;
    modal.handle([&](QWidget *box) {
        view.init(m_other, -1, true, nullptr);
        qobject_cast<QMessageBox *>(box)->button(QMessageBox::Yes)->click();
    });

    view.slotDel();

    QVERIFY(modal.finished());
    QVERIFY(QFile::exists(entry));
}

void tst_VelMenuViewInit::pastesNothing()
{
    const QString entry = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    const QString foreign = write(QStringLiteral("outside/a.desktop"), entryText(QStringLiteral("Foreign")));
    VelMenuView view(menu(), -1, true);
    QVERIFY(open(view, menu(), 1));
    select(view, entry);
    auto *data = new QMimeData;
    data->setUrls({QUrl::fromLocalFile(foreign)});
    QGuiApplication::clipboard()->setMimeData(data);
    ModalDriver modal;
    modal.handle([&](QWidget *box) {
        QVERIFY(QFile::remove(entry));
        view.init(m_other, -1, true, nullptr);
        qobject_cast<QMessageBox *>(box)->button(QMessageBox::Yes)->click();
    });

    view.slotPaste();

    QVERIFY(modal.finished());
    QVERIFY(!QFile::exists(entry));
    QCOMPARE(everythingIn(m_other), QStringList{QStringLiteral("o.desktop")});
}

void tst_VelMenuViewInit::forgetsWhatWasSearched()
{
    writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    VelMenuView view(menu(), -1, true);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        window->findChild<QLineEdit *>()->setText(QStringLiteral("a"));
        qobject_cast<QDialog *>(window)->accept();
    });
    view.slotFind();
    QVERIFY(modal.finished());
    QVERIFY(!view.selectedPath().isEmpty());

    view.init(m_other, -1, true, nullptr);

    QVERIFY(!view.findAndSelect(true));
    QCOMPARE(view.selectedPath(), QString());
}

void tst_VelMenuViewInit::replacesTheActionsAgainAndAgain()
{
    VelMenuView view(menu(), -1, true);
    const int count = view.actions().size();
    QSignalSpy changed(&view, &VelMenuView::changed);
    for (int i = 0; i < 5; ++i) {
        view.init(i % 2 ? menu() : m_other, -1, i != 2, nullptr);
        QCOMPARE(view.actions().size(), i == 2 ? 0 : count);
        QCOMPARE(view.findChildren<QMenu *>(QString(), Qt::FindDirectChildrenOnly).size(), i == 2 ? 0 : 1);
    }
    QVERIFY(open(view, m_other, 1));
    select(view, m_other + QLatin1String("/o.desktop"));
    QVERIFY(action(view, QStringLiteral("copyAction"))->isEnabled());
    QVERIFY(QMetaObject::invokeMethod(files(view), "changed"));
    QCOMPARE(changed.count(), 1);
}

VEL_TEST_MAIN(tst_VelMenuViewInit)
#include "tst_VelMenuViewInit.moc"
