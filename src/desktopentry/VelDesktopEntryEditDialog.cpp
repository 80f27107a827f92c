// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <VelDesktopEntryEditDialog.h>

#include "EntryCopy.h"
#include "EntryFormAssistance.h"
#include "EntryTypeRules.h"
#include "FieldEdit.h"
#include "FormHistory.h"
#include "UnsuitableEntry.h"
#include "VelDesktopEntryPropsWidgetPrivate.h"
#include "fields/ShowInChoice.h"

#include <VelDesktopEntryPropsWidget.h>
#include <VelMenuDialog.h>
#include <frame/DesktopEntryRecord.h>
#include <frame/DialogSize.h>
#include <frame/GuardedDialog.h>
#include <frame/MessageBox.h>
#include <velcore/dirs.h>
#include <velintegration/desktopitems.h>
#include <velintegration/startmenu.h>

#include <QCoreApplication>
#include <QDialogButtonBox>
#include <QFile>
#include <QFileInfo>
#include <QMessageBox>
#include <QPoint>
#include <QPointer>
#include <QPushButton>
#include <QScrollArea>
#include <QVBoxLayout>

#include <optional>

namespace {

// The name of another dialog; the size is kept under it.
QString sizeGroup()
{
    return QStringLiteral("/VelMimeTypesSelectDialog");
}

QString standardDirectory(VelDir kind)
{
    return QString::fromStdString(GetVelDir(kind));
}

} // namespace

class VelDesktopEntryEditDialogPrivate
{
    Q_DECLARE_TR_FUNCTIONS(VelDesktopEntryEditDialog)

public:
    explicit VelDesktopEntryEditDialogPrivate(VelDesktopEntryEditDialog *dialog)
        : q(dialog)
    {
    }

    void warn(const QString &text);
    void warnOfNoEntry(const QString &file);
    void markModified();
    bool checkSuitable(const VelUIDesktopEntry &entry);
    bool inheritFrom(const QString &pattern, VelUIDesktopEntry *entry);
    void savePosition();
    void setNewType();
    void addHistory();
    VelUIDesktopEntry entryToChange() const;
    VelUIDesktopEntry entryToSave() const;
    void emptyListSwitchedFrom(VelUIDesktopEntry *entry) const;
    VelDesktopEntryPropsWidgetPrivate &form() const { return VelDesktopEntryPropsWidgetPrivate::of(*props); }

    void focusField(const QString &key);

    VelDesktopEntryEditDialog *const q;
    QPointer<VelDesktopEntryPropsWidget> props;
    QString path;
    bool isAssisted = false;
    std::optional<QPoint> position; // on the desktop
    // As it was read; saving through a copy writes only what differs from it, so that what
    // another program changed meanwhile stays.
    VelUIDesktopEntry loaded{QString()};
};

void VelDesktopEntryEditDialogPrivate::warn(const QString &text)
{
    MessageBox::show(q, QMessageBox::Warning, tr("Warning"), text);
}

void VelDesktopEntryEditDialogPrivate::warnOfNoEntry(const QString &file)
{
    warn(tr("The file %1 is not a desktop entry: it has no group [Desktop Entry].").arg(file));
}

void VelDesktopEntryEditDialogPrivate::markModified()
{
    // The caller may have set a title without a place for the mark, which Qt would warn about.
    if (q->windowTitle().contains(QLatin1String("[*]")))
        q->setWindowModified(true);
    else
        q->setAttribute(Qt::WA_WindowModified);
}

bool VelDesktopEntryEditDialogPrivate::checkSuitable(const VelUIDesktopEntry &entry)
{
    VelUIDesktopEntry::SuitableError error = 0;
    if (entry.isSuitable(&error))
        return true;
    const QPointer<VelDesktopEntryEditDialog> self(q);
    warn(UnsuitableEntry::text(error));
    if (self && isAssisted && props)
        focusField(UnsuitableEntry::fieldMeant(error, entry));
    return false;
}

void VelDesktopEntryEditDialogPrivate::focusField(const QString &key)
{
    const VelUI::FormRow *row = form().assistance->row(key);
    if (!row)
        return;
    VelUI::FieldEdit::focus(row->field);
    form().scrollArea->ensureWidgetVisible(row->field);
}

