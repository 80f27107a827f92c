// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <DesktopEntryChanges.h>
#include <DesktopEntryText.h>
#include <DesktopEntryWriter.h>
#include <MessageLocale.h>
#include <ProgramSearch.h>

#include <QElapsedTimer>
#include <QMap>

#include <random>

/// The parts of the text engine, each by itself.
class tst_DesktopEntryText : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void findsTheSameAsAPlainWalkOverTheLines();
    void findsAGroupAmongThousands();
    void tellsVariantsOfOneKeyApart_data();
    void tellsVariantsOfOneKeyApart();
    void takesOddLinesAmongVariantsForWhatTheyAre_data();
    void takesOddLinesAmongVariantsForWhatTheyAre();
    void takesNoCommentForAKey();
    void forgetsChangesOfRemovedGroups();
    void keepsTheOrderOfTheFirstSetting();
    void ranksLocales();
    void takesTheTimeThatTheSizeAsksFor();
    void searchesAsAShellDoes();
};

namespace {

std::string_view view(const QByteArray &bytes)
{
    return {bytes.constData(), std::size_t(bytes.size())};
}

// A text is indexed for the user's language: the odd numbers stand for German.
void setLanguage(int number)
{
    qputenv("LANG", number % 2 ? "de_DE.UTF-8" : "fr_FR.UTF-8");
}

} // namespace

void tst_DesktopEntryText::findsTheSameAsAPlainWalkOverTheLines()
{
    std::mt19937 random(7);
    const QByteArrayList names = {"Name",    "Nome", "Nbme", "Name[de]", "Name[df]",
                                  "Name[d]", "Icon", "N",    "Exec"};
    for (int round = 0; round < 1000; ++round) {
        setLanguage(round);
        QByteArray bytes = "[G]\n";
        QMap<QByteArray, QByteArray> expected;
        for (int i = 0; i < 20; ++i) {
            const QByteArray name = names.at(int(random() % unsigned(names.size())));
            bytes += name + "=" + QByteArray::number(i) + "\n";
            expected[name] = QByteArray::number(i);
        }
        const DesktopEntryText text(bytes);
        for (const QByteArray &name : names) {
            const QByteArray locale = name.contains('[') ? name.mid(5).chopped(1) : QByteArray();
            const QByteArray base = name.split('[').constFirst();
            const auto key = text.key(text.group("G"), view(base), view(locale));
            QCOMPARE(key.has_value(), expected.contains(name));
            if (key)
                QVERIFY(text.value(*key) == view(expected[name]));
        }
    }
}

void tst_DesktopEntryText::findsAGroupAmongThousands()
{
    QByteArray bytes;
    for (int i = 0; i < 5000; ++i)
        bytes += "[g" + QByteArray::number(i % 4000) + "]\nk=" + QByteArray::number(i) + "\n";
    const DesktopEntryText text(bytes);
    QCOMPARE(text.groups().size(), std::size_t(5000));
    QCOMPARE(text.group("g999"), 4999);
    QCOMPARE(text.group("g3999"), 3999);
    QCOMPARE(text.group("g5000"), DesktopEntryText::NoGroup);
    QVERIFY(text.value(*text.key(text.group("g999"), "k")) == "4999");
}

void tst_DesktopEntryText::tellsVariantsOfOneKeyApart_data()
{
    QTest::addColumn<int>("language");
    QTest::newRow("of another language than the user's") << 0;
    QTest::newRow("of the user's language") << 1;
}

