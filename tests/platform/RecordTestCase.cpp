// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RecordTestCase.h"

QString RecordTestCase::text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

void RecordTestCase::init()
{
    TestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
    qunsetenv("LC_ALL");
    qunsetenv("LC_MESSAGES");
}

QByteArray RecordTestCase::changed(const QByteArray &before, const Change &change)
{
    const QString file = write(QStringLiteral("x.desktop"), before);
    VelUIDesktopEntry record(file);
    change(record);
    if (!record.save())
        QTest::qFail("the record was not saved", __FILE__, __LINE__);
    return read(file);
}
