// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Counts its runs in a settings file of the desktop: settings FILE

#include <VelSettings.h>

#include <QCoreApplication>
#include <QTextStream>

int main(int argc, char **argv)
{
    QCoreApplication application(argc, argv);
    if (argc < 2)
        return 2;
    VelSettings settings(application.arguments().at(1)); // the file has to exist
    if (!settings.isParsed())
        return 1;

    const int runs = settings.value(QStringLiteral("Runs"), 0).toInt() + 1;
    settings.setValue(QStringLiteral("Runs"), runs);
    settings.sync();

    QTextStream(stdout) << settings.value(QStringLiteral("SectionName")).toString() << ": " << runs << '\n';
    return 0;
}
