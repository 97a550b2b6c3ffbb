// SPDX-License-Identifier: MIT
// An assistant whose steps slide, and cameras that take turns.
#include "PagesPage.h"

#include <QtCore/QDateTime>
#include <QtWidgets/QFormLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../cameras/CameraTile.h"
#include "../Hand.h"
#include "views/NavigationViewController.h"
#include "views/WidgetSlideshow.h"

namespace gallery
{
namespace
{
const int s_frameMillis = 40;
const int s_slideMillis = 350;
}

PagesPage::PagesPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(makeAssistant(), 1);
    layout->addWidget(makeSlideshow(), 1);

    m_frames.setInterval(s_frameMillis);
    connect(&m_frames, &QTimer::timeout, this, [this] {
        const qint64 now = QDateTime::currentMSecsSinceEpoch();
        for (CameraTile* camera : m_cameras) {
            if (camera->isVisible()) {
                camera->advance(now);
            }
        }
    });
    showState();
}

QWidget* PagesPage::makeStep(
    const QString& title, const QString& text, const QVector<QPair<QString, QString>>& rows)
{
    auto* step = new QWidget;
    step->setObjectName(title);
    auto* layout = new QVBoxLayout(step);
    layout->setContentsMargins(16, 12, 16, 12);
    layout->setSpacing(10);
    layout->addWidget(label(title, "title"));
    auto* explanation = label(text, "hint");
    explanation->setWordWrap(true);
    layout->addWidget(explanation);
    auto* form = new QFormLayout;
    form->setHorizontalSpacing(12);
    form->setVerticalSpacing(8);
    for (const auto& row : rows) {
        form->addRow(row.first, new QLineEdit(row.second));
    }
    layout->addLayout(form);
    layout->addStretch(1);
    return step;
}

QWidget* PagesPage::makeAssistant()
{
    m_pages = new vx::NavigationViewController(s_slideMillis, QEasingCurve::OutCubic);
    watch(m_pages, QStringLiteral("pages"));
    m_pages->addWidget(makeStep(tr("Camera"), tr("What the new camera is called and where it hangs."),
        {{tr("Name"), tr("North gate")}, {tr("Building"), tr("Yard")}}));
    m_pages->addWidget(makeStep(tr("Network"), tr("Where the camera is reached. The port is rarely another one."),
        {{tr("Address"), QStringLiteral("192.0.2.17")}, {tr("Port"), QStringLiteral("554")}}));
    m_pages->addWidget(makeStep(tr("Recording"), tr("How long pictures are kept, and how many a second."),
        {{tr("Days"), QStringLiteral("30")}, {tr("Pictures"), QStringLiteral("25")}}));

    m_back = new QPushButton(tr("Back"));
    m_forward = new QPushButton(tr("Next"));
    m_forward->setProperty("role", QStringLiteral("primary"));
    m_place = label(QString(), "hint");
    connect(m_back, &QPushButton::clicked, this, [this] { turn(-1); });
    connect(m_forward, &QPushButton::clicked, this, [this] { turn(1); });
    connect(m_pages, &vx::NavigationViewController::viewDidAppear, this, [this] { showState(); });

    QWidget* box = panel();
    auto* row = new QHBoxLayout;
    row->setContentsMargins(16, 0, 16, 0);
    row->setSpacing(8);
    row->addWidget(m_place);
    row->addStretch(1);
    row->addWidget(m_back);
    row->addWidget(m_forward);
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(1, 4, 1, 16);
    layout->addWidget(m_pages, 1);
    layout->addLayout(row);
    return box;
}

QWidget* PagesPage::makeSlideshow()
{
    const char* const names[] = {QT_TR_NOOP("Main street"), QT_TR_NOOP("Reception"), QT_TR_NOOP("Container yard")};
    QList<QWidget*> widgets;
    int seed = 0;
    for (const char* name : names) {
        auto* camera = new CameraTile(tr(name), seed++, nullptr);
        camera->setObjectName(tr(name));
        m_cameras.append(camera);
        widgets.append(camera);
    }
    m_show = new vx::WidgetSlideshow(widgets);
    watch(m_show, QStringLiteral("slideshow"));

    QWidget* box = panel();
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(16, 12, 16, 16);
    layout->setSpacing(8);
    layout->addWidget(label(tr("Slideshow"), "heading"));
    layout->addWidget(label(tr("The next camera every five seconds"), "hint"));
    layout->addWidget(m_show, 1);
    return box;
}

void PagesPage::turn(int by)
{
    const int target = m_pages->currentIndex() + by;
    if (target >= 0 && target < m_pages->count()) {
        m_pages->setCurrentIndexWithAnimation(target);
    }
}

void PagesPage::showState()
{
    m_place->setText(tr("Step %1 of %2").arg(m_pages->currentIndex() + 1).arg(m_pages->count()));
    m_back->setEnabled(m_pages->currentIndex() > 0);
    m_forward->setEnabled(m_pages->currentIndex() < m_pages->count() - 1);
}

void PagesPage::showEvent(QShowEvent* event)
{
    m_frames.start();
    Page::showEvent(event);
}

void PagesPage::hideEvent(QHideEvent* event)
{
    m_frames.stop();
    Page::hideEvent(event);
}

void PagesPage::rehearse(Hand& hand)
{
    hand.click(m_forward, m_forward->rect().center()).wait(500);
    hand.call(m_show, [this] { m_show->setCurrentIndexWithAnimation(1); }).wait(400);
}
}
