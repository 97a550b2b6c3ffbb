// SPDX-License-Identifier: MIT
// The camera client: the library as a whole.
#pragma once

#include "../Page.h"

namespace client
{
class ClientWindow;
}

namespace gallery
{
/// The client keeps who is logged in, and all that the user has set, while theme, language or page change.
class ClientPage : public Page
{
    Q_OBJECT

public:
    explicit ClientPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;
    bool keepsItself() const override { return true; }
    int logRows() const override { return 2; }

private:
    client::ClientWindow* m_client;
};
}
