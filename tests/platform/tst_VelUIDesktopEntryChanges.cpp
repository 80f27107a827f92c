// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Growth.h"
#include "RecordTestCase.h"

#include <sys/stat.h>

/// Which bytes a record leaves behind when it is changed and saved.
class tst_VelUIDesktopEntryChanges : public RecordTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void givesBackEveryValueItWasGiven();
    void writesOnlyTheLinesOfChangedKeys_data();
    void writesOnlyTheLinesOfChangedKeys();
    void changesNothingWhenASetterGetsTheGettersValue_data();
    void changesNothingWhenASetterGetsTheGettersValue();
    void doesNotTouchTheFileWhenNothingChanged();
    void completesALastLineThatLacksHalfItsEnd_data();
    void completesALastLineThatLacksHalfItsEnd();
    void forgetsAChangeThatWasTakenBack();
    void startsANewFileWithItsGroupAndTheKeysInTheirOrder();
    void writesTheLocalVariantThatTheGetterFound_data();
    void writesTheLocalVariantThatTheGetterFound();
    void dropsWhatBelongsToTheOldTypeOnly();
    void keepsEverythingWhenTheTypeStays();
    void removesAKeyOfManyLanguagesInLinearTime();
};

namespace {

// Every text, list and flag of a record under its own name, to run over all of them.
struct TextField
{
    const char *key;
    QString (VelUIDesktopEntry::*get)() const;
    void (VelUIDesktopEntry::*set)(const QString &);
};

struct ListField
{
    const char *key;
    QStringList (VelUIDesktopEntry::*get)() const;
    void (VelUIDesktopEntry::*set)(const QStringList &);
};

struct FlagField
{
    const char *key;
    bool (VelUIDesktopEntry::*get)() const;
    void (VelUIDesktopEntry::*set)(bool);
};

#define FIELD(key, Name) \
    { \
        key, &VelUIDesktopEntry::get##Name, &VelUIDesktopEntry::set##Name \
    }

const TextField Texts[] = {
    FIELD("Type", Type),
    FIELD("Name", Name),
    FIELD("Name[de]", LocalName),
    FIELD("GenericName", GenericName),
    FIELD("GenericName[de]", LocalGenericName),
    FIELD("Comment", Comment),
    FIELD("Comment[de]", LocalComment),
    FIELD("Icon", Icon),
    FIELD("Icon[de]", LocalIcon),
    FIELD("Exec", Exec),
    FIELD("TryExec", TryExec),
    FIELD("Path", Path),
    FIELD("URL", URL),
    FIELD("StartupWMClass", StartupWMClass),
    FIELD("Version", Version),
};

const ListField Lists[] = {
    FIELD("OnlyShowIn", OnlyShowIn), FIELD("NotShowIn", NotShowIn), FIELD("MimeType", MimeType),
    FIELD("Categories", Categories), FIELD("Keywords", Keywords),   FIELD("Keywords[de]", LocalKeywords),
    FIELD("SortOrder", SortOrder),
};

const FlagField Flags[] = {
    FIELD("Terminal", Terminal),
    FIELD("NoDisplay", NoDisplay),
    FIELD("Hidden", Hidden),
    FIELD("StartupNotify", StartupNotify),
};

#undef FIELD

} // namespace

