// SPDX-License-Identifier: MIT
// A line edit with a magnifier and a clear button.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QSize>
#include <QtWidgets/QLineEdit>

class QLabel;
class QPushButton;

namespace vx
{
/// A line edit for search words: a magnifier at its left edge and, while there is text, a clear button at its right
/// edge. The sides are the same in every layout direction.
///
/// A private slot of this class has the name of the signal textChanged(): connect to &QLineEdit::textChanged.
class ZELKOV_WIDGETS_EXPORT SearchEdit : public QLineEdit
{
    Q_OBJECT

public:
    explicit SearchEdit(QWidget* parent = nullptr);
    /// Starts with that text.
    explicit SearchEdit(const QString& text, QWidget* parent = nullptr);
    ~SearchEdit() override;

    /// Picture of the clear button, a file or resource path. Shown at 20 by 20 pixels.
    void setClearIcon(const QString& path);
    /// Picture in place of the magnifier, a file or resource path. Scaled to 20 by 20 pixels.
    void setLoopIcon(const QString& path);

protected:
    void resizeEvent(QResizeEvent* event) override;

private Q_SLOTS:
    void textChanged(QString text);

private:
    void initialize();

    QLabel* m_loopLabel = nullptr;
    QPushButton* m_clearButton = nullptr;
    QSize m_iconSize;
};
}
