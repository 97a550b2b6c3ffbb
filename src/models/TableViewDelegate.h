// SPDX-License-Identifier: MIT
// Paints a cell as a picture with a caption bar: the thumbnail wall of a camera browser.
#pragma once

#include <memory>

#include <QtCore/QRect>
#include <QtCore/QSize>
#include <QtGui/QImage>
#include <QtWidgets/QStyledItemDelegate>

#include "foundation/Export.h"

namespace vx
{
/// Paints a cell as a thumbnail: the picture of Qt::DecorationRole (a QImage), placed by Qt::TextAlignmentRole, and
/// over its lower edge a bar with the text of Qt::DisplayRole. Sizes are in logical pixels.
///
/// The alignment of a cell with a picture has to be given: with no positional flag and without Qt::AlignAbsolute the
/// picture stands at (0, 0) of the view, see adjustAlignment(). A cell without a picture takes the whole cell for its
/// bar, one without text has no bar. A caption that does not fit gets a smaller font, down to 7 pixels, and is then
/// cut at the left, where the names of devices resemble each other least; it is always white.
///
/// Scaled pictures and drawn captions are kept, so that a model should return the same QImage (with the same
/// QImage::cacheKey()) until the picture changes. The memory is limited, see setPictureCacheLimit(). Editing and size
/// hints are those of the base class.
class ZELKOV_WIDGETS_EXPORT TableViewDelegate : public QStyledItemDelegate
{
    Q_OBJECT

public:
    explicit TableViewDelegate(QObject* parent = nullptr);
    ~TableViewDelegate() override;

    /// Lets bar and font grow with the height of the cell; off by default, with a bar of 20 and a font of 12 pixels.
    void setScaleFont(bool scale);

    /// Where a picture of @p imageSize goes in @p rect. @p alignment is a set of Qt::AlignmentFlag bits; AlignAbsolute
    /// keeps the aspect ratio, AlignJustify with it covers @p rect. With no positional flag and without AlignAbsolute
    /// the result stands at (0, 0).
    static QRect adjustAlignment(const QSize& imageSize, const QRect& rect, int alignment);

    /// The rectangle with the aspect ratio of @p size that fits into @p rect, or covers it with @p expand.
    static QRect fitIntoRectWithAspectRatio(const QRect& rect, const QSize& size, bool expand);

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;

    /// Font size in pixels at which a caption in a bar of @p height is tried first.
    virtual int getFontSize(int height) const;
    /// Height of the bar in a cell of @p height.
    virtual int getTitleHeight(int height) const;
    /// The bar in the rectangle of a picture.
    virtual QRect getTitleRect(const QRect& rect) const;

    /// How much memory the kept pictures may take, in KiB; 40,960 by default, enough for a wall of 3840 x 2160
    /// pixels. 0 keeps none.
    void setPictureCacheLimit(int kibibytes);

protected:
    /// Reads the picture of @p index, a null image if there is none, and its Qt::SizeHintRole if @p size is not null.
    virtual void pixmapFromIndex(const QModelIndex& index, QImage& image, QSize* size) const;

    /// For subclasses that paint themselves. Does nothing here, and paint() does not call it.
    virtual void fitPixmapIntoFrame(
        QImage& image, QRect& rect, const QSize& size, QPainter* painter, const QModelIndex& index) const;

    /// Fills @p background with @p color and writes the text of @p role into @p text, both in the coordinates of the
    /// painter; an empty text draws nothing. @p text is left 4 pixels smaller at both sides. paint() passes the same
    /// rectangle for both. Leaves pen, brush and font of the painter changed.
    virtual void paintCaption(QRect& background, QRect& text, const QModelIndex& index, QPainter* painter,
        const QStyleOptionViewItem& option, const QColor& color, Qt::ItemDataRole role) const;

private:
    struct Cache;

    void drawPicture(QPainter* painter, const QRect& rect, const QImage& image) const;

    bool m_scaleFont = false;
    const std::unique_ptr<Cache> m_cache;
};
}
