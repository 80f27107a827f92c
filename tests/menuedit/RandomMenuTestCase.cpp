// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RandomMenuTestCase.h"

#include "VelDesktopEntryEditDialog.h"

#include <QFileSystemModel>
#include <QLineEdit>

// Names that are hard on URLs and shells, and the same ones in several folders.
void RandomMenuTestCase::buildItem(const QString &folder, int number)
{
    static const char *const patterns[] = {"e%1.desktop", "My Ж %1.desktop", "a b#%1?.desktop",
                                           "100%25 %1.desktop", "note%1.txt"};
    const QString name = QString::fromUtf8(patterns[number % 23 < 5 ? number % 23 : 0]).arg(number % 97);
    const QString path = full(MenuMirror::join(folder, name));
    const QString relative = QLatin1String("menu/") + MenuMirror::join(folder, name);
    if (QFileInfo::exists(path))
        return;
    if (number % 31 == 30)
        QFile::link(folder.isEmpty() ? this->path(QStringLiteral("outside/far.desktop"))
                                     : this->path(QStringLiteral("outside/group")),
                    path);
    else
        write(relative, entryText(fresh(), number % 29 == 28 ? "Hidden=true\n" : "Exec=true\n"));
}

void RandomMenuTestCase::build()
{
    write(QStringLiteral("outside/far.desktop"), entryText(QStringLiteral("Far")));
    write(QStringLiteral("outside/group/.directory"), "[Desktop Entry]\nType=Directory\nName=Outside\n");
    write(QStringLiteral("outside/group/in.desktop"), entryText(QStringLiteral("In")));
    const QStringList folders{QString(),
                              QStringLiteral("games"),
                              QStringLiteral("games/My Ж"),
                              QStringLiteral("games/My Ж/deep#1"),
                              QStringLiteral("office"),
                              QStringLiteral("office/games"),
                              QStringLiteral("tools"),
                              QStringLiteral("tools/tools")};
    for (int i = 0; i < folders.size(); ++i) {
        QDir().mkpath(full(folders.at(i)));
        const QByteArray order = i == 0 ? "e5.desktop;*;tools;" : i == 1 ? "*;e9.desktop;e1*;" : "";
        if (i % 4 != 3)
            writeFolder(folders.at(i), QStringLiteral("Folder %1").arg(i), order);
    }
    for (int i = 0; MenuMirror::ofDisk(menu()).paths().size() <= Items; ++i)
        buildItem(folders.at(number(folders.size())), i);
    m_mirror = MenuMirror::ofDisk(menu());
}

QStringList RandomMenuTestCase::shownPaths() const
{
    QStringList paths;
    for (auto it = m_rows.cbegin(); it != m_rows.cend(); ++it) {
        for (const QString &name : *it)
            paths.append(MenuMirror::join(it.key(), name));
    }
    return paths;
}

QStringList RandomMenuTestCase::folders() const
{
    QStringList result;
    const QStringList paths = m_mirror.paths();
    for (const QString &path : paths) {
        if (m_mirror.kindOf(path) == Kind::Folder)
            result.append(path);
    }
    return result;
}

void RandomMenuTestCase::selectItem(const QString &path)
{
    select(*m_view, full(path));
    QCOMPARE(m_view->selectedPath(), full(path));
}

void RandomMenuTestCase::fillIn(QWidget *dialog, const QString &name, bool isFolder)
{
    const QStringList fields = isFolder
        ? QStringList{QStringLiteral("nameEdit"), QStringLiteral("localNameEdit")}
        : QStringList{QStringLiteral("nameEdit"), QStringLiteral("localNameEdit"),
                      QStringLiteral("execEdit")};
    for (const QString &field : fields) {
        auto *widget = dialog->findChild<QWidget *>(field);
        QVERIFY(widget);
        auto *line = qobject_cast<QLineEdit *>(widget);
        if (!line)
            line = widget->findChild<QLineEdit *>();
        QVERIFY(line);
        line->setText(field == QLatin1String("execEdit") ? QStringLiteral("true") : name);
    }
    auto *editor = qobject_cast<VelDesktopEntryEditDialog *>(dialog);
    QVERIFY(editor);
    editor->accept();
    QCOMPARE(editor->result(), int(QDialog::Accepted));
}

bool RandomMenuTestCase::openAll(const QModelIndex &parent, const QString &folder)
{
    bool isOpen = true;
    const QAbstractItemModel &model = *m_view->model();
    for (int row = 0; row < model.rowCount(parent); ++row) {
        const QModelIndex index = model.index(row, 0, parent);
        const QString path = MenuMirror::join(folder, index.data(QFileSystemModel::FileNameRole).toString());
        if (m_mirror.kindOf(path) != Kind::Folder || !m_mirror.contains(path))
            continue;
        if (!m_view->isExpanded(index)) {
            m_view->model()->fetchMore(index);
            m_view->expand(index);
            isOpen = false;
        }
        isOpen = openAll(index, path) && isOpen;
    }
    return isOpen;
}

QString RandomMenuTestCase::compareRows(const QModelIndex &parent, const QString &folder)
{
    const QAbstractItemModel &model = *m_view->model();
    QStringList names;
    QString fault;
    for (int row = 0; row < model.rowCount(parent) && fault.isEmpty(); ++row) {
        const QModelIndex index = model.index(row, 0, parent);
        const QString name = index.data(QFileSystemModel::FileNameRole).toString();
        const QString path = MenuMirror::join(folder, name);
        names.append(name);
        if (m_mirror.contains(path) && index.data().toString() != m_mirror.shownName(path))
            fault = QStringLiteral("%1 is shown as %2 instead of %3")
                        .arg(path, index.data().toString(), m_mirror.shownName(path));
        if (m_mirror.contains(path) && m_mirror.kindOf(path) == Kind::Folder && fault.isEmpty())
            fault = compareRows(index, path);
    }
    m_rows.insert(folder, names);
    return fault.isEmpty() ? m_mirror.faultOf(folder, names) : fault;
}

QString RandomMenuTestCase::compare()
{
    const QModelIndex root = m_view->rootIndex();
    openAll(root, QString());
    m_rows.clear();
    QString fault = compareRows(root, QString());
    if (fault.isEmpty() && !m_selected.isNull() && m_view->selectedPath() != m_selected)
        fault =
            QStringLiteral("selected is \"%1\" instead of \"%2\"").arg(m_view->selectedPath(), m_selected);
    return fault;
}
