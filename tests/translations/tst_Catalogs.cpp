// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Catalog.h"
#include "TestCase.h"

#include <QDir>
#include <QProcess>
#include <QTranslator>

namespace {

const QStringList names{QStringLiteral("libveluiextra"), QStringLiteral("veluiextra-tools")};

QStringList languages()
{
    return QStringLiteral("de es fr it ja pl pt_BR ru tr uk zh_CN").split(QLatin1Char(' '));
}

QString sourcePath(const QString &name, const QString &language)
{
    return QStringLiteral(VEL_SOURCE_DIR "/translations/%1_%2.ts").arg(name, language);
}

// The texts with a mnemonic that are seen together: in one menu or on one page.
const QVector<QStringList> &together()
{
    static const auto list = [](const char *texts) {
        return QString::fromLatin1(texts).split(QLatin1Char('|'));
    };
    static const QVector<QStringList> all{
        list("&Read-only|&Button beside the address"),
        list("&Automatic configuration|&Manual configuration|&Direct connection"),
        list("F&lat buttons|S&ection:|&Font:|&Size:"),
        list("&Press keys:"),
        list("Edit the &menu...|Edit an e&ntry...|&Pick an entry...|&Assistance"),
        list("&New|&Open...|&Save...|Insert &date|Insert &time|Insert &rule|&Export keys...|&Import "
             "keys...|Save "
             "cheat sheet as &HTML...|Save cheat sheet as te&xt...|&Copy cheat sheet"),
        list(
            "&Export keys...|&Import keys...|Save cheat sheet as &HTML...|Save cheat sheet as &text...|&Copy "
            "cheat sheet"),
        list("&Keep both|&Replace|&Skip|&Do the same with all further ones"),
        list("&Language:|Te&xt|T&ry"),
        list("&Language or its code, such as pt_BR:"),
        list("&Reset this shortcut"),
        list("&Undo|&Redo|Cu&t|&Copy|&Paste|Select &all|Find selected a&gain|Go to &line..."),
        list("New &folder|New entr&y|&Edit|&Delete|&Hide|Sho&w again|E&xecute|Open containin&g "
             "folder|F&ind|Find "
             "&Next|Cu&t|&Copy|&Paste|Dup&licate|Default &menu...|&Up|D&own|&Sort by name|&Reload"),
        list("Zoom &in|Zoom &out|&Wrap lines|&Fixed-width font|&Proportional font|O&verwrite|&Read only|Wide "
             "cur&sor|"
             "&Center on cursor|Scroll &up|Scroll &down|Scroll to &top|Scroll to botto&m"),
    };
    return all;
}

// What a pattern finds in a text, sorted.
QStringList found(const QString &text, const QRegularExpression &pattern)
{
    QStringList all;
    QRegularExpressionMatchIterator iterator = pattern.globalMatch(text);
    while (iterator.hasNext())
        all.append(iterator.next().captured());
    all.sort();
    return all;
}

// Which of the endings that every language keeps a text has.
QString ending(const QString &text)
{
    if (text.endsWith(QLatin1String("...")))
        return QStringLiteral("...");
    // Chinese has a colon of its own, as wide as its other signs.
    if (text.endsWith(QLatin1Char(':')) || text.endsWith(QChar(0xff1a)))
        return QStringLiteral(":");
    return QString();
}

QChar mnemonic(const QString &text)
{
    static const QRegularExpression pattern(QStringLiteral("&([^&\\s])"));
    const QString key = pattern.match(text).captured(1);
    return key.isEmpty() ? QChar() : key.at(0).toLower();
}

// What stands in one of the lists only.
QString difference(const QStringList &expected, const QStringList &actual)
{
    QStringList lines;
    for (const QString &line : expected) {
        if (!actual.contains(line))
            lines.append(QStringLiteral("- ") + line);
    }
    for (const QString &line : actual) {
        if (!expected.contains(line))
            lines.append(QStringLiteral("+ ") + line);
    }
    return lines.join(QLatin1Char('\n'));
}

} // namespace

class tst_Catalogs : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void existForEveryLanguageAndForNoOther();

    void haveEveryTextFinished_data() { addCatalogs(); }
    void haveEveryTextFinished();
    void keepWhatIsNoWord_data() { addCatalogs(); }
    void keepWhatIsNoWord();
    void keepBlanksLinesAndEndings_data() { addCatalogs(); }
    void keepBlanksLinesAndEndings();
    void giveEachMnemonicOncePerMenu_data();
    void giveEachMnemonicOncePerMenu();
    void knowTheMenuOfEveryMnemonic();
    void compileWithoutAComplaint_data() { addCatalogs(); }
    void compileWithoutAComplaint();
    void translateWhenCompiled_data() { addCatalogs(); }
    void translateWhenCompiled();

    void haveTheTextsOfTheSources_data();
    void haveTheTextsOfTheSources();
    void listEveryTextOfTheLibrary();

    void makeAnIdOfPlainLetters();

