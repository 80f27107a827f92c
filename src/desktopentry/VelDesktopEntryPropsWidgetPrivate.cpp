// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelDesktopEntryPropsWidgetPrivate.h"

#include "ActionListEdit.h"
#include "FieldValue.h"
#include "FormLayout.h"
#include "GuardedDialog.h"
#include "IconEdit.h"
#include "LocalisedLabel.h"
#include "MimeTypeInput.h"
#include "PathEdit.h"
#include "ShowInChoice.h"
#include "StringListEdit.h"

#include <VelDesktopEntryPropsWidget.h>

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QEvent>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QMessageBox>
#include <QScrollArea>
#include <QSignalBlocker>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

#include <climits>
#include <utility>

using namespace VelUI;
using Entry = VelUIDesktopEntry;
using Form = VelDesktopEntryPropsWidgetPrivate;

namespace {

using Label = PropsRow::Label;
using ShownFor = PropsRow::ShownFor;

const QLatin1String applicationType("Application");
const QLatin1String linkType("Link");
const QLatin1String directoryType("Directory");

template <typename Field>
Field *makeField(const char *objectName, QWidget *parent)
{
    auto *field = new Field(parent);
    field->setObjectName(QLatin1String(objectName));
    return field;
}

template <>
QLineEdit *makeField<QLineEdit>(const char *objectName, QWidget *parent)
{
    auto *line = new QLineEdit(parent);
    line->setObjectName(QLatin1String(objectName));
    line->setMaxLength(INT_MAX);
    return line;
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
    PropsRow entry = row(Label::Required, label, ShownFor::Link, nullptr, &Form::url, &Entry::getURL,
                         &Entry::setURL, &Form::urlRow);
    entry.add = [](Form &form, const QString &text) { return form.addUrlRow(text); };
    return entry;
}

PropsRow showInRowEntry(const char *label, QRadioButton *Form::*button, StringListEdit *Form::*list)
{
    PropsRow row{Label::Plain, label, ShownFor::All, nullptr, {}, {}, {}, {}, {}};
    row.add = [button, list](Form &form, const QString &text) {
        return form.addShowInRow(text, &(form.*button), &(form.*list));
    };
    return row;
}

// The two lists are one choice: the row of the second loads and saves both.
PropsRow withShowInChoice(PropsRow row)
{
    row.load = [](Form &form, const Entry &entry) { form.loadShowIn(entry); };
    row.save = [](const Form &form, Entry *entry) { form.saveShowIn(entry); };
    return row;
}

bool isListDisplay(const QLineEdit *line)
{
    return qobject_cast<const StringListEdit *>(line->parentWidget())
        || qobject_cast<const ActionListEdit *>(line->parentWidget());
}

QIcon typeIcon(const QString &type)
{
    if (type == linkType)
        return QIcon::fromTheme(QStringLiteral("text-html"));
    if (type == directoryType)
        return QIcon::fromTheme(QStringLiteral("folder"));
    return QIcon::fromTheme(QStringLiteral("application-x-executable"));
}

} // namespace

