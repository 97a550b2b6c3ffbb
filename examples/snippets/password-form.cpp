// SPDX-License-Identifier: MIT
// The code of docs/password-form.md.
//! [form]
#include "controls/PasswordCheckWidget.h"

//! [form]
#include "Snippets.h"

#include <QtWidgets/QPushButton>

namespace snippets_password_form
{
struct Camera
{
    void setPassword(const QString& password) { m_password = password; }
    QString m_password;
};
class Client : public QWidget
{
public:
    void build(Camera* camera, QPushButton* save)
    {
        //! [form]
        using Form = vx::PasswordCheckWidget;
        auto* form = new Form(false, Form::esrMinimumLength | Form::esrDigitAndLetter | Form::esrPasswordsMatch, this);
        connect(form, &Form::passwordChanged, save, [=](const QString&, bool allMet) { save->setEnabled(allMet); });
        connect(save, &QPushButton::clicked, form, [=] { camera->setPassword(form->password()); });
        //! [form]
    }
};
}

namespace snippets
{
void password_form()
{
    snippets_password_form::Client client;
    snippets_password_form::Camera camera;
    auto* save = new QPushButton(&client);
    client.build(&camera, save);
    client.show();
    save->click();
    pause();
}
}
