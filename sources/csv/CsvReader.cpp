#include "CsvReader.h"

#include "Xlate.h"

#include <QUtf8StringView>

#include <algorithm>

namespace kareport
{

namespace
{

enum ByteClass : unsigned char
{
    ordinary = 0,
    high,   ///< part of a character outside ASCII
    special ///< ends a cell or is wrong in a plain one
};

constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

bool isUtf8(std::string_view text)
{
    return QUtf8StringView(text.data(), static_cast<qsizetype>(text.size())).isValidUtf8();
}

} // namespace

CsvReader::CsvReader(const QString &path, std::string_view bytes, char delimiter)
    : CsvReader(path, bytes, Layout{delimiter, false, 0, std::nullopt, false})
{}

CsvReader::CsvReader(const QString &path, std::string_view bytes, const Layout &layout)
    : path_(path), bytes_(bytes), layout_(layout), passesLines_(layout.comment || layout.passesBlankLines)
{
    std::fill(classes_.begin() + 0x80, classes_.end(), high);
    for (const char character : {layout_.delimiter, '"', '\r', '\n', '\0'}) {
        classes_[static_cast<unsigned char>(character)] = special;
    }
    if (layout_.whitespace) {
        classes_[static_cast<unsigned char>(layout_.delimiter)] = ordinary;
        classes_[' '] = special;
        classes_['\t'] = special;
    }
    if (bytes_.starts_with(byteOrderMark)) {
        position_ = byteOrderMark.size();
    }
    skipLines();
}

void CsvReader::seek(std::size_t rowStart, qsizetype line)
{
    position_ = rowStart;
    line_ = line;
    error_.reset();
}

bool CsvReader::next()
{
    if (error_) {
        return false;
    }
    if ((passesLines_ && !passOverLines()) || skipEmptyEnd()) {
        return false;
    }
    rowStart_ = position_;
    rowLine_ = line_;
    rawCells_.clear();
    hasHighBytes_ = false;
    if (layout_.whitespace ? !scanSpacedRow() : !scanRow()) {
        return false;
    }
    const std::string_view row = bytes_.substr(rowStart_, position_ - rowStart_);
    if (hasHighBytes_ && !isUtf8(row)) {
        std::size_t good = 0;
        while (good < row.size()) {
            // The longest valid beginning ends before the first byte that is not part of a character.
            const unsigned char lead = static_cast<unsigned char>(row[good]);
            const std::size_t length = lead < 0x80 ? 1 : lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
            if (!isUtf8(row.substr(good, length))) {
                break;
            }
            good += length;
        }
        return fail(rowStart_ + good, Xlate("the file is not UTF-8"));
    }
    takeCells();
    return true;
}

bool CsvReader::scanRow()
{
    const char delimiter = layout_.delimiter;
    const std::size_t limit = std::min(bytes_.size(), rowStart_ + longestRow + 1); // with its line end
    std::size_t cellStart = position_;
    std::size_t at = position_;
    while (at < limit) {
        const unsigned char kind = classes_[static_cast<unsigned char>(bytes_[at])];
        if (kind != special) {
            hasHighBytes_ |= kind == high;
            ++at;
            continue;
        }
        const char character = bytes_[at];
        if (character == delimiter) {
            rawCells_.push_back({cellStart, at, false, false});
            cellStart = ++at;
        } else if (character == '\n' || character == '\r') {
            rawCells_.push_back({cellStart, at, false, false});
            return endRow(at);
        } else if (character == '"' && at == cellStart) {
            position_ = at;
            if (!scanQuoted(limit)) {
                return false;
            }
            at = position_;
            if (at == bytes_.size() || bytes_[at] == '\n' || bytes_[at] == '\r') {
                return endRow(at);
            }
            if (bytes_[at] != delimiter) {
                return fail(at, Xlate("a delimiter was expected after the closing quote"));
            }
            cellStart = ++at;
        } else {
            return failInCell(at);
        }
    }
    if (at - rowStart_ > longestRow) {
        return failTooLong();
    }
    rawCells_.push_back({cellStart, at, false, false});
    return endRow(at);
}

/// Reads a row whose cells have blanks and tabs between them.
bool CsvReader::scanSpacedRow()
{
    const std::size_t limit = std::min(bytes_.size(), rowStart_ + longestRow + 1);
    std::size_t at = position_;
    while (at < limit) {
        const char first = bytes_[at];
        if (first == ' ' || first == '\t') {
            ++at;
            continue;
        }
        if (first == '\n' || first == '\r') {
            return endRow(at);
        }
        if (first == '"') {
            position_ = at;
            if (!scanQuoted(limit)) {
                return false;
            }
            at = position_;
            if (at < bytes_.size() && std::string_view(" \t\r\n").find(bytes_[at]) == std::string_view::npos) {
                return fail(at, Xlate("a delimiter was expected after the closing quote"));
            }
            continue;
        }
        const std::size_t cellStart = at;
        for (; at < limit && classes_[static_cast<unsigned char>(bytes_[at])] != special; ++at) {
            hasHighBytes_ |= classes_[static_cast<unsigned char>(bytes_[at])] == high;
        }
        if (at < limit && (bytes_[at] == '"' || bytes_[at] == '\0')) {
            return failInCell(at);
        }
        rawCells_.push_back({cellStart, at, false, false});
    }
    return at - rowStart_ > longestRow ? failTooLong() : endRow(at);
}

/// Says what is wrong with a character that a plain cell cannot have.
bool CsvReader::failInCell(std::size_t at)
{
    return fail(at, bytes_[at] == '"'
                        ? Xlate("a quote inside a cell was not expected: put the whole cell in quotes and "
                                "double the quote")
                        : Xlate("the file contains a zero byte: a text file was expected"));
}

bool CsvReader::endRow(std::size_t end)
{
    position_ = end;
    if (end < bytes_.size() && bytes_[end] == '\r') {
        if (end + 1 < bytes_.size() && bytes_[end + 1] != '\n') {
            return failBareReturn(end);
        }
        ++position_;
    }
    if (position_ < bytes_.size()) {
        ++position_;
    }
    ++line_;
    return true;
}

bool CsvReader::failBareReturn(std::size_t at)
{
    return fail(at, Xlate("a carriage return without a line feed was not expected"));
}

bool CsvReader::failTooLong()
{
    return fail(rowStart_, Xlate("the row is longer than %1 bytes: a table of rows was expected").arg(longestRow));
}

bool CsvReader::fail(std::size_t at, const QString &text)
{
    error_ = errorAt(placeOf(at), text);
    return false;
}

} // namespace kareport
