// SPDX-License-Identifier: MIT
// The code of docs/switches.md.
//! [switch]
#include "controls/iOSCheckBox.h"

//! [switch]
//! [states]
#include "controls/MultiStatePushButton.h"

//! [states]
#include "Snippets.h"

namespace snippets_switches
{
class Camera : public QObject
{
public:
    bool isRecording() const { return m_recording; }
    void setRecording(bool recording) { m_recording = recording; }
    bool m_recording = false;
};
class Lamp
{
public:
    void setLevel(int level) { m_level = level; }
    int m_level = 0;
};
class Client : public QWidget
{
public:
    void build(Camera* camera)
    {
        //! [switch]
        auto* recording = new iOSCheckBox(this, camera->isRecording());
        connect(recording, &QCheckBox::toggled, camera, &Camera::setRecording);

        recording->setAnimationMode(true);      // changes from code slide, too
        recording->setChecked(true);
        recording->setAnimationMode(false);
        //! [switch]
    }
    QPushButton* states(Lamp* lamp)
    {
        //! [states]
        auto* light = new vx::MultiStatePushButton({0, 1, 2}, "light", this);
        connect(light, &QPushButton::clicked, this, [=] { lamp->setLevel(light->state()); });
        //! [states]
        return light;
    }
};
}

namespace snippets
{
void switches()
{
    snippets_switches::Client client;
    snippets_switches::Camera camera;
    snippets_switches::Lamp lamp;
    client.build(&camera);
    QPushButton* button = client.states(&lamp);
    client.show();
    button->click();
    Q_ASSERT(camera.isRecording() && lamp.m_level == 1);
    pause();
}
}