private:
    void addCatalogs();
    Catalog extract(const QStringList &folders);
};

void tst_Catalogs::addCatalogs()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("language");
    for (const QString &name : names) {
        for (const QString &language : languages())
            QTest::newRow(qPrintable(name + QLatin1Char('_') + language)) << name << language;
    }
}

void tst_Catalogs::existForEveryLanguageAndForNoOther()
{
    QStringList expected;
    for (const QString &name : names) {
        for (const QString &language : languages())
            expected.append(name + QLatin1Char('_') + language + QLatin1String(".ts"));
    }
    const QDir folder(QStringLiteral(VEL_SOURCE_DIR "/translations"));
    QCOMPARE(folder.entryList({QStringLiteral("*.ts")}, QDir::Files, QDir::Name), expected);
}

void tst_Catalogs::haveEveryTextFinished()
{
    QFETCH(QString, name);
    QFETCH(QString, language);
    const Catalog catalog = Catalog::read(sourcePath(name, language));
    QCOMPARE(catalog.error, QString());
    QCOMPARE(catalog.language, language);
    QVERIFY(!catalog.messages.isEmpty());
    for (const Message &message : catalog.messages) {
        QVERIFY2(message.type.isEmpty(), qPrintable(message.line()));
        QVERIFY2(!message.translation.trimmed().isEmpty(), qPrintable(message.line()));
    }
}

// Marks that are filled in, and what a program or a file format reads.
void tst_Catalogs::keepWhatIsNoWord()
{
    QFETCH(QString, name);
    QFETCH(QString, language);
    static const QRegularExpression pattern(
        QStringLiteral("%[0-9n]|--[a-z]+[a-z-]*|</?[a-z]+>|<a "
                       "href=\"[^\"]*\">|https://[a-z.]+|vel-wm|VEL_COMMAND|openbox|json"
                       "|\\[Desktop Entry\\]|Desktop Entry Standard|Actions\\b(?=[\\s\\x{a0}]*['»”“\"」])"));
    for (const Message &message : Catalog::read(sourcePath(name, language)).messages) {
        QVERIFY2(found(message.translation, pattern) == found(message.source, pattern),
                 qPrintable(message.line() + QLatin1Char('\n') + message.translation));
    }
}

void tst_Catalogs::keepBlanksLinesAndEndings()
{
    QFETCH(QString, name);
    QFETCH(QString, language);
    static const QRegularExpression outer(QStringLiteral("^\\s+|\\s+$"));
    for (const Message &message : Catalog::read(sourcePath(name, language)).messages) {
        const QByteArray where = qPrintable(message.line() + QLatin1Char('\n') + message.translation);
        QVERIFY2(found(message.translation, outer) == found(message.source, outer), where);
        QVERIFY2(message.translation.count(QLatin1Char('\n')) == message.source.count(QLatin1Char('\n')),
                 where);
        QVERIFY2(ending(message.translation) == ending(message.source), where);
        QVERIFY2(!message.translation.contains(QLatin1String("  ")), where);
    }
}

void tst_Catalogs::giveEachMnemonicOncePerMenu_data()
{
    QTest::addColumn<QString>("language");
    QTest::newRow("en") << QString();
    for (const QString &language : languages())
        QTest::newRow(qPrintable(language)) << language;
}

void tst_Catalogs::giveEachMnemonicOncePerMenu()
{
    QFETCH(QString, language);
    const QString read = language.isEmpty() ? QStringLiteral("de") : language;
    for (const QString &name : names) {
        const Catalog catalog = Catalog::read(sourcePath(name, read));
        for (const QStringList &menu : together()) {
            QHash<QChar, Message> taken;
            for (const Message &message : catalog.messages) {
                if (!menu.contains(message.source))
                    continue;
                const QString text = language.isEmpty() ? message.source : message.translation;
                const QChar key = mnemonic(text);
                QVERIFY2(!key.isNull(), qPrintable(text));
                // The same text may stand in a box of another context as well.
                const Message other = taken.value(key);
                const bool isOfAnotherBox =
                    other.source == message.source && other.context != message.context;
                QVERIFY2(!taken.contains(key) || isOfAnotherBox,
                         qPrintable(text + QLatin1String(", ") + other.source));
                taken.insert(key, message);
            }
        }
    }
}

// A new text with a mnemonic has to be entered with the others of its menu or page.
void tst_Catalogs::knowTheMenuOfEveryMnemonic()
{
    for (const QString &name : names) {
        for (const QString &language : languages()) {
            for (const Message &message : Catalog::read(sourcePath(name, language)).messages) {
                const bool known =
                    std::any_of(together().begin(), together().end(),
                                [&](const QStringList &menu) { return menu.contains(message.source); });
                QVERIFY2(known == !mnemonic(message.source).isNull(), qPrintable(message.line()));
                QVERIFY2(known == !mnemonic(message.translation).isNull(), qPrintable(message.translation));
            }
        }
    }
}

