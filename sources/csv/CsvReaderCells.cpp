#include "CsvReader.h"

#include "Xlate.h"

// Cells in quotes, and the texts of the cells of a row.

namespace kareport
{

/// Reads a quoted cell from its opening quote to after its closing one.
bool CsvReader::scanQuoted(std::size_t limit)
{
    const std::size_t opening = position_;
    bool doubled = false;
    for (std::size_t at = opening + 1; at < limit; ++at) {
        const char character = bytes_[at];
        if (character == '"') {
            if (at + 1 < bytes_.size() && bytes_[at + 1] == '"') {
                doubled = true;
                ++at;
                continue;
            }
            rawCells_.push_back({opening + 1, at, doubled, true});
            position_ = at + 1;
            return true;
        }
        if (character == '\n') {
            ++line_;
        } else if (character == '\0') {
            return fail(at, Xlate("the file contains a zero byte: a text file was expected"));
        }
        hasHighBytes_ |= static_cast<unsigned char>(character) >= 0x80;
    }
    return limit < bytes_.size() ? failTooLong() : fail(opening, Xlate("the quoted cell has no closing quote"));
}

void CsvReader::takeCells()
{
    cells_.clear();
    std::size_t undoubled = 0;
    for (const RawCell &raw : rawCells_) {
        const std::string_view text = bytes_.substr(raw.begin, raw.end - raw.begin);
        if (!raw.doubledQuotes) {
            cells_.push_back(text);
            continue;
        }
        // The texts of a row must not move while cells point into them.
        if (unquoted_.size() < rawCells_.size()) {
            unquoted_.resize(rawCells_.size());
        }
        std::string &single = unquoted_[undoubled++];
        single.clear();
        for (std::size_t i = 0; i < text.size(); ++i) {
            single += text[i];
            i += text[i] == '"' ? 1U : 0U;
        }
        cells_.push_back(single);
    }
}

} // namespace kareport
