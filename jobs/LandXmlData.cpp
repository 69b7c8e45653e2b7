#include "DataKinds.h"
#include "FileData.h"
#include "JobFileName.h"
#include "LandXmlList.h"
#include "LandXmlQueryReader.h"
#include "VariableType.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

class LandXmlData : public FileData
{
public:
    /// @param isInFileUnits  lengths of the query are in the unit of the file, not in that of the data set
    LandXmlData(const QString &file, LandXmlQuery query, bool isInFileUnits)
        : FileData(QStringLiteral("landxml"), file), query_(std::move(query)), isInFileUnits_(isInFileUnits)
    {}

    bool hasOwnUnits() const override { return true; }

private:
    Expected<std::unique_ptr<RowList>> rowsOf(const std::shared_ptr<const FileBytes> &bytes, const DataRequest &request,
                                              const ReadProgress &progress) const override
    {
        LandXmlQuery query = query_;
        query.unit = isInFileUnits_ ? std::nullopt : std::optional(request.units.factorOf(VARIABLE_LENGTH));
        const Variables variables = request.variablesIn(LandXmlList::units());
        auto rows = std::make_unique<LandXmlList>(bytes, std::move(query), variables.find, progress, request.settings);
        if (variables.shown) {
            rows->setShown(*variables.shown);
        }
        if (auto error = rows->error()) {
            return *std::move(error);
        }
        return {std::move(rows)};
    }

    LandXmlQuery query_;
    bool isInFileUnits_;
};

std::shared_ptr<const DataSource> read(const JsonNode &set, const QDir &folder)
{
    const JsonNode units = set[QStringLiteral("units")];
    for (const char *unused : {"area", "angle"}) {
        if (const JsonNode unit = units[QString::fromLatin1(unused)]; unit.exists()) {
            unit.fail(Xlate(
                "a LandXML file states its own units: only \"length\" was expected, the unit of lengths in the job"));
        }
    }
    return std::make_shared<LandXmlData>(readDataFileName(set[QStringLiteral("landxml")], folder),
                                         readLandXmlQuery(set), !units[QStringLiteral("length")].exists());
}

} // namespace

DataKind landXmlDataKind()
{
    return {QStringLiteral("landxml"), landXmlQueryKeys(), read};
}

} // namespace kareport
