// SPDX-License-Identifier: MIT
// The code of docs/clicks.md.
//! [button]
#include "input/CustomContextClickToolButton.h"

//! [button]
#include "Snippets.h"

#include <QtCore/QDebug>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QVBoxLayout>

namespace snippets_clicks
{
class Client : public QWidget
{
public:
    void chooseDuration() {}
    void showSettings() {}
    void showPresets() {}
    void toggleRecording() {}
    vx::CustomContextClickToolButton* build(QWidget* bar)
    {
        //! [button]
        using Click = vx::CustomClickAdapter;
        auto* record = new vx::CustomContextClickToolButton(bar, Click::s_DefaultLongClickSpan, false);
        record->setPopupMode(QToolButton::MenuButtonPopup); // shows the arrow
        record->setSecurityCheck("record");
        connect(record, &QToolButton::clicked, this, [this, record] {
            switch (record->getClickType()) {
            case Click::ectLong: chooseDuration(); break;
            case Click::ectContext: showSettings(); break;
            case Click::ectArrow: showPresets(); break;
            default: toggleRecording(); break;
            }
        });
        //! [button]
        return record;
    }
};

//! [listener]
class Watcher : public QObject
{
    Q_OBJECT
    using T = QToolButton;
public Q_SLOTS:
    void mousePress(QMouseEvent* event, T* button) { qDebug() << "down on" << button << event->pos(); }
    void mouseRelease(QMouseEvent* event, T* button) { qDebug() << "up on" << button << event->pos(); }
};
//! [listener]
}

namespace snippets
{
void clicks()
{
    snippets_clicks::Client client;
    snippets_clicks::Watcher watcher;
    auto* button = client.build(&client);
    button->setListener(&watcher);
    client.show();
    pause();
}
}

#include "clicks.moc"
