// SPDX-License-Identifier: MIT
// The main function of every test.
#include "TestMain.h"

#include <memory>

#include <QtCore/QCoreApplication>
#include <QtCore/QLocale>
#include <QtCore/QStandardPaths>
#include <QtGui/QFontInfo>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QStyleFactory>

namespace zelkovtest
{
void prepareProcess()
{
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication::setDesktopSettingsAware(false);
    QStandardPaths::setTestModeEnabled(true);
    QLocale::setDefault(QLocale::c());
}

void prepareApplication()
{
    QApplication::setStyle(QStyleFactory::create(QStringLiteral("Fusion")));
    QFont font(QStringLiteral("DejaVu Sans"));
    font.setPixelSize(13);
    font.setHintingPreference(QFont::PreferNoHinting);
    QApplication::setFont(font);
    if (QFontInfo(font).family() != QLatin1String("DejaVu Sans")) {
        qFatal("The tests need the font DejaVu Sans (package fonts-dejavu-core)");
    }
}

void scrubPostedEvents()
{
    QCoreApplication::sendPostedEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QObject dummy;
    for (int i = 0; i < 4096; ++i) {
        QCoreApplication::postEvent(&dummy, new QEvent(QEvent::User));
    }
    QCoreApplication::sendPostedEvents();
}

int run(int argc, char* argv[], const std::function<QObject*()>& make)
{
    prepareProcess();
    QApplication application(argc, argv);
    prepareApplication();
    int result = 0;
    {
        std::unique_ptr<QObject> test(make());
        result = QTest::qExec(test.get(), argc, argv);
    }
    scrubPostedEvents();
    return result;
}
}
