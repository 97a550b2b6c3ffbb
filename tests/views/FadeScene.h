// SPDX-License-Identifier: MIT
// A parent with one sliding panel, for the tests of the panel.
#pragma once

#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "views/FadeView.h"

#include <QtCore/QPointer>
#include <QtTest/QtTest>
#include <QtWidgets/QVBoxLayout>

Q_DECLARE_METATYPE(FadeView::EPositions)

namespace fadescene
{
/// Shows what is protected.
class OpenView : public FadeView
{
public:
    OpenView(EPositions position, QWidget* parent)
        : FadeView(position, nullptr, parent)
    {
    }
    using FadeView::fadedIn;
    using FadeView::fadedOut;
    using FadeView::fadeinIndependent;
    using FadeView::fadeinLayout;
    using FadeView::fadeoutIndependent;
    using FadeView::fadeoutLayout;
    using FadeView::fullscreenEntered;
    using FadeView::fullscreenExited;
    using FadeView::init;
    using FadeView::m_fadeInSize;
    using FadeView::m_fullscreenTransition;
    using FadeView::m_layoutVerticalOffset;
    using FadeView::m_maximumHeight;
    using FadeView::m_minimumSize;
    using FadeView::m_neighbourOffset;
    using FadeView::m_parentHeight;
    using FadeView::m_parentWidth;
    using FadeView::m_preFullscreenSize;
    using FadeView::m_sizeHint;
    using FadeView::m_stripeMinimumHeight;
    using FadeView::m_verticalOffset;
};

/// A parent of 400 by 300 with one panel.
struct Scene
{
    explicit Scene(FadeView::EPositions position, bool inLayout)
    {
        parent.resize(400, 300);
        view = new OpenView(position, &parent);
        if (inLayout) {
            auto* layout = new QVBoxLayout(&parent);
            layout->setContentsMargins(0, 0, 0, 0);
            layout->setSpacing(0);
            auto* picture = new QWidget;
            if (position == FadeView::ePositionTop) {
                layout->addWidget(view);
            }
            layout->addWidget(picture, 1);
            if (position == FadeView::ePositionBottom) {
                layout->addWidget(view);
            }
        } else {
            view->setFadeStripeAsPartOfLayout(false);
        }
        view->resize();
        parent.show();
        if (!QTest::qWaitForWindowExposed(&parent)) {
            qFatal("no window");
        }
        recorder.add(view);
    }

    /// The recorded names, each run of geometryChanged as one.
    QStringList folded() const
    {
        QStringList result;
        for (const QString& name : recorder.names()) {
            if (name != QLatin1String("geometryChanged") || result.isEmpty() || result.last() != name) {
                result << name;
            }
        }
        return result;
    }

    QRect lastGeometry() const
    {
        for (int i = recorder.entries().size() - 1; i >= 0; --i) {
            if (recorder.entries().at(i).name == QLatin1String("geometryChanged")) {
                return recorder.entries().at(i).arguments.first().toRect();
            }
        }
        return {};
    }

    void wait(const char* signal) const
    {
        const QString name = QString::fromLatin1(signal);
        QTRY_VERIFY_WITH_TIMEOUT(recorder.count(name) > 0, 5000);
        QCoreApplication::processEvents();
    }

    QWidget parent;
    OpenView* view;
    zelkovtest::SignalRecorder recorder;
};

constexpr auto c_Top = FadeView::ePositionTop;
constexpr auto c_Bottom = FadeView::ePositionBottom;

inline QStringList list(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

inline void waysAndEdges()
{
    QTest::addColumn<FadeView::EPositions>("edge");
    QTest::addColumn<bool>("inLayout");
    QTest::newRow("top, in a layout") << c_Top << true;
    QTest::newRow("top, by geometry") << c_Top << false;
    QTest::newRow("bottom, in a layout") << c_Bottom << true;
    QTest::newRow("bottom, by geometry") << c_Bottom << false;
}
}
