// SPDX-License-Identifier: MIT
// What the tests of badges share: a host that counts what it is asked for, a hand on the clock, a look at the
// cache.
#pragma once

#include "indicators/BadgeDrawer.h"
#include "indicators/BadgeGeometry.h"

#include <QtGui/QPainter>
#include <QtGui/QPixmapCache>
#include <QtTest/QtTest>
#include <QtWidgets/QVBoxLayout>

#include <memory>

namespace badgetest
{
inline QTimer* timerOf(const vx::BadgeDrawer& drawer)
{
    return drawer.findChild<QTimer*>();
}

inline bool isSpinning(const vx::BadgeDrawer& drawer)
{
    return timerOf(drawer)->isActive();
}

// Fires the animation's timer at once.
inline void tick(const vx::BadgeDrawer& drawer)
{
    QTimer* timer = timerOf(drawer);
    QVERIFY(timer->isActive());
    QTimerEvent event(timer->timerId());
    QCoreApplication::sendEvent(timer, &event);
}

inline QString keyAt(const vx::BadgeDrawer& drawer, int angle)
{
    return vx::BadgeGeometry::cacheKey(
        drawer.busyBadgeType(), drawer.badgeSize(), angle, -4320, drawer.busyColor1(), drawer.busyColor2());
}

inline bool isCached(const QString& key)
{
    QPixmap pixmap;
    return QPixmapCache::find(key, &pixmap);
}

// True if the drawer shows the very frame that the cache has for the angle.
inline bool showsAngle(const vx::BadgeDrawer& drawer, int angle)
{
    QPixmap pixmap;
    return QPixmapCache::find(keyAt(drawer, angle), &pixmap)
        && pixmap.cacheKey() == drawer.currentPixmap().cacheKey();
}

// A widget in a plain window, with counts of what it is asked for.
class Host : public QWidget
{
public:
    explicit Host(const QSize& size = QSize(80, 60))
        : QWidget(new QWidget)
        , m_size(size)
        , m_window(parentWidget())
    {
        // No fixed size: a widget that cannot change its size asks for no layout.
        auto* layout = new QVBoxLayout(m_window.get());
        layout->addWidget(this, 0, Qt::AlignCenter);
        resize(size);
        m_window->installEventFilter(this);
    }
    ~Host() override { setParent(nullptr); }

    void showWindow()
    {
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
        settle();
    }

    // Until all that was asked for has been done; then forgets it.
    void settle()
    {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
        paints = 0;
        layouts = 0;
    }

    bool wasAskedToUpdate()
    {
        QCoreApplication::processEvents();
        return paints > 0;
    }

    bool wasAskedForLayout()
    {
        QCoreApplication::sendPostedEvents();
        return layouts > 0;
    }

    bool eventFilter(QObject* watched, QEvent* event) override
    {
        layouts += watched == m_window.get() && event->type() == QEvent::LayoutRequest ? 1 : 0;
        return false;
    }

    QSize sizeHint() const override { return m_size; }

    int paints = 0;
    int layouts = 0;

protected:
    void paintEvent(QPaintEvent*) override { ++paints; }

private:
    QSize m_size;
    std::unique_ptr<QWidget> m_window;
};

inline QImage drawn(vx::BadgeDrawer& drawer, const QSize& size, Qt::Alignment alignment)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    drawer.drawBadge(painter, alignment);
    return image;
}

inline QRect inked(const QImage& image)
{
    QRect bounds;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) != 0) {
                bounds |= QRect(x, y, 1, 1);
            }
        }
    }
    return bounds;
}
}
