// SPDX-License-Identifier: MIT
#include "CountingTools.h"

#include "CountingLine.h"
#include "controls/VxCountingLinesGroupBox.h"

#include <QtCore/QEvent>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QSpinBox>
#include <QtWidgets/QVBoxLayout>

namespace client
{
namespace
{
const QRect s_camera(0, 0, 1920, 1080);
}

CountingTools::CountingTools(QWidget* parent)
    : QFrame(parent)
    , m_form(new vx::VxCountingLinesGroupBox)
    , m_hint(new QLabel)
{
    setObjectName(QStringLiteral("countingTools"));
    setFrameShape(QFrame::StyledPanel);
    setProperty("role", QStringLiteral("panel"));
    m_hint->setProperty("role", QStringLiteral("hint"));
    m_hint->setWordWrap(true);
    m_form->setRange(s_camera);
    for (QSpinBox* const field : m_form->findChildren<QSpinBox*>()) {
        connect(field, QOverload<int>::of(&QSpinBox::valueChanged), this, &CountingTools::takeForm);
    }
    for (const char* const name : {"lineNameEdit_2", "lineEastEdit_2", "lineWestEdit_2"}) {
        connect(m_form->findChild<QLineEdit*>(QLatin1String(name)), &QLineEdit::textChanged, this,
            &CountingTools::takeForm);
    }
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins(14, 10, 14, 14);
    layout->setSpacing(10);
    layout->addWidget(m_form);
    layout->addWidget(m_hint);
    layout->addStretch(1);
    retranslate();
}

CountingTools::~CountingTools()
{
    delete m_line;
}

void CountingTools::retranslate()
{
    m_hint->setText(tr("Drag the ends of the line in the picture, or change the numbers."));
}

void CountingTools::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        retranslate();
    }
}

void CountingTools::workIn(QWidget* view, int camera)
{
    if (view == m_view && camera == m_camera) {
        return;
    }
    delete m_line;
    m_view = view;
    m_camera = camera;
    if (!view) {
        return;
    }
    if (!m_lines.contains(camera)) {
        m_lines.insert(camera, {QPoint(480, 640), QPoint(1440, 560), QString(), tr("Outside"), tr("Inside")});
    }
    fillForm(m_lines.value(camera));
    m_line = new CountingLine(view);
    connect(m_line, &CountingLine::lineDragged, this, [this](const QPoint& start, const QPoint& end) {
        Line line = m_lines.value(m_camera);
        line.start = start;
        line.end = end;
        fillForm(line);
        m_lines.insert(m_camera, line);
        Q_EMIT lineChanged(m_camera, start, end);
    });
    showLine();
    m_line->show();
}

void CountingTools::fillForm(const Line& line)
{
    m_fills = true;
    m_form->setId(m_camera + 1);
    m_form->setLineName(line.name);
    m_form->setLeftName(line.left);
    m_form->setRightName(line.right);
    m_form->setStartingPoint(line.start);
    m_form->setEndPoint(line.end);
    m_fills = false;
}

void CountingTools::takeForm()
{
    if (m_fills || !m_line) {
        return;
    }
    m_lines.insert(m_camera,
        {m_form->startingPoint(), m_form->endPoint(), m_form->lineName(), m_form->leftName(), m_form->rightName()});
    showLine();
    Q_EMIT lineChanged(m_camera, m_form->startingPoint(), m_form->endPoint());
}

void CountingTools::showLine()
{
    const Line line = m_lines.value(m_camera);
    m_line->setLine(line.start, line.end);
    m_line->setNames(line.name, line.left, line.right);
}
}
