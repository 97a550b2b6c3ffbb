// SPDX-License-Identifier: MIT
// The number by which a client knows a handle of a slider.
#pragma once

#include "foundation/Export.h"

namespace vx
{
/// Chosen by the client; -1 means no handle. Known to the meta-type system as "vx::NubsieID" from the moment the
/// library is loaded.
typedef int NubsieID;

/// The meta-type of NubsieID, which is that of int.
ZELKOV_WIDGETS_EXPORT int nubsieIDMetaType();
}
