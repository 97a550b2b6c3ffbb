// SPDX-License-Identifier: MIT
// The words in which the rows of the table are written.
#include "StylingTable.h"

#include <QtCore/QMetaProperty>
#include <QtCore/QTemporaryDir>
#include <QtGui/QColor>
#include <QtGui/QImage>
#include <QtGui/QPixmap>

namespace styling
{
namespace
{
Row property(const char* selector, const char* name, const char* given, const Build& build, const char* readBack,
    Proof proof)
{
    const QString head = QLatin1String(selector);
    const QString word = QLatin1String(name);
    return {head + QLatin1String(" { qproperty-") + word + QLatin1String(" }"), proof,
        head + QLatin1String(" { qproperty-") + word + QLatin1String(": ") + QLatin1String(given) + QLatin1String("; }"),
        build, word, QLatin1String(readBack != nullptr ? readBack : given)};
}
}

QString marker()
{
    return QStringLiteral("#ff00ff");
}

int markedPixels(const QImage& image)
{
    int result = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QRgb pixel = image.pixel(x, y);
            result += qRed(pixel) > 190 && qBlue(pixel) > 190 && qGreen(pixel) < 90 ? 1 : 0;
        }
    }
    return result;
}

QString text(const QObject* object, const QString& name)
{
    const QByteArray bytes = name.toLatin1();
    const int index = object->metaObject()->indexOfProperty(bytes.constData());
    const QVariant found = object->property(bytes.constData());
    if (index >= 0 && object->metaObject()->property(index).isEnumType()) {
        const QMetaEnum words = object->metaObject()->property(index).enumerator();
        return QString::fromLatin1(words.valueToKeys(found.toInt()))
            .replace(QLatin1String("AlignTrailing"), QLatin1String("AlignRight")) // the same number
            .replace(QLatin1Char('|'), QLatin1String(", "));
    }
    switch (int(found.type())) {
    case QMetaType::QColor: {
        const auto color = found.value<QColor>();
        return !color.isValid() ? QStringLiteral("none")
                                : color.name(color.alpha() == 255 ? QColor::HexRgb : QColor::HexArgb);
    }
    case QMetaType::QPixmap:
        return found.value<QPixmap>().isNull() ? QStringLiteral("none") : QStringLiteral("picture");
    case QMetaType::QSize:
        return !found.toSize().isValid() ? QStringLiteral("none")
                                         : QStringLiteral("%1 x %2").arg(found.toSize().width()).arg(found.toSize().height());
    default:
        return found.toString();
    }
}

QString pictureFile()
{
    static const QTemporaryDir folder;
    static const QString path = [] {
        QImage image(48, 48, QImage::Format_ARGB32);
        image.fill(QColor(marker()));
        const QString file = folder.filePath(QStringLiteral("marker.png"));
        return image.save(file) ? file : QString();
    }();
    return path;
}

Row box(const char* key, const Build& build)
{
    const QString head = QLatin1String(key);
    return {head, Proof::Box, head + QLatin1String(" { border: none; background: ") + marker() + QLatin1String("; }"),
        build, {}, {}};
}

Row noBox(const char* key, const Build& build)
{
    const QString head = QLatin1String(key);
    return {head, Proof::NoBox,
        head + QLatin1String(" { background: ") + marker() + QLatin1String("; qproperty-toolTip: dressed; }"), build,
        {}, {}};
}

Row rule(const char* key, const char* rule, const Build& build)
{
    return {QLatin1String(key), Proof::Rule, QLatin1String(rule), build, {}, {}};
}

Row windowRule(const char* key, const char* rule, const Build& build)
{
    return {QLatin1String(key), Proof::WindowRule, QLatin1String(rule), build, {}, {}};
}

Row value(const char* selector, const char* name, const char* given, const Build& build, const char* readBack)
{
    return property(selector, name, given, build, readBack, Proof::Value);
}

Row later(const char* selector, const char* name, const char* given, const Build& build, const char* readBack)
{
    return property(selector, name, given, build, readBack, Proof::Later);
}

Row look(const char* selector, const char* name, const char* given, const Build& build)
{
    return property(selector, name, given, build, "?", Proof::Look);
}

Row picture(const char* selector, const char* name, const char* given, const Build& build, const char* readBack)
{
    return property(selector, name, given, build, readBack, Proof::Picture);
}

Table table()
{
    return popoverTable() + rowTable() + sliderTable() + viewTable() + indicatorTable() + controlTable();
}
}
