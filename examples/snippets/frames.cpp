// SPDX-License-Identifier: MIT
// The code of docs/frames.md.
//! [frame]
#include "indicators/BorderIcon.h"

//! [frame]
#include "Snippets.h"

#include <QtGui/QPainter>
#include <QtWidgets/QWidget>

namespace snippets_frames
{
//! [frame]
class Finder : public QWidget
{
public:
    // 16 pixels from each side
    Finder()
        : m_frame(":/finder.png", QMargins(16, 16, 16, 16), BorderIcon::TileCenter)
    {
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        m_frame.paint(&painter, rect());
    }

private:
    BorderIcon m_frame;
};
//! [frame]
}

namespace snippets
{
void frames()
{
    snippets_frames::Finder finder;
    finder.show();
    pause();
}
}
