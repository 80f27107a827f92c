// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CategoryNames.h"

#include <QCoreApplication>
#include <QHash>

namespace VelUI {

namespace {

struct Name
{
    const char *category;
    const char *text;
};

constexpr Name Names[] = {
    {"AudioVideo", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Audio and video")},
    {"Audio", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Audio")},
    {"Video", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Video")},
    {"Development", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Software development")},
    {"Education", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Education")},
    {"Game", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Games")},
    {"Graphics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Graphics")},
    {"Network", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Internet and network")},
    {"Office", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Office")},
    {"Science", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Science")},
    {"Settings", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Settings")},
    {"System", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "System tools")},
    {"Utility", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Accessories")},
    {"Building", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Build tools")},
    {"Debugger", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Debuggers")},
    {"IDE", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Development environments")},
    {"GUIDesigner", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Designers of user interfaces")},
    {"Profiling", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Profilers")},
    {"RevisionControl", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Revision control")},
    {"Translation", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Translation tools")},
    {"Calendar", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Calendars")},
    {"ContactManagement", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Address books")},
    {"Database", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Databases")},
    {"Dictionary", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Dictionaries")},
    {"Chart", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Charts")},
    {"Email", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Email")},
    {"Finance", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Finances")},
    {"FlowChart", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Flow charts")},
    {"PDA", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Handheld devices")},
    {"ProjectManagement", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Project management")},
    {"Presentation", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Presentations")},
    {"Spreadsheet", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Spreadsheets")},
    {"WordProcessor", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Word processors")},
    {"2DGraphics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Two-dimensional graphics")},
    {"VectorGraphics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Vector graphics")},
    {"RasterGraphics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Raster graphics")},
    {"3DGraphics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Three-dimensional graphics")},
    {"Scanning", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Scanning")},
    {"OCR", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Text recognition")},
    {"Photography", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Photography")},
    {"Publishing", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Desktop publishing")},
    {"Viewer", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Viewers")},
    {"TextTools", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Text tools")},
    {"DesktopSettings", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Desktop settings")},
    {"HardwareSettings", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Hardware settings")},
    {"Printing", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Printing")},
    {"PackageManager", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Package managers")},
    {"Dialup", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Dial-up connections")},
    {"InstantMessaging", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Instant messaging")},
    {"Chat", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Chat")},
    {"IRCClient", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "IRC")},
    {"Feed", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "News feeds")},
    {"FileTransfer", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "File transfer")},
    {"HamRadio", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Amateur radio")},
    {"News", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Newsgroups")},
    {"P2P", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "File sharing")},
    {"RemoteAccess", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Remote access")},
    {"Telephony", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Telephony")},
    {"TelephonyTools", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Telephony tools")},
    {"VideoConference", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Video conferences")},
    {"WebBrowser", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Web browsers")},
    {"WebDevelopment", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Web development")},
    {"Midi", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "MIDI")},
    {"Mixer", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Mixers")},
    {"Sequencer", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Sequencers")},
    {"Tuner", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Tuners")},
    {"TV", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Television")},
    {"AudioVideoEditing", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Audio and video editing")},
    {"Player", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Players")},
    {"Recorder", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Recorders")},
    {"DiscBurning", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Disc burning")},
    {"ActionGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Action games")},
    {"AdventureGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Adventure games")},
    {"ArcadeGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Arcade games")},
    {"BoardGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Board games")},
    {"BlocksGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Falling blocks games")},
    {"CardGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Card games")},
    {"KidsGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Games for children")},
    {"LogicGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Logic games")},
    {"RolePlaying", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Role-playing games")},
    {"Shooter", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Shooters")},
    {"Simulation", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Simulations")},
    {"SportsGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Sports games")},
    {"StrategyGame", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Strategy games")},
    {"Art", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Art")},
    {"Construction", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Construction")},
    {"Music", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Music")},
    {"Languages", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Languages")},
    {"ArtificialIntelligence", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Artificial intelligence")},
    {"Astronomy", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Astronomy")},
    {"Biology", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Biology")},
    {"Chemistry", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Chemistry")},
    {"ComputerScience", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Computer science")},
    {"DataVisualization", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Data visualization")},
    {"Economy", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Economics")},
    {"Electricity", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Electricity")},
    {"Geography", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Geography")},
    {"Geology", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Geology")},
    {"Geoscience", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Earth sciences")},
    {"History", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "History")},
    {"Humanities", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Humanities")},
    {"ImageProcessing", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Image processing")},
    {"Literature", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Literature")},
    {"Maps", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Maps")},
    {"Math", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Mathematics")},
    {"NumericalAnalysis", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Numerical analysis")},
    {"MedicalSoftware", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Medicine")},
    {"Physics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Physics")},
    {"Robotics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Robotics")},
    {"Spirituality", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Spirituality")},
    {"Sports", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Sports")},
    {"ParallelComputing", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Parallel computing")},
    {"Amusement", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Amusement")},
    {"Archiving", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Archiving")},
    {"Compression", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Compression")},
    {"Electronics", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Electronics")},
    {"Emulator", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Emulators")},
    {"Engineering", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Engineering")},
    {"FileTools", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "File tools")},
    {"FileManager", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "File managers")},
    {"TerminalEmulator", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Terminals")},
    {"Filesystem", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "File systems")},
    {"Monitor", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Monitors")},
    {"Security", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Security")},
    {"Accessibility", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Accessibility")},
    {"Calculator", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Calculators")},
    {"Clock", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Clocks")},
    {"TextEditor", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Text editors")},
    {"Documentation", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Documentation")},
    {"Adult", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "For adults")},
    {"Core", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Core of the desktop")},
    {"KDE", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Made with KDE")},
    {"GNOME", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Made with GNOME")},
    {"XFCE", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Made with Xfce")},
    {"GTK", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Made with GTK")},
    {"Qt", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Made with Qt")},
    {"Motif", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Made with Motif")},
    {"Java", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Made with Java")},
    {"ConsoleOnly", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "For the console")},
    {"Screensaver", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Screen savers")},
    {"TrayIcon", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Icons of the system tray")},
    {"Applet", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Applets of a panel")},
    {"Shell", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Desktop shells")},
    {"Application", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Applications")},
    {"Applications", QT_TRANSLATE_NOOP("VelUI::CategoryNames", "Applications")},
};

QHash<QString, const char *> table()
{
    QHash<QString, const char *> table;
    for (const Name &name : Names)
        table.insert(QLatin1String(name.category), name.text);
    return table;
}

} // namespace

QString CategoryNames::of(const QString &category)
{
    static const QHash<QString, const char *> texts = table();
    const char *const text = texts.value(category);
    return text ? QCoreApplication::translate("VelUI::CategoryNames", text) : category;
}

} // namespace VelUI
