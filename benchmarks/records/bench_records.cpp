// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Comparison.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <glib.h>

#include <array>
#include <cstdlib>
#include <memory>

// Reading and saving desktop entries: the record class beside GKeyFile and beside the least
// that can be done.

namespace {

constexpr int Files = 100;
constexpr int Languages = 66;

// Keeps the compiler from leaving out what nobody looks at.
volatile int sink = 0;

void use(int value)
{
    sink = sink + value;
}

QByteArray languageCode(int i)
{
    static const char *const first[] = {"de", "fr", "es",    "it",    "pl",
                                        "ru", "ja", "zh_CN", "pt_BR", "sr@latin"};
    if (i < int(std::size(first)))
        return first[i];
    return QByteArray(1, char('a' + i / 26)) + char('a' + i % 26);
}

// An entry as applications install them: some languages, comments, two actions.
QByteArray entry(int languages, int number)
{
    QByteArray bytes = "# A desktop entry\n[Desktop Entry]\nVersion=1.0\nType=Application\n";
    const auto localised = [&](const QByteArray &key, const QByteArray &value) {
        bytes += key + "=" + value + "\n";
        for (int i = 0; i < languages; ++i)
            bytes += key + "[" + languageCode(i) + "]=" + value + " \xC3\xBC" + languageCode(i) + "\n";
    };
    const QByteArray name = "Application " + QByteArray::number(number);
    localised("Name", name);
    localised("GenericName", "Text editor of the kind");
    localised("Comment", "Edit text files and look at what is in them");
    localised("Keywords", "text;editor;notes;plain;");
    bytes += "Exec=application-" + QByteArray::number(number)
        + " --new-window %U\nTryExec=application\nIcon=accessories"
          "-text-editor\nTerminal=false\nStartupNotify=true\nCategories=Utility;TextEditor;\nMimeType=text/"
          "plain;"
          "text/x-c;text/x-c++;application/x-shellscript;\nActions=window;document;\n";
    for (const QByteArray id : {"window", "document"}) {
        bytes += "\n[Desktop Action " + id + "]\n";
        localised("Name", "New " + id);
        bytes += "Exec=application --new-" + id + "\n";
    }
    return bytes;
}

// A folder of entries on the file system that holds `parent`.
class Entries
{
public:
    Entries(const QString &parent, int languages)
        : m_folder(parent + QStringLiteral("/records-XXXXXX"))
    {
        for (int i = 0; i < Files; ++i) {
            const QString path = m_folder.filePath(QStringLiteral("entry%1.desktop").arg(i));
            QFile file(path);
            const QByteArray bytes = entry(languages, i);
            if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
                qFatal("cannot write %s", qPrintable(path));
            m_paths.append(path);
            m_encoded.append(QFile::encodeName(path));
            m_size = bytes.size();
        }
    }

    int size() const { return m_size; }
    const QString &path(int i) const { return m_paths.at(i % Files); }
    const QByteArray &encoded(int i) const { return m_encoded.at(i % Files); }

