// SPDX-License-Identifier: MIT
// A row to search with.
#include "popover/items/SearchItem.h"

#include "CoreQt/Connect.h"

#include <QtGui/QIcon>
#include <QtGui/QPixmap>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QStyle>

namespace vx
{
namespace PopoverWidget
{

namespace
{
constexpr int c_searchMark = 20; // side of both marks
constexpr int c_searchMarkInset = 4;
}

SearchItem::SearchItem(const QString& text, const QString& placeholder, const QString& objectName, int id,
    QFlags<EItemFlag> flags, QWidget* parent)
    : EditItem(text, placeholder, objectName, id, flags, parent, nullptr)
    , m_loop(new QLabel(lineEdit()))
    , m_clearButton(new QPushButton(lineEdit()))
{
    QMargins margins = lineEdit()->textMargins();
    margins.setLeft(margins.left() + c_searchMark);
    margins.setRight(margins.right() + c_searchMark);
    lineEdit()->setTextMargins(margins);

    m_loop->setScaledContents(true);
    m_loop->setPixmap(QPixmap(QStringLiteral(":/SearchItem/searchLoop.png")));
    m_loop->setMouseTracking(true);

    m_clearButton->setIcon(QIcon(QStringLiteral(":/SearchItem/searchClear.png")));
    m_clearButton->setFlat(true);
    m_clearButton->setMouseTracking(true);
    m_clearButton->setCursor(Qt::ArrowCursor);
    m_clearButton->hide();

    vx::connect(lineEdit(), "2textChanged(const QString&)", this, "1searchEdited(const QString&)",
        Qt::AutoConnection);
    vx::connect(m_clearButton, "2clicked()", this, "1clearClicked()", Qt::AutoConnection);
}

SearchItem::~SearchItem() = default;

void SearchItem::searchEdited(const QString& text)
{
    const auto reporting = m_lineEdit.report();
    m_clearButton->setVisible(!text.isEmpty());
    Q_EMIT searchChanged(text);
}

void SearchItem::clearClicked()
{
    const auto reporting = m_lineEdit.report();
    m_lineEdit->clear();
}

void SearchItem::showEvent(QShowEvent* event)
{
    EditItem::showEvent(event);
    placeMarks();
}

void SearchItem::resizeEvent(QResizeEvent* event)
{
    EditItem::resizeEvent(event);
    placeMarks();
}

void SearchItem::placeMarks()
{
    if (!m_lineEdit) {
        return;
    }
    const QRect room = m_lineEdit->rect();
    const QSize size(c_searchMark, c_searchMark);
    m_loop->setGeometry(QStyle::alignedRect(Qt::LeftToRight, Qt::AlignLeft | Qt::AlignVCenter, size, room)
                            .translated(c_searchMarkInset, 0));
    m_clearButton->setGeometry(QStyle::alignedRect(Qt::LeftToRight, Qt::AlignRight | Qt::AlignVCenter, size, room)
                                   .translated(-c_searchMarkInset, 0));
}

} // namespace PopoverWidget
} // namespace vx
