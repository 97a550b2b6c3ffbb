// SPDX-License-Identifier: MIT
// The two resource bundles come with the library and go with it.
#include <dlfcn.h>

#include <iterator>

#include <QtCore/QFile>
#include <QtCore/QJsonDocument>
#include <QtCore/QJsonObject>
#include <QtCore/QJsonArray>
#include <QtCore/QRegularExpression>
#include <QtCore/QSet>
#include <QtCore/QTranslator>
#include <QtCore/QXmlStreamReader>
#include <QtGui/QImage>
#include <QtTest/QtTest>

namespace
{
const QString c_profiles = QStringLiteral(":/Json/DefaultTimeProfiles.json");
const QString c_german = QStringLiteral(":/Translations/ZelkovJson_de.qm");
const QString c_french = QStringLiteral(":/Translations/ZelkovJson_fr.qm");
const QString c_zones = QStringLiteral(":/Timezones/TimeZones.txt");

QStringList allPaths()
{
    return {QStringLiteral(":/iOSCheckBox/iOSCheckBox.png"), QStringLiteral(":/iOSListWidget/iOSRiffleArea.png"),
        QStringLiteral(":/iOSListWidget/iOSDeleteListEntry.png"), QStringLiteral(":/SearchItem/searchLoop.png"),
        QStringLiteral(":/SearchItem/searchClear.png"), QStringLiteral(":/SearchItem/btn_pen.png"), c_zones,
        c_profiles, QStringLiteral(":/Translations/ZelkovWidgets_de.qm"),
        QStringLiteral(":/Translations/ZelkovWidgets_fr.qm"), c_german, c_french};
}

/// Holds the library in memory for one test function.
class LoadedLibrary
{
public:
    LoadedLibrary() : m_handle(dlopen(ZELKOV_WIDGETS_FILE, RTLD_NOW | RTLD_LOCAL)) {}
    ~LoadedLibrary()
    {
        if (m_handle != nullptr) {
            dlclose(m_handle);
        }
    }
    LoadedLibrary(const LoadedLibrary&) = delete;
    LoadedLibrary& operator=(const LoadedLibrary&) = delete;
    bool isLoaded() const { return m_handle != nullptr; }

private:
    void* m_handle;
};

QByteArray contentOf(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}
}

