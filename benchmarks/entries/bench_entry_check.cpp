// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The checks of an entry while the user types: from the press of a key until the sentence stands under
// its row. There is no peer that does this; the aim is a time that nobody notices.

#include "Comparison.h"

#include <VelDesktopEntryEditDialog.h>
#include <desktopentry/check/EntryCheck.h>

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTest>

namespace {

constexpr double AimInMicroseconds = 2000;

class NothingKnown : public EntryLookups
{
public:
    Answer program(const QString &, const QString &) const override { return Answer::Unknown; }
    Answer icon(const QString &) const override { return Answer::Unknown; }
    Answer file(const QString &) const override { return Answer::Unknown; }
    Answer mimeType(const QString &) const override { return Answer::Unknown; }
};

// An application with every text in so many languages.
QByteArray entry(int languages)
{
    QByteArray bytes =
        "[Desktop Entry]\nType=Application\nVersion=1.4\nName=Program\nGenericName=Thing\n"
        "Comment=Does it\nIcon=applications-other\nExec=true --option\nTryExec=true\nTerminal=false\n"
        "Categories=Utility;TextEditor;\nMimeType=text/plain;text/html;image/png;\nKeywords=a;b;\n";
    for (int i = 0; i < languages; ++i) {
        const QByteArray language = QByteArray(1, char('a' + i / 26)) + char('a' + i % 26);
        for (const char *key : {"Name", "GenericName", "Comment", "Keywords"})
            bytes += QByteArray(key) + '[' + language + "]=A text in this language;\n";
    }
    return bytes + "Actions=new;\n\n[Desktop Action new]\nName=New\nExec=true --new\n";
}

// Types a quote into the command and takes it away again; counts the way to the sentence.
double typeQuote(VelDesktopEntryEditDialog *dialog)
{
    auto *exec = dialog->findChild<QWidget *>(QStringLiteral("execEdit"))->findChild<QLineEdit *>();
    const auto isSaid = [dialog] {
        const auto *label = dialog->findChild<QLabel *>(QStringLiteral("check_Exec"));
        return label && label->isVisible();
    };
    QElapsedTimer clock;
    clock.start();
    QTest::keyClick(exec, Qt::Key_Apostrophe);
    while (!isSaid())
        QCoreApplication::processEvents();
    const double time = double(clock.nsecsElapsed()) / 1000;
    QTest::keyClick(exec, Qt::Key_Backspace);
    while (isSaid())
        QCoreApplication::processEvents();
    return time;
}

bool compareChecks(const char *title, const QByteArray &bytes, const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        return false;
    file.close();
    const VelUIDesktopEntry record(path);
    const NothingKnown lookups;
    Comparison comparison(title);
    comparison.setRepetitions(20);
    comparison.add("EntryCheck", [&] { EntryCheck::check(record, bytes, path, lookups); });
    comparison.addTimed(
        "the aim", [] { return AimInMicroseconds; }, 0.5);
    return comparison.run();
}

bool compareKeys(const char *title, const QByteArray &bytes, const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        return false;
    file.close();
    VelDesktopEntryEditDialog dialog;
    dialog.setAssistance(true);
    dialog.resize(700, 800);
    dialog.setDesktopEntryPath(path);
    dialog.show();
    if (!QTest::qWaitForWindowExposed(&dialog))
        return false;
    QTest::qWait(500); // for the answers about the programs and icons of the entry
    typeQuote(&dialog);
    Comparison comparison(title);
    comparison.addTimed("key press to sentence", [&dialog] { return typeQuote(&dialog); });
    comparison.addTimed(
        "the aim", [] { return AimInMicroseconds; }, 1);
    return comparison.run(31);
}

} // namespace

int main(int argc, char **argv)
{
    const QTemporaryDir home;
    for (const char *variable : {"HOME", "XDG_CONFIG_HOME", "XDG_CACHE_HOME", "VEL_CONFIG_HOME"})
        qputenv(variable, QFile::encodeName(home.path()));
    QApplication application(argc, argv);
    const QString path = home.filePath(QStringLiteral("entry.desktop"));
    bool kept = compareChecks("checks of an entry in one language", entry(0), path);
    kept = compareChecks("checks of an entry in 100 languages", entry(100), path) && kept;
    kept = compareKeys("a key in the form of an entry in one language", entry(0), path) && kept;
    kept = compareKeys("a key in the form of an entry in 100 languages", entry(100), path) && kept;
    return kept ? 0 : 1;
}
