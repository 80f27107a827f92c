// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/fields/MimeTypeInput.h>

#include <QMimeDatabase>

using namespace FormDriving;

class tst_MimeTypeInput : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void turnsAnExtensionIntoItsType_data();
    void turnsAnExtensionIntoItsType();
    void takesTheFirstTypeOfAnExtension();
    void asksWithTheTextsGiven();
    void givesNothingWhenCanceled();
};

void tst_MimeTypeInput::turnsAnExtensionIntoItsType_data()
{
    QTest::addColumn<QString>("answer");
    QTest::addColumn<QString>("type");
    QTest::newRow("extension") << "png"
                               << "image/png";
    QTest::newRow("extension of two parts") << "tar.gz"
                                            << "application/x-compressed-tar";
    QTest::newRow("type") << "image/png"
                          << "image/png";
    QTest::newRow("type nobody knows") << "x-a/b c;d"
                                       << "x-a/b c;d";
    QTest::newRow("slash alone") << "/"
                                 << "/";
    QTest::newRow("extension nobody knows") << "nobodyknows"
                                            << "nobodyknows";
    QTest::newRow("empty") << ""
                           << "";
}

void tst_MimeTypeInput::turnsAnExtensionIntoItsType()
{
    QFETCH(QString, answer);
    QFETCH(QString, type);
    QCOMPARE(VelUI::mimeTypeFor(answer), type);
}

void tst_MimeTypeInput::takesTheFirstTypeOfAnExtension()
{
    // Films and translations share it.
    const QList<QMimeType> types = QMimeDatabase().mimeTypesForFileName(QStringLiteral("a.ts"));
    QVERIFY(types.size() > 1);
    QCOMPARE(VelUI::mimeTypeFor(QStringLiteral("ts")), types.constFirst().name());
}

void tst_MimeTypeInput::asksWithTheTextsGiven()
{
    ModalDriver modal;
    Prompt prompt;
    answerPrompt(modal, QStringLiteral("png"), &prompt);
    QCOMPARE(VelUI::askForMimeType(nullptr, QStringLiteral("title"), QStringLiteral("label"),
                                   QLineEdit::Normal, QStringLiteral("before")),
             QStringLiteral("image/png"));
    QVERIFY(modal.finished());
    QCOMPARE(prompt.title, QStringLiteral("title"));
    QCOMPARE(prompt.label, QStringLiteral("label"));
    QCOMPARE(prompt.text, QStringLiteral("before"));
}

void tst_MimeTypeInput::givesNothingWhenCanceled()
{
    ModalDriver modal;
    answerPrompt(modal, QString());
    QVERIFY(VelUI::askForMimeType(nullptr, QString(), QString(), QLineEdit::Normal, QStringLiteral("png"))
                .isEmpty());
    QVERIFY(modal.finished());
}

VEL_TEST_MAIN(tst_MimeTypeInput)

#include "tst_MimeTypeInput.moc"