void tst_Catalogs::compileWithoutAComplaint()
{
    QFETCH(QString, name);
    QFETCH(QString, language);
    QProcess lrelease;
    lrelease.setProcessChannelMode(QProcess::MergedChannels);
    lrelease.start(QStringLiteral(VEL_LRELEASE),
                   {sourcePath(name, language), QStringLiteral("-qm"), path(QStringLiteral("catalog.qm"))});
    QVERIFY(lrelease.waitForFinished());
    QCOMPARE(lrelease.exitCode(), 0);
    const QString said = QString::fromUtf8(lrelease.readAll());
    QVERIFY2(said.contains(QLatin1String("finished and 0 unfinished)")), qPrintable(said));
    QVERIFY2(!said.contains(QLatin1String("Ignored")), qPrintable(said));
    QVERIFY2(!said.contains(QLatin1String("Warning"), Qt::CaseInsensitive), qPrintable(said));
}

void tst_Catalogs::translateWhenCompiled()
{
    QFETCH(QString, name);
    QFETCH(QString, language);
    QTranslator translator;
    QVERIFY(translator.load(name + QLatin1Char('_') + language, QStringLiteral(VEL_COMPILED_DIR)));
    for (const Message &message : Catalog::read(sourcePath(name, language)).messages) {
        QCOMPARE(translator.translate(message.context.toUtf8().constData(),
                                      message.source.toUtf8().constData(),
                                      message.comment.toUtf8().constData(), message.number),
                 message.translation);
    }
}

// What lupdate finds in the folders; it has to find it without a complaint.
Catalog tst_Catalogs::extract(const QStringList &folders)
{
    const QString file = path(QStringLiteral("extracted.ts"));
    QStringList arguments{QStringLiteral("-silent"), QStringLiteral("-no-obsolete"),
                          QStringLiteral("-locations"), QStringLiteral("none")};
    for (const QString &folder : folders)
        arguments.append(QStringLiteral(VEL_SOURCE_DIR "/") + folder);
    arguments << QStringLiteral("-ts") << file;
    QProcess lupdate;
    lupdate.start(QStringLiteral(VEL_LUPDATE), arguments);
    Catalog catalog;
    if (!lupdate.waitForFinished() || lupdate.exitCode() != 0)
        catalog.error = QStringLiteral("lupdate failed");
    else
        catalog = Catalog::read(file);
    catalog.error += QString::fromUtf8(lupdate.readAllStandardError());
    return catalog;
}

void tst_Catalogs::haveTheTextsOfTheSources_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("sources");
    QTest::newRow("library") << names.at(0) << QStringLiteral("src");
    QTest::newRow("programs") << names.at(1) << QStringLiteral("apps");
}

void tst_Catalogs::haveTheTextsOfTheSources()
{
    QFETCH(QString, name);
    QFETCH(QString, sources);
    const Catalog extracted = extract({sources, QStringLiteral("include")});
    QCOMPARE(extracted.error, QString());
    for (const QString &language : languages()) {
        const QStringList lines = Catalog::read(sourcePath(name, language)).lines();
        QVERIFY2(lines == extracted.lines(),
                 qPrintable(language + QLatin1Char('\n') + difference(lines, extracted.lines())));
    }
}

void tst_Catalogs::listEveryTextOfTheLibrary()
{
    QStringList listed;
    for (const QByteArray &line :
         read(QStringLiteral(VEL_SOURCE_DIR "/tests/translations/texts.txt")).split('\n')) {
        if (!line.isEmpty() && !line.startsWith('#'))
            listed.append(QString::fromUtf8(line));
    }
    listed.sort();
    const Catalog extracted = extract({QStringLiteral("src"), QStringLiteral("include")});
    QCOMPARE(extracted.error, QString());
    QVERIFY2(extracted.lines() == listed, qPrintable(difference(listed, extracted.lines())));
}

// The id of a new action becomes part of a group's name, which the format wants in plain letters.
void tst_Catalogs::makeAnIdOfPlainLetters()
{
    static const QRegularExpression plain(QStringLiteral("^[A-Za-z0-9-]+$"));
    for (const QString &language : languages()) {
        int seen = 0;
        for (const Message &message : Catalog::read(sourcePath(names.at(0), language)).messages) {
            if (message.source != QLatin1String("newAction"))
                continue;
            ++seen;
            QVERIFY2(plain.match(message.translation).hasMatch(), qPrintable(message.translation));
        }
        QCOMPARE(seen, 1);
    }
}

VEL_TEST_GUILESS_MAIN(tst_Catalogs)

#include "tst_Catalogs.moc"