class TestResourceBundles : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everyPathOpensAfterLoadingAndIsGoneAfterUnloading()
    {
        const QStringList paths = allPaths();
        for (const QString& path : paths) {
            QVERIFY2(!QFile::exists(path), qPrintable(path));
        }
        for (int round = 0; round < 2; ++round) {
            void* const library = dlopen(ZELKOV_WIDGETS_FILE, RTLD_NOW | RTLD_LOCAL);
            QVERIFY2(library != nullptr, dlerror());
            for (const QString& path : paths) {
                QFile file(path);
                QVERIFY2(file.open(QIODevice::ReadOnly), qPrintable(path));
                QVERIFY(!file.readAll().isEmpty());
            }
            QCOMPARE(dlclose(library), 0);
            for (const QString& path : paths) {
                QVERIFY2(!QFile::exists(path), qPrintable(path));
            }
        }
    }

    void theProfilesParseAndHoldWholeDays()
    {
        void* const library = dlopen(ZELKOV_WIDGETS_FILE, RTLD_NOW | RTLD_LOCAL);
        QVERIFY(library != nullptr);
        QFile file(c_profiles);
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QByteArray bytes = file.readAll();
        file.close();
        QCOMPARE(bytes.size(), 1297);
        QCOMPARE(bytes.count('\n'), bytes.count("\r\n"));
        QVERIFY(bytes.contains(" \r\n"));
        QJsonParseError error{};
        const QJsonObject profiles = QJsonDocument::fromJson(bytes, &error).object();
        QCOMPARE(error.error, QJsonParseError::NoError);
        QCOMPARE(profiles.keys(), (QStringList{QStringLiteral("defProfile1"), QStringLiteral("defProfile2")}));
        const QJsonObject weekend = profiles.value(QLatin1String("defProfile1")).toObject();
        QCOMPARE(weekend.value(QLatin1String("profileName")).toString(), QStringLiteral("Weekend"));
        const QJsonObject table = weekend.value(QLatin1String("timeTable")).toObject();
        QCOMPARE(table.keys(), (QStringList{QStringLiteral("Sa"), QStringLiteral("Su")}));
        const QJsonObject interval = table.value(QLatin1String("Su")).toArray().at(0).toObject();
        QCOMPARE(interval.value(QLatin1String("startTime")).toInt(-1), 0);
        QCOMPARE(interval.value(QLatin1String("endTime")).toInt(-1), 1440);
        QCOMPARE(profiles.value(QLatin1String("defProfile2")).toObject().value(QLatin1String("timeTable"))
                     .toObject().size(), 5);
        dlclose(library);
    }

    void theNamesAreTranslatedUnderTheirOwnContextAlone()
    {
        void* const library = dlopen(ZELKOV_WIDGETS_FILE, RTLD_NOW | RTLD_LOCAL);
        QVERIFY(library != nullptr);
        {
            QTranslator german;
            QVERIFY(german.load(c_german));
            QCOMPARE(german.translate("DefaultTimeProfiles.json", "Weekend"), QStringLiteral("Wochenende"));
            QCOMPARE(german.translate("DefaultTimeProfiles.json", "Working Days"), QStringLiteral("Arbeitstage"));
            QVERIFY(german.translate("ZelkovJson", "Weekend").isEmpty());
            QTranslator french;
            QVERIFY(french.load(c_french));
            QCOMPARE(french.translate("DefaultTimeProfiles.json", "Working Days"),
                QString::fromUtf8("Jours ouvr\xc3\xa9s"));
        }
        dlclose(library);
    }

    void thePicturesHaveTheirSizesAndColourTypes_data()
    {
        QTest::addColumn<QString>("path");
        QTest::addColumn<QSize>("size");
        QTest::addColumn<int>("colourType");
        QTest::newRow("switch") << QStringLiteral(":/iOSCheckBox/iOSCheckBox.png") << QSize(109, 18) << 2;
        QTest::newRow("grip") << QStringLiteral(":/iOSListWidget/iOSRiffleArea.png") << QSize(23, 17) << 4;
        QTest::newRow("delete") << QStringLiteral(":/iOSListWidget/iOSDeleteListEntry.png") << QSize(23, 23) << 6;
        QTest::newRow("loop") << QStringLiteral(":/SearchItem/searchLoop.png") << QSize(140, 140) << 6;
        QTest::newRow("clear") << QStringLiteral(":/SearchItem/searchClear.png") << QSize(140, 140) << 6;
        QTest::newRow("pen") << QStringLiteral(":/SearchItem/btn_pen.png") << QSize(152, 152) << 6;
    }
    void thePicturesHaveTheirSizesAndColourTypes()
    {
        QFETCH(QString, path);
        QFETCH(QSize, size);
        QFETCH(int, colourType);
        const LoadedLibrary library;
        QVERIFY(library.isLoaded());
        const QByteArray bytes = contentOf(path);
        QVERIFY(bytes.size() > 26);
        QCOMPARE(bytes.left(4), QByteArray("\x89PNG"));
        QCOMPARE(int(bytes.at(24)), 8);
        QCOMPARE(int(bytes.at(25)), colourType);
        const QImage image = QImage::fromData(bytes, "PNG");
        QCOMPARE(image.size(), size);
        QCOMPARE(image.hasAlphaChannel(), colourType != 2);
        const QRgb first = image.pixel(image.rect().center());
        bool drawn = false;
        for (int y = 0; y < image.height() && !drawn; ++y) {
            for (int x = 0; x < image.width() && !drawn; ++x) {
                drawn = image.pixel(x, y) != first;
            }
        }
        QVERIFY(drawn);
    }

    void theTimeZonesStandOneALineSortedAndUnderNumbersOfTheirOwn()
    {
        const LoadedLibrary library;
        QVERIFY(library.isLoaded());
        const QByteArray bytes = contentOf(c_zones);
        QCOMPARE(bytes.size(), 11610);
        QCOMPARE(bytes.count('\n'), 561);
        QCOMPARE(bytes.count("\r\n"), 561);
        QCOMPARE(bytes.count('\r'), 561);
        QVERIFY(!bytes.endsWith('\n'));
        const QSet<QByteArray> prefixes{"Africa", "America", "Antarctica", "Arctic", "Asia", "Atlantic", "Australia",
            "Brazil", "Canada", "Chile", "Etc", "Europe", "GMT", "Indian", "Mexico", "Mideast", "Pacific", "US"};
        const QRegularExpression form(QStringLiteral("^([A-Za-z0-9_+/-]+)=([0-9]{3})$"));
        QSet<int> numbers;
        QSet<QByteArray> seen;
        QByteArray previous;
        int falls = 0;
        int lastNumber = 0;
        for (const QByteArray& line : bytes.split('\n')) {
            const QString text = QString::fromLatin1(line).remove(QLatin1Char('\r'));
            const QRegularExpressionMatch match = form.match(text);
            QVERIFY2(match.hasMatch(), line.constData());
            const QByteArray name = match.captured(1).toLatin1();
            const int number = match.captured(2).toInt();
            const QByteArray prefix = name.startsWith("GMT") ? QByteArray("GMT") : name.left(name.indexOf('/'));
            QVERIFY2(prefixes.contains(prefix), line.constData());
            QVERIFY2(previous < name, line.constData());
            QVERIFY2(number >= 100 && number <= 664, line.constData());
            QVERIFY2(!numbers.contains(number), line.constData());
            falls += number < lastNumber ? 1 : 0;
            seen.insert(prefix);
            numbers.insert(number);
            previous = name;
            lastNumber = number;
        }
        QCOMPARE(numbers.size(), 562);
        QCOMPARE(seen, prefixes);
        QVERIFY(falls < 20);
    }

    void theTimeZoneNumbersThatClientsKeepAreTheirs()
    {
        const LoadedLibrary library;
        QVERIFY(library.isLoaded());
        const QList<QByteArray> lines = contentOf(c_zones).replace("\r", "").split('\n');
        for (const char* line : {"Africa/Abidjan=100", "Africa/Accra=101", "America/St_Thomas=296",
                 "America/Tijuana=302", "US/Pacific=655", "US/Pacific-New=656", "US/Samoa=657"}) {
            QVERIFY2(lines.contains(line), line);
        }
        QCOMPARE(lines.first(), QByteArray("Africa/Abidjan=100"));
        QCOMPARE(lines.last(), QByteArray("US/Samoa=657"));
    }

    void theWidgetsSpeakGermanAndFrench()
    {
        struct Message
        {
            const char* context;
            const char* source;
            const char* german;
            const char* french;
        };
        const Message messages[] = {
            {"CountingLinesGroupBox", "Additional Parameters",
                "Weitere Einstellungen", "Param\xc3\xa8tres suppl\xc3\xa9mentaires"},
            {"CountingLinesGroupBox", "Coordinates",
                "Koordinaten", "Coordonn\xc3\xa9" "es"},
            {"CountingLinesGroupBox", "Counting Corridors",
                "Z\xc3\xa4hlkorridore", "Couloirs de comptage"},
            {"CountingLinesGroupBox", "East",
                "Ost", "Est"},
            {"CountingLinesGroupBox", "End point:",
                "Endpunkt:", "Point de fin\xc2\xa0:"},
            {"CountingLinesGroupBox", "GroupBox",
                "GroupBox", "GroupBox"},
            {"CountingLinesGroupBox", "ID",
                "ID", "ID"},
            {"CountingLinesGroupBox", "Name",
                "Name", "Nom"},
            {"CountingLinesGroupBox", "Starting point:",
                "Startpunkt:", "Point de d\xc3\xa9part\xc2\xa0:"},
            {"CountingLinesGroupBox", "Title \"East\"",
                "Titel \"Ost\"", "Titre \"Est\""},
            {"CountingLinesGroupBox", "Title \"West\"",
                "Titel \"West\"", "Titre \"Ouest\""},
            {"CountingLinesGroupBox", "West",
                "West", "Ouest"},
            {"CountingLinesGroupBox", "x",
                "x", "x"},
            {"CountingLinesGroupBox", "y",
                "j", "y"},
            {"vx::BusyOverlayView", "Connection lost since %1",
                "Verbindung unterbrochen seit %1", "Connexion perdue depuis %1"},
            {"vx::CustomToolBar", "Customize Toolbar...",
                "Symbolleiste anpassen...", "Personnaliser barre d'outils..."},
            {"vx::CustomToolBar", "Icons & Text",
                "Symbole & Text", "Ic\xc3\xb4nes & textes"},
            {"vx::CustomToolBar", "Icons Only",
                "Nur Symbole", "Ic\xc3\xb4nes uniquement"},
            {"vx::CustomToolBar", "Remove Item",
                "Element entfernen", "Supprimer \xc3\xa9l\xc3\xa9ment"},
            {"vx::CustomToolBar", "Small Icons",
                "Kleine Symbole", "Ic\xc3\xb4nes petites"},
            {"vx::CustomToolBar", "Text Only",
                "Nur Text", "Textes seulement"},
            {"vx::DateTimeDefaultEdit", "Reset time",
                "Zeit zur\xc3\xbc" "cksetzen", "R\xc3\xa9initialiser temps"},
            {"vx::FilepathEdit", "Choose Directory...",
                "Verzeichnis w\xc3\xa4hlen...", "S\xc3\xa9lectionner r\xc3\xa9pertoire..."},
            {"vx::MultiNubsieSlider", "Export range end marker",
                "Ende des Exportbereichs", "Curseur de fin de plage d'exportation"},
            {"vx::MultiNubsieSlider", "Export range start marker",
                "Start des Exportbereichs", "Curseur de d\xc3\xa9" "but de plage d'exportation"},
            {"vx::MultiNubsieSlider", "Time range to export",
                "Export-Zeitbereich", "Plage horaire \xc3\xa0 exporter"},
            {"vx::PasswordCheckWidget", "Confirm Password",
                "Passwort best\xc3\xa4tigen", "Confirmer mot de passe"},
            {"vx::PasswordCheckWidget", "Password",
                "Passwort", "Mot de passe"},
            {"vx::PasswordCheckWidget", "Retype Password",
                "Passwort wiederholen", "Retaper mot de passe"},
            {"vx::PasswordCheckWidget", "Type Password",
                "Passwort eingeben", "Taper mot de passe"},
            {"vx::iOSListWidgetItem", "Delete",
                "L\xc3\xb6schen", "Supprimer"},
        };
        const LoadedLibrary library;
        QVERIFY(library.isLoaded());
        QTranslator german;
        QTranslator french;
        QVERIFY(german.load(QStringLiteral(":/Translations/ZelkovWidgets_de.qm")));
        QVERIFY(french.load(QStringLiteral(":/Translations/ZelkovWidgets_fr.qm")));
        for (const Message& message : messages) {
            QCOMPARE(german.translate(message.context, message.source), QString::fromUtf8(message.german));
            QCOMPARE(french.translate(message.context, message.source), QString::fromUtf8(message.french));
            QVERIFY(german.translate("Elsewhere", message.source).isEmpty());
        }
        for (const char* language : {"de", "fr"}) {
            QFile file(QStringLiteral(ZELKOV_CATALOGUE_FOLDER "/ZelkovWidgets_%1.ts").arg(QLatin1String(language)));
            QVERIFY(file.open(QIODevice::ReadOnly));
            QXmlStreamReader reader(&file);
            int count = 0;
            while (!reader.atEnd()) {
                count += reader.readNext() == QXmlStreamReader::StartElement
                        && reader.name() == QLatin1String("message") ? 1 : 0;
            }
            QCOMPARE(count, int(std::size(messages)));
        }
    }

    void theBundlesAreOfFormatTwo()
    {
        for (const char* name : {"zelkov_images", "zelkov_translations"}) {
            const QByteArray source = contentOf(
                QStringLiteral(ZELKOV_BUNDLE_FOLDER "/qrc_%1.cpp").arg(QLatin1String(name)));
            QVERIFY2(source.contains("int version = 2;") || source.contains("qRegisterResourceData(0x02"), name);
        }
    }
};

QTEST_GUILESS_MAIN(TestResourceBundles)
#include "tst_resourcebundles.moc"
