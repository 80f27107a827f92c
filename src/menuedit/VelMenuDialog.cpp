// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuDialog.h"

#include "MenuDialogAssistance.h"
#include "MenuUpdateCommand.h"
#include "StartMenu.h"
#include "VelMenuView.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/DialogSize.h>
#include <frame/EntryPath.h>
#include <frame/MessageBox.h>
#include <frame/OwnIcon.h>

#include <velintegration/help.h>

#include <QAbstractProxyModel>
#include <QAction>
#include <QDialogButtonBox>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QFileSystemModel>
#include <QIcon>
#include <QPushButton>
#include <QToolBar>
#include <QVBoxLayout>

#include <memory>
#include <string>

namespace {

QString sizeGroup()
{
    return QStringLiteral("VelMenuDialog");
}

} // namespace

class VelMenuDialogPrivate
{
public:
    explicit VelMenuDialogPrivate(VelMenuDialog *dialog)
        : q(dialog)
    {
    }

    VelMenuView *view = nullptr;
    QDialogButtonBox *buttonBox = nullptr;
    bool anyItemSelectable = false;
    int menuKind = MenuUpdateCommand::NoKind;
    QToolBar *toolBar = nullptr;
    // Null without assistance.
    std::unique_ptr<MenuDialogAssistance> helper;

    VelMenuDialog *q;

    void buildToolBar();
    void addAction(const char *name);
    void connectButtons();
    void pick(const QModelIndex &shown) const;
    QString title() const;
    QString plainTitle() const;
    QPushButton *button(QDialogButtonBox::StandardButton which) const { return buttonBox->button(which); }
    QString pathOf(const QModelIndex &shown) const;
};

void VelMenuDialogPrivate::addAction(const char *name)
{
    const QLatin1String wanted(name);
    const QList<QAction *> actions = view->actions();
    for (QAction *action : actions) {
        if (action->objectName() == wanted)
            toolBar->addAction(action);
    }
}

void VelMenuDialogPrivate::buildToolBar()
{
    toolBar = new QToolBar(VelMenuDialog::tr("Edit"), q);
    toolBar->setObjectName(QStringLiteral("toolBar"));
    // Outside a main window it would stand back from the tree by a margin of its own.
    toolBar->layout()->setContentsMargins(0, 0, 0, 0);
    for (const char *name : {"fileNewAction", "dirNewAction", "editAction", "deleteAction"})
        addAction(name);
    toolBar->addSeparator();
    for (const char *name : {"cutAction", "copyAction", "pasteAction"})
        addAction(name);
    toolBar->addSeparator();
    for (const char *name : {"upAction", "downAction"})
        addAction(name);
    if (view->menuDir() == StartMenu::directory()) {
        toolBar->addSeparator();
        addAction("recreateAction");
    }
}

void VelMenuDialogPrivate::connectButtons()
{
    if (QPushButton *ok = button(QDialogButtonBox::Ok)) {
        ok->setEnabled(false);
        QObject::connect(ok, &QPushButton::clicked, q, &VelMenuDialog::accept);
    }
    if (QPushButton *cancel = button(QDialogButtonBox::Cancel))
        QObject::connect(cancel, &QPushButton::clicked, q, &VelMenuDialog::reject);
    if (QPushButton *close = button(QDialogButtonBox::Close))
        QObject::connect(close, &QPushButton::clicked, q, &VelMenuDialog::accept);
    if (QPushButton *apply = button(QDialogButtonBox::Apply)) {
        apply->setEnabled(false);
        apply->setToolTip(VelMenuDialog::tr("Send command to vel-wm to update\n edited menu, toolbar, etc."));
        QObject::connect(apply, &QPushButton::clicked, q, &VelMenuDialog::applySlot);
        QObject::connect(view, &VelMenuView::changed, q, &VelMenuDialog::changed);
    }
}

// A folder is opened by a double click, whatever it is called.
void VelMenuDialogPrivate::pick(const QModelIndex &shown) const
{
    QPushButton *ok = button(QDialogButtonBox::Ok);
    if (ok && ok->isEnabled() && !QFileInfo(pathOf(shown)).isDir())
        ok->click();
}

QString VelMenuDialogPrivate::title() const
{
    QString text;
    const QString dir = view->menuDir();
    const QString recordFile = EntryPath::recordFileOf(dir);
    if (QFile::exists(recordFile))
        text += QLatin1String(" \"") + VelUIDesktopEntry(recordFile).getLocalName() + QLatin1Char('"');
    return text + QLatin1Char(' ') + dir;
}

// With assistance: what the menu is called, not where it lies.
QString VelMenuDialogPrivate::plainTitle() const
{
    const QString dir = view->menuDir();
    if (dir == StartMenu::directory())
        return VelMenuDialog::tr("Start menu");
    const VelUIDesktopEntry record(EntryPath::recordFileOf(dir));
    const QString name = record.getLocalName().isEmpty() ? record.getName() : record.getLocalName();
    const QString folder = QDir(QDir(dir).absolutePath()).dirName();
    return !name.isEmpty() ? name : !folder.isEmpty() ? folder : dir;
}

QString VelMenuDialogPrivate::pathOf(const QModelIndex &shown) const
{
    const auto *proxy = qobject_cast<const QAbstractProxyModel *>(shown.model());
    const auto *files = proxy ? qobject_cast<const QFileSystemModel *>(proxy->sourceModel()) : nullptr;
    return files ? files->filePath(proxy->mapToSource(shown)) : QString();
}

