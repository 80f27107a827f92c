// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// 500 theme icons at 22 pixels, seen for the first time and seen again.

#include "Comparison.h"

#include <veluiaux/VelIcon.h>
#include <veluiaux/VelIconTheme.h>

#include <QApplication>
#include <QDirIterator>
#include <QFileInfo>
#include <QPixmap>
#include <QPixmapCache>

#include <cstdio>

namespace {

using Emblems = QMap<Qt::Corner, QString>;

constexpr int count = 500;
constexpr int size = 22;

/// Names of icons that the theme has in this size, spread evenly over all of them.
QStringList themeNames()
{
    QStringList all;
    QDirIterator files(QStringLiteral("/usr/share/icons/breeze"), {QStringLiteral("*.svg")}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext()) {
        files.next();
        if (files.filePath().contains(QStringLiteral("/22/")))
            all.append(files.fileInfo().completeBaseName());
    }
    all.removeDuplicates();
    all.sort();
    QStringList chosen;
    for (int i = 0; i < count && all.size() >= count; ++i)
        chosen.append(all.at(int(qint64(i) * all.size() / count)));
    return chosen;
}

void forget()
{
    VelIconTheme::current(VelIconTheme::DoForceLoad);
    QPixmapCache::clear();
}

int pixels = 0; // what was made is used, so that no compiler leaves it out

template <typename Icon>
Comparison::Work showEach(const QStringList &names, const Icon &icon)
{
    return [names, icon] {
        for (const QString &name : names)
            pixels += icon(name).pixmap(size).width();
    };
}

bool compare(const char *title, const QStringList &names, const Emblems &emblems, bool cold, double most)
{
    Comparison comparison(title);
    comparison.add("VelIcon", showEach(names, [emblems](const QString &name) {
                       return VelIcon::fromTheme(name, emblems, QIcon());
                   }));
    comparison.add("QIcon::fromTheme",
                   showEach(names, [](const QString &name) { return QIcon::fromTheme(name); }), most);
    if (cold)
        comparison.setPreparation(forget);
    return comparison.run(cold ? 9 : 15);
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication application(argc, argv);
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
    const QStringList names = themeNames();
    if (names.isEmpty()) {
        std::fprintf(stderr, "bench_theme_icons: the Breeze icon theme is not installed\n");
        return 1;
    }
    const Emblems emblem{{Qt::BottomLeftCorner, QStringLiteral("emblem-symbolic-link")}};
    bool kept = compare("500 theme icons at 22 pixels, cold", names, Emblems(), true, 0.75);
    kept &= compare("500 theme icons at 22 pixels with an emblem, cold", names, emblem, true, 0.85);
    kept &= compare("500 theme icons at 22 pixels, warm", names, Emblems(), false, 0.1);
    kept &= compare("500 theme icons at 22 pixels with an emblem, warm", names, emblem, false, 0.1);
    return kept && pixels > 0 ? 0 : 1;
}
