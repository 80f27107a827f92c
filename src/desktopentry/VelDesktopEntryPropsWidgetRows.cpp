// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The table of the form's rows and what its lines are made of.

#include "VelDesktopEntryPropsWidgetPrivate.h"

#include "ActionListEdit.h"
#include "fields/FormLayout.h"
#include "fields/IconEdit.h"
#include "fields/NamedField.h"
#include "fields/PathEdit.h"
#include "fields/PlainFields.h"
#include "fields/ShowInChoice.h"
#include "fields/StringListEdit.h"

#include <QCheckBox>

#include <utility>

using namespace VelUI;
using Entry = VelUIDesktopEntry;
using Form = VelDesktopEntryPropsWidgetPrivate;

namespace {

using Label = PropsRow::Label;
using ShownFor = PropsRow::ShownFor;

int addField(FormLayout *layout, const QString &label, QWidget *field)
{
    return layout->addRow(label, field);
}

int addField(FormLayout *layout, const QString &label, QCheckBox *box)
{
    box->setText(label);
    return layout->addRow(box);
}

// A key that one field shows.
template <typename Field, typename Get, typename Set>
PropsRow row(Label kind, const char *label, ShownFor shownFor, const char *objectName, Field *Form::*field,
             Get get, Set set, int Form::*number = nullptr)
{
    using Value = decltype(fieldValue(std::declval<const Field *>()));
    PropsRow row{kind, label, shownFor, number, {}, {}, {}, {}, {}};
    row.add = [field, objectName](Form &form, const QString &text) {
        form.*field = makeField<Field>(objectName, form.content);
        return addField(form.layout, text, form.*field);
    };
    row.field = [field](const Form &form) { return form.*field; };
    row.load = [field, get](Form &form, const Entry &entry) { setFieldValue(form.*field, (entry.*get)()); };
    row.save = [field, set](const Form &form, Entry *entry) { (entry->*set)(fieldValue(form.*field)); };
    row.clear = [field](Form &form) { setFieldValue(form.*field, Value{}); };
    return row;
}

PropsRow typeRowEntry(const char *label)
{
    PropsRow row{Label::Plain, label, ShownFor::All, &Form::typeRow, {}, {}, {}, {}, {}};
    row.add = [](Form &form, const QString &text) { return form.addTypeRow(text); };
    row.save = [](const Form &form, Entry *entry) { entry->setType(form.type); };
    return row;
}

PropsRow urlRowEntry(const char *label)
{
    PropsRow entry = row(Label::Required, label, ShownFor::Links, nullptr, &Form::url, &Entry::getURL,
                         &Entry::setURL, &Form::urlRow);
    entry.add = [](Form &form, const QString &text) { return form.addUrlRow(text); };
    return entry;
}

PropsRow showInRows(const char *label)
{
    PropsRow row{Label::Plain, label, ShownFor::All, nullptr, {}, {}, {}, {}, {}};
    row.add = [](Form &form, const QString &text) { return form.addShowInRows(text); };
    row.load = [](Form &form, const Entry &entry) { form.showIn->load(entry); };
    row.save = [](const Form &form, Entry *entry) { form.showIn->save(entry); };
    return row;
}

} // namespace

// Whoever adds a key adds a line here and a field to the class.
const std::vector<PropsRow> &VelDesktopEntryPropsWidgetPrivate::rows()
{
    constexpr Label plain = Label::Plain, required = Label::Required, local = Label::Localized;
    constexpr ShownFor all = ShownFor::All, application = ShownFor::Applications;
    using F = Form;
    using E = Entry;
    // clang-format off
    static const std::vector<PropsRow> table = {
        typeRowEntry(QT_TR_NOOP("Type")),
        row(required, QT_TR_NOOP("Name"), all, "nameEdit", &F::name, &E::getName, &E::setName),
        row(local, QT_TR_NOOP("Name"), all, "localNameEdit", &F::localName, &E::getLocalName, &E::setLocalName),
        row(plain, QT_TR_NOOP("Icon"), all, "iconEdit", &F::icon, &E::getIcon, &E::setIcon),
        row(local, QT_TR_NOOP("Icon"), all, "localIconEdit", &F::localIcon, &E::getLocalIcon, &E::setLocalIcon),
        row(required, QT_TR_NOOP("Exec"), application, "execEdit", &F::exec, &E::getExec, &E::setExec, &F::execRow),
        row(plain, QT_TR_NOOP("Terminal"), application, "terminalCheckBox", &F::terminal, &E::getTerminal, &E::setTerminal),
        row(plain, QT_TR_NOOP("Path"), application, "pathEdit", &F::path, &E::getPath, &E::setPath, &F::pathRow),
        row(plain, QT_TR_NOOP("Try exec"), application, "tryExecEdit", &F::tryExec, &E::getTryExec, &E::setTryExec, &F::tryExecRow),
        urlRowEntry(QT_TR_NOOP("Url")),
        row(plain, QT_TR_NOOP("Generic name"), all, "genericNameEdit", &F::genericName, &E::getGenericName, &E::setGenericName),
        row(local, QT_TR_NOOP("Generic name"), all, "localGenericNameEdit", &F::localGenericName, &E::getLocalGenericName, &E::setLocalGenericName),
        row(plain, QT_TR_NOOP("Comment"), all, "commentEdit", &F::comment, &E::getComment, &E::setComment),
        row(local, QT_TR_NOOP("Comment"), all, "localCommentEdit", &F::localComment, &E::getLocalComment, &E::setLocalComment),
        row(plain, QT_TR_NOOP("No display"), all, "noDisplayCheckBox", &F::noDisplay, &E::getNoDisplay, &E::setNoDisplay),
        row(plain, QT_TR_NOOP("Hidden"), all, "hiddenCheckBox", &F::hidden, &E::getHidden, &E::setHidden),
        showInRows(QT_TR_NOOP("Only show in")),
        row(plain, QT_TR_NOOP("MIME type"), application, "mimeTypeEdit", &F::mimeType, &E::getMimeType, &E::setMimeType, &F::mimeTypeRow),
        row(plain, QT_TR_NOOP("Categories"), application, "categoriesEdit", &F::categories, &E::getCategories, &E::setCategories, &F::categoriesRow),
        row(plain, QT_TR_NOOP("Keywords"), application, "keywordsEdit", &F::keywords, &E::getKeywords, &E::setKeywords, &F::keywordsRow),
        row(local, QT_TR_NOOP("Keywords"), application, "localKeywordsEdit", &F::localKeywords, &E::getLocalKeywords, &E::setLocalKeywords, &F::localKeywordsRow),
        row(plain, QT_TR_NOOP("Startup notify"), application, "startupNotifyCheckBox", &F::startupNotify, &E::getStartupNotify, &E::setStartupNotify),
        row(plain, QT_TR_NOOP("Startup WM class"), application, "startupWMClassEdit", &F::startupWMClass, &E::getStartupWMClass, &E::setStartupWMClass, &F::startupWMClassRow),
        row(plain, QT_TR_NOOP("Actions"), application, "actionsEdit", &F::actions, &E::getActions, &E::setActions, &F::actionsRow),
        row(plain, QT_TR_NOOP("Version"), all, "versionEdit", &F::version, &E::getVersion, &E::setVersion),
    };
    // clang-format on
    return table;
}
