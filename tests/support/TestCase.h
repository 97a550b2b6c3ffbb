// SPDX-License-Identifier: MIT
// Base of every test class: fails a test function that prints a warning it did not announce or leaves a widget.
#pragma once

#include <QtCore/QObject>
#include <QtCore/QRegularExpression>
#include <QtCore/QStringList>

namespace zelkovtest
{
class TestCase : public QObject
{
    Q_OBJECT

public:
    TestCase();
    ~TestCase() override;

    /// Announces a warning: one message that matches must come before the end of the test function.
    void expectWarning(const QRegularExpression& pattern);

    /// Warnings and critical messages of this test function that nobody announced, so far.
    static QStringList unexpectedWarnings();
    /// What would be left over if the test function ended now: widgets, pressed buttons, popups, override cursors.
    static QStringList leftovers();
    static void forgetWarnings();

public Q_SLOTS:
    void init();
    void cleanup();
};
}
