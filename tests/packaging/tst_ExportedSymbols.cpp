// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QProcess>

// What the library exports is a promise to its hosts: the list is checked in, and a symbol that
// comes or goes has to be entered there by hand (see the first lines of the list).
class tst_ExportedSymbols : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();

    void areThoseOfTheList();
    void belongToDocumentedClassesOnly();
    void areOursAlone_data();
    void areOursAlone();

private:
    QStringList m_symbols;
};

void tst_ExportedSymbols::initTestCase()
{
    QProcess nm;
    nm.start(QStringLiteral(VEL_NM),
             {QStringLiteral("--dynamic"), QStringLiteral("--defined-only"), QStringLiteral("--demangle"),
              QStringLiteral("--format=posix"), QStringLiteral("--without-symbol-versions"),
              QStringLiteral(VEL_LIBRARY)});
    QVERIFY(nm.waitForFinished());
    for (const QByteArray &line : nm.readAllStandardOutput().split('\n')) {
        // "name type value size"; a demangled name has blanks of its own.
        static const QRegularExpression pattern(QStringLiteral("^(.*) ([A-Za-z]) [0-9a-f]+( [0-9a-f]+)?$"));
        const QRegularExpressionMatch match = pattern.match(QString::fromUtf8(line));
        // Weak symbols are inline functions and templates of other libraries.
        if (match.hasMatch() && match.captured(2) != QLatin1String("W")
            && match.captured(2) != QLatin1String("w")
            && match.captured(2) != QLatin1String("u")
            // The name of the version that they carry.
            && match.captured(2) != QLatin1String("A") && !match.captured(1).startsWith(QLatin1String("__")))
            m_symbols.append(match.captured(1));
    }
    m_symbols.sort();
    m_symbols.removeDuplicates();
    QVERIFY(!m_symbols.isEmpty());
}

// The same function where Qt has other names for its arguments.
static QString withQtsNames(QString symbol)
{
#if QT_VERSION_MAJOR >= 6
    symbol.replace(QLatin1String("QStringList"), QLatin1String("QList<QString>"));
    symbol.replace(QLatin1String("QFileIconProvider::IconType"),
                   QLatin1String("QAbstractFileIconProvider::IconType"));
#endif
    return symbol;
}

void tst_ExportedSymbols::areThoseOfTheList()
{
    QStringList listed;
    for (const QByteArray &line :
         read(QStringLiteral(VEL_SOURCE_DIR "/tests/packaging/exported-symbols.txt")).split('\n')) {
        if (!line.isEmpty() && !line.startsWith('#'))
            listed.append(withQtsNames(QString::fromUtf8(line)));
    }
    QStringList added;
    for (const QString &symbol : qAsConst(m_symbols)) {
        if (!listed.contains(symbol))
            added.append(QStringLiteral("+ ") + symbol);
    }
    for (const QString &symbol : qAsConst(listed)) {
        if (!m_symbols.contains(symbol))
            added.append(QStringLiteral("- ") + symbol);
    }
    QVERIFY2(added.isEmpty(), qPrintable(added.join(QLatin1Char('\n'))));
}

void tst_ExportedSymbols::belongToDocumentedClassesOnly()
{
    static const QRegularExpression owner(
        QStringLiteral("(?:^|\\s)(VelSettings|VelKeyServer|IShortcutObject|ShortcutsModel|ShortcutClash|"
                       "ShortcutScheme|ShortcutSheet|"
                       "EditShortcutsDialog|VelMenuView|VelMenuDialog"
                       "|VelMimeTypeIconProvider|VelDesktopEntryPropsWidget|VelDesktopEntryEditDialog|"
                       "VelRadioGroupBox)(?:::|$)"));
    for (const QString &symbol : qAsConst(m_symbols))
        QVERIFY2(owner.match(symbol).hasMatch(), qPrintable(symbol));
}

void tst_ExportedSymbols::areOursAlone_data()
{
    QTest::addColumn<QString>("library");
    QTest::addColumn<QString>("ours");
    QTest::newRow("veluiextra") << QStringLiteral(VEL_LIBRARY)
                                << QStringLiteral(
                                       "Vel(Settings|KeyServer|Menu\\w+|MimeTypeIconProvider|Desktop\\w+"
                                       "|RadioGroupBox)|IShortcutObject|Shortcut\\w+|EditShortcutsDialog");
#ifdef VEL_CORE
    QTest::newRow("velcore")
        << QStringLiteral(VEL_CORE)
        << QStringLiteral("Vel|GetVelDir|velInstalledDataDir|velLanguageCode|velSessionConfigSuffix");
    QTest::newRow("veluiaux") << QStringLiteral(
        VEL_AUX) << QStringLiteral("Vel(Icon|IconTheme|Trash|UIDesktopAction|UIDesktopEntry|UIEntriesAhead)");
    QTest::newRow("velintegration")
        << QStringLiteral(VEL_INTEGRATION)
        << QStringLiteral("VelStartMenu|VelWmCommand|WmCommandReceiver|CreateStartMenu|UpdateStartMenu|"
                          "ReadDesktopItemPosition|SaveDesktopItemPosition|SendCommandToWM|velHelpShow");
#endif
}

// No template of Qt or of the standard library that was instantiated here, weak or not, leaves the library.
void tst_ExportedSymbols::areOursAlone()
{
    QFETCH(QString, library);
    QFETCH(QString, ours);
    QProcess nm;
    nm.start(QStringLiteral(VEL_NM),
             {QStringLiteral("--dynamic"), QStringLiteral("--defined-only"), QStringLiteral("--extern-only"),
              QStringLiteral("--demangle"), library});
    QVERIFY(nm.waitForFinished());
    const QRegularExpression pattern(
        QStringLiteral(
            "^[0-9a-f]+ (?:[^A] (?:(?:non-virtual thunk to|typeinfo for|typeinfo name for|vtable for) )?"
            "(?:%1)(?![A-Za-z0-9_]).*|A )(@@?VEL\\w+_1|VEL\\w+_1)$")
            .arg(ours));
    QStringList others;
    int seen = 0;
    for (const QByteArray &line : nm.readAllStandardOutput().split('\n')) {
        if (line.isEmpty())
            continue;
        ++seen;
        if (!pattern.match(QString::fromUtf8(line)).hasMatch())
            others.append(QString::fromUtf8(line));
    }
    QVERIFY(seen > 3);
    QVERIFY2(others.isEmpty(), qPrintable(others.join(QLatin1Char('\n'))));
}

VEL_TEST_GUILESS_MAIN(tst_ExportedSymbols)

#include "tst_ExportedSymbols.moc"
