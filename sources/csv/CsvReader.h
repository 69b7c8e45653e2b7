#pragma once

#include "FileBytes.h"
#include "InputError.h"

#include <QString>

#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace kareport
{

/// Reads a CSV text (RFC 4180, UTF-8 with or without a byte-order mark) row by row, in one pass. With other delimiters, and
/// lines that are skipped, it reads any text of rows and cells.
class CsvReader
{
public:
    /// How rows and cells are told apart.
    struct Layout
    {
        char delimiter = ',';    ///< one ASCII character
        bool whitespace = false; ///< blanks and tabs, as many as there are, delimit; those around a row do not count
        qsizetype skip = 0;      ///< lines that are skipped at the beginning, whatever they hold
        std::optional<char> comment;   ///< a line that begins with this ASCII character is skipped
        bool passesBlankLines = false; ///< lines of nothing, or of blanks and tabs alone, are skipped
    };

    /// Longer rows are taken for something that is no CSV.
    static constexpr std::size_t longestRow = std::size_t(1) << 20;

    /// @param path  names the file in errors
    CsvReader(const QString &path, std::string_view bytes, char delimiter);
    CsvReader(const QString &path, std::string_view bytes, const Layout &layout);

    /// Reads the next row. @return false at the end, and when something is wrong with the row
    bool next();
    const std::optional<InputError> &error() const { return error_; }

    /// The cells of the row; valid until the next call of `next`.
    const std::vector<std::string_view> &cells() const { return cells_; }
    /// Where the row begins: a position for `seek`.
    std::size_t rowStart() const { return rowStart_; }
    qsizetype rowLine() const { return rowLine_; }
    /// The line that the next row begins in.
    qsizetype nextLine() const { return line_; }
    /// Where reading has come to.
    std::size_t position() const { return position_; }

    /// Continues at the start of a row that was read before.
    void seek(std::size_t rowStart, qsizetype line);

    /// The place of a cell of the row; after the last one, that of the last.
    TextPlace placeOfCell(std::size_t cell) const;
    /// The places of all cells of the row.
    std::vector<TextPlace> placesOfCells() const;
    InputError errorAt(TextPlace place, const QString &text) const { return {path_, place, text}; }

private:
    struct RawCell
    {
        std::size_t begin;
        std::size_t end;
        bool doubledQuotes;
        bool quoted;
    };

    void skipLines();
    bool passOverLines();
    bool isPassedOver() const;
    bool passOverLine();
    bool scanRow();
    bool scanSpacedRow();
    bool failInCell(std::size_t at);
    bool scanQuoted(std::size_t limit);
    bool endRow(std::size_t end);
    void takeCells();
    bool skipEmptyEnd();
    bool failTooLong();
    bool failBareReturn(std::size_t at);
    bool fail(std::size_t at, const QString &text);
    TextPlace placeOf(std::size_t at) const;

    QString path_;
    std::string_view bytes_;
    Layout layout_;
    bool passesLines_; ///< comments or blank lines
    std::size_t position_ = 0;
    std::size_t rowStart_ = 0;
    std::size_t blankFrom_ = 1; ///< from here to `blankEnd_` there are blanks and line ends alone
    std::size_t blankEnd_ = 0;  // nothing was looked over yet
    qsizetype line_ = 1;
    qsizetype rowLine_ = 1;
    bool hasHighBytes_ = false;
    std::vector<RawCell> rawCells_;
    std::vector<std::string_view> cells_;
    std::vector<std::string> unquoted_;
    std::optional<InputError> error_;
    std::array<unsigned char, 256> classes_{};
};

} // namespace kareport
