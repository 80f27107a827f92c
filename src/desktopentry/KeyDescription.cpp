// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyDescription.h"

#include <QCoreApplication>

namespace {

struct Text
{
    const char *key;
    const char *source;
};

constexpr Text texts[] = {
    {"Type",
     QT_TRANSLATE_NOOP(
         "KeyDescription",
         "Whether the entry starts a program, opens an address or describes a folder of the menu.")},
    {"Name", QT_TRANSLATE_NOOP("KeyDescription", "The name that menus show.")},
    {"Icon",
     QT_TRANSLATE_NOOP(
         "KeyDescription",
         "The icon that menus show: a name from the icon theme, or the full path of a picture.")},
    {"Exec",
     QT_TRANSLATE_NOOP(
         "KeyDescription",
         "The command that starts the program, with codes such as %f for the files that it opens.")},
    {"Terminal", QT_TRANSLATE_NOOP("KeyDescription", "Whether the program needs a terminal window.")},
    {"Path", QT_TRANSLATE_NOOP("KeyDescription", "The folder in which the program starts.")},
    {"TryExec",
     QT_TRANSLATE_NOOP("KeyDescription",
                       "A program that has to be installed; without it menus leave the entry out.")},
    {"URL", QT_TRANSLATE_NOOP("KeyDescription", "The address that the entry opens.")},
    {"GenericName", QT_TRANSLATE_NOOP("KeyDescription", "What kind of program it is, such as: Web browser.")},
    {"Comment",
     QT_TRANSLATE_NOOP("KeyDescription", "A sentence about the program, which menus show as a tip.")},
    {"NoDisplay",
     QT_TRANSLATE_NOOP("KeyDescription",
                       "Whether menus leave the entry out although the program can be used.")},
    {"Hidden", QT_TRANSLATE_NOOP("KeyDescription", "Whether the entry counts as deleted.")},
    {"OnlyShowIn",
     QT_TRANSLATE_NOOP("KeyDescription",
                       "The desktop environments that alone show the entry; none means all.")},
    {"NotShowIn",
     QT_TRANSLATE_NOOP("KeyDescription", "The desktop environments that do not show the entry.")},
    {"MimeType", QT_TRANSLATE_NOOP("KeyDescription", "The types of files that the program opens.")},
    {"Categories",
     QT_TRANSLATE_NOOP("KeyDescription", "The groups of the menu that the program belongs to.")},
    {"Keywords",
     QT_TRANSLATE_NOOP("KeyDescription", "Words by which a search finds the program beside its name.")},
    {"StartupNotify",
     QT_TRANSLATE_NOOP(
         "KeyDescription",
         "Whether the program tells when it has started, so that the pointer shows it until then.")},
    {"StartupWMClass",
     QT_TRANSLATE_NOOP("KeyDescription",
                       "The class of the window by which the desktop knows that the program has started.")},
    {"Actions",
     QT_TRANSLATE_NOOP("KeyDescription",
                       "Further things that the program can be started for, such as: New window.")},
    {"Version",
     QT_TRANSLATE_NOOP("KeyDescription", "The version of the standard for entries that this one follows.")},
};

const char *sourceOf(const QString &key)
{
    for (const Text &text : texts) {
        if (key == QLatin1String(text.key))
            return text.source;
    }
    return nullptr;
}

} // namespace

QString KeyDescription::of(const QString &key)
{
    const char *const source = sourceOf(key);
    return source ? QCoreApplication::translate("KeyDescription", source) : QString();
}

QString KeyDescription::ofTranslation(const QString &key)
{
    return QCoreApplication::translate("KeyDescription", "%1 Only for users of one language.",
                                       "%1 is a sentence about a key")
        .arg(of(key));
}
