#include "ColumnChoices.h"
#include "DataKinds.h"
#include "PostgresObjectList.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

class PostgresData : public DataSource
{
public:
    explicit PostgresData(PostgresQuery query) : query_(std::move(query)) {}

    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const override
    {
        auto rows = std::make_unique<PostgresObjectList>(request.files.connection(query_.connection), query_,
                                                         request.variables(),
                                                         request.beginReading(QStringLiteral("PostgreSQL"), 0));
        return openedRows(std::move(rows), request);
    }

    bool isAllInFiles() const override { return false; }

private:
    PostgresQuery query_;
};

/// Values of $1, $2, ...: they go beside the query, so that no text of theirs is ever SQL.
std::vector<std::optional<QString>> readParameters(const JsonNode &node)
{
    std::vector<std::optional<QString>> parameters;
    for (qsizetype i = 0; node.expectArray() && i < node.size(); ++i) {
        const JsonNode parameter = node[i];
        const QJsonValue &value = parameter.value();
        switch (value.type()) {
        case QJsonValue::Null: parameters.emplace_back(); break;
        case QJsonValue::Bool:
            parameters.emplace_back(value.toBool() ? QStringLiteral("true") : QStringLiteral("false"));
            break;
        // What was set on the command line is the text as it was given there, such as 1.50 or 007.
        case QJsonValue::Double:
            parameters.emplace_back(parameter.givenText().value_or(value.toVariant().toString()));
            break;
        case QJsonValue::String: parameters.emplace_back(readWholeText(parameter)); break;
        default: parameter.fail(Xlate("a text, a number, true, false or null was expected")); break;
        }
    }
    return parameters;
}

std::shared_ptr<const DataSource> read(const JsonNode &set, const QDir & /*folder*/)
{
    PostgresQuery query;
    query.connection = readWholeText(set[QStringLiteral("postgresql")]);
    query.query = readWholeText(set[QStringLiteral("query")]);
    query.parameters = readParameters(set[QStringLiteral("parameters")]);
    query.columns = readColumnChoices(set[QStringLiteral("columns")]);
    if (query.query.isEmpty()) {
        set.fail(Xlate("the key \"%1\" with a text was expected").arg(QStringLiteral("query")));
    }
    return std::make_shared<PostgresData>(query);
}

} // namespace

DataKind postgresDataKind()
{
    QStringList options;
    for (const char *key : {"query", "parameters", "columns"}) {
        options.append(QLatin1StringView(key));
    }
    return {QStringLiteral("postgresql"), options, read};
}

} // namespace kareport
