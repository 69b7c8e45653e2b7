#include "JobSettingsWriter.h"

#include "JobSettingsWords.h"

#include <QJsonArray>

namespace kareport
{

namespace
{

template <typename Words, typename Value>
QString wordOf(const Words &words, Value value)
{
    return words[static_cast<std::size_t>(value)].toString();
}

} // namespace

QJsonObject settingsToJson(const UJobSettings &settings)
{
    QJsonArray marks;
    for (const char mark : settings.angleMarks) {
        marks.append(mark == 0 ? QString() : QString(QLatin1Char(mark)));
    }
    return {{QStringLiteral("lengthUnit"), keyOf(settings.lengthUnit).toString()},
            {QStringLiteral("areaUnit"), keyOf(settings.areaUnit).toString()},
            {QStringLiteral("angleUnit"), keyOf(settings.angleUnit).toString()},
            {QStringLiteral("lengthDecimals"), settings.lengthDecimals},
            {QStringLiteral("stationDecimals"), settings.stationDecimals},
            {QStringLiteral("numberDecimals"), settings.numberDecimals},
            {QStringLiteral("stationFormat"), wordOf(stationFormats, settings.stationFormat)},
            {QStringLiteral("northEastOrder"), wordOf(northEastOrders, settings.northEastOrder)},
            {QStringLiteral("bearingUnit"), wordOf(bearingUnits, settings.bearingUnit)},
            {QStringLiteral("bearingStyle"), wordOf(bearingStyles, settings.bearingStyle)},
            {QStringLiteral("bearingDecimals"), settings.bearingDecimals},
            {QStringLiteral("bearingPadding"), settings.bearingPadding != 0},
            {QStringLiteral("bearingReference"), wordOf(bearingReferences, settings.bearingReference)},
            {QStringLiteral("angleMarks"), marks}};
}

} // namespace kareport
