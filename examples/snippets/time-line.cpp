// SPDX-License-Identifier: MIT
// The code of docs/time-line.md.
//! [slider]
#include "sliders/MultiNubsieSlider.h"

//! [slider]
#include "Snippets.h"

#include "popover/Manager.h"

#include <QtWidgets/QLabel>
#include <QtWidgets/QVBoxLayout>

namespace snippets_time_line
{
enum
{
    NowId,
    PositionId
};
class Player : public QObject
{
    Q_OBJECT
public:
    void seek(int, int second) { m_second = second; }
public Q_SLOTS:
    void seekTo(int second) { m_second = second; }

private:
    int m_second = 0;
};
class Export : public QWidget
{
public:
    void editStart() {}
    vx::MultiNubsieSlider* build(QVBoxLayout* layout, const QDateTime& midnight, Player* player)
    {
        //! [slider]
        auto* line = new vx::MultiNubsieSlider(this, this);
        layout->addWidget(line); // handles are children of the window: put the slider there first
        line->addNubsie("now", 43200, 0, 86400, NowId);
        line->setStandardSize(NowId, QSize(24, 24));
        line->setDraggedSize(NowId, QSize(36, 36));
        line->setIcon(NowId, QPixmap(":/position.png"));
        line->addFeatures(NowId, vx::Nubsie::enfDateMode);
        line->setStartEndDates(NowId, midnight, midnight.addDays(1));
        line->setDrawTrack(true);
        connect(line, &vx::MultiNubsieSlider::nubsieValueChangedByUser, player, &Player::seek);
        //! [slider]
        return line;
    }
    void handle(vx::MultiNubsieSlider* line, const QDateTime& midnight, Player* player)
    {
        //! [handle]
        auto* handle = new vx::Nubsie("position", 0, 0, 86400, 0, window(), PositionId);
        handle->setSize(QSize(24, 24));
        handle->setDraggedSize(QSize(40, 40));
        handle->setIcon(QPixmap(":/position.png"));
        handle->setStartEndDate(midnight, midnight.addDays(1));
        handle->setFeatures(handle->features() | vx::Nubsie::enfDateMode);
        handle->setDragSlot(vx::QtSlot(player, "seekTo"));
        line->addNubsie(handle);
        //! [handle]
    }
    void flags(vx::MultiNubsieSlider* line, int x1, int x2)
    {
        //! [flags]
        line->setFirstFlagColor(vx::MultiNubsieSlider::efcGreen);
        line->setSecondFlagColor(vx::MultiNubsieSlider::efcRed);
        line->getFirstFlag()->setGeometry(x1, 0, line->height() / 2, line->height() / 2);
        line->getSecondFlag()->setGeometry(x2, 0, line->height() / 2, line->height() / 2);
        line->showFlags(true);
        connect(line, &vx::MultiNubsieSlider::firstFlagClicked, this, &Export::editStart);
        //! [flags]
    }
};
}

namespace snippets
{
void time_line()
{
    vx::PopoverWidget::Manager::init(1000);
    snippets_time_line::Export client;
    snippets_time_line::Player player;
    client.resize(600, 120);
    const QDateTime midnight(QDate(2026, 4, 1), QTime(0, 0));
    auto* line = client.build(new QVBoxLayout(&client), midnight, &player);
    client.handle(line, midnight, &player);
    client.show();
    client.flags(line, 100, 200);
    pause();
}
}

#include "time-line.moc"
