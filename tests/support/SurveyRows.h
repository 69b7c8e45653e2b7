#pragma once

#include "CsvDialect.h"
#include "CsvObjectList.h"
#include "InputErrorText.h"
#include "JobFolder.h"
#include "VariableType.h"

#include <QStringList>

/// A dictionary of what a survey has, and rows that are read for it.
namespace survey
{

enum Id : unsigned
{
    numberId = 1,
    northingId,
    eastingId,
    elevationId,
    descriptionId,
    stationId,
    offsetId,
    bearingId,
    angleId,
    countId,
    flagId
};

/// Number, Northing, Easting, Elevation, Description, Station, Offset, Bearing, Angle, Count and Flag.
kareport::Variables variables(const kareport::DataUnits &units = {});

/// The values of an object without the missing ones, as "number=1 northing=2.5". Angles are in degrees, with 9 decimals at
/// most.
QString textOf(const UDataObject *object);

/// All rows of a list, and its error as a last text.
QStringList rowsOf(kareport::RowList &list);

/// The rows of a text in a dialect.
QStringList rowsOf(const QByteArray &text, const kareport::CsvDialect &dialect);

} // namespace survey
