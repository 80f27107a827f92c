// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LazyIconEngine.h"

#include "EmblemLayout.h"
#include "IconMemory.h"
#include "PictureFile.h"
#include "ThemeState.h"

#include <QGuiApplication>
#include <QPainter>
#include <QPalette>

namespace {

// Stands in no name of a file and in no name of an icon.
constexpr QChar Separator(0x1f);

} // namespace

LazyIconEngine::LazyIconEngine(const QString &name, const QMap<Qt::Corner, QString> &emblems,
                               const QIcon &plain)
    : m_name(name)
    , m_emblems(emblems)
    , m_plain(plain)
{
}

LazyIconEngine::~LazyIconEngine() = default;

const QIcon &LazyIconEngine::base() const
{
    lookUp();
    m_base.makeIcon();
    if (m_base.icon.isNull())
        m_base = {m_plain, {}, {}};
    return m_base.icon;
}

void LazyIconEngine::lookUp() const
{
    const quint64 generation = ThemeState::generation();
    if (m_baseGeneration == generation)
        return;
    m_base = m_name.isEmpty() ? IconLookup::Found() : IconLookup::find(m_name);
    m_baseGeneration = generation;
}

QPixmap LazyIconEngine::basePixmap(const QSize &pixels, qreal ratio, IconDrawing::Fit fit, QIcon::Mode mode,
                                   QIcon::State state) const
{
    lookUp();
    const bool isPainted = fit == IconDrawing::Fit::Exactly && m_base.isOfFiles();
    const qreal asked = isPainted ? QtMajor::paintedRatio(ratio) : QtMajor::askedRatio(ratio);
    const IconDrawing::Request request = IconDrawing::request(pixels, asked);
    // Other modes are made by the style, which only QIcon asks.
    const bool isPlain = request.scale == 1 && mode == QIcon::Normal;
    if (const ThemeFiles::File *const file = isPlain ? m_base.drawing(pixels) : nullptr) {
        const auto bytes = PictureFile::readSafeDrawing(file->path);
        return bytes ? IconDrawing::drawing(*bytes, pixels, fit) : QPixmap();
    }
    if (!m_base.mayBeDrawn(request.sizeOfFile, request.scale))
        return QPixmap();
    return IconDrawing::pixmap(base(), pixels, asked, fit, mode, state);
}

const QString &LazyIconEngine::baseKey() const
{
    if (m_baseKey.isNull()) {
        m_baseKey = (m_name.isEmpty() ? QString() : IconLookup::identity(m_name)) + Separator
            + QString::number(m_plain.cacheKey(), 16);
    }
    return m_baseKey;
}

QString LazyIconEngine::sizedKey(const QSize &size, QIcon::Mode mode, QIcon::State state) const
{
    // Disabled and selected pixmaps are tinted by the palette.
    const qint64 numbers[] = {size.width(), size.height(), mode * 2 + state,
                              QGuiApplication::palette().cacheKey()};
    QString key = baseKey();
    for (const qint64 number : numbers) {
        key += Separator;
        key += QString::number(number, 36);
    }
    return key;
}

QPixmap LazyIconEngine::scaledPixmap(const QSize &pixels, qreal ratio, IconDrawing::Fit fit, QIcon::Mode mode,
                                     QIcon::State state) const
{
    if (pixels.isEmpty())
        return QPixmap();
    const IconMemory &memory = IconMemory::instance();
    QString key = sizedKey(pixels, mode, state) + Separator + QString::number(qRound64(ratio * 1000))
        + Separator + QString::number(int(fit));
    for (auto it = m_emblems.cbegin(); it != m_emblems.cend(); ++it)
        key += Separator + QString::number(it.key()) + it.value();

    QPixmap pixmap;
    if (memory.findPixmap(key, &pixmap))
        return pixmap;
    pixmap = basePixmap(pixels, ratio, fit, mode, state);
    if (pixmap.isNull())
        pixmap = IconDrawing::pixmap(m_plain, pixels, QtMajor::askedRatio(ratio), fit, mode, state);
    if (pixmap.isNull())
        return pixmap;
    if (!m_emblems.isEmpty())
        IconDrawing::overlayEmblems(pixmap, emblemPixmaps(pixmap.size(), ratio, mode), ratio);
    memory.keepPixmap(key, pixmap);
    return pixmap;
}

QMap<Qt::Corner, QPixmap> LazyIconEngine::emblemPixmaps(const QSize &size, qreal ratio,
                                                        QIcon::Mode mode) const
{
    QMap<Qt::Corner, QPixmap> pixmaps;
    for (auto it = m_emblems.cbegin(); it != m_emblems.cend(); ++it) {
        const QSize pixels = EmblemLayout::square(size, ratio, it.key()).size();
        const LazyIconEngine emblem(it.value(), {}, QIcon());
        pixmaps.insert(it.key(),
                       emblem.scaledPixmap(pixels, ratio, IconDrawing::Fit::AtMost, mode, QIcon::Off));
    }
    return pixmaps;
}

QPixmap LazyIconEngine::pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state)
{
    return scaledPixmap(size, 1, IconDrawing::Fit::AtMost, mode, state);
}

void LazyIconEngine::paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state)
{
    // QIcon has made the rectangle as large as actualSize() says.
    const qreal ratio = painter->device()->devicePixelRatioF();
    const QPixmap pixmap = scaledPixmap(rect.size() * ratio, ratio, IconDrawing::Fit::Exactly, mode, state);
    if (!pixmap.isNull())
        painter->drawPixmap(rect, pixmap);
}

QSize LazyIconEngine::actualSize(const QSize &size, QIcon::Mode mode, QIcon::State state)
{
    IconMemory &memory = IconMemory::instance();
    const QString key = sizedKey(size, mode, state);
    if (const QSize *known = memory.findSize(key))
        return *known;
    lookUp();
    // QIcon, which has asked for pixels, would take them for a logical size.
    const auto ofFiles = QtMajor::ratioOfSizes() > 1 ? m_base.actualSize(size) : std::nullopt;
    const QSize actual = ofFiles ? *ofFiles : base().actualSize(size, mode, state);
    memory.keepSize(key, actual);
    return actual;
}

bool LazyIconEngine::isEmpty() const
{
    if (!m_plain.isNull())
        return false;
    IconMemory &memory = IconMemory::instance();
    if (const bool *known = memory.findEmptiness(baseKey()))
        return *known;
    const bool empty = base().isNull();
    memory.keepEmptiness(baseKey(), empty);
    return empty;
}

QList<QSize> LazyIconEngine::availableSizes(QIcon::Mode mode, QIcon::State state) VEL_ICON_ENGINE_CONST
{
    return base().availableSizes(mode, state);
}

QString LazyIconEngine::iconName() VEL_ICON_ENGINE_CONST
{
    return base().name();
}

QString LazyIconEngine::key() const
{
    return QStringLiteral("LazyIconEngine");
}

QIconEngine *LazyIconEngine::clone() const
{
    return new LazyIconEngine(*this); // the icon that asks owns it
}

void LazyIconEngine::virtual_hook(int id, void *data)
{
    if (id == QIconEngine::IsNullHook) {
        *static_cast<bool *>(data) = isEmpty();
    } else if (id == QIconEngine::ScaledPixmapHook) {
        auto *argument = static_cast<QIconEngine::ScaledPixmapArgument *>(data);
        argument->pixmap = scaledPixmap(QtMajor::pixelsOf(*argument), argument->scale,
                                        IconDrawing::Fit::AtMost, argument->mode, argument->state);
    } else {
        QIconEngine::virtual_hook(id, data);
    }
}
