// SPDX-License-Identifier: MIT
// Page "Panels": FadeView and FadeStripeView over a live picture.
#pragma once

#include <QtCore/QTimer>
#include <QtWidgets/QCheckBox>

#include "../Page.h"
#include "views/FadeView.h"

class FadeStripeView;

namespace gallery
{
class CameraTile;

/// A panel with a grip on its strip and a row of small pictures: what a client's subclass paints. A click on the
/// strip opens and closes it.
class PicturePanel : public FadeView
{
    Q_OBJECT

public:
    PicturePanel(EPositions position, const QString& caption, int seed, QWidget* parent);

Q_SIGNALS:
    void stripClicked();

protected:
    void paintEvent(QPaintEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    QRect strip() const;

    QString m_caption;
    QVector<QPixmap> m_pictures;
};

/// Rows of small pictures, as many as there is height for: the contents of the stripe.
class PictureRows : public QWidget
{
    Q_OBJECT

public:
    static const int s_rowHeight = 84;

    explicit PictureRows(QWidget* parent = nullptr);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QVector<QPixmap> m_pictures;
};

class PanelsPage : public Page
{
    Q_OBJECT

public:
    explicit PanelsPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;
    bool eventFilter(QObject* object, QEvent* event) override;

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    QWidget* makeSettings();
    FadeStripeView* makeStripe();
    void toggle(FadeView* panel);

    QWidget* m_view;
    CameraTile* m_camera;
    PicturePanel* m_top;
    FadeStripeView* m_bottom;
    QCheckBox* m_animated = nullptr;
    QTimer m_frames;
};
}
