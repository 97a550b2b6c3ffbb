// SPDX-License-Identifier: MIT
// Clicks and double clicks of any widget, as signals.
#pragma once

#include "ZelkovUtils/Export.h"

#include <QtCore/QObject>
#include <QtCore/QPointF>
#include <QtCore/QPointer>
#include <QtWidgets/QWidget>

namespace vx
{
/// Watches the left mouse button over a receiver widget and reports clicks with their position, without taking part
/// in the event handling: the receiver gets every event as before, after the report.
///
/// A click is a press and a release less than QApplication::startDragDistance() apart (on the screen, so that a
/// widget that is dragged along is not clicked). It is reported at once at the release. The second press of a double
/// click reports doubleClicked(), and its release reports nothing; without efDoubleClick it is a press like any
/// other and leads to a second click.
class ZELKOV_UTILS_EXPORT ClickHelper : public QObject
{
    Q_OBJECT

public:
    /// Bit set of what is reported.
    enum EFeature : int
    {
        efNone = 0,
        efClick = 1,
        efDoubleClick = 2
    };

    /// \a parent owns the helper and is not watched by that alone. \a features is a sum of EFeature values. Starts
    /// inactive and without receiver.
    ClickHelper(QWidget* parent, int features);
    ~ClickHelper() override;

    /// What is reported, as given to the constructor.
    int features() const;
    QWidget* receiver() const;
    /// The widget to watch, null for none. Not owned. Forgets a press that has not been released yet.
    void setReceiver(QWidget* receiver);
    bool isActive() const;
    /// Whether anything is reported. Forgets a press that has not been released yet.
    void setActive(bool active);

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// Position of the release, in the coordinates of the receiver.
    void clicked(const QPointF& position);
    /// Position of the second press, in the coordinates of the receiver.
    void doubleClicked(const QPointF& position);

private:
    int m_features;
    bool m_active = false;
    bool m_pressed = false;
    QPointF m_pressPosition;  // global
    QPointer<QWidget> m_receiver;
};
}
