// SPDX-License-Identifier: MIT
// A time line over a synthetic recording, and small sliders with one kind of handle each.
#include "TimeLinePage.h"

#include <QtCore/QDateTime>
#include <QtCore/QEvent>
#include <QtGui/QPainter>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QVBoxLayout>

#include <cmath>

#include "../cameras/Scene.h"
#include "../Hand.h"
#include "popover/Manager.h"
#include "sliders/MultiNubsieSlider.h"

namespace gallery
{
namespace
{
using vx::MultiNubsieSlider;
using vx::Nubsie;

enum Handle : int
{
    hMoment = 1,
    hStart = 2,
    hEnd = 3
};

const int s_secondsOfDay = 86400;
const int s_dayHandle = 24;
const QStringList s_floods
    = {QStringLiteral("nubsieValueChangedByUser"), QStringLiteral("triggerNubsieRepaintQueued")};

QDateTime midnight()
{
    return QDateTime(QDate(2026, 3, 14), QTime(0, 0));
}

QString clock(int seconds)
{
    return QTime(0, 0).addSecs(qMin(seconds, s_secondsOfDay - 1)).toString(QStringLiteral("HH:mm:ss"));
}

// A round handle, large enough to stay crisp while it grows.
QPixmap knob(const QColor& color)
{
    QPixmap pixmap(96, 96);
    pixmap.fill(Qt::transparent);
    QPainter p(&pixmap);
    p.setRenderHint(QPainter::Antialiasing);
    p.setPen(Qt::NoPen);
    p.setBrush(QColor(0, 0, 0, 50));
    p.drawEllipse(QRectF(3, 6, 90, 90));
    p.setBrush(Qt::white);
    p.drawEllipse(QRectF(3, 2, 90, 90));
    p.setBrush(color);
    p.drawEllipse(QRectF(13, 12, 70, 70));
    p.setBrush(QColor(255, 255, 255, 60));
    p.drawEllipse(QRectF(24, 17, 48, 28));
    return pixmap;
}

void dress(MultiNubsieSlider* slider, int id, const QColor& color, int size)
{
    slider->setStandardSize(id, QSize(size, size));
    slider->setDraggedSize(id, QSize(size * 3 / 2, size * 3 / 2));
    slider->setIcon(id, knob(color));
}

/// The hours below a time line, where its handle stands at that time.
class DayRuler : public QWidget
{
public:
    explicit DayRuler(QWidget* parent)
        : QWidget(parent)
    {
        setFixedHeight(26);
        setAttribute(Qt::WA_TransparentForMouseEvents);
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter p(this);
        const double way = width() - s_dayHandle;
        QColor faint = palette().color(QPalette::WindowText);
        faint.setAlphaF(0.65);
        p.setPen(faint);
        for (int hour = 0; hour <= 24; ++hour) {
            const int x = int(s_dayHandle / 2 + way * hour / 24);
            const bool named = hour % 3 == 0;
            p.drawLine(x, 0, x, named ? 6 : 3);
            if (named) {
                QRect box(x - 30, 8, 60, 16);
                box.moveLeft(qBound(0, box.left(), width() - box.width()));
                const int side = hour == 0 ? Qt::AlignLeft : hour == 24 ? Qt::AlignRight : Qt::AlignHCenter;
                p.drawText(box, side | Qt::AlignTop, QStringLiteral("%1:00").arg(hour, 2, 10, QLatin1Char('0')));
            }
        }
    }
};
}

/// The picture of a camera at any moment of the day, with the moment burned in.
class RecordingView : public QWidget
{
public:
    RecordingView()
        : m_scene(3)
    {
        setMinimumSize(320, 160);
        setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    }

    void setMoment(int seconds)
    {
        m_seconds = seconds;
        update();
    }

protected:
    void resizeEvent(QResizeEvent*) override { m_ground = m_scene.ground(size(), devicePixelRatioF()); }

