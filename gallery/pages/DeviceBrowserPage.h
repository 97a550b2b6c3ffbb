// SPDX-License-Identifier: MIT
// Page "Device browser": a list of devices filtered by MultiFilterModel, and a wall of thumbnails beside it.
#pragma once

#include "../Page.h"

namespace vx
{
class FlexibleTableModel;
class MultiFilterModel;
}

class QComboBox;
class QLabel;
class QLineEdit;
class QTableView;

namespace gallery
{
class DeviceBrowserPage : public Page
{
    Q_OBJECT

public:
    explicit DeviceBrowserPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget* makeCriteria();
    QTableView* makeList();
    QTableView* makeWall();
    void filter();
    void followWidth();

    vx::MultiFilterModel* m_filtered = nullptr;
    vx::FlexibleTableModel* m_thumbnails = nullptr;
    QLineEdit* m_search = nullptr;
    QComboBox* m_place = nullptr;
    QComboBox* m_state = nullptr;
    QLabel* m_time = nullptr;
    QTableView* m_wall = nullptr;
};
}
