// SPDX-License-Identifier: MIT
// What is to be seen while an export runs.
#include "ExportRun.h"

#include <QtCore/QEvent>
#include <QtCore/QVariant>

#include "indicators/BusyOverlayView.h"
#include "indicators/ElidedLabel.h"

namespace client
{
namespace
{
const QSize s_size(340, 136);
const int s_margin = 16;
const int s_busyTop = 36; // where the spinner and its text stand
const int s_busyHeight = 46;
}

ExportRun::ExportRun(const QString& fileName, int duration, QWidget* parent)
    : QWidget(parent)
    , m_fileName(fileName)
    , m_title(new vx::ElidedLabel(this))
    , m_progress(new QProgressBar(this))
    , m_cancel(new QPushButton(this))
    , m_busy(new vx::BusyOverlayView(this))
{
    setObjectName(QStringLiteral("exportRun"));
    setProperty("role", QStringLiteral("panel"));
    setAttribute(Qt::WA_StyledBackground);
    setAttribute(Qt::WA_NoMousePropagation);
    m_title->setObjectName(QStringLiteral("exportRunTitle"));
    m_title->setProperty("role", QStringLiteral("heading"));
    m_title->setAlignment(Qt::AlignCenter);
    m_progress->setObjectName(QStringLiteral("exportProgress"));
    m_progress->setRange(0, duration);
    m_progress->setTextVisible(false);
    m_cancel->setObjectName(QStringLiteral("exportRunCancel"));
    m_cancel->setFocusPolicy(Qt::NoFocus);
    connect(m_cancel, &QPushButton::clicked, this, [this] { end(false); });
    connect(m_busy, &vx::BusyOverlayView::updatedLayout, this, &ExportRun::arrange);
    m_busy->showBusyOverlay(true);

    m_end.setSingleShot(true);
    connect(&m_end, &QTimer::timeout, this, [this] { end(true); });
    m_end.start(duration);
    m_clock.start();
    m_steps.setInterval(40);
    connect(&m_steps, &QTimer::timeout, this,
        [this] { m_progress->setValue(qMin(int(m_clock.elapsed()), m_progress->maximum())); });
    retranslate();
    place();
}

void ExportRun::place()
{
    const QRect around = parentWidget()->rect();
    setFixedSize(qMin(s_size.width(), around.width()), qMin(s_size.height(), around.height()));
    move(around.center() - rect().center());
    arrange();
    raise();
}

void ExportRun::arrange()
{
    const int inside = qMax(0, width() - 2 * s_margin);
    m_title->setGeometry(s_margin, 12, inside, 20);
    m_busy->move((width() - m_busy->width()) / 2, s_busyTop + (s_busyHeight - m_busy->height()) / 2);
    const QSize button = m_cancel->sizeHint();
    const int below = height() - 12 - button.height();
    m_cancel->setGeometry(width() - s_margin - button.width(), below, button.width(), button.height());
    m_progress->setGeometry(
        s_margin, below + button.height() / 2 - 3, qMax(0, inside - button.width() - 14), 6);
}

void ExportRun::end(bool complete)
{
    if (m_ended) {
        return;
    }
    m_ended = true;
    m_end.stop();
    Q_EMIT finished(complete);
}

void ExportRun::retranslate()
{
    m_title->setText(tr("Exporting %1").arg(m_fileName));
    m_busy->setBusyText(tr("Running for %1"));
    m_cancel->setText(tr("Cancel"));
    arrange();
}

void ExportRun::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    m_steps.start();
    arrange();
}

void ExportRun::hideEvent(QHideEvent* event)
{
    m_steps.stop();
    QWidget::hideEvent(event);
}

void ExportRun::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
    QWidget::changeEvent(event);
}
}
