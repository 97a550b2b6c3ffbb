// SPDX-License-Identifier: MIT
// The scale of a time line with its three handles.
#include "TimeTrack.h"

#include <QtCore/QDateTime>
#include <QtGui/QHelpEvent>
#include <QtGui/QPainter>
#include <QtGui/QPainterPath>
#include <QtWidgets/QToolTip>

#include "CoreQt/QtSlot.h"
#include "sliders/MultiNubsieSlider.h"
#include "theme/Theme.h"

namespace client
{
namespace
{
using vx::MultiNubsieSlider;
using vx::Nubsie;

enum Handle : int
{
    hPosition = 1,
    hFrom = 2,
    hTo = 3
};

const int s_knob = 22;
const int s_flag = 22;
const int s_pole = 8; // from the middle of a flag to its pole
const int s_seconds = 24 * 60 * 60;
const QRect s_flags(0, 0, 0, 24); // top and height of what is in a column
const QRect s_bar(0, 27, 0, 14);
const QRect s_knobs(0, 22, 0, 24);
const int s_hours = 43;

QPixmap knobPicture(const QColor& color)
{
    QPixmap pixmap(96, 96);
    pixmap.fill(Qt::transparent);
    QPainter p(&pixmap);
    p.setRenderHint(QPainter::Antialiasing);
    p.setPen(Qt::NoPen);
    p.setBrush(QColor(0, 0, 0, 60));
    p.drawEllipse(QRectF(3, 5, 90, 90));
    p.setBrush(Qt::white);
    p.drawEllipse(QRectF(4, 2, 88, 88));
    p.setBrush(color);
    p.drawEllipse(QRectF(15, 13, 66, 66));
    return pixmap;
}

QColor orElse(const QColor& color, const QColor& fallback)
{
    return color.isValid() ? color : fallback;
}
}

TimeTrack::TimeTrack(QWidget* clip, QWidget* parent)
    : QWidget(parent)
    , m_clip(clip)
    , m_position(makeSlider("positionSlider"))
    , m_fromFlag(makeSlider("fromSlider"))
    , m_toFlag(makeSlider("toSlider"))
{
    // The pictures of the flags come with the theme.
    zelkov::theme::styleSheet(zelkov::theme::Name::None);
    setObjectName(QStringLiteral("timeTrack"));
    setMinimumHeight(s_height);
    connect(m_position, &MultiNubsieSlider::nubsieValueChangedByUser, this, [this](int, int value) {
        m_moment = begin() + qint64(value) * 1000;
        update();
        Q_EMIT momentChosen(m_moment);
    });
    connect(m_fromFlag, &MultiNubsieSlider::nubsieValueChangedByUser, this,
        [this](int, int value) { moveFlag(true, value); });
    connect(m_toFlag, &MultiNubsieSlider::nubsieValueChangedByUser, this,
        [this](int, int value) { moveFlag(false, value); });
    // A flag that was pulled beyond the shortest range goes to where it belongs.
    for (MultiNubsieSlider* slider : {m_fromFlag, m_toFlag}) {
        connect(slider, &MultiNubsieSlider::nubsieDragEnded, this, [this] { placeHandles(); }, Qt::QueuedConnection);
    }
    setEnd(QDateTime::currentMSecsSinceEpoch());
    m_moment = m_end;
    m_from = m_end - 3 * s_length / 24;
    m_to = m_end - 2 * s_length / 24;
}

MultiNubsieSlider* TimeTrack::makeSlider(const char* name)
{
    auto* slider = new MultiNubsieSlider(this, this); // takes its handle along at its end
    slider->setObjectName(QLatin1String(name));
    slider->setSliderBarExtent(0);
    slider->setFeatures(QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures>());
    slider->setAttribute(Qt::WA_TransparentForMouseEvents);
    return slider;
}

// Handles are children of the window, so the track has to be in it first.
void TimeTrack::makeHandles()
{
    if (!m_position->getNubsies().isEmpty()) {
        return;
    }
    m_fromFlag->addNubsie(QStringLiteral("exportFrom"), 0, 0, s_seconds, hFrom);
    m_toFlag->addNubsie(QStringLiteral("exportTo"), 0, 0, s_seconds, hTo);
    m_position->addNubsie(QStringLiteral("position"), 0, 0, s_seconds, hPosition);
    // Turned outwards, so that they cannot cover each other.
    m_fromFlag->setIcon(hFrom, QPixmap(QStringLiteral(":/views/btn_flag_green2.png")));
    m_toFlag->setIcon(hTo, QPixmap(QStringLiteral(":/views/btn_flag_red1.png")));
    m_fromFlag->setStandardSize(hFrom, QSize(s_flag, s_flag));
    m_toFlag->setStandardSize(hTo, QSize(s_flag, s_flag));
    // A handle that is as large at rest as while held would never be clipped.
    m_fromFlag->setDraggedSize(hFrom, QSize(s_flag + 4, s_flag + 4));
    m_toFlag->setDraggedSize(hTo, QSize(s_flag + 4, s_flag + 4));
    m_position->setStandardSize(hPosition, QSize(s_knob, s_knob));
    m_position->setDraggedSize(hPosition, QSize(s_knob * 4 / 3, s_knob * 4 / 3));
    m_position->addFeatures(hPosition, Nubsie::enfDateMode);
    m_position->setPopoverFeatures(hPosition, vx::PopoverWidget::Balloon::ebfNoHeader);
    m_position->setDoubleClickSlot(hPosition, vx::QtSlot(this, "doubleClickMoment"));
    for (MultiNubsieSlider* slider : {m_position, m_fromFlag, m_toFlag}) {
        const QPointer<Nubsie> handle = slider->getNubsies().constFirst();
        handle->setClipWidget(m_clip);
        slider->setNubsieVisible(handle->id(), m_handlesVisible);
    }
    dressPosition();
    retranslate();
}

void TimeTrack::dressPosition()
{
    m_position->setIcon(hPosition, knobPicture(orElse(m_knobColor, palette().color(QPalette::Highlight))));
}

void TimeTrack::setKnobColor(const QColor& color)
{
    m_knobColor = color;
    dressPosition();
}

void TimeTrack::retranslate()
{
    m_position->setToolTipText(hPosition, tr("Moment that is shown. A double click asks for another one."));
    m_fromFlag->setToolTipText(hFrom, tr("Start of the export"));
    m_toFlag->setToolTipText(hTo, tr("End of the export"));
}

void TimeTrack::setEnd(qint64 end)
{
    m_end = end;
    setRange(m_from, m_to);
    setMoment(m_moment);
    m_position->setStartEndDates(
        hPosition, QDateTime::fromMSecsSinceEpoch(begin()), QDateTime::fromMSecsSinceEpoch(m_end));
}

void TimeTrack::setRecords(const QVector<RecordedSpan>& spans, const QVector<RecordedEvent>& events)
{
    m_spans = spans;
    m_events = events;
    update();
}

void TimeTrack::setMoment(qint64 moment)
{
    m_moment = qBound(begin(), moment, m_end);
    if (!isHeld()) {
        m_position->hideNubsieBalloons(); // it would show the former moment on
    }
    placeHandles();
}

void TimeTrack::setRange(qint64 from, qint64 to)
{
    m_from = qBound(begin(), from, m_end - s_shortestRange);
    m_to = qBound(m_from + s_shortestRange, to, m_end);
    placeHandles();
}

bool TimeTrack::isHeld() const
{
    return m_position->nubsieGrabbed(hPosition) || m_fromFlag->nubsieGrabbed(hFrom) || m_toFlag->nubsieGrabbed(hTo);
}

void TimeTrack::placeHandles()
{
    const auto set = [this](MultiNubsieSlider* slider, int id, qint64 moment) {
        if (!slider->nubsieGrabbed(id)) {
            slider->setValue(id, int((moment - begin() + 500) / 1000), false, false);
        }
    };
    set(m_position, hPosition, m_moment);
    set(m_fromFlag, hFrom, m_from);
    set(m_toFlag, hTo, m_to);
    update();
}

void TimeTrack::moveFlag(bool isFrom, int value)
{
    const qint64 moment = begin() + qint64(value) * 1000;
    // The flag that is held takes the other one along.
    if (isFrom) {
        m_from = qMin(moment, m_end - s_shortestRange);
        m_to = qMax(m_to, m_from + s_shortestRange);
    } else {
        m_to = qMax(moment, begin() + s_shortestRange);
        m_from = qMin(m_from, m_to - s_shortestRange);
    }
    placeHandles();
    Q_EMIT rangeChosen(m_from, m_to);
}

void TimeTrack::doubleClickMoment(int)
{
    Q_EMIT momentDoubleClicked();
}

double TimeTrack::xOf(qint64 moment) const
{
    return s_margin + (width() - 2 * s_margin) * (double(moment - begin()) / double(s_length));
}

qint64 TimeTrack::momentAt(double x) const
{
    const double part = (x - s_margin) / qMax(1, width() - 2 * s_margin);
    return begin() + qint64(qBound(0.0, part, 1.0) * s_seconds) * 1000;
}

void TimeTrack::follow()
{
    for (MultiNubsieSlider* slider : {m_position, m_fromFlag, m_toFlag}) {
        slider->repaintNubsiesImmediately();
    }
}

void TimeTrack::setHandlesVisible(bool visible)
{
    m_handlesVisible = visible;
    m_position->setNubsieVisible(hPosition, visible);
    m_fromFlag->setNubsieVisible(hFrom, visible);
    m_toFlag->setNubsieVisible(hTo, visible);
}

MultiNubsieSlider* TimeTrack::sliderAt(const QPoint& point) const
{
    for (MultiNubsieSlider* slider : {m_position, m_toFlag, m_fromFlag}) {
        const QPoint inside = slider->mapFrom(this, point);
        const Nubsie* const handle = slider->rect().contains(inside) ? slider->getNubsieForPos(inside) : nullptr;
        if (handle && slider->nubsieImageClicked(slider->nubsieRect(handle), inside)) {
            return slider;
        }
    }
    return nullptr;
}

// A press on the scale brings the handle there, and then takes it.
bool TimeTrack::takeMouse(QEvent* event)
{
    auto* const mouse = static_cast<QMouseEvent*>(event);
    const QPointer<TimeTrack> alive(this);
    QPoint point = mouse->pos();
    const bool isPress = event->type() == QEvent::MouseButtonPress || event->type() == QEvent::MouseButtonDblClick;
    if (isPress && mouse->button() == Qt::LeftButton) {
        m_pressed = sliderAt(point);
        if (!m_pressed && point.y() >= s_bar.top() - 4) {
            m_pressed = m_position;
            point.setY(m_position->geometry().center().y());
            setMoment(momentAt(point.x()));
            Q_EMIT momentChosen(m_moment);
        }
    }
    if (!alive || !m_pressed) {
        return !alive;
    }
    QMouseEvent mapped(mouse->type(), m_pressed->mapFrom(this, point), mouse->windowPos(), mouse->screenPos(),
        mouse->button(), mouse->buttons(), mouse->modifiers());
    mapped.setTimestamp(mouse->timestamp());
    const QPointer<MultiNubsieSlider> slider = m_pressed;
    if (event->type() == QEvent::MouseButtonRelease && mouse->button() == Qt::LeftButton) {
        m_pressed = nullptr;
    }
    slider->handleEvent(&mapped);
    return true;
}

bool TimeTrack::event(QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseMove:
        if (takeMouse(event)) {
            event->accept();
            return true; // this may be gone by now
        }
        break;
    case QEvent::ToolTip: {
        auto* const help = static_cast<QHelpEvent*>(event);
        if (MultiNubsieSlider* const slider = sliderAt(help->pos())) {
            QHelpEvent mapped(QEvent::ToolTip, slider->mapFrom(this, help->pos()), help->globalPos());
            slider->handleEvent(&mapped);
        } else {
            QToolTip::hideText();
        }
        return true;
    }
    default: break;
    }
    return QWidget::event(event);
}