void tst_VelUIDesktopEntryChanges::givesBackEveryValueItWasGiven()
{
    const QString file = path(QStringLiteral("new.desktop"));
    VelUIDesktopEntry record(file);
    for (const TextField &field : Texts)
        (record.*field.set)(QLatin1String("text of ") + QLatin1String(field.key));
    for (const ListField &field : Lists)
        (record.*field.set)({QLatin1String(field.key), QStringLiteral("x;y")});
    for (const FlagField &field : Flags)
        (record.*field.set)(true);
    QVERIFY(record.save());

    const QByteArray bytes = read(file);
    const VelUIDesktopEntry again(file);
    for (const VelUIDesktopEntry &each : {record, again}) {
        for (const TextField &field : Texts)
            QCOMPARE((each.*field.get)(), QLatin1String("text of ") + QLatin1String(field.key));
        for (const ListField &field : Lists)
            QCOMPARE((each.*field.get)(), (QStringList{QLatin1String(field.key), QStringLiteral("x;y")}));
        for (const FlagField &field : Flags)
            QVERIFY((each.*field.get)());
    }
    for (const TextField &field : Texts)
        QVERIFY(bytes.contains(QByteArray("\n") + field.key + "=text of " + field.key + "\n"));
    for (const ListField &field : Lists)
        QVERIFY(bytes.contains(QByteArray("\n") + field.key + "=" + field.key + ";x\\;y;\n"));
    for (const FlagField &field : Flags)
        QVERIFY(bytes.contains(QByteArray("\n") + field.key + "=true\n"));
}

