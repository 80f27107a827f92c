// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <atomic>
#include <thread>
#include <vector>

/// Records in several threads, all of one file.
class tst_DesktopEntryThreads : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void readOneFileInManyThreads();
    void loseNoChangeThatAnotherThreadSaves();
    void copyARecordToOtherThreads();
};

namespace {

constexpr int Threads = 4;
const QByteArray Header = "[Desktop Entry]\n";

template <typename Work>
void inThreads(Work work)
{
    std::vector<std::thread> threads;
    for (int i = 0; i < Threads; ++i)
        threads.emplace_back(work, i);
    for (std::thread &thread : threads)
        thread.join();
}

} // namespace

void tst_DesktopEntryThreads::readOneFileInManyThreads()
{
    const QString file = write(QStringLiteral("x.desktop"),
                               Header + "Name=A\nName[en]=E\nActions=a;\n\n[Desktop Action a]\nName=B\n");
    std::atomic<int> wrong{0};
    // Long enough for the text to become one that the threads share.
    inThreads([&](int) {
        for (int i = 0; i < 20000; ++i) {
            const VelUIDesktopEntry record(file);
            if (record.getName() != QLatin1String("A") || record.getLocalName() != QLatin1String("E")
                || record.getActions().size() != 1 || !record.isValid())
                ++wrong;
        }
    });
    QCOMPARE(wrong.load(), 0);
}

void tst_DesktopEntryThreads::loseNoChangeThatAnotherThreadSaves()
{
    const QString file = write(QStringLiteral("x.desktop"), Header);
    using Setter = void (VelUIDesktopEntry::*)(const QString &);
    const Setter setters[Threads] = {&VelUIDesktopEntry::setName, &VelUIDesktopEntry::setIcon,
                                     &VelUIDesktopEntry::setExec, &VelUIDesktopEntry::setComment};
    std::atomic<int> failed{0};
    constexpr int Rounds = 50;
    inThreads([&](int number) {
        for (int i = 1; i <= Rounds; ++i) {
            VelUIDesktopEntry record(file);
            (record.*setters[number])(QString::number(i));
            if (!record.save())
                ++failed;
        }
    });
    QCOMPARE(failed.load(), 0);
    const VelUIDesktopEntry record(file);
    const QString last = QString::number(Rounds);
    QCOMPARE(record.getName(), last);
    QCOMPARE(record.getIcon(), last);
    QCOMPARE(record.getExec(), last);
    QCOMPARE(record.getComment(), last);
}

void tst_DesktopEntryThreads::copyARecordToOtherThreads()
{
    const VelUIDesktopEntry original(write(QStringLiteral("x.desktop"), Header + "Name=A\n"));
    std::atomic<int> wrong{0};
    inThreads([&wrong, original](int number) {
        for (int i = 0; i < 2000; ++i) {
            VelUIDesktopEntry copy(original);
            copy.setName(QString::number(number));
            if (copy.getName() != QString::number(number) || original.getName() != QLatin1String("A"))
                ++wrong;
        }
    });
    QCOMPARE(wrong.load(), 0);
}

VEL_TEST_GUILESS_MAIN(tst_DesktopEntryThreads)

#include "tst_DesktopEntryThreads.moc"
