// SPDX-License-Identifier: MIT
// A window whose badge counts the clicks on it.
#include "indicators/BadgeWidget.h"
#include "input/MouseAdapter.h"

#include <QApplication>
#include <QLabel>
#include <QTimer>
#include <QVBoxLayout>

int main(int argc, char* argv[])
{
    QApplication application(argc, argv);

    QWidget window;
    window.setWindowTitle(QStringLiteral("Hello"));
    window.resize(240, 160);

    vx::BadgeWidget badge(&window);
    badge.setBadgeSize(QSize(48, 48));
    badge.setBadgeLabel(QStringLiteral("0"));

    QVBoxLayout layout(&window);
    QLabel label(QStringLiteral("Click me"));
    layout.addWidget(&badge);
    layout.addWidget(&label);

    int clicks = 0;
    vx::MouseAdapter adapter(&window, false);
    QObject::connect(&adapter, &vx::MouseAdapter::clicked, &badge, [&](const vx::MouseGesture::Ptr& /*gesture*/) {
        badge.setBadgeLabel(QString::number(++clicks));
    });

    window.show();
    if (application.arguments().contains(QStringLiteral("--once"))) {
        QTimer::singleShot(0, &application, &QCoreApplication::quit);
    }
    const int result = application.exec();
    return badge.hasBadge() ? result : 1;
}
