// SPDX-License-Identifier: MIT
// A surface that shows where the pointer went.
#pragma once

#include <QtCore/QVector>
#include <QtWidgets/QWidget>

namespace gallery
{
/// Draws the trail of a gesture, its presses and releases, the click radius around the first press, and a
/// verdict in words. Knows nothing of gestures itself.
class GesturePad : public QWidget
{
    Q_OBJECT

public:
    explicit GesturePad(QWidget* parent = nullptr);

    void clear();
    void addPress(const QPoint& position);
    void addMove(const QPoint& position);
    void addRelease(const QPoint& position);
    void setVerdict(const QString& text);
    /// Of the diamond around the first press: distances of clicks are |dx| + |dy|.
    void setClickRadius(int radius);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QVector<QPoint> m_trail;
    QVector<QPoint> m_presses;
    QVector<QPoint> m_releases;
    QString m_verdict;
    int m_clickRadius = 8;
};
}