// Whoever adds a key adds a line here and a field to the class.
const std::vector<PropsRow> &VelDesktopEntryPropsWidgetPrivate::rows()
{
    constexpr Label plain = Label::Plain, required = Label::Required, local = Label::Localised;
    constexpr ShownFor all = ShownFor::All, application = ShownFor::Application;
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
        showInRowEntry(QT_TR_NOOP("Only show in"), &F::onlyShowInButton, &F::onlyShowIn),
        withShowInChoice(showInRowEntry(QT_TR_NOOP("Not show in"), &F::notShowInButton, &F::notShowIn)),
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

VelDesktopEntryPropsWidgetPrivate::VelDesktopEntryPropsWidgetPrivate(VelDesktopEntryPropsWidget *widget)
    : QObject(widget)
    , q(widget)
{
    build();
    setType(applicationType, {});
    connectChanges();
}

void VelDesktopEntryPropsWidgetPrivate::build()
{
    auto *outer = new QVBoxLayout(q);
    outer->setContentsMargins(0, 0, 0, 0);
    scrollArea = new QScrollArea(q);
    scrollArea->setObjectName(QStringLiteral("scrollArea"));
    scrollArea->setWidgetResizable(true);
    scrollArea->setFocusPolicy(Qt::NoFocus);
    outer->addWidget(scrollArea);
    content = new QWidget;
    content->setObjectName(QStringLiteral("content"));
    scrollArea->setWidget(content);
    layout = new FormLayout(content);
    layout->setObjectName(QStringLiteral("formLayout"));

    for (const PropsRow &row : rows())
        addRow(row);
    layout->setRowStretch(layout->rowCount(), 1);

    ShowInChoice{onlyShowInButton, onlyShowIn, notShowInButton, notShowIn}.connectUp(this);
    setListTexts();
}

void VelDesktopEntryPropsWidgetPrivate::addRow(const PropsRow &row)
{
    const QString label = tr(row.label);
    const int number = row.add(*this, row.kind == Label::Localised ? localisedLabel(label) : label);
    if (row.kind == Label::Required)
        layout->setRowLabelBold(number);
    if (row.number)
        this->*row.number = number;
}

int VelDesktopEntryPropsWidgetPrivate::addTypeRow(const QString &label)
{
    typeBox = makeField<QComboBox>("typeComboBox", content);
    // The wheel scrolls the form; on its way over the box it must not change the type.
    typeBox->setFocusPolicy(Qt::StrongFocus);
    // Long names of the types must not make the form wider than its window.
    typeBox->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    typeBox->setMinimumContentsLength(8);
    typeBox->installEventFilter(this);
    return layout->addRow(label, typeBox);
}

int VelDesktopEntryPropsWidgetPrivate::addUrlRow(const QString &label)
{
    url = makeField<QLineEdit>("urlEdit", content);
    urlInfoButton = makeField<QToolButton>("urlInfoButton", content);
    urlInfoButton->setIcon(QIcon::fromTheme(QStringLiteral("document-properties"),
                                            q->style()->standardIcon(QStyle::SP_FileDialogInfoView)));
    urlInfoButton->setToolTip(tr("Information about the URL"));
    urlInfoButton->setAccessibleName(urlInfoButton->toolTip());
    urlInfoButton->hide();

    auto *line = new QHBoxLayout;
    line->setContentsMargins(0, 0, 0, 0);
    line->addWidget(url);
    line->addWidget(urlInfoButton);
    return layout->addRow(label, line);
}

int VelDesktopEntryPropsWidgetPrivate::addShowInRow(const QString &label, QRadioButton **button,
                                                    StringListEdit **list)
{
    *button = new RowRadioButton(label, content);
    *list = new StringListEdit(content);
    const bool first = !notShowInButton;
    (*button)->setObjectName(first ? QStringLiteral("onlyShowInButton") : QStringLiteral("notShowInButton"));
    (*list)->setObjectName(first ? QStringLiteral("onlyShowInEdit") : QStringLiteral("notShowInEdit"));
    return layout->addRow(*button, *list);
}

void VelDesktopEntryPropsWidgetPrivate::setListTexts()
{
    const QString only = tr("Only show in");
    const QString no = tr("Not show in");
    const QString addDesktop = tr("Add desktop environment:");
    const QString editDesktop = tr("Edit desktop environment:");
    onlyShowIn->setTexts(only, only, addDesktop, only, editDesktop);
    notShowIn->setTexts(no, no, addDesktop, no, editDesktop);
    const QString mimeLabel = tr("MIME type or file name extension:");
    mimeType->setTexts(tr("MIME type"), tr("Add MIME type"), mimeLabel, tr("Edit MIME type"), mimeLabel);
    mimeType->setInputFunction(askForMimeType);
    categories->setTexts(tr("Categories"), tr("Add category"), tr("Category:"), tr("Edit category"),
                         tr("Category:"));
    for (StringListEdit *list : {keywords, localKeywords})
        list->setTexts(tr("Keywords"), tr("Add keyword"), tr("Keyword:"), tr("Edit keyword"), tr("Keyword:"));
    actions->setTexts(tr("Actions"), tr("Add action"), tr("Edit action"));
}

void VelDesktopEntryPropsWidgetPrivate::connectChanges()
{
    const auto changed = &VelDesktopEntryPropsWidget::changed;
    for (QLineEdit *line : content->findChildren<QLineEdit *>())
        connect(line, &QLineEdit::textEdited, q, changed);
    for (IconEdit *edit : content->findChildren<IconEdit *>())
        connect(edit, &IconEdit::iconChanged, q, changed);
    for (QCheckBox *box : content->findChildren<QCheckBox *>())
        connect(box, &QCheckBox::stateChanged, q, changed);
    for (PathEdit *edit : content->findChildren<PathEdit *>())
        connect(edit, &PathEdit::changed, q, changed);
    for (StringListEdit *edit : content->findChildren<StringListEdit *>())
        connect(edit, &StringListEdit::changed, q, changed);
    connect(actions, &ActionListEdit::changed, q, changed);

    connect(typeBox, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &Form::typeChosen);
    connect(onlyShowInButton, &QRadioButton::toggled, this, [this] { showInSwitched = true; });
    connect(urlInfoButton, &QToolButton::clicked, q, [this] { Q_EMIT q->requestedURLInfo(url->text()); });
    connect(qApp, &QApplication::focusChanged, this,
            [this](QWidget *, QWidget *focused) { keepInView(focused); });
}

void VelDesktopEntryPropsWidgetPrivate::keepInView(QWidget *focused)
{
    // Moving the form under a pressed mouse would make it miss what it clicks.
    if (focused && content->isAncestorOf(focused) && QApplication::mouseButtons() == Qt::NoButton)
        scrollArea->ensureWidgetVisible(focused);
}

bool VelDesktopEntryPropsWidgetPrivate::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == typeBox && event->type() == QEvent::Wheel && !typeBox->hasFocus()) {
        event->ignore();
        return true;
    }
    return QObject::eventFilter(watched, event);
}

