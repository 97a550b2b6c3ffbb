// SPDX-License-Identifier: MIT
// A label whose scaled picture keeps its proportions.
#pragma once

#include "foundation/Export.h"

#include <QLabel>
#include <QPixmap>
#include <QSize>

class QPaintEvent;

namespace vx
{
/// A QLabel that, with scaled contents, scales its picture so that it covers the label and keeps its proportions:
/// it stands centred and is cut where it overhangs. Without scaled contents it is a QLabel.
class ZELKOV_WIDGETS_EXPORT Label : public QLabel
{
    Q_OBJECT

public:
    // As the constructors of QLabel.
    explicit Label(QWidget* parent = nullptr, Qt::WindowFlags flags = Qt::WindowFlags());
    explicit Label(const QString& text, QWidget* parent = nullptr, Qt::WindowFlags flags = Qt::WindowFlags());
    ~Label() override;

    /// Whether the picture keeps its proportions (the default) or is stretched as QLabel does it.
    bool keepAspectRatio() const;
    void setKeepAspectRatio(bool on);

    /// Hides that of QLabel.
    void setPixmap(const QPixmap& pixmap);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    bool m_keepAspectRatio = true;
    QPixmap m_scaledPixmap; ///< the last scaling: of the picture m_scaledFrom, for a label of m_scaledFor pixels
    qint64 m_scaledFrom = 0;
    QSize m_scaledFor;
};
}
