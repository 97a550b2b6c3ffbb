// SPDX-License-Identifier: MIT
// Many short lives.
#include <memory>

#include <QtCore/QSet>
#include <QtWidgets/QApplication>

#include "Suites.h"

namespace zelkovtest
{
namespace
{
void liveOnce(const Entry& entry)
{
    const std::unique_ptr<QWidget> host(new QWidget);
    host->resize(120, 90);
    entry.create(host.get());
    host->show();
    paint(host.get());
}

QSet<QWidget*> widgets()
{
    const QWidgetList all = QApplication::allWidgets();
    return QSet<QWidget*>(all.begin(), all.end());
}
}

QString runLeakCycles(const Entry& entry, int cycles)
{
    // The first life may make what Qt keeps for the whole process.
    liveOnce(entry);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    const QSet<QWidget*> before = widgets();
    for (int i = 0; i < cycles; ++i) {
        liveOnce(entry);
        if (i % 100 == 99) {
            QCoreApplication::processEvents();
        }
    }
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    const QSet<QWidget*> left = widgets() - before;
    if (left.isEmpty()) {
        return {};
    }
    const QString text = QStringLiteral("%1 widgets outlived %2 cycles, one is a %3");
    return text.arg(left.size()).arg(cycles).arg(QLatin1String((*left.begin())->metaObject()->className()));
}
}