void tst_DesktopEntryText::tellsVariantsOfOneKeyApart()
{
    QFETCH(int, language);
    setLanguage(language);
    const DesktopEntryText text("[G]\nName=0\nName[de]=1\nName[fr]=4\nName[de_AT]=2\nNome[de]=3\n"
                                "Name[it]=5\nName[dE]=6\nName[de@a]=7\nName[d]=8\n");
    QStringList all;
    QStringList german;
    const auto note = [&text](QStringList *to) {
        return [&text, to](const DesktopEntryText::Key &key) {
            to->append(QString::fromStdString(std::string(text.locale(key))));
        };
    };
    text.forEachVariant(0, "Name", note(&all));
    text.forEachVariant(0, "Name", note(&german), "de");
    QCOMPARE(all.join(QLatin1Char(' ')), QStringLiteral("de fr de_AT it dE de@a d"));
    QCOMPARE(german.join(QLatin1Char(' ')), QStringLiteral("de de_AT de@a"));
}

void tst_DesktopEntryText::takesOddLinesAmongVariantsForWhatTheyAre_data()
{
    QTest::addColumn<QByteArray>("text");
    QTest::addColumn<QByteArray>("key");
    QTest::addColumn<QByteArray>("locale");
    QTest::addColumn<QByteArray>("value");
    const QByteArray none("(none)");
    const auto row = [](const char *name, const QByteArray &lines, const char *key, const char *locale,
                        const QByteArray &value) {
        QTest::newRow(name) << lines << QByteArray(key) << QByteArray(locale) << value;
    };
    row("no end of line", "K=0\nK[de]=1", "K", "de", "1");
    row("nothing behind the sign", "K=0\nK[de]=", "K", "de", "");
    row("another line end", "K=0\r\nK[de]=1\r\n", "K", "de", "1");
    row("blanks around the sign", "K=0\nK[de] = 1\n", "K", "de", "1");
    row("blanks before the key", "K=0\n K[de]=1\n", "K", "de", "1");
    row("a comment between", "K=0\n#\nK[de]=1\n", "K", "de", "1");
    row("another key between", "K=0\nL=2\nK[de]=1\n", "K", "de", "1");
    row("no closing bracket", "K=0\nK[de=1\n", "K[de", "", "1");
    row("no language", "K=0\nK[]=1\n", "K[]", "", "1");
    row("no sign", "K=0\nK[de]\nK[fr]=1\n", "K", "de", none);
    row("behind one without a sign", "K=0\nK[de]\nK[fr]=1\n", "K", "fr", "1");
    row("a blank in the language", "K=0\nK[d e]=1\n", "K", "d e", "1");
    row("bytes in the language", "K=0\nK[\xC3\xBC]=1\n", "K", "\xC3\xBC", "1");
    row("a bracket in the language", "K=0\nK[d[e]=1\n", "K", "d[e", "1");
    row("two closing brackets", "K=0\nK[de]]=1\n", "K", "de]", "1");
    row("a bracket in the key above", "K[d=0\nK[d[e]=1\n", "K", "d[e", "1");
    row("a longer key", "K=0\nKK[de]=1\n", "KK", "de", "1");
    row("the group above", "K=0\n[H]\nK[de]=1\n", "K", "de", none);
}

void tst_DesktopEntryText::takesOddLinesAmongVariantsForWhatTheyAre()
{
    QFETCH(QByteArray, text);
    QFETCH(QByteArray, key);
    QFETCH(QByteArray, locale);
    QFETCH(QByteArray, value);
    for (int language = 0; language < 2; ++language) {
        setLanguage(language);
        const DesktopEntryText entry("[G]\n" + text);
        const auto found = entry.key(entry.group("G"), view(key), view(locale));
        QCOMPARE(found ? QByteArray::fromStdString(std::string(entry.value(*found))) : QByteArray("(none)"),
                 value);
        if (text.contains("[H]"))
            QVERIFY(entry.key(entry.group("H"), view(key), view(locale)));
    }
}

void tst_DesktopEntryText::takesNoCommentForAKey()
{
    for (const char *comment : {"#=0", "#a=0", " #a=0", "#a[de]=0", "#[G]"}) {
        const DesktopEntryText text("[G]\n" + QByteArray(comment) + "\n");
        QCOMPARE(text.groups().size(), std::size_t(1));
        // A new key goes above the comment.
        QCOMPARE(text.keysEnd(text.groups().front()), 4U);
    }
}

