// SPDX-License-Identifier: MIT
// A badge - a pill with a text, or a busy mark - that any widget can hold and paint.
#pragma once

#include "foundation/Export.h"
#include "indicators/BadgeGeometry.h"

#include <QColor>
#include <QObject>
#include <QPixmap>
#include <QPointer>
#include <QSize>
#include <QString>
#include <QTimer>
#include <QWidget>

#include <array>

class QPainter;

namespace vx
{

//! Keeps the picture of one badge and draws it wherever a widget wants it.
//!
//! A badge is a short text in a rounded pill, optionally outlined or struck through, or a turning busy mark.
//! Hold a BadgeDrawer by value in a widget, name the widget as its host, and call drawBadge() at the end of
//! the widget's paintEvent(). BadgeWidget does just that for those who want a widget of its own.
//!
//! The drawer is in one of three states: none (null pixmap), label, or busy. The host is not owned and may
//! die first. It is asked to repaint and to lay itself out again when the badge changes.
//!
//! The frames of the busy mark come from QPixmapCache, so that all drawers of one look share 12 of them.
//! While the host is hidden, the animation sleeps. GUI thread only.
//!
//! Sizes are device pixels of the pixmap, whose device pixel ratio is 1. A badge size that is empty, or that
//! no pixmap has room for, gives a null pixmap.
class ZELKOV_WIDGETS_EXPORT BadgeDrawer : public QObject
{
    Q_OBJECT

public:
    //! The look of the busy mark. Other numbers are accepted and give a fully transparent mark.
    enum EBusyBadgeType : int
    {
        ebbtArc = 0, //!< one thick open arc in the first busy colour
        ebbtRing = 1, //!< a closed ring with a turning conical gradient
        ebbtDots = 2, //!< eight discs coloured by a turning conical gradient
        ebbtSpokes = 3, //!< twelve strokes coloured by a turning conical gradient
    };
    Q_ENUM(EBusyBadgeType)

    //! \a widget is the host; it may be null, and then nothing is drawn by drawBadge() and the animation
    //! does not care about visibility.
    BadgeDrawer(QObject* parent, QWidget* widget);
    ~BadgeDrawer() override;

    //! Changes the host; only stores it. A busy drawer watches the new host's visibility from the next
    //! setBadgeBusy(true) on.
    void setBadgeWidget(QWidget* widget);

    //! Shows \a text in a pill that covers \a size: as high as asked, or wider or higher if the text's
    //! proportions want it. Stops the animation but leaves badgeBusy() as it is: a busy drawer goes on
    //! spinning when its host is shown the next time. An empty text gives a plain disc.
    void setBadgeLabel(const QString& text, const QSize& size, bool stroke, bool crossed);

    //! The same with badgeSize() and badgeStroke().
    void setBadgeLabel(const QString& text, bool crossed);

    //! Takes the badge away, busy mark included; badgeBusy() is left as it is.
    void unsetBadgeLabel();

    QString badgeLabel() const;

    //! Starts or ends the busy mark; the current value again does nothing. Starting clears the label and
    //! begins at the first angle. Ending takes the mark away, unless a label was set in the meantime: that
    //! label stays.
    void setBadgeBusy(bool on);
    bool badgeBusy() const;

    //! Draws the pixmap as it is, aligned in the host's rectangle; in the host's coordinates. Left is left,
    //! whatever the host's layout direction. Draws nothing without a host.
    void drawBadge(QPainter& painter, Qt::Alignment alignment);

    //! True while there is a pixmap, be it transparent.
    bool hasBadge() const;
    /// What drawBadge() draws; null without a badge.
    QPixmap currentPixmap() const;

    //! The pixmap's size, or badgeSize() while there is none.
    QSize sizeHint() const;

    //! A still frame of the busy mark at its first angle. Changes nothing.
    QPixmap busyPixmap();

    // The setters only store. The change shows with the next setBadgeLabel(), setBadgeBusy(true) or tick.
    // A busy colour of the same QColor::value() as the old one may go on showing the old frames.

    QSize badgeSize() const; //!< default 20 x 20
    void setBadgeSize(const QSize& size);
    bool badgeStroke() const; //!< outline the pill; default false
    void setBadgeStroke(bool stroke);
    QColor badgeColor() const; //!< text, outline and cross; default white
    void setBadgeColor(const QColor& color);
    QColor badgeBackground() const; //!< the pill; default (246, 67, 70, 220)
    void setBadgeBackground(const QColor& color);
    QColor busyColor1() const; //!< where the gradient starts; default white
    void setBusyColor1(const QColor& color);
    QColor busyColor2() const; //!< where the gradient ends; default (192, 192, 192)
    void setBusyColor2(const QColor& color);
    EBusyBadgeType busyBadgeType() const; //!< default ebbtSpokes
    void setBusyBadgeType(EBusyBadgeType type);

    //! A pill 100 pixels high and as wide as the text wants, at least 100. Without a text, outline and cross
    //! use the whole disc.
    static QPixmap renderBadgePixmapFromText(
        const QString& text, bool stroke, bool crossed, const QColor& foreground, const QColor& background);

    //! A busy mark of 100 x 100 pixels. \a startAngle and \a spanAngle in 1/16 degree, counter-clockwise;
    //! the span matters to ebbtArc only, which in turn ignores \a color2.
    static QPixmap renderBusyBadgePixmap(
        EBusyBadgeType type, int startAngle, int spanAngle, const QColor& color1, const QColor& color2);

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    //! The animation has moved on by a frame; currentPixmap() is the new one. Not emitted when a label or
    //! the busy state is set.
    void pixmapChanged();

private Q_SLOTS:
    void updateBusyBadge();

private:
    QString cacheKey(EBusyBadgeType type, const QSize& size, int startAngle, int spanAngle, const QColor& color1,
        const QColor& color2) const;
    void fetchFrame(const QString& key, int startAngle, int spanAngle, QPixmap& frame) const;
    void showFrame();
    void forgetKeys();
    void refreshHost();

    QPointer<QWidget> m_widget;
    EBusyBadgeType m_busyBadgeType;
    QString m_label;
    QPixmap m_pixmap;
    bool m_busy;
    QSize m_badgeSize;
    bool m_badgeStroke;
    QColor m_badgeColor;
    QColor m_busyColor1;
    QColor m_busyColor2;
    QColor m_badgeBackground;
    int m_busyAngle;
    int m_busySpan;
    int m_busyFrame;
    QTimer m_busyTimer;

    // The keys of the running animation's frames, made when they are first needed and forgotten by the setters.
    std::array<QString, BadgeGeometry::AngleCount> m_frameKeys;
};

} // namespace vx
