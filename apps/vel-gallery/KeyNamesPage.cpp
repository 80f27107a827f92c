// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GalleryPage.h"

#include <VelKeyServer.h>
#include <support/QtMajor.h>

#include <QCoreApplication>
#include <QFormLayout>
#include <QKeySequenceEdit>
#include <QLabel>

namespace {

struct PageTexts
{
    Q_DECLARE_TR_FUNCTIONS(KeyNamesPage)
};

QLabel *addRow(QFormLayout *layout, const QString &title)
{
    auto *label = new QLabel(layout->parentWidget());
    label->setTextFormat(Qt::PlainText);
    label->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    layout->addRow(title, label);
    return label;
}

QWidget *createPage(const GalleryContext &, QWidget *parent)
{
    auto *page = new QWidget(parent);
    auto *layout = new QFormLayout(page);
    auto *keys = new QKeySequenceEdit(page);
    layout->addRow(PageTexts::tr("&Press keys:"), keys);
    QLabel *x11 = addRow(layout, PageTexts::tr("In the window manager's notation:"));
    QLabel *qt = addRow(layout, PageTexts::tr("Read back:"));
    QLabel *global = addRow(layout, PageTexts::tr("Global action with these keys:"));

    QObject::connect(keys, &QKeySequenceEdit::keySequenceChanged, page, [=](const QKeySequence &sequence) {
        const QString name =
            sequence.isEmpty() ? QString() : VelKeyServer::KeyQtToKeyStringX(QtMajor::chord(sequence, 0));
        x11->setText(name);
        qt->setText(VelKeyServer::KeyStringXToQt(name));
        global->setText(sequence.isEmpty() ? QString() : VelKeyServer::checkForGlobalShortcut(sequence));
    });
    keys->setKeySequence(QKeySequence(Qt::CTRL | Qt::ALT | Qt::Key_F2));
    return page;
}

} // namespace

GalleryPage keyNamesPage()
{
    GalleryPage page;
    page.name = QStringLiteral("key-names");
    page.title = PageTexts::tr("Key names");
    page.category = PageTexts::tr("Shortcuts");
    page.snippet = QStringLiteral(R"(const int code = sequence[0];
// "Ctrl+Alt+F2"
const QString name = VelKeyServer::KeyQtToKeyStringX(code);
const QString back = VelKeyServer::KeyStringXToQt(name);

// Empty when no global action has these keys.
const QString action =
    VelKeyServer::checkForGlobalShortcut(sequence);)");
    page.create = createPage;
    return page;
}
