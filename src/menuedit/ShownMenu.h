// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <memory>

class QObject;
class VelMenuModel;
class VelMenuProxyModel;
class VelMenuView;

/**
 * One menu directory as a view shows it: the model of its files and the sorting model above that.
 */
class ShownMenu
{
public:
    /// Shows \a directory in \a view, which also is \a parent, the owner of the sorting model.
    ShownMenu(const QString &directory, bool isEditable, VelMenuView *view, QObject *parent);
    ~ShownMenu();
    ShownMenu(const ShownMenu &) = delete;
    ShownMenu &operator=(const ShownMenu &) = delete;

    /// As it was given.
    const QString &directory() const { return m_directory; }
    bool isEditable() const { return m_isEditable; }

    VelMenuModel &files() const { return *m_files; }
    VelMenuProxyModel &proxy() const { return *m_proxy; }

    /// Whether the rows tell more than their names; see VelMenuModel::setAssisted().
    void setAssisted(bool isAssisted);

    /// Builds the model of the files under the sorting model. To be called again when the
    /// directory was replaced: what the model watched is gone then.
    void build();

private:
    const QString m_directory;
    const bool m_isEditable;
    bool m_isAssisted = false;
    VelMenuView *const m_view;
    std::unique_ptr<VelMenuModel> m_files;
    std::unique_ptr<VelMenuProxyModel> m_proxy;
};