void tst_VelUIDesktopEntryChanges::writesOnlyTheLinesOfChangedKeys_data()
{
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<Change>("change");
    QTest::addColumn<QByteArray>("after");
    const auto row = [](const char *name, const QByteArray &before, const Change &change,
                        const QByteArray &after) { QTest::newRow(name) << before << change << after; };
    const Change name = [](auto &record) { record.setName(QStringLiteral("New")); };
    const Change noName = [](auto &record) { record.setName(QString()); };
    const Change icon = [](auto &record) { record.setIcon(QStringLiteral("i")); };
    const Change local = [](auto &record) { record.setLocalName(QStringLiteral("Neu")); };
    const Change noTerminal = [](auto &record) { record.setTerminal(false); };

    row("value", Header + "#c\n\nName=A\nX-a = 1\nName[fr]=F\n", name,
        Header + "#c\n\nName=New\nX-a = 1\nName[fr]=F\n");
    row("value with blanks before it", Header + " Name \t=  A\n", name, Header + " Name \t=  New\n");
    row("value in the last line", Header + "Name=A", name, Header + "Name=New");
    row("value with carriage return", "[Desktop Entry]\r\nName=A\r\nIcon=x\r\n", name,
        "[Desktop Entry]\r\nName=New\r\nIcon=x\r\n");
    row("byte order mark", "\xEF\xBB\xBF" + Header + "Name=A\n", name,
        "\xEF\xBB\xBF" + Header + "Name=New\n");
    row("malformed value", Header + "Name=\xFF\n", name, Header + "Name=New\n");
    row("empty value", Header + "Name=\nIcon=i\n", name, Header + "Name=New\nIcon=i\n");
    row("the last of duplicates", Header + "Name=A\nName=B\n", name, Header + "Name=A\nName=New\n");
    row("the last of duplicate groups", Header + "Name=A\n" + Header + "Name=B\n", name,
        Header + "Name=A\n" + Header + "Name=New\n");
    row("malformed lines elsewhere stay", Header + "Icon=\xFF\nName=A\n", name,
        Header + "Icon=\xFF\nName=New\n");

    row("removal", Header + "Icon=i\nName=A\nName[de]=B\n#end\n", noName,
        Header + "Icon=i\nName[de]=B\n#end\n");
    row("removal of the last line", Header + "Icon=i\nName=A", noName, Header + "Icon=i\n");
    row("removal of all duplicates", Header + "Name=A\nIcon=i\nName=B\n" + Header + "Name=C\n", noName,
        Header + "Icon=i\n" + Header);

    row("new key", Header + "Name=A\n", icon, Header + "Name=A\nIcon=i\n");
    row("new key before trailing blanks and comments", Header + "Name=A\n\n# end\n\n[Other]\nx=y\n", icon,
        Header + "Name=A\nIcon=i\n\n# end\n\n[Other]\nx=y\n");
    row("new key in an empty group", Header + "# only\n", icon, Header + "Icon=i\n# only\n");
    row("new key behind a line without end", Header + "Name=A", icon, Header + "Name=A\nIcon=i\n");
    row("new key behind a header without end", "[Desktop Entry]", icon, Header + "Icon=i\n");
    row("new key with carriage returns", "[Desktop Entry]\r\nName=A\r\n", icon,
        "[Desktop Entry]\r\nName=A\r\nIcon=i\r\n");
    row("new key with carriage returns but at the end", "[Desktop Entry]\r\nName=A", icon,
        "[Desktop Entry]\r\nName=A\r\nIcon=i\r\n");
    row("new key in a file without the group", "# mine\n", icon, "# mine\n\n" + Header + "Icon=i\n");
    row("new key in a file of other groups", "# mine\n\n# other\n[Other]\nx=y\n", icon,
        "# mine\n\n" + Header + "Icon=i\n\n# other\n[Other]\nx=y\n");
    row("new key in an empty file", "", icon, Header + "Icon=i\n");
    row("new key in a file with a mark only", "\xEF\xBB\xBF", icon, "\xEF\xBB\xBF" + Header + "Icon=i\n");

    row("new variant behind its key", Header + "Name=A\nIcon=i\n", local,
        Header + "Name=A\nName[de]=Neu\nIcon=i\n");
    row("new variant behind the other variants", Header + "Name=A\nName[fr]=F\nIcon=i\n#c\n", local,
        Header + "Name=A\nName[fr]=F\nName[de]=Neu\nIcon=i\n#c\n");
    row("new variant without its key", Header + "Icon=i\n", local, Header + "Icon=i\nName[de]=Neu\n");
    const auto translated = [](auto &record) {
        record.setLocalName(QStringLiteral("Neu"));
        record.setName(QStringLiteral("New"));
    };
    row("new variant set before its new key", Header + "Icon=i\n", translated,
        Header + "Icon=i\nName=New\nName[de]=Neu\n");
    row("new variant set before its new key in a new file", "", translated,
        Header + "Name=New\nName[de]=Neu\n");
    row("new key before its variants", Header + "Name[fr]=F\nIcon=i\nName[ja]=J\n", translated,
        Header + "Name=New\nName[fr]=F\nIcon=i\nName[ja]=J\nName[de]=Neu\n");
    row(
        "new key before a variant that goes", Header + "Icon=i\n#c\nName[de]=A\nName[fr]=F\n",
        [](auto &record) {
            record.setName(QStringLiteral("New"));
            record.setLocalName({});
        },
        Header + "Icon=i\n#c\nName=New\nName[fr]=F\n");
    row(
        "new variant and new key", Header + "Name=A\n",
        [](auto &record) {
            record.setIcon(QStringLiteral("i"));
            record.setComment(QStringLiteral("c"));
            record.setLocalIcon(QStringLiteral("l"));
            record.setLocalName(QStringLiteral("Neu"));
        },
        Header + "Name=A\nName[de]=Neu\nIcon=i\nIcon[de]=l\nComment=c\n");

    row("false where true stands", Header + "Terminal=true\n", noTerminal, Header + "Terminal=false\n");
    row(
        "list", Header + "Keywords=a;;b\n",
        [](auto &record) {
            record.setKeywords({text("a"), text(""), text("c")});
        },
        Header + "Keywords=a;c;\n");
    row(
        "list that became empty", Header + "Keywords=a;\nName=A\n",
        [](auto &record) { record.setKeywords({QString()}); }, Header + "Name=A\n");
    row(
        "removal and new key", Header + "Name=A\n\n[Other]\n",
        [](auto &record) {
            record.setName({});
            record.setIcon(QStringLiteral("i"));
        },
        Header + "Icon=i\n\n[Other]\n");
}

void tst_VelUIDesktopEntryChanges::writesOnlyTheLinesOfChangedKeys()
{
    QFETCH(QByteArray, before);
    QFETCH(Change, change);
    QFETCH(QByteArray, after);
    QCOMPARE(changed(before, change), after);
}

