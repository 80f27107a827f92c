// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TransferTestCase.h"

#include <QClipboard>

void TransferTestCase::init()
{
    MenuTestCase::init();
    m_a = writeEntry(QStringLiteral("a.desktop"), QStringLiteral("A"));
    m_sub = writeFolder(QStringLiteral("sub"), QStringLiteral("Sub"));
    for (const char *letter : {"x", "y", "z"})
        writeEntry(QStringLiteral("sub/%1.desktop").arg(QLatin1String(letter)),
                   QString::fromLatin1(letter).toUpper());
}

void TransferTestCase::cleanup()
{
    QGuiApplication::clipboard()->clear();
    MenuTestCase::cleanup();
}
