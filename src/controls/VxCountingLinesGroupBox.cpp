// SPDX-License-Identifier: MIT
#include "controls/VxCountingLinesGroupBox.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QEvent>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QSpinBox>
#include <QtWidgets/QVBoxLayout>

namespace vx
{
struct VxCountingLinesGroupBox::Form
{
    explicit Form(QWidget* root)
    {
        layoutWidget = named(new QWidget(root), "layoutWidget");
        auto* const rows = named(new QVBoxLayout(layoutWidget), "verticalLayout");
        rows->setContentsMargins(0, 0, 0, 0);

        coordinates = named(new QGroupBox(layoutWidget), "coordGroupBox_2");
        coordinates->setAlignment(Qt::AlignHCenter);
        coordinates->setFlat(true);
        auto* const outer = new QGridLayout(coordinates);
        auto* const grid = named(new QGridLayout, "gridLayout_2");
        outer->addLayout(grid, 0, 0);
        startX = label("label_8", coordinates);
        startXEdit = spinBox("editX1_2", 1280, coordinates);
        startY = label("label_22", coordinates);
        startYEdit = spinBox("editY1_2", 960, coordinates);
        start = label("label", coordinates);
        end = label("label_3", coordinates);
        endX = label("label_23", coordinates);
        endXEdit = spinBox("editX2_2", 1280, coordinates);
        endY = label("label_24", coordinates);
        endYEdit = spinBox("editY2_2", 960, coordinates);
        for (QLabel* const axis : {startX, startY, endX, endY}) {
            axis->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
        }
        addRow(grid, 0, {start, startX, startXEdit, startY, startYEdit});
        addRow(grid, 1, {end, endX, endXEdit, endY, endYEdit});
        grid->setColumnStretch(2, 1);
        grid->setColumnStretch(4, 1);
        rows->addWidget(coordinates);

        parameters = named(new QGroupBox(layoutWidget), "paramGroupBox_2");
        auto* const fields = new QGridLayout(parameters);
        idLabel = label("label_2", parameters);
        idEdit = lineEdit("lineIdEdit_2", parameters);
        idEdit->setMaximumWidth(40);
        idEdit->setMaxLength(3);
        idEdit->setReadOnly(true);
        nameLabel = label("label_17", parameters);
        nameEdit = lineEdit("lineNameEdit_2", parameters);
        eastLabel = label("label_18", parameters);
        eastEdit = lineEdit("lineEastEdit_2", parameters);
        westLabel = label("label_25", parameters);
        westEdit = lineEdit("lineWestEdit_2", parameters);
        addRow(fields, 0, {idLabel, idEdit});
        addRow(fields, 1, {nameLabel, nameEdit});
        addRow(fields, 2, {eastLabel, eastEdit});
        addRow(fields, 3, {westLabel, westEdit});
        rows->addWidget(parameters);
    }

    static QString text(const char* source) { return QCoreApplication::translate("CountingLinesGroupBox", source); }

    void translate(QGroupBox* root)
    {
        root->setTitle(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "Counting Corridors")));
        coordinates->setTitle(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "Coordinates")));
        startX->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "x")));
        startY->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "y")));
        start->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "Starting point:")));
        end->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "End point:")));
        endX->setText(startX->text());
        endY->setText(startY->text());
        parameters->setTitle(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "Additional Parameters")));
        idLabel->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "ID")));
        nameLabel->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "Name")));
        eastLabel->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "Title \"East\"")));
        westLabel->setText(text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "Title \"West\"")));
    }

    template<class Object>
    static Object* named(Object* object, const char* name)
    {
        object->setObjectName(QLatin1String(name));
        return object;
    }

    static QFont plainFont(const QWidget* widget)
    {
        QFont font = widget->font();
        font.setBold(false);
        font.setWeight(QFont::Normal);
        return font;
    }

    static QLabel* label(const char* name, QWidget* parent)
    {
        auto* const made = named(new QLabel(parent), name);
        made->setFont(plainFont(parent));
        return made;
    }

    static QLineEdit* lineEdit(const char* name, QWidget* parent)
    {
        auto* const made = named(new QLineEdit(parent), name);
        made->setFont(plainFont(parent));
        return made;
    }

    static QSpinBox* spinBox(const char* name, int last, QWidget* parent)
    {
        auto* const made = named(new QSpinBox(parent), name);
        made->setFont(plainFont(parent));
        made->setMinimumSize(60, 26);
        made->setMaximumSize(QWIDGETSIZE_MAX, 26);
        made->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
        made->setMaximum(last);
        made->setSingleStep(10);
        made->setValue(last);
        return made;
    }

    static void addRow(QGridLayout* grid, int row, std::initializer_list<QWidget*> widgets)
    {
        int column = 0;
        for (QWidget* const widget : widgets) {
            grid->addWidget(widget, row, column++);
        }
    }

    QWidget* layoutWidget;
    QGroupBox* coordinates;
    QLabel* startX;
    QSpinBox* startXEdit;
    QLabel* startY;
    QSpinBox* startYEdit;
    QLabel* start;
    QLabel* end;
    QLabel* endX;
    QSpinBox* endXEdit;
    QLabel* endY;
    QSpinBox* endYEdit;
    QGroupBox* parameters;
    QLabel* idLabel;
    QLineEdit* idEdit;
    QLabel* nameLabel;
    QLineEdit* nameEdit;
    QLabel* eastLabel;
    QLineEdit* eastEdit;
    QLabel* westLabel;
    QLineEdit* westEdit;
};

