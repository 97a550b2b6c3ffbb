// SPDX-License-Identifier: MIT
// The whole client.
#include "ClientWindow.h"

namespace client
{
ClientWindow::ClientWindow(QWidget* parent)
    : QWidget(parent)
{
}
}
