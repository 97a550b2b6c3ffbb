// SPDX-License-Identifier: MIT
// Base of every test class.
#include "TestCase.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QMutex>
#include <QtCore/QMutexLocker>
#include <QtCore/QVector>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QWidget>

namespace
{
struct Messages
{
    QMutex mutex;
    QStringList unexpected;
    QVector<QRegularExpression> expected;
    QtMessageHandler previous = nullptr;
};

Messages& messages()
{
    static Messages instance;
    return instance;
}

void collect(QtMsgType type, const QMessageLogContext& context, const QString& text)
{
    Messages& all = messages();
    if (type == QtWarningMsg || type == QtCriticalMsg) {
        const QMutexLocker lock(&all.mutex);
        // The offscreen plug-in says so of raise(), size hints and grabs; it is no fault of ours.
        if (text.startsWith(QLatin1String("This plugin does not support "))) {
            return;
        }
        for (int i = 0; i < all.expected.size(); ++i) {
            if (all.expected.at(i).match(text).hasMatch()) {
                all.expected.removeAt(i);
                return;
            }
        }
        all.unexpected << text;
        // Not handed on: Qt Test would print it, and the one report at the end of the function is enough.
        return;
    }
    if (all.previous != nullptr) {
        all.previous(type, context, text);
    }
}
}

namespace zelkovtest
{
TestCase::TestCase() = default;
TestCase::~TestCase() = default;

void TestCase::expectWarning(const QRegularExpression& pattern)
{
    const QMutexLocker lock(&messages().mutex);
    messages().expected << pattern;
}

QStringList TestCase::unexpectedWarnings()
{
    const QMutexLocker lock(&messages().mutex);
    return messages().unexpected;
}

void TestCase::forgetWarnings()
{
    const QMutexLocker lock(&messages().mutex);
    messages().unexpected.clear();
    messages().expected.clear();
}

QStringList TestCase::leftovers()
{
    QStringList result;
    const QWidgetList widgets = QApplication::allWidgets();
    for (const QWidget* widget : widgets) {
        if (widget->parentWidget() == nullptr && widget->windowType() != Qt::Desktop
            && !widget->inherits("QTipLabel")) {
            result << QStringLiteral("widget %1 \"%2\"").arg(QLatin1String(widget->metaObject()->className()),
                widget->objectName());
        }
    }
    if (QGuiApplication::mouseButtons() != Qt::NoButton) {
        result << QStringLiteral("a pressed mouse button");
    }
    if (QApplication::activePopupWidget() != nullptr) {
        result << QStringLiteral("a popup");
    }
    if (QApplication::activeModalWidget() != nullptr) {
        result << QStringLiteral("a modal window");
    }
    if (QApplication::overrideCursor() != nullptr) {
        result << QStringLiteral("an override cursor");
    }
    return result;
}

void TestCase::init()
{
    forgetWarnings();
    messages().previous = qInstallMessageHandler(&collect);
}

void TestCase::cleanup()
{
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    qInstallMessageHandler(messages().previous);
    const QStringList warnings = unexpectedWarnings();
    QVERIFY2(warnings.isEmpty(), qPrintable(QStringLiteral("unexpected: ") + warnings.join(QLatin1String(" | "))));
    {
        const QMutexLocker lock(&messages().mutex);
        QVERIFY2(messages().expected.isEmpty(), "an announced warning did not come");
    }
    const QStringList left = leftovers();
    QVERIFY2(left.isEmpty(), qPrintable(QStringLiteral("left over: ") + left.join(QLatin1String(", "))));
}
}
