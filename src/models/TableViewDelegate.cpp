// SPDX-License-Identifier: MIT
// Paints thumbnails and keeps what is dear to make: scaled pictures and fitted captions.
#include "models/TableViewDelegate.h"

#include <climits>
#include <cmath>

#include <QtCore/QCache>
#include <QtGui/QFontDatabase>
#include <QtGui/QFontMetrics>
#include <QtGui/QPaintEngine>
#include <QtGui/QPainter>
#include <QtGui/QPixmap>

#include "models/ThumbnailGeometry.h"

namespace vx
{
// Named, since members of such types are refused where several sources are compiled as one.
namespace delegatecache
{
struct PictureKey
{
    qint64 image;
    QSize size; // device pixels
    bool smooth;

    bool operator==(const PictureKey& other) const
    {
        return image == other.image && size == other.size && smooth == other.smooth;
    }
};

uint qHash(const PictureKey& key, uint seed)
{
    return ::qHash(key.image, seed) ^ uint(key.size.width() * 31 + key.size.height()) ^ (key.smooth ? 0x10000u : 0u);
}

struct CaptionKey
{
    QString text;
    QSize extent; // logical pixels
    QRect bar;    // logical pixels, seen from the upper left of the text
    QRgb color;   // of the bar; transparent for a text without one
    int size;
    Qt::LayoutDirection direction;

