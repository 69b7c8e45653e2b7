#include "CsvObjectList.h"

#include "CsvRows.h"
#include "DelimiterGuess.h"

namespace kareport
{

namespace
{

/// No rows, for the reason that `error` gives.
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

/// No rows, as reading was stopped before the first one.
class StoppedRows : public RowReader
{
public:
    explicit StoppedRows(const QString &name) : name_(name) {}

    bool next(UDataObject & /*object*/, const std::vector<unsigned> * /*onlyIds*/) override { return false; }
    void rewind() override {}
    QString name() const override { return name_; }
    bool knowsColumns() const override { return false; }
    std::size_t position() const override { return 0; }
    std::size_t rowBytes() const override { return 0; }

private:
    QString name_;
};

CsvDialect withDelimiter(char delimiter)
{
    CsvDialect dialect;
    dialect.delimiter = delimiter;
    return dialect;
}

std::unique_ptr<RowReader> makeReader(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                                      const Variables &variables, const ReadProgress &progress)
{
    const auto text = toUtf8(file, dialect.encoding, [&progress] { return progress && !progress(0); });
    if (const InputError *error = errorOf(text)) {
        return std::make_unique<FailedRows>(*error);
    }
    const auto &bytes = std::get<std::shared_ptr<const FileBytes>>(text);
    if (!bytes) {
        return std::make_unique<StoppedRows>(file->path());
    }
    CsvDialect known = dialect;
    if (dialect.kind == DelimiterKind::Automatic) {
        const auto guessed = guessDelimiter(bytes, dialect, variables);
        if (const InputError *error = errorOf(guessed)) {
            return std::make_unique<FailedRows>(*error);
        }
        known = std::get<CsvDialect>(guessed);
    }
    auto rows = std::make_unique<CsvRows>(bytes, known, variables);
    rows->checkHeader();
    return rows;
}

} // namespace

CsvObjectList::CsvObjectList(std::shared_ptr<const FileBytes> file, char delimiter, const FindVariable &findVariable,
                             ReadProgress progress)
    : RowObjectList(std::make_unique<CsvRows>(std::move(file), withDelimiter(delimiter), Variables{findVariable, {}}),
                    std::move(progress))
{}

CsvObjectList::CsvObjectList(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                             const Variables &variables, const ReadProgress &progress)
    : RowObjectList(makeReader(file, dialect, variables, progress), progress)
{}

} // namespace kareport