void tst_DesktopEntryText::forgetsChangesOfRemovedGroups()
{
    DesktopEntryChanges changes;
    changes.set({"G", "k", "", "1"});
    changes.set({"H", "k", "", "2"});
    changes.removeGroups({"G"});
    QVERIFY(changes.isRemoved("G") && !changes.isRemoved("H"));
    QVERIFY(!changes.find("G", "k", ""));
    QCOMPARE(*changes.find("H", "k", "")->value, std::string("2"));
    changes.drop("H", "k", "");
    QVERIFY(changes.all().empty() && !changes.isEmpty());
}

void tst_DesktopEntryText::keepsTheOrderOfTheFirstSetting()
{
    DesktopEntryChanges changes;
    for (const char *key : {"c", "a", "b", "a"})
        changes.set({"G", key, "", key});
    changes.drop("G", "c", "");
    changes.set({"G", "c", "", "c"});
    QCOMPARE(DesktopEntryWriter::apply(DesktopEntryText("[Desktop Entry]\n[G]\n"), changes),
             QByteArray("[Desktop Entry]\n[G]\na=a\nb=b\nc=c\n"));
}

void tst_DesktopEntryText::ranksLocales()
{
    const MessageLocale locale("sr_RS.UTF-8@latin");
    QCOMPARE(locale.rank("sr_RS@latin"), 4);
    QCOMPARE(locale.rank("sr_RS"), 3);
    QCOMPARE(locale.rank("sr@latin"), 2);
    QCOMPARE(locale.rank("sr"), 1);
    for (const char *other :
         {"", "s", "srp", "sr_", "sr_RSX", "sr_RS@", "sr_RS@latinx", "sr@", "SR", "sr_RS.UTF-8"})
        QVERIFY2(locale.rank(other) == 0, other);
    for (int rank = 1; rank <= MessageLocale::BestRank; ++rank)
        QCOMPARE(locale.rank(locale.keyLocale(rank)), rank);
    QVERIFY(MessageLocale("de").keyLocale(2).empty() && MessageLocale("de").keyLocale(3).empty());
}

void tst_DesktopEntryText::takesTheTimeThatTheSizeAsksFor()
{
    // As many keys as a file can have: a walk over all for each would not end in this life.
    QByteArray bytes = "[Desktop Entry]\n";
    DesktopEntryChanges changes;
    for (int i = 0; i < 40000; ++i) {
        bytes += "K" + QByteArray::number(i) + "=1\n[Desktop Action " + QByteArray::number(i) + "]\n";
        changes.set({"New" + std::to_string(i % 1000), "k" + std::to_string(i), "", "v"});
    }
    const DesktopEntryText text(bytes);
    QElapsedTimer timer;
    timer.start();
    const QByteArray result = DesktopEntryWriter::apply(text, changes);
    QVERIFY(result.size() > bytes.size());
    QVERIFY2(timer.elapsed() < 20000, QByteArray::number(timer.elapsed()));
}

void tst_DesktopEntryText::searchesAsAShellDoes()
{
    using ProgramSearch::Result;
    QCOMPARE(ProgramSearch::find({}), Result::Missing);
    QCOMPARE(ProgramSearch::find(QStringLiteral("/bin/sh")), Result::Found);
    QCOMPARE(ProgramSearch::find(QStringLiteral("/etc/passwd")), Result::NotExecutable);
    QCOMPARE(ProgramSearch::find(QStringLiteral("sh"), QStringLiteral("/nosuch")), Result::Found);
    QCOMPARE(ProgramSearch::find(QStringLiteral("./sh"), QStringLiteral("/bin")), Result::Found);
    QCOMPARE(ProgramSearch::find(QString(QChar(0))), Result::Missing);
}

VEL_TEST_GUILESS_MAIN(tst_DesktopEntryText)

#include "tst_DesktopEntryText.moc"
