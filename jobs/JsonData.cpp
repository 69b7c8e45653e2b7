#include "ColumnChoices.h"
#include "DataKinds.h"
#include "FileData.h"
#include "JobFileName.h"
#include "JsonFileList.h"

namespace kareport
{

namespace
{

class JsonData : public FileData
{
public:
    JsonData(const QString &file, std::vector<ColumnChoice> columns)
        : FileData(QStringLiteral("json"), file), columns_(std::move(columns))
    {}

private:
    Expected<std::unique_ptr<RowList>> rowsOf(const std::shared_ptr<const FileBytes> &bytes, const DataRequest &request,
                                              const ReadProgress &progress) const override
    {
        return openedRows(std::make_unique<JsonFileList>(bytes, columns_, request.variables(), progress), request);
    }

    std::vector<ColumnChoice> columns_;
};

std::shared_ptr<const DataSource> read(const JsonNode &set, const QDir &folder)
{
    return std::make_shared<JsonData>(readDataFileName(set[QStringLiteral("json")], folder),
                                      readColumnChoices(set[QStringLiteral("columns")]));
}

} // namespace

DataKind jsonDataKind()
{
    return {QStringLiteral("json"), QStringList(QStringLiteral("columns")), read};
}

} // namespace kareport
