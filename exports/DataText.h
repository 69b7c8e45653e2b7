#pragma once

#include "ResultSink.h"

#include <QStringView>

#include <string>

namespace kareport
{

/// Appends a text in UTF-8. Half of a surrogate pair becomes U+FFFD.
void appendUtf8(std::string &out, QStringView text);

/// The number of the data that becomes an internal value by a factor: the very number that was read, where there is one.
/// Of several that become the same value it is the one with the fewest digits.
double inDataUnit(double internal, double factor);

/// Appends a finite number with the fewest digits that say it, with a point and without an exponent unless it is very
/// large or very small. @param isAngle  never with an exponent: angles of the data have none
void appendNumber(std::string &out, double number, bool isAngle);

/// Whether values of a type are angles.
bool isAngleType(int type);

} // namespace kareport
