// SPDX-License-Identifier: MIT
// zelkov-gallery: what the widgets of the library look like and which signals they send.
#include <QtCore/QCommandLineParser>
#include <QtCore/QLocale>
#include <QtCore/QTextStream>
#include <QtWidgets/QApplication>

#include "GalleryWindow.h"
#include "PageList.h"
#include "Shots.h"
#include "SignalLog.h"

namespace
{
const int s_usageError = 2;

int fail(const QString& message)
{
    QTextStream(stderr) << "zelkov-gallery: " << message << '\n';
    return s_usageError;
}

QString systemLanguage()
{
    const QString language = QLocale::system().name().left(2);
    return gallery::GalleryWindow::languages().contains(language) ? language : QStringLiteral("en");
}

// Without a desktop there are no settings to take a font from, and the platform talks about hints it ignores.
QtMessageHandler s_nextHandler = nullptr;

void dropNoise(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    if (!message.contains(QLatin1String("propagateSizeHints"))) {
        s_nextHandler(type, context, message);
    }
}

void settleWithoutDesktop()
{
    s_nextHandler = qInstallMessageHandler(dropNoise);
    QFont font(QStringLiteral("DejaVu Sans"));
    font.setPixelSize(13);
    QApplication::setFont(font);
}

// Pictures and lists need no display; only a window to use does.
void doWithoutDisplay(int argc, char* argv[])
{
    const bool hasDisplay = qEnvironmentVariableIsSet("DISPLAY") || qEnvironmentVariableIsSet("WAYLAND_DISPLAY")
        || qEnvironmentVariableIsSet("QT_QPA_PLATFORM");
    for (int i = 1; i < argc && !hasDisplay; ++i) {
        const QByteArray argument(argv[i]);
        if (argument.startsWith("--shots") || argument == "--list" || argument == "--help") {
            qputenv("QT_QPA_PLATFORM", "offscreen");
        }
    }
}

void listPages()
{
    QTextStream out(stdout);
    for (const gallery::PageEntry& entry : gallery::pages()) {
        out << QString::fromLatin1(entry.name).leftJustified(20) << entry.familyText() << ": " << entry.titleText()
            << '\n';
    }
}
}

namespace
{
// Animations that pages stop on their way out delete themselves later; after the loop there is no later.
struct DeferredDeletions
{
    DeferredDeletions() = default;
    DeferredDeletions(const DeferredDeletions&) = delete;
    DeferredDeletions& operator=(const DeferredDeletions&) = delete;
    ~DeferredDeletions() { QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete); }
};
}

int main(int argc, char* argv[])
{
    doWithoutDisplay(argc, argv);
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
    if (!qgetenv("QT_QPA_PLATFORM").startsWith("offscreen")) {
        // The screen that is none reports 100 dpi, and everything would stand between pixels.
        QCoreApplication::setAttribute(Qt::AA_EnableHighDpiScaling);
#if QT_VERSION >= QT_VERSION_CHECK(5, 14, 0)
        QGuiApplication::setHighDpiScaleFactorRoundingPolicy(Qt::HighDpiScaleFactorRoundingPolicy::PassThrough);
#endif
    }
    QApplication application(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("zelkov-gallery"));

    const QCommandLineOption page(QStringLiteral("page"), QStringLiteral("Show this page first."),
                                  QStringLiteral("name"));
    const QCommandLineOption list(QStringLiteral("list"), QStringLiteral("Print the names of all pages."));
    const QCommandLineOption shots(
        QStringLiteral("shots"),
        QStringLiteral("Save a picture of every page in every theme into this folder and quit. --page and --theme "
                       "limit it to one page or theme."),
        QStringLiteral("folder"));
    const QCommandLineOption language(QStringLiteral("lang"), QStringLiteral("en, de or fr."),
                                      QStringLiteral("language"), systemLanguage());
    const QCommandLineOption theme(QStringLiteral("theme"), QStringLiteral("light, dark or none."),
                                   QStringLiteral("name"), QStringLiteral("light"));
    const QCommandLineOption logFile(QStringLiteral("log"), QStringLiteral("Append every signal to this file."),
                                     QStringLiteral("file"));
    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Shows the widgets of ZelkovWidgets and the signals they send."));
    parser.addHelpOption();
    parser.addOptions({page, list, shots, language, theme, logFile});
    parser.process(application);

    if (!parser.positionalArguments().isEmpty()) {
        return fail(QStringLiteral("unexpected argument '%1'").arg(parser.positionalArguments().constFirst()));
    }
    if (parser.isSet(list)) {
        listPages();
        return 0;
    }
    const int index = parser.isSet(page) ? gallery::indexOfPage(parser.value(page)) : 0;
    if (index < 0) {
        return fail(QStringLiteral("there is no page '%1'; --list names all pages").arg(parser.value(page)));
    }
    bool themeKnown = false;
    const zelkov::theme::Name themeName = gallery::GalleryWindow::themeFromName(parser.value(theme), &themeKnown);
    if (!themeKnown) {
        return fail(QStringLiteral("there is no theme '%1'; it is light, dark or none").arg(parser.value(theme)));
    }
    if (!gallery::GalleryWindow::languages().contains(parser.value(language))) {
        return fail(QStringLiteral("there is no language '%1'; it is en, de or fr").arg(parser.value(language)));
    }

    if (QGuiApplication::platformName() == QLatin1String("offscreen")) {
        settleWithoutDesktop();
    }
    gallery::SignalLog log;
    if (parser.isSet(logFile) && !log.openFile(parser.value(logFile))) {
        return fail(QStringLiteral("cannot write '%1'").arg(parser.value(logFile)));
    }
    const DeferredDeletions deletions;
    gallery::GalleryWindow window(log);
    window.showPage(index);
    window.setLanguage(parser.value(language));
    window.setTheme(themeName);
    if (!parser.isSet(shots)) {
        window.show();
        return application.exec();
    }

    QVector<int> indexes{index};
    if (!parser.isSet(page)) {
        indexes.clear();
        for (int i = 0; i < gallery::pages().size(); ++i) {
            indexes.append(i);
        }
    }
    QVector<zelkov::theme::Name> themes{themeName};
    if (!parser.isSet(theme)) {
        themes = {zelkov::theme::Name::Light, zelkov::theme::Name::Dark, zelkov::theme::Name::None};
    }
    gallery::Shots photographer(window, parser.value(shots), indexes, themes);
    QObject::connect(&photographer, &gallery::Shots::finished, &application,
                     [](bool ok) { QCoreApplication::exit(ok ? 0 : 1); });
    photographer.start();
    return application.exec();
}
