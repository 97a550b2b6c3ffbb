// SPDX-License-Identifier: MIT
// Puts the entries of the rooms together.
#include "Registry.h"

namespace zelkovtest
{
const std::vector<Entry>& registry()
{
    static const std::vector<Entry> entries = [] {
        std::vector<Entry> all;
        for (const std::vector<Entry>& room :
            {platformEntries(), foundationEntries(), indicatorsEntries(), inputEntries(), slidersEntries(),
                nubsieEntries(), timeLineEntries(),
                viewsEntries(),
                popoverItemEntries(), balloonEntries(), controllerEntries(), modelsEntries(), clickEntries(),
                labelEntries(), switchEntries(), editsEntries(), overlayEntries(), controlsEntries(), rowEntries()}) {
            all.insert(all.end(), room.begin(), room.end());
        }
        return all;
    }();
    return entries;
}
}
