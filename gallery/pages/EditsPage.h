// SPDX-License-Identifier: MIT
// Page "Edits": search, path, times, and combo boxes that let a form scroll.
#pragma once

#include "../Page.h"

namespace vx
{
class SearchEdit;
class DateTimeDefaultEdit;
}

namespace gallery
{
class EditsPage : public Page
{
    Q_OBJECT

public:
    explicit EditsPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

private:
    QWidget* makeSearch();
    QWidget* makeFields();
    QWidget* makeForm();

    vx::SearchEdit* m_search = nullptr;
    vx::DateTimeDefaultEdit* m_end = nullptr;
};
}
