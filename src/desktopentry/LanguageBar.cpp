// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LanguageBar.h"

#include "LanguageCode.h"
#include "LanguageDialog.h"
#include "LanguageNote.h"
#include "LanguageRows.h"

#include <frame/GuardedDialog.h>
#include <velcore/language.h>

#include <QAbstractButton>
#include <QComboBox>
#include <QLabel>
#include <QPointer>
#include <QSignalBlocker>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>

namespace VelUI {

namespace {

// Few icons are for one language only: nobody misses the others.
constexpr QLatin1String IconKey("Icon");

QString ownCode()
{
    return QString::fromStdString(velLanguageCode());
}

bool isEmpty(const QVariant &value)
{
    return value.userType() == QMetaType::QStringList ? value.toStringList().isEmpty()
                                                      : value.toString().isEmpty();
}

} // namespace

LanguageBar::LanguageBar(EntryFormHost &form, LanguageRows &rows)
    : QWidget(form.form())
    , m_form(form)
    , m_rows(rows)
    , m_line(new QHBoxLayout)
    , m_box(new QComboBox(this))
    , m_note(new QLabel(this))
{
    setObjectName(QStringLiteral("languageBar"));
    build();
    qobject_cast<QBoxLayout *>(form.form()->layout())->insertWidget(0, this);
    connect(m_box, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &LanguageBar::choose);
    connect(&m_form, &EntryFormHost::recordChanged, this, &LanguageBar::refresh);
    connect(&m_rows, &LanguageRows::turned, this, &LanguageBar::refresh);
    refresh();
    show();
}

void LanguageBar::build()
{
    auto *label = new QLabel(tr("&Language:"), this);
    label->setBuddy(m_box);
    m_box->setObjectName(QStringLiteral("languageBox"));
    m_box->setAccessibleName(tr("Language"));
    m_box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_box->setMinimumContentsLength(14);
    m_box->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    auto *add = new QToolButton(this);
    add->setObjectName(QStringLiteral("newLanguageButton"));
    add->setIcon(QIcon::fromTheme(QStringLiteral("list-add")));
    if (add->icon().isNull())
        add->setText(QStringLiteral("+"));
    add->setToolTip(tr("Another language..."));
    add->setAccessibleName(tr("Another language"));
    add->setFocusPolicy(Qt::StrongFocus);
    connect(add, &QToolButton::clicked, this, &LanguageBar::askForLanguage);
    m_note->setObjectName(QStringLiteral("languageNote"));
    m_note->setTextFormat(Qt::PlainText);
    m_note->setWordWrap(true);

    for (QWidget *widget :
         {static_cast<QWidget *>(label), static_cast<QWidget *>(m_box), static_cast<QWidget *>(add)})
        m_line->addWidget(widget, widget == m_box ? 1 : 0);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addLayout(m_line);
    layout->addWidget(m_note);
}

void LanguageBar::addButton(QAbstractButton *button)
{
    m_line->addWidget(button);
}

void LanguageBar::refresh()
{
    const VelUIDesktopEntry entry = m_form.record();
    showItems(itemsOf(entry));
    const QString note = noteOf(entry);
    m_note->setText(note);
    m_box->setAccessibleDescription(note);
}

void LanguageBar::showItems(const QVector<Item> &items)
{
    const QSignalBlocker blocker(m_box);
    const QIcon mark = QIcon::fromTheme(QStringLiteral("dialog-ok-apply"),
                                        style()->standardIcon(QStyle::SP_DialogApplyButton));
    while (m_box->count() > items.size())
        m_box->removeItem(m_box->count() - 1);
    for (int i = 0; i < items.size(); ++i) {
        const Item &item = items.at(i);
        if (i == m_box->count())
            m_box->addItem(QString());
        if (m_box->itemText(i) != item.text || m_box->itemIcon(i).isNull() == item.exists) {
            m_box->setItemText(i, item.text);
            m_box->setItemIcon(i, item.exists ? mark : QIcon());
        }
        m_box->setItemData(i, item.language);
        if (item.language == m_rows.language())
            m_box->setCurrentIndex(i);
    }
}

QStringList LanguageBar::languagesOf(const VelUIDesktopEntry &entry) const
{
    QStringList languages;
    QStringList own;
    const QStringList keys = m_rows.keys();
    for (const QString &key : keys) {
        languages.append(entry.getLanguages(key));
        own.append(Translations::ownLanguage(entry, key));
    }
    if (!m_rows.language().isEmpty())
        languages.append(m_rows.language());
    languages.removeDuplicates();
    own.removeDuplicates();
    // It stands at the top, unless the user sees several languages at once.
    if (own == QStringList{ownCode()} && m_rows.language() != ownCode())
        languages.removeOne(ownCode());
    std::sort(languages.begin(), languages.end());
    return languages;
}

QVector<LanguageBar::Item> LanguageBar::itemsOf(const VelUIDesktopEntry &entry) const
{
    QVector<Item> items{itemOf(entry, QString())};
    const QStringList languages = languagesOf(entry);
    for (const QString &language : languages)
        items.append(itemOf(entry, language));
    return items;
}

LanguageBar::Item LanguageBar::itemOf(const VelUIDesktopEntry &entry, const QString &language) const
{
    int count = 0;
    int total = 0;
    bool hasIcon = false;
    const QStringList keys = m_rows.keys();
    for (const QString &key : keys) {
        const QString shown = language.isEmpty() ? entry.getLanguageInForce(key) : language;
        const bool isTranslated = !shown.isEmpty() && !isEmpty(Translations::value(entry, key, shown));
        if (key == IconKey)
            hasIcon = isTranslated;
        else if (isTranslated || !isEmpty(Translations::baseValue(entry, key)))
            ++total;
        count += isTranslated && key != IconKey;
    }
    const bool exists = count > 0 || hasIcon;
    return {language, textOf(language, exists, count, total), exists};
}

QString LanguageBar::textOf(const QString &language, bool exists, int count, int total)
{
    const QString code = language.isEmpty() ? ownCode() : language;
    const QString known = LanguageCode::nativeName(code);
    const QString name = known.isEmpty() ? tr("Unknown language") : known;
    if (language.isEmpty() && exists)
        return tr("%1 (%2), yours: %3 of %4 texts").arg(name, code).arg(count).arg(total);
    if (language.isEmpty())
        return tr("%1 (%2), yours: no text yet").arg(name, code);
    if (exists)
        return tr("%1 (%2): %3 of %4 texts").arg(name, code).arg(count).arg(total);
    return tr("%1 (%2): no text yet").arg(name, code);
}

QString LanguageBar::noteOf(const VelUIDesktopEntry &entry) const
{
    LanguageNote::Languages languages;
    const QStringList keys = m_rows.keys();
    for (const QString &key : keys) {
        if (key != IconKey && !isEmpty(Translations::baseValue(entry, key)))
            languages.insert(key, entry.getLanguages(key));
    }
    return LanguageNote::text(m_rows.language().isEmpty() ? ownCode() : m_rows.language(), languages);
}

void LanguageBar::choose(int item)
{
    if (item >= 0)
        m_rows.turnTo(m_box->itemData(item).toString());
}

void LanguageBar::askForLanguage()
{
    const QPointer<LanguageBar> self(this);
    GuardedDialog<LanguageDialog> dialog(m_form.form());
    if (!dialog.run() || !self)
        return;
    const QString language = dialog->language();
    m_rows.turnTo(language == ownCode() && m_box->findData(language) < 0 ? QString() : language);
}

} // namespace VelUI