    // Makes the files younger than any record that knows them.
    void touch() const
    {
        for (const QByteArray &path : m_encoded)
            ::utimensat(AT_FDCWD, path.constData(), nullptr, 0);
    }

private:
    QTemporaryDir m_folder;
    QStringList m_paths;
    QByteArrayList m_encoded;
    int m_size = 0;
};

void readRecord(const QString &path)
{
    const VelUIDesktopEntry record(path);
    use(record.getType().size() + record.getName().size() + record.getIcon().size() + record.getExec().size()
        + record.getLocalName().size() + record.getLocalGenericName().size());
    const QList<VelUIDesktopAction> actions = record.getActions();
    for (const VelUIDesktopAction &action : actions)
        use(action.getLocalName().size());
}

void readKeyFile(const QByteArray &path)
{
    constexpr const char *Main = "Desktop Entry";
    GKeyFile *const file = g_key_file_new();
    if (!g_key_file_load_from_file(file, path.constData(), G_KEY_FILE_NONE, nullptr))
        std::abort();
    for (const char *key : {"Type", "Name", "Icon", "Exec"}) {
        char *const value = g_key_file_get_string(file, Main, key, nullptr);
        use(value[0]);
        g_free(value);
    }
    for (const char *key : {"Name", "GenericName"}) {
        char *const value = g_key_file_get_locale_string(file, Main, key, nullptr, nullptr);
        use(value[0]);
        g_free(value);
    }
    char **const actions = g_key_file_get_string_list(file, Main, "Actions", nullptr, nullptr);
    for (char **action = actions; *action; ++action) {
        const QByteArray group = "Desktop Action " + QByteArray(*action);
        char *const name = g_key_file_get_locale_string(file, group.constData(), "Name", nullptr, nullptr);
        use(name[0]);
        g_free(name);
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

void saveRecord(const QString &path)
{
    static int number = 0;
    VelUIDesktopEntry record(path);
    record.setIcon(QStringLiteral("icon-%1").arg(++number));
    if (!record.save())
        std::abort();
}

void saveKeyFile(const QByteArray &path)
{
    static int number = 0;
    GKeyFile *const file = g_key_file_new();
    if (!g_key_file_load_from_file(file, path.constData(),
                                   GKeyFileFlags(G_KEY_FILE_KEEP_COMMENTS | G_KEY_FILE_KEEP_TRANSLATIONS),
                                   nullptr))
        std::abort();
    g_key_file_set_string(file, "Desktop Entry", "Icon",
                          ("icon-" + QByteArray::number(++number)).constData());
    if (!g_key_file_save_to_file(file, path.constData(), nullptr))
        std::abort();
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

bool compareLoading(const QString &parent, const char *title, int languages)
{
    const Entries entries(parent, languages);
    const auto each = [&entries](auto work) {
        return [&entries, work] {
            for (int i = 0; i < Files; ++i)
                work(entries, i);
        };
    };
    const std::string size = std::string(title) + ", " + std::to_string(entries.size()) + " bytes";
    const auto ours = each([](const Entries &from, int i) { readRecord(from.path(i)); });
    const auto peer = each([](const Entries &from, int i) { readKeyFile(from.encoded(i)); });
    const auto least = each([](const Entries &from, int i) { readBytes(from.encoded(i)); });

    Comparison cold("desktop entry: load and read 8 values, each file for the first time; " + size);
    cold.setPreparation([&entries] { entries.touch(); });
    cold.add("VelUIDesktopEntry", ours);
    cold.add("GKeyFile", peer, 0.25);
    cold.add("read() alone", least);
    const bool coldKept = cold.run();

    Comparison warm("desktop entry: load and read 8 values, files read before; " + size);
    ::usleep(100000); // Until the files count as settled.
    ours();
    warm.add("VelUIDesktopEntry", ours);
    warm.add("GKeyFile", peer, 0.25);
    warm.add("read() alone", least);
    return warm.run() && coldKept;
}

bool compareSaving(const QString &parent, const char *title, double peerLimit, double leastLimit)
{
    const Entries entries(parent, 12);
    int next = 0;
    Comparison comparison(std::string("desktop entry: load, change one key, save; ") + title);
    comparison.add("VelUIDesktopEntry", [&] { saveRecord(entries.path(++next)); });
    comparison.add(
        "GKeyFile", [&] { saveKeyFile(entries.encoded(++next)); }, peerLimit);
    comparison.add(
        "new file, fsync, rename", [&] { replaceBytes(entries.encoded(++next), entries.size()); },
        leastLimit);
    comparison.setRepetitions(20);
    return comparison.run();
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
    bool kept = compareLoading(memory, "12 languages", 12);
    kept = compareLoading(memory, "66 languages", Languages) && kept;
    kept = compareSaving(memory, "memory disk", 0.30, 0) && kept;
    kept = compareSaving(disk, "disk", 0, 1.1) && kept;
    return kept ? 0 : 1;
}
