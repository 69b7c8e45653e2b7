#pragma once

#include <QString>

#include <cstddef>
#include <optional>

namespace kareport
{

/// Which of the values that a cell has is written.
enum class ResultValues
{
    Data,    ///< that of the data, in the data's units
    Printed, ///< the text that the report shows, or the number that it says
    Exact    ///< of a spreadsheet: the number before it was rounded, in the unit that the report shows
};

/// What an output of typed results is to be.
struct ResultOptions
{
    static constexpr int usualRowsPerPage = 20'000; ///< with more, browsers become slow

    // The step whose rows it has, where it has those of one alone; empty for any.
    QString table;                   ///< the name of a table of the template
    QString block;                   ///< or of a block
    QString data;                    ///< the name of the data set that is written through it
    std::optional<std::size_t> step; ///< or the step itself, by its place in the job

    ResultValues values = ResultValues::Data;
    char delimiter = ','; ///< of CSV
    QString schema;       ///< a file that says the types and units of the columns; empty for none

    QString title;                      ///< of a web page; empty for that of the report
    QString language;                   ///< of a web page, as a tag such as "de"; empty where it is not said
    int rowsPerPage = usualRowsPerPage; ///< of tables, on each web page

    bool isOneSheet = false;    ///< of a workbook: all in one sheet, not a sheet for each table
    bool bearingValues = false; ///< of a workbook: a column with the degrees of each bearing beside its text
    bool formulas = false;      ///< of a workbook: totals are formulas where these show the same digits
};

} // namespace kareport
