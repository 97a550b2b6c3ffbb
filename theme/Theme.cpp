// SPDX-License-Identifier: MIT
// Colours of the themes, and how they get into the sheet and the palette.
#include "theme/Theme.h"

#include <QtCore/QFile>
#include <QtWidgets/QApplication>
#include <QtWidgets/QStyle>
#include <QtWidgets/QStyleFactory>

// Must stand outside any namespace, or a static library does not link.
static void initThemeResource()
{
    Q_INIT_RESOURCE(theme);
    Q_INIT_RESOURCE(timeline);
}

namespace zelkov
{
namespace theme
{
namespace
{
struct Color
{
    const char* word;
    const char* light;
    const char* dark;
};

const Color s_colors[] = {
    {"window", "#eef0f4", "#12161d"},     {"surface", "#ffffff", "#1b212b"},
    {"raised", "#f8f9fb", "#232b37"},     {"border", "#d3d8e1", "#333d4c"},
    {"strong", "#aab3c2", "#4c596d"},     {"text", "#18202c", "#e7ebf2"},
    {"faint", "#5d6a7e", "#98a5b9"},      {"disabled", "#a3adbb", "#5d697b"},
    {"accent", "#1f66d6", "#5b9bff"},     {"accenthover", "#1857bb", "#7aaeff"},
    {"accenttext", "#ffffff", "#0d1524"}, {"hover", "#e6eaf1", "#2a3341"},
    {"pressed", "#d9dfe9", "#354051"},    {"selection", "#dce8fc", "#23395c"},
    {"selected", "#123f8c", "#cfe1ff"},   {"tip", "#232b37", "#e7ebf2"},
    {"tiptext", "#f3f5f8", "#18202c"},    {"bad", "#c8373c", "#ff7b7b"},
    {"badground", "#fdf0f0", "#3a2228"},  {"good", "#1f8a50", "#57c98a"},
    {"goodground", "#eefaf3", "#1c3329"},
};

QColor color(Name name, const char* word)
{
    for (const Color& entry : s_colors) {
        if (qstrcmp(entry.word, word) == 0) {
            return QColor(QLatin1String(name == Name::Dark ? entry.dark : entry.light));
        }
    }
    return {};
}
}

QString styleSheet(Name name)
{
    // Without a sheet, too: the library names pictures that only the application has.
    initThemeResource();
    if (name == Name::None) {
        return {};
    }
    QFile file(QStringLiteral(":/zelkov/theme/theme.qss"));
    if (!file.open(QIODevice::ReadOnly)) {
        return {};
    }
    QString sheet = QString::fromUtf8(file.readAll());
    for (const Color& entry : s_colors) {
        sheet.replace(QLatin1Char('@') + QLatin1String(entry.word) + QLatin1Char('@'),
                      QLatin1String(name == Name::Dark ? entry.dark : entry.light));
    }
    sheet.replace(QLatin1String("@pictures@"),
                  QLatin1String(":/zelkov/theme/pictures/") + QLatin1String(name == Name::Dark ? "dark" : "light"));
    return sheet;
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
