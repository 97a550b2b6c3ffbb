// SPDX-License-Identifier: MIT
// The code of docs/counting-lines.md.
//! [form]
#include "controls/VxCountingLinesGroupBox.h"

//! [form]
#include "Snippets.h"

#include <QtWidgets/QSpinBox>
#include <QtWidgets/QVBoxLayout>

namespace snippets_counting_lines
{
struct Line
{
    int id;
    QString name;
    QPoint start;
    QPoint end;
};
class View : public QWidget
{
public:
    void drawLine(vx::VxCountingLinesGroupBox* form) { m_line = {form->startingPoint(), form->endPoint()}; }
    QVector<QPoint> m_line;
};
class Client : public QWidget
{
public:
    void build(const QPixmap& picture, const Line& line, View* view)
    {
        //! [form]
        auto* form = new vx::VxCountingLinesGroupBox(this);
        form->setRange(QRect(QPoint(0, 0), picture.size()));
        form->setId(line.id);
        form->setLineName(line.name);
        form->setStartingPoint(line.start);
        form->setEndPoint(line.end);
        for (QSpinBox* field : form->findChildren<QSpinBox*>()) {
            connect(field, QOverload<int>::of(&QSpinBox::valueChanged), view, [=] { view->drawLine(form); });
        }
        //! [form]
        form->findChild<QSpinBox*>("editX1_2")->setValue(30);
    }
};
}

namespace snippets
{
void counting_lines()
{
    snippets_counting_lines::Client client;
    auto* view = new snippets_counting_lines::View;
    view->setParent(&client);
    client.build(QPixmap(640, 480), {1, "Gate", {10, 10}, {600, 400}}, view);
    client.show();
    pause();
    Q_ASSERT(view->m_line.value(0) == QPoint(30, 10));
}
}
