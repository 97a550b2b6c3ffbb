// SPDX-License-Identifier: MIT
// A date and time field with a button back to a default.
#pragma once

#include "controls/DateTimeEdit.h"

class QPushButton;

namespace vx
{
/// A DateTimeEdit with a default value and a small button, shown only while the value differs from the default, that
/// brings it back. Return and Enter give the focus to the parent.
class ZELKOV_WIDGETS_EXPORT DateTimeDefaultEdit : public DateTimeEdit
{
    Q_OBJECT

public:
    /// Side of the reset button. The layout direction does not change it.
    enum EPosition : int
    {
        Left = 0,
        Right = 1
    };
    Q_ENUM(EPosition)

    /// Without a default; the button is hidden.
    explicit DateTimeDefaultEdit(QWidget* parent = nullptr, EPosition position = Right);
    ~DateTimeDefaultEdit() override;

    /// Stores the default and shows it. A null default never shows the button and leaves the value as it is.
    void setDefaultDateTime(const QDateTime& dateTime);
    const QDateTime& defaultDateTime() const; //!< null at first

Q_SIGNALS:
    /// For clients that have their own way back to the default. The reset button does not emit it: it emits
    /// dateTimeChanged() and editingFinished(), and clients rely on that.
    void resettedToDefault(QDateTime defaultDateTime);

protected:
    void resizeEvent(QResizeEvent* event) override;

private Q_SLOTS:
    void resetToDefault();
    void onDateTimeChanged();

private:
    QDateTime m_defaultDateTime;
    QPushButton* m_resetButton;
    EPosition m_position;
};
}
