#include "RichTextTokens.h"

#include <array>
#include <limits>

namespace kareport
{

namespace
{

constexpr auto endsText = [] {
    std::array<bool, 256> ends{};
    for (const char byte : {'\\', '{', '}', '\r', '\n', '\0'}) {
        ends[static_cast<unsigned char>(byte)] = true;
    }
    return ends;
}();

bool isLetter(char byte)
{
    return (byte >= 'a' && byte <= 'z') || (byte >= 'A' && byte <= 'Z');
}

bool isDigit(char byte)
{
    return byte >= '0' && byte <= '9';
}

int hexDigit(char byte)
{
    if (isDigit(byte)) {
        return byte - '0';
    }
    if (byte >= 'a' && byte <= 'f') {
        return byte - 'a' + 10;
    }
    return byte >= 'A' && byte <= 'F' ? byte - 'A' + 10 : -1;
}

} // namespace

RichTextToken RichTextTokens::next()
{
    while (at_ < bytes_.size() && (bytes_[at_] == '\n' || bytes_[at_] == '\r' || bytes_[at_] == '\0')) {
        ++at_;
    }
    start_ = at_;
    if (at_ == bytes_.size()) {
        return {};
    }
    switch (bytes_[at_]) {
    case '{': ++at_; return {.kind = RichTextTokenKind::GroupStart, .text = {}};
    case '}': ++at_; return {.kind = RichTextTokenKind::GroupEnd, .text = {}};
    case '\\': ++at_; return control();
    default: break;
    }
    while (at_ < bytes_.size() && !endsText[static_cast<unsigned char>(bytes_[at_])]) {
        ++at_;
    }
    return {.kind = RichTextTokenKind::Text, .text = bytes_.substr(start_, at_ - start_)};
}

RichTextToken RichTextTokens::control()
{
    if (at_ == bytes_.size()) {
        return {};
    }
    if (isLetter(bytes_[at_])) {
        return word();
    }
    const char symbol = bytes_[at_++];
    if (symbol == '\'' && bytes_.size() - at_ >= 2) {
        const int high = hexDigit(bytes_[at_]);
        const int low = hexDigit(bytes_[at_ + 1]);
        if (high >= 0 && low >= 0) {
            at_ += 2;
            return {.kind = RichTextTokenKind::Byte, .text = {}, .byte = static_cast<char>(high * 16 + low)};
        }
    }
    // An LF after an escaped CR is left out before the next token.
    return {.kind = RichTextTokenKind::Symbol, .text = {}, .byte = symbol == '\r' ? '\n' : symbol};
}

RichTextToken RichTextTokens::word()
{
    RichTextToken token{.kind = RichTextTokenKind::Word, .text = {}};
    const std::size_t begin = at_;
    while (at_ < bytes_.size() && isLetter(bytes_[at_])) {
        ++at_;
    }
    token.text = bytes_.substr(begin, at_ - begin);
    const bool negative = bytes_.size() - at_ >= 2 && bytes_[at_] == '-' && isDigit(bytes_[at_ + 1]);
    if (negative) {
        ++at_;
    }
    constexpr int most = std::numeric_limits<int>::max();
    for (; at_ < bytes_.size() && isDigit(bytes_[at_]); ++at_) {
        const int digit = bytes_[at_] - '0';
        token.hasNumber = true;
        token.number = token.number > (most - digit) / 10 ? most : token.number * 10 + digit;
    }
    if (negative) {
        token.number = -token.number;
    }
    if (at_ < bytes_.size() && bytes_[at_] == ' ') {
        ++at_;
    }
    if (token.text == "bin" && token.number > 0) {
        if (static_cast<std::size_t>(token.number) > bytes_.size() - at_) {
            token.kind = RichTextTokenKind::MissingData;
        } else {
            at_ += static_cast<std::size_t>(token.number);
        }
    }
    return token;
}

} // namespace kareport