void tst_VelUIDesktopEntryChanges::changesNothingWhenASetterGetsTheGettersValue_data()
{
    QTest::addColumn<QByteArray>("value");
    QTest::newRow("absent") << QByteArray();
    QTest::newRow("empty") << QByteArray("@=\n");
    QTest::newRow("blank") << QByteArray("@ =  \n");
    QTest::newRow("text") << QByteArray("@=true\n");
    QTest::newRow("escapes written in another way") << QByteArray("@=a\\sb\\q\tc\n");
    QTest::newRow("list with empty items and no end") << QByteArray("@=a;;b\n");
    QTest::newRow("list of nothing") << QByteArray("@=;;\n");
    QTest::newRow("malformed") << QByteArray("@=\xFF\n");
    QTest::newRow("no flag") << QByteArray("@=0\n");
    QTest::newRow("duplicates") << QByteArray("@=x\n@=y\n");
}

void tst_VelUIDesktopEntryChanges::changesNothingWhenASetterGetsTheGettersValue()
{
    QFETCH(QByteArray, value);
    QByteArray bytes = Header + "# comment\n";
    for (const TextField &field : Texts)
        bytes += QByteArray(value).replace('@', field.key);
    for (const ListField &field : Lists)
        bytes += QByteArray(value).replace('@', field.key);
    for (const FlagField &field : Flags)
        bytes += QByteArray(value).replace('@', field.key);
    QCOMPARE(changed(bytes,
                     [](VelUIDesktopEntry &record) {
                         for (const TextField &field : Texts)
                             (record.*field.set)((record.*field.get)());
                         for (const ListField &field : Lists)
                             (record.*field.set)((record.*field.get)());
                         for (const FlagField &field : Flags)
                             (record.*field.set)((record.*field.get)());
                         record.setActions(record.getActions());
                     }),
             bytes);
}

void tst_VelUIDesktopEntryChanges::doesNotTouchTheFileWhenNothingChanged()
{
    const QString file = write(QStringLiteral("x.desktop"), Header + "Name=A");
    struct stat before;
    QCOMPARE(::stat(qPrintable(file), &before), 0);
    VelUIDesktopEntry record(file);
    record.setName(QStringLiteral("A"));
    QVERIFY(record.save());
    struct stat after;
    QCOMPARE(::stat(qPrintable(file), &after), 0);
    QCOMPARE(after.st_ino, before.st_ino);
    QCOMPARE(after.st_mtim.tv_nsec, before.st_mtim.tv_nsec);
    QCOMPARE(after.st_ctim.tv_nsec, before.st_ctim.tv_nsec);
}

void tst_VelUIDesktopEntryChanges::completesALastLineThatLacksHalfItsEnd_data()
{
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<QByteArray>("after");
    QTest::newRow("behind line feeds") << Header + "Name=A\nX-K=k\r" << Header + "Name=A\nX-K=k\r\nIcon=i\n";
    QTest::newRow("behind both") << QByteArray("[Desktop Entry]\r\nName=A\r\nX-K=k\r")
                                 << QByteArray("[Desktop Entry]\r\nName=A\r\nX-K=k\r\nIcon=i\r\n");
    QTest::newRow("two of them") << QByteArray("[Desktop Entry]\r\nX-K=k\r\r")
                                 << QByteArray("[Desktop Entry]\r\nX-K=k\r\r\nIcon=i\r\n");
    QTest::newRow("a header") << QByteArray("#c\r\n[Desktop Entry]\r")
                              << QByteArray("#c\r\n[Desktop Entry]\r\nIcon=i\r\n");
    QTest::newRow("none of it") << QByteArray("[Desktop Entry]\r\nX-K=k")
                                << QByteArray("[Desktop Entry]\r\nX-K=k\r\nIcon=i\r\n");
}

void tst_VelUIDesktopEntryChanges::completesALastLineThatLacksHalfItsEnd()
{
    QFETCH(QByteArray, before);
    QFETCH(QByteArray, after);
    QCOMPARE(changed(before, [](auto &record) { record.setIcon(QStringLiteral("i")); }), after);
}

