// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SourceFiles.h"
#include "TestCase.h"

#include <QFile>
#include <QRegularExpression>

// What the documentation of every public class and namespace says: since when it is there, and what
// thread may call it.
class tst_PublicClasses : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void sayTheirVersionAndThread_data();
    void sayTheirVersionAndThread();
    void haveAPictureInTheReference();
};

void tst_PublicClasses::sayTheirVersionAndThread_data()
{
    QTest::addColumn<QString>("documentation");
    // The functions of the platform lie in a namespace of no meaning.
    static const QRegularExpression definition(
        QStringLiteral("(?:/\\*\\*((?:[^*]|\\*(?!/))*)\\*/\\n)?^(?:(?:class|struct) \\w+_EXPORT|namespace) "
                       "(\\w+)[^;{]*\\{?$"),
        QRegularExpression::MultilineOption);
    QStringList headers = SourceFiles::below(QStringLiteral("include"));
    for (const char *library : {"velcore", "veluiaux", "velintegration"})
        headers += SourceFiles::below(QStringLiteral("platform/%1/include").arg(QLatin1String(library)));
    for (const QString &header : qAsConst(headers)) {
        QRegularExpressionMatchIterator classes = definition.globalMatch(SourceFiles::textOf(header));
        while (classes.hasNext()) {
            const QRegularExpressionMatch found = classes.next();
            if (found.captured(2) != QLatin1String("Vel"))
                QTest::newRow(qPrintable(header + QLatin1Char(' ') + found.captured(2))) << found.captured(1);
        }
    }
}

void tst_PublicClasses::sayTheirVersionAndThread()
{
    QFETCH(QString, documentation);
    QVERIFY2(documentation.contains(QRegularExpression(QStringLiteral("\\\\since [0-9]+\\.[0-9]+\\n"))),
             "no \\since");
    QVERIFY2(documentation.contains(QRegularExpression(QStringLiteral("\\bthreads?\\b"))), "no thread");
}

void tst_PublicClasses::haveAPictureInTheReference()
{
    static const QRegularExpression image(QStringLiteral("\\\\image html (\\S+)"));
    const QStringList headers = SourceFiles::below(QStringLiteral("include"));
    QVERIFY(headers.size() > 10);
    for (const QString &header : headers) {
        const QString picture = image.match(SourceFiles::textOf(header)).captured(1);
        QVERIFY2(!picture.isEmpty(), qPrintable(header));
        QVERIFY2(QFile::exists(SourceFiles::absolute(QStringLiteral("docs/pictures/") + picture)),
                 qPrintable(picture));
    }
}

VEL_TEST_GUILESS_MAIN(tst_PublicClasses)

#include "tst_PublicClasses.moc"
