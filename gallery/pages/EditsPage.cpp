// SPDX-License-Identifier: MIT
// Each field in the place it was made for.
#include "EditsPage.h"

#include <QtCore/QDir>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QFormLayout>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QListWidget>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "controls/DateTimeDefaultEdit.h"
#include "controls/ExtendedComboBox.h"
#include "controls/FilepathEdit.h"
#include "controls/SearchEdit.h"

namespace gallery
{
namespace
{
QVBoxLayout* column(QWidget* panel, QLabel* heading)
{
    auto* layout = new QVBoxLayout(panel);
    layout->setContentsMargins(16, 12, 16, 14);
    layout->setSpacing(10);
    layout->addWidget(heading);
    return layout;
}
}

EditsPage::EditsPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
{
    auto* right = new QVBoxLayout;
    right->setSpacing(12);
    right->addWidget(makeFields());
    right->addWidget(makeForm(), 1);
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(16);
    layout->addWidget(makeSearch(), 2);
    layout->addLayout(right, 3);
}

QWidget* EditsPage::makeSearch()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Search"), "heading"));
    m_search = new vx::SearchEdit;
    m_search->setPlaceholderText(tr("Find a camera"));
    auto* list = new QListWidget;
    list->setSpacing(2);
    for (const QString& place : {tr("Gate"), tr("Yard"), tr("Hall"), tr("Ramp"), tr("Stairs")}) {
        for (const QString& side : {tr("north"), tr("east"), tr("south"), tr("west")}) {
            list->addItem(place + QLatin1Char(' ') + side);
        }
    }
    // The class has a slot of the same name, which hides the signal.
    connect(m_search, &QLineEdit::textChanged, list, [list](const QString& text) {
        for (int row = 0; row < list->count(); ++row) {
            list->item(row)->setHidden(!list->item(row)->text().contains(text, Qt::CaseInsensitive));
        }
    });
    watch(m_search, QStringLiteral("search"));
    layout->addWidget(m_search);
    layout->addWidget(list, 1);
    return box;
}

QWidget* EditsPage::makeFields()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("Export"), "heading"));
    auto* path = new vx::FilepathEdit(QDir::rootPath());
    watch(path, QStringLiteral("path"));
    announcePlace(path, QStringLiteral("path"));
    const QDateTime start(QDate(2026, 4, 1), QTime(8, 15));
    const QString format = QStringLiteral("dd.MM.yyyy HH:mm:ss");
    auto* from = new vx::DateTimeEdit;
    from->setDisplayFormat(format);
    from->setDateTime(start);
    watch(from, QStringLiteral("from"));
    m_end = new vx::DateTimeDefaultEdit;
    m_end->setDisplayFormat(format);
    m_end->setDefaultDateTime(start.addSecs(3600));
    m_end->setButtonSymbols(QAbstractSpinBox::NoButtons);
    watch(m_end, QStringLiteral("to"));
    auto* lock = new QCheckBox(tr("Read only"));
    connect(lock, &QCheckBox::toggled, from, &QDateTimeEdit::setReadOnly);

    auto* form = new QFormLayout;
    form->setHorizontalSpacing(14);
    form->setVerticalSpacing(8);
    form->setLabelAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    form->addRow(tr("Folder"), path);
    form->addRow(tr("From"), from);
    form->addRow(tr("To"), m_end);
    form->addRow(QString(), lock);
    layout->addLayout(form);
    auto* hint = label(tr("Drop a file on the folder: its folder is taken. The cross brings the end back."), "hint");
    hint->setWordWrap(true);
    layout->addWidget(hint);
    return box;
}

QWidget* EditsPage::makeForm()
{
    QWidget* box = panel();
    QVBoxLayout* layout = column(box, label(tr("A form that scrolls"), "heading"));
    layout->addWidget(label(tr("The wheel over a combo box scrolls the form and changes nothing."), "hint"));
    auto* fields = new QWidget;
    auto* form = new QFormLayout(fields);
    form->setContentsMargins(0, 0, 10, 0);
    form->setHorizontalSpacing(14);
    form->setVerticalSpacing(8);
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    for (int camera = 1; camera <= 12; ++camera) {
        auto* rate = new vx::ExtendedComboBox;
        rate->addItems({tr("25 pictures a second"), tr("12 pictures a second"), tr("1 picture a second")});
        form->addRow(tr("Camera %1").arg(camera), rate);
    }
    auto* area = new QScrollArea;
    area->setProperty("role", QStringLiteral("plain"));
    area->setWidgetResizable(true);
    area->setWidget(fields);
    area->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Ignored);
    area->setMinimumHeight(110);
    fields->setAutoFillBackground(false);
    area->viewport()->setAutoFillBackground(false);
    layout->addWidget(area, 1);
    return box;
}

void EditsPage::rehearse(Hand& hand)
{
    hand.call(m_search, [this] { m_search->setText(tr("Gate")); });
    hand.call(m_end, [this] { m_end->setDateTime(m_end->dateTime().addSecs(900)); });
    hand.wait(100);
}
}
