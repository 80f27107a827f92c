// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Sorting what is loaded already. Growing as n log n, four times the rows take about 4.7 times
// as long; the aim leaves room for the caches of the machine.

#include "Comparison.h"
#include "MenuFiles.h"
#include "ShownTree.h"

#include <menuedit/VelMenuModel.h>
#include <menuedit/VelMenuProxyModel.h>

#include <QApplication>
#include <QEventLoop>

namespace {

class LoadedMenu
{
public:
    LoadedMenu(const QString &path, int rows)
        : m_path(path)
        , m_model(path, nullptr, nullptr)
        , m_proxy(nullptr)
    {
        m_proxy.setSourceModel(&m_model);
        m_proxy.sort(0, Qt::DescendingOrder);
        while (m_proxy.rowCount(root()) != rows)
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        // The file-system model sorts itself a moment later.
        QElapsedTimer timer;
        for (timer.start(); timer.elapsed() < 300;)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
    }

    void sort()
    {
        m_proxy.invalidateSortOrder(m_path);
        m_proxy.rowCount(root());
    }

private:
    QModelIndex root() const { return m_proxy.mapFromSource(m_model.index(m_path)); }

    QString m_path;
    VelMenuModel m_model;
    VelMenuProxyModel m_proxy;
};

bool compare(MenuFiles &files, bool sorted)
{
    LoadedMenu large(files.flat(5000, sorted), 5000);
    LoadedMenu small(files.flat(1250, sorted), 1250);
    Comparison comparison(sorted ? "one sort, with a SortOrder of all names"
                                 : "one sort, without a SortOrder");
    comparison.add("5,000 rows", [&] { large.sort(); });
    comparison.add(
        "1,250 rows", [&] { small.sort(); }, 6.0);
    return comparison.run(25);
}

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    MenuFiles files;
    const bool kept = compare(files, false);
    return compare(files, true) && kept ? 0 : 1;
}
