// SPDX-License-Identifier: MIT
// The round delete sign of a list row.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPropertyAnimation>
#include <QtWidgets/QPushButton>

namespace vx
{
/// The round sign at the left of a list row in edit mode. In delete mode it is turned by a quarter turn to the left.
class ZELKOV_WIDGETS_EXPORT iOSListWidgetDeleteIcon : public QPushButton
{
    Q_OBJECT
    Q_PROPERTY(double deleteIconRotation READ deleteIconRotation WRITE setDeleteIconRotation)

public:
    explicit iOSListWidgetDeleteIcon(QWidget* parent = nullptr);
    ~iOSListWidgetDeleteIcon() override;

    /// Animated it turns within 250 ms, from the end point of the way and not from where it is; nothing happens then
    /// if that is the mode already.
    void setDeleteMode(bool on, bool animated);
    bool getDeleteMode() const;

    double deleteIconRotation() const; //!< degrees, clockwise
    void setDeleteIconRotation(double degrees);

    /// The size of the picture.
    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPropertyAnimation* m_animation;
    double m_rotation = 0.0;
    bool m_deleteMode = false;
};
}
