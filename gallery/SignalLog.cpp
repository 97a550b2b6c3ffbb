// SPDX-License-Identifier: MIT
// Records signals by their meta-objects, with their arguments in words.
#include "SignalLog.h"

#include <QtCore/QMetaMethod>
#include <QtCore/QPoint>
#include <QtCore/QSize>
#include <QtCore/QStringList>
#include <QtWidgets/QWidget>

#include "input/MouseEvent.h"
#include "input/MouseGesture.h"
#include "popover/PopoverFlags.h"

namespace gallery
{
namespace
{
// The flags of a performed row: "text, left button".
QString flagWords(int flags)
{
    const char* const words[] = {"icon", "text", "additional text", "control", "left button", "right button",
        "double click", "disclosure"};
    QStringList set;
    for (int bit = 0; bit < 8; ++bit) {
        if ((flags & (1 << bit)) != 0) {
            set << QLatin1String(words[bit]);
        }
    }
    return set.isEmpty() ? QStringLiteral("0") : set.join(QLatin1String(" | "));
}

QString pointText(const QPoint& point)
{
    return QStringLiteral("%1,%2").arg(point.x()).arg(point.y());
}

QString argumentText(const QByteArray& type, int id, const void* data)
{
    if (type.endsWith("MouseGesture::Ptr") || type == "QSharedPointer<vx::MouseGesture>") {
        const vx::MouseGesture::Ptr gesture = *static_cast<const vx::MouseGesture::Ptr*>(data);
        if (!gesture) {
            return QStringLiteral("null");
        }
        const QString name = gesture->clickedWidgetName();
        return name.isEmpty() ? QStringLiteral("?") : name;
    }
    if (type.endsWith("MouseEvent")) {
        return pointText(static_cast<const vx::MouseEvent*>(data)->pos());
    }
    if (type == "QPoint") {
        return pointText(*static_cast<const QPoint*>(data));
    }
    if (type.endsWith('*')) {
        const QVariant value(id == QMetaType::UnknownType ? int(QMetaType::VoidStar) : id, data);
        const QObject* object = value.value<QObject*>();
        return object ? object->objectName() : QString::fromLatin1(type);
    }
    if (id == QMetaType::UnknownType) {
        return QString::fromLatin1(type);
    }
    if (type.endsWith("EItemPerformedFlags")) {
        return flagWords(int(*static_cast<const vx::PopoverWidget::EItemPerformedFlags*>(data)));
    }
    const QVariant value = id == QMetaType::QVariant ? *static_cast<const QVariant*>(data) : QVariant(id, data);
    if (!value.isValid()) {
        return QStringLiteral("null");
    }
    if (value.type() == QVariant::List) {
        QStringList texts;
        const QVariantList list = value.toList();
        for (const QVariant& entry : list) {
            texts << entry.toString();
        }
        return QLatin1Char('(') + texts.join(QStringLiteral(", ")) + QLatin1Char(')');
    }
    if (value.type() == QVariant::String) {
        return QLatin1Char('"') + value.toString() + QLatin1Char('"');
    }
    if (value.canConvert<QString>()) {
        return value.toString();
    }
    return QString::fromLatin1(type);
}

// Receives signals without slots of its own: each connected signal gets a method number above those of
// QObject, and qt_metacall() tells them apart. A Q_OBJECT macro would take that function away.
class SignalTap : public QObject
{
public:
    SignalTap(QObject* sender, const QString& name, const QStringList& chatty, SignalLog& log)
        : QObject(&log), m_name(name), m_log(log)
    {
        const QMetaObject* base = sender->isWidgetType() ? &QWidget::staticMetaObject : &QObject::staticMetaObject;
        const QMetaObject* meta = sender->metaObject();
        for (int i = base->methodCount(); i < meta->methodCount(); ++i) {
            const QMetaMethod method = meta->method(i);
            if (method.methodType() != QMetaMethod::Signal) {
                continue;
            }
            const int number = QObject::staticMetaObject.methodCount() + m_methods.size();
            m_methods.append({method, chatty.contains(QString::fromLatin1(method.name()))});
            QMetaObject::connect(sender, i, this, number, Qt::DirectConnection);
        }
        connect(sender, &QObject::destroyed, this, &QObject::deleteLater);
    }

