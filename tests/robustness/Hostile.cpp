// SPDX-License-Identifier: MIT
// Slots that attack the sender of their signal.
#include <memory>

#include <QtCore/QEventLoop>
#include <QtCore/QTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include "Saboteur.h"
#include "Suites.h"

namespace zelkovtest
{
namespace
{
void spin(int milliseconds)
{
    QEventLoop loop;
    QTimer::singleShot(milliseconds, &loop, &QEventLoop::quit);
    loop.exec();
}

void commit(Sabotage sabotage, const Subject& victim, QWidget* otherHost)
{
    switch (sabotage) {
    case Sabotage::None:
        return;
    case Sabotage::DeleteSender:
        delete victim.object.data();
        return;
    case Sabotage::DeleteWindow:
        delete victim.widget->window();
        return;
    case Sabotage::DeleteLaterInNestedLoop:
        // Only what is asked for inside the loop also happens inside it.
        QTimer::singleShot(0, victim.object.data(), &QObject::deleteLater);
        spin(5);
        return;
    case Sabotage::Hide:
        victim.widget->hide();
        return;
    case Sabotage::Disable:
        victim.widget->setEnabled(false);
        return;
    case Sabotage::NestedLoop:
        spin(20);
        return;
    case Sabotage::Reparent:
        victim.widget->setParent(otherHost);
        if (victim.object && !victim.object->isWidgetType()) {
            victim.object->setParent(otherHost);
        }
        return;
    }
}
}

QList<QPair<QByteArray, Sabotage>> allSabotages()
{
    return {{"none", Sabotage::None}, {"deleteSender", Sabotage::DeleteSender},
        {"deleteWindow", Sabotage::DeleteWindow}, {"deleteLaterNestedLoop", Sabotage::DeleteLaterInNestedLoop},
        {"hide", Sabotage::Hide}, {"disable", Sabotage::Disable}, {"nestedLoop", Sabotage::NestedLoop},
        {"reparent", Sabotage::Reparent}};
}

bool deletes(Sabotage sabotage)
{
    return sabotage == Sabotage::DeleteSender || sabotage == Sabotage::DeleteWindow
        || sabotage == Sabotage::DeleteLaterInNestedLoop;
}

void paint(QWidget* widget)
{
    if (widget->size().isEmpty()) {
        return;
    }
    QImage image(widget->size().boundedTo(QSize(2000, 2000)), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    widget->render(&image, QPoint(), QRegion(), QWidget::DrawChildren);
}

QList<QByteArray> unpromisedSignals(const Entry& entry)
{
    QWidget host;
    const Subject subject = entry.create(&host);
    const QList<QByteArray> promised = entry.expectedSignals();
    QList<QByteArray> result;
    for (const QByteArray& signal : declaredSignals(subject.object)) {
        if (!promised.contains(signal)) {
            result << signal;
        }
    }
    return result;
}

QString runHostile(const Entry& entry, const QByteArray& signal, Sabotage sabotage)
{
    const Script* script = nullptr;
    for (const Script& candidate : entry.exercise) {
        if (candidate.fires.contains(signal)) {
            script = &candidate;
            break;
        }
    }
    if (script == nullptr) {
        return QStringLiteral("no script fires %1").arg(QLatin1String(signal));
    }

    std::unique_ptr<QWidget> otherHost(new QWidget);
    otherHost->resize(100, 100);
    QPointer<QWidget> host(new QWidget);
    host->resize(200, 150);
    const Subject subject = entry.create(host);
    host->show();

    int fired = 0;
    {
        Saboteur saboteur(subject.object, signalIndex(subject.object, signal), [&] {
            if (++fired == 1) {
                // What the sabotage stops from coming is not worth a long wait.
                setPatience(sabotage == Sabotage::None ? 5000 : 150);
                commit(sabotage, subject, otherHost.get());
            }
        });
        setPatience(5000);
        for (const Step& step : script->steps) {
            if (!subject.alive()) {
                break;
            }
            step(subject);
        }
    }
    if (subject.alive()) {
        paint(subject.widget);
    }
    QCoreApplication::processEvents();
    delete subject.object.data();
    delete host.data();
    otherHost.reset();
    QCoreApplication::processEvents();
    if (fired == 0) {
        return QStringLiteral("%1 did not fire in \"%2\"").arg(QLatin1String(signal), QLatin1String(script->name));
    }
    return {};
}
}
