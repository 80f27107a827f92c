// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/help.h>

#include <velcore/dirs.h>
#include <velcore/language.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QProcess>
#include <QString>
#include <QStringList>

namespace {

bool leadsOutside(const QString &page)
{
    return page.split(QLatin1Char('/')).contains(QStringLiteral(".."));
}

// The first of the help folders that has the page, in the user's language first; empty when none has.
QString pagePath(const QString &page)
{
    const QString language = QString::fromStdString(velLanguageCode());
    QStringList folders = {QFile::decodeName(velInstalledDataDir().c_str())};
    const QString data = QFile::decodeName(qgetenv("VEL_DATA_DIR"));
    if (QDir::isAbsolutePath(data))
        folders.prepend(data);
    for (const QString &folder : qAsConst(folders)) {
        for (const QString &pages :
             {QLatin1String("/doc/") + language + QLatin1Char('/'), QStringLiteral("/doc/")}) {
            const QFileInfo file(folder + pages + page + QLatin1String(".html"));
            if (file.isFile())
                return file.absoluteFilePath();
        }
    }
    return {};
}

} // namespace

bool velHelpShow(const std::string &page)
{
    const QString name = page.empty() ? QStringLiteral("index") : QFile::decodeName(page.c_str());
    const QString path = leadsOutside(name) ? QString() : pagePath(name);
    if (path.isEmpty())
        return false;

    QProcess browser;
    browser.setProgram(QStringLiteral("xdg-open"));
    browser.setArguments({path});
    browser.setStandardInputFile(QProcess::nullDevice());
    browser.setStandardOutputFile(QProcess::nullDevice());
    browser.setStandardErrorFile(QProcess::nullDevice());
    return browser.startDetached();
}
