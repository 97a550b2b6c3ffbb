// SPDX-License-Identifier: MIT
// The classes of foundation/.
#include "foundation/AlignedWidget.h"

#include <QtWidgets/QLabel>

#include "Registry.h"

namespace zelkovtest
{
namespace
{
Entry alignedWidget()
{
    Entry entry;
    entry.name = "AlignedWidget";
    entry.header = "foundation/AlignedWidget.h";
    entry.kind = Kind::Widget;
    entry.create = [](QWidget* host) {
        vx::AlignedWidget* const widget = new vx::AlignedWidget(new QLabel(QStringLiteral("child")), host);
        return Subject{widget, widget};
    };
    entry.exercise = {{"ask", {}, {[](const Subject& subject) {
        static_cast<vx::AlignedWidget*>(subject.object.data())->qchild();
    }}}};
    return entry;
}
}

std::vector<Entry> foundationEntries()
{
    return {
        alignedWidget(),
        valueClass("LogStatement", "foundation/LogStatement.h"),
        valueClass("ValueRange", "foundation/ValueRange.h"),
    };
}
}