    void paintEvent(QPaintEvent*) override
    {
        QPainter p(this);
        p.setRenderHint(QPainter::Antialiasing);
        const QSize ground(int(width() * Scene::s_width), height());
        p.save();
        p.translate((width() - ground.width()) / 2, 0);
        p.drawPixmap(0, 0, m_ground);
        // A second of the day is a tenth of one in the picture, or nothing could be followed.
        m_scene.drawMovers(p, ground, qint64(m_seconds) * 100);
        p.restore();
        // Night falls and goes.
        const double sun = std::cos((m_seconds / double(s_secondsOfDay) - 0.5) * 2 * M_PI);
        p.fillRect(rect(), QColor(6, 10, 30, qBound(0, int(90 - 150 * sun), 170)));
        QFont font = this->font();
        font.setPixelSize(14);
        font.setBold(true);
        p.setFont(font);
        const QString texts[] = {QStringLiteral("Road 4"), QStringLiteral("2026-03-14  ") + clock(m_seconds)};
        const int places[] = {Qt::AlignLeft | Qt::AlignTop, Qt::AlignRight | Qt::AlignTop};
        for (int i = 0; i < 2; ++i) {
            p.setPen(QColor(0, 0, 0, 180));
            p.drawText(rect().adjusted(13, 11, -11, 0), places[i], texts[i]);
            p.setPen(Qt::white);
            p.drawText(rect().adjusted(12, 10, -12, 0), places[i], texts[i]);
        }
    }

private:
    Scene m_scene;
    QPixmap m_ground;
    int m_seconds = 0;
};

TimeLinePage::TimeLinePage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    // For the balloons of handles.
    vx::PopoverWidget::Manager::init(1000);

    auto* below = new QHBoxLayout;
    below->setSpacing(12);
    below->addWidget(makeCluster(), 3);
    below->addWidget(makeKinds(), 4);
    below->addWidget(makeUpright(), 2);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(12);
    layout->addWidget(makeDay(), 1);
    layout->addLayout(below);
}

MultiNubsieSlider* TimeLinePage::makeSlider(const QString& name, Qt::Orientation orientation)
{
    auto* slider = new MultiNubsieSlider(nullptr, this);
    slider->setObjectName(QStringLiteral("timeLine"));
    slider->setOrientation(orientation);
    slider->setDrawTrack(true);
    if (orientation == Qt::Horizontal) {
        slider->setFixedHeight(44);
    } else {
        slider->setFixedWidth(44);
    }
    watch(slider, name, s_floods);
    m_sliders.append(slider);
    return slider;
}

QWidget* TimeLinePage::makeDay()
{
    QWidget* box = panel();
    m_recording = new RecordingView;
    m_moment = label(QString(), "title");
    m_range = label(QString());
    auto* hint
        = label(tr("Drag the blue handle through the day. The farther you pull away from the bar, the slower it "
                   "goes, down to single seconds. The flags go with the ends of the range."),
            "hint");
    hint->setWordWrap(true);
    auto* words = new QVBoxLayout;
    words->setSpacing(8);
    words->addWidget(label(tr("A day of recordings"), "heading"));
    words->addWidget(m_moment);
    words->addWidget(m_range);
    words->addWidget(hint);
    words->addStretch(1);
    auto* above = new QHBoxLayout;
    above->setSpacing(16);
    above->addWidget(m_recording, 3);
    above->addLayout(words, 2);

    m_day = makeSlider(QStringLiteral("day"));
    m_day->setFixedHeight(76);
    m_day->setSliderBarExtent(10);
    m_day->setProgressColor(QColor(70, 150, 245));
    m_day->setDrawProgress(true);
    announcePlace(m_day, QStringLiteral("day"));
    announcePlace(m_day->getFirstFlag(), QStringLiteral("firstFlag"));
    connect(m_day, &MultiNubsieSlider::nubsieValueChangedByUser, this, [this](int id) {
        if (id == hMoment) {
            showMoment();
        } else {
            showRange();
        }
    });
    m_ruler = new DayRuler(m_day);
    m_day->installEventFilter(this);

    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 10);
    layout->setSpacing(4);
    layout->addLayout(above, 1);
    layout->addWidget(m_day);
    return box;
}

QWidget* TimeLinePage::makeCluster()
{
    QWidget* box = panel();
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(8);
    layout->addWidget(label(tr("Handles that share a scale"), "heading"));
    auto* hint = label(tr("Close values are pushed apart. Take one out, and its neighbours drift home."), "hint");
    hint->setWordWrap(true);
    layout->addWidget(hint);
    m_cluster = makeSlider(QStringLiteral("cluster"));
    layout->addStretch(1);
    layout->addWidget(m_cluster);
    layout->addStretch(1);
    return box;
}

void TimeLinePage::addKind(QGridLayout* grid, const QString& text, MultiNubsieSlider* slider)
{
    const int row = grid->rowCount();
    auto* number = label(QString());
    number->setFixedWidth(38);
    number->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    connect(slider, &MultiNubsieSlider::nubsieValueChangedByUser, number,
        [number](int, int value) { number->setNum(value); });
    grid->addWidget(label(text, "hint"), row, 0);
    grid->addWidget(slider, row, 1);
    grid->addWidget(number, row, 2);
    m_kinds.append(slider);
    m_values.append(number);
}

