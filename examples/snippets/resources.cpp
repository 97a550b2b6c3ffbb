// SPDX-License-Identifier: MIT
// The code of docs/resources.md.
#include "Snippets.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QFile>
#include <QtCore/QTranslator>

namespace snippets
{
void resources()
{
    //! [resources]
    QFile zones(":/Timezones/TimeZones.txt"); // name=number, one a line
    zones.open(QIODevice::ReadOnly);

    QTranslator german;                       // the library never installs one itself
    german.load(":/Translations/ZelkovWidgets_de.qm");
    QCoreApplication::installTranslator(&german);
    //! [resources]
    Q_ASSERT(zones.isOpen() && !german.isEmpty());
    QCoreApplication::removeTranslator(&german);
}
}
