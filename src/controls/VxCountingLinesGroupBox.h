// SPDX-License-Identifier: MIT
// A form that edits one counting corridor.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QPoint>
#include <QtCore/QRect>
#include <QtCore/QString>
#include <QtWidgets/QGroupBox>

#include <memory>

namespace vx
{
/// Edits one counting corridor: a line across the picture, given by two points, with an identifier, a name and the
/// titles of its two sides. People or objects that cross the line are counted by the camera. The form only moves
/// values in and out; it has no signals of its own. Points are in pixels of the picture, origin at its top left.
///
/// The object name is "CountingLinesGroupBox", the fields have object names too and can be found by them.
class ZELKOV_WIDGETS_EXPORT VxCountingLinesGroupBox : public QGroupBox
{
    Q_OBJECT

public:
    /// At least 329 pixels wide; the height is fixed. Both points start at the lower right corner of a picture of
    /// 1280 by 960 pixels, the sides are "East" and "West".
    explicit VxCountingLinesGroupBox(QWidget* parent = nullptr);
    ~VxCountingLinesGroupBox() override;

    QPoint startingPoint();
    void setStartingPoint(const QPoint& point); //!< clamped to the range
    QPoint endPoint();
    void setEndPoint(const QPoint& point); //!< clamped to the range

    int id() const; //!< 0 where the field holds no number
    void setId(int id);

    /// The name of the corridor, as the field has it.
    QString lineName();
    void setLineName(const QString& name);
    QString rightName(); //!< title of the side called "East" at first
    void setRightName(const QString& name);
    QString leftName(); //!< title of the side called "West" at first
    void setLeftName(const QString& name);

    /// The picture's pixels: x from left() to right(), y from top() to bottom() of the rectangle, both ends included.
    /// Points outside are clamped.
    void setRange(const QRect& range);

protected:
    void changeEvent(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    struct Form;
    std::unique_ptr<Form> m_form;
};
}
