// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconProviderTestCase.h"

#include <QImage>

#include <unistd.h>

/// Icons of desktop entries.
class tst_VelMimeTypeIconProviderEntries : public IconProviderTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void givesEntriesTheIconThatTheyName();
    void takesTheBuiltInFileWhereTheThemeLacksTheIconOfAnEntry();
    void givesLinkEntriesTheIconOfTheirTarget_data();
    void givesLinkEntriesTheIconOfTheirTarget();
    void givesLinkEntriesNoBuiltInPicture();
    void drawsSeparators();
    void drawsSeparatorsInEverySize_data();
    void drawsSeparatorsInEverySize();
    void givesASeparatorWithAnIconThatIcon();
    void givesOtherEntriesTheBuiltInPicture_data();
    void givesOtherEntriesTheBuiltInPicture();
    void tellsEntriesByTheExactEndOfTheirName_data();
    void tellsEntriesByTheExactEndOfTheirName();
};

void tst_VelMimeTypeIconProviderEntries::givesEntriesTheIconThatTheyName()
{
    m_theme->add(QStringLiteral("application-x-desktop"), Qt::cyan);
    write(QStringLiteral("a.desktop"), entry("Type=Application\nIcon=named\nExec=true\n"));
    write(QStringLiteral("b.desktop"), entry("Type=Link\nURL=http://example.org\nIcon=named\n"));
    write(QStringLiteral(".desktop"), entry("Icon=named.png\n"));
    for (const char *name : {"a.desktop", "b.desktop", ".desktop"})
        QCOMPARE(middle(iconOf(QString::fromLatin1(name))), namedColor);

    const QString picture = path(QStringLiteral("picture.png"));
    QPixmap pixmap(16, 16);
    pixmap.fill(Qt::magenta);
    QVERIFY(pixmap.save(picture));
    write(QStringLiteral("c.desktop"), entry("Icon=" + QFile::encodeName(picture) + '\n'));
    QCOMPARE(middle(iconOf(QStringLiteral("c.desktop"))), QColor(Qt::magenta));
}

