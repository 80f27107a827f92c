// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OddName.h"
#include "TestCase.h"

#include <desktopentry/choosers/ChoiceModel.h>
#include <desktopentry/choosers/MimeTypeSource.h>
#include <desktopentry/choosers/ProgramSource.h>

#include <QFile>
#include <QMimeDatabase>

using namespace VelUI;

namespace {

template <typename Source>
void readAll(Source *source, ChoiceModel *model)
{
    while (source->read(model)) { }
}

const Choice *find(const ChoiceModel &model, const char *value)
{
    for (int row = 0; row < model.rowCount(); ++row) {
        if (model.at(row).value == QLatin1String(value))
            return &model.at(row);
    }
    return nullptr;
}

QStringList texts(const ChoiceModel &model)
{
    QStringList rows;
    for (int row = 0; row < model.rowCount(); ++row)
        rows.append(model.at(row).texts.join(QLatin1Char(' ')));
    rows.sort();
    return rows;
}

} // namespace

/// What the choosers read from the system.
class tst_ChoiceSources : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void readsTheNamesOfMimeTypesAtOnce();
    void tellsWhatMimeTypesAre();
    void knowsMimeTypesByTheirAliases();
    void listsProgramsByName();
    void listsProgramsBesideANameThatIsNoText();
    void listsNoProgramsOfMissingFolders_data();
    void listsNoProgramsOfMissingFolders();

private:
    void writeProgram(const QString &name);
};

void tst_ChoiceSources::writeProgram(const QString &name)
{
    QVERIFY(QFile::setPermissions(write(name, "#!/bin/sh\n"), QFile::ReadOwner | QFile::ExeOwner));
}

void tst_ChoiceSources::readsTheNamesOfMimeTypesAtOnce()
{
    ChoiceModel model(ChoiceModel::Kind::Several, MimeTypeSource::headers());
    MimeTypeSource source({QStringLiteral("text/plain"), QStringLiteral("x/unheard")});
    QVERIFY(source.read(&model));
    QCOMPARE(model.rowCount(), QMimeDatabase().allMimeTypes().size() + 1);
    readAll(&source, &model);
    QCOMPARE(model.rowCount(), QMimeDatabase().allMimeTypes().size() + 1);
}

void tst_ChoiceSources::tellsWhatMimeTypesAre()
{
    ChoiceModel model(ChoiceModel::Kind::Several, MimeTypeSource::headers());
    MimeTypeSource source({QStringLiteral("x/unheard")});
    readAll(&source, &model);
    const QMimeType png = QMimeDatabase().mimeTypeForName(QStringLiteral("image/png"));
    const Choice *choice = find(model, "image/png");
    QVERIFY(choice);
    QCOMPARE(choice->texts, (QStringList{png.name(), png.comment(), QStringLiteral("*.png")}));
    const Choice *unheard = find(model, "x/unheard");
    QVERIFY(unheard);
    QCOMPARE(unheard->texts,
             (QStringList{QStringLiteral("x/unheard"), QStringLiteral("Not in the database")}));
}

void tst_ChoiceSources::knowsMimeTypesByTheirAliases()
{
    ChoiceModel model(ChoiceModel::Kind::Several, MimeTypeSource::headers());
    MimeTypeSource source({QStringLiteral("application/x-pdf")});
    readAll(&source, &model);
    const Choice *pdf = find(model, "application/pdf");
    const Choice *alias = find(model, "application/x-pdf");
    QVERIFY(pdf && alias);
    QCOMPARE(alias->texts.at(1), pdf->texts.at(1));
    QVERIFY(pdf->words.contains(alias->value));
}

void tst_ChoiceSources::listsProgramsByName()
{
    writeProgram(QStringLiteral("one/both"));
    writeProgram(QStringLiteral("two/both"));
    writeProgram(QStringLiteral("two/my program"));
    write(QStringLiteral("two/text"), "no program");
    writeProgram(QStringLiteral("two/folder/deeper"));
    qputenv("PATH",
            QFile::encodeName(QStringLiteral(":%1:relative:%2/:%1")
                                  .arg(path(QStringLiteral("one")), path(QStringLiteral("two")))));
    ProgramSource source;
    ChoiceModel model(ChoiceModel::Kind::One, ProgramSource::headers());
    readAll(&source, &model);
    QCOMPARE(texts(model),
             (QStringList{QStringLiteral("both ") + path(QStringLiteral("one")),
                          QStringLiteral("my program ") + path(QStringLiteral("two"))}));
}

void tst_ChoiceSources::listsProgramsBesideANameThatIsNoText()
{
    for (int i = 0; i < 8; ++i) {
        const QString file = write(QStringLiteral("bin/p%1").arg(i), "");
        QVERIFY(QFile::setPermissions(file, QFile::ReadOwner | QFile::ExeOwner));
        writeOddName(path(QStringLiteral("bin")), i);
    }
    qputenv("PATH", QFile::encodeName(path(QStringLiteral("bin"))));
    ProgramSource source;
    ChoiceModel model(ChoiceModel::Kind::One, ProgramSource::headers());
    readAll(&source, &model);
    QCOMPARE(model.rowCount(), 8);
}

void tst_ChoiceSources::listsNoProgramsOfMissingFolders_data()
{
    QTest::addColumn<QByteArray>("variable");
    QTest::newRow("no path") << QByteArray();
    QTest::newRow("empty") << QByteArray("");
    QTest::newRow("missing") << QByteArray("/does/not/exist:/nor/this");
}

void tst_ChoiceSources::listsNoProgramsOfMissingFolders()
{
    QFETCH(QByteArray, variable);
    if (variable.isNull())
        qunsetenv("PATH");
    else
        qputenv("PATH", variable);
    ProgramSource source;
    ChoiceModel model(ChoiceModel::Kind::One, ProgramSource::headers());
    readAll(&source, &model);
    QCOMPARE(model.rowCount(), 0);
}

VEL_TEST_GUILESS_MAIN(tst_ChoiceSources)

#include "tst_ChoiceSources.moc"
