// SPDX-License-Identifier: MIT
// An icon whose small picture fills any rectangle as a frame of nine parts.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QMargins>
#include <QtGui/QIcon>

/// A QIcon that is painted as a nine-part frame: the picture is cut along four margins into corners, edges and a
/// centre, and these are fitted to whatever rectangle the icon is asked to fill. Buttons and frames of any size can
/// thus use one small picture. It has no size of its own: actualSize() is the size asked for.
///
/// Copies share the engine and with it the opacity. A copy that gets further pictures by addPixmap() or addFile()
/// parts from the others as every QIcon does, but getOpacity() and setOpacity() stay with the engine it came from.
class ZELKOV_WIDGETS_EXPORT BorderIcon : public QIcon
{
public:
    /// What fills the room that the target has more than the picture. The values are part of the interface.
    enum Stretch : int
    {
        StretchCenter = 0, ///< centre scaled, corners and edges at natural size
        StretchBorder = 1, ///< centre at natural size, corners and edges scaled
        TileCenter = 2,    ///< centre tiled, corners and edges at natural size
        TileBorder = 3     ///< centre at natural size, corners and edges tiled
    };

    class Engine;

    /// Two pixels on each side.
    static QMargins defaultMargins;

    /// No picture, defaultMargins, StretchCenter, opacity 1.
    BorderIcon();
    /// The picture serves QIcon::Normal and QIcon::Off, and with that every mode and state that has none of its own.
    /// \a margins are in pixels of the picture; with StretchBorder and TileBorder the two of an axis must not both
    /// be 0. \a opacity is 0 to 1.
    explicit BorderIcon(const QPixmap& pixmap, const QMargins& margins = defaultMargins,
        Stretch stretch = StretchCenter, double opacity = 1.0);
    /// The same with a picture from a file or resource.
    explicit BorderIcon(const QString& path, const QMargins& margins = defaultMargins,
        Stretch stretch = StretchCenter, double opacity = 1.0);
    BorderIcon(const BorderIcon& other);
    BorderIcon& operator=(const BorderIcon& other);
    ~BorderIcon();

    /// Replaces the painter's opacity while the icon is painted. Default 1.
    double getOpacity() const;
    void setOpacity(double opacity);

private:
    explicit BorderIcon(Engine* engine);

    Engine* m_engine; // owned by the icon's shared data
};
