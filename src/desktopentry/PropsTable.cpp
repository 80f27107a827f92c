// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PropsTable.h"

#include "ActionListEdit.h"
#include "KeyRow.h"
#include "UrlRow.h"
#include "fields/FormLayout.h"
#include "fields/IconEdit.h"
#include "fields/LocalizedLabel.h"
#include "fields/MimeTypeInput.h"
#include "fields/NamedField.h"
#include "fields/PathEdit.h"
#include "fields/ShowInChoice.h"
#include "fields/StringListEdit.h"
#include "fields/TiedLines.h"

#include <QCheckBox>

namespace VelUI {

namespace {

using ShownFor = PropsRow::ShownFor;

// The lists of desktop environments: two rows, but one choice. Entries of every type have them.
class ShowInRows : public PropsRow
{
public:
    ShowInRows(FormLayout *layout, const ShowInChoice::Texts &texts)
        : PropsRow(ShownFor::All, layout, layout->rowCount())
        , m_choice(new ShowInChoice(texts, layout))
    {
    }

    void load(const VelUIDesktopEntry &entry) override { m_choice->load(entry); }
    void save(VelUIDesktopEntry *entry) const override { m_choice->save(entry); }
    // Every type has them.
    void putAway() override { }
    void restore() override { }
    void forget() override { }

