#include "VariableKeywords.h"

#include "TextFolding.h"

#include <array>

namespace kareport
{

namespace
{

struct KeywordRow
{
    QStringView keyword;
    VARIABLE_TYPE type;
};

constexpr std::array<KeywordRow, 18> keywords = {{
    {u"INTEGER", VARIABLE_INTEGER},
    {u"DOUBLE", VARIABLE_DOUBLE},
    {u"TEXT", VARIABLE_TEXT},
    {u"ANGLE", VARIABLE_ANGLE},
    {u"BEARING", VARIABLE_BEARING},
    {u"COORDINATE", VARIABLE_COORDINATE},
    {u"LENGTH", VARIABLE_LENGTH},
    {u"DISTANCE", VARIABLE_DISTANCE},
    {u"ELEVATION", VARIABLE_ELEVATION},
    {u"STATION", VARIABLE_STATION},
    {u"OFFSET", VARIABLE_OFFSET},
    {u"AREA", VARIABLE_AREA},
    {u"NAME", VARIABLE_NAME},
    {u"NUMBER", VARIABLE_NUMBER},
    {u"VANGLE", VARIABLE_VANGLE},
    {u"BOOLEAN", VARIABLE_BOOLEAN},
    {u"FLAG", VARIABLE_FLAG},
    {u"THICKNESS", VARIABLE_THICKNESS},
}};

} // namespace

std::optional<VARIABLE_TYPE> variableTypeFromKeyword(QStringView keyword)
{
    for (const KeywordRow &row : keywords) {
        if (equalFolded(row.keyword, keyword)) {
            return row.type;
        }
    }
    return std::nullopt;
}

QStringView keywordOf(int type)
{
    for (const KeywordRow &row : keywords) {
        if (row.type == type) {
            return row.keyword;
        }
    }
    return {};
}

} // namespace kareport
