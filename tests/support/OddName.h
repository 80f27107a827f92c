// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QFile>
#include <QString>
#include <QTest>

#include <fstream>
#include <string>

/// Makes an entry in \a folder whose name Qt cannot tell, which is why it is made without Qt. The
/// \a number makes another of it. Many together leave no order of the file system in which none
/// comes first.
inline void writeOddName(const QString &folder, int number = 0)
{
    const std::string file =
        QFile::encodeName(folder).toStdString() + "/raw\xff" + std::to_string(number) + ".desktop";
    std::ofstream(file) << "[Desktop Entry]\nType=Application\nName=Raw\nExec=true\n";
    if (!std::ifstream(file).is_open())
        QTest::qFail("the file cannot be made", __FILE__, __LINE__);
}
