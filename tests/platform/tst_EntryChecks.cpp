// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <EntryChecks.h>
#include <EntryDocument.h>

/// What speaks against an entry.
class tst_EntryChecks : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsWhyAnEntryIsUnsuitable_data();
    void tellsWhyAnEntryIsUnsuitable();
    void tellsWhyAnEntryIsNotDisplayed_data();
    void tellsWhyAnEntryIsNotDisplayed();

private:
    EntryDocument document(const QByteArray &keys);
};

EntryDocument tst_EntryChecks::document(const QByteArray &keys)
{
    EntryDocument document;
    document.setPath(QFile::encodeName(write(QStringLiteral("x.desktop"), "[Desktop Entry]\n" + keys)));
    if (!document.load())
        QTest::qFail("the entry does not load", __FILE__, __LINE__);
    return document;
}

void tst_EntryChecks::tellsWhyAnEntryIsUnsuitable_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<int>("reason");
    const QByteArray application = "Type=Application\nName=A\n";
    const auto row = [](const char *name, const QByteArray &keys, EntryChecks::Unsuitable reason) {
        QTest::newRow(name) << keys << int(reason);
    };
    row("nothing", application + "Exec=sh -c x\n", EntryChecks::Suitable);
    row("no type", "Name=A\nExec=sh\n", EntryChecks::Unusable);
    row("no command", application, EntryChecks::NoExec);
    row("a command that does not parse", application + "Exec=\"sh\n", EntryChecks::Unusable);
    row("a program that is gone", application + "Exec=/nosuch/x\n", EntryChecks::ProgramMissing);
    row("a program that does not run", application + "Exec=/etc/passwd\n", EntryChecks::ProgramNotExecutable);
    row("a program nobody has", application + "Exec=vel-no-such\n", EntryChecks::ProgramNotInPath);
    row("a test program that is gone", application + "Exec=sh\nTryExec=/nosuch/x\n",
        EntryChecks::TryExecMissing);
    row("a test program nobody has", application + "Exec=sh\nTryExec=vel-no-such\n",
        EntryChecks::TryExecNotInPath);
    row("a link to nowhere", "Type=Link\nName=A\nURL=/nosuch\n", EntryChecks::UrlMissing);
}

void tst_EntryChecks::tellsWhyAnEntryIsUnsuitable()
{
    QFETCH(QByteArray, keys);
    QFETCH(int, reason);
    QCOMPARE(int(EntryChecks::suitability(document(keys))), reason);
}

void tst_EntryChecks::tellsWhyAnEntryIsNotDisplayed_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<int>("reason");
    QTest::newRow("nothing") << QByteArray("TryExec=sh\nOnlyShowIn=VEL;\n") << int(EntryChecks::Displayed);
    QTest::newRow("hidden") << QByteArray("NoDisplay=true\nHidden=true\n") << int(EntryChecks::IsHidden);
    QTest::newRow("no menu") << QByteArray("NoDisplay=true\nNotShowIn=VEL;\n")
                             << int(EntryChecks::IsNotForMenus);
    QTest::newRow("others") << QByteArray("NotShowIn=VEL;\nTryExec=vel-no-such\n")
                            << int(EntryChecks::IsForOtherDesktops);
    QTest::newRow("not installed") << QByteArray("TryExec=vel-no-such\n") << int(EntryChecks::NotInstalled);
}

void tst_EntryChecks::tellsWhyAnEntryIsNotDisplayed()
{
    QFETCH(QByteArray, keys);
    QFETCH(int, reason);
    qunsetenv("XDG_CURRENT_DESKTOP");
    QCOMPARE(int(EntryChecks::displayability(document(keys))), reason);
}

VEL_TEST_GUILESS_MAIN(tst_EntryChecks)

#include "tst_EntryChecks.moc"
