// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>

#include <memory>

class QFileIconProvider;
class RowCache;

/**
 * Keeps the icon provider of a menu model.
 *
 * The file model asks for the icons of a whole folder, again after any change in it and before
 * anyone asks for the first name. So the icons of entries that are still the same are remembered,
 * and the names that were read beside them are prefetched.
 */
class MenuIconProvider : public QObject
{
    Q_OBJECT

public:
    /// Remembers in \a cache, and nothing once that is gone.
    MenuIconProvider(RowCache *cache, QObject *parent);
    ~MenuIconProvider() override;

    /// The provider; it lives as long as this object.
    QFileIconProvider *provider() const { return m_provider.get(); }

private:
    std::unique_ptr<QFileIconProvider> m_provider;
};
