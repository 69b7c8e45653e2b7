#include "LandXmlData.h"

#include "JobFileName.h"
#include "LandXmlList.h"
#include "LandXmlQueryReader.h"
#include "VariableType.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

namespace
{

class LandXmlData : public DataSource
{
public:
    /// @param isInFileUnits  lengths of the query are in the unit of the file, not in that of the data set
    LandXmlData(QString file, LandXmlQuery query, bool isInFileUnits)
        : file_(std::move(file)), query_(std::move(query)), isInFileUnits_(isInFileUnits)
    {}

    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const override
    {
        const auto bytes = request.files.open(file_);
        if (const InputError *error = errorOf(bytes)) {
            return request.errorAt(QStringLiteral("landxml"), unreadableData(file_, error->text));
        }
        const auto &opened = std::get<std::shared_ptr<const FileBytes>>(bytes);
        LandXmlQuery query = query_;
        query.unit = isInFileUnits_ ? std::nullopt : std::optional(request.units.factorOf(VARIABLE_LENGTH));
        auto rows =
            std::make_unique<LandXmlList>(opened, std::move(query), request.variablesIn(LandXmlList::units()).find,
                                          request.beginReading(QFileInfo(file_).fileName(), opened->view().size()));
        if (auto error = rows->error()) {
            return *std::move(error);
        }
        return rows;
    }

    QStringList files() const override { return readsStandardInput() ? QStringList() : QStringList(file_); }
    bool isAllInFiles() const override { return !readsStandardInput(); }
    bool hasOwnUnits() const override { return true; }
    bool readsStandardInput() const override { return file_ == u"-"; }

private:
    QString file_;
    LandXmlQuery query_;
    bool isInFileUnits_;
};

std::shared_ptr<const DataSource> read(const JsonNode &set, const QDir &folder)
{
    const JsonNode units = set[QStringLiteral("units")];
    for (const char *unused : {"area", "angle"}) {
        if (const JsonNode unit = units[QString::fromLatin1(unused)]; unit.exists()) {
            unit.fail(Xlate("the file says its units: \"length\" alone was expected, which lengths of the job are in"));
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
