#pragma once

#include "ResultFile.h"
#include "ResultOptions.h"

namespace kareport
{

/// The rows of one table as CSV: a header row with the names of the variables, then a row for each object, in UTF-8 with
/// line feeds. It can be read as data again.
class CsvResult : public ResultFile
{
public:
    explicit CsvResult(const ResultOptions &options) : options_(options) {}

    bool beginTable(const ResultTable &table) override;
    void addRow(const ResultRow &row) override;
    void endTable() override {}
    void addText(ResultText /*kind*/, QStringView /*text*/, int /*style*/) override {}
    QStringList warnings() const override;

private:
    void appendValue(const ResultColumn &column, const ResultCell &cell);
    void appendText(QStringView text);
    void appendDataText(QStringView text);

    ResultOptions options_;
    std::vector<ResultColumn> columns_;
    std::vector<std::size_t> places_; ///< of the columns in the table
    quint64 formulas_ = 0;            ///< texts that other programs take for such
};

} // namespace kareport
