// SPDX-License-Identifier: MIT
// The form has no signals: the page listens to its fields.
#include "CountingLinesPage.h"

#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QSpinBox>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "LinePicture.h"
#include "controls/VxCountingLinesGroupBox.h"

namespace gallery
{
namespace
{
const QSize s_picture(1280, 720);
}

CountingLinesPage::CountingLinesPage(SignalLog& log, QWidget* parent)
    : Page(log, parent), m_picture(new LinePicture(s_picture))
{
    auto* form = new vx::VxCountingLinesGroupBox;
    form->setRange(QRect(QPoint(0, 0), s_picture));
    form->setId(1);
    form->setLineName(tr("Main entrance"));
    form->setLeftName(tr("Outside"));
    form->setRightName(tr("Inside"));
    form->setStartingPoint(QPoint(300, 600));
    form->setEndPoint(QPoint(960, 480));

    const auto show = [this, form] {
        m_picture->setLine(form->startingPoint(), form->endPoint());
        m_picture->setNames(form->lineName(), form->leftName(), form->rightName());
    };
    for (QSpinBox* field : form->findChildren<QSpinBox*>()) {
        connect(field, QOverload<int>::of(&QSpinBox::valueChanged), m_picture, show);
    }
    for (const char* name : {"lineNameEdit_2", "lineEastEdit_2", "lineWestEdit_2"}) {
        connect(form->findChild<QLineEdit*>(QLatin1String(name)), &QLineEdit::textChanged, m_picture, show);
    }
    connect(m_picture, &LinePicture::startDragged, form, &vx::VxCountingLinesGroupBox::setStartingPoint);
    connect(m_picture, &LinePicture::endDragged, form, &vx::VxCountingLinesGroupBox::setEndPoint);
    watch(m_picture, QStringLiteral("picture"), {QStringLiteral("startDragged"), QStringLiteral("endDragged")});
    show();

    QWidget* box = panel();
    auto* side = new QVBoxLayout(box);
    side->setContentsMargins(14, 10, 14, 14);
    side->setSpacing(10);
    side->addWidget(form);
    auto* hint = label(tr("Drag the ends of the line in the picture, or change the numbers."), "hint");
    hint->setWordWrap(true);
    side->addWidget(hint);
    side->addStretch(1);
    box->setFixedWidth(370);

    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(m_picture, 1);
    layout->addWidget(box);
}

void CountingLinesPage::rehearse(Hand& hand)
{
    const QPoint start = m_picture->fromPicture(QPoint(300, 600));
    hand.moveTo(m_picture, start).press().glideTo(m_picture, start - QPoint(20, 40), 200).release().wait(50);
}
}
