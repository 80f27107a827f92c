// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PropsFormTestCase.h"

#include "FormDriving.h"

#include <desktopentry/FormLayout.h>

#include <QAbstractButton>
#include <QComboBox>
#include <QIcon>

using VelUI::FormLayout;

const QString PropsFormTestCase::application = QStringLiteral("Application");
const QString PropsFormTestCase::link = QStringLiteral("Link");
const QString PropsFormTestCase::directory = QStringLiteral("Directory");

void PropsFormTestCase::initTestCase()
{
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
}

void PropsFormTestCase::init()
{
    TestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
}

void PropsFormTestCase::cleanup()
{
    qputenv("LANG", "C.UTF-8");
    TestCase::cleanup();
}

VelUIDesktopEntry PropsFormTestCase::entry(const QByteArray &bytes, const QString &name)
{
    VelUIDesktopEntry entry(write(name, bytes));
    if (!entry.load())
        qFatal("the sample does not load");
    return entry;
}

QByteArray PropsFormTestCase::saved(VelUIDesktopEntry &entry)
{
    const QString target = path(QStringLiteral("saved.desktop"));
    entry.setFilePath(target);
    if (!entry.save())
        qFatal("the sample cannot be saved");
    return read(target);
}

QComboBox *PropsFormTestCase::typeBox(const QWidget &form)
{
    return FormDriving::child<QComboBox>(&form, "typeComboBox");
}

void PropsFormTestCase::chooseType(const QWidget &form, const QString &type)
{
    typeBox(form)->setCurrentIndex(typeBox(form)->findData(type));
}

QStringList PropsFormTestCase::shownRows(const QWidget &form)
{
    auto *layout = form.findChild<FormLayout *>();
    QStringList rows;
    for (int row = 0; row < layout->rowCount(); ++row) {
        QLayoutItem *item = layout->itemAtPosition(row, 0);
        if (!item || item->widget()->isHidden())
            continue;
        if (auto *label = qobject_cast<QLabel *>(item->widget()))
            rows.append(label->text() + (label->font().bold() ? QStringLiteral("*") : QString()));
        else
            rows.append(qobject_cast<QAbstractButton *>(item->widget())->text());
    }
    return rows;
}
