// SPDX-License-Identifier: MIT
// A transparent widget that shows nothing but a badge.
#pragma once

#include "foundation/Export.h"
#include "indicators/BadgeDrawer.h"

#include <QWidget>

namespace vx
{

//! A badge as a widget of its own: a spinner in a layout, a count beside a title.
//!
//! The widget holds a BadgeDrawer, is its host, and adds an alignment. It paints no background of its own; a
//! style sheet may give it one, and may set the look through qproperty-busyBadgeType and its siblings. All
//! properties but the alignment are the drawer's: writing one shows with the next label, start or tick.
class ZELKOV_WIDGETS_EXPORT BadgeWidget : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(Qt::Alignment alignment READ alignment WRITE setAlignment)
    Q_PROPERTY(int busyBadgeType READ busyBadgeType WRITE setBusyBadgeType)
    Q_PROPERTY(QSize badgeSize READ badgeSize WRITE setBadgeSize)
    Q_PROPERTY(bool badgeStroke READ badgeStroke WRITE setBadgeStroke)
    Q_PROPERTY(QColor badgeColor READ badgeColor WRITE setBadgeColor)
    Q_PROPERTY(QColor busyColor1 READ busyColor1 WRITE setBusyColor1)
    Q_PROPERTY(QColor busyColor2 READ busyColor2 WRITE setBusyColor2)
    Q_PROPERTY(QColor badgeBackground READ badgeBackground WRITE setBadgeBackground)

public:
    explicit BadgeWidget(QWidget* parent = nullptr);
    ~BadgeWidget() override;

    //! The drawer, for what the widget does not forward. It lives as long as the widget.
    BadgeDrawer& badge();

    //! Where the badge stands in the widget; default right and top. Left is left in every layout direction.
    Qt::Alignment alignment() const;
    void setAlignment(Qt::Alignment alignment);

    int busyBadgeType() const; //!< BadgeDrawer::EBusyBadgeType as a number; unknown ones show nothing
    void setBusyBadgeType(int type);
    // As in BadgeDrawer, with the same defaults.
    QSize badgeSize() const;
    void setBadgeSize(const QSize& size);
    bool badgeStroke() const;
    void setBadgeStroke(bool stroke);
    QColor badgeColor() const;
    void setBadgeColor(const QColor& color);
    QColor busyColor1() const;
    void setBusyColor1(const QColor& color);
    QColor busyColor2() const;
    void setBusyColor2(const QColor& color);
    QColor badgeBackground() const;
    void setBadgeBackground(const QColor& color);

    /// Starts or ends the busy mark, see BadgeDrawer::setBadgeBusy().
    void setBadgeBusy(bool on);

    //! Shows \a text, not struck through, with the size and the outline of the properties.
    void setBadgeLabel(const QString& text);
    QString badgeLabel() const;
    /// Whether there is something to draw.
    bool hasBadge() const;

    //! The size of the badge on show, or badgeSize() while there is none.
    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    BadgeDrawer m_badge;
    Qt::Alignment m_alignment;
};

} // namespace vx
