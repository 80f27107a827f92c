// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "TestCase.h"

#include <menuedit/Trash.h>

#include <QDir>
#include <QFileInfo>

/// What goes into the desktop's trash, and what cannot.
class tst_Trash : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void keepsANoteOfEachThing();
    void takesWhatHasALongName_data();
    void takesWhatHasALongName();
    void takesNothingWhereNoNoteCanBeWritten_data();
    void takesNothingWhereNoNoteCanBeWritten();

private:
    QString trash() const { return path(QStringLiteral("data/Trash")); }
    QStringList in(const char *name) const
    {
        return QDir(trash() + QLatin1Char('/') + QLatin1String(name))
            .entryList(QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden);
    }

    QByteArray m_dataHome;
};

void tst_Trash::init()
{
    TestCase::init();
    m_dataHome = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("data"))));
}

void tst_Trash::cleanup()
{
    qputenv("XDG_DATA_HOME", m_dataHome);
    TestCase::cleanup();
}

void tst_Trash::keepsANoteOfEachThing()
{
    QStringList places;
    for (int i = 0; i < 3; ++i) {
        const QString file = write(QStringLiteral("menu/a b.desktop"), QByteArray::number(i));
        places.append(Trash::put(file));
        QVERIFY(!QFileInfo::exists(file));
        QCOMPARE(read(places.last()), QByteArray::number(i));
    }
    write(QStringLiteral("menu/games/x.desktop"), "x");
    places.append(Trash::put(path(QStringLiteral("menu/games"))));
    QCOMPARE(read(places.last() + QStringLiteral("/x.desktop")), QByteArray("x"));
    QCOMPARE(in("files"),
             QStringList({QStringLiteral("a b.desktop"), QStringLiteral("a b.desktop 2"),
                          QStringLiteral("a b.desktop 3"), QStringLiteral("games")}));
    QCOMPARE(in("info").size(), 4);
    const QByteArray note = read(trash() + QStringLiteral("/info/a b.desktop 2.trashinfo"));
    QVERIFY2(note.startsWith("[Trash Info]\nPath="), note.constData());
    QVERIFY2(note.contains("/menu/a%20b.desktop\nDeletionDate="), note.constData());
    for (const QString &place : qAsConst(places))
        Trash::forget(place);
    QCOMPARE(in("info"), QStringList());
}

void tst_Trash::takesWhatHasALongName_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("letters") << QString(255, QLatin1Char('l'));
    QTest::newRow("of two bytes") << QString(127, QChar(0x416));
    QTest::newRow("of four bytes") << QStringLiteral("\U0001F3B9").repeated(63);
    QTest::newRow("a little too long") << QString(246, QLatin1Char('l'));
}

void tst_Trash::takesWhatHasALongName()
{
    QFETCH(QString, name);
    for (int i = 0; i < 2; ++i) {
        const QString file = write(QLatin1String("menu/") + name, "long");
        const QString place = Trash::put(file);
        QVERIFY(!place.isEmpty());
        QCOMPARE(read(place), QByteArray("long"));
        QVERIFY(!QFileInfo::exists(file));
    }
    QCOMPARE(in("info").size(), 2);
}

void tst_Trash::takesNothingWhereNoNoteCanBeWritten_data()
{
    QTest::addColumn<QString>("locked");
    QTest::newRow("trash") << "";
    QTest::newRow("notes") << "/info";
    QTest::newRow("files") << "/files";
}

void tst_Trash::takesNothingWhereNoNoteCanBeWritten()
{
    QFETCH(QString, locked);
    const QString file = write(QStringLiteral("menu/a.desktop"), "a");
    write(QStringLiteral("data/Trash/files/old"), "old");
    write(QStringLiteral("data/Trash/info/old.trashinfo"), "old");
    const OrdinaryUser user(folder());
    const QString place = trash() + locked;
    const QFile::Permissions before = QFile::permissions(place);
    QVERIFY(QFile::setPermissions(place, QFile::ReadOwner | QFile::ExeOwner));
    QCOMPARE(Trash::put(file), QString());
    QVERIFY(QFile::setPermissions(place, before));
    QCOMPARE(read(file), QByteArray("a"));
    QCOMPARE(in("files"), QStringList{QStringLiteral("old")});
    QCOMPARE(in("info"), QStringList{QStringLiteral("old.trashinfo")});
}

VEL_TEST_GUILESS_MAIN(tst_Trash)
#include "tst_Trash.moc"