    bool operator==(const CaptionKey& other) const
    {
        return extent == other.extent && bar == other.bar && color == other.color && size == other.size
            && direction == other.direction && text == other.text;
    }
};

uint qHash(const CaptionKey& key, uint seed)
{
    return ::qHash(key.text, seed) ^ uint(key.extent.width() * 31 + key.extent.height() * 7 + key.size) ^ key.color;
}

/// A text at the size and in the words in which it fits.
struct Caption
{
    QFont font;
    QString text;
    QPixmap picture; // bar and text in one
};
}

namespace
{
using delegatecache::Caption;
using delegatecache::CaptionKey;
using delegatecache::PictureKey;

const QColor c_selectedBar(236, 208, 30, 185);
const QColor c_plainBar(109, 110, 113, 185);
constexpr int c_pictureCacheKibibytes = 40960;
constexpr int c_captionCacheKibibytes = 8192;
constexpr int c_captionAlignment = Qt::AlignLeft | Qt::AlignVCenter;

QFont captionFont(int pixelSize)
{
    static QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    font.setPixelSize(qMax(pixelSize, 1));
    return font;
}

Caption* makeCaption(const CaptionKey& key)
{
    auto* caption = new Caption;
    const int size = thumbnail::fittingSize(key.size, key.extent.width(),
        [&key](int pixels) { return QFontMetrics(captionFont(pixels)).horizontalAdvance(key.text); });
    caption->font = captionFont(size);
    const QFontMetrics metrics(caption->font);
    caption->text = metrics.elidedText(key.text, Qt::ElideLeft, key.extent.width());
    return caption;
}

bool isWhole(qreal value)
{
    return std::abs(value - std::round(value)) < 1e-6;
}

/// The size of @p rect in device pixels, if a kept picture of it can be blitted: it has to lie on whole device pixels
/// of a raster, unrotated. Empty otherwise.
QSize blitSize(const QPainter* painter, const QRect& rect)
{
    const QPaintEngine* const engine = painter->paintEngine();
    const QTransform transform = painter->deviceTransform();
    if (rect.isEmpty() || engine == nullptr || engine->type() != QPaintEngine::Raster
        || painter->worldTransform().type() > QTransform::TxTranslate || transform.type() > QTransform::TxScale) {
        return QSize();
    }
    const QRectF target = transform.mapRect(QRectF(rect));
    const bool whole
        = isWhole(target.x()) && isWhole(target.y()) && isWhole(target.width()) && isWhole(target.height());
    return whole ? target.size().toSize() : QSize();
}

int kibibytes(const QSize& size)
{
    return int(qMin<qint64>(qint64(size.width()) * size.height() * 4 / 1024 + 1, INT_MAX));
}

/// Laying out glyphs takes longer than all the rest of a cell, so that the drawn text is kept, too, and its bar with
/// it: one picture to blend instead of two.
void bakeCaption(Caption& caption, const CaptionKey& key, const QSize& size, qreal ratio)
{
    caption.picture = QPixmap(size);
    caption.picture.setDevicePixelRatio(ratio);
    caption.picture.fill(QColor::fromRgba(key.color));
    QPainter painter(&caption.picture);
    painter.setLayoutDirection(key.direction);
    painter.setFont(caption.font);
    painter.setPen(Qt::white);
    painter.drawText(QRect(-key.bar.topLeft(), key.extent), c_captionAlignment, caption.text);
}
}

struct TableViewDelegate::Cache
{
    QCache<PictureKey, QPixmap> pictures {c_pictureCacheKibibytes};
    QCache<CaptionKey, Caption> captions {c_captionCacheKibibytes};
};

TableViewDelegate::TableViewDelegate(QObject* parent)
    : QStyledItemDelegate(parent)
    , m_cache(new Cache)
{
}

TableViewDelegate::~TableViewDelegate() = default;

void TableViewDelegate::setScaleFont(bool scale)
{
    m_scaleFont = scale;
}

void TableViewDelegate::setPictureCacheLimit(int kibibytes)
{
    m_cache->pictures.setMaxCost(qMax(kibibytes, 0));
}

QRect TableViewDelegate::adjustAlignment(const QSize& imageSize, const QRect& rect, int alignment)
{
    return thumbnail::align(imageSize, rect, alignment);
}

QRect TableViewDelegate::fitIntoRectWithAspectRatio(const QRect& rect, const QSize& size, bool expand)
{
    return thumbnail::fitWithAspectRatio(rect, size, expand);
}

void TableViewDelegate::paint(
    QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    painter->save();
    QRect rect = option.rect;
    QImage image;
    pixmapFromIndex(index, image, nullptr);
    if (!image.isNull()) {
        const int alignment = index.data(Qt::TextAlignmentRole).toInt();
        rect = adjustAlignment(image.size(), rect, alignment);
        drawPicture(painter, rect.adjusted(10, 10, -1, -1), image);
    }
    QRect title = getTitleRect(rect);
    const bool selected = option.state.testFlag(QStyle::State_Selected);
    paintCaption(title, title, index, painter, option, selected ? c_selectedBar : c_plainBar, Qt::DisplayRole);
    painter->restore();
}

int TableViewDelegate::getFontSize(int height) const
{
    return thumbnail::fontSize(height, m_scaleFont);
}

int TableViewDelegate::getTitleHeight(int height) const
{
    return thumbnail::titleHeight(height, m_scaleFont);
}

QRect TableViewDelegate::getTitleRect(const QRect& rect) const
{
    return thumbnail::titleRect(rect, m_scaleFont);
}

void TableViewDelegate::pixmapFromIndex(const QModelIndex& index, QImage& image, QSize* size) const
{
    image = index.data(Qt::DecorationRole).value<QImage>();
    if (size != nullptr) {
        *size = index.data(Qt::SizeHintRole).toSize();
    }
}

void TableViewDelegate::fitPixmapIntoFrame(QImage&, QRect&, const QSize&, QPainter*, const QModelIndex&) const { }

void TableViewDelegate::paintCaption(QRect& background, QRect& text, const QModelIndex& index, QPainter* painter,
    const QStyleOptionViewItem& option, const QColor& color, Qt::ItemDataRole role) const
{
    const QString words = index.data(role).toString();
    if (words.isEmpty()) {
        return;
    }
    const int size = getFontSize(text.height());
    const bool selected = option.state.testFlag(QStyle::State_Selected);
    painter->setPen(Qt::white);
    painter->setBrush(
        option.palette.brush(QPalette::Active, selected ? QPalette::HighlightedText : QPalette::ButtonText));
    const QRect filled = background; // may be the same object as text
    text.adjust(4, 0, -4, 0);

    // A bar and a text blended one after the other are the same as both in one only where nothing else comes in.
    const bool plain = painter->compositionMode() == QPainter::CompositionMode_SourceOver;
    const bool together = plain && painter->opacity() >= 1 && filled.contains(text);
    const QRect bar = together ? filled : text;
    const CaptionKey key {words, text.size(), bar.translated(-text.topLeft()),
        together ? color.rgba() : qRgba(0, 0, 0, 0), size, painter->layoutDirection()};
    Caption* caption = m_cache->captions.object(key);
    const QSize pixels = blitSize(painter, bar);
    const int cost = kibibytes(pixels);
    const bool kept = plain && !pixels.isEmpty() && cost <= c_captionCacheKibibytes / 8;
    if (!kept || !together) {
        painter->fillRect(filled, color);
    }
    if (caption == nullptr) {
        caption = makeCaption(key);
        m_cache->captions.insert(key, caption, qBound(1, cost, c_captionCacheKibibytes / 8));
    }
    painter->setFont(caption->font);
    if (!kept) {
        painter->drawText(text, c_captionAlignment, caption->text);
        return;
    }
    const qreal ratio = painter->device()->devicePixelRatioF();
    if (caption->picture.size() != pixels || caption->picture.devicePixelRatioF() != ratio) {
        bakeCaption(*caption, key, pixels, ratio);
    }
    painter->drawPixmap(bar.topLeft(), caption->picture);
}

void TableViewDelegate::drawPicture(QPainter* painter, const QRect& rect, const QImage& image) const
{
    const qreal ratio = painter->device()->devicePixelRatioF();
    const QSize size = blitSize(painter, rect);
    const int cost = kibibytes(size);
    if (size.isEmpty() || cost > m_cache->pictures.maxCost() / 8) {
        painter->drawImage(rect, image);
        return;
    }
    const bool smooth = painter->testRenderHint(QPainter::SmoothPixmapTransform);
    const PictureKey key {image.cacheKey(), size, smooth};
    const QPixmap* kept = m_cache->pictures.object(key);
    if (kept == nullptr || kept->devicePixelRatioF() != ratio) {
        auto* picture = new QPixmap(size);
        if (image.hasAlphaChannel()) {
            picture->fill(Qt::transparent);
        }
        QPainter scaler(picture);
        scaler.setRenderHint(QPainter::SmoothPixmapTransform, smooth);
        scaler.drawImage(QRect(QPoint(0, 0), size), image);
        scaler.end();
        picture->setDevicePixelRatio(ratio);
        m_cache->pictures.insert(key, picture, cost);
        kept = picture;
    }
    painter->drawPixmap(rect.topLeft(), *kept);
}
}
