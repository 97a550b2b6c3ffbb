// SPDX-License-Identifier: MIT
// Registers the name of the handle's number.
#include "foundation/NubsieID.h"

#include <QtCore/QMetaType>

namespace vx
{
namespace
{
// At load, so that a queued connection may name the type before any handle exists.
[[maybe_unused]] const int s_metaType = nubsieIDMetaType();
}

int nubsieIDMetaType()
{
    static const int type = qRegisterMetaType<NubsieID>("vx::NubsieID");
    return type;
}
}