// Gives the entry what it lacks; false when the dialog was deleted behind a message.
bool VelDesktopEntryEditDialogPrivate::inheritFrom(const QString &pattern, VelUIDesktopEntry *entry)
{
    VelUIDesktopEntry source{QString()};
    source.setFilePath(pattern);
    const bool isLoaded = source.load();
    entry->inheritFrom(source);
    if (source.isValid())
        return true;
    const QPointer<VelDesktopEntryEditDialog> self(q);
    if (isLoaded)
        warnOfNoEntry(pattern);
    else
        warn(tr("Can't load file %1").arg(pattern));
    return self;
}

void VelDesktopEntryEditDialogPrivate::savePosition()
{
    const QFileInfo file(path);
    if (file.absolutePath() != standardDirectory(VelDir::Desktop)) {
        warn(tr("Can't save position on desktop for %1").arg(path));
        return;
    }
    SaveDesktopItemPosition(file.fileName().toLocal8Bit().constData(), position->x(), position->y());
}

// Where the path says nothing, the new entry gets the type that the form shows.
void VelDesktopEntryEditDialogPrivate::setNewType()
{
    const EntryTypeRules::NewEntry types = EntryTypeRules::newEntryAt(path);
    props->setType(types.type.isEmpty() ? form().typeChooser.type() : types.type, types.allowed);
}

// An entry may hold both lists; whoever goes over to the other one means it to count.
void VelDesktopEntryEditDialogPrivate::emptyListSwitchedFrom(VelUIDesktopEntry *entry) const
{
    const bool isOnlyChosen = form().rows.showIn()->isOnlyChosen();
    if (isOnlyChosen == VelUI::ShowInChoice::choosesOnly(loaded))
        return;
    if (isOnlyChosen)
        entry->setNotShowIn({});
    else
        entry->setOnlyShowIn({});
}

// Good in the whole dialog.
void VelDesktopEntryEditDialogPrivate::addHistory()
{
    const VelUI::FormHistory &history = form().assistance->history();
    q->addActions({history.undoAction(), history.redoAction()});
    QObject::connect(&history, &VelUI::FormHistory::unchanged, q, [this] { q->setWindowModified(false); });
}

VelUIDesktopEntry VelDesktopEntryEditDialogPrivate::entryToChange() const
{
    VelUIDesktopEntry entry = loaded;
    entry.setFilePath(path);
    return entry;
}

VelUIDesktopEntry VelDesktopEntryEditDialogPrivate::entryToSave() const
{
    VelUIDesktopEntry entry = entryToChange();
    props->saveTo(&entry);
    emptyListSwitchedFrom(&entry);
    return entry;
}

VelDesktopEntryEditDialog::VelDesktopEntryEditDialog(QWidget *parent)
    : QDialog(parent)
    , d(std::make_unique<VelDesktopEntryEditDialogPrivate>(this))
{
    d->props = new VelDesktopEntryPropsWidget(this);
    d->props->setObjectName(QStringLiteral("props"));
    d->form().recordToChange = [this] { return d->entryToChange(); };
    d->form().recordToSave = [this] { return d->entryToSave(); };
    // Whoever opens the dialog types the name first.
    d->props->setFocus();
    connect(d->props, &VelDesktopEntryPropsWidget::changed, this, [this] { d->markModified(); });
    connect(&d->form(), &VelDesktopEntryPropsWidgetPrivate::showInSwitched, this,
            [this] { d->markModified(); });

    auto *buttonBox = new QDialogButtonBox(
        QDialogButtonBox::Ok | QDialogButtonBox::Cancel | QDialogButtonBox::Help, Qt::Horizontal, this);
    buttonBox->setObjectName(QStringLiteral("buttonBox"));
    auto *copyButton = new QPushButton(tr("Copy from..."), this);
    copyButton->setObjectName(QStringLiteral("copyButton"));
    connect(copyButton, &QPushButton::clicked, this, &VelDesktopEntryEditDialog::copyFrom);
    buttonBox->addButton(copyButton, QDialogButtonBox::ResetRole);
    buttonBox->button(QDialogButtonBox::Help)->setShortcut(QKeySequence(Qt::Key_F1));
    connect(buttonBox, &QDialogButtonBox::accepted, this, &VelDesktopEntryEditDialog::accept);
    connect(buttonBox, &QDialogButtonBox::rejected, this, &VelDesktopEntryEditDialog::reject);
    connect(buttonBox, &QDialogButtonBox::helpRequested, this, &VelDesktopEntryEditDialog::helpSlot);

    auto *layout = new QVBoxLayout(this);
    layout->addWidget(d->props);
    layout->addWidget(buttonBox);

    DialogSize::restore(*this, sizeGroup(), QSize(560, 440));
}