void tst_VelUIDesktopEntryChanges::forgetsAChangeThatWasTakenBack()
{
    const QByteArray bytes = Header + "Name=a\\sb\nKeywords=a;b\nTerminal=1\nName[de]=x\n";
    QCOMPARE(changed(bytes,
                     [](VelUIDesktopEntry &record) {
                         record.setName(QStringLiteral("x"));
                         record.setName(QStringLiteral("a b"));
                         record.setKeywords({});
                         record.setKeywords({QStringLiteral("a"), QStringLiteral("b")});
                         record.setTerminal(false);
                         record.setTerminal(true);
                         record.setLocalName({});
                         record.setLocalName(QStringLiteral("x"));
                         record.setIcon(QStringLiteral("new"));
                         record.setIcon({});
                         record.setHidden(true);
                         record.setHidden(false);
                     }),
             bytes);
}

void tst_VelUIDesktopEntryChanges::startsANewFileWithItsGroupAndTheKeysInTheirOrder()
{
    const QString file = path(QStringLiteral("new.desktop"));
    VelUIDesktopEntry record;
    record.setFilePath(file);
    QVERIFY(!record.load());
    VelUIDesktopAction action(QStringLiteral("a"));
    action.setName(QStringLiteral("Do"));
    record.setActions({action});
    record.setType(QStringLiteral("Application"));
    record.setIcon(QStringLiteral("i"));
    record.setName(QStringLiteral("N"));
    record.setHidden(false);
    record.setIcon(QStringLiteral("j"));
    record.setComment({});
    record.setKeywords({QStringLiteral("a"), QStringLiteral("b")});
    QVERIFY(record.save());
    QCOMPARE(
        read(file),
        Header
            + "Actions=a;\nType=Application\nIcon=j\nName=N\nKeywords=a;b;\n\n[Desktop Action a]\nName=Do\n");
}

void tst_VelUIDesktopEntryChanges::writesTheLocalVariantThatTheGetterFound_data()
{
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("before");
    QTest::addColumn<QString>("value");
    QTest::addColumn<QByteArray>("after");
    const auto row = [](const char *name, const char *locale, const char *before, const char *value,
                        const char *after) {
        QTest::newRow(name) << QByteArray(locale) << QByteArray(before) << text(value) << QByteArray(after);
    };
    row("the exact one", "de_DE.UTF-8", "Name=a\nName[de]=b\nName[de_DE]=c\n", "X",
        "Name=a\nName[de]=b\nName[de_DE]=X\n");
    row("the less exact one", "de_DE.UTF-8", "Name=a\nName[de]=b\nName[de_AT]=c\n", "X",
        "Name=a\nName[de]=X\nName[de_AT]=c\n");
    row("a new one for the language", "de_DE.UTF-8", "Name=a\nName[de_AT]=c\n", "X",
        "Name=a\nName[de_AT]=c\nName[de]=X\n");
    row("a new one by country", "pt_BR.UTF-8", "Name=a\n", "X", "Name=a\nName[pt_BR]=X\n");
    row("a new one for no locale", "C", "Name=a\n", "X", "Name=a\nName[en]=X\n");
    row("the malformed one", "de_DE.UTF-8", "Name=a\nName[de]=\xFF\n", "X", "Name=a\nName[de]=X\n");
    row("removal of the one found", "de_DE.UTF-8", "Name=a\nName[de]=b\nName[de_DE]=c\n", "",
        "Name=a\nName[de]=b\n");
    row("removal of duplicates", "de_DE.UTF-8", "Name[de]=a\nName=a\nName[de]=b\n", "", "Name=a\n");
    row("removal of nothing", "de_DE.UTF-8", "Name=a\nName[fr]=b\n", "", "Name=a\nName[fr]=b\n");
}

