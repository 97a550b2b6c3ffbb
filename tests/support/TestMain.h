// SPDX-License-Identifier: MIT
// The main function of every test: fixed font, style, locale and scale, and a last sweep that lets the leak
// checker see widgets.
#pragma once

#include <functional>

#include <QtCore/QObject>

namespace zelkovtest
{
/// Runs the tests of the object that @p make returns, in the fixed surroundings; the exit code of the program.
int run(int argc, char* argv[], const std::function<QObject*()>& make);

/// Sets what a QApplication takes over from the process: to be called before one is made.
void prepareProcess();

/// Sets font, style and locale of the running QApplication.
void prepareApplication();

/// Overwrites the list of posted events, whose stale receiver pointers hide leaked widgets from the leak checker.
void scrubPostedEvents();
}

#define ZELKOV_TEST_MAIN(TestClass)                                                                                  \
    int main(int argc, char* argv[])                                                                                 \
    {                                                                                                                \
        return zelkovtest::run(argc, argv, [] { return static_cast<QObject*>(new TestClass); });                     \
    }
