// SPDX-License-Identifier: MIT
// Where the sheets come from, and the palette that goes with them.
#include "theme/Theme.h"

#include <QtCore/QFile>
#include <QtCore/QHash>
#include <QtCore/QStringList>
#include <QtWidgets/QApplication>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleFactory>

// Must stand outside any namespace, or a static library does not link.
static void initThemeResource()
{
    Q_INIT_RESOURCE(theme);
    Q_INIT_RESOURCE(timeline);
    Q_INIT_RESOURCE(sheets);
}

namespace zelkov
{
namespace theme
{
namespace
{
using Colors = QHash<QString, QColor>;

Colors readColors(int column)
{
    Colors result;
    QFile file(QStringLiteral(":/zelkov/theme/colors.txt"));
    if (file.open(QIODevice::ReadOnly)) {
        const QStringList lines = QString::fromUtf8(file.readAll()).split(QLatin1Char('\n'));
        for (const QString& line : lines) {
            const QStringList words = line.simplified().split(QLatin1Char(' '));
            if (words.size() == 3 && !line.startsWith(QLatin1Char('#'))) {
                result.insert(words.at(0), QColor(words.at(column)));
            }
        }
    }
    return result;
}

QColor color(Name name, const char* word)
{
    initThemeResource();
    static const Colors light = readColors(1);
    static const Colors dark = readColors(2);
    return (name == Name::Dark ? dark : light).value(QLatin1String(word));
}
}

QString styleSheet(Name name)
{
    // Without a sheet, too: the library names pictures that only the application has.
    initThemeResource();
    if (name == Name::None) {
        return {};
    }
    QFile file(name == Name::Dark ? QStringLiteral(":/zelkov/theme/dark.qss")
                                  : QStringLiteral(":/zelkov/theme/light.qss"));
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QPalette palette(Name name)
{
    if (name == Name::None) {
        return QApplication::style() ? QApplication::style()->standardPalette() : QPalette();
    }
    QPalette result(color(name, "text"), color(name, "raised"), color(name, "surface"), color(name, "strong"),
                    color(name, "border"), color(name, "text"), color(name, "accenttext"), color(name, "surface"),
                    color(name, "window"));
    result.setColor(QPalette::AlternateBase, color(name, "raised"));
    result.setColor(QPalette::Highlight, color(name, "accent"));
    result.setColor(QPalette::HighlightedText, color(name, "accenttext"));
    result.setColor(QPalette::Link, color(name, "accent"));
    result.setColor(QPalette::PlaceholderText, color(name, "faint"));
    result.setColor(QPalette::ToolTipBase, color(name, "tip"));
    result.setColor(QPalette::ToolTipText, color(name, "tiptext"));
    for (const QPalette::ColorRole role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText}) {
        result.setColor(QPalette::Disabled, role, color(name, "disabled"));
    }
    return result;
}

void apply(QApplication& application, Name name)
{
    application.setStyleSheet(QString());
    QApplication::setStyle(QStyleFactory::create(QStringLiteral("Fusion")));
    QApplication::setPalette(palette(name));
    application.setStyleSheet(styleSheet(name));
}
}
}
