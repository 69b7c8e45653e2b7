#include "JobSettings.h"

#include "DeskPreferences.h"
#include "JobReader.h"
#include "Profile.h"

#include <QJsonDocument>

#include <gtest/gtest.h>

#include <random>

namespace
{

using namespace kareport;

bool same(const UJobSettings &a, const UJobSettings &b)
{
    return a.lengthUnit == b.lengthUnit && a.areaUnit == b.areaUnit && a.angleUnit == b.angleUnit &&
           a.lengthDecimals == b.lengthDecimals && a.stationDecimals == b.stationDecimals &&
           a.numberDecimals == b.numberDecimals && a.stationFormat == b.stationFormat &&
           a.northEastOrder == b.northEastOrder && a.bearingUnit == b.bearingUnit && a.bearingStyle == b.bearingStyle &&
           a.bearingDecimals == b.bearingDecimals && a.bearingPadding == b.bearingPadding &&
           a.bearingReference == b.bearingReference && a.angleMarks == b.angleMarks;
}

TEST(DeskPreferences, WhatIsWrittenIsReadAgain)
{
    std::mt19937 random(7);
    const auto upTo = [&random](int most) { return std::uniform_int_distribution<int>(0, most)(random); };
    for (int round = 0; round < 500; ++round) {
        UJobSettings settings;
        settings.lengthUnit = static_cast<LengthUnit>(upTo(4));
        settings.areaUnit = static_cast<AreaUnit>(upTo(4));
        settings.angleUnit = static_cast<AngleUnit>(upTo(2));
        settings.lengthDecimals = upTo(15);
        settings.stationDecimals = upTo(15);
        settings.numberDecimals = upTo(15);
        settings.stationFormat = static_cast<UJobSettings::StationFormat>(upTo(2));
        settings.northEastOrder = static_cast<qint16>(upTo(1));
        settings.bearingUnit = static_cast<unsigned>(upTo(2));
        settings.bearingStyle = static_cast<qint16>(upTo(1));
        settings.bearingDecimals = upTo(9);
        settings.bearingPadding = static_cast<qint16>(upTo(1));
        settings.bearingReference = static_cast<unsigned>(upTo(1));
        for (char &mark : settings.angleMarks) {
            mark = static_cast<char>(upTo(255)); // 0 means no mark; above 127 is Latin-1
        }
        DeskPreferences preferences;
        preferences.settings = settings;
        savePreferences(preferences);
        EXPECT_TRUE(same(loadPreferences().settings, settings))
            << QJsonDocument(settingsToJson(settings)).toJson().toStdString();
    }
    setProfileStore(makeMemoryProfile());
}

TEST(DeskPreferences, SpoiledPreferencesAreNotTaken)
{
    for (const char *text : {"", "x", "{\"lengthUnit\": \"ell\"}", "{\"surprise\": 1}", "[]"}) {
        setProfileStore(makeMemoryProfile());
        WriteProfileString(QString(), QStringLiteral("Job Settings"), QString::fromUtf8(text));
        EXPECT_TRUE(same(loadPreferences().settings, UJobSettings())) << text;
    }
    setProfileStore(makeMemoryProfile());
}

} // namespace
