// SPDX-License-Identifier: MIT
// FadeStripeView: a panel at the edge of a view with a grab handle, a time line and rows of contents.
#pragma once

#include "views/FadeView.h"

#include <QtCore/QList>
#include <QtCore/QMimeData>
#include <QtCore/QPoint>
#include <QtCore/QPointer>
#include <QtCore/QStringList>
#include <QtCore/QVector>

class QDropEvent;
class QTimer;

namespace vx
{
class MultiNubsieSlider;
}

/// The concrete panel at the edge of a view: a bar of 15 pixels with a grab handle and a MultiNubsieSlider at the
/// side that moves, another bar at the edge, and the client's contents in between.
///
/// The user opens and shuts it by a click on the handle, drags the bar to a height that snaps to rows of contents,
/// and takes a top panel to the full height and back by a double click; at the bottom a double click takes one
/// row. Drops of accepted mime types are reported.
///
/// Heights are those of the whole panel, so 30 more than those of the contents. Call setContentsHeight() before
/// anything else that speaks of rows.
///
/// The widgets of the two bars and of the handle get object names from the first setStyle...() call on, for the
/// application's style sheet; the contents are called "contentView" and the slider "fadeStripeNubsieSlider".
class ZELKOV_WIDGETS_EXPORT FadeStripeView : public FadeView
{
    Q_OBJECT

public:
    /// The contents become a child; null gives an empty widget. The panel should be in its window already, since
    /// that is where the handles of the slider go.
    FadeStripeView(EPositions position, QWidget* contents, QWidget* parent);
    ~FadeStripeView() override;

    /// The time line on the bar that moves; without a handle at first.
    vx::MultiNubsieSlider* slider() const;

    /// Height of one row of contents. Sets the heights to snap to: 15, then 30 more than one, two ... rows.
    void setContentsHeight(int height);
    /// Takes the height of that many rows; 0 closes. Rows that there are not close, too.
    void setRows(int rows);
    /// Always 0.
    int getRows() const;
    /// The height that a height snaps to: closed below two thirds of a row of contents, one row up to a row and
    /// both bars, as it is from there on. A release by the user snaps differently, at 0.66: clients rely on it.
    int snapToSize(int size) const;
    /// Emits sizeChanged() with the present height of the contents, if the panel is open and not at full height.
    void distributeHeight();
    /// Highest height of the whole panel, for drags, setSizeHint() and layouts. At first the parent's height on
    /// top, half of it at the bottom. Hides the function of QWidget.
    void setMaximumHeight(int height);

    // A panel with accepted mime types takes drops.
    void setAcceptedMimeTypes(const QStringList& types);
    void addAcceptedMimeType(const QString& type);
    void removeAcceptedMimeType(const QString& type);
    QStringList acceptedMimeTypes() const;

    /// Sources whose drags are refused whatever they carry. Not owned and not watched; null is never ignored.
    void setIgnoredSources(const QList<QObject*>& sources);
    // One more of them, and one less.
    void addIgnoredSource(QObject* source);
    void removeIgnoredSource(QObject* source);
    QList<QObject*> ignoredSources() const;

    // Names for the bars and the handle: "header", "footer", "grab", and those with "-red", "-green" added;
    // "header-solid-grey", "footer-solid-grey" and "-solid-blue" with a plain "grab".
    void setStyleDefault();
    void setStyleRed();
    void setStyleGreen();
    void setStyleSolidGrey();
    void setStyleSolidBlue();
    /// Names the widget for style sheets, if it has another name. Ignored for null.
    static void updateStyle(QWidget* widget, const QString& name);

    /// Clamps the height between 15 and the maximum and takes note of it; \a resizeNow also takes it at once.
    virtual void setSizeHint(int size, bool resizeNow);

private Q_SLOTS:
    virtual void fadedIn();
    virtual void fadedOut();
    void emitSingleClicked();

Q_SIGNALS:
    // Places are parts of the width, from 0 at the left.
    void headerPressed(float relpos);
    void footerPressed(float relPos);
    /// Released where it was pressed, on an open panel and not on the handle.
    void headerReleased(float relpos);
    /// Likewise.
    void footerReleased(float relPos);
    /// The same on a closed panel.
    void headerReleasedFadedOut();
    /// Likewise.
    void footerReleasedFadedOut();
    /// The height of the panel and its edge, whatever the names say.
    void heightChanged(int rows, int pos);
    /// The height that the contents should have.
    void sizeChanged(int height);
    /// A click on an inactive panel, on the handle or, when closed, anywhere on its bars.
    void inactiveClicked();
    /// A drop of an accepted type. \a pos is always -1.
    void dragAccepted(QPointer<QObject> source, const QMimeData& mimeData, int pos);

protected:
    /// Builds the bars and puts the contents between them; called by the constructor.
    void init(QWidget* contents);
    /// Puts handle and time line onto a bar.
    void addGrab(QWidget* bar);
    /// Whether the drag has an accepted format and comes from no ignored source.
    bool isMimeTypeAccepted(QDropEvent* event);

    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    bool isOnMovingBar(const QPoint& position) const;
    QRect grabRect() const;
    int draggedHeight(const QMouseEvent* event) const;
    void dragTo(const QMouseEvent* event);
    void snap();
    void setStyle(const char* header, const char* footer, const char* grab);

    bool m_dragging = false;
    int m_pressGlobalY = 0;
    QPoint m_pressPos;
    int m_dragOffset = 0;
    QWidget* m_header = nullptr;
    QWidget* m_footer = nullptr;
    QPointer<QWidget> m_contents;
    QWidget* m_grab = nullptr;
    vx::MultiNubsieSlider* m_slider = nullptr;
    int m_rows = 0;
    int m_maxRows = 2;
    QVector<int> m_rowHeights;
    int m_contentsHeight = 0;
    QTimer* m_clickTimer = nullptr;
    QStringList m_acceptedMimeTypes;
    QList<QObject*> m_ignoredSources;
};
