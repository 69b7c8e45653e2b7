#pragma once

#include "ColumnTotal.h"
#include "DataRemarks.h"
#include "FieldFormatter.h"
#include "GroupResults.h"
#include "GroupedList.h"
#include "KeptLines.h"
#include "PageWriter.h"
#include "TotalFormatter.h"
#include "UDataObjectList.h"
#include "UXmlReportTable.h"

#include <QString>
#include <QStringView>

#include <functional>
#include <optional>
#include <vector>

namespace kareport
{

/// Writes the rows of a table in groups, with headings over them, and totals under them, the page and the table.
class GroupedTable
{
public:
    /// What the table does for its rows.
    struct Rows
    {
        UDataObjectList &list;
        /// The text of a row, valid until the next call. @param row  from 0
        std::function<QStringView(const UDataObject &object, quint64 row)> textOf;
        /// Places the table's heading over so many lines that belong together.
        std::function<void(qint64 lines)> placeHeading;
        /// Is told that a row was written. @param row  from 1
        std::function<void(quint64 row)> rowWritten;
    };

    GroupedTable(PageWriter &page, const FormatOptions &options, const UXmlReportTable &table, GroupedList &groups,
                 DataRemarks &remarks);

    /// Has all that is written handed on as results as well. It must outlive the table.
    void giveResults(GroupResults &results) { results_ = &results; }
    /// Writes all rows. Without any, nothing is written and the heading not placed.
    void write(const Rows &rows);

private:
    /// A group that is being written.
    struct OpenGroup
    {
        UDataObject firstRow;
        std::optional<std::size_t> heading; ///< that has no text yet
        std::size_t headingResult = 0;      ///< the same of the results
        quint64 rows = 0;
    };
    using Totals = std::vector<ColumnTotal>;

    void beginGroups(std::size_t first, const UDataObject &object);
    void endGroups(std::size_t first);
    void addRow(const UDataObject &object, QStringView text, quint64 row);
    void addValues(const UDataObject &object, quint64 row);
    bool isKept(std::size_t levels) const;
    void countPageRow(const KeptLines::Line &line);
    std::vector<QString> pageEnd();
    void clearPage();
    void addTo(Totals &totals, const Totals &other);
    bool givesResults() const { return results_ != nullptr && results_->isWanted(); }
    /// Whose totals they are.
    struct TotalsOf
    {
        ResultRowKind kind;
        int level; ///< of the group
    };
    void giveTotals(const TotalsOf &of, const std::vector<TotalLine> &lines, const Totals &totals, quint64 rows,
                    const UDataObject *object);
    std::vector<ResultTotal> resultsOf(const TotalLine &line, const Totals &totals) const;

    QString textOf(const GroupText &text, const Totals &totals, quint64 rows, const UDataObject *object) const;
    QString totalText(const TotalCell &cell, const Totals &totals) const;
    std::vector<QString> linesOf(const std::vector<TotalLine> &lines, const Totals &totals, quint64 rows,
                                 const UDataObject *object) const;
    QString lineOf(const TotalLine &line, const Totals &totals, const QString &label, bool &hasLabel) const;
    QString ruleOf(const std::vector<TotalLine> &lines) const;
    template <typename Cell>
    void appendCells(TextBuffer &out, Cell appendCell) const;
    qint64 pageEndHeight() const;
    const TotalCell *cellOf(const TotalLine &line, std::size_t field) const;

    PageWriter &page_;
    const FormatOptions &options_;
    const FormatOptions textOptions_; ///< of values in texts, which have no width
    GroupedList &list_;
    const TableGroups &groups_;
    DataRemarks &remarks_;
    std::vector<sXmlReportField> fields_;
    std::vector<FieldFormatter> fieldFormatters_;
    std::vector<std::optional<std::size_t>> variableOf_; ///< of each field; nothing for one without totals
    std::vector<TotalFormatter> columns_;                ///< by the fields
    std::vector<TotalFormatter> texts_;                  ///< by the variables, for texts
    std::vector<TotalledCell> cells_;
    KeptLines lines_;
    GroupResults *results_ = nullptr; ///< null where they are not needed

    std::vector<OpenGroup> open_; ///< by the levels
    std::vector<Totals> totals_;  ///< of the table, and of the levels after it
    quint64 tableRows_ = 0;
    bool afterHeading_ = false; ///< the line added last is a heading
    std::vector<LeftOut> leftOut_;
    mutable quint64 wideTotalRow_ = 0; ///< the row, from 1, under which a total was last too wide

    Totals pageTotals_;
    quint64 pageRows_ = 0;
    std::vector<TotalledCell::Value> waiting_; ///< values of rows that have no place on a page yet
    std::size_t nextWaiting_ = 0;
};

} // namespace kareport
