#pragma once

#include "ResultFile.h"
#include "ResultOptions.h"

namespace kareport
{

/// Says what the columns of a file of data are: a JSON object with the names, labels, types and units of the columns, and how
/// many rows there are.
class ResultSchema : public ResultFile
{
public:
    explicit ResultSchema(const ResultOptions &options) : options_(options) {}

    bool beginTable(const ResultTable &table) override;
    void addRow(const ResultRow &row) override { rows_ += row.kind == ResultRowKind::Row ? 1U : 0U; }
    void endTable() override {}
    void addText(ResultText /*kind*/, QStringView /*text*/, int /*style*/) override {}

protected:
    void writeEnd() override;

private:
    ResultOptions options_;
    std::string columns_;
    std::string name_;
    quint64 rows_ = 0;
};

} // namespace kareport