VelDesktopEntryEditDialog::~VelDesktopEntryEditDialog()
{
    DialogSize::remember(*this, sizeGroup());
}

bool VelDesktopEntryEditDialog::assistance() const
{
    return d->isAssisted;
}

void VelDesktopEntryEditDialog::setAssistance(bool assistance)
{
    if (assistance == d->isAssisted)
        return;
    d->isAssisted = assistance;
    if (!d->props)
        return;
    d->props->setAssistance(assistance);
    if (assistance)
        d->addHistory();
}

bool VelDesktopEntryEditDialog::setDesktopEntryPath(const QString &path, bool create, const QString &pattern)
{
    if (!d->props)
        return false;
    VelUIDesktopEntry entry{QString()};
    entry.setFilePath(path);
    const bool loaded = entry.load();
    if (!loaded && !create) {
        d->warn(tr("Can't load file %1").arg(path));
        return false;
    }
    const VelUIDesktopEntry own = entry;
    if (!pattern.isEmpty() && !d->inheritFrom(pattern, &entry))
        return false;
    d->path = path;
    d->loaded = own;
    d->form().path = path;
    d->form().allowAllTypes();
    d->props->loadFrom(entry);
    if (!loaded)
        d->setNewType();
    setWindowTitle(tr("Desktop Entry Editor") + QStringLiteral(" - ") + path + QStringLiteral("[*]"));
    // Filling the form is not a change of the user's.
    setWindowModified(false);
    // The last thing: the dialog may go away behind it.
    if (loaded && !own.isValid())
        d->warnOfNoEntry(path);
    return true;
}

void VelDesktopEntryEditDialog::setDesktopEntryCoords(int xx, int yy)
{
    if (!d->props)
        return;
    d->position = QPoint(xx, yy);
}

void VelDesktopEntryEditDialog::accept()
{
    if (!d->props) {
        QDialog::accept();
        return;
    }
    VelUIDesktopEntry entry = d->entryToSave();
    const QPointer<VelDesktopEntryEditDialog> self(this);
    if (!d->checkSuitable(entry))
        return;
    VelUIDesktopEntry::DisplayableError displayError = 0;
    if (!entry.isDisplayable(&displayError))
        d->warn(tr("You create hidden desktop entry"));
    if (!self)
        return;
    if (!entry.save()) {
        d->warn(tr("Can't save file %1").arg(d->path));
        return;
    }
    d->loaded = entry;
    if (d->position)
        d->savePosition();
    if (self)
        QDialog::accept();
}

void VelDesktopEntryEditDialog::copyFrom()
{
    if (!d->props)
        return;
    const QString menu = standardDirectory(VelDir::StartMenu);
    if (assistance())
        UpdateStartMenu(QFile::encodeName(menu).constData(), nullptr); // a new home has none yet
    GuardedDialog<VelMenuDialog> picker(menu, -1, false, false, this);
    picker->setAssistance(assistance());
    if (!picker.run())
        return;
    const QString source = picker->selectedItemPath();
    if (source.isEmpty() || !d->props)
        return;
    VelUIDesktopEntry entry(source);
    if (!entry.load())
        return;
    VelUI::EntryCopy(d->form()).take(entry, d->loaded);
    d->markModified();
}

void VelDesktopEntryEditDialog::helpSlot()
{
    GuardedDialog<QMessageBox> box(
        QMessageBox::Information, tr("Help"),
        tr("<b>Desktop entry</b> is a multipurpose info file for installed apps, devices, etc. "
           "It can be used to build menu entries, shortcuts, etc. "
           "This dialog implements the 'Desktop Entry Standard' of "
           "<a href=\"https://www.freedesktop.org\">https://www.freedesktop.org</a>."
           "<br><br>"
           "Desktop entry file is a text ini-like file with one main section [Desktop Entry] and possible "
           "additional sections for each action defined in the main section field 'Actions'. "
           "All fields are text string pairs: key=value. "
           "Value can also be a semicolon separated string list."),
        QMessageBox::Close, this);
    box->setTextFormat(Qt::RichText);
    box.exec();
}