void VelDesktopEntryPropsWidgetPrivate::setType(const QString &newType, const QStringList &newAllowedTypes)
{
    const QStringList allowed =
        newAllowedTypes.isEmpty() ? QStringList{applicationType, linkType, directoryType} : newAllowedTypes;
    if (newType.isEmpty() || !allowed.contains(newType))
        return;
    if (newType == type && allowed == allowedTypes)
        return;
    if (allowed != allowedTypes) {
        allowedTypes = allowed;
        fillTypeBox();
    }
    applyType(newType);
}

void VelDesktopEntryPropsWidgetPrivate::fillTypeBox()
{
    // Their names for the user; a type of the caller's own is shown as it is.
    static const char *const names[] = {QT_TR_NOOP("Application"), QT_TR_NOOP("Link"),
                                        QT_TR_NOOP("Directory")};
    Q_UNUSED(names)
    const QSignalBlocker blocker(typeBox);
    typeBox->clear();
    for (const QString &allowed : std::as_const(allowedTypes))
        typeBox->addItem(typeIcon(allowed), tr(allowed.toUtf8().constData()), allowed);
}

void VelDesktopEntryPropsWidgetPrivate::selectType()
{
    const QSignalBlocker blocker(typeBox);
    typeBox->setCurrentIndex(typeBox->findData(type, Qt::UserRole, Qt::MatchFixedString));
}

void VelDesktopEntryPropsWidgetPrivate::applyType(const QString &newType)
{
    type = newType;
    selectType();
    setRowsShown(ShownFor::Application);
    setRowsShown(ShownFor::Link);
    layout->setRowVisible(typeRow, allowedTypes.size() > 1 || type != directoryType);
    urlInfoButton->setVisible(showURLInfoButton && isShown(ShownFor::Link));
}

bool VelDesktopEntryPropsWidgetPrivate::isShown(ShownFor group) const
{
    switch (group) {
    case ShownFor::Application:
        return type == applicationType;
    case ShownFor::Link:
        return type == linkType;
    case ShownFor::All:
        break;
    }
    return true;
}