void tst_VelMimeTypeIconProviderEntries::takesTheBuiltInFileWhereTheThemeLacksTheIconOfAnEntry()
{
    write(QStringLiteral("a.desktop"), entry("Type=Application\nIcon=missing\nExec=VELWM_SEPARATOR\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), fileColor);
}

void tst_VelMimeTypeIconProviderEntries::givesLinkEntriesTheIconOfTheirTarget_data()
{
    QTest::addColumn<QByteArray>("url");
    QTest::addColumn<QColor>("color");
    QTest::newRow("http") << QByteArray("http://example.org/") << htmlColor;
    QTest::newRow("text") << QByteArray("file://%1/a.txt") << textColor;
    QTest::newRow("path with letters beyond ASCII") << QByteArray("%1/\xd0\x96.txt") << textColor;
    QTest::newRow("no such file") << QByteArray("file://%1/b.txt") << unknownColor;
    QTest::newRow("empty") << QByteArray() << unknownColor;
}

void tst_VelMimeTypeIconProviderEntries::givesLinkEntriesTheIconOfTheirTarget()
{
    QFETCH(QByteArray, url);
    QFETCH(QColor, color);
    write(QStringLiteral("a.txt"), "text");
    write(QStringLiteral("Ж.txt"), "text");
    url.replace("%1", QFile::encodeName(folder()));
    write(QStringLiteral("a.desktop"), entry("Type=Link\nURL=" + url + "\nExec=VELWM_SEPARATOR\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), color);
}

void tst_VelMimeTypeIconProviderEntries::givesLinkEntriesNoBuiltInPicture()
{
    write(QStringLiteral("a.desktop"), entry("Type=Link\nURL=mailto:someone@example.org\n"));
    QVERIFY(iconOf(QStringLiteral("a.desktop")).isNull());
    m_theme->add(QStringLiteral("mail-message-new"), Qt::cyan);
    QIcon::setThemeName(QString());
    m_theme->use();
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), QColor(Qt::cyan));
}

void tst_VelMimeTypeIconProviderEntries::drawsSeparators()
{
    write(QStringLiteral("a.desktop"), entry("Type=Application\nExec=VELWM_SEPARATOR\n"));
    QVERIFY(QFile::link(path(QStringLiteral("a.desktop")), path(QStringLiteral("link.desktop"))));
    const QIcon icon = iconOf(QStringLiteral("a.desktop"));
    const QIcon linked = iconOf(QStringLiteral("link.desktop"));
    QCOMPARE(linked.cacheKey(), icon.cacheKey());
    QCOMPARE(icon.availableSizes(),
             (QList<QSize>{QSize(16, 16), QSize(22, 22), QSize(32, 32), QSize(48, 48), QSize(64, 64),
                           QSize(128, 128)}));
}

void tst_VelMimeTypeIconProviderEntries::drawsSeparatorsInEverySize_data()
{
    QTest::addColumn<int>("size");
    for (const int size : {16, 22, 32, 48, 64, 128})
        QTest::addRow("%d", size) << size;
}

void tst_VelMimeTypeIconProviderEntries::drawsSeparatorsInEverySize()
{
    QFETCH(int, size);
    write(QStringLiteral("a.desktop"), entry("Exec=VELWM_SEPARATOR\n"));
    const QImage image = iconOf(QStringLiteral("a.desktop")).pixmap(size).toImage();
    QCOMPARE(image.size(), QSize(size, size));
    for (int y = 0; y < size; ++y) {
        const bool onRule = y == size / 2 - 1 || y == size / 2;
        for (int x = 0; x < size; ++x)
            QCOMPARE(image.pixelColor(x, y), onRule ? QColor(Qt::black) : QColor(Qt::transparent));
    }
}

void tst_VelMimeTypeIconProviderEntries::givesASeparatorWithAnIconThatIcon()
{
    write(QStringLiteral("a.desktop"), entry("Type=Application\nExec=VELWM_SEPARATOR\nIcon=named\n"));
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), namedColor);
}

void tst_VelMimeTypeIconProviderEntries::givesOtherEntriesTheBuiltInPicture_data()
{
    QTest::addColumn<QByteArray>("contents");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("garbage") << QByteArray(1 << 20, '\xfe');
    QTest::newRow("no group") << QByteArray("Icon=named\n");
    QTest::newRow("application") << entry("Type=Application\nExec=true\n");
    QTest::newRow("type in another case") << entry("Type=link\nURL=http://example.org\n");
    QTest::newRow("separator in another case") << entry("Type=Application\nExec=velwm_separator\n");
    QTest::newRow("separator with an argument") << entry("Type=Application\nExec=VELWM_SEPARATOR x\n");
}

void tst_VelMimeTypeIconProviderEntries::givesOtherEntriesTheBuiltInPicture()
{
    QFETCH(QByteArray, contents);
    m_theme->add(QStringLiteral("application-x-desktop"), Qt::cyan);
    write(QStringLiteral("a.desktop"), contents);
    QCOMPARE(middle(iconOf(QStringLiteral("a.desktop"))), fileColor);
}

void tst_VelMimeTypeIconProviderEntries::tellsEntriesByTheExactEndOfTheirName_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"a.Desktop", "a.DESKTOP", "a.desktop.txt", "adesktop"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_VelMimeTypeIconProviderEntries::tellsEntriesByTheExactEndOfTheirName()
{
    QFETCH(QString, name);
    write(name, entry("Type=Application\nIcon=named\n"));
    m_theme->add(QStringLiteral("application-x-desktop"), Qt::cyan);
    const QColor color = middle(iconOf(name));
    QVERIFY(color == QColor(Qt::cyan) || color == textColor);
}

VEL_TEST_MAIN(tst_VelMimeTypeIconProviderEntries)
#include "tst_VelMimeTypeIconProviderEntries.moc"
