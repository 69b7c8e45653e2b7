#pragma once

#include "ResultFile.h"
#include "ResultOptions.h"
#include "UJobSettings.h"
#include "XlsxBook.h"
#include "XlsxRanges.h"

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
    /// @param rowsOfSheet  what a sheet holds before a further one is begun
    explicit XlsxResult(const ResultOptions &options, lxw_row_t rowsOfSheet = LXW_ROW_MAX);

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
        lxw_row_t headRow = 0; ///< of the last of them
    };

    // The whole book.
    Sheet &textSheet();
    Sheet furtherSheet(const QString &name);
    void endTextSheet();
    void setWidths(Sheet &sheet);
    void keepInView(const Sheet &sheet);
    void copyBook();

    // Tables and blocks.
    static double widthOfText(qsizetype characters);
    void addColumn(const ResultColumn &column, std::size_t place);
    Column bearingValueOf(const Column &bearing) const;
    void beginTableSheet();
    void writeHead();
    void makeRoom();
    void endSheetTable();
    void writeBlock(const ResultRow &row);
    void writeRow(const ResultRow &row);
    void writeCell(const Column &column, lxw_col_t at, const ResultCell &cell);
    bool writeBearingValue(const Column &column, lxw_col_t at, const ResultCell &cell);
    bool writeNumber(const Column &column, lxw_col_t at, const ResultCell &cell);

    // Totals.
    void writeTotals(const ResultRow &row);
    void writeTotal(const Column &column, lxw_col_t at, const ResultRow &row, const ResultCell &cell);
    std::string formulaOf(const Column &column, lxw_col_t at, const ResultRow &row, const ResultCell &cell) const;
    bool givesFormula(const Column &column, const ResultCell &cell) const;

    ResultOptions options_;
    lxw_row_t rowsOfSheet_;
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
    bool addsPrinted_ = false; ///< the totals of the table add the digits that are printed
    std::vector<Column> columns_;
    XlsxRanges ranges_; ///< of its rows of data
    lxw_row_t lastRowOfData_ = 0;
    quint64 totalsAsValues_ = 0; ///< that were to be formulas
    quint64 columnsLeftOut_ = 0;
};

} // namespace kareport
