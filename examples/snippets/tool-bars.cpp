// SPDX-License-Identifier: MIT
// The code of docs/tool-bars.md.
//! [bar]
#include "views/CustomToolBar.h"

//! [bar]
#include "Snippets.h"

#include <QtCore/QDataStream>
#include <QtCore/QMap>
#include <QtCore/QMimeData>
#include <QtWidgets/QAction>
#include <QtWidgets/QMainWindow>

namespace snippets_tool_bars
{
class Window : public QMainWindow
{
    Q_OBJECT
public:
    QToolBar* build()
    {
        //! [bar]
        auto* bar = new vx::CustomToolBar(tr("Playback"), this, true, "playback");
        connect(bar, &vx::CustomToolBar::actionDropped, this, [this](QToolBar* to, const QString& id, QAction* before) {
            to->insertAction(before, m_actions.value(id)); // null: at the end
        });
        connect(bar, &vx::CustomToolBar::actionRemoved, this, [](QToolBar* from, QAction* action) {
            from->removeAction(action);
        });
        //! [bar]
        return bar;
    }
    void drag(QMimeData* data)
    {
        //! [data]
        QByteArray id;
        QDataStream stream(&id, QIODevice::WriteOnly);
        stream << QString("zoom-in");
        data->setData("application/action-id", id);
        //! [data]
    }
public Q_SLOTS:
    void customizeToolBar() {}

private:
    QMap<QString, QAction*> m_actions;
};
}

namespace snippets
{
void tool_bars()
{
    snippets_tool_bars::Window window;
    window.addToolBar(window.build());
    QMimeData data;
    window.drag(&data);
    window.show();
    pause();
}
}

#include "tool-bars.moc"
