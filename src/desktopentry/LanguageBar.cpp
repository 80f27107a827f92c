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

// More than there are translators for; the list would take long.
constexpr int MostLanguages = 500;

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

// Few edits change what is told: no other takes time.
void LanguageBar::refresh()
{
    const Coverage now = coverage();
    if (m_box->count() > 0 && now == m_coverage)
        return;
    m_coverage = now;
    QVector<Item> items{itemOf(QString())};
    const QStringList languages = otherLanguages();
    for (const QString &language : languages)
        items.append(itemOf(language));
    showItems(items);
    m_note->setText(note());
    m_box->setAccessibleDescription(m_note->text());
}

LanguageBar::Coverage LanguageBar::coverage() const
{
    const VelUIDesktopEntry entry = m_form.record();
    Coverage coverage;
    coverage.shown = m_rows.language();
    const QStringList keys = m_rows.keys();
    for (const QString &key : keys) {
        coverage.languages.insert(key, entry.getLanguages(key).mid(0, MostLanguages));
        coverage.inForce.insert(key, entry.getLanguageInForce(key));
        if (!isEmpty(Translations::baseValue(entry, key)))
            coverage.texts.append(key);
    }
    return coverage;
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

QStringList LanguageBar::otherLanguages() const
{
    QStringList languages;
    for (const QStringList &existing : m_coverage.languages)
        languages.append(existing);
    if (!m_rows.language().isEmpty())
        languages.append(m_rows.language());
    languages.removeDuplicates();
    // The user's own stands at the top, unless the user sees several languages at once.
    const bool seesOthers =
        std::any_of(m_coverage.inForce.begin(), m_coverage.inForce.end(),
                    [](const QString &seen) { return !seen.isEmpty() && seen != ownCode(); });
    if (!seesOthers && m_rows.language() != ownCode())
        languages.removeOne(ownCode());
    std::sort(languages.begin(), languages.end());
    return languages;
}

LanguageBar::Item LanguageBar::itemOf(const QString &language) const
{
    int count = 0;
    int total = 0;
    bool exists = false;
    for (auto key = m_coverage.languages.begin(); key != m_coverage.languages.end(); ++key) {
        const bool isTranslated =
            language.isEmpty() ? !m_coverage.inForce.value(key.key()).isEmpty() : key->contains(language);
        exists = exists || isTranslated;
        if (key.key() == IconKey)
            continue;
        count += isTranslated;
        total += isTranslated || m_coverage.texts.contains(key.key());
    }
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

QString LanguageBar::note() const
{
    LanguageNote::Languages languages;
    for (const QString &key : m_coverage.texts) {
        if (key != IconKey)
            languages.insert(key, m_coverage.languages.value(key));
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
