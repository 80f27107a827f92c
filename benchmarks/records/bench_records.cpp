// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Comparison.h"
#include "EntryFiles.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <time.h>
#include <unistd.h>

#include <glib.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <memory>
#include <vector>

// Reading and saving desktop entries: the record class beside GKeyFile and beside the least
// that can be done.

namespace {

constexpr int Rounds = 15;
constexpr int Candidates = 3;
// No more than there are files, so that each save meets one that nobody has just written.
constexpr int Saves = 20;

// Keeps the compiler from leaving out what nobody looks at.
volatile int sink = 0;

void use(int value)
{
    sink = sink + value;
}

[[gnu::noinline]] void readRecord(const QString &path)
{
    const VelUIDesktopEntry record(path);
    use(record.getType().size() + record.getName().size() + record.getIcon().size() + record.getExec().size()
        + record.getLocalName().size() + record.getLocalGenericName().size());
    const QList<VelUIDesktopAction> actions = record.getActions();
    for (const VelUIDesktopAction &action : actions)
        use(action.getLocalName().size());
}

void useAndFree(char *value)
{
    use(value ? value[0] : 0);
    g_free(value);
}

[[gnu::noinline]] void readKeyFile(const QByteArray &path)
{
    constexpr const char *Main = "Desktop Entry";
    GKeyFile *const file = g_key_file_new();
    if (!g_key_file_load_from_file(file, path.constData(), G_KEY_FILE_NONE, nullptr))
        std::abort();
    for (const char *key : {"Type", "Name", "Icon", "Exec"})
        useAndFree(g_key_file_get_string(file, Main, key, nullptr));
    for (const char *key : {"Name", "GenericName"})
        useAndFree(g_key_file_get_locale_string(file, Main, key, nullptr, nullptr));
    char **const actions = g_key_file_get_string_list(file, Main, "Actions", nullptr, nullptr);
    for (char **action = actions; action && *action; ++action) {
        const QByteArray group = "Desktop Action " + QByteArray(*action);
        useAndFree(g_key_file_get_locale_string(file, group.constData(), "Name", nullptr, nullptr));
    }
    g_strfreev(actions);
    g_key_file_free(file);
}

void readBytes(const QByteArray &path)
{
    const int file = ::open(path.constData(), O_RDONLY | O_CLOEXEC);
    struct stat status;
    if (file < 0 || ::fstat(file, &status) != 0)
        std::abort();
    const std::unique_ptr<char[]> bytes(new char[std::size_t(status.st_size)]);
    if (::read(file, bytes.get(), std::size_t(status.st_size)) != status.st_size)
        std::abort();
    use(bytes[0]);
    ::close(file);
}

[[gnu::noinline]] void changeRecord(VelUIDesktopEntry &record)
{
    static int number = 0;
    record.setIcon(QStringLiteral("icon-%1").arg(++number));
    if (!record.save())
        std::abort();
}

[[gnu::noinline]] void saveRecord(const QString &path)
{
    VelUIDesktopEntry record(path);
    changeRecord(record);
}

// Without these flags the comments and all other languages would be lost.
GKeyFile *loadKeyFile(const QByteArray &path)
{
    constexpr auto Everything = GKeyFileFlags(G_KEY_FILE_KEEP_COMMENTS | G_KEY_FILE_KEEP_TRANSLATIONS);
    GKeyFile *const file = g_key_file_new();
    if (!g_key_file_load_from_file(file, path.constData(), Everything, nullptr))
        std::abort();
    return file;
}

[[gnu::noinline]] void changeKeyFile(GKeyFile *file, const QByteArray &path)
{
    static int number = 0;
    const QByteArray icon = "icon-" + QByteArray::number(++number);
    g_key_file_set_string(file, "Desktop Entry", "Icon", icon.constData());
    if (!g_key_file_save_to_file(file, path.constData(), nullptr))
        std::abort();
}

[[gnu::noinline]] void saveKeyFile(const QByteArray &path)
{
    GKeyFile *const file = loadKeyFile(path);
    changeKeyFile(file, path);
    g_key_file_free(file);
}

// New file, fsync, rename: what nobody can save without.
void replaceBytes(const QByteArray &path, int size)
{
    const QByteArray bytes(size, 'x');
    const QByteArray beside = path + ".new";
    const int file = ::open(beside.constData(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
    if (file < 0 || ::write(file, bytes.constData(), std::size_t(size)) != size || ::fsync(file) != 0)
        std::abort();
    ::close(file);
    if (::rename(beside.constData(), (path + ".old").constData()) != 0)
        std::abort();
}

using Work = std::function<void()>;
using Clock = double (*)();

double wallTime()
{
    using Steady = std::chrono::steady_clock;
    return std::chrono::duration<double, std::micro>(Steady::now().time_since_epoch()).count();
}

// For work that waits for nothing: what else the machine does is left out.
double processorTime()
{
    timespec time;
    ::clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
    return double(time.tv_sec) * 1e6 + double(time.tv_nsec) / 1e3;
}

double microseconds(Clock clock, const Work &work)
{
    const double start = clock();
    work();
    return clock() - start;
}

bool compareLoading(const QString &parent, const std::string &title, const QByteArrayList &contents,
                    double coldLimit, double warmLimit)
{
    if (contents.isEmpty())
        return true;
    // Every measurement of a first time has files that nobody has ever read.
    EntryFiles entries(parent, contents, Candidates * (Rounds + 1) + 1);
    const auto each = [&entries](auto work) {
        return [&entries, work] {
            return microseconds(processorTime, [&entries, &work] {
                for (int i = 0; i < entries.count(); ++i)
                    work(entries, i);
            });
        };
    };
    const std::string what = title + " (" + std::to_string(entries.count()) + " files of "
        + std::to_string(entries.size()) + " bytes)";
    const auto ours = each([](const EntryFiles &from, int i) { readRecord(from.path(i)); });
    const auto peer = each([](const EntryFiles &from, int i) { readKeyFile(from.encoded(i)); });
    const auto least = each([](const EntryFiles &from, int i) { readBytes(from.encoded(i)); });

    Comparison cold("desktop entry: load and read 8 values, first time; " + what);
    cold.setPreparation([&entries] { entries.useNextSet(); });
    cold.addTimed("VelUIDesktopEntry", ours);
    cold.addTimed("GKeyFile", peer, coldLimit);
    cold.addTimed("read() alone", least);
    const bool coldKept = cold.run(Rounds);

    Comparison warm("desktop entry: load and read 8 values, read before; " + what);
    warm.setPreparation([&ours] {
        // A text is kept from the second time on.
        ours();
        ours();
    });
    warm.addTimed("VelUIDesktopEntry", ours);
    warm.addTimed("GKeyFile", peer, warmLimit);
    warm.addTimed("read() alone", least);
    return warm.run(Rounds) && coldKept;
}

// A record that takes over all keys of another one, beside reading such a file.
bool compareInheriting(const QString &parent, const std::string &title, const QByteArrayList &contents)
{
    if (contents.isEmpty())
        return true;
    EntryFiles entries(parent, contents, Rounds + 2);
    std::vector<VelUIDesktopEntry> models;
    for (int i = 0; i < entries.count(); ++i)
        models.emplace_back(entries.path(i));
    Comparison comparison("desktop entry: take over all keys of another; " + title);
    comparison.setPreparation([&entries] { entries.useNextSet(); });
    comparison.addTimed("VelUIDesktopEntry", [&models] {
        return microseconds(processorTime, [&models] {
            for (const VelUIDesktopEntry &model : models) {
                VelUIDesktopEntry heir;
                heir.inheritFrom(model);
                use(heir.isValid());
            }
        });
    });
    comparison.addTimed(
        "load and read 8 values, first time",
        [&entries] {
            return microseconds(processorTime, [&entries] {
                for (int i = 0; i < entries.count(); ++i)
                    readRecord(entries.path(i));
            });
        },
        3);
    return comparison.run(Rounds);
}

// The whole of what a user does, and then each half of it.
bool compareSaving(const QString &parent, Clock clock, const std::string &title,
                   const QByteArrayList &contents, double peerLimit, double leastLimit)
{
    if (contents.isEmpty())
        return true;
    const EntryFiles entries(parent, contents);
    int next = 0;
    const auto timed = [clock](const Work &work) { return [=] { return microseconds(clock, work); }; };
    const Work least = [&] { replaceBytes(entries.encoded(++next), entries.size()); };
    const auto prepare = [](Comparison &comparison) {
        comparison.setPreparation(&EntryFiles::settle);
        comparison.setRepetitions(Saves);
    };

    Comparison whole("desktop entry: load, change one key, save; " + title);
    whole.setPreparation(&EntryFiles::settleForLong);
    whole.setRepetitions(Saves);
    whole.addTimed("VelUIDesktopEntry", timed([&] { saveRecord(entries.path(++next)); }));
    whole.addTimed("GKeyFile", timed([&] { saveKeyFile(entries.encoded(++next)); }), peerLimit);
    whole.addTimed("new file, fsync, rename", timed(least), leastLimit);
    const bool kept = whole.run(Rounds);

    Comparison loading("desktop entry: of these, load; " + title);
    prepare(loading);
    loading.addTimed("VelUIDesktopEntry",
                     timed([&] { use(VelUIDesktopEntry(entries.path(++next)).isValid()); }));
    loading.addTimed("GKeyFile", timed([&] { g_key_file_free(loadKeyFile(entries.encoded(++next))); }));
    loading.run(Rounds);

    Comparison saving("desktop entry: of these, change one key, save; " + title);
    prepare(saving);
    saving.addTimed("VelUIDesktopEntry", [&] {
        VelUIDesktopEntry record(entries.path(++next));
        return microseconds(clock, [&record] { changeRecord(record); });
    });
    saving.addTimed("GKeyFile", [&] {
        const std::unique_ptr<GKeyFile, decltype(&g_key_file_free)> file(loadKeyFile(entries.encoded(++next)),
                                                                         &g_key_file_free);
        return microseconds(clock, [&] { changeKeyFile(file.get(), entries.encoded(next)); });
    });
    saving.addTimed("new file, fsync, rename", timed(least));
    saving.run(Rounds);
    return kept;
}

// In a process of its own: the texts and the memory that the one comparison leaves behind would
// decide how much memory is new in the next.
bool runAlone(const std::function<bool()> &comparison)
{
    // One candidate is run for a tool that looks at one process.
    if (std::getenv("VEL_BENCHMARK_ONLY"))
        return comparison();
    std::fflush(stdout);
    const pid_t child = ::fork();
    if (child == 0)
        std::exit(comparison() ? 0 : 1);
    int status = 0;
    return child > 0 && ::waitpid(child, &status, 0) == child && WIFEXITED(status)
        && WEXITSTATUS(status) == 0;
}

} // namespace

int main()
{
    qputenv("LANG", "de_DE.UTF-8");
    qunsetenv("LC_ALL");
    qunsetenv("LC_MESSAGES");
    qunsetenv("LANGUAGE");
    const QString memory = QStringLiteral("/dev/shm");
    const QString disk = QDir::currentPath();
    const auto loading = [&memory](const char *title, const QByteArrayList &contents, double coldLimit,
                                   double warmLimit) {
        return runAlone([&] { return compareLoading(memory, title, contents, coldLimit, warmLimit); });
    };
    const auto saving = [](const QString &parent, Clock clock, const char *title,
                           const QByteArrayList &contents, double peerLimit, double leastLimit) {
        return runAlone([&] { return compareSaving(parent, clock, title, contents, peerLimit, leastLimit); });
    };
    const QByteArrayList installed = EntryFiles::installed();
    const QByteArrayList twelve = EntryFiles::synthetic(12);
    bool kept = loading("installed entries", installed, 0.45, 0.16);
    kept = loading("12 languages", twelve, 0.45, 0.25) && kept;
    kept = loading("66 languages", EntryFiles::synthetic(66), 0.30, 0.12) && kept;
    const auto inheriting = [&memory](const char *title, const QByteArrayList &contents) {
        return runAlone([&] { return compareInheriting(memory, title, contents); });
    };
    kept = inheriting("installed entries", installed) && kept;
    kept = inheriting("66 languages", EntryFiles::synthetic(66)) && kept;
    kept = saving(memory, processorTime, "installed entries, memory disk", installed, 0.35, 0) && kept;
    kept = saving(memory, processorTime, "12 languages, memory disk", twelve, 0.35, 0) && kept;
    kept = saving(disk, wallTime, "12 languages, disk", twelve, 0, 1.1) && kept;
    return kept ? 0 : 1;
}
