// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A settings file of 2,000 keys, against QSettings' own format and KConfig on the same text: with names
// that sort after the one under which the section is kept, and with names that sort before it.

#include "Comparison.h"

#include <VelSettings.h>

#include <KConfig>
#include <KConfigGroup>

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSettings>
#include <QTemporaryDir>
#include <QVector>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

constexpr int keyCount = 2000;

QString keyName(const QString &prefix, int number)
{
    return prefix + QStringLiteral("%1").arg(number, 4, 10, QLatin1Char('0'));
}

QByteArray valueText(int number)
{
    switch (number % 4) {
    case 0:
        return QByteArray::number(number);
    case 1:
        return number % 8 == 1 ? "true" : "false";
    case 2:
        return "#d4d0c" + QByteArray::number(number % 10);
    default:
        return "\"Some words of text number " + QByteArray::number(number) + '"';
    }
}

// The same settings in three files, one for each candidate.
struct Files
{
    Files(const QTemporaryDir &folder, const QString &prefix)
        : ours(make(folder, prefix, QStringLiteral("ours")))
        , ini(make(folder, prefix, QStringLiteral("ini")))
        , kconfig(make(folder, prefix, QStringLiteral("kconfig")))
    {
        for (int i = 0; i < keyCount; ++i) {
            keys.append(keyName(prefix, i));
            groupedKeys.append(QStringLiteral("Main/") + keyName(prefix, i));
        }
    }

    static QString make(const QTemporaryDir &folder, const QString &prefix, const QString &name)
    {
        QByteArray text = "[Main]\n";
        for (int i = 0; i < keyCount; ++i)
            text += keyName(prefix, i).toLatin1() + '=' + valueText(i) + '\n';
        QFile file(folder.filePath(prefix + name));
        if (!file.open(QIODevice::WriteOnly) || file.write(text) < 0)
            qFatal("cannot write %s", qPrintable(file.fileName()));
        return file.fileName();
    }

    const QString ours;
    const QString ini;
    const QString kconfig;
    QStringList keys;
    QStringList groupedKeys;
};

// A time that the file never had, so that QSettings does not answer from its cache.
void changeTime(const QString &path)
{
    static time_t seconds = 1000000000;
    const timespec times[2] = {{++seconds, 0}, {seconds, 0}};
    utimensat(AT_FDCWD, QFile::encodeName(path).constData(), times, 0);
}

template <typename Read>
void readAll(const QStringList &keys, Read read)
{
    int length = 0;
    for (const QString &key : keys)
        length += read(key).toString().size();
    if (length < 10 * keyCount)
        qFatal("not all was read: %d", length);
}

bool compareReading(const std::string &title, const Files &files, double iniLimit)
{
    Comparison reading(title + ": load and read all");
    reading.setPreparation([&] {
        for (const QString &file : {files.ours, files.ini, files.kconfig})
            changeTime(file);
    });
    reading.add("VelSettings", [&] {
        VelSettings settings(files.ours);
        readAll(files.keys, [&settings](const QString &key) { return settings.value(key); });
    });
    reading.add(
        "QSettings::IniFormat",
        [&] {
            QSettings settings(files.ini, QSettings::IniFormat);
            readAll(files.groupedKeys, [&settings](const QString &key) { return settings.value(key); });
        },
        iniLimit);
    reading.add(
        "KConfig",
        [&] {
            KConfig config(files.kconfig, KConfig::SimpleConfig);
            const KConfigGroup group(&config, "Main");
            readAll(files.keys,
                    [&group](const QString &key) { return QVariant(group.readEntry(key, QString())); });
        },
        0.6);
    return reading.run(41);
}

bool compareWriting(const Files &files)
{
    VelSettings ourSettings(files.ours);
    QSettings iniSettings(files.ini, QSettings::IniFormat);
    KConfig kconfigSettings(files.kconfig, KConfig::SimpleConfig);
    KConfigGroup kconfigGroup(&kconfigSettings, "Main");
    int value = keyCount;
    Comparison writing("settings file of 2,000 keys: change one and sync");
    writing.setPreparation([&] { ++value; });
    writing.add("VelSettings", [&] {
        ourSettings.setValue(files.keys.at(1000), value);
        ourSettings.sync();
    });
    writing.add(
        "QSettings::IniFormat",
        [&] {
            iniSettings.setValue(files.groupedKeys.at(1000), value);
            iniSettings.sync();
        },
        0.85);
    writing.add(
        "KConfig",
        [&] {
            kconfigGroup.writeEntry(files.keys.at(1000), value);
            kconfigSettings.sync();
        },
        0.6);
    return writing.run(41);
}

} // namespace

int main(int argc, char **argv)
{
    QCoreApplication application(argc, argv);
    // In memory where that is possible: all would wait for a disk alike.
    const QString memory = QStringLiteral("/dev/shm");
    const QTemporaryDir folder((QFileInfo(memory).isWritable() ? memory : QDir::tempPath())
                               + QStringLiteral("/bench-XXXXXX"));
    const Files after(folder, QStringLiteral("key"));
    const Files before(folder, QStringLiteral("Key"));
    const bool readsInTime = compareReading("settings file of 2,000 keys", after, 1.1);
    const bool readsCapitalsInTime =
        compareReading("settings file of 2,000 keys that begin with a capital letter", before, 1.25);
    const bool writesInTime = compareWriting(after);
    return readsInTime && readsCapitalsInTime && writesInTime ? 0 : 1;
}
