// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShownMenu.h"

#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

ShownMenu::ShownMenu(const QString &directory, bool isEditable, VelMenuView *view, QObject *parent)
    : m_directory(directory)
    , m_isEditable(isEditable)
    , m_view(view)
    , m_proxy(std::make_unique<VelMenuProxyModel>(parent))
{
    build();
}

ShownMenu::~ShownMenu() = default;

void ShownMenu::build()
{
    const std::unique_ptr<VelMenuModel> former = std::move(m_files);
    m_files = std::make_unique<VelMenuModel>(m_directory, m_view, nullptr);
    m_files->setReadOnly(!m_isEditable);
    m_files->setAssisted(m_isAssisted);
    m_proxy->setSourceModel(m_files.get());
}

// The names that decide the order may be others now.
void ShownMenu::setAssisted(bool isAssisted)
{
    m_isAssisted = isAssisted;
    m_files->setAssisted(isAssisted);
    m_proxy->forgetNames();
}
