// SPDX-License-Identifier: MIT
// A plain widget with the signals of a button.
#pragma once

#include "foundation/Export.h"

#include <QWidget>

class QMouseEvent;

namespace vx
{
/// A widget that offers the signals of a button without being one, for code that wants something to click. It
/// paints nothing, has no state, and any mouse button clicks it.
///
/// A press gives pressed(); a release gives clicked(false), if there was a press, and then released(), wherever
/// the pointer is. Mouse events do not go on to the parent.
class ZELKOV_WIDGETS_EXPORT CustomClickQWidget : public QWidget
{
    Q_OBJECT

public:
    explicit CustomClickQWidget(QWidget* parent);
    ~CustomClickQWidget() override;

Q_SIGNALS:
    /// A release after a press, or a call of click() or the other clicked(). \a checked is always false. To
    /// connect by address, pick it with QOverload<bool>::of().
    void clicked(bool checked);
    // A button of the mouse went down, and up again wherever that was.
    void pressed();
    void released();
    /// For subclasses; never emitted here.
    void toggled(bool checked);

protected Q_SLOTS:
    /// Emits clicked(false).
    void click();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

public:
    /// Emits clicked(false).
    virtual void clicked();

protected:
    // Do nothing; for subclasses, under the names that QAbstractButton has for them.
    virtual void checkStateSet();
    virtual void nextCheckState();

private:
    bool m_pressed = false;
};
}
