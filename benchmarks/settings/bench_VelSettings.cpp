// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A settings file of 2,000 keys, against QSettings' own format and KConfig on the same text.

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

QString keyName(int number)
{
    return QStringLiteral("key%1").arg(number, 4, 10, QLatin1Char('0'));
}

QByteArray fileText()
{
    QByteArray text = "[Main]\n";
    for (int i = 0; i < keyCount; ++i) {
        text += keyName(i).toLatin1() + '=';
        if (i % 4 == 0)
            text += QByteArray::number(i);
        else if (i % 4 == 1)
            text += i % 8 == 1 ? "true" : "false";
        else if (i % 4 == 2)
            text += "#d4d0c" + QByteArray::number(i % 10);
        else
            text += "\"Some words of text number " + QByteArray::number(i) + '"';
        text += '\n';
    }
    return text;
}

QString makeFile(const QTemporaryDir &folder, const QString &name)
{
    QFile file(folder.filePath(name));
    if (!file.open(QIODevice::WriteOnly) || file.write(fileText()) < 0)
        qFatal("cannot write %s", qPrintable(file.fileName()));
    return file.fileName();
}

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

} // namespace

int main(int argc, char **argv)
{
    QCoreApplication application(argc, argv);
    // In memory where that is possible: all would wait for a disk alike.
    const QString memory = QStringLiteral("/dev/shm");
    const QTemporaryDir folder((QFileInfo(memory).isWritable() ? memory : QDir::tempPath())
                               + QStringLiteral("/bench-XXXXXX"));
    const QString ours = makeFile(folder, QStringLiteral("ours"));
    const QString ini = makeFile(folder, QStringLiteral("ini"));
    const QString kconfig = makeFile(folder, QStringLiteral("kconfig"));
    QStringList keys;
    QStringList groupedKeys;
    for (int i = 0; i < keyCount; ++i) {
        keys.append(keyName(i));
        groupedKeys.append(QStringLiteral("Main/") + keyName(i));
    }

    Comparison reading("settings file of 2,000 keys: load and read all");
    reading.setPreparation([&] {
        for (const QString &file : {ours, ini, kconfig})
            changeTime(file);
    });
    reading.add("VelSettings", [&] {
        VelSettings settings(ours);
        readAll(keys, [&settings](const QString &key) { return settings.value(key); });
    });
    reading.add(
        "QSettings::IniFormat",
        [&] {
            QSettings settings(ini, QSettings::IniFormat);
            readAll(groupedKeys, [&settings](const QString &key) { return settings.value(key); });
        },
        1.1);
    reading.add(
        "KConfig",
        [&] {
            KConfig config(kconfig, KConfig::SimpleConfig);
            const KConfigGroup group(&config, "Main");
            readAll(keys, [&group](const QString &key) { return QVariant(group.readEntry(key, QString())); });
        },
        0.6);
    const bool readsInTime = reading.run(41);

    VelSettings ourSettings(ours);
    QSettings iniSettings(ini, QSettings::IniFormat);
    KConfig kconfigSettings(kconfig, KConfig::SimpleConfig);
    KConfigGroup kconfigGroup(&kconfigSettings, "Main");
    int value = keyCount;
    Comparison writing("settings file of 2,000 keys: change one and sync");
    writing.setPreparation([&] { ++value; });
    writing.add("VelSettings", [&] {
        ourSettings.setValue(keys.at(1000), value);
        ourSettings.sync();
    });
    writing.add(
        "QSettings::IniFormat",
        [&] {
            iniSettings.setValue(groupedKeys.at(1000), value);
            iniSettings.sync();
        },
        0.85);
    writing.add(
        "KConfig",
        [&] {
            kconfigGroup.writeEntry(keys.at(1000), value);
            kconfigSettings.sync();
        },
        0.6);
    const bool writesInTime = writing.run(41);
    return readsInTime && writesInTime ? 0 : 1;
}
