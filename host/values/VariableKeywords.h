#pragma once

#include "VariableType.h"

#include <QStringView>

#include <optional>

namespace kareport
{

/// The type of a keyword such as "COORDINATE", in any case; nothing for any other text.
std::optional<VARIABLE_TYPE> variableTypeFromKeyword(QStringView keyword);
/// The keyword of a type, in capitals; empty where there is none.
QStringView keywordOf(int type);

} // namespace kareport
