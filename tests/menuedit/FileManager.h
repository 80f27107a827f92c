// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QPoint>
#include <QString>

#include <memory>

/**
 * A file manager that is no program of ours, worked with mouse and keyboard.
 *
 * It shows one folder with one item, drawn so large that its place is known whatever the
 * fonts and icons are.
 */
class FileManager
{
public:
    FileManager();
    /// Ends the program and whatever it started.
    ~FileManager();
    Q_DISABLE_COPY_MOVE(FileManager)

    /// Why there is none on this machine; empty when there is one.
    static QString obstacle();

    /// Shows \a folder with the window's corner at \a corner of the screen and waits until the item
    /// of the folder is drawn; false when that does not come.
    bool start(const QString &folder, const QPoint &corner);
    /// Clicks its item and presses \a keys until its URL is on the clipboard; false when it does not
    /// come.
    bool putOnClipboard(const QString &keys);
    /// Pastes into its folder.
    void paste();

    /// The arguments of a "mousemove" to its item, and to where no item is.
    QString onItem() const { return at(ItemPlace); }
    QString besideItem() const { return at({500, 320}); }
    /// Waits for the menu that a drop opens, and clicks its first entry (copy) or second (move).
    void pickInDropMenu(Qt::DropAction action);

private:
    class Process;

    static constexpr QPoint ItemPlace{54, 115};

    QString at(const QPoint &place) const;
    void startProcess(const QString &folder);
    void findWindow(int patience);
    bool moveWindow(const QPoint &corner);
    bool activate();
    bool showsItem() const;

    std::unique_ptr<Process> m_process;
    QByteArray m_window;
};
