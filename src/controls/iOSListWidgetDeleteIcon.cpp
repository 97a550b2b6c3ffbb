// SPDX-License-Identifier: MIT
#include "controls/iOSListWidgetDeleteIcon.h"

#include "CoreQt/Connect.h"

#include <QtCore/QCoreApplication>
#include <QtGui/QPainter>
#include <QtGui/QPixmap>

namespace vx
{
namespace
{
constexpr int deleteIconQuarterTurn = -90; // degrees

// One for all signs; a pixmap must not outlive the application.
QPixmap& deleteIconStore()
{
    static QPixmap pixmap;
    return pixmap;
}

const QPixmap& deleteIconPixmap()
{
    QPixmap& pixmap = deleteIconStore();
    if (pixmap.isNull()) {
        pixmap.load(QStringLiteral(":/iOSListWidget/iOSDeleteListEntry.png"));
        qAddPostRoutine([] { deleteIconStore() = QPixmap(); });
    }
    return pixmap;
}
}

iOSListWidgetDeleteIcon::iOSListWidgetDeleteIcon(QWidget* parent)
    : QPushButton(parent)
    , m_animation(new QPropertyAnimation(this, "deleteIconRotation", this))
{
    m_animation->setLoopCount(1);
    m_animation->setDuration(250);
    m_animation->setEasingCurve(QEasingCurve::Linear);
    vx::connect(m_animation, "2valueChanged(const QVariant&)", this, "1update()", Qt::AutoConnection);
}

iOSListWidgetDeleteIcon::~iOSListWidgetDeleteIcon() = default;

void iOSListWidgetDeleteIcon::setDeleteMode(bool on, bool animated)
{
    if (!animated) {
        m_animation->stop();
        m_deleteMode = on;
        m_rotation = on ? deleteIconQuarterTurn : 0.0;
        update();
        return;
    }
    if (m_deleteMode == on) {
        return;
    }
    m_deleteMode = on;
    m_animation->stop();
    m_animation->setStartValue(on ? 0 : deleteIconQuarterTurn);
    m_animation->setEndValue(on ? deleteIconQuarterTurn : 0);
    m_animation->start();
}

bool iOSListWidgetDeleteIcon::getDeleteMode() const
{
    return m_deleteMode;
}

double iOSListWidgetDeleteIcon::deleteIconRotation() const
{
    return m_rotation;
}

void iOSListWidgetDeleteIcon::setDeleteIconRotation(double degrees)
{
    m_rotation = degrees;
    update();
}

QSize iOSListWidgetDeleteIcon::sizeHint() const
{
    return deleteIconPixmap().size();
}

void iOSListWidgetDeleteIcon::paintEvent(QPaintEvent*)
{
    const QPixmap& pixmap = deleteIconPixmap();
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    const int dx = pixmap.width() / 2 + pixmap.width() % 2;
    const int dy = pixmap.height() / 2 + pixmap.height() % 2;
    painter.translate(dx, dy);
    painter.rotate(m_rotation);
    painter.drawPixmap(-dx, -dy, pixmap);
}
}
