// SPDX-License-Identifier: MIT
// The pieces of code that the pages of docs/ show. What stands between two marks "//! [name]" is on the page, to the
// letter; the rest makes it run.
#pragma once

#include <QtCore/QVector>

namespace snippets
{
/// One page of docs/ and the function that runs its pieces, in a window of its own that is gone afterwards.
struct Page
{
    const char* name;
    void (*run)();
};

/// All pages with pieces of code, sorted by name.
const QVector<Page>& pages();

/// Shows the widgets of a page for a moment: lets the event loop run for \a milliseconds.
void pause(int milliseconds = 20);
}