void TimeTrack::resizeEvent(QResizeEvent*)
{
    const int way = width() - 2 * s_margin;
    m_position->setGeometry(s_margin - s_knob / 2, s_knobs.top(), way + s_knob, s_knobs.height());
    m_fromFlag->setGeometry(s_margin - s_flag / 2 - s_pole, s_flags.top(), way + s_flag, s_flags.height());
    m_toFlag->setGeometry(s_margin - s_flag / 2 + s_pole, s_flags.top(), way + s_flag, s_flags.height());
}

void TimeTrack::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    makeHandles();
    for (MultiNubsieSlider* slider : {m_fromFlag, m_toFlag, m_position}) {
        for (const QPointer<Nubsie>& handle : slider->getNubsies()) {
            if (handle && handle->parentWidget() != window()) {
                handle->setParent(window());
                handle->setVisible(m_handlesVisible);
            }
        }
    }
    setEnd(m_end);
}

void TimeTrack::hideEvent(QHideEvent* event)
{
    m_pressed = nullptr;
    m_position->hideNubsieBalloons();
    QWidget::hideEvent(event);
}

void TimeTrack::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    } else if (event->type() == QEvent::PaletteChange || event->type() == QEvent::StyleChange) {
        dressPosition();
    }
    QWidget::changeEvent(event);
}

