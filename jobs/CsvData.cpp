#include "CsvData.h"

#include "ColumnChoices.h"
#include "CsvObjectList.h"
#include "CsvOptions.h"
#include "JobFileName.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

namespace
{

class CsvData : public DataSource
{
public:
    CsvData(QString file, CsvDialect dialect) : file_(std::move(file)), dialect_(std::move(dialect)) {}

    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const override
    {
        const auto bytes = request.files.open(file_);
        if (const InputError *error = errorOf(bytes)) {
            return request.errorAt(QStringLiteral("csv"), unreadableData(file_, error->text));
        }
        const auto &opened = std::get<std::shared_ptr<const FileBytes>>(bytes);
        auto rows =
            std::make_unique<CsvObjectList>(opened, dialect_, request.variables(),
                                            request.beginReading(QFileInfo(file_).fileName(), opened->view().size()));
        if (auto error = whyNotOpened(*rows, request)) {
            return *std::move(error);
        }
        return {std::move(rows)};
    }

    QStringList files() const override { return readsStandardInput() ? QStringList() : QStringList(file_); }
    bool isAllInFiles() const override { return !readsStandardInput(); }
    bool readsStandardInput() const override { return file_ == u"-"; }

    std::optional<InputError> noRow() const override
    {
        const QString sentence = dialect_.hasHeader
                                     ? Xlate("a row was expected after the header row: a block shows the first one")
                                     : Xlate("a row was expected: a block shows the first one");
        return InputError{file_, TextPlace(), sentence};
    }

private:
    QString file_;
    CsvDialect dialect_;
};

std::shared_ptr<const DataSource> read(const JsonNode &set, const QDir &folder)
{
    return std::make_shared<CsvData>(readDataFileName(set[QStringLiteral("csv")], folder), readCsvDialect(set));
}

} // namespace

DataKind csvDataKind()
{
    return {QStringLiteral("csv"), csvDialectKeys(), read};
}

} // namespace kareport
