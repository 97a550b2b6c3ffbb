// SPDX-License-Identifier: MIT
// A switch whose picture has a frame for each of three states.
#pragma once

#include "controls/iOSCheckBox.h"

/// A sliding switch with a picture of three frames side by side: checked, unchecked and partially checked, each a
/// third of its width. It is as large as one frame, and slides fast.
///
/// The default picture comes from the application; without it the switch has no size and draws nothing. Until it is
/// first shown or changed it stands at the third frame. setCheckState(Qt::PartiallyChecked) shows at the next
/// setVisible(), not at once.
class ZELKOV_WIDGETS_EXPORT AnimatedCheckBox : public iOSCheckBox
{
    Q_OBJECT

public:
    /// \a path names the picture, whose three frames lie side by side.
    explicit AnimatedCheckBox(QWidget* parent = nullptr, bool checked = false,
        QString path = QStringLiteral(":/icons/btn_schalter.png"));
    ~AnimatedCheckBox() override;

    /// One frame.
    QSize sizeHint() const override;

public Q_SLOTS:
    void setVisible(bool visible) override;

protected:
    void checkStateSet() override;
    void resizeEvent(QResizeEvent* event) override;

private:
    QRect getControlRect() override;
    QPoint maximumRightPosition() override;
    void draw(QPaintEvent* event, QPainter& painter) override;
};
