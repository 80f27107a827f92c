// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RegisteredCategories.h"

#include <QHash>

namespace RegisteredCategories {

namespace {

// The related ones as the register writes them: "or" between lists, ";" within one.
struct Row
{
    const char *name;
    const char *related;
};

constexpr Row MainRows[] = {
    {"AudioVideo", ""},  {"Audio", "AudioVideo"}, {"Video", "AudioVideo"},
    {"Development", ""}, {"Education", ""},       {"Game", ""},
    {"Graphics", ""},    {"Network", ""},         {"Office", ""},
    {"Science", ""},     {"Settings", ""},        {"System", ""},
    {"Utility", ""},
};

constexpr Row AdditionalRows[] = {
    {"Building", "Development"},
    {"Debugger", "Development"},
    {"IDE", "Development"},
    {"GUIDesigner", "Development"},
    {"Profiling", "Development"},
    {"RevisionControl", "Development"},
    {"Translation", "Development"},
    {"Calendar", "Office"},
    {"ContactManagement", "Office"},
    {"Database", "Office|Development|AudioVideo"},
    {"Dictionary", "Office|TextTools"},
    {"Chart", "Office"},
    {"Email", "Office|Network"},
    {"Finance", "Office"},
    {"FlowChart", "Office"},
    {"PDA", "Office"},
    {"ProjectManagement", "Office|Development"},
    {"Presentation", "Office"},
    {"Spreadsheet", "Office"},
    {"WordProcessor", "Office"},
    {"2DGraphics", "Graphics"},
    {"VectorGraphics", "Graphics;2DGraphics"},
    {"RasterGraphics", "Graphics;2DGraphics"},
    {"3DGraphics", "Graphics"},
    {"Scanning", "Graphics"},
    {"OCR", "Graphics;Scanning"},
    {"Photography", "Graphics|Office"},
    {"Publishing", "Graphics|Office"},
    {"Viewer", "Graphics|Office"},
    {"TextTools", "Utility"},
    {"DesktopSettings", "Settings"},
    {"HardwareSettings", "Settings"},
    {"Printing", "HardwareSettings;Settings"},
    {"PackageManager", "Settings"},
    {"Dialup", "Network"},
    {"InstantMessaging", "Network"},
    {"Chat", "Network"},
    {"IRCClient", "Network"},
    {"Feed", "Network"},
    {"FileTransfer", "Network"},
    {"HamRadio", "Network|Audio"},
    {"News", "Network"},
    {"P2P", "Network"},
    {"RemoteAccess", "Network"},
    {"Telephony", "Network"},
    {"TelephonyTools", "Utility"},
    {"VideoConference", "Network"},
    {"WebBrowser", "Network"},
    {"WebDevelopment", "Network|Development"},
    {"Midi", "AudioVideo;Audio"},
    {"Mixer", "AudioVideo;Audio"},
    {"Sequencer", "AudioVideo;Audio"},
    {"Tuner", "AudioVideo;Audio"},
    {"TV", "AudioVideo;Video"},
    {"AudioVideoEditing", "Audio|Video|AudioVideo"},
    {"Player", "Audio|Video|AudioVideo"},
    {"Recorder", "Audio|Video|AudioVideo"},
    {"DiscBurning", "Audio|Video|AudioVideo"},
    {"ActionGame", "Game"},
    {"AdventureGame", "Game"},
    {"ArcadeGame", "Game"},
    {"BoardGame", "Game"},
    {"BlocksGame", "Game"},
    {"CardGame", "Game"},
    {"KidsGame", "Game"},
    {"LogicGame", "Game"},
    {"RolePlaying", "Game"},
    {"Shooter", "Game"},
    {"Simulation", "Game"},
    {"SportsGame", "Game"},
    {"StrategyGame", "Game"},
    {"Art", "Education|Science"},
    {"Construction", "Education|Science"},
    {"Music", "AudioVideo|Education"},
    {"Languages", "Education|Science"},
    {"ArtificialIntelligence", "Education|Science"},
    {"Astronomy", "Education|Science"},
    {"Biology", "Education|Science"},
    {"Chemistry", "Education|Science"},
    {"ComputerScience", "Education|Science"},
    {"DataVisualization", "Education|Science"},
    {"Economy", "Education|Science"},
    {"Electricity", "Education|Science"},
    {"Geography", "Education|Science"},
    {"Geology", "Education|Science"},
    {"Geoscience", "Education|Science"},
    {"History", "Education|Science"},
    {"Humanities", "Education|Science"},
    {"ImageProcessing", "Education|Science"},
    {"Literature", "Education|Science"},
    {"Maps", "Education|Science|Utility"},
    {"Math", "Education|Science"},
    {"NumericalAnalysis", "Education;Math|Science;Math"},
    {"MedicalSoftware", "Education|Science"},
    {"Physics", "Education|Science"},
    {"Robotics", "Education|Science"},
    {"Spirituality", "Education|Science|Utility"},
    {"Sports", "Education|Science"},
    {"ParallelComputing", "Education;ComputerScience|Science;ComputerScience"},
    {"Amusement", ""},
    {"Archiving", "Utility"},
    {"Compression", "Utility;Archiving"},
    {"Electronics", ""},
    {"Emulator", "System|Game"},
    {"Engineering", ""},
    {"FileTools", "Utility|System"},
    {"FileManager", "System;FileTools"},
    {"TerminalEmulator", "System"},
    {"Filesystem", "System"},
    {"Monitor", "System|Network"},
    {"Security", "Settings|System"},
    {"Accessibility", "Settings|Utility"},
    {"Calculator", "Utility"},
    {"Clock", "Utility"},
    {"TextEditor", "Utility"},
    {"Documentation", ""},
    {"Adult", ""},
    {"Core", ""},
    {"KDE", "Qt"},
    {"GNOME", "GTK"},
    {"XFCE", "GTK"},
    {"GTK", ""},
    {"Qt", ""},
    {"Motif", ""},
    {"Java", ""},
    {"ConsoleOnly", ""},
};

constexpr Row ReservedRows[] = {{"Screensaver", ""}, {"TrayIcon", ""}, {"Applet", ""}, {"Shell", ""}};

constexpr Row DeprecatedRows[] = {{"Application", ""}, {"Applications", ""}};

Category categoryOf(const Row &row, Kind kind)
{
    Category category{QString::fromLatin1(row.name), kind, {}};
    const QStringList lists = QString::fromLatin1(row.related).split(QLatin1Char('|'), Qt::SkipEmptyParts);
    for (const QString &list : lists)
        category.related.append(list.split(QLatin1Char(';')));
    return category;
}

template <std::size_t Size>
void append(QVector<Category> *categories, const Row (&rows)[Size], Kind kind)
{
    for (const Row &row : rows)
        categories->append(categoryOf(row, kind));
}

QVector<Category> table()
{
    QVector<Category> categories;
    append(&categories, MainRows, Kind::Main);
    append(&categories, AdditionalRows, Kind::Additional);
    append(&categories, ReservedRows, Kind::Reserved);
    append(&categories, DeprecatedRows, Kind::Deprecated);
    return categories;
}

QHash<QString, const Category *> indexOf(const QVector<Category> &categories)
{
    QHash<QString, const Category *> index;
    for (const Category &category : categories)
        index.insert(category.name, &category);
    return index;
}

} // namespace

const QVector<Category> &all()
{
    static const QVector<Category> categories = table();
    return categories;
}

const Category *find(const QString &name)
{
    static const QHash<QString, const Category *> index = indexOf(all());
    return index.value(name, nullptr);
}

bool isMain(const QString &name)
{
    const Category *category = find(name);
    return category && category->kind == Kind::Main;
}

bool isExtension(const QString &name)
{
    return name.startsWith(QLatin1String("X-"));
}

} // namespace RegisteredCategories
