// SPDX-License-Identifier: MIT
#include "controls/SearchEdit.h"

#include "CoreQt/Connect.h"

#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QStyle>

namespace vx
{
namespace
{
// A name with a null character is no file; Qt would print a warning.
QString searchEditFile(const QString& path)
{
    return path.contains(QChar::Null) ? QString() : path;
}
}

SearchEdit::SearchEdit(QWidget* parent)
    : QLineEdit(parent)
{
    initialize();
}

SearchEdit::SearchEdit(const QString& text, QWidget* parent)
    : QLineEdit(text, parent)
{
    initialize();
}

SearchEdit::~SearchEdit() = default;

void SearchEdit::initialize()
{
    m_iconSize = QSize(20, 20);
    QMargins margins = textMargins();
    margins.setLeft(margins.left() + m_iconSize.width());
    margins.setRight(margins.right() + m_iconSize.width());
    setTextMargins(margins);

    m_loopLabel = new QLabel(this);
    m_loopLabel->setScaledContents(true);
    m_loopLabel->setPixmap(QPixmap(QStringLiteral(":/SearchItem/searchLoop.png")));
    m_loopLabel->setMouseTracking(true);

    m_clearButton = new QPushButton(this);
    m_clearButton->setFlat(true);
    m_clearButton->setIcon(QIcon(QStringLiteral(":/SearchItem/searchClear.png")));
    m_clearButton->setMouseTracking(true);
    m_clearButton->setCursor(Qt::ArrowCursor);
    m_clearButton->setFocusPolicy(Qt::NoFocus);
    m_clearButton->hide();

    vx::connect(this, "2textChanged(const QString&)", this, "1textChanged(QString)", Qt::AutoConnection);
    vx::connect(m_clearButton, "2clicked()", this, "1clear()", Qt::AutoConnection);
    textChanged(text());
}

void SearchEdit::setClearIcon(const QString& path)
{
    m_clearButton->setIcon(QIcon(searchEditFile(path)));
}

void SearchEdit::setLoopIcon(const QString& path)
{
    m_loopLabel->setPixmap(QPixmap(searchEditFile(path)));
}

void SearchEdit::textChanged(QString text)
{
    m_clearButton->setVisible(!text.isEmpty());
}

void SearchEdit::resizeEvent(QResizeEvent* event)
{
    QLineEdit::resizeEvent(event);
    // Without a horizontal alignment it is the direction that chooses the side.
    m_loopLabel->setGeometry(QStyle::alignedRect(Qt::LeftToRight, Qt::AlignVCenter, m_iconSize, rect()));
    m_clearButton->setGeometry(QStyle::alignedRect(Qt::RightToLeft, Qt::AlignVCenter, m_iconSize, rect()));
}
}
