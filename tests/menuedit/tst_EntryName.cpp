// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>
#include <menuedit/EntryName.h>

class tst_EntryName : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void composesTheName_data();
    void composesTheName();
};

void tst_EntryName::composesTheName_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<QString>("expected");
    QTest::newRow("translated name alone") << QByteArray("Name[en]=Local\n") << QStringLiteral("Local");
    QTest::newRow("translated name wins")
        << QByteArray("Name=Plain\nName[en]=Local\nGenericName[en]=Kind\n") << QStringLiteral("Local");
    QTest::newRow("untranslated") << QByteArray("Name=Plain\n") << QStringLiteral("Plain");
    QTest::newRow("untranslated and kind")
        << QByteArray("Name=Plain\nGenericName[en]=Kind\n") << QStringLiteral("Plain Kind");
    QTest::newRow("untranslated kind does not count")
        << QByteArray("Name=Plain\nGenericName=Kind\n") << QStringLiteral("Plain");
    QTest::newRow("kind alone") << QByteArray("GenericName[en]=Kind\n") << QStringLiteral(" Kind");
    QTest::newRow("nothing") << QByteArray() << QString();
}

void tst_EntryName::composesTheName()
{
    QFETCH(QByteArray, keys);
    QFETCH(QString, expected);
    const QString file = write(QStringLiteral("a.desktop"), "[Desktop Entry]\nType=Application\n" + keys);

    QCOMPARE(EntryName::of(VelUIDesktopEntry(file)), expected);
}

VEL_TEST_GUILESS_MAIN(tst_EntryName)

#include "tst_EntryName.moc"
