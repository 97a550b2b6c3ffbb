// SPDX-License-Identifier: MIT
// What dials and stick look like.
#pragma once

#include <QtGui/QPixmap>

class QPalette;

namespace client
{
/// Pictures in the colours of a palette, so many device pixels wide and high. An application with files of its own
/// names them in its style sheet: qproperty-button: url(...).
namespace PtzPictures
{
/// The ground of a dial, with marks from the lower left over the top to the lower right.
QPixmap plate(const QPalette& colors, int size);
/// Upright; it points at the value when it is turned.
QPixmap knob(const QPalette& colors, int size, bool enabled);
QPixmap crosshair(const QPalette& colors, int size, bool enabled);
QPixmap point(const QPalette& colors, int size, bool enabled);
}
}