VelMenuDialog::VelMenuDialog(const QString &dir, int iconSize, bool editable, bool closeOnly, QWidget *parent,
                             Qt::WindowFlags f)
    : QDialog(parent, f)
    , d(new VelMenuDialogPrivate(this))
{
    const QString shownDir = dir.isEmpty() ? StartMenu::directory() : dir;
    d->menuKind = MenuUpdateCommand::kindOf(shownDir);

    auto *layout = new QVBoxLayout(this);
    d->view = new VelMenuView(shownDir, iconSize, editable, this);
    d->view->setObjectName(QStringLiteral("view"));
    if (editable) {
        d->buildToolBar();
        layout->addWidget(d->toolBar);
    }
    layout->addWidget(d->view);
    d->buttonBox = new QDialogButtonBox(closeOnly ? QDialogButtonBox::Close
                                                  : QDialogButtonBox::Ok | QDialogButtonBox::Cancel,
                                        Qt::Horizontal, this);
    d->buttonBox->setObjectName(QStringLiteral("buttonBox"));
    layout->addWidget(d->buttonBox);
    connect(d->view->selectionModel(), &QItemSelectionModel::selectionChanged, this,
            &VelMenuDialog::selChanged);
    if (!editable)
        connect(d->view, &QAbstractItemView::doubleClicked, this,
                [this](const QModelIndex &shown) { d->pick(shown); });
    d->connectButtons();
    setWindowTitle(d->title());
    setWindowIcon(OwnIcon::named(QStringLiteral("velmenuedit")));
    DialogSize::restore(*this, sizeGroup(), QSize(400, 480));
}

VelMenuDialog::VelMenuDialog(QWidget *parent)
    : VelMenuDialog(QString(), -1, false, false, parent, Qt::WindowFlags())
{
}

VelMenuDialog::~VelMenuDialog()
{
    DialogSize::remember(*this, sizeGroup());
    if (d->helper)
        d->helper->remember();
    updateWM();
}

bool VelMenuDialog::assistance() const
{
    return d->view->assistance();
}

void VelMenuDialog::setAssistance(bool assistance)
{
    if (assistance == this->assistance())
        return;
    d->view->setAssistance(assistance);
    d->helper.reset();
    // A host may have given it a title of its own.
    if (windowTitle() == (assistance ? d->title() : d->plainTitle()))
        setWindowTitle(assistance ? d->plainTitle() : d->title());
    if (assistance) {
        auto *layout = qobject_cast<QVBoxLayout *>(this->layout());
        d->helper = std::make_unique<MenuDialogAssistance>(this, layout, d->view, d->toolBar);
    }
}

QString VelMenuDialog::menuDir() const
{
    return d->view->menuDir();
}

QString VelMenuDialog::selectedItemPath() const
{
    if (!d->view || !d->view->selectionModel() || !d->view->model())
        return {};
    return d->view->selectedPath();
}

QString VelMenuDialog::selectedItemExec(const QString &filePath, const QString &url,
                                        const QStringList *filePathList, const QStringList *urlList) const
{
    const QString path = selectedItemPath();
    if (path.isEmpty())
        return {};
    const VelUIDesktopEntry entry(path);
    const QString exec = entry.getExec();
    if (exec.startsWith(QLatin1String("VELWM_")))
        return QLatin1String("vel-wmfunc ") + exec + QLatin1Char('\n');
    const QString localName = entry.getLocalName();
    return VelUIDesktopEntry::ExecFormatString(exec)
        .filePath(filePath)
        .url(url)
        .appName(localName.isEmpty() ? entry.getName() : localName)
        .icon(entry.getIcon())
        .desktopFilePath(path)
        .filePathList(filePathList ? *filePathList : QStringList())
        .urlList(urlList ? *urlList : QStringList());
}

bool VelMenuDialog::updateWM()
{
    const QByteArray command = MenuUpdateCommand::forKind(d->menuKind);
    if (command.isEmpty())
        return false;
    const bool isHeard = MenuUpdateCommand::isHeard();
    if (MenuUpdateCommand::send(command))
        return true;
    // Where nobody shows the menu, nobody has to read it anew.
    if (assistance() && !isHeard)
        return false;
    MessageBox::show(this, QMessageBox::Warning, tr("Warning"), tr("Can't send command to vel-wm"));
    return false;
}

// NOLINTNEXTLINE(performance-unnecessary-value-param)
void VelMenuDialog::selChanged(QItemSelection selected, QItemSelection)
{
    QPushButton *ok = d->button(QDialogButtonBox::Ok);
    if (!ok)
        return;
    QModelIndexList indexes = selected.indexes();
    // One item can be picked. Of several, the change alone does not tell which are selected now.
    if (assistance()) {
        indexes = d->view->selectionModel()->selectedIndexes();
        if (indexes.size() > 1)
            indexes.clear();
    }
    ok->setEnabled(!indexes.isEmpty()
                   && (d->anyItemSelectable || EntryPath::isEntry(d->pathOf(indexes.constFirst()))));
}

void VelMenuDialog::changed()
{
    if (QPushButton *apply = d->button(QDialogButtonBox::Apply))
        apply->setEnabled(true);
}

void VelMenuDialog::applySlot()
{
    updateWM();
    if (QPushButton *apply = d->button(QDialogButtonBox::Apply))
        apply->setEnabled(false);
}

void VelMenuDialog::helpSlot()
{
    velHelpShow(std::string());
}
