// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryCopy.h"

#include "EntryFormAssistance.h"
#include "VelDesktopEntryPropsWidgetPrivate.h"

#include <VelDesktopEntryPropsWidget.h>
#include <frame/EntryPath.h>

#include <QScopedValueRollback>

namespace VelUI {

EntryCopy::EntryCopy(VelDesktopEntryPropsWidgetPrivate &form)
    : m_form(form)
{
}

// A folder stays one, whatever is copied to its record; a new entry, too, keeps its type where what
// is copied has none of ours.
void EntryCopy::take(VelUIDesktopEntry entry, const VelUIDesktopEntry &loaded)
{
    const TypeChooser &chooser = m_form.typeChooser;
    const QString type = chooser.type();
    const bool wasDecided = chooser.isDecided();
    if (EntryPath::isRecordFile(m_form.path))
        entry.setType(wasDecided ? type : loaded.getType());
    const QScopedValueRollback<bool> copying(m_form.isCopying, true);
    if (m_form.assistance)
        takeTranslations(entry);
    m_form.q->loadFrom(entry);
    if (wasDecided && !chooser.isDecided())
        m_form.q->setType(type, chooser.allowedTypes());
}

// What the fields are emptied of in one language goes in the others, too.
void EntryCopy::takeTranslations(const VelUIDesktopEntry &entry)
{
    const VelUIDesktopEntry former = m_form.record();
    for (const FormRow &row : m_form.formRows()) {
        if (!row.isTranslation())
            continue;
        QStringList languages = former.getLanguages(row.key) + entry.getLanguages(row.key);
        languages.removeDuplicates();
        for (const QString &language : qAsConst(languages))
            m_form.translations().set(row.key, language, Translations::value(entry, row.key, language));
    }
}

} // namespace VelUI
