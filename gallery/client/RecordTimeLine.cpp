// SPDX-License-Identifier: MIT
// The contents of the lower stripe: the time line and what it says in words.
#include "RecordTimeLine.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>
#include <QtCore/QVariant>
#include <QtGui/QPainter>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleOption>

#include "Fleet.h"
#include "TimeTrack.h"
#include "ZelkovUtils/TimeUtils.h"
#include "indicators/ElidedLabel.h"
#include "popover/Container.h"
#include "popover/Manager.h"
#include "popover/items/DateTimeItem.h"
#include "sliders/MultiNubsieSlider.h"

namespace client
{
namespace
{
const int s_margin = 12;
const int s_wordsTop = 7;
const int s_wordsHeight = 30;
const int s_trackTop = 40;
const qint64 s_scaleStep = 10 * 1000; // how far the clock gets ahead before the scale follows

QString inWords(qint64 moment)
{
    return TimeUtils::formatDateTimeRelative(
        QDateTime::fromMSecsSinceEpoch(moment), true, true, true, false, false);
}
}

RecordTimeLine::RecordTimeLine(Fleet& fleet, QWidget* parent)
    : QWidget(parent)
    , m_fleet(fleet)
    , m_words(new QWidget(this))
    , m_moment(new vx::ElidedLabel(m_words))
    , m_range(new vx::ElidedLabel(m_words))
    , m_export(new QPushButton(m_words))
    , m_liveButton(new QPushButton(m_words))
    , m_track(new TimeTrack(this, this))
{
    m_moment->setObjectName(QStringLiteral("momentLabel"));
    m_moment->setProperty("role", QStringLiteral("heading"));
    m_range->setObjectName(QStringLiteral("rangeLabel"));
    m_range->setProperty("role", QStringLiteral("hint"));
    m_range->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    m_export->setObjectName(QStringLiteral("timeLineExportButton"));
    m_liveButton->setObjectName(QStringLiteral("timeLineLiveButton"));
    m_liveButton->setCheckable(true);
    for (QPushButton* button : {m_export, m_liveButton}) {
        button->setFocusPolicy(Qt::NoFocus);
    }

    auto* row = new QHBoxLayout(m_words);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(10);
    row->addWidget(m_moment);
    row->addWidget(m_range, 1);
    row->addWidget(m_export);
    row->addWidget(m_liveButton);

    connect(m_track, &TimeTrack::momentChosen, this, &RecordTimeLine::choose);
    connect(m_track, &TimeTrack::momentDoubleClicked, this, &RecordTimeLine::askForMoment);
    connect(m_track, &TimeTrack::rangeChosen, this, [this](qint64 from, qint64 to) {
        showWords();
        Q_EMIT rangeChosen(from, to);
    });
    connect(m_export, &QPushButton::clicked, this, [this] { Q_EMIT exportWanted(m_export); });
    connect(m_liveButton, &QPushButton::clicked, this, [this] {
        setLive();
        Q_EMIT liveWanted();
    });
    connect(&m_fleet, &Fleet::orderChanged, this, &RecordTimeLine::readRecords);
    m_timer.setInterval(1000);
    connect(&m_timer, &QTimer::timeout, this, &RecordTimeLine::tick);
    readRecords();
    retranslate();
}

RecordTimeLine::~RecordTimeLine()
{
    if (m_popover) {
        m_popover->dismiss(false, true); // it stands in the window and would ask on
    }
}

void RecordTimeLine::setLive()
{
    m_live = true;
    m_track->setMoment(m_track->end());
    showWords();
}

void RecordTimeLine::setMoment(qint64 moment)
{
    m_live = false;
    m_track->setMoment(moment);
    showWords();
}

void RecordTimeLine::choose(qint64 moment)
{
    m_live = false;
    showWords();
    // The scale may be a little behind the clock.
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    Q_EMIT momentChosen(qBound(now - TimeTrack::s_length, moment, now));
}

void RecordTimeLine::setExportAllowed(bool allowed)
{
    m_exportAllowed = allowed;
    m_export->setEnabled(allowed);
    retranslate();
}

void RecordTimeLine::tick()
{
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    if (!m_track->isHeld() && (now - m_track->end() >= s_scaleStep || now < m_track->end())) {
        m_track->setEnd(now);
        if (m_live) {
            m_track->setMoment(now);
        }
        readRecords();
    }
    showWords();
}

void RecordTimeLine::readRecords()
{
    m_track->setRecords(Recordings::spans(m_track->begin(), m_track->end()),
        Recordings::events(m_track->begin(), m_track->end(), m_fleet));
}

void RecordTimeLine::showWords()
{
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    const qint64 moment = m_track->moment();
    m_liveButton->setChecked(m_live);
    m_moment->setText(m_live ? tr("Live · %1").arg(inWords(now))
                             : tr("%1 · %2 ago").arg(inWords(moment),
                                 TimeUtils::formatTimeUserFriendly(qMax(Q_INT64_C(0), now - moment) / 1000)));
    const qint64 from = m_track->from();
    const qint64 to = m_track->to();
    const auto clock = [](qint64 time) {
        return QDateTime::fromMSecsSinceEpoch(time).time().toString(QStringLiteral("HH:mm:ss"));
    };
    const QString length = TimeUtils::formatTimeUserFriendly((to - from + 500) / 1000);
    m_rangeTexts = QStringList{tr("Export %1 to %2 (%3)").arg(clock(from), clock(to), length),
        QStringLiteral("%1 \u2013 %2").arg(clock(from), clock(to)), length};
    fitWords();
    m_range->setToolTip(tr("Drag the flags to choose what is exported."));
}

// The moment comes first; the range says as much as there is room for.
void RecordTimeLine::fitWords()
{
    const int spacing = m_words->layout()->spacing();
    int room = m_words->width() - m_export->sizeHint().width() - m_liveButton->sizeHint().width() - 3 * spacing;
    m_moment->setMinimumWidth(qMax(0, qMin(room, m_moment->sizeHint().width())));
    room -= m_moment->minimumWidth();
    QString shown;
    for (const QString& text : qAsConst(m_rangeTexts)) {
        if (m_range->fontMetrics().horizontalAdvance(text) + 4 <= room) {
            shown = text;
            break;
        }
    }
    m_range->setText(shown);
}

void RecordTimeLine::retranslate()
{
    m_export->setText(tr("Export..."));
    m_export->setToolTip(m_exportAllowed ? QString() : tr("You have no right to export."));
    m_liveButton->setText(tr("Live"));
    m_liveButton->setToolTip(tr("Back to what the cameras show now"));
    showWords();
}

// A popover of one row. What is typed is shown at once, as with the handle itself.
void RecordTimeLine::askForMoment()
{
    namespace rows = vx::PopoverWidget;
    if (m_popover) {
        return;
    }
    rows::Manager* const manager = rows::Manager::instance();
    const QPointer<vx::Nubsie> handle = m_track->positionSlider()->getNubsies().value(0);
    if (!manager || !handle) {
        return;
    }
    m_popover = manager->createController(manager->getUniquePopoverID(), false, false, this, handle.data(),
        tr("Go to"), QStringLiteral("momentPopover"), rows::Balloon::EArrowDirections(rows::Balloon::eadBottom),
        QSizeF(), rows::Balloon::ESizeConstraints());
    auto* content = new rows::Container(nullptr, QStringLiteral("rows"), Qt::Vertical, Qt::AlignTop);
    auto* row = new rows::DateTimeItem(tr("Date and time"), QDateTime::fromMSecsSinceEpoch(m_track->moment()),
        Qt::LocalTime, TimeUtils::getDateTimeFormat(true, true), QStringLiteral("momentRow"), 1,
        rows::eifText | rows::eifControl, nullptr);
    row->dateTimeEdit()->setMinimumDateTime(QDateTime::fromMSecsSinceEpoch(m_track->begin()));
    row->dateTimeEdit()->setMaximumDateTime(QDateTime::fromMSecsSinceEpoch(m_track->end()));
    row->setMinimumWidth(290);
    content->addItem(row, rows::EContainerFlags());
    m_popover->setContainer(content, rows::Balloon::ebfTitle | rows::Balloon::ebfClose);
    connect(m_popover.data(), &rows::Controller::itemPerformed, this, [this](int, const QVariant& value) {
        m_track->setMoment(value.toDateTime().toMSecsSinceEpoch());
        choose(m_track->moment());
    });
    m_popover->setActive(true, rows::Controller::epsBalloon | rows::Controller::epsNoFade, false);
}

// Opaque, so that the pictures below can run without having this painted as often.
void RecordTimeLine::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), palette().window());
    QStyleOption option;
    option.initFrom(this);
    style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, this);
}

bool RecordTimeLine::event(QEvent* event)
{
    const bool result = QWidget::event(event);
    if (event->type() == QEvent::Polish || event->type() == QEvent::StyleChange) {
        setAttribute(Qt::WA_OpaquePaintEvent); // style sheets take it away
    }
    return result;
}

void RecordTimeLine::resizeEvent(QResizeEvent*)
{
    // By hand, so that the stripe does not squeeze it while it slides.
    m_words->setGeometry(s_margin, s_wordsTop, qMax(0, width() - 2 * s_margin), s_wordsHeight);
    m_track->setGeometry(0, s_trackTop, width(), TimeTrack::s_height);
    fitWords();
}

void RecordTimeLine::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    m_timer.start();
    tick();
}

void RecordTimeLine::hideEvent(QHideEvent* event)
{
    m_timer.stop();
    if (m_popover) {
        m_popover->dismiss(false, true); // it points at a handle that is going
    }
    QWidget::hideEvent(event);
}

void RecordTimeLine::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
    QWidget::changeEvent(event);
}
}
