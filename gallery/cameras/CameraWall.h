// SPDX-License-Identifier: MIT
// The cameras side by side.
#pragma once

#include <QtCore/QVector>
#include <QtWidgets/QWidget>

namespace gallery
{
class CameraTile;

/// Several walls of three by three cameras, of which one wall, or one enlarged camera, is on show.
class CameraWall : public QWidget
{
    Q_OBJECT

public:
    static const int s_columns = 3;
    static const int s_perWall = s_columns * s_columns;

    CameraWall(const QStringList& names, QWidget* parent = nullptr);

    const QVector<CameraTile*>& tiles() const { return m_tiles; }
    int wallCount() const;
    int currentWall() const { return m_wall; }

    void select(CameraTile* tile);
    void toggleEnlarged(CameraTile* tile);
    /// Forward or backward: by a wall, or by a camera while one is enlarged. Goes round at the ends.
    void turn(int step);
    /// The next frame of all cameras on show.
    void advance(qint64 epochMillis);

Q_SIGNALS:
    void changed();

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void arrange();

    QVector<CameraTile*> m_tiles;
    CameraTile* m_enlarged = nullptr;
    int m_wall = 0;
};
}
