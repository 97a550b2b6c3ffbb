// SPDX-License-Identifier: MIT
#include "indicators/BorderIcon.h"

#include "indicators/NinePartGrid.h"

#include <QtCore/QList>
#include <QtCore/QSet>
#include <QtGui/QIconEngine>
#include <QtGui/QPainter>
#include <QtGui/QPixmap>

QMargins BorderIcon::defaultMargins(2, 2, 2, 2);

class BorderIcon::Engine : public QIconEngine
{
public:
    Engine(const QMargins& margins, Stretch stretch, double opacity);
    ~Engine() override;

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State state) override;
    QSize actualSize(const QSize& size, QIcon::Mode mode, QIcon::State state) override;
    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override;
    void addPixmap(const QPixmap& pixmap, QIcon::Mode mode, QIcon::State state) override;
    void addFile(const QString& fileName, const QSize& size, QIcon::Mode mode, QIcon::State state) override;
    QIconEngine* clone() const override;

    double opacity() const { return m_opacity; }
    void setOpacity(double opacity) { m_opacity = opacity; }

    // An icon may outlive the engine that it points to: it parted from it, and the last icon that shared it is gone.
    static bool isAlive(const Engine* engine) { return engine && living().contains(engine); }

private:
    struct Entry
    {
        QPixmap pixmap;
        QIcon::Mode mode;
        QIcon::State state;
    };

    // The last picture put together, to be drawn in one go while nothing changes.
    struct Composed
    {
        QPixmap pixmap;
        QPoint offset; // from the top left of the rectangle
        qint64 source = 0;
        QSize size;
        double opacity = -1.0;
        bool smooth = false;
    };

    Engine(const Engine& other);
    const Entry* find(QIcon::Mode mode, QIcon::State state) const;
    QPixmap choose(QIcon::Mode mode, QIcon::State state) const;
    vx::NinePartGrid grid(const QRect& rect, const QPixmap& pixmap) const;
    void paintParts(QPainter* painter, const QPixmap& pixmap, const vx::NinePartGrid& grid) const;
    bool paintComposed(QPainter* painter, const QRect& rect, const QPixmap& pixmap, const vx::NinePartGrid& grid);
    static QSet<const Engine*>& living();

    double m_opacity;
    Stretch m_stretch;
    QMargins m_margins;
    QList<Entry> m_pixmaps;
    Composed m_composed;
};

QSet<const BorderIcon::Engine*>& BorderIcon::Engine::living()
{
    static QSet<const Engine*> engines;
    return engines;
}

BorderIcon::Engine::Engine(const QMargins& margins, Stretch stretch, double opacity)
    : m_opacity(opacity)
    , m_stretch(stretch)
    , m_margins(margins)
{
    living().insert(this);
}

BorderIcon::Engine::Engine(const Engine& other)
    : QIconEngine(other)
    , m_opacity(other.m_opacity)
    , m_stretch(other.m_stretch)
    , m_margins(other.m_margins)
    , m_pixmaps(other.m_pixmaps)
{
    living().insert(this);
}

BorderIcon::Engine::~Engine()
{
    living().remove(this);
}

QSize BorderIcon::Engine::actualSize(const QSize& size, QIcon::Mode, QIcon::State)
{
    return size;
}

QPixmap BorderIcon::Engine::pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state)
{
    QPixmap picture(size);
    picture.fill(Qt::transparent);
    if (!picture.isNull()) {
        QPainter painter(&picture);
        paint(&painter, QRect(QPoint(0, 0), size), mode, state);
    }
    return picture;
}

void BorderIcon::Engine::addPixmap(const QPixmap& pixmap, QIcon::Mode mode, QIcon::State state)
{
    m_pixmaps.append({pixmap, mode, state});
}

void BorderIcon::Engine::addFile(const QString& fileName, const QSize&, QIcon::Mode mode, QIcon::State state)
{
    addPixmap(QPixmap(fileName), mode, state);
}

QIconEngine* BorderIcon::Engine::clone() const
{
    return new Engine(*this);
}

const BorderIcon::Engine::Entry* BorderIcon::Engine::find(QIcon::Mode mode, QIcon::State state) const
{
    for (const Entry& entry : m_pixmaps) {
        if (entry.mode == mode && entry.state == state) {
            return &entry;
        }
    }
    return nullptr;
}

QPixmap BorderIcon::Engine::choose(QIcon::Mode mode, QIcon::State state) const
{
    const Entry* entry = find(mode, state);
    if (!entry && mode != QIcon::Normal) {
        mode = QIcon::Normal;
        entry = find(mode, state);
    }
    if (!entry && state != QIcon::Off) {
        entry = find(mode, QIcon::Off);
    }
    return entry ? entry->pixmap : QPixmap();
}

vx::NinePartGrid BorderIcon::Engine::grid(const QRect& rect, const QPixmap& pixmap) const
{
    return m_stretch == StretchBorder || m_stretch == TileBorder
        ? vx::ninePartGridWithGrowingBorder(rect, pixmap.size(), m_margins)
        : vx::ninePartGrid(rect, pixmap.size(), m_margins);
}

