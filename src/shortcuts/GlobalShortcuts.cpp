// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GlobalShortcuts.h"

#include "KeyMatcher.h"
#include "QuotedText.h"

#include <velcore/dirs.h>
#include <velcore/session.h>

#include <QFile>
#include <QKeySequence>

#include <cstring>
#include <string_view>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

// Packages leave out what the conversions need, and some hide the functions behind a library
// that was built with other conversions; bytes are all that is wanted here.
#define SI_NO_CONVERSION
#define SI_IMPLEMENTATION
#include <SimpleIni.h>

namespace {

// Nothing, unless all of it can be read. Only a regular file has a size; opening a pipe must not wait for
// its writer.
QByteArray contents(const QString &path)
{
    const int descriptor = ::open(path.toLocal8Bit().constData(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    if (descriptor < 0)
        return {};
    QByteArray bytes;
    struct stat status = {};
    if (fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode)
        && status.st_size <= GlobalShortcuts::LargestFile) {
        bytes.resize(int(status.st_size));
        QFile file;
        if (!file.open(descriptor, QIODevice::ReadOnly | QIODevice::Unbuffered)
            || file.read(bytes.data(), bytes.size()) != bytes.size())
            bytes.clear();
    }
    ::close(descriptor);
    return bytes;
}

bool isBlank(char character)
{
    return character == ' ' || character == '\t';
}

// The key in a line; none where the line has no "=".
std::string_view keyOf(std::string_view line)
{
    std::string_view key = line.substr(0, line.find('='));
    if (key.size() == line.size())
        return {};
    while (!key.empty() && isBlank(key.front()))
        key.remove_prefix(1);
    while (!key.empty() && isBlank(key.back()))
        key.remove_suffix(1);
    return key;
}

// Whether any line has a key that matches, in whatever section or comment it stands. Parsing the file
// takes several times as long, and mostly nothing matches.
bool mayMatch(const QByteArray &bytes, const KeyMatcher &matcher)
{
    const char *begin = bytes.constData();
    const char *const end = begin + bytes.size();
    if (bytes.startsWith("\xef\xbb\xbf"))
        begin += 3;
    while (begin < end) {
        // Stops at a zero, too: one inside, or the one behind the bytes.
        const char *const lineEnd = begin + std::strcspn(begin, "\n\r");
        const std::string_view key = keyOf({begin, std::size_t(lineEnd - begin)});
        if (!key.empty() && matcher.matches(key))
            return true;
        begin = lineEnd + 1;
    }
    return false;
}

} // namespace

QString GlobalShortcuts::filePath()
{
    const QString folder = QString::fromStdString(GetVelDir(VelDir::WindowManagerConfig));
    return folder + QLatin1String("/keyshortcutrc") + QString::fromStdString(velSessionConfigSuffix(0));
}

QString GlobalShortcuts::find(const QString &path, const QKeySequence &sequence)
{
    const QByteArray bytes = path.isEmpty() ? QByteArray() : contents(path);
    if (bytes.isEmpty())
        return {};
    const KeyMatcher matcher(sequence);
    CSimpleIniA ini;
    if (!mayMatch(bytes, matcher) || ini.LoadData(bytes.constData(), std::size_t(bytes.size())) < 0)
        return {};
    const CSimpleIniA::TKeyVal *bindings = ini.GetSection("ShortCutKeys");
    if (!bindings)
        return {};
    for (const auto &binding : *bindings) {
        if (matcher.matches(binding.first.pItem))
            return QuotedText::withoutQuotes(QString::fromUtf8(binding.second));
    }
    return {};
}
