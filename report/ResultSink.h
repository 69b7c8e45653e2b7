#pragma once

#include "UDictEntry.h"
#include "sXmlReportField.h"

#include <QString>
#include <QStringView>

#include <limits>
#include <vector>

class UDataObject;
class UJobSettings;

namespace kareport
{

/// A column of a table that is written, or a line of a block.
struct ResultColumn
{
    sXmlReportField field; ///< with the label that the heading shows
    QChar suffix;          ///< "R" or "+" where a marker before the field says so; the character 0 for none
    bool isShown = true;   ///< whether the report shows it; a sort key alone is not shown

    // What a number of the data stands for. Who opens the data fills it in.
    bool isVariable = true; ///< whether the dictionary has the variable
    double dataFactor = 1;  ///< a number of the data times this is internal (metre, square metre, radian)
    QString dataUnit;       ///< the key of the data's unit, such as "usft"; empty for a number without a unit
};

/// A table or a block that is written.
struct ResultTable
{
    QString name; ///< of a table; that of a block is known to who opens its data
    bool isTable = true;
    bool addsPrinted = false;               ///< whether its totals add the digits that are printed
    const UJobSettings *settings = nullptr; ///< units and formats of what is shown; valid until the table ends
    std::vector<ResultColumn> columns;      ///< without markers
};

/// What a total says of the values above it.
enum class ResultTotalKind
{
    None, ///< not a total
    Sum,
    Mean,
    Least,
    Greatest,
    Count
};

/// A value with its text.
struct ResultCell
{
    const UDictEntry *value = nullptr; ///< null where it is missing
    /// The text that the report shows for it, without the blanks that fill the column, and whole where the report has "#".
    /// Of a block's line that is left out, none.
    QStringView text;
    ResultTotalKind total = ResultTotalKind::None; ///< not None in a row of totals alone
};

/// What a row is.
enum class ResultRowKind
{
    Row,         ///< an object of the data
    GroupFooter, ///< values that a group ends with
    Total        ///< totals of the table; those of pages are left out, as results have no pages
};

struct ResultRow
{
    ResultRowKind kind = ResultRowKind::Row;
    const UDataObject *object = nullptr; ///< that the values are of; null where there is none
    std::vector<ResultCell> cells;       ///< one for each column
    static constexpr int noLevel = std::numeric_limits<int>::max();
    /// Of groups, from 0 for the outermost one. Of a row, the first one that a new group of begins with; of totals of a group,
    /// that of the group.
    int level = noLevel;
};

/// What a line of text in a report is.
enum class ResultText
{
    Heading, ///< under the header of the pages that follow
    Line,
    GroupHeading, ///< that a group of a table begins with
    GroupFooter   ///< that it ends with
};

/// Receives what a report is made of while it is written: typed values with their texts. What it is given is valid during
/// the call alone, the settings of a table until the table ends.
class ResultSink
{
public:
    ResultSink() = default;
    virtual ~ResultSink() = default;
    ResultSink(const ResultSink &) = delete;
    ResultSink &operator=(const ResultSink &) = delete;

    /// A table, or a block, begins. @return whether its rows are wanted; without that, neither rows nor an end follow
    virtual bool beginTable(const ResultTable &table) = 0;
    virtual void addRow(const ResultRow &row) = 0;
    virtual void endTable() = 0;
    /// A line of text, which may be in a table.
    /// @param style  0 plain, 1 bold, 2 underlined, 3 both; of the heading of a group, its level, from 0
    virtual void addText(ResultText kind, QStringView text, int style) = 0;
};

} // namespace kareport
