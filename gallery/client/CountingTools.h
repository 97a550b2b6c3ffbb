// SPDX-License-Identifier: MIT
// The form of the counting line, and the line in the picture.
#pragma once

#include <QtCore/QHash>
#include <QtCore/QPoint>
#include <QtCore/QPointer>
#include <QtWidgets/QFrame>

class QLabel;

namespace vx
{
class VxCountingLinesGroupBox;
}

namespace client
{
class CountingLine;

/// A panel that edits the counting line of one camera: by its fields, or in the picture. Each camera keeps its own.
class CountingTools : public QFrame
{
    Q_OBJECT

public:
    explicit CountingTools(QWidget* parent = nullptr);
    ~CountingTools() override;

    /// Edits the line of that camera in that view. Null puts the line away.
    void workIn(QWidget* view, int camera);

Q_SIGNALS:
    /// Both ends are pixels of the camera (1920 x 1080).
    void lineChanged(int camera, const QPoint& start, const QPoint& end);

protected:
    void changeEvent(QEvent* event) override;

private:
    struct Line
    {
        QPoint start;
        QPoint end;
        QString name;
        QString left;
        QString right;
    };

    void retranslate();
    void takeForm();
    void fillForm(const Line& line);
    void showLine();

    vx::VxCountingLinesGroupBox* m_form;
    QLabel* m_hint;
    QHash<int, Line> m_lines;
    QPointer<QWidget> m_view;
    QPointer<CountingLine> m_line;
    int m_camera = -1;
    bool m_fills = false;
};
}
