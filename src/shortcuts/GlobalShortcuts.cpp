// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GlobalShortcuts.h"

#include "KeyMatcher.h"
#include "QuotedText.h"

#include <velcore/dirs.h>
#include <velcore/session.h>

#include <QFile>
#include <QKeySequence>

#include <cstdio>
#include <memory>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

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
using FilePointer = std::unique_ptr<FILE, FileCloser>;

// Only a regular file has a size; opening a pipe must not wait for its writer.
FilePointer openFile(const QByteArray &name)
{
    const int descriptor = ::open(name.constData(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    if (descriptor < 0)
        return nullptr;
    struct stat status = {};
    const bool isUsable = fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode)
        && status.st_size <= GlobalShortcuts::LargestFile;
    FilePointer file(isUsable ? fdopen(descriptor, "rb") : nullptr);
    if (!file)
        ::close(descriptor);
    return file;
}

bool load(CSimpleIniA &ini, const QString &path)
{
    const FilePointer file = openFile(path.toLocal8Bit());
    return file && ini.LoadFile(file.get()) >= 0;
}

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
    const CSimpleIniA::TKeyVal *bindings = ini.GetSection("ShortCutKeys");
    if (!bindings)
        return {};
    const KeyMatcher matcher(sequence);
    for (const auto &binding : *bindings) {
        if (matcher.matches(binding.first.pItem))
            return QuotedText::withoutQuotes(QString::fromUtf8(binding.second));
    }
    return {};
}