void TimeTrack::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    paintScale(painter);
    paintHours(painter);
}

void TimeTrack::paintScale(QPainter& painter) const
{
    const QRectF bar(s_margin, s_bar.top(), width() - 2 * s_margin, s_bar.height());
    const QColor highlight = palette().color(QPalette::Highlight);
    const auto stretch = [&](qint64 begin, qint64 end) {
        const double left = qBound(bar.left(), xOf(begin), bar.right());
        const double right = qBound(bar.left(), xOf(end), bar.right());
        return QRectF(left, bar.top(), qMax(1.0, right - left), bar.height());
    };
    QPainterPath outline;
    outline.addRoundedRect(bar, 4, 4);
    painter.fillPath(outline, orElse(m_groundColor, palette().color(QPalette::Midlight)));
    painter.save();
    painter.setClipPath(outline);
    QColor record = orElse(m_recordColor, highlight);
    record.setAlphaF(0.35);
    for (const RecordedSpan& span : m_spans) {
        painter.fillRect(stretch(span.begin, span.end), record);
    }
    for (const RecordedEvent& event : m_events) {
        const double x = xOf(event.time);
        const double height = event.alarm ? bar.height() : bar.height() * 0.55;
        painter.fillRect(QRectF(qRound(x) - 1, bar.bottom() - height, 2, height),
            event.alarm ? orElse(m_alarmColor, Qt::red) : orElse(m_eventColor, highlight));
    }
    painter.restore();

    // What would be exported: a light veil and a frame between the poles of the flags.
    const QColor range = orElse(m_rangeColor, highlight);
    QRectF inside = stretch(m_from, m_to);
    inside.setTop(s_flags.bottom() - 1);
    QColor veil = range;
    veil.setAlphaF(0.22);
    painter.fillRect(inside.adjusted(0, 1, 0, 2), veil);
    painter.setPen(Qt::NoPen);
    painter.setBrush(range);
    painter.drawRect(QRectF(inside.left(), inside.top(), inside.width(), 2));
    painter.drawRect(QRectF(inside.left(), bar.bottom() + 1, inside.width(), 2));
    painter.drawRect(QRectF(inside.left() - 1, s_flags.bottom() - 3, 2, bar.bottom() + 5 - s_flags.bottom() + 1));
    painter.drawRect(QRectF(inside.right() - 1, s_flags.bottom() - 3, 2, bar.bottom() + 5 - s_flags.bottom() + 1));
}

void TimeTrack::paintHours(QPainter& painter) const
{
    QColor faint = palette().color(QPalette::WindowText);
    faint.setAlphaF(0.7);
    painter.setPen(faint);
    painter.setRenderHint(QPainter::Antialiasing, false);
    const int step = width() > 620 ? 2 : width() > 420 ? 3 : 6;
    QDateTime hour = QDateTime::fromMSecsSinceEpoch(begin());
    hour.setTime(QTime(hour.time().hour(), 0));
    for (int i = 0; i < 26; ++i, hour = hour.addSecs(3600)) {
        if (hour.toMSecsSinceEpoch() < begin() || hour.toMSecsSinceEpoch() > m_end) {
            continue;
        }
        const int x = qRound(xOf(hour.toMSecsSinceEpoch()));
        const bool isNamed = hour.time().hour() % step == 0;
        painter.drawLine(x, s_hours + 1, x, s_hours + (isNamed ? 5 : 3));
        if (isNamed) {
            painter.drawText(QRect(x - 30, s_hours + 5, 60, s_height - s_hours - 5), Qt::AlignHCenter | Qt::AlignTop,
                hour.time().toString(QStringLiteral("HH:mm")));
        }
    }
}
}
