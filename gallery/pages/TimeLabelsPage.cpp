// SPDX-License-Identifier: MIT
// A picture with 25 frames a second and the time of each, and the same name and time in four widths.
#include "TimeLabelsPage.h"

#include <QtCore/QEvent>
#include <QtCore/QTimer>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "../cameras/Scene.h"
#include "controls/DateTimeEdit.h"
#include "indicators/Label.h"
#include "indicators/NameTimeLabel.h"
#include "indicators/TimeLabel.h"

namespace gallery
{
namespace
{
constexpr int s_lineHeight = 26;
constexpr int s_margin = 12;
constexpr int s_frame = 40;

// What lies on a picture looks the same in every theme. The symbol is chosen by its object name.
const QString s_sheet = QStringLiteral(R"(
    #FrameTimeWidget { background: rgba(12, 16, 22, 190); border-radius: 5px; }
    #FrameTimeLabel, #DateEdit { color: white; background: transparent; border: none; padding: 0; min-height: 0; }
    #FrameTimeGrabberCamera { qproperty-pixmap: url(:/zelkov/theme/pictures/overlays/from-camera.png); }
    #FrameTimeGrabberFileserver { qproperty-pixmap: url(:/zelkov/theme/pictures/overlays/from-server.png); }
    #FrameTimeGrabberError { qproperty-pixmap: url(:/zelkov/theme/pictures/overlays/from-nowhere.png); }
)");

QVBoxLayout* column(QWidget* panel, QLabel* heading)
{
    auto* layout = new QVBoxLayout(panel);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(10);
    layout->addWidget(heading);
    return layout;
}
}

TimeLabelsPage::TimeLabelsPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_start(QDate(2026, 4, 1), QTime(8, 15))
    , m_picture(new vx::Label)
    , m_time(new vx::TimeLabel(true, m_picture))
{
    m_clock.start();
    m_picture->setScaledContents(true);
    m_picture->setPixmap(Scene(2).ground(QSize(960, 600), devicePixelRatioF()));
    m_picture->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Ignored);
    m_picture->setMinimumSize(360, 200);
    m_picture->setStyleSheet(s_sheet);
    m_picture->installEventFilter(this);

    // A plain widget draws the ground of its sheet only when asked to.
    m_time->setAttribute(Qt::WA_StyledBackground);
    connect(m_time, &vx::TimeLabel::reposTimeLabel, this, &TimeLabelsPage::place);
    connect(m_time, &vx::TimeLabel::labelGrabbed, this, [this](bool grabbed) {
        m_isGrabbed = grabbed;
        m_grabbed = m_time->mapFromGlobal(QCursor::pos());
    });
    connect(m_time, &vx::TimeLabel::frametimeUpdate, this, [this](const QDateTime& time) {
        m_start = time;
        m_clock.restart();
    });
    watch(m_time, QStringLiteral("time"), {QStringLiteral("reposTimeLabel")});

    auto* timer = new QTimer(this);
    connect(timer, &QTimer::timeout, this, &TimeLabelsPage::nextFrame);
    timer->start(s_frame);

    auto* top = new QHBoxLayout;
    top->setSpacing(16);
    top->addWidget(m_picture, 1);
    top->addWidget(makeSettings());
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addLayout(top, 1);
    layout->addWidget(makeNames());
}

