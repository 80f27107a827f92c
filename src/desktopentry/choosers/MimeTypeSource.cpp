// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MimeTypeSource.h"

#include "ChoiceModel.h"

#include <veluiaux/VelIcon.h>

#include <QElapsedTimer>
#include <QMimeType>

namespace VelUI {

namespace {

// Of the time that one frame on a screen takes.
constexpr qint64 MostMilliseconds = 8;

QIcon iconOf(const QMimeType &type)
{
    const QMap<Qt::Corner, QString> noEmblems;
    const QIcon unknown = VelIcon::fromTheme(QStringLiteral("unknown"), noEmblems, QIcon());
    if (!type.isValid())
        return unknown;
    return VelIcon::fromTheme(type.iconName(), noEmblems,
                              VelIcon::fromTheme(type.genericIconName(), noEmblems, unknown));
}

} // namespace

MimeTypeSource::MimeTypeSource(const QStringList &chosen)
    : m_chosen(chosen)
{
}

QStringList MimeTypeSource::headers()
{
    return {tr("MIME type"), tr("Description"), tr("File names")};
}

bool MimeTypeSource::read(ChoiceModel *model)
{
    if (m_next < 0) {
        readNames(model);
        m_next = 0;
        return !m_types.isEmpty();
    }
    QElapsedTimer timer;
    timer.start();
    while (m_next < m_types.size() && timer.elapsed() < MostMilliseconds) {
        model->change(m_next, choice(model->at(m_next).value, m_types.at(m_next)));
        ++m_next;
    }
    return m_next < m_types.size();
}

void MimeTypeSource::readNames(ChoiceModel *model)
{
    QStringList names;
    const QList<QMimeType> types = m_database.allMimeTypes();
    for (const QMimeType &type : types) {
        names.append(type.name());
        m_types.append(type);
    }
    // One by an alias is known all the same.
    for (const QString &name : m_chosen) {
        if (names.contains(name))
            continue;
        names.append(name);
        m_types.append(m_database.mimeTypeForName(name));
    }
    QVector<Choice> choices;
    for (const QString &name : qAsConst(names)) {
        Choice choice;
        choice.value = name;
        choice.texts = QStringList{name};
        choices.append(choice);
    }
    model->add(choices);
}

Choice MimeTypeSource::choice(const QString &name, const QMimeType &type) const
{
    Choice choice;
    choice.value = name;
    choice.icon = iconOf(type);
    if (!type.isValid()) {
        choice.texts = QStringList{name, tr("Not in the database")};
        return choice;
    }
    choice.texts = QStringList{name, type.comment(), type.globPatterns().join(QStringLiteral(", "))};
    choice.words = type.aliases().join(QLatin1Char('\n'));
    return choice;
}

} // namespace VelUI
