#include "CsvObjectList.h"

#include "CsvRows.h"
#include "DelimiterGuess.h"

namespace kareport
{

namespace
{

/// No rows, for the reason that stands in `error`.
class FailedRows : public RowReader
{
public:
    explicit FailedRows(const InputError &error) { error_ = error; }

    bool next(UDataObject & /*object*/, const std::vector<unsigned> * /*onlyIds*/) override { return false; }
    void rewind() override {}
    QString name() const override { return error_->file; }
    std::size_t position() const override { return 0; }
    std::size_t rowBytes() const override { return 0; }
};

CsvDialect withDelimiter(char delimiter)
{
    CsvDialect dialect;
    dialect.delimiter = delimiter;
    return dialect;
}

std::unique_ptr<RowReader> makeReader(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                                      const Variables &variables)
{
    const auto text = toUtf8(file, dialect.encoding);
    if (const InputError *error = errorOf(text)) {
        return std::make_unique<FailedRows>(*error);
    }
    const auto &bytes = std::get<std::shared_ptr<const FileBytes>>(text);
    if (dialect.kind != DelimiterKind::Automatic) {
        return std::make_unique<CsvRows>(bytes, dialect, variables);
    }
    const auto guessed = guessDelimiter(bytes, dialect, variables);
    if (const InputError *error = errorOf(guessed)) {
        return std::make_unique<FailedRows>(*error);
    }
    return std::make_unique<CsvRows>(bytes, std::get<CsvDialect>(guessed), variables);
}

} // namespace

CsvObjectList::CsvObjectList(std::shared_ptr<const FileBytes> file, char delimiter, const FindVariable &findVariable,
                             ReadProgress progress)
    : RowObjectList(std::make_unique<CsvRows>(std::move(file), withDelimiter(delimiter), Variables{findVariable, {}}),
                    std::move(progress))
{}

CsvObjectList::CsvObjectList(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                             const Variables &variables, ReadProgress progress)
    : RowObjectList(makeReader(file, dialect, variables), std::move(progress))
{}

} // namespace kareport
