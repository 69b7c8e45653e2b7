#pragma once

#include "ResultFile.h"
#include "ResultOptions.h"

namespace kareport
{

/// The rows of one table as JSON lines: an object for each row, its keys the names of the variables, in UTF-8. It can be read
/// as data again.
class JsonLinesResult : public ResultFile
{
public:
    explicit JsonLinesResult(const ResultOptions &options) : values_(options.values) {}

    bool beginTable(const ResultTable &table) override;
    void addRow(const ResultRow &row) override;
    void endTable() override {}
    void addText(ResultText /*kind*/, QStringView /*text*/, int /*style*/) override {}

private:
    struct Column
    {
        std::size_t place = 0; ///< in the table
        std::string key;       ///< with all that is before the value
        double dataFactor = 1;
        bool isAngle = false;
    };

    void appendText(QStringView text);
    void appendValue(const Column &column, const ResultCell &cell);

    ResultValues values_;
    std::vector<Column> columns_;
};

} // namespace kareport
