// SPDX-License-Identifier: MIT
// The two resource bundles come with the library and go with it.
#include <dlfcn.h>

#include <QtCore/QFile>
#include <QtCore/QJsonDocument>
#include <QtCore/QJsonObject>
#include <QtCore/QJsonArray>
#include <QtCore/QTranslator>
#include <QtTest/QtTest>

namespace
{
const QString c_profiles = QStringLiteral(":/Json/DefaultTimeProfiles.json");
const QString c_german = QStringLiteral(":/Translations/ZelkovJson_de.qm");
const QString c_french = QStringLiteral(":/Translations/ZelkovJson_fr.qm");
}

class TestResourceBundles : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everyPathOpensAfterLoadingAndIsGoneAfterUnloading()
    {
        const QStringList paths{c_profiles, c_german, c_french};
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
};

QTEST_GUILESS_MAIN(TestResourceBundles)
#include "tst_resourcebundles.moc"
