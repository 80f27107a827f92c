// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeptThing.h"

#include "ExactMove.h"
#include "StagingFolder.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>

namespace {

// The trash of the home folder, made where there is none; empty where none can be had.
QString homeTrash()
{
    const QString data = QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation);
    const QString trash = data + QStringLiteral("/Trash");
    if (!QFileInfo(trash).isDir()) {
        if (!QDir().mkpath(data) || !QDir().mkdir(trash))
            return QString();
        QFile::setPermissions(trash, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }
    const QFileInfo info(trash);
    return info.isWritable() && info.isExecutable() ? trash : QString();
}

// The file in a trash that says where the one at \a place was.
QString trashInfoOf(const QString &place)
{
    const QFileInfo info(place);
    return QFileInfo(info.path()).path() + QStringLiteral("/info/") + info.fileName()
        + QStringLiteral(".trashinfo");
}

} // namespace

KeptThing::KeptThing(const QString &path)
    : m_state(path)
{
}

KeptThing::~KeptThing() = default;

std::unique_ptr<KeptThing> KeptThing::inTrash(const QString &path)
{
    std::unique_ptr<KeptThing> kept(new KeptThing(path));
    QString place;
    // Without a trash in the home folder Qt takes the current folder for one.
    if (!kept->m_state.exists() || homeTrash().isEmpty() || !QFile::moveToTrash(path, &place))
        return nullptr;
    kept->m_place = ExactMove::native(place);
    kept->m_trashInfo = trashInfoOf(place);
    return kept;
}

std::unique_ptr<KeptThing> KeptThing::beside(const QString &path)
{
    const TreeCopy::Path native = ExactMove::native(path);
    std::unique_ptr<KeptThing> kept(new KeptThing(path));
    kept->m_folder = std::make_unique<StagingFolder>(native.parent_path());
    kept->m_place = kept->m_folder->item();
    return kept->m_folder->error() || ExactMove::move(native, kept->m_place) ? nullptr : std::move(kept);
}

bool KeptThing::isThere() const
{
    return m_state.isAt(m_place);
}

std::error_code KeptThing::bringBack(const QString &path)
{
    if (const std::error_code error = ExactMove::move(m_place, ExactMove::native(path)))
        return error;
    if (!m_trashInfo.isEmpty())
        QFile::remove(m_trashInfo);
    m_folder.reset();
    return {};
}
