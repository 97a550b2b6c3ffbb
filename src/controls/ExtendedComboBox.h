// SPDX-License-Identifier: MIT
// A combo box that leaves the wheel to the area that it stands in.
#pragma once

#include "foundation/Export.h"

#include <QtWidgets/QComboBox>

namespace vx
{
/// A combo box whose current item the wheel never changes: the wheel goes on to what lies around it, so that a form
/// in a scroll area scrolls, or it is swallowed.
class ZELKOV_WIDGETS_EXPORT ExtendedComboBox : public QComboBox
{
    Q_OBJECT

public:
    explicit ExtendedComboBox(QWidget* parent = nullptr);
    ~ExtendedComboBox() override;

    bool ignoreWheelEvents() const; //!< default true
    /// True lets the wheel go on to the parent, false swallows it.
    void setIgnoreWheelEvents(bool ignore);

protected:
    void wheelEvent(QWheelEvent* event) override;

private:
    bool m_ignoreWheelEvents = true;
};
}
