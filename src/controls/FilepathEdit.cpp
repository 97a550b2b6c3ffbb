// SPDX-License-Identifier: MIT
#include "controls/FilepathEdit.h"

#include "CoreQt/Connect.h"

#include <QtCore/QDir>
#include <QtCore/QFileInfo>
#include <QtCore/QMimeData>
#include <QtCore/QPointer>
#include <QtCore/QUrl>
#include <QtGui/QDragEnterEvent>
#include <QtWidgets/QFileDialog>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QStyle>

namespace vx
{
FilepathEdit::FilepathEdit(QWidget* parent)
    : QLineEdit(parent)
{
    initialize();
}

FilepathEdit::FilepathEdit(const QString& text, QWidget* parent)
    : QLineEdit(text, parent)
{
    initialize();
}

FilepathEdit::~FilepathEdit() = default;

void FilepathEdit::initialize()
{
    setAcceptDrops(true);
    setObjectName(QStringLiteral("filepathedit"));
    QMargins margins = textMargins();
    margins.setRight(margins.right() + m_buttonSize.width());
    setTextMargins(margins);
    m_chooserButton = new QPushButton(this);
    m_chooserButton->setFlat(true);
    m_chooserButton->setIcon(QIcon(QStringLiteral(":/SearchItem/btn_pen.png")));
    m_chooserButton->setMouseTracking(true);
    m_chooserButton->setCursor(Qt::ArrowCursor);
    vx::connect(m_chooserButton, "2clicked()", this, "1openFileChooser()", Qt::AutoConnection);
}

bool FilepathEdit::urlMode() const
{
    return m_urlMode;
}

void FilepathEdit::setUrlMode(bool on)
{
    m_urlMode = on;
}

void FilepathEdit::dragEnterEvent(QDragEnterEvent* event)
{
    if (event->mimeData()->hasUrls()) {
        event->acceptProposedAction();
    } else {
        event->ignore();
    }
}

void FilepathEdit::dropEvent(QDropEvent* event)
{
    const QList<QUrl> urls = event->mimeData()->urls();
    if (!event->mimeData()->hasUrls() || urls.isEmpty()) {
        event->ignore();
        return;
    }
    event->acceptProposedAction();
    setText(QFileInfo(urls.first().toLocalFile()).absolutePath());
}

void FilepathEdit::resizeEvent(QResizeEvent* event)
{
    QLineEdit::resizeEvent(event);
    // Without a horizontal alignment it is the direction that chooses the side.
    m_chooserButton->setGeometry(QStyle::alignedRect(Qt::RightToLeft, Qt::AlignVCenter, m_buttonSize, rect()));
}

void FilepathEdit::openFileChooser()
{
    const QPointer<FilepathEdit> alive(this);
    Q_EMIT fileChooserOpened();
    if (!alive) {
        return;
    }
    setFocus();
    // Not the static function: its dialog is on the stack and would be deleted there together with this edit.
    const QPointer<QFileDialog> dialog(
        new QFileDialog(this, tr("Choose Directory..."), QDir(text()).absolutePath()));
    dialog->setFileMode(QFileDialog::Directory);
    dialog->setOption(QFileDialog::ShowDirsOnly);
    QString path;
    if (dialog->exec() == QDialog::Accepted && dialog) {
        path = dialog->selectedFiles().value(0);
    }
    delete dialog;
    if (!alive) {
        return;
    }
    Q_EMIT fileChooserClosed();
    if (alive && !path.isEmpty()) {
        setText(path);
    }
}
}
