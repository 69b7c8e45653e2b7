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

QString readWholeText(const JsonNode &node)
{
    const QString text = node.text();
    if (text.contains(QChar())) {
        node.fail(Xlate("a text without a zero character was expected"));
    }
    return text;
}

Expected<std::unique_ptr<RowList>> openedRows(std::unique_ptr<RowObjectList> rows, const DataRequest &request)
{
    const auto error = rows->error();
    if (!error) {
        return {std::move(rows)};
    }
    const auto &fault = rows->reader().wrongChoice();
    if (!fault || fault->choice.isEmpty()) {
        return *error;
    }
    JsonPath place = request.path;
    place.emplace_back(QStringLiteral("columns"));
    place.emplace_back(fault->choice);
    // The place in the job does not name the data.
    return request.source.errorAt(place, QStringLiteral("%1: %2").arg(error->file, fault->text));
}

} // namespace kareport
