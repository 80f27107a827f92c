// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SourceFiles.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QRegularExpression>

namespace {

const QString SourceDir = QStringLiteral(VEL_SOURCE_DIR);

// The file of ours that an include names, tried in the order in which the compiler would.
QString resolve(const QString &includer, const QString &written)
{
    QStringList folders{QFileInfo(includer).path(), QStringLiteral("src"), QStringLiteral("include"),
                        QStringLiteral("apps"), QStringLiteral("platform/rules")};
    for (const char *library : {"velcore", "veluiaux", "velintegration"}) {
        folders << QStringLiteral("platform/%1/include").arg(QLatin1String(library))
                << QStringLiteral("platform/%1").arg(QLatin1String(library));
    }
    for (const QString &folder : qAsConst(folders)) {
        const QString file = QDir::cleanPath(folder + QLatin1Char('/') + written);
        if (QFileInfo(SourceFiles::absolute(file)).isFile())
            return file;
    }
    return QString();
}

// The unit of each source file of the library by its name alone.
const QMap<QString, QString> &unitsOfPublicHeaders()
{
    static const QMap<QString, QString> units = [] {
        QMap<QString, QString> found;
        for (const QString &file : SourceFiles::below(QStringLiteral("src"))) {
            if (file.endsWith(QLatin1String(".cpp")))
                found.insert(QFileInfo(file).completeBaseName(),
                             file.left(file.lastIndexOf(QLatin1Char('.'))));
        }
        return found;
    }();
    return units;
}

// What can be reached from a unit.
QSet<QString> reachable(const SourceFiles::Graph &graph, const QString &start)
{
    QSet<QString> seen;
    QStringList open(start);
    while (!open.isEmpty()) {
        for (const QString &next : graph.value(open.takeLast())) {
            if (seen.contains(next))
                continue;
            seen.insert(next);
            open.append(next);
        }
    }
    return seen;
}

} // namespace

QString SourceFiles::absolute(const QString &file)
{
    return SourceDir + QLatin1Char('/') + file;
}

QString SourceFiles::textOf(const QString &file)
{
    QFile device(absolute(file));
    return device.open(QIODevice::ReadOnly) ? QString::fromUtf8(device.readAll()) : QString();
}

QStringList SourceFiles::below(const QString &folder)
{
    QStringList files;
    QDirIterator iterator(absolute(folder),
                          {QStringLiteral("*.h"), QStringLiteral("*.cpp"), QStringLiteral("*.c")},
                          QDir::Files, QDirIterator::Subdirectories);
    while (iterator.hasNext())
        files.append(QDir(SourceDir).relativeFilePath(iterator.next()));
    files.sort();
    return files;
}

bool SourceFiles::isBelow(const QString &file, const QString &folder)
{
    return file.startsWith(folder + QLatin1Char('/'));
}

QVector<SourceFiles::Include> SourceFiles::includesOf(const QString &file)
{
    static const QRegularExpression pattern(QStringLiteral("^\\s*#\\s*include\\s*[<\"]([^>\"]+)[>\"]"));
    QVector<Include> includes;
    int number = 0;
    for (const QString &line : textOf(file).split(QLatin1Char('\n'))) {
        ++number;
        const QRegularExpressionMatch match = pattern.match(line);
        if (match.hasMatch())
            includes.append({resolve(file, match.captured(1)), match.captured(1), number});
    }
    return includes;
}

QStringList SourceFiles::stringLiterals(const QString &text)
{
    // A character constant may hold a quotation mark; whichever begins first ends first.
    static const QRegularExpression token(
        QStringLiteral("//[^\\n]*|/\\*.*?\\*/|'(?:\\\\.|[^'\\\\\\n])+'|\"((?:\\\\.|[^\"\\\\\\n])*)\""),
        QRegularExpression::DotMatchesEverythingOption);
    QStringList literals;
    QRegularExpressionMatchIterator matches = token.globalMatch(text);
    while (matches.hasNext()) {
        const QRegularExpressionMatch match = matches.next();
        if (match.capturedStart(1) >= 0)
            literals.append(match.captured(1));
    }
    return literals;
}

QString SourceFiles::unitOf(const QString &file)
{
    const QString name = QFileInfo(file).completeBaseName();
    if (isBelow(file, QStringLiteral("include")))
        return unitsOfPublicHeaders().value(name, QStringLiteral("include/") + name);
    return file.left(file.lastIndexOf(QLatin1Char('.')));
}

QVector<QStringList> SourceFiles::circles(const Graph &graph)
{
    QMap<QString, QSet<QString>> reached;
    for (auto it = graph.begin(); it != graph.end(); ++it)
        reached.insert(it.key(), reachable(graph, it.key()));

    QVector<QStringList> found;
    QSet<QString> known;
    for (const QString &unit : graph.keys()) {
        if (known.contains(unit) || !reached.value(unit).contains(unit))
            continue;
        QStringList circle;
        for (const QString &other : reached.value(unit)) {
            if (reached.value(other).contains(unit))
                circle.append(other);
        }
        known += QSet<QString>(circle.begin(), circle.end());
        circle.sort();
        if (circle.size() > 1)
            found.append(circle);
    }
    return found;
}
