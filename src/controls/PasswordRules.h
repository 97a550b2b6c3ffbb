// SPDX-License-Identifier: MIT
// The strength rules for passwords, each as a plain function.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QString>

namespace vx
{
/// A small and a capital letter, a to z.
ZELKOV_WIDGETS_EXPORT bool hasUpperAndLowerCase(const QString& password);
/// A digit and a letter, a to z in either case.
ZELKOV_WIDGETS_EXPORT bool hasDigitAndLetter(const QString& password);
/// An underscore or anything that is no word character.
ZELKOV_WIDGETS_EXPORT bool hasSpecialCharacter(const QString& password);
/// The pattern matches the whole text, case sensitive. An invalid pattern matches nothing.
ZELKOV_WIDGETS_EXPORT bool hasAllowedCharactersOnly(const QString& password, const QString& pattern);
}
