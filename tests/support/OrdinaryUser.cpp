// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"

#include <QDirIterator>
#include <QFileInfo>
#include <QTest>

#include <unistd.h>

namespace {

constexpr uid_t Nobody = 65534;

bool giveAway(const QString &path)
{
    return lchown(QFile::encodeName(path).constData(), Nobody, Nobody) == 0;
}

bool handOver(const QString &folder)
{
    bool isDone = giveAway(folder);
    QDirIterator below(folder, QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                       QDirIterator::Subdirectories);
    while (below.hasNext())
        isDone = giveAway(below.next()) && isDone;
    // Somebody else has to come as far as the folder.
    for (QString above = QFileInfo(folder).absolutePath(); above.size() > 1;
         above = QFileInfo(above).absolutePath())
        isDone = QFile::setPermissions(above, QFile::permissions(above) | QFile::ReadOther | QFile::ExeOther)
            && isDone;
    return isDone;
}

} // namespace

OrdinaryUser::OrdinaryUser(const QString &folder)
    : m_wasSuperuser(geteuid() == 0)
    , m_runtimeDir(qgetenv("XDG_RUNTIME_DIR"))
{
    if (!m_wasSuperuser)
        return;
    const QString runtimeDir = folder + QLatin1String("/runtime");
    const bool isReady = QDir().mkpath(runtimeDir)
        && QFile::setPermissions(runtimeDir, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner)
        && handOver(folder);
    qputenv("XDG_RUNTIME_DIR", QFile::encodeName(runtimeDir));
    // The saved user stays the superuser, for the way back; a program that is started has none.
    if (!isReady || setresgid(Nobody, Nobody, 0) != 0 || setresuid(Nobody, Nobody, 0) != 0)
        QTest::qFail("cannot become an ordinary user", __FILE__, __LINE__);
}

OrdinaryUser::~OrdinaryUser()
{
    if (!m_wasSuperuser)
        return;
    if (setresuid(0, 0, 0) != 0 || setresgid(0, 0, 0) != 0)
        QTest::qFail("cannot become the superuser again", __FILE__, __LINE__);
    qputenv("XDG_RUNTIME_DIR", m_runtimeDir);
}
