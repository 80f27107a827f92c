// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The filter above 20,000 actions: from a key press to the painted rows.

#include "Comparison.h"
#include "EditShortcutsDialog.h"
#include "ShortcutsModel.h"

#include <QAction>
#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QKeyEvent>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTreeView>

#include <algorithm>
#include <cstdio>

namespace {

// What a user may wait for the rows.
constexpr double Aim = 50000; // microseconds

class PaintWatcher : public QObject
{
public:
    bool painted = false;

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        painted = painted || event->type() == QEvent::Paint;
        return QObject::eventFilter(watched, event);
    }
};

void waitForPaint(PaintWatcher *watcher)
{
    while (!watcher->painted)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    QCoreApplication::processEvents();
}

class FilteredDialog
{
public:
    FilteredDialog()
        : m_model(nullptr, QString())
    {
        const char *verbs[] = {"Open", "Close", "Insert", "Löschen", "Sélectionner", "Move"};
        for (int i = 0; i < 20000; ++i) {
            auto *action = new QAction(
                QStringLiteral("&%1 the thing number %2").arg(QString::fromUtf8(verbs[i % 6])).arg(i),
                &m_owner);
            if (i % 4 != 0)
                action->setShortcut(QKeySequence(Qt::CTRL | (Qt::Key_A + i % 26), Qt::Key_0 + i / 26 % 40));
            m_model.registerAction(QStringLiteral("action-%1").arg(i, 5, 10, QLatin1Char('0')), action,
                                   QStringLiteral("Group %1").arg(i % 40));
        }
        m_dialog.reset(new EditShortcutsDialog(&m_model));
        m_dialog->setAssistance(true);
        m_edit = m_dialog->findChild<QLineEdit *>(QStringLiteral("filterEdit"));
        m_view = m_dialog->findChild<QTreeView *>(QStringLiteral("treeView"));
        m_view->viewport()->installEventFilter(&m_watcher);
        m_dialog->show();
        m_dialog->activateWindow();
        m_edit->setFocus();
        waitForPaint(&m_watcher);
    }

    // From the key press until the rows are painted, in microseconds.
    double press(int key, const QString &text)
    {
        m_watcher.painted = false;
        QElapsedTimer timer;
        timer.start();
        QKeyEvent event(QEvent::KeyPress, key, Qt::NoModifier, text);
        QCoreApplication::sendEvent(m_edit, &event);
        waitForPaint(&m_watcher);
        return double(timer.nsecsElapsed()) / 1000;
    }

    // Types a text and takes it back; the key that takes longest counts.
    double typeAndErase(const QString &text)
    {
        double longest = 0;
        for (const QChar letter : text)
            longest = std::max(longest, press(letter.toUpper().unicode(), QString(letter)));
        while (!m_edit->text().isEmpty())
            longest = std::max(longest, press(Qt::Key_Backspace, QString()));
        return longest;
    }

private:
    QObject m_owner;
    ShortcutsModel m_model;
    std::unique_ptr<EditShortcutsDialog> m_dialog;
    QLineEdit *m_edit = nullptr;
    QTreeView *m_view = nullptr;
    PaintWatcher m_watcher;
};

bool compare(FilteredDialog *dialog, const char *title, const QString &text)
{
    Comparison comparison(title);
    comparison.addTimed("EditShortcutsDialog", [dialog, text] { return dialog->typeAndErase(text); });
    comparison.addTimed(
        "what a user may wait", [] { return Aim; }, 1.0);
    return comparison.run(15);
}

} // namespace

int main(int argc, char **argv)
{
    const QTemporaryDir home;
    for (const char *variable : {"HOME", "XDG_CONFIG_HOME", "XDG_CACHE_HOME", "VEL_CONFIG_HOME"})
        qputenv(variable, QFile::encodeName(home.path()));
    QApplication application(argc, argv);
    FilteredDialog dialog;
    std::printf("first key press: %.0f us\n", dialog.press(Qt::Key_T, QStringLiteral("t")));
    dialog.press(Qt::Key_Backspace, QString());

    bool kept =
        compare(&dialog, "filter of 20,000 actions, longest key press; many match", QStringLiteral("thing"));
    kept = compare(&dialog, "filter of 20,000 actions, longest key press; few match",
                   QStringLiteral("group 7 loschen 1999"))
        && kept;
    return kept ? 0 : 1;
}
