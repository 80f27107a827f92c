// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>
#include <veluiaux/VelUIEntriesAhead.h>

#include <QDir>
#include <QMap>

#include <sys/stat.h>

#include <memory>
#include <random>

/// Entries that are read ahead and loaded, while folders open, close and change.
class tst_VelUIEntriesAhead : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void leavesNoThread();
    void givesWhatTheDiskHolds_data();
    void givesWhatTheDiskHolds();
};

namespace {

constexpr int Folders = 5;
constexpr int Entries = 40;

int threads()
{
    return QDir(QStringLiteral("/proc/self/task")).entryList(QDir::Dirs | QDir::NoDotAndDotDot).size();
}

} // namespace

void tst_VelUIEntriesAhead::leavesNoThread()
{
    for (int i = 0; i < 1000; ++i)
        write(QStringLiteral("m/%1.desktop").arg(i), "[Desktop Entry]\n");
    const int before = threads();
    {
        VelUIEntriesAhead ahead;
        ahead.read(path(QStringLiteral("m")));
        QTRY_COMPARE(threads(), before);
        ahead.read(path(QStringLiteral("m")));
    }
    QTRY_COMPARE(threads(), before);
}

void tst_VelUIEntriesAhead::givesWhatTheDiskHolds_data()
{
    QTest::addColumn<int>("seed");
    for (int seed = 1; seed <= 4; ++seed)
        QTest::newRow(qPrintable(QString::number(seed))) << seed;
}

// The plain model: for each path, the name that was written last.
void tst_VelUIEntriesAhead::givesWhatTheDiskHolds()
{
    QFETCH(int, seed);
    constexpr int Steps = 1500;
    std::mt19937 random{std::mt19937::result_type(seed)};
    const auto below = [&random](int count) { return int(random() % unsigned(count)); };
    QMap<QString, QString> disk;
    std::unique_ptr<VelUIEntriesAhead> readers[2];
    int loads = 0;
    const auto fileOf = [&](int folder, int entry) {
        return entry == 0 ? QStringLiteral("%1/.directory").arg(folder)
                          : QStringLiteral("%1/%2.desktop").arg(folder).arg(entry);
    };
    const auto change = [&](const QString &file) {
        // Of one length, so that the stamp's times have to tell.
        const QString name = QString::number(1000 + below(9000));
        const QByteArray text = "[Desktop Entry]\nType=Application\nName=" + name.toLatin1() + '\n';
        const int how = disk.contains(file) ? below(4) : 0;
        if (how == 0) {
            write(file, text);
        } else if (how == 1) {
            write(QStringLiteral("beside"), text);
            QVERIFY(::rename(qPrintable(path(QStringLiteral("beside"))), qPrintable(path(file))) == 0);
        } else if (how == 2) {
            VelUIDesktopEntry entry(path(file));
            entry.setName(name);
            QVERIFY(entry.save());
        } else {
            QVERIFY(QFile::remove(path(file)));
            disk.remove(file);
            return;
        }
        disk.insert(file, name);
    };
    for (int folder = 0; folder < Folders; ++folder) {
        for (int entry = 0; entry < Entries; ++entry)
            change(fileOf(folder, entry));
    }
    for (int step = 0; step < Steps; ++step) {
        auto &reader = readers[below(2)];
        const QString folder = path(QString::number(below(Folders)));
        const int what = below(40);
        if (what == 0) {
            reader.reset();
        } else if (what < 4) {
            if (!reader)
                reader = std::make_unique<VelUIEntriesAhead>();
            reader->read(folder);
        } else if (what == 4 && reader) {
            reader->giveUp(folder);
        } else if (what < 8) {
            change(fileOf(below(Folders), below(Entries)));
        } else if (what == 8 && below(4) == 0) {
            // Old enough to be kept.
            const QDateTime later = QDateTime::currentDateTime().addMSecs(60);
            QTRY_VERIFY(QDateTime::currentDateTime() >= later);
        } else {
            const QString file = fileOf(below(Folders), below(Entries));
            const VelUIDesktopEntry entry(path(file));
            QCOMPARE(entry.isValid(), disk.contains(file));
            QCOMPARE(entry.getName(), disk.value(file));
            ++loads;
        }
    }
    QVERIFY(loads > Steps / 2);
}

VEL_TEST_GUILESS_MAIN(tst_VelUIEntriesAhead)

#include "tst_VelUIEntriesAhead.moc"
