// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "QtMajor.h"

#include <QAbstractItemView>
#include <QDropEvent>
#include <QGuiApplication>
#include <QIcon>
#include <QMouseEvent>
#include <QSettings>
#include <QWidget>
#include <QWindow>

#if QT_VERSION_MAJOR < 6
#include <QTextCodec>
#include <QX11Info>
#endif

namespace QtMajor {

namespace {

// Gives the way to what is protected in every view.
class OpenView : public QAbstractItemView
{
public:
    static QStyleOptionViewItem option(const QAbstractItemView &view)
    {
#if QT_VERSION_MAJOR >= 6
        QStyleOptionViewItem option;
        (view.*(&OpenView::initViewItemOption))(&option);
        return option;
#else
        return (view.*(&OpenView::viewOptions))();
#endif
    }
};

} // namespace

QStyleOptionViewItem itemOption(const QAbstractItemView &view)
{
    return OpenView::option(view);
}

#if QT_VERSION_MAJOR >= 6

int chord(const QKeySequence &keys, int index)
{
    return keys[uint(index)].toCombined();
}

QAbstractItemDelegate *delegateOf(const QAbstractItemView &view, const QModelIndex &index)
{
    return view.itemDelegateForIndex(index);
}

QPixmap pixmapFor(const QWidget &widget, const QIcon &icon, const QSize &size)
{
    return icon.pixmap(size, widget.devicePixelRatioF());
}

QPointF positionOf(const QMouseEvent &event)
{
    return event.position();
}

QPointF positionOf(const QDropEvent &event)
{
    return event.position();
}

_XDisplay *x11Display()
{
    const auto *x11 = qGuiApp ? qGuiApp->nativeInterface<QNativeInterface::QX11Application>() : nullptr;
    return x11 ? x11->display() : nullptr;
}

bool isLocaleUtf8()
{
    return true;
}

void setLocaleEncoding(QSettings &) { }

#else

int chord(const QKeySequence &keys, int index)
{
    return keys[uint(index)];
}

QAbstractItemDelegate *delegateOf(const QAbstractItemView &view, const QModelIndex &index)
{
    return view.itemDelegate(index);
}

QPixmap pixmapFor(const QWidget &widget, const QIcon &icon, const QSize &size)
{
    return icon.pixmap(widget.window()->windowHandle(), size);
}

QPointF positionOf(const QMouseEvent &event)
{
    return event.localPos();
}

QPointF positionOf(const QDropEvent &event)
{
    return event.posF();
}

// Other platforms have a display, too: that of Wayland is no connection of Xlib's.
_XDisplay *x11Display()
{
    return QX11Info::isPlatformX11() ? QX11Info::display() : nullptr;
}

bool isLocaleUtf8()
{
    constexpr int Utf8 = 106; // IANA's number
    return QTextCodec::codecForLocale()->mibEnum() == Utf8;
}

void setLocaleEncoding(QSettings &settings)
{
    settings.setIniCodec(QTextCodec::codecForLocale());
}

#endif

} // namespace QtMajor
