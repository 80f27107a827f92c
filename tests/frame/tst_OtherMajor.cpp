// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <QProcess>

// The libraries for the two majors of Qt in one process; a library of its name stands in for the other.
class tst_OtherMajor : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isLoadedAlone();
    void refusesToBeLoadedWhereTheOtherIs();
};

void tst_OtherMajor::isLoadedAlone()
{
    QProcess process;
    process.start(QStringLiteral(VEL_LOAD), {QStringLiteral(VEL_LIBRARY)});
    QVERIFY(process.waitForFinished());
    QVERIFY2(process.exitStatus() == QProcess::NormalExit, process.readAllStandardError().constData());
    QCOMPARE(process.readAllStandardOutput(), QByteArray("all are loaded\n"));
}

void tst_OtherMajor::refusesToBeLoadedWhereTheOtherIs()
{
    QProcess process;
    process.start(QStringLiteral(VEL_LOAD), {QStringLiteral(VEL_OTHER), QStringLiteral(VEL_LIBRARY)});
    QVERIFY(process.waitForFinished());
    QCOMPARE(process.exitStatus(), QProcess::CrashExit);
    QVERIFY(process.readAllStandardOutput().isEmpty());
    const QByteArray said = process.readAllStandardError();
    QVERIFY2(said.contains("libveluiextra.so.1") && said.contains("libveluiextra-qt6.so.1")
                 && said.contains("the one is for Qt 5, the other for Qt 6"),
             said.constData());
}

VEL_TEST_GUILESS_MAIN(tst_OtherMajor)

#include "tst_OtherMajor.moc"
