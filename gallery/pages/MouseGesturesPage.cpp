// SPDX-License-Identifier: MIT
// The pad shows what each signal of its adapter means; the map is moved with the adapter's scroll helpers.
#include "MouseGesturesPage.h"

#include <functional>

#include <QtWidgets/QApplication>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QFormLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QSpinBox>

#include "../Hand.h"
#include "../cameras/Scene.h"
#include "GesturePad.h"

namespace gallery
{
namespace
{
const QStringList s_chatty = {QStringLiteral("moved"), QStringLiteral("panning")};
}

MouseGesturesPage::MouseGesturesPage(SignalLog& log, QWidget* parent)
    : Page(log, parent), m_pad(new GesturePad)
{
    m_pad->setObjectName(QStringLiteral("gesturePad"));
    m_mouse = new vx::MouseAdapter(m_pad, false);
    m_mouse->setMouseTracking(false);
    watch(m_mouse, QStringLiteral("pad"), s_chatty);
    announcePlace(m_pad, QStringLiteral("pad"));
    connectPad();

    auto* left = new QVBoxLayout;
    left->setSpacing(12);
    left->addWidget(m_pad, 3);
    left->addWidget(makeMap(), 2);
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addLayout(left, 1);
    layout->addWidget(makeSettings());
}

void MouseGesturesPage::connectPad()
{
    using Gesture = vx::MouseGesture::Ptr;
    connect(m_mouse, &vx::MouseAdapter::pressed, m_pad, [this](const Gesture& gesture) {
        if (gesture->isJustStarted()) {
            m_pad->clear();
        }
        m_pad->addPress(gesture->last().pos());
        m_pad->setVerdict(tr("Pressed"));
    });
    connect(m_mouse, &vx::MouseAdapter::panning, m_pad, [this](const Gesture& gesture) {
        m_pad->addMove(gesture->last().pos());
        m_pad->setVerdict(tr("Panning"));
    });
    connect(m_mouse, &vx::MouseAdapter::released, m_pad, [this](const Gesture& gesture) {
        m_pad->addRelease(gesture->last().pos());
        m_pad->setVerdict(tr("Released"));
    });
    connect(m_mouse, &vx::MouseAdapter::longPressed, m_pad, [this] { m_pad->setVerdict(tr("Long press")); });
    connect(m_mouse, &vx::MouseAdapter::clicked, m_pad, [this] { m_pad->setVerdict(tr("Click")); });
    connect(m_mouse, &vx::MouseAdapter::doubleClicked, m_pad, [this] { m_pad->setVerdict(tr("Double click")); });
    connect(m_mouse, &vx::MouseAdapter::longClicked, m_pad, [this] { m_pad->setVerdict(tr("Long click")); });
    connect(m_mouse, &vx::MouseAdapter::autoClicked, m_pad, [this] { m_pad->setVerdict(tr("Auto click")); });

    auto directed = [](vx::Direction direction, const QString& left, const QString& right, const QString& up,
                       const QString& down) {
        switch (direction) {
        case vx::dLeft:
            return left;
        case vx::dRight:
            return right;
        case vx::dUp:
            return up;
        default:
            return down;
        }
    };
    connect(m_mouse, &vx::MouseAdapter::swiped, m_pad, [this, directed](const Gesture& gesture) {
        m_pad->setVerdict(directed(gesture->swipeDirection(), tr("Swipe to the left"), tr("Swipe to the right"),
                                   tr("Swipe up"), tr("Swipe down")));
    });
    connect(m_mouse, &vx::MouseAdapter::panned, m_pad, [this, directed](const Gesture& gesture) {
        m_pad->setVerdict(directed(gesture->panDirection(), tr("Pan to the left"), tr("Pan to the right"),
                                   tr("Pan up"), tr("Pan down")));
    });
}

QWidget* MouseGesturesPage::makeSettings()
{
    QWidget* box = panel();
    box->setMinimumWidth(280);
    box->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Preferred);
    auto* form = new QFormLayout;
    form->setHorizontalSpacing(12);
    form->setVerticalSpacing(8);
    form->setLabelAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);

    auto addNumber = [form](const QString& text, int value, int maximum, int step, const QString& unit,
                            const std::function<void(int)>& set) {
        auto* field = new QSpinBox;
        field->setRange(0, maximum);
        field->setSingleStep(step);
        field->setValue(value);
        field->setSuffix(unit);
        field->setSpecialValueText(tr("off"));
        field->setAlignment(Qt::AlignRight);
        connect(field, QOverload<int>::of(&QSpinBox::valueChanged), field, set);
        form->addRow(text, field);
        return field;
    };
    const QString ms = tr(" ms");
    const QString px = tr(" px");
    addNumber(tr("Double click interval"), QApplication::doubleClickInterval(), 5000, 50, ms,
              [this](int value) { m_mouse->setDoubleClickInterval(value); });
    addNumber(tr("Long click interval"), 1000, 5000, 50, ms,
              [this](int value) { m_mouse->setLongClickInterval(value); });
    addNumber(tr("Auto click interval"), 1000, 5000, 50, ms,
              [this](int value) { m_mouse->setAutoClickInterval(value); });
    addNumber(tr("Swipe interval"), 1000, 5000, 50, ms, [this](int value) { m_mouse->setSwipeInterval(value); })
        ->setSpecialValueText(QString());
    addNumber(tr("Click radius"), 8, 200, 1, px, [this](int value) {
        m_mouse->setClickRadius(value);
        m_pad->setClickRadius(value);
    })->setSpecialValueText(QString());
    addNumber(tr("Double click radius"), 8, 200, 1, px, [this](int value) {
        m_mouse->setDoubleClickRadius(value);
    })->setSpecialValueText(QString());

    auto* hover = new QCheckBox(tr("Report hovering"));
    hover->setToolTip(tr("Signals entered, moved and left, also without a button held"));
    connect(hover, &QCheckBox::toggled, m_mouse, &vx::MouseAdapter::setMouseTracking);
    announcePlace(hover, QStringLiteral("hover"));

    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 14, 16, 16);
    layout->setSpacing(12);
    layout->addWidget(label(tr("Settings of the pad"), "heading"));
    layout->addLayout(form);
    layout->addWidget(hover);
    layout->addStretch(1);
    return box;
}

