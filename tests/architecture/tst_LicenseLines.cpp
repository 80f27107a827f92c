// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QDir>
#include <QDirIterator>

// Every file says whose it is and under which license; pictures and lists of data are covered by
// the license of the project.
class tst_LicenseLines : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void standInEveryFile_data();
    void standInEveryFile();
};

void tst_LicenseLines::standInEveryFile_data()
{
    QTest::addColumn<QString>("pattern");
    for (const char *pattern : {"*.cpp", "*.h", "CMakeLists.txt", "*.cmake", "*.svg"})
        QTest::newRow(pattern) << QString::fromLatin1(pattern);
}

void tst_LicenseLines::standInEveryFile()
{
    QFETCH(QString, pattern);
    const QDir source(QStringLiteral(VEL_SOURCE_DIR));
    QStringList without;
    int seen = 0;
    for (const QString &folder : source.entryList(QDir::Dirs | QDir::NoDotAndDotDot)) {
        if (folder == QLatin1String("build") || folder.startsWith(QLatin1String("obj-")))
            continue;
        QDirIterator iterator(source.filePath(folder), {pattern}, QDir::Files, QDirIterator::Subdirectories);
        while (iterator.hasNext()) {
            const QString path = iterator.next();
            const QByteArray head = read(path).left(600);
            ++seen;
            // REUSE-IgnoreStart
            if (!head.contains("SPDX-FileCopyrightText: The veluiextra developers")
                || !head.contains("SPDX-License-Identifier: LGPL-2.1-or-later"))
                without.append(source.relativeFilePath(path));
            // REUSE-IgnoreEnd
        }
    }
    if (pattern != QLatin1String("*.svg"))
        QVERIFY(seen > 0);
    QVERIFY2(without.isEmpty(), qPrintable(without.join(QLatin1Char('\n'))));
}

VEL_TEST_GUILESS_MAIN(tst_LicenseLines)

#include "tst_LicenseLines.moc"
