// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelIcon.h>

#include <QDir>
#include <QDirIterator>
#include <QIcon>
#include <QLoggingCategory>
#include <QPixmapCache>
#include <QSet>

/// The icons of installed themes, beside those of Qt. VEL_TEST_FULL looks at each of them.
class tst_VelIconInstalled : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void drawsEveryPixelAsQtDoes_data();
    void drawsEveryPixelAsQtDoes();
};

namespace {

constexpr int Sample = 150;

QStringList namesIn(const QString &folder)
{
    QSet<QString> names;
    QDirIterator files(folder, {QStringLiteral("*.png"), QStringLiteral("*.svg")}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext()) {
        files.next();
        names.insert(files.fileInfo().completeBaseName());
    }
    QStringList sorted = names.values();
    sorted.sort();
    if (qEnvironmentVariableIsSet("VEL_TEST_FULL"))
        return sorted;
    QStringList sample;
    for (int i = 0; i < Sample && !sorted.isEmpty(); ++i)
        sample.append(sorted.at(int(qint64(i) * sorted.size() / Sample)));
    return sample;
}

} // namespace

void tst_VelIconInstalled::drawsEveryPixelAsQtDoes_data()
{
    QTest::addColumn<QString>("theme");
    for (const char *theme : {"breeze", "breeze-dark", "Adwaita"})
        QTest::newRow(theme) << QString::fromLatin1(theme);
}

void tst_VelIconInstalled::drawsEveryPixelAsQtDoes()
{
    QFETCH(QString, theme);
    const QString root = QStringLiteral("/usr/share/icons");
    if (!QDir(root + QLatin1Char('/') + theme).exists())
        QSKIP("this theme is not installed");
    QLoggingCategory::setFilterRules(QStringLiteral("qt.svg=false")); // not every drawing is a good one
    QIcon::setThemeSearchPaths({root});
    QIcon::setThemeName(theme);
    const QStringList names = namesIn(root + QLatin1Char('/') + theme);
    for (const QString &name : names) {
        const QIcon qt = QIcon::fromTheme(name);
        const QIcon ours = VelIcon::fromTheme(name, QMap<Qt::Corner, QString>(), QIcon());
        for (const QSize size : {QSize(16, 16), QSize(22, 22), QSize(32, 32), QSize(48, 48), QSize(30, 20)}) {
            for (const QIcon::Mode mode : {QIcon::Normal, QIcon::Disabled}) {
                QPixmapCache::clear();
                const QImage expected = qt.pixmap(size, mode).toImage();
                QPixmapCache::clear();
                QVERIFY2(ours.pixmap(size, mode).toImage() == expected,
                         qPrintable(QStringLiteral("%1 %2").arg(name).arg(size.width())));
            }
        }
    }
}

VEL_TEST_MAIN(tst_VelIconInstalled)

#include "tst_VelIconInstalled.moc"