    ShowInChoice *choice() const { return m_choice; }

private:
    ShowInChoice *const m_choice;
};

struct Lines
{
    QLineEdit *base;
    QLineEdit *local;
};

// Takes the lines in braces: they are added in the order in which they stand there.
void tie(const Lines &lines)
{
    new TiedLines(lines.base, lines.local);
}

int addField(FormLayout *layout, const QString &label, QWidget *field)
{
    return layout->addRow(label, field);
}

int addField(FormLayout *layout, const QString &label, QCheckBox *box)
{
    box->setText(label);
    return layout->addRow(box);
}

} // namespace

PropsTable::PropsTable(FormLayout *layout)
    : m_layout(layout)
{
    build();
}

PropsTable::~PropsTable() = default;

// The table of the form: whoever adds a key adds a line.
void PropsTable::build()
{
    using E = VelUIDesktopEntry;
    constexpr ShownFor all = ShownFor::All, applications = ShownFor::Applications;
    // clang-format off
    tie({m_nameLine = add<QLineEdit>("Name", required(tr("Name")), all, "nameEdit", &E::getName, &E::setName),
         add<QLineEdit>("Name", localized(tr("Name")), all, "localNameEdit", &E::getLocalName, &E::setLocalName)});
    add<IconEdit>("Icon", tr("Icon"), all, "iconEdit", &E::getIcon, &E::setIcon);
    add<IconEdit>("Icon", localized(tr("Icon")), all, "localIconEdit", &E::getLocalIcon, &E::setLocalIcon);
    add<PathEdit>("Exec", required(tr("Exec")), applications, "execEdit", &E::getExec, &E::setExec);
    add<QCheckBox>("Terminal", tr("Terminal"), applications, "terminalCheckBox", &E::getTerminal, &E::setTerminal);
    add<QLineEdit>("Path", tr("Path"), applications, "pathEdit", &E::getPath, &E::setPath);
    add<PathEdit>("TryExec", tr("Try exec"), applications, "tryExecEdit", &E::getTryExec, &E::setTryExec);
    addUrl();
    tie({add<QLineEdit>("GenericName", tr("Generic name"), all, "genericNameEdit", &E::getGenericName, &E::setGenericName),
         add<QLineEdit>("GenericName", localized(tr("Generic name")), all, "localGenericNameEdit", &E::getLocalGenericName, &E::setLocalGenericName)});
    tie({add<QLineEdit>("Comment", tr("Comment"), all, "commentEdit", &E::getComment, &E::setComment),
         add<QLineEdit>("Comment", localized(tr("Comment")), all, "localCommentEdit", &E::getLocalComment, &E::setLocalComment)});
    add<QCheckBox>("NoDisplay", tr("No display"), all, "noDisplayCheckBox", &E::getNoDisplay, &E::setNoDisplay);
    add<QCheckBox>("Hidden", tr("Hidden"), all, "hiddenCheckBox", &E::getHidden, &E::setHidden);
    addShowIn();
    setMimeTypeTexts(add<StringListEdit>("MimeType", tr("MIME type"), applications, "mimeTypeEdit", &E::getMimeType, &E::setMimeType));
    setCategoryTexts(add<StringListEdit>("Categories", tr("Categories"), applications, "categoriesEdit", &E::getCategories, &E::setCategories));
    setKeywordTexts(add<StringListEdit>("Keywords", tr("Keywords"), applications, "keywordsEdit", &E::getKeywords, &E::setKeywords));
    setKeywordTexts(add<StringListEdit>("Keywords", localized(tr("Keywords")), applications, "localKeywordsEdit", &E::getLocalKeywords, &E::setLocalKeywords));
    add<QCheckBox>("StartupNotify", tr("Startup notify"), applications, "startupNotifyCheckBox", &E::getStartupNotify, &E::setStartupNotify);
    add<QLineEdit>("StartupWMClass", tr("Startup WM class"), applications, "startupWMClassEdit", &E::getStartupWMClass, &E::setStartupWMClass);
    add<ActionListEdit>("Actions", tr("Actions"), applications, "actionsEdit", &E::getActions, &E::setActions)->setTexts(tr("Actions"), tr("Add action"), tr("Edit action"));
    add<QLineEdit>("Version", tr("Version"), all, "versionEdit", &E::getVersion, &E::setVersion);
    // clang-format on
}

PropsTable::Label PropsTable::required(const QString &text)
{
    return {text, true};
}

PropsTable::Label PropsTable::localized(const QString &text)
{
    return {localizedLabel(text), false, text};
}

template <typename Field, typename Getter, typename Setter>
Field *PropsTable::add(const char *key, const Label &label, ShownFor shownFor, const char *objectName,
                       Getter getter, Setter setter)
{
    auto *field = makeField<Field>(objectName, m_layout->parentWidget());
    const int number = addField(m_layout, label.text, field);
    if (label.isBold)
        m_layout->setRowLabelBold(number);
    m_formRows.append({QString::fromLatin1(key), label.text, shownFor, label.translated, number, field});
    m_rows.push_back(
        std::make_unique<KeyRow<Field, Getter, Setter>>(shownFor, m_layout, number, field, getter, setter));
    return field;
}

void PropsTable::addUrl()
{
    auto row = std::make_unique<UrlRow>(m_layout);
    m_urlRow = row.get();
    m_formRows.append(row->row());
    m_rows.push_back(std::move(row));
}

void PropsTable::addShowIn()
{
    const ShowInChoice::Texts texts{tr("Only show in"), tr("Not show in"), tr("Add desktop environment:"),
                                    tr("Edit desktop environment:")};
    auto rows = std::make_unique<ShowInRows>(m_layout, texts);
    m_showIn = rows->choice();
    const int second = m_layout->rowCount() - 1;
    m_formRows.append(
        {QStringLiteral("OnlyShowIn"), texts.only, ShownFor::All, {}, second - 1, m_showIn->onlyField()});
    m_formRows.append(
        {QStringLiteral("NotShowIn"), texts.no, ShownFor::All, {}, second, m_showIn->noField()});
    m_rows.push_back(std::move(rows));
}

void PropsTable::setMimeTypeTexts(StringListEdit *field)
{
    const QString label = tr("MIME type or file name extension:");
    field->setTexts(tr("MIME type"), tr("Add MIME type"), label, tr("Edit MIME type"), label);
    field->setInputFunction(askForMimeType);
}

void PropsTable::setCategoryTexts(StringListEdit *field)
{
    field->setTexts(tr("Categories"), tr("Add category"), tr("Category:"), tr("Edit category"),
                    tr("Category:"));
}

void PropsTable::setKeywordTexts(StringListEdit *field)
{
    field->setTexts(tr("Keywords"), tr("Add keyword"), tr("Keyword:"), tr("Edit keyword"), tr("Keyword:"));
}

void PropsTable::showFor(const QString &type)
{
    forget();
    changeTo(type);
    forget();
}

void PropsTable::forget()
{
    for (const auto &row : m_rows)
        row->forget();
}

void PropsTable::changeTo(const QString &type)
{
    for (const ShownFor group : {ShownFor::Applications, ShownFor::Links}) {
        const bool isShown = EntryTypeRules::isShown(group, type);
        for (const auto &row : m_rows) {
            if (row->shownFor() != group)
                continue;
            row->setVisible(isShown);
            if (isShown)
                row->restore();
            else
                row->putAway();
        }
    }
}

void PropsTable::load(const VelUIDesktopEntry &entry, const QString &type)
{
    forget();
    for (const auto &row : m_rows) {
        if (EntryTypeRules::isShown(row->shownFor(), type))
            row->load(entry);
    }
}

void PropsTable::save(VelUIDesktopEntry *entry, const QString &type) const
{
    for (const auto &row : m_rows) {
        if (EntryTypeRules::isShown(row->shownFor(), type))
            row->save(entry);
    }
}

UrlRow *PropsTable::urlRow() const
{
    return m_urlRow;
}

ShowInChoice *PropsTable::showIn() const
{
    return m_showIn;
}

const QVector<FormRow> &PropsTable::formRows() const
{
    return m_formRows;
}

QLineEdit *PropsTable::nameLine() const
{
    return m_nameLine;
}

} // namespace VelUI
