// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/FileIdentity.h>

#include <QSaveFile>

class tst_FileIdentity : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isThatOfTheSameFileOnly();
    void seesAChange();
    void seesThatAFileWasReplaced();
    void tellsRegularFiles();
    void settlesAMomentAfterAChange();
};

void tst_FileIdentity::isThatOfTheSameFileOnly()
{
    const QString file = write(QStringLiteral("a"), "a");
    const QString other = write(QStringLiteral("b"), "a");

    QVERIFY(FileIdentity(file) == FileIdentity(file));
    QVERIFY(!(FileIdentity(file) == FileIdentity(other)));
    QVERIFY(!(FileIdentity(file) == FileIdentity()));
    QVERIFY(FileIdentity(file).mark() == FileIdentity(file).mark());
    QVERIFY(FileIdentity(file).mark() != FileIdentity(other).mark());
    QVERIFY(FileIdentity(file).mark() != FileIdentity().mark());
    QVERIFY(FileIdentity(path(QStringLiteral("missing"))) == FileIdentity());
}

void tst_FileIdentity::seesAChange()
{
    const QString file = write(QStringLiteral("a"), "a");
    const FileIdentity before(file);

    write(QStringLiteral("a"), "bb");

    QVERIFY(!(FileIdentity(file) == before));
    QVERIFY(FileIdentity(file).mark() != before.mark());
    QVERIFY(FileIdentity(file).isSameFile(before));
}

void tst_FileIdentity::seesThatAFileWasReplaced()
{
    const QString file = write(QStringLiteral("a"), "a");
    const FileIdentity before(file);

    QSaveFile other(file);
    QVERIFY(other.open(QIODevice::WriteOnly));
    QCOMPARE(other.write("b"), 1);
    QVERIFY(other.commit());

    QVERIFY(!(FileIdentity(file) == before));
    QVERIFY(FileIdentity(file).mark() != before.mark());
    QVERIFY(!FileIdentity(file).isSameFile(before));
}

void tst_FileIdentity::tellsRegularFiles()
{
    const QString file = write(QStringLiteral("a"), "a");
    QVERIFY(QFile::link(file, path(QStringLiteral("link"))));

    QVERIFY(FileIdentity(file).isRegularFile());
    QVERIFY(FileIdentity(path(QStringLiteral("link"))).isRegularFile());
    QVERIFY(!FileIdentity(folder()).isRegularFile());
    QVERIFY(!FileIdentity().isRegularFile());
}

void tst_FileIdentity::settlesAMomentAfterAChange()
{
    const QString file = write(QStringLiteral("a"), "a");
    QTRY_VERIFY(FileIdentity(file).isSettled());
    QVERIFY(FileIdentity(file).isSettledAt(FileIdentity::now()));
    QVERIFY(!FileIdentity(file).isSettledAt(FileIdentity::now() - qint64(3600) * 1000000000));

    // From now on for longer than this takes.
    QFile changed(file);
    QVERIFY(changed.open(QIODevice::ReadWrite));
    QVERIFY(changed.setFileTime(QDateTime::currentDateTime().addSecs(60), QFileDevice::FileModificationTime));

    QVERIFY(!FileIdentity(file).isSettled());
}

VEL_TEST_GUILESS_MAIN(tst_FileIdentity)

#include "tst_FileIdentity.moc"
