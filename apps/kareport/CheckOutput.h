#pragma once

#include "JobCheck.h"

#include <QJsonObject>

namespace kareport
{

/// Prints what was found in a file on standard output, a line for each remark, and then how the data of each step of a job
/// fits its fields. @param quiet  prints errors alone
void printChecked(const CheckedFile &checked, bool quiet);

/// The same for programs.
QJsonObject checkedToJson(const CheckedFile &checked);

} // namespace kareport
