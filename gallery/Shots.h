// SPDX-License-Identifier: MIT
// Pictures of all pages.
#pragma once

#include <QtCore/QObject>
#include <QtCore/QVector>

#include "theme/Theme.h"

namespace gallery
{
class GalleryWindow;

/// Shows one page after another in every theme, uses it a little, and saves DIR/<page>-<theme>.png.
class Shots : public QObject
{
    Q_OBJECT

public:
    /// With only the pages and themes that are given.
    Shots(GalleryWindow& window, const QString& directory, const QVector<int>& pageIndexes,
          const QVector<zelkov::theme::Name>& themes);

    void start();

Q_SIGNALS:
    /// Once, at the end; ok is false if a picture could not be written.
    void finished(bool ok);

private:
    struct Shot
    {
        int page;
        zelkov::theme::Name theme;
    };

    void next();
    void save(const Shot& shot);

    GalleryWindow& m_window;
    QString m_directory;
    QVector<Shot> m_shots;
    bool m_ok = true;
};
}
