#pragma once

#include "CsvDialect.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <vector>

/// The same points in every form that a survey comes in.
namespace survey
{

struct Point
{
    QString number;
    QString northing; ///< with a decimal point; empty for none
    QString easting;
    QString elevation;
    QString description;
};

/// Points with all that makes a form hard: missing values, blanks, quotes, letters of other alphabets.
std::vector<Point> somePoints(int count);

/// A text with the points in a dialect, as its bytes.
QByteArray textOf(const std::vector<Point> &points, const kareport::CsvDialect &dialect);
/// A list of objects, or an object a line.
QByteArray jsonOf(const std::vector<Point> &points, bool isList);
/// What makes the table "points" of a database.
QByteArray sqlOf(const std::vector<Point> &points);

} // namespace survey