QWidget* TimeLabelsPage::makeSettings()
{
    QWidget* box = panel();
    box->setFixedWidth(270);
    QVBoxLayout* layout = column(box, label(tr("Time of the picture"), "heading"));
    auto* editable = new QCheckBox(tr("Can be edited"));
    connect(editable, &QCheckBox::toggled, m_time, [this](bool on) { m_time->setReadOnly(!on); });
    auto* server = new QCheckBox(tr("Comes from the file server"));
    connect(server, &QCheckBox::toggled, m_time, [this](bool on) { m_time->changeRecordingSymbol(!on); });
    auto* error = new QCheckBox(tr("Something is wrong"));
    connect(error, &QCheckBox::toggled, m_time, &vx::TimeLabel::showErrorSymbol);
    auto* anchor = new QPushButton(tr("Count from here"));
    connect(anchor, &QPushButton::clicked, m_time, [this] { m_time->setAnchortime(now()); });
    auto* hint = label(tr("Drag the label by its symbol; a double click puts it back."), "hint");
    hint->setWordWrap(true);
    layout->addWidget(editable);
    layout->addWidget(server);
    layout->addWidget(error);
    layout->addWidget(anchor);
    layout->addWidget(hint);
    layout->addStretch(1);
    m_anchor = anchor;
    return box;
}

QWidget* TimeLabelsPage::makeNames()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Name, date and time in the room there is"), "heading"));
    auto* wrong = new QCheckBox(tr("The clock of the device is two minutes late"));
    auto* row = new QHBoxLayout;
    row->setSpacing(12);
    for (const int width : {330, 190, 130}) {
        auto* line = new vx::NameTimeLabel;
        line->setFixedSize(width, 30);
        line->setFrameShape(QFrame::StyledPanel);
        // The theme takes the frame away, and here the room is what is shown.
        line->setStyleSheet(QStringLiteral("vx--NameTimeLabel { border: 1px solid palette(mid); border-radius: 4px; }"));
        line->setDeviceName(tr("Loading bay west"));
        line->setDate(m_start.toString(QStringLiteral("dd.MM.yyyy")));
        line->setTime(m_start.toString(QStringLiteral("HH:mm")));
        connect(wrong, &QCheckBox::toggled, line, [line](bool on) {
            // The first check that finds a difference starts the blinking.
            line->setCheckTimeSync(on);
            if (on) {
                line->setDateTime(QDateTime::currentDateTime().addSecs(-120), Qt::ISODate, Qt::ISODate);
            }
        });
        watch(line, QStringLiteral("line%1").arg(width));
        row->addWidget(line);
    }
    row->addStretch(1);
    layout->addLayout(row);
    layout->addWidget(wrong);
    layout->addWidget(label(tr("A click on the narrowest line turns it over."), "hint"));
    return box;
}

quint64 TimeLabelsPage::now() const
{
    return quint64(m_start.toMSecsSinceEpoch() + m_clock.elapsed()) * 1000;
}

void TimeLabelsPage::nextFrame()
{
    // Not while the user is typing another time.
    if (!m_time->getDateTimeEit()->hasFocus()) {
        m_time->setFrametime(now());
    }
}

void TimeLabelsPage::place(bool home)
{
    const QRect room = m_picture->rect().adjusted(s_margin, s_margin, -s_margin, -s_margin);
    m_isMoved = m_isMoved && !home;
    if (!m_isMoved) {
        m_time->move(room.center().x() - m_time->width() / 2, room.bottom() - m_time->height());
        return;
    }
    const QPoint corner(qBound(room.left(), m_time->x(), room.right() - m_time->width()),
        qBound(room.top(), m_time->y(), room.bottom() - m_time->height()));
    m_time->move(corner);
}

bool TimeLabelsPage::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::Resize) {
        m_time->resizeContent(true);
    } else if (event->type() == QEvent::MouseMove && m_isGrabbed) {
        // The label ignores its moves, so they arrive at the picture.
        m_isMoved = true;
        m_time->move(static_cast<QMouseEvent*>(event)->pos() - m_grabbed);
        place(false);
    }
    return Page::eventFilter(object, event);
}

void TimeLabelsPage::showEvent(QShowEvent* event)
{
    Page::showEvent(event);
    m_time->showFrametime(true, now(), s_lineHeight, s_margin, true, Qt::AlignHCenter | Qt::AlignBottom, true);
}

void TimeLabelsPage::rehearse(Hand& hand)
{
    hand.click(m_anchor, m_anchor->rect().center()).wait(1300);
}
}