void BorderIcon::Engine::paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State state)
{
    const QPixmap pixmap = choose(mode, state);
    if (pixmap.isNull()) {
        return;
    }
    const vx::NinePartGrid parts = grid(rect, pixmap);
    if (parts.count == 0) {
        return;
    }
    painter->save();
    if (!paintComposed(painter, rect, pixmap, parts)) {
        painter->setOpacity(m_opacity);
        paintParts(painter, pixmap, parts);
    }
    painter->restore();
}

void BorderIcon::Engine::paintParts(QPainter* painter, const QPixmap& pixmap, const vx::NinePartGrid& grid) const
{
    enum class Way : int
    {
        Copy,
        Scale,
        Tile
    };
    Way centre = Way::Copy;
    Way border = Way::Copy;
    switch (m_stretch) {
    case StretchCenter: centre = Way::Scale; break;
    case StretchBorder: border = Way::Scale; break;
    case TileCenter: centre = Way::Tile; break;
    case TileBorder: border = Way::Tile; break;
    }
    for (int i = 0; i < grid.count; ++i) {
        const vx::NinePart& part = grid.parts[static_cast<std::size_t>(i)];
        painter->setClipRect(part.target, Qt::ReplaceClip);
        switch (part.centre ? centre : border) {
        case Way::Copy: painter->drawPixmap(part.target.topLeft(), pixmap, part.source); break;
        case Way::Scale: painter->drawPixmap(part.target, pixmap, part.source); break;
        case Way::Tile:
            for (int y = part.target.top(); y < part.target.bottom(); y += part.source.height()) {
                for (int x = part.target.left(); x < part.target.right(); x += part.source.width()) {
                    painter->drawPixmap(QPoint(x, y), pixmap, part.source);
                }
            }
            break;
        }
    }
}

// Only where the result is the same to the pixel: plain source-over painting at whole pixels of the device.
bool BorderIcon::Engine::paintComposed(
    QPainter* painter, const QRect& rect, const QPixmap& pixmap, const vx::NinePartGrid& grid)
{
    const QTransform& transform = painter->deviceTransform();
    const bool wholePixels = transform.type() == QTransform::TxNone
        || (transform.type() == QTransform::TxTranslate && transform.dx() == qRound(transform.dx())
            && transform.dy() == qRound(transform.dy()));
    if (!wholePixels || painter->compositionMode() != QPainter::CompositionMode_SourceOver) {
        return false;
    }
    QRect area;
    for (int i = 0; i < grid.count; ++i) {
        area |= grid.parts[static_cast<std::size_t>(i)].target;
    }
    constexpr int largestKept = 2048; // pixels on a side: 16 MB
    if (area.width() > largestKept || area.height() > largestKept) {
        return false;
    }
    const bool smooth = painter->testRenderHint(QPainter::SmoothPixmapTransform);
    if (m_composed.source != pixmap.cacheKey() || m_composed.size != rect.size() || m_composed.smooth != smooth
        || m_composed.opacity < m_opacity || m_composed.opacity > m_opacity) {
        QPixmap picture(area.size());
        picture.fill(Qt::transparent);
        {
            QPainter composer(&picture);
            composer.setRenderHints(painter->renderHints());
            composer.translate(-area.topLeft());
            composer.setOpacity(m_opacity);
            paintParts(&composer, pixmap, grid);
        }
        m_composed = {picture, area.topLeft() - rect.topLeft(), pixmap.cacheKey(), rect.size(), m_opacity, smooth};
    }
    painter->setOpacity(1.0);
    painter->setClipRect(area, Qt::ReplaceClip);
    painter->drawPixmap(rect.topLeft() + m_composed.offset, m_composed.pixmap);
    return true;
}

BorderIcon::BorderIcon()
    : BorderIcon(new Engine(defaultMargins, StretchCenter, 1.0))
{
}

BorderIcon::BorderIcon(Engine* engine)
    : QIcon(engine)
    , m_engine(engine)
{
}

BorderIcon::BorderIcon(const QPixmap& pixmap, const QMargins& margins, Stretch stretch, double opacity)
    : BorderIcon(new Engine(margins, stretch, opacity))
{
    addPixmap(pixmap, QIcon::Normal, QIcon::Off);
}

BorderIcon::BorderIcon(const QString& path, const QMargins& margins, Stretch stretch, double opacity)
    : BorderIcon(new Engine(margins, stretch, opacity))
{
    addFile(path, QSize(), QIcon::Normal, QIcon::Off);
}

BorderIcon::BorderIcon(const BorderIcon& other) = default;
BorderIcon& BorderIcon::operator=(const BorderIcon& other) = default;
BorderIcon::~BorderIcon() = default;

double BorderIcon::getOpacity() const
{
    return Engine::isAlive(m_engine) ? m_engine->opacity() : 1.0;
}

void BorderIcon::setOpacity(double opacity)
{
    if (Engine::isAlive(m_engine)) {
        m_engine->setOpacity(opacity);
    }
}
