#include "ColumnChoices.h"

#include "DataKind.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

constexpr int mostColumns = 10'000;

void addColumnChoice(std::vector<ColumnChoice> &choices, const QString &variable, const JsonNode &node)
{
    if (node.value().isDouble()) {
        choices.push_back({variable, node.whole(1, 1, mostColumns)});
    } else if (node.value().isString() && !node.text().isEmpty()) {
        choices.push_back({variable, node.text()});
    } else {
        node.fail(Xlate("the name of a column, or its number from 1, was expected"));
    }
}

} // namespace

std::vector<ColumnChoice> readColumnChoices(const JsonNode &node)
{
    std::vector<ColumnChoice> choices;
    if (!node.expectObject()) {
        return choices;
    }
    for (const QString &variable : node.keys()) {
        addColumnChoice(choices, variable, node[variable]);
    }
    return choices;
}

std::optional<InputError> whyNotOpened(const RowObjectList &rows, const DataRequest &request)
{
    auto error = rows.error();
    const auto &fault = rows.reader().wrongChoice();
    if (!error || !fault || fault->choice.isEmpty()) {
        return error;
    }
    JsonPath place = request.path;
    place.emplace_back(QStringLiteral("columns"));
    place.emplace_back(fault->choice);
    // The name of the data is nowhere in the job's place.
    return request.source.errorAt(place, QStringLiteral("%1: %2").arg(error->file, fault->text));
}

} // namespace kareport
