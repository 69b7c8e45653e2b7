#pragma once

#include "FieldFormatter.h"
#include "ResultSink.h"
#include "TextBuffer.h"

#include <vector>

class UXmlReportBlock;
class UXmlReportTable;

namespace kareport
{

/// A total as a sink of results gets it.
struct ResultTotal
{
    enum class Kind
    {
        None,   ///< a text alone, such as a count
        Number, ///< internal
        Whole
    };
    Kind kind = Kind::None;
    double number = 0;
    QString text; ///< as the report shows it, without the blanks that fill the column
    ResultTotalKind total = ResultTotalKind::None;
};

/// Hands the values of a table or a block to a sink of results while they are formatted.
class ResultFeed
{
public:
    /// @param sink  null where results are not needed: then nothing is done
    ResultFeed(ResultSink *sink, const FormatOptions &options) : sink_(sink), options_(options) {}

    /// @param addsPrinted  as `ResultTable` has it
    void beginTable(const UXmlReportTable &table, const QString &chainageLabel, bool addsPrinted);
    void beginBlock(const UXmlReportBlock &block);
    /// Whether rows are wanted.
    bool isOpen() const { return isOpen_; }

    /// Takes the next value of a row that has been formatted.
    /// @param entry  null for a value that is missing
    /// @param shown  the text in its column, and how it shows there
    void take(const FieldFormatter &field, const UDictEntry *entry, QStringView suffix, QStringView shown, Shown how);
    /// Leaves the next column of a row without a value and without a text.
    void skip();
    /// @param level  the first one of groups that begins with the row
    void endRow(const UDataObject &object, int level = ResultRow::noLevel);
    /// Forgets what was taken of a row.
    void dropRow();
    /// A line of text in a table. @param level  of the group that it heads, from 0
    void addText(ResultText kind, QStringView text, int level) { sink_->addText(kind, text, level); }
    /// A row of totals. @param totals  one for each column without a marker @param level  of their group
    void addTotals(ResultRowKind kind, const std::vector<ResultTotal> &totals, int level);
    void endTable();

private:
    void begin(ResultTable &table);

    ResultSink *sink_;
    const FormatOptions &options_;
    bool isOpen_ = false;
    ResultRow row_;
    TextBuffer texts_;              ///< of the row's values, one after the other
    std::vector<std::size_t> ends_; ///< of the texts
};

} // namespace kareport
