// SPDX-License-Identifier: MIT
// The synthetic cameras that the client shows and manages.
#pragma once

#include <QtCore/QObject>
#include <QtCore/QString>
#include <QtCore/QVector>

namespace client
{
struct Camera
{
    int id = -1; ///< never changes and is never used again
    QString name;
    QString place;
    QString address;
    bool online = true;
    bool steerable = false; ///< has a motor
    int events = 0; ///< that nobody has looked at yet
};

/// The cameras in the order in which the user has put them. Everything that shows cameras reads here and follows the
/// signals; whoever edits cameras does it here.
class Fleet : public QObject
{
    Q_OBJECT

public:
    static const int s_count = 64;

    explicit Fleet(QObject* parent = nullptr);

    const QVector<Camera>& cameras() const { return m_cameras; }
    /// Null for an id that there is not.
    const Camera* camera(int id) const;
    /// -1 for an id that there is not.
    int indexOf(int id) const;

    void rename(int id, const QString& name);
    /// Both are places in cameras(); \a to is the place after the move.
    void move(int from, int to);
    void remove(int id);
    /// A camera that is offline sends no pictures. It comes back by itself, as a network does, or by this.
    void setOnline(int id, bool online);
    /// Events that nobody has looked at yet; 0 when somebody has.
    void setEvents(int id, int count);

Q_SIGNALS:
    void renamed(int id);
    void onlineChanged(int id, bool online);
    void eventsChanged(int id);
    /// After cameras came, went or moved.
    void orderChanged();

private:
    QVector<Camera> m_cameras;
};
}
