// SPDX-License-Identifier: MIT
// A date and time field that never shows a selection while it is read-only and reports presses.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QDateTime>
#include <QtCore/QPointer>
#include <QtGui/QFont>
#include <QtWidgets/QDateTimeEdit>
#include <QtWidgets/QLineEdit>

namespace vx
{
/// A QDateTimeEdit for frame times: read-only it shows no selection and says when it is pressed, editable it can give
/// the focus back to its parent on Return.
///
/// While it is read-only its inner line edit lets mouse events through, so that a press anywhere on the field, text
/// included, reaches the field itself.
class ZELKOV_WIDGETS_EXPORT DateTimeEdit : public QDateTimeEdit
{
    Q_OBJECT

public:
    explicit DateTimeEdit(QWidget* parent = nullptr);
    ~DateTimeEdit() override;

    /// Sets the font of the inner line edit only.
    void changeFont(QFont font);
    /// The font of the inner line edit.
    QFont getFont();

    /// The inner line edit, owned by this widget.
    QLineEdit* lineEdit() const;
    /// Takes over the line edit and deletes the present one. Null is ignored.
    void setLineEdit(QLineEdit* edit);

    /// Whether Return and Enter move the focus to the parent, in place of what QDateTimeEdit does with them. Default
    /// false. Owners of a field set it directly.
    bool m_returnLeavesField = false;

Q_SIGNALS:
    /// The field was pressed with any button, read-only or not; comes before the press takes its usual course.
    /// Carries the time shown.
    void anchorTimeClicked(QDateTime dateTime);

protected:
    bool event(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void letMouseThrough();

    QPointer<QLineEdit> m_lineEdit; // the base class names one that is being deleted while it is replaced
};
}
