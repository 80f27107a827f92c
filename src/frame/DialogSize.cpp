// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogSize.h"

#include <QEvent>
#include <QScreen>
#include <QSettings>
#include <QStyle>
#include <QWidget>

namespace {

QString widthKey(const QString &group)
{
    return group + QLatin1String("/Width");
}

QString heightKey(const QString &group)
{
    return group + QLatin1String("/Height");
}

// The room for a window; its frame is not there before it was shown.
QSize roomFor(const QWidget &window)
{
    return window.screen()->availableSize()
        - QSize(0, window.style()->pixelMetric(QStyle::PM_TitleBarHeight, nullptr, &window));
}

/// Cuts a dialog to its screen, which is known when it is first shown.
class CutWhenShown : public QObject
{
public:
    explicit CutWhenShown(QWidget *dialog)
        : QObject(dialog)
    {
        dialog->installEventFilter(this);
    }

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::Show) {
            auto *dialog = static_cast<QWidget *>(watched);
            dialog->removeEventFilter(this);
            deleteLater();
            dialog->resize(dialog->size().boundedTo(roomFor(*dialog)));
        }
        return QObject::eventFilter(watched, event);
    }
};

QSize kept(const QString &group, QSize fallback)
{
    const QSettings settings;
    return {settings.value(widthKey(group), fallback.width()).toInt(),
            settings.value(heightKey(group), fallback.height()).toInt()};
}

void keep(QSettings &settings, const QString &key, int number)
{
    if (settings.value(key).toString() != QString::number(number))
        settings.setValue(key, number);
}

} // namespace

void DialogSize::restore(QWidget &dialog, const QString &group, QSize fallback)
{
    dialog.resize(kept(group, fallback));
    new CutWhenShown(&dialog);
}

void DialogSize::restoreShown(QWidget &dialog, const QString &group)
{
    dialog.resize(kept(group, dialog.size()).boundedTo(roomFor(dialog)));
}

void DialogSize::remember(const QWidget &dialog, const QString &group)
{
    QSettings settings;
    keep(settings, widthKey(group), dialog.width());
    keep(settings, heightKey(group), dialog.height());
}
