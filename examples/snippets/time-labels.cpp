// SPDX-License-Identifier: MIT
// The code of docs/time-labels.md.
//! [time]
#include "indicators/TimeLabel.h"

//! [time]
//! [name]
#include "indicators/NameTimeLabel.h"

//! [name]
#include "Snippets.h"

namespace snippets_time_labels
{
class Player : public QObject
{
    Q_OBJECT
public:
    qulonglong frameTime() const { return 1775031301000000ULL; }
    void goTo(const QDateTime&) {}
Q_SIGNALS:
    void frameShown(qulonglong time);
};
class Client : public QWidget
{
public:
    void turnOver() {}
    void build(QWidget* view, Player* player)
    {
        //! [time]
        auto* time = new vx::TimeLabel(true, view); // true: the symbol of a camera, false: that of the file server
        connect(time, &vx::TimeLabel::reposTimeLabel, view, [=] {
            time->move((view->width() - time->width()) / 2, view->height() - time->height() - 12);
        });
        connect(time, &vx::TimeLabel::frametimeUpdate, player, &Player::goTo);
        connect(player, &Player::frameShown, time, &vx::TimeLabel::setFrametime); // microseconds since the epoch
        time->showFrametime(true, player->frameTime(), 26, 12, false, Qt::AlignHCenter | Qt::AlignBottom, false);
        //! [time]
    }
    void name()
    {
        //! [name]
        auto* line = new vx::NameTimeLabel(this);
        line->setText("Loading bay west", "08:15", "01.04.2026"); // name, time, date
        connect(line, &vx::NameTimeLabel::clicked, this, &Client::turnOver);
        //! [name]
    }
};
}

namespace snippets
{
void time_labels()
{
    snippets_time_labels::Client client;
    snippets_time_labels::Player player;
    client.resize(500, 300);
    client.build(&client, &player);
    client.name();
    client.show();
    Q_EMIT player.frameShown(player.frameTime() + 1000000);
    pause();
}
}

#include "time-labels.moc"
