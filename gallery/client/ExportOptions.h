// SPDX-License-Identifier: MIT
// What can be chosen for an export.
#pragma once

#include <QtCore/QString>
#include <QtCore/QVector>

namespace client
{
struct ExportOptions
{
    enum Format : int
    {
        kMp4,
        kMkv,
        kOriginal
    };

    QVector<int> cameras;
    Format format = kMp4;
    int quality = 80; ///< percent
    bool sound = true;
    bool clock = true; ///< in the pictures
    QString fileName;
    QString password; ///< empty for none
    qint64 from = 0; ///< milliseconds since 1970-01-01 UTC
    qint64 to = 0;
};
}
