#pragma once

#include "ColumnBinding.h"
#include "DataUnits.h"
#include "UXmlReportTpl.h"

#include <QString>

namespace kareport
{

/// The variables of a dictionary of a template, for numbers in the given units. The template must outlive what comes back. None
/// of a dictionary that the template does not have.
Variables variablesOf(const UXmlReportTpl &tpl, const QString &dictionary, const DataUnits &units);

} // namespace kareport