    int qt_metacall(QMetaObject::Call call, int id, void** arguments) override
    {
        id = QObject::qt_metacall(call, id, arguments);
        if (id < 0 || call != QMetaObject::InvokeMetaMethod) {
            return id;
        }
        if (id < m_methods.size()) {
            record(m_methods.at(id).method, m_methods.at(id).chatty, arguments);
        }
        return -1;
    }

private:
    struct Method
    {
        QMetaMethod method;
        bool chatty;
    };

    void record(const QMetaMethod& method, bool chatty, void** arguments)
    {
        QStringList texts;
        const QList<QByteArray> types = method.parameterTypes();
        for (int i = 0; i < types.size(); ++i) {
            texts.append(argumentText(types.at(i), method.parameterType(i), arguments[i + 1]));
        }
        m_log.record(m_name, QString::fromLatin1(method.name()), texts.join(QStringLiteral(", ")), chatty);
    }

    QString m_name;
    SignalLog& m_log;
    QVector<Method> m_methods;
};
}

SignalLog::SignalLog(QObject* parent)
    : QAbstractTableModel(parent)
{
}

SignalLog::~SignalLog()
{
    // The taps are children and would still record into a half-destroyed log.
    qDeleteAll(children());
}

bool SignalLog::openFile(const QString& path)
{
    m_file.close();
    m_file.setFileName(path);
    return m_file.open(QIODevice::WriteOnly | QIODevice::Append | QIODevice::Text);
}

void SignalLog::watch(QObject* object, const QString& name, const QStringList& chatty)
{
    if (object) {
        new SignalTap(object, name, chatty, *this);
    }
}

void SignalLog::writeComment(const QString& text)
{
    if (m_file.isOpen()) {
        m_file.write("# " + text.toUtf8() + '\n');
        m_file.flush();
    }
}

void SignalLog::record(const QString& object, const QString& signal, const QString& arguments, bool chatty)
{
    const QTime now = QTime::currentTime();
    if (m_file.isOpen()) {
        m_file.write(QStringLiteral("%1 %2.%3(%4)\n")
                         .arg(now.toString(QStringLiteral("HH:mm:ss.zzz")), object, signal, arguments)
                         .toUtf8());
        m_file.flush();
    }
    if (chatty && m_folds && fold(object, signal, arguments, now)) {
        return;
    }
    if (m_rows.size() >= s_maximumRows) {
        const int gone = s_maximumRows / 10;
        beginRemoveRows(QModelIndex(), 0, gone - 1);
        m_rows.remove(0, gone);
        endRemoveRows();
    }
    beginInsertRows(QModelIndex(), m_rows.size(), m_rows.size());
    m_rows.append({now, object, signal, arguments, 1, chatty});
    endInsertRows();
}

bool SignalLog::fold(const QString& object, const QString& signal, const QString& arguments, QTime now)
{
    // Floods come in pairs (moved and panning), so a signal is looked for across other chatty rows.
    for (int i = m_rows.size() - 1; i >= 0 && m_rows.at(i).chatty; --i) {
        Row& row = m_rows[i];
        if (row.object == object && row.signal == signal) {
            row.time = now;
            row.arguments = arguments;
            ++row.repetitions;
            Q_EMIT dataChanged(index(i, 0), index(i, cCount - 1));
            return true;
        }
    }
    return false;
}

void SignalLog::clear()
{
    beginResetModel();
    m_rows.clear();
    endResetModel();
}

int SignalLog::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_rows.size();
}

int SignalLog::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(cCount);
}

QVariant SignalLog::data(const QModelIndex& index, int role) const
{
    if (!index.isValid() || role != Qt::DisplayRole) {
        return {};
    }
    const Row& row = m_rows.at(index.row());
    switch (index.column()) {
    case cTime:
        return row.time.toString(QStringLiteral("HH:mm:ss.zzz"));
    case cObject:
        return row.object;
    case cSignal:
        return row.repetitions == 1 ? row.signal : QStringLiteral("%1 ×%2").arg(row.signal).arg(row.repetitions);
    default:
        return row.arguments;
    }
}

QVariant SignalLog::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal) {
        return {};
    }
    if (role == Qt::TextAlignmentRole) {
        return int(Qt::AlignLeft | Qt::AlignVCenter);
    }
    if (role != Qt::DisplayRole) {
        return {};
    }
    switch (section) {
    case cTime:
        return tr("Time");
    case cObject:
        return tr("Object");
    case cSignal:
        return tr("Signal");
    default:
        return tr("Arguments");
    }
}
}