void tst_VelUIDesktopEntryChanges::writesTheLocalVariantThatTheGetterFound()
{
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, before);
    QFETCH(QString, value);
    QFETCH(QByteArray, after);
    qputenv("LANG", locale);
    QCOMPARE(changed(Header + before, [value](auto &record) { record.setLocalName(value); }), Header + after);
}

void tst_VelUIDesktopEntryChanges::dropsWhatBelongsToTheOldTypeOnly()
{
    const QByteArray common =
        "Name=A\nName[fr]=B\nIcon=i\nHidden=true\nOnlyShowIn=VEL;\nX-Own=1\nX-Own[de]=2\n";
    const QByteArray application =
        "Exec=e\nTryExec=t\nPath=p\nTerminal=true\nActions=a;\nMimeType=a/b;\nCategories=C;\n"
        "Keywords=k;\nKeywords[fr]=k;\nKeywords[de]=k;\nStartupNotify=true\n"
        "StartupWMClass=c\nPrefersNonDefaultGPU=true\nSingleMainWindow=true\n";
    const QByteArray groups =
        "\n[Desktop Action a]\nName=Do\n\n[Desktop Action nobody]\nName=Stay\n\n[X-Group]\nExec=e\n";
    const QByteArray nobody = "\n[Desktop Action nobody]\nName=Stay\n\n[X-Group]\nExec=e\n";

    const Change toLink = [](auto &record) { record.setType(QStringLiteral("Link")); };
    QCOMPARE(changed(Header + "Type=Application\n" + application + common + "URL=u\n" + groups, toLink),
             Header + "Type=Link\n" + common + "URL=u\n" + nobody);
    const Change toDirectory = [](auto &record) { record.setType(QStringLiteral("Directory")); };
    QCOMPARE(changed(Header + "Type=Link\n" + common + "URL=u\nSortOrder=a;\nExec=e\n", toDirectory),
             Header + "Type=Directory\n" + common + "SortOrder=a;\nExec=e\n");
    const Change toApplication = [](auto &record) { record.setType(QStringLiteral("Application")); };
    QCOMPARE(changed(Header + "Type=Directory\n" + common + "SortOrder=a;\n", toApplication),
             Header + "Type=Application\n" + common + "SortOrder=a;\n");
    QCOMPARE(changed(Header + "Exec=e\nURL=u\n", toApplication),
             Header + "Exec=e\nURL=u\nType=Application\n");
    QCOMPARE(changed(Header + "Type=Application\n",
                     [](auto &record) {
                         record.setExec(QStringLiteral("new"));
                         record.setLocalKeywords({QStringLiteral("new")});
                         record.setType(QStringLiteral("Link"));
                     }),
             Header + "Type=Link\n");
}

void tst_VelUIDesktopEntryChanges::keepsEverythingWhenTheTypeStays()
{
    const QByteArray bytes = Header + "Type=Link\nURL=u\nExec=e\n";
    QCOMPARE(changed(bytes, [](auto &record) { record.setType(QStringLiteral("Link")); }), bytes);
}

void tst_VelUIDesktopEntryChanges::removesAKeyOfManyLanguagesInLinearTime()
{
    const auto removal = [this](int languages) {
        QByteArray lines;
        for (int i = 0; i < languages; ++i)
            lines += "Keywords[l" + QByteArray::number(i) + "]=a\n";
        const QByteArray bytes = Header + "Type=Application\nName=A\nKeywords=a\n" + lines;
        return [this, bytes] {
            const QString file = write(QStringLiteral("x.desktop"), bytes);
            VelUIDesktopEntry record(file);
            record.setType(QStringLiteral("Link"));
            if (!record.save() || read(file) != Header + "Type=Link\nName=A\n")
                QTest::qFail("not removed", __FILE__, __LINE__);
        };
    };
    const double growth = Growth::of(removal(1000), removal(1000 * Growth::Factor));
    QVERIFY2(growth < Growth::Most, qPrintable(QString::number(growth)));
}

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopEntryChanges)
#include "tst_VelUIDesktopEntryChanges.moc"
