// SPDX-License-Identifier: MIT
// Asks how to export.
#pragma once

#include "ExportOptions.h"

#include <QtCore/QObject>
#include <QtCore/QPointer>
#include <QtWidgets/QWidget>

namespace vx
{
class Nubsie;
namespace PopoverWidget
{
class Container;
class Controller;
class Item;
class SliderItem;
}
}

namespace client
{
class Fleet;

/// A modal popover with the options of an export. Its end takes the popover along.
class ExportPopover : public QObject
{
    Q_OBJECT

public:
    /// \a camera is the one that is offered besides all of them. Both ends have to lie between \a begin and \a end.
    ExportPopover(const Fleet& fleet, int camera, qint64 begin, qint64 end, QObject* parent);
    ~ExportPopover() override;

    /// Returns when the user has decided: whether to export. This may be deleted in the meantime.
    bool ask(QWidget* target, const ExportOptions& suggested);
    const ExportOptions& options() const { return m_options; }
    /// Shows another range; emits nothing.
    void setRange(qint64 from, qint64 to);

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// By the user.
    void rangeChosen(qint64 from, qint64 to);

private:
    vx::PopoverWidget::Container* makeRows();
    void makeChoices(vx::PopoverWidget::Container* rows);
    void makeFileRows(vx::PopoverWidget::Container* rows);
    vx::PopoverWidget::Container* makeButtons();
    void add(vx::PopoverWidget::Container* rows, vx::PopoverWidget::Item* row);
    void makeHandle();
    void perform(int id, const QVariant& value);
    void takeRange();
    void check();
    void accept();
    void retranslate();
    QString cameraName() const;

    const Fleet& m_fleet;
    int m_camera;
    qint64 m_begin;
    qint64 m_end;
    ExportOptions m_options;
    QPointer<vx::PopoverWidget::Controller> m_controller;
    QPointer<vx::PopoverWidget::Container> m_rows;
    QPointer<vx::PopoverWidget::Container> m_buttons;
    QPointer<vx::PopoverWidget::SliderItem> m_quality;
    QPointer<vx::Nubsie> m_handle;
    bool m_settingRange = false;
};
}
