// SPDX-License-Identifier: MIT
// Each row is a label, a field that takes its place while the list is edited, and a word about the device.
#include "PhoneListPage.h"

#include <QtWidgets/QCheckBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetDeleteIcon.h"
#include "controls/iOSListWidgetItem.h"

namespace gallery
{
PhoneListPage::PhoneListPage(SignalLog& log, QWidget* parent)
    : Page(log, parent), m_list(new vx::iOSListWidget(nullptr, QStringLiteral("devices"))), m_edit(new QPushButton)
{
    // It is as high as its rows, which leaves no room for a frame.
    m_list->setFrameShape(QFrame::NoFrame);
    watch(m_list, QStringLiteral("list"));
    announcePlace(m_list, QStringLiteral("list"));
    const QStringList names{tr("Gate west"), tr("Yard north"), tr("Entrance hall"), tr("Ramp"), tr("Stairs"), tr("Roof")};
    for (int i = 0; i < names.size(); ++i) {
        addDevice(names.at(i), i == 3 ? tr("offline") : tr("online"));
    }
    m_list->setCurrentRow(0);

    m_edit->setCheckable(true);
    const auto nameButton = [this] { m_edit->setText(m_list->editMode() ? tr("Done") : tr("Edit")); };
    connect(m_edit, &QPushButton::toggled, m_list, [this, nameButton](bool on) {
        m_list->setEditMode(on);
        nameButton();
    });
    nameButton();
    auto* add = new QPushButton(tr("Add a camera"));
    connect(add, &QPushButton::clicked, m_list, [this] { addDevice(tr("Camera %1").arg(++m_number), tr("online")); });
    auto* keep = new QCheckBox(tr("Keep the last one"));
    connect(keep, &QCheckBox::toggled, m_list, [this](bool on) { m_list->setKeepLastItem(on); });

    QWidget* box = panel();
    box->setFixedWidth(440);
    box->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Maximum);
    auto* column = new QVBoxLayout(box);
    column->setContentsMargins(16, 12, 16, 16);
    column->setSpacing(10);
    auto* top = new QHBoxLayout;
    top->addWidget(label(tr("Devices"), "heading"));
    top->addStretch(1);
    top->addWidget(m_edit);
    column->addLayout(top);
    column->addWidget(m_list, 1);
    auto* bottom = new QHBoxLayout;
    bottom->addWidget(keep);
    bottom->addStretch(1);
    bottom->addWidget(add);
    column->addLayout(bottom);

    auto* hint = label(tr("While you edit: the red sign brings out a button that deletes the row, a row is dragged to "
                          "another place, and its name can be changed."),
        "hint");
    hint->setWordWrap(true);
    hint->setFixedWidth(260);
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(box, 0, Qt::AlignTop);
    layout->addWidget(hint, 0, Qt::AlignTop);
    layout->addStretch(1);
}

void PhoneListPage::addDevice(const QString& name, const QString& state)
{
    auto* shown = new QLabel(name);
    shown->setMargin(10);
    auto* field = new QLineEdit(name);
    field->setFrame(false);
    connect(field, &QLineEdit::textChanged, shown, &QLabel::setText);
    auto* word = label(state, "hint");
    word->setMargin(10);
    // The row puts itself at the end of the list, which owns it.
    auto* row = new vx::iOSListWidgetItem(m_list, shown, QStringLiteral("device"), QSize(), field, nullptr, word);
    row->setData(Qt::UserRole, name);
    if (m_list->editMode()) {
        row->setEditMode(true);
    }
}

void PhoneListPage::rehearse(Hand& hand)
{
    hand.click(m_edit, m_edit->rect().center()).wait(100);
    // The sign stands in the row only now.
    hand.call(m_list, [this] { m_list->setDeleteMode(m_list->getIOSItem(2)); });
    hand.wait(500);
}
}
