// SPDX-License-Identifier: MIT
// Shows on the standard output that the library logs and connects through the second platform set.
#include "CoreQt/Connect.h"
#include "foundation/LogStatement.h"
#include "input/MouseAdapter.h"

#include <QtWidgets/QApplication>
#include <QtWidgets/QWidget>

#include <iostream>

int main(int argc, char* argv[])
{
    QApplication application(argc, argv);
    ZELKOV_LOG(vx::c_LogTrace, "client", "under the threshold");
    ZELKOV_LOG(vx::c_LogFault, "client", 42);

    const int before = vx::connectionCount();
    QWidget widget;
    vx::MouseAdapter adapter(&widget, true);
    std::wcout << L"connections through the second set: " << (vx::connectionCount() > before ? L"yes" : L"no")
               << std::endl;
    return 0;
}