void VelDesktopEntryPropsWidgetPrivate::setRowsShown(ShownFor group)
{
    const bool shown = isShown(group);
    for (const PropsRow &row : rows()) {
        if (row.shownFor != group)
            continue;
        if (row.number)
            layout->setRowVisible(this->*row.number, shown);
        else
            row.field(*this)->setVisible(shown);
        if (!shown)
            row.clear(*this);
    }
}

void VelDesktopEntryPropsWidgetPrivate::typeChosen(int index)
{
    const QString chosen = typeBox->itemData(index).toString();
    if (chosen.isEmpty() || chosen == type)
        return;
    // By hand: the ready-made question adds a No button to make No the default.
    GuardedDialog<QMessageBox> box(
        QMessageBox::Question, tr("Attention"),
        tr("Desktop entry type was changed.\nSome field values may be lost...\nContinue?"), QMessageBox::Yes,
        q);
    box->setDefaultButton(QMessageBox::No);
    const int answer = box.exec();
    if (!box.isAlive())
        return;
    if (answer != QMessageBox::Yes) {
        selectType();
        return;
    }
    applyType(chosen);
    Q_EMIT q->changed();
}

void VelDesktopEntryPropsWidgetPrivate::loadFrom(const VelUIDesktopEntry &entry)
{
    setType(entry.getType(), allowedTypes);
    if (!entry.isValid())
        return;
    for (const PropsRow &row : rows()) {
        if (row.load && isShown(row.shownFor))
            row.load(*this, entry);
    }
}

void VelDesktopEntryPropsWidgetPrivate::saveTo(VelUIDesktopEntry *entry) const
{
    if (!entry)
        return;
    for (const PropsRow &row : rows()) {
        if (row.save && isShown(row.shownFor))
            row.save(*this, entry);
    }
}

void VelDesktopEntryPropsWidgetPrivate::loadShowIn(const VelUIDesktopEntry &entry)
{
    ShowInChoice{onlyShowInButton, onlyShowIn, notShowInButton, notShowIn}.load(entry.getOnlyShowIn(),
                                                                                entry.getNotShowIn());
    showInSwitched = false;
}

void VelDesktopEntryPropsWidgetPrivate::saveShowIn(VelUIDesktopEntry *entry) const
{
    const bool only = onlyShowInButton->isChecked();
    // An entry that holds both lists keeps them, unless something else was chosen: here, or
    // in the other entry that the form was filled from.
    const bool switched = showInSwitched || only != entry->getNotShowIn().isEmpty();
    if (only) {
        entry->setOnlyShowIn(onlyShowIn->strings());
        if (switched || notShowIn->strings() != entry->getNotShowIn())
            entry->setNotShowIn({});
    } else {
        entry->setNotShowIn(notShowIn->strings());
        if (switched || onlyShowIn->strings() != entry->getOnlyShowIn())
            entry->setOnlyShowIn({});
    }
}

void VelDesktopEntryPropsWidgetPrivate::setReadOnly(bool on)
{
    if (on == readOnly)
        return;
    readOnly = on;
    typeBox->setDisabled(on);
    for (QLineEdit *line : content->findChildren<QLineEdit *>()) {
        if (!isListDisplay(line))
            line->setReadOnly(on);
    }
    for (IconEdit *edit : content->findChildren<IconEdit *>())
        edit->setReadOnly(on);
    for (PathEdit *edit : content->findChildren<PathEdit *>())
        edit->setReadOnly(on);
    for (StringListEdit *edit : content->findChildren<StringListEdit *>())
        edit->setReadOnly(on);
    actions->setReadOnly(on);
    for (QCheckBox *box : content->findChildren<QCheckBox *>())
        box->setDisabled(on);
    for (QRadioButton *button : content->findChildren<QRadioButton *>())
        button->setDisabled(on);
}

void VelDesktopEntryPropsWidgetPrivate::setShowURLInfoButton(bool on)
{
    if (on == showURLInfoButton)
        return;
    showURLInfoButton = on;
    urlInfoButton->setVisible(on && isShown(ShownFor::Link));
}
