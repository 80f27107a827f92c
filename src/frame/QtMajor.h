// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QMetaType>
#include <QPixmap>
#include <QPointF>
#include <QStyleOptionViewItem>
#include <QVariant>

class QAbstractItemDelegate;
class QAbstractItemView;
class QDropEvent;
class QIcon;
class QModelIndex;
class QMouseEvent;
class QSettings;
class QWidget;
struct _XDisplay;

/**
 * What Qt 5 and Qt 6 call differently, in one place: the rest of the library is written once.
 */
namespace QtMajor {

#if QT_VERSION_MAJOR >= 6
/// The result of a QAbstractNativeEventFilter.
using NativeResult = qintptr;
/// How QMimeData is told which type is wanted.
using MimeType = QMetaType;
#else
using NativeResult = long;
using MimeType = QVariant::Type;
#endif

/// Whether a list of values is wanted.
inline bool isList(MimeType type)
{
    return type == MimeType(QMetaType::QVariantList);
}

/// The chord of \a keys at \a index as one number: a key with its modifiers.
int chord(const QKeySequence &keys, int index);

/// What the items of a \a view are drawn with.
QStyleOptionViewItem itemOption(const QAbstractItemView &view);

/// What draws the item at \a index of a \a view; the view's.
QAbstractItemDelegate *delegateOf(const QAbstractItemView &view, const QModelIndex &index);

/// The pixmap of an \a icon for a \a widget, as sharp as the screen that shows it.
QPixmap pixmapFor(const QWidget &widget, const QIcon &icon, const QSize &size);

/// Where the pointer is, with respect to the widget that gets the \a event.
QPointF positionOf(const QMouseEvent &event);
/// Where that which is dragged is, with respect to the same.
QPointF positionOf(const QDropEvent &event);

/// The connection to the X server; null where the application is shown in another way.
_XDisplay *x11Display();

/// Whether the listing of a folder ends at a name that is no text, where Qt 5 leaves that one out.
constexpr bool listingStopsAtOddNames()
{
    return QT_VERSION_MAJOR >= 6;
}

/// Whether the encoding of the locale is UTF-8, as it always is for Qt 6.
bool isLocaleUtf8();
/// Has \a settings read and write texts in the encoding of the locale.
void setLocaleEncoding(QSettings &settings);

} // namespace QtMajor
