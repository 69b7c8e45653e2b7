#include "FilePlaces.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// Whether an XML file declares an encoding of one byte a character. Each encoding that is read, but for UTF-8 and UTF-16, is
/// one.
bool declaresOneByteCharacters(std::string_view bytes)
{
    constexpr std::size_t longest = 200;
    const std::string_view begin = bytes.substr(0, longest);
    const std::string_view declaration = begin.substr(0, begin.find("?>"));
    constexpr std::string_view keyword = "encoding";
    const std::size_t at = declaration.find(keyword);
    if (!declaration.starts_with("<?xml") || at == std::string_view::npos) {
        return false;
    }
    const std::size_t quote = declaration.find_first_of("\"'", at);
    const std::string_view name = declaration.substr(std::min(quote, declaration.size() - 1) + 1, 3);
    return name != "UTF" && name != "utf" && name != "Utf";
}

} // namespace

FilePlaces::FilePlaces(const FileBytes &file)
    : file_(file), hasOneByteCharacters_(declaresOneByteCharacters(file.view()))
{}

TextPlace FilePlaces::of(std::size_t byte)
{
    const std::string_view bytes = file_.view();
    if (byte < at_) {
        at_ = 0;
        place_ = TextPlace();
    }
    constexpr std::size_t block = std::size_t(1) << 16;
    const std::size_t end = std::min(byte, bytes.size());
    const bool isLittle = bytes.starts_with("\xFF\xFE");
    while (at_ < end) {
        // To the same borders as the reader, so that what is read again is released again.
        const std::size_t next = std::min(end, at_ / block * block + block);
        if (isLittle || bytes.starts_with("\xFE\xFF")) {
            walkWide(next, isLittle);
        } else {
            walk(next);
        }
        file_.release(at_);
    }
    return place_;
}

void FilePlaces::walk(std::size_t end)
{
    std::string_view piece = file_.view().substr(at_, end - at_);
    if (at_ == 0 && file_.view().starts_with("\xEF\xBB\xBF")) {
        piece.remove_prefix(std::min<std::size_t>(3, piece.size()));
    }
    const auto lines = std::count(piece.begin(), piece.end(), '\n');
    if (lines > 0) {
        place_.line += lines;
        place_.column = 1;
        piece.remove_prefix(piece.rfind('\n') + 1);
    }
    place_.column += std::count_if(piece.begin(), piece.end(), [this](char unit) {
        return hasOneByteCharacters_ || (static_cast<unsigned char>(unit) & 0xC0U) != 0x80U;
    });
    at_ = end;
}

void FilePlaces::walkWide(std::size_t end, bool isLittle)
{
    const std::string_view bytes = file_.view();
    for (at_ = std::max<std::size_t>(at_, 2); at_ + 1 < end; at_ += 2) {
        const auto low = static_cast<unsigned char>(bytes[isLittle ? at_ : at_ + 1]);
        const auto high = static_cast<unsigned char>(bytes[isLittle ? at_ + 1 : at_]);
        const bool isLineEnd = high == 0 && low == '\n';
        const bool isSecondHalf = high >= 0xDC && high <= 0xDF; // of a character of two units
        place_.line += isLineEnd ? 1 : 0;
        place_.column = isLineEnd ? 1 : place_.column + (isSecondHalf ? 0 : 1);
    }
    at_ = std::max(at_, end);
}

} // namespace kareport
