#include "CsvOptions.h"
#include "DataKinds.h"
#include "JsonObjectList.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

class ValuesData : public DataSource
{
public:
    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const override
    {
        JsonPath values = request.path;
        values.emplace_back(QStringLiteral("values"));
        std::unique_ptr<RowList> rows =
            std::make_unique<JsonObjectList>(request.source, values, request.variables().find, request.firstOnly,
                                             [&isStopped = request.isStopped](std::size_t) { return !isStopped(); });
        if (auto error = rows->error()) {
            return *std::move(error);
        }
        return rows;
    }
};

std::shared_ptr<const DataSource> read(const JsonNode &set, const QDir & /*folder*/)
{
    const JsonNode values = set[QStringLiteral("values")];
    if (!values.value().isArray() && !values.value().isObject()) {
        values.fail(Xlate("an object or a list of objects was expected"));
    }
    // A delimiter means nothing here, but jobs have it where a file was replaced by its values.
    CsvDialect unused;
    readDelimiter(set[QStringLiteral("delimiter")], unused);
    return std::make_shared<ValuesData>();
}

} // namespace

DataKind valuesDataKind()
{
    return {QStringLiteral("values"), QStringList(QStringLiteral("delimiter")), read};
}

} // namespace kareport
