// SPDX-License-Identifier: MIT
// A transient sign over a widget: an icon or a text that comes, goes and deletes itself.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPointer>
#include <QtCore/QPropertyAnimation>
#include <QtCore/QRectF>
#include <QtCore/QTimer>
#include <QtWidgets/QWidget>

namespace vx
{
/// A transient sign: an icon or text that pops up over a widget, grows or fades in, and at once goes away again. The
/// static functions make, run and delete one in a single call.
///
/// A sign takes no mouse. Its icon is a label without a picture of its own: the application's style sheet gives it one
/// by the object name. The whole stay is twice the animation's duration; there is no rest in between. A sign that
/// needs more room than its parent has stays hidden, and deletes itself all the same.
class ZELKOV_WIDGETS_EXPORT IconOverlayView : public QWidget
{
    Q_OBJECT

public:
    /// What is animated while a sign comes and goes.
    enum EAnimationType : int
    {
        eatGeometry = 0, ///< the content grows from the centre
        eatOpacity = 1   ///< the "windowOpacity" of the content, which shows only where the content is a window
    };
    Q_ENUM(EAnimationType)

    static const int sDefaultIconShowTime; ///< 1000 ms
    static const int sDefaultTextShowTime; ///< 2000 ms

    /// Takes \a content over and covers \a parent, following its size. Shown at once if it fits.
    IconOverlayView(QWidget* content, QWidget* parent);
    ~IconOverlayView() override;

    /// Other values are stored; the animated property then stays. While the sign comes or goes, the change takes
    /// effect with its next part.
    void setAnimationType(EAnimationType type);

    /// Shows the sign until hideIconNow(), without animation.
    void showIcon();
    /// Shows a new label of that object name, over and above the present content, for sDefaultIconShowTime. The
    /// animation keeps the content it was made for: clients rely on it.
    void showIcon(const QString& objectName);
    /// Shows the sign for that time, in and out included.
    void showIconFor(int milliseconds);

    // The view deletes itself in all cases: a pointer that is returned is good until the end of the animation only.
    /// \return the view if \a returnView is true, else null
    static IconOverlayView* showIcon(QWidget* parent, const QString& objectName, bool returnView);
    /// The same with a text, for sDefaultTextShowTime.
    static IconOverlayView* showText(QWidget* parent, const QString& text, const QString& objectName, bool returnView);
    /// The same with an icon (\a objectName) and below it a text (object name "text"), unless it is empty.
    static IconOverlayView* showTextAndIcon(
        QWidget* parent, const QString& text, const QString& objectName, bool returnView);

    bool eventFilter(QObject* watched, QEvent* event) override;

public Q_SLOTS:
    /// Lets the sign go now.
    void hideIconNow();
    /// The end of the way out: hides the sign, and deletes it if it was made by a static function.
    void disappeared();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private Q_SLOTS:
    void appeared();

private:
    void adoptProperty();
    void appear();
    void disappear();
    void init(QWidget& watched);
    void updateLayout();
    void reveal();
    static IconOverlayView* run(IconOverlayView* view, int duration, bool returnView);

    QWidget* m_watched = nullptr;
    QPointer<QWidget> m_content;
    QRectF m_centerRect;
    QRectF m_fullRect;
    QTimer m_hideTimer;
    EAnimationType m_animationType = eatGeometry;
    QPropertyAnimation m_animation;
    bool m_deleteWhenHidden = false;
    bool m_fits = true;
};
}
