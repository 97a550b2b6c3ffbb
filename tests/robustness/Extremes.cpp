// SPDX-License-Identifier: MIT
// Values at and beyond the edge.
#include <climits>
#include <limits>
#include <memory>

#include <QtCore/QDateTime>
#include <QtCore/QMetaProperty>
#include <QtCore/QRect>
#include <QtCore/QUrl>
#include <QtGui/QColor>
#include <QtGui/QFont>
#include <QtGui/QIcon>
#include <QtGui/QPainter>
#include <QtGui/QPalette>
#include <QtGui/QPixmap>
#include <QtWidgets/QApplication>
#include <QtWidgets/QWidget>

#include "Saboteur.h"
#include "Suites.h"

namespace zelkovtest
{
namespace
{
struct Stage
{
    Stage(const Entry& entry)
        : host(new QWidget)
    {
        host->resize(200, 150);
        subject = entry.create(host.get());
        host->show();
    }

    // True while the subject lives.
    bool look()
    {
        if (subject.alive()) {
            subject.widget->sizeHint();
            subject.widget->minimumSizeHint();
            paint(subject.widget);
        }
        QCoreApplication::processEvents();
        return subject.alive();
    }

    std::unique_ptr<QWidget> host;
    Subject subject;
};

QVariantList extremeEnumerators(const QMetaEnum& meta)
{
    // Numbers outside the enumeration are not for moc's cast: what it does with them is undefined.
    QVariantList result;
    int all = 0;
    for (int i = 0; i < meta.keyCount(); ++i) {
        result << meta.value(i);
        all |= meta.value(i);
    }
    if (meta.isFlag()) {
        result << 0 << all;
    }
    return result;
}

QString died(const QByteArray& what, const QVariant& value)
{
    return QStringLiteral("the instance died of %1(%2)").arg(QLatin1String(what), value.toString().left(60));
}
}

QVariantList extremeValues(int type)
{
    QVariantList values;
    switch (type) {
    case QMetaType::Bool:
        return {true, false};
    case QMetaType::Int:
        return {20, 0, 1, -1, 2, 90, 255, 5760, -5760, 65536, INT_MAX, INT_MAX - 1, INT_MIN, INT_MIN + 1};
    case QMetaType::UInt:
        return {20u, 0u, 1u, UINT_MAX, UINT_MAX - 1u, 0x80000000u};
    case QMetaType::LongLong:
        return {20ll, 0ll, 1ll, -1ll, qint64(INT_MAX) + 1, LLONG_MAX, LLONG_MIN};
    case QMetaType::ULongLong:
        return {20ull, 0ull, 1ull, ULLONG_MAX, ULLONG_MAX - 1ull};
    case QMetaType::Double:
    case QMetaType::Float:
        return {0.5, 0.0, -0.0, 1.0, -1.0, 1e-300, 1e9, -1e9, std::numeric_limits<double>::max(),
            std::numeric_limits<double>::lowest(), std::numeric_limits<double>::infinity(),
            -std::numeric_limits<double>::infinity(), std::numeric_limits<double>::quiet_NaN()};
    case QMetaType::QString: {
        values << QStringLiteral("3") << QString() << QLatin1String("") << QStringLiteral(" ")
               << QStringLiteral("%1 %n &&") << QStringLiteral("a\nb\tc") << QStringLiteral("<b>1</b>")
               << QString(QChar(0)) << QString(QChar(0xD800)) << QString::fromUtf8("\xF0\x9F\x93\xB7")
               << QString::fromUtf8("\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D") << QString(2000, QLatin1Char('W'));
        return values;
    }
    case QMetaType::QByteArray:
        return {QByteArray("3"), QByteArray(), QByteArray(1, '\0'), QByteArray(5000, 'x')};
    case QMetaType::QSize:
        return {QSize(20, 20), QSize(0, 0), QSize(), QSize(-5, -5), QSize(1, 1), QSize(0, 20), QSize(20, 0),
            QSize(1, 1000), QSize(1000, 1), QSize(INT_MIN, INT_MIN), QSize(INT_MAX, INT_MAX), QSize(INT_MAX, 1)};
    case QMetaType::QSizeF:
        return {QSizeF(20, 20), QSizeF(0, 0), QSizeF(), QSizeF(-5, -5), QSizeF(1e9, 1e9)};
    case QMetaType::QPoint:
        return {QPoint(3, 4), QPoint(), QPoint(-1, -1), QPoint(INT_MAX, INT_MAX), QPoint(INT_MIN, INT_MIN),
            QPoint(INT_MIN, INT_MAX)};
    case QMetaType::QPointF:
        return {QPointF(3, 4), QPointF(), QPointF(-1, -1), QPointF(1e9, -1e9)};
    case QMetaType::QRect:
        return {QRect(0, 0, 10, 10), QRect(), QRect(5, 5, -10, -10), QRect(INT_MIN, INT_MIN, INT_MAX, INT_MAX)};
    case QMetaType::QRectF:
        return {QRectF(0, 0, 10, 10), QRectF(), QRectF(5, 5, -10, -10), QRectF(-1e9, -1e9, 2e9, 2e9)};
    case QMetaType::QColor:
        values << QColor(Qt::red) << QColor() << QColor(Qt::transparent) << QColor(0, 0, 0) << QColor(255, 255, 255, 0)
               << QColor::fromHsvF(0.5, 1.0, 1.0) << QColor::fromCmykF(0.1, 0.2, 0.3, 0.4);
        return values;
    case QMetaType::QDateTime:
        return {QDateTime(QDate(2020, 2, 29), QTime(12, 0)), QDateTime(), QDateTime::fromMSecsSinceEpoch(0),
            QDateTime::fromMSecsSinceEpoch(LLONG_MAX), QDateTime::fromMSecsSinceEpoch(LLONG_MIN)};
    case QMetaType::QDate:
        return {QDate(2020, 2, 29), QDate(), QDate(1, 1, 1), QDate(9999, 12, 31), QDate(-4713, 1, 1)};
    case QMetaType::QTime:
        return {QTime(12, 0), QTime(), QTime(0, 0), QTime(23, 59, 59, 999)};
    case QMetaType::QStringList:
        return {QStringList{QStringLiteral("a")}, QStringList(), QStringList{QString(), QString()}};
    case QMetaType::QFont: {
        QFont huge;
        huge.setPixelSize(400);
        QFont tiny;
        tiny.setPixelSize(1);
        return {QFont(), huge, tiny, QFont(QStringLiteral("No Such Family"))};
    }
    case QMetaType::QPixmap:
        values << QPixmap(8, 8) << QPixmap() << QPixmap(1, 1) << QPixmap(3, 2000);
        return values;
    case QMetaType::QIcon:
        values << QIcon(QPixmap(8, 8)) << QIcon();
        return values;
    case QMetaType::QUrl:
        return {QUrl(QStringLiteral("http://x/")), QUrl()};
    default:
        break;
    }
    if (QMetaType::typeFlags(type) & (QMetaType::PointerToQObject)) {
        return {QVariant(type, nullptr)};
    }
    return {QVariant(type, nullptr)};
}

QList<QByteArray> writableProperties(const Entry& entry)
{
    QWidget host;
    const Subject subject = entry.create(&host);
    const QMetaObject* const meta = subject.object->metaObject();
    QList<QByteArray> result;
    for (int i = 0; i < meta->propertyCount(); ++i) {
        const QMetaProperty property = meta->property(i);
        if (property.isWritable() && !isQtClass(property.enclosingMetaObject())) {
            result << property.name();
        }
    }
    return result;
}

QString runExtremeProperty(const Entry& entry, const QByteArray& name)
{
    Stage stage(entry);
    const QMetaObject* const meta = stage.subject.object->metaObject();
    const QMetaProperty property = meta->property(meta->indexOfProperty(name));
    const QVariantList values
        = property.isEnumType() ? extremeEnumerators(property.enumerator()) : extremeValues(property.userType());
    for (const QVariant& value : values) {
        if (!property.write(stage.subject.object, value)) {
            return QStringLiteral("%1 does not take a %2")
                .arg(QLatin1String(name), QLatin1String(value.typeName()));
        }
        if (!stage.look()) {
            return died(name, value);
        }
        // Each value is also used: what only stores a number shows its fault when the class works with it.
        for (const Script& script : entry.exercise) {
            setPatience(60);
            for (const Step& step : script.steps) {
                if (stage.subject.alive()) {
                    step(stage.subject);
                }
            }
            break;
        }
        if (!stage.look()) {
            return died(name, value);
        }
        property.read(stage.subject.object);
    }
    return {};
}

QString runExtremeSetter(const Entry& entry, const Setter& setter)
{
    QVariantList ordinary;
    for (const int type : setter.types) {
        ordinary << extremeValues(type).first();
    }
    for (int i = 0; i < ordinary.size(); ++i) {
        Stage stage(entry);
        const QVariantList values = extremeValues(setter.types.at(static_cast<std::size_t>(i)));
        for (const QVariant& value : values) {
            QVariantList arguments = ordinary;
            arguments[i] = value;
            setter.call(stage.subject.object, arguments);
            if (!stage.look()) {
                return died(setter.name, value);
            }
        }
    }
    // And all arguments at an edge at once.
    Stage stage(entry);
    for (int k = 0; k < 16; ++k) {
        QVariantList arguments;
        for (const int type : setter.types) {
            const QVariantList values = extremeValues(type);
            arguments << values.at(k % values.size());
        }
        setter.call(stage.subject.object, arguments);
        if (!stage.look()) {
            return died(setter.name, arguments.value(0));
        }
    }
    return {};
}

QString runExtremeSurroundings(const Entry& entry)
{
    const QSize sizes[] = {QSize(0, 0), QSize(1, 1), QSize(1, 400), QSize(400, 1), QSize(3, 3), QSize(4000, 3000),
        QSize(200, 150)};
    const char* const sheets[] = {"* { border: 200px solid red; }", "* { background: transparent; padding: 90px; }",
        "* { font-size: 120px; color: rgba(0, 0, 0, 0); }", "* { min-width: 0; max-width: 1px; max-height: 1px; }", ""};
    Stage stage(entry);
    QWidget* const widget = stage.subject.widget;
    for (const QSize& size : sizes) {
        widget->resize(size);
        if (!stage.look()) {
            return QStringLiteral("the instance died of its size");
        }
    }
    for (const QVariant& font : extremeValues(QMetaType::QFont)) {
        widget->setFont(font.value<QFont>());
        stage.look();
    }
    widget->setPalette(QPalette(Qt::transparent));
    stage.look();
    widget->setLayoutDirection(Qt::RightToLeft);
    stage.look();
    for (const char* sheet : sheets) {
        widget->setStyleSheet(QLatin1String(sheet));
        if (!stage.look()) {
            return QStringLiteral("the instance died of a style sheet");
        }
    }
    widget->setEnabled(false);
    stage.look();
    widget->hide();
    stage.look();
    widget->setParent(nullptr);
    stage.look();
    widget->setParent(stage.host.get());
    return stage.look() ? QString() : QStringLiteral("the instance died of its surroundings");
}
}
