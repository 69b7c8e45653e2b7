#include "DataColumns.h"

#include "TextFolding.h"

#include <QHash> // std::hash<QString>

#include <unordered_set>

namespace kareport
{

std::vector<std::size_t> dataColumns(const ResultTable &table, ResultValues values)
{
    std::vector<std::size_t> places;
    std::unordered_set<QString> names;
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        const ResultColumn &column = table.columns[i];
        const bool isWanted = column.isVariable && (column.isShown || values == ResultValues::Data);
        if (isWanted && names.insert(foldedKey(column.field.VariableName)).second) {
            places.push_back(i);
        }
    }
    return places;
}

} // namespace kareport
