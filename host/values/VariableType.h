#pragma once

#include "KaReportExport.h"

#include <QStringView>

#include <optional>

/// The value type codes of dictionary variables. Codes 12 to 15 and 21 have no keyword.
enum VARIABLE_TYPE
{
    VARIABLE_INTEGER = 0,
    VARIABLE_DOUBLE = 1,
    VARIABLE_TEXT = 2,
    VARIABLE_ANGLE = 3,
    VARIABLE_BEARING = 4,
    VARIABLE_COORDINATE = 5,
    VARIABLE_LENGTH = 6,
    VARIABLE_DISTANCE = 7,
    VARIABLE_ELEVATION = 8,
    VARIABLE_STATION = 9,
    VARIABLE_OFFSET = 10,
    VARIABLE_AREA = 11,
    VARIABLE_NAME = 16,
    VARIABLE_NUMBER = 17,
    VARIABLE_VANGLE = 18,
    VARIABLE_BOOLEAN = 19,
    VARIABLE_FLAG = 20,
    VARIABLE_PLAIN = 21,
    VARIABLE_THICKNESS = 22
};

namespace kareport
{

/// The type of a keyword such as "COORDINATE", in any case; nothing for any other text.
KAREPORT_EXPORT std::optional<VARIABLE_TYPE> variableTypeFromKeyword(QStringView keyword);
/// The keyword of a type, in capitals; empty where there is none.
KAREPORT_EXPORT QStringView keywordOf(int type);

} // namespace kareport
