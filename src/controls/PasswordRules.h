// SPDX-License-Identifier: MIT
// The strength rules for passwords, each as a plain function.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QString>

namespace vx
{
ZELKOV_WIDGETS_EXPORT bool hasUpperAndLowerCase(const QString& password);
ZELKOV_WIDGETS_EXPORT bool hasDigitAndLetter(const QString& password);
/// An underscore or anything that is no word character.
ZELKOV_WIDGETS_EXPORT bool hasSpecialCharacter(const QString& password);
/// The pattern matches the whole text, case sensitive. An invalid pattern matches nothing.
ZELKOV_WIDGETS_EXPORT bool hasAllowedCharactersOnly(const QString& password, const QString& pattern);
}
