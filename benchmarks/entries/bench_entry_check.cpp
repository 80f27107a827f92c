// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The checks of an entry while the user types: from the press of a key until the sentence is painted under
// its row. There is no peer that does this; the aim is a time that nobody notices.

#include "Comparison.h"

#include <VelDesktopEntryEditDialog.h>
#include <desktopentry/check/EntryCheck.h>

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QScrollArea>
#include <QTemporaryDir>
#include <QTest>

#include <utility>

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

// Whether a widget of that name has been painted since it was asked for.
class PaintWatch : public QObject
{
public:
    explicit PaintWatch(QString name)
        : m_name(std::move(name))
    {
        qApp->installEventFilter(this);
    }

    bool wasPainted() const { return m_wasPainted; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override
    {
        m_wasPainted = m_wasPainted || (event->type() == QEvent::Paint && watched->objectName() == m_name);
        return false;
    }

private:
    const QString m_name;
    bool m_wasPainted = false;
};

const QString Sentence = QStringLiteral("check_Exec");

// What is left of a key before must not count for the next one.
void settle()
{
    QTest::qWait(5);
}

// Types a quote into the command and takes it away again; counts the way until the sentence is painted.
double typeQuote(const QWidget &window, QLineEdit *exec)
{
    const auto isSaid = [&window] {
        const auto *label = window.findChild<QLabel *>(Sentence);
        return label && label->isVisible();
    };
    settle();
    double time = 0;
    {
        const PaintWatch watch(Sentence);
        QElapsedTimer clock;
        clock.start();
        QTest::keyClick(exec, Qt::Key_Apostrophe);
        while (!watch.wasPainted())
            QCoreApplication::processEvents();
        time = double(clock.nsecsElapsed()) / 1000;
    }
    QTest::keyClick(exec, Qt::Key_Backspace);
    while (isSaid())
        QCoreApplication::processEvents();
    return time;
}

// The least that Qt does for it: as many lines in a grid, and a label that comes under one of them.
class BareForm : public QScrollArea
{
public:
    BareForm()
    {
        auto *content = new QWidget;
        auto *layout = new QGridLayout(content);
        auto *sentence = new QLabel(QStringLiteral("A quote is not closed."));
        sentence->setObjectName(Sentence);
        sentence->hide();
        for (int row = 0; row < 28; ++row) {
            auto *line = new QLineEdit;
            layout->addWidget(new QLabel(QStringLiteral("Field:")), 2 * row, 0);
            layout->addWidget(line, 2 * row, 1);
            m_exec = row == 5 ? line : m_exec;
        }
        layout->addWidget(sentence, 11, 1);
        setWidget(content);
        setWidgetResizable(true);
        connect(m_exec, &QLineEdit::textEdited, sentence,
                [sentence](const QString &text) { sentence->setVisible(!text.isEmpty()); });
    }

    QLineEdit *exec() const { return m_exec; }

private:
    QLineEdit *m_exec = nullptr;
};

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
    dialog.setDesktopEntryPath(path);
    BareForm bare;
    for (QWidget *window : {static_cast<QWidget *>(&dialog), static_cast<QWidget *>(&bare)}) {
        window->resize(700, 800);
        window->show();
        if (!QTest::qWaitForWindowExposed(window))
            return false;
    }
    QTest::qWait(500); // for the answers about the programs and icons of the entry
    auto *exec = dialog.findChild<QWidget *>(QStringLiteral("execEdit"))->findChild<QLineEdit *>();
    Comparison comparison(title);
    comparison.setRepetitions(5);
    comparison.addTimed("key press to painted sentence", [&dialog, exec] { return typeQuote(dialog, exec); });
    comparison.addTimed(
        "the aim", [] { return AimInMicroseconds; }, 1);
    comparison.addTimed("a bare form of as many lines", [&bare] { return typeQuote(bare, bare.exec()); });
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
