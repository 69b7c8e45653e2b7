#pragma once

#include "ResultFile.h"
#include "ResultOptions.h"
#include "UJobSettings.h"
#include "XlsxBook.h"

#include <QStringList>

#include <memory>
#include <vector>

namespace kareport
{

/// A report as a workbook: every number a number with the format of its column. Each table has a sheet, and lines, headings
/// and blocks have one together; or all is in one sheet.
class XlsxResult : public ResultFile
{
public:
    explicit XlsxResult(const ResultOptions &options);

    void beginReport(const ResultReport &report) override;
    bool beginTable(const ResultTable &table) override;
    void addRow(const ResultRow &row) override;
    void endTable() override;
    void addText(ResultText kind, QStringView text, int style) override;
    QStringList warnings() const override;

protected:
    void writeEnd() override;

private:
    struct Column
    {
        std::size_t place = 0; ///< in the table
        ResultColumn column;
        bool isNumber = false;
        bool isBearingValue = false; ///< the number of the bearing beside it
        CellLook look;
        lxw_format *format = nullptr;      ///< of its cells
        lxw_format *totalFormat = nullptr; ///< of its cells in totals
        double width = 0;                  ///< in characters
    };
    /// A sheet that is written.
    struct Sheet
    {
        lxw_worksheet *sheet = nullptr;
        lxw_row_t nextRow = 0;
        std::vector<double> widths; ///< of its columns
        int tables = 0;
    };

    Sheet &textSheet();
    void addColumn(const ResultColumn &column, std::size_t place);
    void beginTableSheet();
    void writeHead();
    void makeRoom();
    void endSheetTable();
    void writeBlock(const ResultRow &row);
    void writeCell(const Column &column, lxw_col_t at, const ResultCell &cell, bool isTotal);
    void setWidths(Sheet &sheet);

    ResultOptions options_;
    std::unique_ptr<XlsxBook> book_;
    QString title_;
    QByteArray properties_[3]; ///< title, author, comments: kept while the library has them
    std::int64_t created_ = 0;
    UJobSettings settings_;
    bool isSettingsKnown_ = false;
    Sheet text_;  ///< of lines, headings and blocks; of all, where there is one sheet
    Sheet table_; ///< of the table that is written
    QString tableName_;
    bool isTable_ = false;
    std::vector<Column> columns_;
    lxw_row_t headRow_ = 0;
};

} // namespace kareport
