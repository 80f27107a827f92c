// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QImage>
#include <QProcess>
#include <QStandardPaths>
#include <QXmlStreamReader>

namespace {

QStringList languages()
{
    return QStringLiteral("de es fr it ja pl pt_BR ru tr uk zh_CN").split(QLatin1Char(' '));
}

// The name, the summary, the one paragraph of the description, and the line under the picture.
QStringList metadataTexts()
{
    return {QStringLiteral("name"), QStringLiteral("summary"), QStringLiteral("p"),
            QStringLiteral("caption")};
}

} // namespace

// What menus and software centers show of the programs before they are started.
class tst_DesktopFileLanguages : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void areAllInTheDesktopFile_data() { addPrograms(); }
    void areAllInTheDesktopFile();
    void areAllInTheMetadata_data() { addPrograms(); }
    void areAllInTheMetadata();
    void showAPictureThatIsThere_data() { addPrograms(); }
    void showAPictureThatIsThere();
    void leaveTheDesktopFileValid_data() { addPrograms(); }
    void leaveTheDesktopFileValid();
    void leaveTheMetadataValid_data() { addPrograms(); }
    void leaveTheMetadataValid();

private:
    void addPrograms();
    void runValidator(const QString &program, const QStringList &arguments);
};

void tst_DesktopFileLanguages::addPrograms()
{
    QTest::addColumn<QString>("desktopFile");
    QTest::addColumn<QString>("metadata");
    for (const QString &program :
         {QStringLiteral("entryedit"), QStringLiteral("gallery"), QStringLiteral("menuedit")}) {
        QTest::newRow(qPrintable(program))
            << QStringLiteral(VEL_SOURCE_DIR "/apps/vel-%1/vel-%1.desktop").arg(program)
            << QStringLiteral(VEL_SOURCE_DIR "/data/metainfo/org.veluiextra.%1.metainfo.xml").arg(program);
    }
}

void tst_DesktopFileLanguages::areAllInTheDesktopFile()
{
    QFETCH(QString, desktopFile);
    const QStringList lines = QString::fromUtf8(read(desktopFile)).split(QLatin1Char('\n'));
    int keys = 0;
    for (const char *key : {"Name", "GenericName", "Comment", "Keywords"}) {
        if (lines.filter(QRegularExpression(QStringLiteral("^%1=.").arg(QLatin1String(key)))).isEmpty())
            continue;
        ++keys;
        for (const QString &language : languages()) {
            const QString pattern = QStringLiteral("^%1\\[%2\\]=.").arg(QLatin1String(key), language);
            QVERIFY2(lines.filter(QRegularExpression(pattern)).size() == 1, qPrintable(pattern));
        }
    }
    QVERIFY(keys >= 2);
}

void tst_DesktopFileLanguages::areAllInTheMetadata()
{
    QFETCH(QString, metadata);
    QHash<QString, QStringList> seen;
    QXmlStreamReader xml(read(metadata));
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement)
            continue;
        const QString language = xml.attributes().value(QLatin1String("xml:lang")).toString();
        const QString element = xml.name().toString();
        if (metadataTexts().contains(element)) {
            if (!language.isEmpty())
                seen[element].append(language);
            QVERIFY(!xml.readElementText().isEmpty());
        }
    }
    QVERIFY2(!xml.hasError(), qPrintable(xml.errorString()));
    for (const QString &element : metadataTexts()) {
        seen[element].sort();
        QCOMPARE(seen[element], languages());
    }
}

void tst_DesktopFileLanguages::showAPictureThatIsThere()
{
    QFETCH(QString, metadata);
    QXmlStreamReader xml(read(metadata));
    int pictures = 0;
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement || xml.name() != QLatin1String("image"))
            continue;
        const QSize size(xml.attributes().value(QLatin1String("width")).toInt(),
                         xml.attributes().value(QLatin1String("height")).toInt());
        const QString name = xml.readElementText().section(QLatin1Char('/'), -1);
        QCOMPARE(QImage(QStringLiteral(VEL_SOURCE_DIR "/docs/pictures/") + name).size(), size);
        ++pictures;
    }
    QCOMPARE(pictures, 1);
}

void tst_DesktopFileLanguages::runValidator(const QString &program, const QStringList &arguments)
{
    if (QStandardPaths::findExecutable(program).isEmpty())
        QSKIP(qPrintable(program + QStringLiteral(" is not installed")));
    QProcess validator;
    validator.setProcessChannelMode(QProcess::MergedChannels);
    validator.start(program, arguments);
    QVERIFY(validator.waitForFinished());
    const QByteArray said = validator.readAll();
    QVERIFY2(validator.exitCode() == 0, said.constData());
    // Hints and notes as well: there is nothing that the files could not do better.
    QVERIFY2(!said.contains("warning") && !said.contains("hint:"), said.constData());
}

void tst_DesktopFileLanguages::leaveTheDesktopFileValid()
{
    QFETCH(QString, desktopFile);
    runValidator(QStringLiteral("desktop-file-validate"), {desktopFile});
}

void tst_DesktopFileLanguages::leaveTheMetadataValid()
{
    QFETCH(QString, metadata);
    runValidator(QStringLiteral("appstreamcli"),
                 {QStringLiteral("validate"), QStringLiteral("--no-net"), QStringLiteral("--no-color"),
                  QStringLiteral("--pedantic"), metadata});
}

VEL_TEST_GUILESS_MAIN(tst_DesktopFileLanguages)

#include "tst_DesktopFileLanguages.moc"
