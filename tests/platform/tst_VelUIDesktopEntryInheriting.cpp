// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RecordTestCase.h"

/// What a record takes over from another one and from another file.
class tst_VelUIDesktopEntryInheriting : public RecordTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void inheritsOnlyWhatItLacks();
    void inheritsActionsOnlyWithTheirList();
    void becomesValidByInheritingFromAValidRecord();
    void rebindsWithoutReading();
    void loadingDropsChanges();
    void becomesInvalidWhenLoadingFails();
    void isAValueWithSharedData();
};

void tst_VelUIDesktopEntryInheriting::inheritsOnlyWhatItLacks()
{
    const VelUIDesktopEntry model(
        write(QStringLiteral("model.desktop"),
              "# not a key\n" + Header
                  + "Type=Application\nName=M\nName[fr]=MF\nComment=C\nComment[de]=CD\nComment[fr]="
                    "\xFF\nGenericName[fr]=G\n"
                    "Keywords=a;;b\nX-Own=\xFE\nIcon=mi\nIcon=mj\n\n[X-Group]\nx=y\nz=1\n"));
    QCOMPARE(changed(Header + "Name=A\nIcon=\nComment[de]=mine\n\n[X-Group]\nx=own\n",
                     [&model](auto &record) { record.inheritFrom(model); }),
             Header
                 + "Name=A\nIcon=\nComment=C\nComment[de]=mine\nComment[fr]=\xFF\nType=Application\nKeywords="
                   "a;;b\nX-Own=\xFE\n"
                   "\n[X-Group]\nx=own\nz=1\n");

    const QByteArray bytes = Header + "Name=A\n";
    QCOMPARE(changed(bytes, [](auto &record) { record.inheritFrom(record); }), bytes);
    QCOMPARE(changed(Header + "Name=A\n",
                     [](auto &record) {
                         VelUIDesktopEntry other;
                         other.setIcon(QStringLiteral("i"));
                         other.setLocalIcon(QStringLiteral("l"));
                         record.inheritFrom(other);
                     }),
             Header + "Name=A\nIcon=i\nIcon[de]=l\n");
}

void tst_VelUIDesktopEntryInheriting::inheritsActionsOnlyWithTheirList()
{
    const VelUIDesktopEntry model(write(
        QStringLiteral("model.desktop"),
        Header + "Actions=a;b\n\n[Desktop Action a]\nName=A\nX-a=1\n\n[Desktop Action other]\nName=O\n"));
    const Change inherit = [&model](auto &record) { record.inheritFrom(model); };
    QCOMPARE(changed(Header + "Name=N\n", inherit),
             Header + "Name=N\nActions=a;b\n\n[Desktop Action a]\nName=A\nX-a=1\n");
    QCOMPARE(changed(Header + "Actions=c;\n", inherit), Header + "Actions=c;\n");
    QCOMPARE(changed(Header + "Actions=\n", inherit), Header + "Actions=\n");
}

void tst_VelUIDesktopEntryInheriting::becomesValidByInheritingFromAValidRecord()
{
    const VelUIDesktopEntry model(write(QStringLiteral("model.desktop"), Header + "Name=A\n"));
    VelUIDesktopEntry record;
    record.inheritFrom(VelUIDesktopEntry());
    QVERIFY(!record.isValid());
    record.inheritFrom(VelUIDesktopEntry(write(QStringLiteral("bare.desktop"), Header)));
    QVERIFY(!record.isValid());
    record.inheritFrom(model);
    QVERIFY(record.isValid());
    QCOMPARE(record.getName(), QStringLiteral("A"));

    VelUIDesktopEntry unread;
    unread.setName(QStringLiteral("B"));
    VelUIDesktopEntry heir;
    heir.inheritFrom(unread);
    QCOMPARE(heir.getName(), QStringLiteral("B"));
    QVERIFY(!heir.isValid());
}

void tst_VelUIDesktopEntryInheriting::rebindsWithoutReading()
{
    const QString a = write(QStringLiteral("a.desktop"), Header + "Name=A\n# a\n");
    const QString b = write(QStringLiteral("b.desktop"), Header + "Name=B\nIcon=b\n");
    VelUIDesktopEntry record(a);
    record.setFilePath(b);
    QCOMPARE(record.getName(), QStringLiteral("A"));
    QVERIFY(record.isValid());
    QVERIFY(record.save());
    QCOMPARE(read(b), Header + "Name=A\n# a\n");
    QCOMPARE(read(a), Header + "Name=A\n# a\n");

    VelUIDesktopEntry unread;
    unread.setFilePath(b);
    QVERIFY(!unread.isValid());
    unread.setIcon(QStringLiteral("c"));
    QVERIFY(unread.save());
    QCOMPARE(read(b), Header + "Name=A\nIcon=c\n# a\n");
}

void tst_VelUIDesktopEntryInheriting::loadingDropsChanges()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A\n");
    VelUIDesktopEntry record(file);
    record.setName(QStringLiteral("B"));
    record.setIcon(QStringLiteral("i"));
    write(QStringLiteral("x.desktop"), Header + "Name=C\n");
    QVERIFY(record.load());
    QCOMPARE(record.getName(), QStringLiteral("C"));
    QCOMPARE(record.getIcon(), QString());
    QVERIFY(record.save());
    QCOMPARE(read(file), Header + "Name=C\n");
}

void tst_VelUIDesktopEntryInheriting::becomesInvalidWhenLoadingFails()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A\n");
    VelUIDesktopEntry record(file);
    QVERIFY(QFile::remove(file));
    QVERIFY(record.isValid());
    QVERIFY(!record.load());
    QVERIFY(!record.isValid());
    QCOMPARE(record.getName(), QString());
}

void tst_VelUIDesktopEntryInheriting::isAValueWithSharedData()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A\n");
    VelUIDesktopEntry record(file);
    VelUIDesktopEntry copy(record);
    copy.setName(QStringLiteral("B"));
    QCOMPARE(record.getName(), QStringLiteral("A"));
    record = copy;
    QCOMPARE(record.getName(), QStringLiteral("B"));
    const VelUIDesktopEntry moved(std::move(copy));
    QCOMPARE(moved.getName(), QStringLiteral("B"));
    copy = moved;
    QVERIFY(copy.save());
    QCOMPARE(read(file), Header + "Name=B\n");
}

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopEntryInheriting)
#include "tst_VelUIDesktopEntryInheriting.moc"
