// SPDX-License-Identifier: MIT
// The one place where the pages of the gallery are named.
#pragma once

#include <QtCore/QString>
#include <QtCore/QVector>

class QWidget;

namespace gallery
{
class Page;
class SignalLog;

struct PageEntry
{
    const char* name; ///< for --page and for the names of pictures; not translated
    const char* family;
    const char* title;
    const char* description;
    Page* (*make)(SignalLog& log, QWidget* parent);

    QString familyText() const;
    QString titleText() const;
    QString descriptionText() const;
};

/// All pages, those of a family side by side, in the order of the list.
const QVector<PageEntry>& pages();

/// The place of the page in pages(), or -1.
int indexOfPage(const QString& name);
}
