// SPDX-License-Identifier: MIT
#include "indicators/BusyOverlayView.h"

#include "CoreQt/Connect.h"
#include "ZelkovUtils/TimeUtils.h"
#include "indicators/BadgeWidget.h"
#include "indicators/OverlayGeometry.h"

#include <QtCore/QPointer>
#include <QtGui/QFontMetrics>
#include <QtWidgets/QLabel>

#include <limits>

namespace vx
{
BusyOverlayView::BusyOverlayView(QWidget* parent)
    : QWidget(parent)
    , m_busySeconds(1)
{
    setObjectName(QStringLiteral("BusyOverlayWidget"));
    setAttribute(Qt::WA_StyledBackground); // the ground of a style sheet, and nothing else
    m_delayTimer.setSingleShot(true);
    m_delayTimer.setInterval(1000);
    m_secondsTimer.setSingleShot(false);
    m_secondsTimer.setInterval(1000);
    m_busyIcon = new BadgeWidget(this);
    m_busyIcon->setObjectName(QStringLiteral("busyIcon"));
    m_busyIcon->setAlignment(Qt::AlignCenter);
    m_busyIcon->setBadgeSize(QSize(20, 20));
    m_busyLabel = new QLabel(this);
    m_busyLabel->setAlignment(Qt::AlignHCenter);
    m_busyLabel->setObjectName(QStringLiteral("busyText"));
    m_baseFontSize = m_busyLabel->font().pointSize();
    vx::connect(&m_delayTimer, "2timeout()", this, "1showBusyIcon()", Qt::AutoConnection);
    vx::connect(&m_secondsTimer, "2timeout()", this, "1updateBusyTime()", Qt::AutoConnection);
    hide();
    arrangeWidgets();
}

BusyOverlayView::~BusyOverlayView() = default;

void BusyOverlayView::showBusyOverlay(bool showText)
{
    m_delayTimer.start();
    m_showText = showText;
}

void BusyOverlayView::hideBusyOverlay()
{
    m_delayTimer.stop();
    m_secondsTimer.stop();
    m_busySeconds = 1;
    m_busyIcon->setBadgeBusy(false);
    hide();
}

void BusyOverlayView::showBusyText()
{
    m_busyLabel->show();
    arrangeWidgets();
}

void BusyOverlayView::hideBusyText()
{
    m_busyLabel->hide();
}

void BusyOverlayView::setBusySeconds(int seconds)
{
    m_busySeconds = seconds;
    if (seconds != 0) {
        updateBusyTime();
    }
}

QString BusyOverlayView::busyText() const
{
    return m_busyText;
}

void BusyOverlayView::setBusyText(const QString& text)
{
    m_busyText = text;
}

void BusyOverlayView::clearBusyText()
{
    m_busyText.clear();
}

void BusyOverlayView::showBusyIcon()
{
    show();
    m_busyIcon->setBadgeBusy(true);
    if (!m_showText) {
        m_busyLabel->hide();
        return;
    }
    m_secondsTimer.start();
    m_busyLabel->show();
    arrangeWidgets();
}

void BusyOverlayView::updateBusyTime()
{
    const QPointer<BusyOverlayView> alive(this);
    m_busyLabel->show();
    arrangeWidgets();
    if (!alive) {
        return;
    }
    const QString time = TimeUtils::formatTimeUserFriendly(m_busySeconds);
    QString text;
    if (m_busyText.isEmpty()) {
        text = tr("Connection lost since %1").arg(time);
    } else if (m_busyText.contains(QLatin1String("%1"), Qt::CaseSensitive)) {
        text = m_busyText.arg(time);
    } else {
        text = m_busyText;
    }
    m_busyLabel->setText(text);
    m_busySeconds = m_busySeconds == std::numeric_limits<int>::max() ? m_busySeconds : m_busySeconds + 1;
    arrangeWidgets(); // another text needs another fit
}

void BusyOverlayView::findOptimumFontSize()
{
    const QWidget* const around = parentWidget();
    if (m_busyLabel->text().isEmpty() || !around) {
        return;
    }
    // Each fit starts from the base size: the text never grows beyond it.
    QFont font = m_busyLabel->font();
    if (m_baseFontSize > 0) {
        font.setPointSize(m_baseFontSize);
    }
    m_busyLabel->setFont(font);
    const int textWidth = QFontMetrics(m_busyLabel->font()).horizontalAdvance(m_busyLabel->text());
    const BusyTextFit fit = fitBusyText(around->width(), textWidth, font.pointSizeF());
    switch (fit.fit) {
    case BusyTextFit::Fits: break; // shown or not, as it was
    case BusyTextFit::Shrink:
        font.setPointSizeF(fit.pointSize);
        m_busyLabel->setFont(font);
        m_busyLabel->show();
        break;
    case BusyTextFit::TooLong: m_busyLabel->hide(); break;
    }
}

void BusyOverlayView::arrangeWidgets()
{
    findOptimumFontSize();
    const QFontMetrics metrics(m_busyLabel->font());
    const QString text = m_busyLabel->text();
    const bool hasText = !text.isEmpty() && m_busyLabel->isVisible();
    const BusyLayout layout
        = busyLayout(m_busyIcon->size(), hasText, hasText ? metrics.horizontalAdvance(text) : 0, metrics.height());
    m_busyIcon->move(layout.icon);
    m_busyLabel->setGeometry(layout.label);
    setFixedSize(layout.size);
    Q_EMIT updatedLayout(false);
}
}
