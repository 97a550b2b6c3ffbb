// SPDX-License-Identifier: MIT
// Shows the value of a control in a balloon beside it while the user turns or drags the control.
#pragma once

#include "foundation/Export.h"
#include "foundation/ValueRange.h"
#include "popover/Balloon.h"

#include <QtCore/QMap>
#include <QtCore/QPointer>
#include <QtCore/QString>

class QLabel;
class QWidget;

namespace vx
{
namespace PopoverWidget
{
class Controller;
class Item;
}

class WidgetContainer;

/// A helper that a control holds as a member, or derives from, to show values in a balloon that points at the
/// control. It is no widget itself. A value selects a text, or a set of rows of which the matching one is checked.
/// The balloon closes by itself 3000 ms after the last text.
///
/// The popover is made when it is first needed, in the window of the control, and kept until this object is
/// destroyed, which deletes it. Needs the popover Manager. Copies share the popover, and the first one to be
/// destroyed deletes it for all; the next text makes a new one.
class ZELKOV_WIDGETS_EXPORT PopoverBalloonWidget
{
public:
    /// @p owner is the control pointed at; it must outlive this object. The second argument is kept and read
    /// nowhere. @p controllerId is the id of the popover in the Manager.
    PopoverBalloonWidget(QWidget* owner, const QString& name, int controllerId, const QString& title);
    PopoverBalloonWidget(const PopoverBalloonWidget& other);
    PopoverBalloonWidget& operator=(const PopoverBalloonWidget& other);
    virtual ~PopoverBalloonWidget();

    /// The text of each range of values. Where ranges overlap, the one that starts lower wins.
    void setBalloonTextMap(const QMap<vx::ValueRange, QString>& texts);
    /// The row of each range of values. Rows of the old map that have no parent are deleted.
    void setBalloonItemMap(const QMap<vx::ValueRange, QPointer<vx::PopoverWidget::Item>>& items);
    QMap<vx::ValueRange, QPointer<vx::PopoverWidget::Item>> balloonItemMap() const { return m_itemMap; }
    /// Whether values may select rows. Default true.
    void setItemMapEnabled(bool enabled);
    /// For the next popover that is made. Default title and close button.
    void setBalloonFeatures(QFlags<vx::PopoverWidget::Balloon::EBalloonFeature> features);
    // For the next popover that is made.
    void setBalloonTitle(const QString& title);
    void setControllerID(int controllerId);

    /// Shows this text, in a balloon that takes no mouse events, and starts the 3000 ms anew.
    void setBalloonText(const QString& text);
    /// Shows the rows or the text of the value; closes the balloon if it has neither. With @p minimum below
    /// @p maximum only rows whose range lies between them are visible.
    void updateBalloon(int value, int minimum, int maximum);
    /// The same with three zeros.
    void updateBalloon();

    /// The popover, made if there is none, and moved to where the control is now. Null without a Manager.
    QPointer<vx::PopoverWidget::Controller> getController();
    /// Whether there is a popover; makes none.
    bool hasController() const;

protected:
    /// Whether the popover exists and is visible.
    bool popoverOpen() const;
    /// The window of the control, or the active window if that is none or embedded in a graphics scene.
    QWidget* obtainWindow();
    // The row or the text of the first range that contains the value; null or empty without one.
    QPointer<vx::PopoverWidget::Item> getBalloonItemForValue(int value);
    QString getBalloonTextForValue(int value);
    /// Deletes the rows that never got into a popover and takes them out of the map.
    void clearUnparentedBalloonItems();

private:
    bool m_itemMapEnabled = true;
    QMap<vx::ValueRange, QString> m_textMap;
    QMap<vx::ValueRange, QPointer<vx::PopoverWidget::Item>> m_itemMap;
    QPointer<vx::PopoverWidget::Controller> m_controller;
    QPointer<vx::WidgetContainer> m_container;
    QPointer<QLabel> m_label;
    QWidget* m_owner;
    QString m_name;
    int m_controllerId;
    QString m_title;
    QFlags<vx::PopoverWidget::Balloon::EBalloonFeature> m_features
        = vx::PopoverWidget::Balloon::ebfTitle | vx::PopoverWidget::Balloon::ebfClose;
};
}
