// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>

#include <QDir>
#include <QProcess>
#include <QRegularExpression>

// The checks hold against a copy of the platform's headers, and stop the build against a copy
// that lacks an operation.
class tst_DesktopEntryRecord : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void bringsInBothRecordClasses();
    void acceptsThePlatformsRecords();
    void namesTheOperationThatIsLacking_data();
    void namesTheOperationThatIsLacking();
    void reliesOnNothingThatItDoesNotCheck_data();
    void reliesOnNothingThatItDoesNotCheck();

private:
    void copyHeaders();
    bool compile(QByteArray *messages);
};

void tst_DesktopEntryRecord::bringsInBothRecordClasses()
{
    const VelUIDesktopAction action(QStringLiteral("new-window"));
    QCOMPARE(action.getId(), QStringLiteral("new-window"));
    QVERIFY(!VelUIDesktopEntry().isValid());
}

void tst_DesktopEntryRecord::copyHeaders()
{
    const QStringList includes =
        QStringLiteral(VEL_RECORD_INCLUDES).split(QLatin1Char(':'), Qt::SkipEmptyParts);
    for (const QString &include : includes) {
        const QDir headers(include + QStringLiteral("/veluiaux"));
        for (const QString &name : headers.entryList({QStringLiteral("*.h")}))
            write(QStringLiteral("platform/veluiaux/") + name, read(headers.filePath(name)));
    }
}

bool tst_DesktopEntryRecord::compile(QByteArray *messages)
{
    QStringList arguments{QStringLiteral("-std=c++17"), QStringLiteral("-fPIC"),
                          QStringLiteral("-fsyntax-only"),
                          QStringLiteral("-I") + path(QStringLiteral("platform"))};
    const QStringList includes = QStringLiteral(VEL_QT_INCLUDES).split(QLatin1Char(':'), Qt::SkipEmptyParts);
    for (const QString &include : includes)
        arguments << QStringLiteral("-isystem") << include;
    arguments << QStringLiteral(VEL_RECORD_SOURCE);
    QProcess compiler;
    compiler.setProcessChannelMode(QProcess::MergedChannels);
    compiler.start(QStringLiteral(VEL_CXX), arguments);
    const bool finished = compiler.waitForFinished(120000);
    *messages = compiler.readAll();
    return finished && compiler.exitCode() == 0;
}

void tst_DesktopEntryRecord::acceptsThePlatformsRecords()
{
    copyHeaders();
    QByteArray messages;
    QVERIFY2(compile(&messages), messages);
}

void tst_DesktopEntryRecord::namesTheOperationThatIsLacking_data()
{
    QTest::addColumn<QString>("header");
    QTest::addColumn<QByteArray>("operation");
    QTest::addColumn<QByteArray>("without");
    QTest::addColumn<QByteArray>("message");

    const QString entry = QStringLiteral("VelUIDesktopEntry.h");
    const QString action = QStringLiteral("VelUIDesktopAction.h");
    QTest::newRow("a getter is gone") << entry << QByteArray("QString getURL() const;") << QByteArray()
                                      << QByteArray("lacks the operation QString getURL()");
    QTest::newRow("a getter changes the record")
        << entry << QByteArray("QString getURL() const;") << QByteArray("QString getURL();")
        << QByteArray("lacks the operation QString getURL()");
    QTest::newRow("a list is a text") << entry << QByteArray("QStringList getSortOrder() const;")
                                      << QByteArray("QString getSortOrder() const;")
                                      << QByteArray("lacks the operation QStringList getSortOrder()");
    QTest::newRow("saving tells nothing") << entry << QByteArray("bool save();") << QByteArray("void save();")
                                          << QByteArray("lacks the operation bool save()");
    QTest::newRow("a setter of the action is gone")
        << action << QByteArray("void setExec(const QString &value);") << QByteArray()
        << QByteArray("lacks the operation void setExec");
    QTest::newRow("an action without an id")
        << action << QByteArray("explicit VelUIDesktopAction(const QString &id);") << QByteArray()
        << QByteArray("lacks the constructor (const QString &)");
}

void tst_DesktopEntryRecord::namesTheOperationThatIsLacking()
{
    QFETCH(QString, header);
    QFETCH(QByteArray, operation);
    QFETCH(QByteArray, without);
    QFETCH(QByteArray, message);
    copyHeaders();
    const QString file = QStringLiteral("platform/veluiaux/") + header;
    QByteArray text = read(path(file));
    QVERIFY2(text.contains(operation), operation);
    write(file, text.replace(operation, without));

    QByteArray messages;
    QVERIFY(!compile(&messages));
    QVERIFY2(messages.contains(message), messages);
}

void tst_DesktopEntryRecord::reliesOnNothingThatItDoesNotCheck_data()
{
    QTest::addColumn<QString>("header");
    QTest::addColumn<QString>("operations");
    QTest::addColumn<QString>("values"); // with a getter and a setter each

    QTest::newRow("entry")
        << QStringLiteral("VelUIDesktopEntry.h")
        << QStringLiteral(
               "setFilePath load save contents isValid inheritFrom isSuitable isDisplayable getLanguages "
               "getLanguageInForce getTranslation setTranslation getTranslatedList setTranslatedList")
        << QStringLiteral("Type Name LocalName GenericName LocalGenericName Comment "
                          "LocalComment Icon LocalIcon Exec TryExec Path URL "
                          "StartupWMClass Version Terminal NoDisplay Hidden StartupNotify "
                          "OnlyShowIn NotShowIn MimeType Categories Keywords LocalKeywords "
                          "SortOrder Actions");
    QTest::newRow("command line") << QStringLiteral("VelUIDesktopEntry.h")
                                  << QStringLiteral(
                                         "filePath url appName icon desktopFilePath filePathList urlList")
                                  << QString();
    QTest::newRow("action") << QStringLiteral("VelUIDesktopAction.h") << QStringLiteral("getId")
                            << QStringLiteral("Name LocalName Icon LocalIcon Exec OnlyShowIn NotShowIn");
}

void tst_DesktopEntryRecord::reliesOnNothingThatItDoesNotCheck()
{
    QFETCH(QString, header);
    QFETCH(QString, operations);
    QFETCH(QString, values);
    QStringList names = operations.split(QLatin1Char(' '));
    for (const QString &value : values.split(QLatin1Char(' '), Qt::SkipEmptyParts))
        names << QStringLiteral("get") + value << QStringLiteral("set") + value;
    copyHeaders();
    const QString file = QStringLiteral("platform/veluiaux/") + header;
    QString text = QString::fromUtf8(read(path(file)));
    for (const QString &name : qAsConst(names)) {
        const int before = text.size();
        text.remove(QRegularExpression(QStringLiteral("^ +[\\w<>:& ]+[ &]%1\\([^\\n]*;$").arg(name),
                                       QRegularExpression::MultilineOption));
        QVERIFY2(text.size() < before, qPrintable(name));
    }
    write(file, text.toUtf8());

    QByteArray messages;
    QVERIFY(!compile(&messages));
    for (const QString &name : qAsConst(names)) {
        const QRegularExpression message(QStringLiteral("lacks the operation [^(]*\\b%1\\(").arg(name));
        QVERIFY2(message.match(QString::fromUtf8(messages)).hasMatch(), qPrintable(name));
    }
}

VEL_TEST_GUILESS_MAIN(tst_DesktopEntryRecord)

#include "tst_DesktopEntryRecord.moc"
