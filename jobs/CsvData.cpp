#include "ColumnChoices.h"
#include "CsvObjectList.h"
#include "CsvOptions.h"
#include "DataKinds.h"
#include "FileData.h"
#include "JobFileName.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

class CsvData : public FileData
{
public:
    CsvData(const QString &file, CsvDialect dialect)
        : FileData(QStringLiteral("csv"), file), dialect_(std::move(dialect))
    {}

    std::optional<InputError> noRow() const override
    {
        const QString sentence = dialect_.hasHeader
                                     ? Xlate("a row was expected after the header row: a block shows the first one")
                                     : Xlate("a row was expected: a block shows the first one");
        return InputError{file(), TextPlace(), sentence};
    }

private:
    Expected<std::unique_ptr<RowList>> rowsOf(const std::shared_ptr<const FileBytes> &bytes, const DataRequest &request,
                                              const ReadProgress &progress) const override
    {
        return openedRows(std::make_unique<CsvObjectList>(bytes, dialect_, request.variables(), progress), request);
    }

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
