// SPDX-License-Identifier: MIT
// The code of docs/edits.md.
//! [edits]
#include "controls/DateTimeDefaultEdit.h"
#include "controls/FilepathEdit.h"
#include "controls/SearchEdit.h"

//! [edits]
#include "Snippets.h"

#include <QtCore/QDir>
#include <QtWidgets/QVBoxLayout>

namespace snippets_edits
{
class DeviceModel : public QObject
{
public:
    void setFilter(const QString& text) { m_filter = text; }
    QString m_filter;
};
struct Recording
{
    QDateTime end() const { return QDateTime(QDate(2026, 4, 1), QTime(8, 15)); }
};
class Export : public QWidget
{
public:
    void setFolder(const QString& folder) { m_folder = folder; }
    void build(DeviceModel* model, const Recording& recording)
    {
        //! [edits]
        auto* search = new vx::SearchEdit(this);
        connect(search, &QLineEdit::textChanged, model, &DeviceModel::setFilter); // not &vx::SearchEdit::textChanged

        auto* folder = new vx::FilepathEdit(QDir::homePath(), this);
        connect(folder, &QLineEdit::textChanged, this, &Export::setFolder);

        auto* end = new vx::DateTimeDefaultEdit(this);
        end->setDefaultDateTime(recording.end());
        //! [edits]
        search->setText("gate");
        folder->setText("/tmp");
    }
    QString m_folder;
};
}

namespace snippets
{
void edits()
{
    snippets_edits::Export client;
    snippets_edits::DeviceModel model;
    client.build(&model, {});
    client.show();
    pause();
    Q_ASSERT(model.m_filter == "gate" && client.m_folder == "/tmp");
}
}
