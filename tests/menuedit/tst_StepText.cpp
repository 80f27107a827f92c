// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/StepText.h>

#include <QTranslator>

namespace {

// Knows every text, as a catalog does: one without a number in one form only.
class Catalog : public QTranslator
{
public:
    bool isEmpty() const override { return false; }
    QString translate(const char *, const char *source, const char *, int n) const override
    {
        const QString text = QString::fromUtf8(source);
        const bool hasForms = text.contains(QLatin1String("%n"));
        return hasForms == (n >= 0) ? QStringLiteral("translated: ") + text : QString();
    }
};

} // namespace

class tst_StepText : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void speaksTheLanguageOfTheUser_data();
    void speaksTheLanguageOfTheUser();
};

void tst_StepText::speaksTheLanguageOfTheUser_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("count");
    for (int kind = 0; kind <= int(StepText::Kind::DuplicateItems); ++kind) {
        for (const int count : {0, 1, 2})
            QTest::addRow("kind %d, %d", kind, count) << kind << count;
    }
}

void tst_StepText::speaksTheLanguageOfTheUser()
{
    QFETCH(int, kind);
    QFETCH(int, count);
    Catalog catalog;
    QVERIFY(QCoreApplication::installTranslator(&catalog));
    const StepText text(StepText::Kind(kind), QStringLiteral("item"), count, QStringLiteral("folder"));
    for (const QString &said : {text.undo(), text.redo(), text.done()})
        QVERIFY2(said.startsWith(QLatin1String("translated: ")), qPrintable(said));
}

VEL_TEST_GUILESS_MAIN(tst_StepText)

#include "tst_StepText.moc"
