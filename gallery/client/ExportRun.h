// SPDX-License-Identifier: MIT
// What is to be seen while an export runs.
#pragma once

#include <QtCore/QElapsedTimer>
#include <QtCore/QString>
#include <QtCore/QTimer>
#include <QtWidgets/QLabel>
#include <QtWidgets/QProgressBar>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QWidget>

namespace vx
{
class BusyOverlayView;
class ElidedLabel;
}

namespace client
{
/// A card in the middle of its parent, with a spinner, the time since the start and a way out. It runs a few seconds,
/// since nothing is really written.
class ExportRun : public QWidget
{
    Q_OBJECT

public:
    /// Of an export, in milliseconds.
    static const int s_duration = 4000;

    ExportRun(const QString& fileName, int duration, QWidget* parent);

    /// To the middle of the parent.
    void place();

Q_SIGNALS:
    /// At the end or by the user. Once.
    void finished(bool complete);

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void end(bool complete);
    void retranslate();
    void arrange();

    QString m_fileName;
    vx::ElidedLabel* m_title;
    QProgressBar* m_progress;
    QPushButton* m_cancel;
    vx::BusyOverlayView* m_busy;
    QTimer m_end;
    QTimer m_steps;
    QElapsedTimer m_clock;
    bool m_ended = false;
};
}