QWidget* TimeLinePage::makeKinds()
{
    QWidget* box = panel();
    auto* grid = new QGridLayout(box);
    grid->setContentsMargins(16, 12, 16, 14);
    grid->setHorizontalSpacing(12);
    grid->setVerticalSpacing(2);
    grid->addWidget(label(tr("Kinds of handles"), "heading"), 0, 0, 1, 3);
    m_discrete = makeSlider(QStringLiteral("discrete"));
    m_spring = makeSlider(QStringLiteral("spring"));
    m_inverted = makeSlider(QStringLiteral("inverted"));
    addKind(grid, tr("Five steps"), m_discrete);
    addKind(grid, tr("Spring"), m_spring);
    addKind(grid, tr("Inverted"), m_inverted);
    grid->setColumnStretch(1, 1);
    return box;
}

QWidget* TimeLinePage::makeUpright()
{
    QWidget* box = panel();
    m_left = makeSlider(QStringLiteral("left"), Qt::Vertical);
    m_right = makeSlider(QStringLiteral("right"), Qt::Vertical);
    m_kinds << m_left << m_right;
    m_numbers = new QCheckBox(tr("Numbers"));
    m_fading = new QCheckBox(tr("Fading"));
    m_jumping = new QCheckBox(tr("Jumping"));
    m_numbers->setToolTip(tr("Minimum and maximum while a handle is in use"));
    m_fading->setToolTip(tr("The bar fades when the pointer leaves"));
    m_jumping->setToolTip(tr("A click on the track moves the only handle"));
    auto* layout = new QHBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(4);
    auto* switches = new QVBoxLayout;
    switches->setSpacing(8);
    switches->addWidget(label(tr("Features"), "heading"));
    for (QCheckBox* box2 : {m_numbers, m_fading, m_jumping}) {
        connect(box2, &QCheckBox::toggled, this, &TimeLinePage::applySwitches);
        switches->addWidget(box2);
    }
    switches->addStretch(1);
    layout->addLayout(switches, 1);
    layout->addWidget(m_left);
    layout->addWidget(m_right);
    return box;
}

void TimeLinePage::applySwitches()
{
    QFlags<MultiNubsieSlider::EMultiNubsieSliderFeatures> features;
    features.setFlag(MultiNubsieSlider::emfShowRangeLabels, m_numbers->isChecked());
    features.setFlag(MultiNubsieSlider::emfFadeWhenInactive, m_fading->isChecked());
    features.setFlag(MultiNubsieSlider::emfJumpOnTrackClick, m_jumping->isChecked());
    for (MultiNubsieSlider* slider : qAsConst(m_kinds)) {
        slider->setFeatures(features);
        slider->setOpacity(1.0);
        slider->update();
    }
}

// Handles are children of the window, so the page has to be in it first.
void TimeLinePage::addHandles()
{
    m_day->addNubsie(QStringLiteral("start"), 8 * 3600, 0, s_secondsOfDay, hStart);
    m_day->addNubsie(QStringLiteral("end"), 15 * 3600 + 1800, 0, s_secondsOfDay, hEnd);
    m_day->addNubsie(QStringLiteral("moment"), 12 * 3600, 0, s_secondsOfDay, hMoment);
    dress(m_day, hStart, QColor(40, 160, 90), s_dayHandle);
    dress(m_day, hEnd, QColor(214, 62, 62), s_dayHandle);
    dress(m_day, hMoment, QColor(31, 102, 214), s_dayHandle);
    m_day->setToolTipText(hStart, tr("Start of the range to export"));
    m_day->setToolTipText(hEnd, tr("End of the range to export"));
    m_day->setToolTipText(hMoment, tr("Moment that is shown"));
    m_day->addFeatures(hMoment, Nubsie::enfDateMode);
    m_day->setStartEndDates(hMoment, midnight(), midnight().addDays(1));
    m_day->setPopoverFeatures(hMoment, vx::PopoverWidget::Balloon::ebfNoHeader);
    m_day->setProgress(0.82);
    m_day->showFlags(true);

    const QColor colors[] = {QColor(31, 102, 214), QColor(214, 62, 62), QColor(40, 160, 90), QColor(208, 140, 20),
        QColor(128, 84, 200), QColor(30, 150, 170)};
    const int values[] = {44, 46, 48, 49, 51, 78};
    for (int i = 0; i < 6; ++i) {
        m_cluster->addNubsie(QStringLiteral("handle"), values[i], 0, 100, i);
        dress(m_cluster, i, colors[i], 22);
    }

    m_discrete->addNubsie(QStringLiteral("discrete"), 2, 0, 4, 0);
    dress(m_discrete, 0, colors[0], 24);
    m_discrete->addFeatures(0, Nubsie::enfDiscreteSteps | Nubsie::enfValueBadge);
    m_discrete->setBackColor(0, colors[0]);
    m_spring->addNubsie(QStringLiteral("spring"), 0, -100, 100, 0);
    dress(m_spring, 0, colors[3], 24);
    m_spring->addFeatures(0, Nubsie::enfResetOnRelease);
    m_inverted->addNubsie(QStringLiteral("inverted"), 3, 0, 10, 0);
    dress(m_inverted, 0, colors[1], 24);
    m_inverted->addFeatures(0, Nubsie::enfInverted | Nubsie::enfValueBadge);
    m_left->addNubsie(QStringLiteral("left"), 70, 0, 100, 0);
    dress(m_left, 0, colors[5], 24);
    m_right->addNubsie(QStringLiteral("right"), 30, 0, 100, 0);
    dress(m_right, 0, colors[4], 24);

    for (int i = 0; i < m_values.size(); ++i) {
        m_values.at(i)->setNum(m_kinds.at(i)->value(0));
    }
    showMoment();
    showRange();
}

