// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GlobalShortcuts.h"

#include "KeyNames.h"
#include "KeySequences.h"
#include "VelKeyServer.h"

#include <velcore/dirs.h>
#include <velcore/session.h>

#include <QFile>
#include <QKeySequence>

#include <cstdio>
#include <memory>
#include <optional>

#include <sys/stat.h>

// Packages leave out what the conversions need, and some hide the functions behind a library
// that was built with other conversions; bytes are all that is wanted here.
#define SI_NO_CONVERSION
#define SI_IMPLEMENTATION
#include <SimpleIni.h>

namespace {

struct FileCloser
{
    void operator()(FILE *file) const { std::fclose(file); }
};

bool load(CSimpleIniA &ini, const QString &path)
{
    const QByteArray name = path.toLocal8Bit();
    // Only a regular file has a size; opening a pipe would wait for its writer.
    struct stat status = {};
    if (stat(name.constData(), &status) != 0 || !S_ISREG(status.st_mode))
        return false;
    const std::unique_ptr<FILE, FileCloser> file(std::fopen(name.constData(), "rb"));
    return file && ini.LoadFile(file.get()) >= 0;
}

QString withoutQuotes(QString text)
{
    if (text.startsWith(QLatin1Char('"'))) {
        text.remove(0, 1);
        text.chop(1);
    }
    return text;
}

// Compares the keys of the file with one sequence.
class KeyMatcher
{
public:
    explicit KeyMatcher(const QKeySequence &wanted)
        : m_wanted(wanted)
    {
    }

    bool matches(const char *fileKey) const
    {
        if (const std::optional<int> code = simpleCode(fileKey))
            return m_wanted.count() == 1 && m_wanted[0] == *code;
        return matchesText(fileKey);
    }

private:
    bool matchesText(const char *fileKey) const
    {
        QString key = withoutQuotes(QString::fromUtf8(fileKey));
        key.replace(QLatin1Char('|'), QLatin1Char('+'));
        key.remove(QLatin1String("None+"));
        const QString converted = VelKeyServer::KeyStringXToQt(key);
        const QKeySequence sequence(converted.isEmpty() ? key : converted, QKeySequence::NativeText);
        return KeySequences::isKnown(sequence) && sequence == m_wanted;
    }

    // The key code of a file key for which the way over its text, which takes ten times as
    // long, is known to end in the same code.
    static std::optional<int> simpleCode(const char *fileKey)
    {
        QByteArray key(fileKey);
        for (const char byte : qAsConst(key)) {
            if (static_cast<unsigned char>(byte) >= 0x80)
                return std::nullopt;
        }
        if (key.startsWith('"')) {
            key.remove(0, 1);
            key.chop(1);
        }
        key.replace('|', '+');
        key.replace("None+", "");
        const std::optional<int> code = KeyNames::codeFromKeyString(key);
        return code && KeyNames::readsBackUnchanged(*code) ? code : std::nullopt;
    }

    const QKeySequence m_wanted;
};

} // namespace

QString GlobalShortcuts::filePath()
{
    const QString folder = QString::fromStdString(GetVelDir(VelDir::WindowManagerConfig));
    return folder + QLatin1String("/keyshortcutrc") + QString::fromStdString(velSessionConfigSuffix(0));
}

QString GlobalShortcuts::find(const QString &path, const QKeySequence &sequence)
{
    CSimpleIniA ini;
    if (path.isEmpty() || !load(ini, path))
        return {};
    const CSimpleIniA::TKeyVal *entries = ini.GetSection("ShortCutKeys");
    if (!entries)
        return {};
    const KeyMatcher matcher(sequence);
    for (const auto &entry : *entries) {
        if (matcher.matches(entry.first.pItem))
            return withoutQuotes(QString::fromUtf8(entry.second));
    }
    return {};
}
