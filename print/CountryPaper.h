#pragma once

#include "DefaultPrinter.h"

class QLocale;

namespace kareport
{

/// The paper that printers of a country hold: Letter or A4.
PaperSize paperOfCountry(const QLocale &locale);
/// Whether its rulers have inches.
bool measuresInInches(const QLocale &locale);

} // namespace kareport
