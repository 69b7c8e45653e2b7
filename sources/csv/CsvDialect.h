#pragma once

#include "ColumnBinding.h"
#include "NumberStyle.h"
#include "TextEncoding.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace kareport
{

/// What cells are delimited by.
enum class DelimiterKind
{
    Character,
    Whitespace, ///< blanks and tabs, as many as there are
    Automatic   ///< detected from the first rows; two possible readings are an error
};

/// How a file of rows and cells is written. By default: RFC 4180 in UTF-8, with a header row.
struct CsvDialect
{
    DelimiterKind kind = DelimiterKind::Character;
    char delimiter = ',';      ///< one ASCII character, for `DelimiterKind::Character`
    bool hasHeader = true;     ///< the first row names the columns
    bool isHeaderSaid = false; ///< it was chosen by somebody who knows the file: the row is not checked for data
    QStringList names;         ///< of the columns by their position, empty for one that is skipped. Then names of a
                               ///< header row do not count, and every row has as many cells
    QString order;             ///< the columns in short form, such as "PNEZD"; empty for none. Names of a header
                               ///< row then do not count, nor do they with `names`, which win
    std::vector<ColumnChoice> columns; ///< what is read from which column; it wins over names and order
    TextEncoding encoding = TextEncoding::Utf8;
    NumberStyle numbers;
    qsizetype skip = 0;          ///< lines before the header row
    std::optional<char> comment; ///< an ASCII character: a line that begins with it is skipped
    bool passesBlankLines = false;
};

/// The names of columns of a short form: P is Number, N Northing, E Easting, Z Elevation and D Description, in any case and
/// any order, each once; "-" is a column that is skipped and has no name.
/// @return nothing when the text is not of this form
std::optional<QStringList> namesOfOrder(QStringView order);

} // namespace kareport