void TimeLinePage::showEvent(QShowEvent* event)
{
    Page::showEvent(event);
    if (m_day->getNubsies().isEmpty()) {
        addHandles();
        // The page may scroll, and with it the sliders, which hear nothing of it.
        for (QWidget* above = parentWidget(); above; above = above->parentWidget()) {
            auto* area = qobject_cast<QScrollArea*>(above);
            if (!area) {
                continue;
            }
            for (MultiNubsieSlider* slider : qAsConst(m_sliders)) {
                connect(area->verticalScrollBar(), &QScrollBar::valueChanged, slider,
                    &MultiNubsieSlider::repaintNubsiesImmediately);
                connect(area->horizontalScrollBar(), &QScrollBar::valueChanged, slider,
                    &MultiNubsieSlider::repaintNubsiesImmediately);
                for (const QPointer<Nubsie>& nubsie : slider->getNubsies()) {
                    nubsie->setClipWidget(this);
                }
            }
            break;
        }
    }
}

bool TimeLinePage::eventFilter(QObject* object, QEvent* event)
{
    if (object == m_day && (event->type() == QEvent::Resize || event->type() == QEvent::Show)) {
        m_ruler->setGeometry(0, m_day->height() - m_ruler->height(), m_day->width(), m_ruler->height());
        // A colour brings the picture back in full size.
        m_day->setFirstFlagColor(MultiNubsieSlider::efcGreen);
        m_day->setSecondFlagColor(MultiNubsieSlider::efcRed);
        placeFlags();
    }
    return Page::eventFilter(object, event);
}

void TimeLinePage::showMoment()
{
    // As the balloon has it: between two whole seconds it is still the first.
    const int seconds = int(midnight().secsTo(m_day->getDate(hMoment)));
    m_recording->setMoment(seconds);
    m_moment->setText(clock(seconds));
}

void TimeLinePage::showRange()
{
    const int start = m_day->value(hStart);
    const int end = m_day->value(hEnd);
    m_range->setText(tr("To export: %1 to %2").arg(clock(qMin(start, end)), clock(qMax(start, end))));
    placeFlags();
}

// The poles stand a little inside the pictures, left in the first and right in the second.
void TimeLinePage::placeFlags()
{
    if (m_day->getNubsies().isEmpty()) {
        return;
    }
    const int size = m_day->height() / 2;
    const int way = m_day->width() - s_dayHandle;
    const auto pole
        = [&](int id) { return s_dayHandle / 2 + int(double(way) * m_day->value(id) / s_secondsOfDay); };
    m_day->getFirstFlag()->setGeometry(pole(hStart) - size * 15 / 100, 0, size, size);
    m_day->getSecondFlag()->setGeometry(pole(hEnd) - size * 85 / 100, 0, size, size);
}

void TimeLinePage::rehearse(Hand& hand)
{
    const int middle = m_day->width() / 2 - 1;
    const int line = m_day->height() / 2 - 5;
    hand.moveTo(m_day, QPoint(middle, line))
        .press()
        .glideTo(m_day, QPoint(middle + 60, line), 300)
        .glideTo(m_day, QPoint(middle + 90, line + 120), 300)
        .release()
        .wait(700);
}
}
