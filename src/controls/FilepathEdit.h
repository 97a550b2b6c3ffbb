// SPDX-License-Identifier: MIT
// A line edit for a directory, picked by a dialog or by a drop.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QSize>
#include <QtWidgets/QLineEdit>

class QPushButton;

namespace vx
{
/// A line edit that holds the path of a directory: typed, picked in a dialog by the button at its right edge, or
/// taken from a file that is dropped on it. The object name is "filepathedit".
///
/// A dropped URL gives the absolute path of the directory that holds it, for a directory its parent.
class ZELKOV_WIDGETS_EXPORT FilepathEdit : public QLineEdit
{
    Q_OBJECT

public:
    explicit FilepathEdit(QWidget* parent = nullptr);
    /// Starts with that path.
    explicit FilepathEdit(const QString& text, QWidget* parent = nullptr);
    ~FilepathEdit() override;

    bool urlMode() const; //!< default false
    /// Kept for clients; nothing in this class depends on it.
    void setUrlMode(bool on);

Q_SIGNALS:
    /// Just before the dialog opens.
    void fileChooserOpened();
    /// The dialog is closed, accepted or not; the text is set after that.
    void fileChooserClosed();

protected:
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private Q_SLOTS:
    void openFileChooser();

private:
    void initialize();

    QSize m_buttonSize{20, 20};
    bool m_urlMode = false;
    QPushButton* m_chooserButton = nullptr;
};
}
