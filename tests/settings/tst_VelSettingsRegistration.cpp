// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Qt has room for sixteen formats of an application's own; here they are all taken.

#include "StderrCapture.h"
#include "TestCase.h"

#include <VelSettings.h>

#include <QSettings>

namespace {

bool refuse(QIODevice &, QSettings::SettingsMap &)
{
    return false;
}

bool refuseToWrite(QIODevice &, const QSettings::SettingsMap &)
{
    return false;
}

} // namespace

class tst_VelSettingsRegistration : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void goesOnWithTheInvalidFormatAndTriesAgain();
};

void tst_VelSettingsRegistration::goesOnWithTheInvalidFormatAndTriesAgain()
{
    while (QSettings::registerFormat(QStringLiteral("taken"), refuse, refuseToWrite)
           != QSettings::InvalidFormat) { }
    const QByteArray message("VelSettings: custom format 16 NOT registered\n");
    const QString file = write(QStringLiteral("rc"), "a=1\n");
    expectWarning(QStringLiteral("Cant register format!"));
    expectWarning(QStringLiteral("Cant register format!"));

    StderrCapture missing;
    VelSettings none(path(QStringLiteral("none")));
    QCOMPARE(missing.take(), QByteArray()); // a missing file never gets that far

    StderrCapture first;
    VelSettings settings(file);
    QCOMPARE(first.take(), message);
    QVERIFY(!settings.isParsed());
    QCOMPARE(settings.value(QStringLiteral("a"), 5), QVariant(5));

    StderrCapture second;
    QVERIFY(!settings.ParseConfigFile(file));
    QCOMPARE(second.take(), message);

    settings.setValue(QStringLiteral("a"), 2);
    settings.sync(true);
    QCOMPARE(read(file), QByteArray("a=1\n"));
}

VEL_TEST_GUILESS_MAIN(tst_VelSettingsRegistration)

#include "tst_VelSettingsRegistration.moc"