VxCountingLinesGroupBox::VxCountingLinesGroupBox(QWidget* parent)
    : QGroupBox(parent)
{
    setObjectName(QStringLiteral("CountingLinesGroupBox"));
    resize(333, 280);
    setMinimumSize(329, 349); // rules over the size above
    setFlat(true);
    QFont bold = font();
    bold.setBold(true);
    bold.setWeight(QFont::Bold);
    setFont(bold);
    m_form = std::make_unique<Form>(this);
    m_form->translate(this);
    m_form->eastEdit->setText(Form::text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "East")));
    m_form->westEdit->setText(Form::text(QT_TRANSLATE_NOOP("CountingLinesGroupBox", "West")));
    m_form->layoutWidget->setGeometry(contentsRect());
    setFixedHeight(height());
}

VxCountingLinesGroupBox::~VxCountingLinesGroupBox() = default;

QPoint VxCountingLinesGroupBox::startingPoint()
{
    return QPoint(m_form->startXEdit->value(), m_form->startYEdit->value());
}

void VxCountingLinesGroupBox::setStartingPoint(const QPoint& point)
{
    m_form->startXEdit->setValue(point.x());
    m_form->startYEdit->setValue(point.y());
}

QPoint VxCountingLinesGroupBox::endPoint()
{
    return QPoint(m_form->endXEdit->value(), m_form->endYEdit->value());
}

void VxCountingLinesGroupBox::setEndPoint(const QPoint& point)
{
    m_form->endXEdit->setValue(point.x());
    m_form->endYEdit->setValue(point.y());
}

int VxCountingLinesGroupBox::id() const
{
    return m_form->idEdit->text().toInt(nullptr, 10);
}

void VxCountingLinesGroupBox::setId(int id)
{
    m_form->idEdit->setText(QString::number(id, 10));
}

QString VxCountingLinesGroupBox::lineName()
{
    return m_form->nameEdit->text();
}

void VxCountingLinesGroupBox::setLineName(const QString& name)
{
    m_form->nameEdit->setText(name);
}

QString VxCountingLinesGroupBox::rightName()
{
    return m_form->eastEdit->text();
}

void VxCountingLinesGroupBox::setRightName(const QString& name)
{
    m_form->eastEdit->setText(name);
}

QString VxCountingLinesGroupBox::leftName()
{
    return m_form->westEdit->text();
}

void VxCountingLinesGroupBox::setLeftName(const QString& name)
{
    m_form->westEdit->setText(name);
}

void VxCountingLinesGroupBox::setRange(const QRect& range)
{
    for (QSpinBox* const edit : {m_form->startXEdit, m_form->endXEdit}) {
        edit->setRange(range.left(), range.right());
    }
    for (QSpinBox* const edit : {m_form->startYEdit, m_form->endYEdit}) {
        edit->setRange(range.top(), range.bottom());
    }
}

void VxCountingLinesGroupBox::changeEvent(QEvent* event)
{
    QGroupBox::changeEvent(event);
    if (event->type() == QEvent::LanguageChange && m_form) {
        m_form->translate(this); // the titles of the sides are the user's
    }
}

void VxCountingLinesGroupBox::resizeEvent(QResizeEvent* event)
{
    QGroupBox::resizeEvent(event);
    if (m_form) {
        m_form->layoutWidget->setGeometry(contentsRect());
    }
}
}
