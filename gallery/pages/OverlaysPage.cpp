// SPDX-License-Identifier: MIT
// One picture under both kinds of overlay.
#include "OverlaysPage.h"

#include <functional>

#include <QtCore/QEvent>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "../cameras/Scene.h"
#include "indicators/BusyOverlayView.h"
#include "indicators/IconOverlayView.h"
#include "indicators/Label.h"

namespace gallery
{
namespace
{
// What lies on a picture looks the same in every theme. An icon gets its picture here, by its object name.
const QString s_sheet = QStringLiteral(R"(
    #busyText, #signText, #text { color: white; background: rgba(12, 16, 22, 190); border-radius: 5px; }
    #signText, #text { padding: 6px 14px; font-size: 18px; }
    #playSign, #pauseSign, #snapshotSign { qproperty-alignment: AlignCenter; }
    #playSign { qproperty-pixmap: url(:/zelkov/theme/pictures/overlays/sign-play.png); }
    #pauseSign { qproperty-pixmap: url(:/zelkov/theme/pictures/overlays/sign-pause.png); }
    #snapshotSign { qproperty-pixmap: url(:/zelkov/theme/pictures/overlays/sign-snapshot.png); }
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

OverlaysPage::OverlaysPage(SignalLog& log, QWidget* parent)
    : Page(log, parent), m_picture(new vx::Label), m_busy(new vx::BusyOverlayView(m_picture))
{
    m_picture->setScaledContents(true);
    m_picture->setPixmap(Scene(1).ground(QSize(960, 600), devicePixelRatioF()));
    m_picture->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Ignored);
    m_picture->setMinimumSize(320, 240);
    m_picture->setStyleSheet(s_sheet);

    // The overlay has the size of what it shows; where it goes is up to its owner.
    m_picture->installEventFilter(this);
    connect(m_busy, &vx::BusyOverlayView::updatedLayout, this, &OverlaysPage::centreBusy);
    watch(m_busy, QStringLiteral("busy"));

    auto* side = new QVBoxLayout;
    side->setSpacing(12);
    side->addWidget(makeConnection());
    side->addWidget(makeSigns());
    side->addStretch(1);
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(m_picture, 1);
    layout->addLayout(side);
}

QWidget* OverlaysPage::makeConnection()
{
    QWidget* box = panel();
    box->setFixedWidth(290);
    QVBoxLayout* layout = column(box, label(tr("Connection"), "heading"));
    auto* cut = new QPushButton(tr("Cut the line"));
    cut->setCheckable(true);
    auto* withText = new QCheckBox(tr("Count the seconds"));
    withText->setChecked(true);
    auto* text = new QLineEdit;
    text->setPlaceholderText(tr("Another text, %1 is the time"));
    connect(cut, &QPushButton::toggled, m_busy, [this, withText](bool on) {
        if (on) {
            m_busy->showBusyOverlay(withText->isChecked());
        } else {
            m_busy->hideBusyOverlay();
        }
    });
    connect(text, &QLineEdit::textChanged, m_busy, &vx::BusyOverlayView::setBusyText);
    auto* hint = label(tr("The spinner comes a second later: a short loss shows nothing."), "hint");
    hint->setWordWrap(true);
    layout->addWidget(cut);
    layout->addWidget(withText);
    layout->addWidget(text);
    layout->addWidget(hint);
    m_cut = cut;
    return box;
}

QWidget* OverlaysPage::makeSigns()
{
    using vx::IconOverlayView;
    QWidget* box = panel();
    box->setFixedWidth(290);
    QVBoxLayout* layout = column(box, label(tr("Signs"), "heading"));
    const auto add = [&](const QString& text, const std::function<void()>& show) {
        auto* button = new QPushButton(text);
        connect(button, &QPushButton::clicked, m_picture, show);
        layout->addWidget(button);
    };
    // Each of them makes a sign that goes and deletes itself.
    add(tr("Play"), [this] { IconOverlayView::showIcon(m_picture, QStringLiteral("playSign"), false); });
    add(tr("Pause"), [this] { IconOverlayView::showIcon(m_picture, QStringLiteral("pauseSign"), false); });
    add(tr("Text"), [this] {
        IconOverlayView::showText(m_picture, tr("Start of the recording"), QStringLiteral("signText"), false);
    });
    add(tr("Icon and text"), [this] {
        IconOverlayView::showTextAndIcon(m_picture, tr("Picture saved"), QStringLiteral("snapshotSign"), false);
    });
    return box;
}

void OverlaysPage::centreBusy()
{
    m_busy->move(m_picture->rect().center() - m_busy->rect().center());
}

bool OverlaysPage::eventFilter(QObject* object, QEvent* event)
{
    if (object == m_picture && event->type() == QEvent::Resize) {
        centreBusy();
    }
    return Page::eventFilter(object, event);
}

void OverlaysPage::rehearse(Hand& hand)
{
    hand.click(m_cut, m_cut->rect().center()).wait(2300);
}
}
