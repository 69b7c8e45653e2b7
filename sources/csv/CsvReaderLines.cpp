#include "CsvReader.h"

#include <algorithm>

// What a reader does with lines: those that are skipped, and places in them.

namespace kareport
{

void CsvReader::skipLines()
{
    for (qsizetype i = 0; i < layout_.skip && position_ < bytes_.size() && passOverLine(); ++i) {
    }
}

/// Skips lines that are not rows. @return false when something is wrong with one
bool CsvReader::passOverLines()
{
    while (position_ < bytes_.size() && isPassedOver()) {
        if (!passOverLine()) {
            return false;
        }
    }
    return true;
}

bool CsvReader::isPassedOver() const
{
    if (bytes_[position_] == layout_.comment) {
        return true;
    }
    const std::size_t text = layout_.passesBlankLines ? bytes_.find_first_not_of(" \t\r", position_) : position_;
    return layout_.passesBlankLines && (text == std::string_view::npos || bytes_[text] == '\n');
}

/// Skips a line, whatever it holds, with its carriage returns before the line feed: some files have several. Where lines
/// end with a carriage return alone, it would be all that follows: that is an error as in a row. @return false then
bool CsvReader::passOverLine()
{
    const std::size_t end = bytes_.find('\n', position_);
    const std::string_view line =
        bytes_.substr(position_, end - position_); // to the end where there is no such character
    const std::size_t carriageReturn = line.find('\r');
    const std::size_t lastOfText = line.find_last_not_of('\r');
    const bool isAtEnd = end == std::string_view::npos && carriageReturn + 1 < line.size();
    if (carriageReturn != std::string_view::npos &&
        (isAtEnd || (lastOfText != std::string_view::npos && carriageReturn < lastOfText)))
    {
        rowStart_ = position_;
        rowLine_ = line_;
        return failBareReturn(position_ + carriageReturn);
    }
    position_ = end == std::string_view::npos ? bytes_.size() : end + 1;
    ++line_;
    return true;
}

/// Blank lines at the end of the file are not rows.
bool CsvReader::skipEmptyEnd()
{
    // What was searched once is not searched again for each of its lines.
    if (position_ < blankFrom_ || position_ > blankEnd_) {
        const char *blank = layout_.whitespace ? " \t\r\n" : "\r\n";
        blankFrom_ = position_;
        blankEnd_ = std::min(bytes_.find_first_not_of(blank, position_), bytes_.size());
    }
    if (blankEnd_ == bytes_.size()) {
        position_ = bytes_.size();
    }
    return position_ == bytes_.size();
}

TextPlace CsvReader::placeOf(std::size_t at) const
{
    const std::string_view before = bytes_.substr(rowStart_, at - rowStart_);
    const auto lines = std::count(before.begin(), before.end(), '\n');
    const std::size_t lineStart = lines == 0 ? 0 : before.rfind('\n') + 1;
    const std::string_view line = before.substr(lineStart);
    const auto characters = std::count_if(line.begin(), line.end(),
                                          [](char byte) { return (static_cast<unsigned char>(byte) & 0xC0) != 0x80; });
    return {rowLine_ + lines, characters + 1};
}

TextPlace CsvReader::placeOfCell(std::size_t cell) const
{
    if (rawCells_.empty()) {
        return placeOf(rowStart_);
    }
    const RawCell &raw = rawCells_[std::min(cell, rawCells_.size() - 1)];
    return placeOf(raw.quoted ? raw.begin - 1 : raw.begin);
}

std::vector<TextPlace> CsvReader::placesOfCells() const
{
    std::vector<TextPlace> places;
    places.reserve(rawCells_.size());
    TextPlace place = {rowLine_, 1};
    std::size_t at = rowStart_;
    for (const RawCell &raw : rawCells_) {
        for (const std::size_t begin = raw.quoted ? raw.begin - 1 : raw.begin; at < begin; ++at) {
            const auto byte = static_cast<unsigned char>(bytes_[at]);
            if (byte == '\n') {
                place = {place.line + 1, 1};
            } else if ((byte & 0xC0U) != 0x80U) {
                ++place.column;
            }
        }
        places.push_back(place);
    }
    return places;
}

} // namespace kareport
