// SPDX-License-Identifier: MIT
// A spinner with a running text over a view whose connection has gone.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QString>
#include <QtCore/QTimer>
#include <QtWidgets/QWidget>

class QLabel;

namespace vx
{
class BadgeWidget;

/// Tells the user that a connection has gone: a second after showBusyOverlay() it shows a spinner and, if asked, a
/// text that counts the seconds. A shorter loss shows nothing at all.
///
/// The overlay fixes its own size to what it shows and emits updatedLayout() each time; it does not place itself in
/// its parent: centre it on that signal. Object names for style sheets are "BusyOverlayWidget", and "busyIcon" and
/// "busyText" for its children. The text is shown at the label's own size at most and shrinks to fit the parent less
/// 50 pixels; where it would need 8 points or less it is hidden.
class ZELKOV_WIDGETS_EXPORT BusyOverlayView : public QWidget
{
    Q_OBJECT

public:
    /// Starts hidden.
    explicit BusyOverlayView(QWidget* parent = nullptr);
    ~BusyOverlayView() override;

    /// Shows the overlay after a second. Called again it starts the second anew.
    void showBusyOverlay(bool showText);
    /// Hides the overlay or gives up the waiting; the next round counts from 1 again.
    void hideBusyOverlay();

    /// Shows the text line and fits the overlay.
    void showBusyText();
    void hideBusyText(); //!< the size stays as it is

    /// The number of seconds shown next. Any but 0 is shown at once.
    void setBusySeconds(int seconds);

    /// The text line; "%1" stands for the time. Empty (the default) selects "Connection lost since %1". A new text
    /// shows with the next second.
    QString busyText() const;
    void setBusyText(const QString& text);
    /// Back to the default text.
    void clearBusyText();

Q_SIGNALS:
    /// The size may have changed. Always false.
    void updatedLayout(bool);

private Q_SLOTS:
    void showBusyIcon();
    void updateBusyTime();

private:
    void arrangeWidgets();
    void findOptimumFontSize();

    QTimer m_delayTimer;
    QTimer m_secondsTimer;
    int m_baseFontSize;
    int m_busySeconds;
    bool m_showText = false;
    BadgeWidget* m_busyIcon;
    QLabel* m_busyLabel;
    QString m_busyText;
};
}
