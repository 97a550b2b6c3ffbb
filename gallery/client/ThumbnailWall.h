// SPDX-License-Identifier: MIT
// All cameras as small pictures.
#pragma once

#include <QtWidgets/QWidget>

namespace client
{
class Fleet;

/// A searchable wall of thumbnails whose columns follow the width.
class ThumbnailWall : public QWidget
{
    Q_OBJECT

public:
    explicit ThumbnailWall(Fleet& fleet, QWidget* parent = nullptr);

Q_SIGNALS:
    /// A double click of the user on a picture.
    void cameraChosen(int id);

private:
    Fleet& m_fleet;
};
}
