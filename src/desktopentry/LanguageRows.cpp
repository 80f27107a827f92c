// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LanguageRows.h"

#include "FieldEdit.h"
#include "PropsTable.h"
#include "fields/FormLayout.h"
#include "fields/IconEdit.h"
#include "fields/LocalizedLabel.h"
#include "fields/NamedField.h"
#include "fields/StringListEdit.h"
#include "fields/TabOrder.h"

#include <utility>

namespace VelUI {

LanguageRows::LanguageRows(EntryFormHost &form, QVector<FormRow> &rows)
    : m_form(form)
    , m_rows(rows)
{
    connect(&m_form, &EntryFormHost::recordChanged, this, &LanguageRows::showValues);
    connect(&m_form, &EntryFormHost::entryLoaded, this, [this] { turnTo(QString()); });
}

LanguageRows::~LanguageRows()
{
    turnTo(QString());
    for (const Pair &pair : std::as_const(m_pairs))
        delete pair.other;
}

QString LanguageRows::language() const
{
    return m_language;
}

QStringList LanguageRows::keys() const
{
    QStringList keys;
    for (const FormRow &row : std::as_const(m_rows)) {
        if (row.isTranslation())
            keys.append(row.key);
    }
    return keys;
}

void LanguageRows::turnTo(const QString &language)
{
    if (language == m_language)
        return;
    m_language = language;
    if (m_pairs.isEmpty())
        makeFields();
    // Before anybody sees the fields.
    showValues();
    showFields(language.isEmpty());
    Q_EMIT turned();
}

QWidget *LanguageRows::makeField(const FormRow &row)
{
    QWidget *const parent = m_form.formLayout()->parentWidget();
    const QByteArray name = "other" + row.field->objectName().mid(int(qstrlen("local"))).toLatin1();
    if (qobject_cast<IconEdit *>(row.field))
        return VelUI::makeField<IconEdit>(name, parent);
    if (!qobject_cast<StringListEdit *>(row.field))
        return VelUI::makeField<QLineEdit>(name, parent);
    auto *list = VelUI::makeField<StringListEdit>(name, parent);
    PropsTable::setKeywordTexts(list);
    return list;
}

void LanguageRows::makeFields()
{
    for (int i = 0; i < m_rows.size(); ++i) {
        const FormRow &row = m_rows.at(i);
        if (!row.isTranslation())
            continue;
        const Pair pair{i, row.field, makeField(row)};
        pair.other->hide();
        TabOrder::putBehind(TabOrder::lastOf({row.field}), pair.other);
        FieldEdit::onEdited(pair.other, this, [this, pair] { edited(pair); });
        m_pairs.append(pair);
    }
    m_form.applyReadOnly();
}

void LanguageRows::showFields(bool isOwn)
{
    for (const Pair &pair : std::as_const(m_pairs)) {
        FormRow &row = m_rows[pair.row];
        row.field = isOwn ? pair.own : pair.other;
        row.label = isOwn ? localizedLabel(row.translated) : localizedLabel(row.translated, m_language);
        m_form.formLayout()->setField(row.number, row.label, row.field);
    }
}

void LanguageRows::showValues()
{
    if (m_language.isEmpty())
        return;
    const VelUIDesktopEntry entry = m_form.record();
    for (const Pair &pair : std::as_const(m_pairs))
        FieldEdit::show(pair.other, Translations::value(entry, m_rows.at(pair.row).key, m_language));
}

VelUIDesktopEntry LanguageRows::withoutFields() const
{
    VelUIDesktopEntry entry = m_form.baseRecord();
    m_form.translations().applyTo(&entry, [](const QString &) { return true; });
    return entry;
}

// A variant of the user's own language may be what the user's own field shows.
void LanguageRows::edited(const Pair &pair)
{
    const QString key = m_rows.at(pair.row).key;
    const QString former = Translations::ownLanguage(withoutFields(), key);
    m_form.translations().set(key, m_language, FieldEdit::value(pair.other));
    const VelUIDesktopEntry entry = withoutFields();
    const QString own = Translations::ownLanguage(entry, key);
    if (m_language == former || m_language == own)
        FieldEdit::show(pair.own, Translations::value(entry, key, own));
    m_form.tellEdit();
}

} // namespace VelUI
