// SPDX-License-Identifier: MIT
// Keeps the two resource bundles in a static build. Each bundle registers itself when the library is loaded
// and takes itself out when it is unloaded; an archive however drops objects that nobody refers to. A client of
// the archive links with "-u zelkov_resource_anchor", which pulls this object in, and this one pulls in the bundles.
#include <QtCore/QtGlobal>
#include <QtCore/QDir>

static void keepBundles()
{
    Q_INIT_RESOURCE(zelkov_images);
    Q_INIT_RESOURCE(zelkov_translations);
}

extern "C" {
extern void (*const zelkov_resource_anchor)();
void (*const zelkov_resource_anchor)() = &keepBundles;
}
