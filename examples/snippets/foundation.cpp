// SPDX-License-Identifier: MIT
// The code of docs/foundation.md.
//! [ranges]
#include "foundation/ValueRange.h"

//! [ranges]
//! [centre]
#include "foundation/AlignedWidget.h"

//! [centre]
//! [log]
#include "foundation/LogStatement.h"

//! [log]
#include "Snippets.h"

#include <QtCore/QMap>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QVBoxLayout>

namespace snippets_foundation
{
class Client : public QWidget
{
public:
    QString quality(int bitrate)
    {
        //! [ranges]
        const QMap<vx::ValueRange, QString> names{{{0, 499}, tr("poor")}, {{500, 1999}, tr("fair")}, {2000, tr("exact")}};
        for (auto entry = names.begin(); entry != names.end(); ++entry) {
            if (entry.key().contains(bitrate)) {
                return entry.value(); // of overlapping ranges the one that starts lower
            }
        }
        //! [ranges]
        return QString();
    }
    void build(QVBoxLayout* layout)
    {
        //! [centre]
        auto* centre = new vx::AlignedWidget(new QPushButton(tr("Connect")), this); // takes the button as its own
        layout->addWidget(centre, 1);
        //! [centre]
    }
    void paint(const QSize& size)
    {
        //! [log]
        ZELKOV_LOG(vx::c_LogFault, "client::View::paint", "no picture for " << size.width() << " pixels");
        //! [log]
    }
};
}

namespace snippets
{
void foundation()
{
    snippets_foundation::Client client;
    client.build(new QVBoxLayout(&client));
    Q_ASSERT(client.quality(500) == "fair" && client.quality(2000) == "exact" && client.quality(2001).isEmpty());
    client.paint(client.size());
    client.show();
    pause();
}
}
