// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

/// Entries for the tests of the form and its dialog. The commands exist everywhere.
namespace EntrySamples {

/// An application with every key that the form shows.
inline QByteArray fullApplication()
{
    return "# A comment\n"
           "[Desktop Entry]\n"
           "Version=1.5\n"
           "Type=Application\n"
           "Name=Full\n"
           "Name[de]=Voll\n"
           "Name[fr]=Plein\n"
           "GenericName=Generic\n"
           "GenericName[de]=Allgemein\n"
           "Comment=Does all\n"
           "Comment[de]=Macht alles\n"
           "Icon=folder\n"
           "Icon[de]=folder-de\n"
           "NoDisplay=false\n"
           "OnlyShowIn=VEL;Other;\n"
           "TryExec=/bin/sh\n"
           "Exec=/bin/sh -c true %u\n"
           "Path=/tmp\n"
           "Terminal=true\n"
           "MimeType=text/plain;image/png;\n"
           "Categories=Utility;Qt;\n"
           "Keywords=one;two;\n"
           "Keywords[de]=eins;zwei;\n"
           "StartupNotify=true\n"
           "StartupWMClass=Full\n"
           "Actions=new;quit;\n"
           "X-Vendor-Key=keep me\n"
           "\n"
           "[Desktop Action new]\n"
           "Name=New\n"
           "Name[fr]=Nouveau\n"
           "Exec=/bin/sh -c new\n"
           "\n"
           "[Desktop Action quit]\n"
           "Name=Quit\n"
           "Exec=/bin/sh -c quit\n"
           "\n"
           "[X-Group]\n"
           "Key=Value\n";
}

inline QByteArray link()
{
    return "[Desktop Entry]\nType=Link\nName=Page\nURL=https://www.freedesktop.org\n";
}

inline QByteArray directory()
{
    return "[Desktop Entry]\nType=Directory\nName=Folder\nIcon=folder\nSortOrder=b.desktop;a.desktop;*;\n";
}

} // namespace EntrySamples
