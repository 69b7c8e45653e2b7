#include "JsonData.h"

#include "ColumnChoices.h"
#include "JobFileName.h"
#include "JsonFileList.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

namespace
{

class JsonData : public DataSource
{
public:
    JsonData(QString file, std::vector<ColumnChoice> columns) : file_(std::move(file)), columns_(std::move(columns)) {}

    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const override
    {
        const auto bytes = request.files.open(file_);
        if (const InputError *error = errorOf(bytes)) {
            return request.errorAt(QStringLiteral("json"), unreadableData(file_, error->text));
        }
        const auto &opened = std::get<std::shared_ptr<const FileBytes>>(bytes);
        auto rows =
            std::make_unique<JsonFileList>(opened, columns_, request.variables(),
                                           request.beginReading(QFileInfo(file_).fileName(), opened->view().size()));
        if (auto error = whyNotOpened(*rows, request)) {
            return *std::move(error);
        }
        return {std::move(rows)};
    }

    QStringList files() const override { return readsStandardInput() ? QStringList() : QStringList(file_); }
    bool isAllInFiles() const override { return !readsStandardInput(); }
    bool readsStandardInput() const override { return file_ == u"-"; }

private:
    QString file_;
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
