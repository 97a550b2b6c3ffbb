// SPDX-License-Identifier: MIT
// Each camera has a MouseAdapter of its own; what its signals do stands in connectCamera().
#include "CameraWallPage.h"

#include <QtCore/QDateTime>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

#include "../Hand.h"
#include "../cameras/CameraTile.h"
#include "../cameras/CameraWall.h"
#include "input/MouseAdapter.h"

namespace gallery
{
namespace
{
const int s_frameMillis = 40;

const char* const s_cameras[] = {
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Main street"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Reception"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Container yard"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "North gate"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Corridor 1"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Loading dock"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Car park"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Staircase"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Rail siding"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "South gate"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Canteen"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Warehouse"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Bus stop"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Corridor 2"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Crane"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Ring road"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Workshop"),
    QT_TRANSLATE_NOOP("gallery::CameraWallPage", "Quay"),
};
}

CameraWallPage::CameraWallPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    QStringList names;
    for (const char* name : s_cameras) {
        names.append(tr(name));
    }
    m_wall = new CameraWall(names);
    for (CameraTile* tile : m_wall->tiles()) {
        connectCamera(tile);
    }
    connect(m_wall, &CameraWall::changed, this, &CameraWallPage::showState);

    auto* back = new QPushButton(tr("Previous"));
    auto* forward = new QPushButton(tr("Next"));
    connect(back, &QPushButton::clicked, m_wall, [this] { m_wall->turn(-1); });
    connect(forward, &QPushButton::clicked, m_wall, [this] { m_wall->turn(1); });
    m_place = label(QString());
    m_state = label(QString(), "hint");

    auto* row = new QHBoxLayout;
    row->setSpacing(8);
    row->addWidget(back);
    row->addWidget(forward);
    row->addSpacing(8);
    row->addWidget(m_place);
    row->addStretch(1);
    row->addWidget(m_state);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addWidget(m_wall, 1);
    layout->addLayout(row);

    m_frames.setInterval(s_frameMillis);
    m_frames.setTimerType(Qt::PreciseTimer);
    connect(&m_frames, &QTimer::timeout, this, &CameraWallPage::nextFrame);
    m_second.setInterval(1000);
    connect(&m_second, &QTimer::timeout, this, [this] {
        m_framesPerSecond = qRound(m_frameCount * 1000.0 / double(qMax(qint64(1), m_since.restart())));
        m_frameCount = 0;
        showState();
    });
    nextFrame();
    showState();
}

void CameraWallPage::connectCamera(CameraTile* tile)
{
    auto* mouse = new vx::MouseAdapter(tile, false);
    watch(mouse, tile->objectName(), {QStringLiteral("moved"), QStringLiteral("panning")});
    connect(mouse, &vx::MouseAdapter::clicked, this, [this, tile] { m_wall->select(tile); });
    connect(mouse, &vx::MouseAdapter::doubleClicked, this, [this, tile] { m_wall->toggleEnlarged(tile); });
    connect(mouse, &vx::MouseAdapter::longPressed, this, [this, tile] {
        tile->setDropped(!tile->isDropped());
        showState();
    });
    connect(mouse, &vx::MouseAdapter::panning, this,
            [tile](const vx::MouseGesture::Ptr& gesture) { tile->lookBy(-gesture->lastPanOffset().x()); });
    connect(mouse, &vx::MouseAdapter::swiped, this, [this](const vx::MouseGesture::Ptr& gesture) {
        if (gesture->wasSwipe(Qt::Horizontal)) {
            m_wall->turn(gesture->wasSwipe(vx::dLeft) ? 1 : -1);
        }
    });
}

void CameraWallPage::nextFrame()
{
    ++m_frameCount;
    m_wall->advance(QDateTime::currentMSecsSinceEpoch());
}

void CameraWallPage::showState()
{
    int dropped = 0;
    for (const CameraTile* tile : m_wall->tiles()) {
        dropped += tile->isDropped() ? 1 : 0;
    }
    m_place->setText(tr("Wall %1 of %2").arg(m_wall->currentWall() + 1).arg(m_wall->wallCount()));
    m_state->setText(tr("%1 frames per second   Without signal: %2").arg(m_framesPerSecond).arg(dropped));
}

void CameraWallPage::showEvent(QShowEvent* event)
{
    m_frameCount = 0;
    m_since.start();
    m_frames.start();
    m_second.start();
    Page::showEvent(event);
}

void CameraWallPage::hideEvent(QHideEvent* event)
{
    m_frames.stop();
    m_second.stop();
    Page::hideEvent(event);
}

void CameraWallPage::rehearse(Hand& hand)
{
    CameraTile* first = m_wall->tiles().at(0);
    CameraTile* fifth = m_wall->tiles().at(4);
    const QPoint middle = first->rect().center();
    hand.click(first, middle).wait(450);
    hand.moveTo(fifth, middle).press().wait(1100).release().wait(60);
}
}
