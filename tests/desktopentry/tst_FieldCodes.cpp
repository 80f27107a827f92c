// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/choosers/FieldCodes.h>

using VelUI::FieldCodes;

class tst_FieldCodes : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void offersThoseInForceAndExplainsEach();
    void putsNoCodeBeforeTheProgram_data();
    void putsNoCodeBeforeTheProgram();
    void keepsACodeApartFromTheWordBeforeIt_data();
    void keepsACodeApartFromTheWordBeforeIt();
};

void tst_FieldCodes::offersThoseInForceAndExplainsEach()
{
    QStringList codes;
    for (const FieldCodes::Code &code : FieldCodes::all()) {
        codes.append(code.code);
        QVERIFY2(code.explanation.startsWith(code.code + QLatin1String(": ")), qPrintable(code.explanation));
        QVERIFY(code.explanation.size() > 12);
    }
    QCOMPARE(codes.join(QLatin1Char(' ')), QStringLiteral("%f %F %u %U %i %c %k %%"));
}

void tst_FieldCodes::putsNoCodeBeforeTheProgram_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<int>("position");
    QTest::addColumn<int>("place");
    QTest::newRow("nothing there") << "" << 0 << 0;
    QTest::newRow("in front") << "gimp -n" << 0 << 7;
    QTest::newRow("among blanks in front") << "  gimp" << 1 << 6;
    QTest::newRow("in the program") << "gimp" << 1 << 1;
    QTest::newRow("behind the program") << "gimp -n" << 5 << 5;
}

void tst_FieldCodes::putsNoCodeBeforeTheProgram()
{
    QFETCH(QString, command);
    QFETCH(int, position);
    QFETCH(int, place);
    QCOMPARE(FieldCodes::place(command, position), place);
}

void tst_FieldCodes::keepsACodeApartFromTheWordBeforeIt_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<int>("position");
    QTest::addColumn<QString>("code");
    QTest::addColumn<QString>("insertion");
    QTest::newRow("nothing there") << "" << 0 << "%f"
                                   << "%f";
    QTest::newRow("behind the program") << "gimp" << 4 << "%f"
                                        << " %f";
    QTest::newRow("behind a blank") << "gimp " << 5 << "%f"
                                    << "%f";
    QTest::newRow("in a word") << "gimp" << 2 << "%f"
                               << "%f";
    QTest::newRow("in front") << "gimp" << 0 << "%i"
                              << "%i";
    QTest::newRow("value of an option") << "a --file=" << 9 << "%f"
                                        << "%f";
    QTest::newRow("behind a quote") << "a \"" << 3 << "%c"
                                    << "%c";
    QTest::newRow("percent sign") << "a 100" << 5 << "%%"
                                  << "%%";
}

void tst_FieldCodes::keepsACodeApartFromTheWordBeforeIt()
{
    QFETCH(QString, command);
    QFETCH(int, position);
    QFETCH(QString, code);
    QFETCH(QString, insertion);
    QCOMPARE(FieldCodes::insertion(command, position, code), insertion);
}

VEL_TEST_GUILESS_MAIN(tst_FieldCodes)

#include "tst_FieldCodes.moc"