QWidget* MouseGesturesPage::makeMap()
{
    auto* picture = new QLabel;
    picture->setObjectName(QStringLiteral("map"));
    picture->setPixmap(Scene(0).ground(QSize(1100, 420), devicePixelRatioF()));
    m_map = new QScrollArea;
    m_map->setWidget(picture);
    m_map->setMinimumHeight(90);
    m_map->setCursor(Qt::OpenHandCursor);
    m_map->horizontalScrollBar()->setValue(260);
    m_map->verticalScrollBar()->setValue(110);

    auto* mouse = new vx::MouseAdapter(picture, true);
    m_mapMouse = mouse;
    mouse->setMouseTracking(false);
    watch(mouse, QStringLiteral("map"), s_chatty);
    connect(mouse, &vx::MouseAdapter::panning, m_map, [this, mouse](const vx::MouseGesture::Ptr& gesture) {
        mouse->scroll(m_map, gesture->lastPanOffset());
    });
    connect(mouse, &vx::MouseAdapter::swiped, m_map, [this, mouse](const vx::MouseGesture::Ptr& gesture) {
        mouse->scrollPage(m_map, gesture->swipeDirection(), m_map->viewport()->size());
    });
    return m_map;
}

MouseGesturesPage::~MouseGesturesPage()
{
    // A scroll that still runs has no owner but itself.
    m_mapMouse->stopAnimation();
}

void MouseGesturesPage::rehearse(Hand& hand)
{
    const QWidget* view = m_map->viewport();
    const QPoint middle = view->rect().center();
    hand.moveTo(m_map->viewport(), middle).press().glideTo(m_map->viewport(), middle - QPoint(90, 20), 300);
    hand.release().wait(200);

    const int w = m_pad->width();
    const int h = m_pad->height();
    hand.moveTo(m_pad, QPoint(w / 5, h * 3 / 4)).press();
    hand.glideTo(m_pad, QPoint(w * 2 / 5, h * 2 / 5), 120).glideTo(m_pad, QPoint(w * 3 / 5, h * 3 / 5), 120);
    hand.glideTo(m_pad, QPoint(w * 4 / 5, h / 2), 120).release();
}
}
