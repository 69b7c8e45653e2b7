#include "RichTextParser.h"

#include "Xlate.h"

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

/// Far deeper than any word processor writes.
constexpr std::size_t mostGroups = 10000;

bool isBlank(std::string_view text)
{
    return text.find_first_not_of(" \t") == std::string_view::npos;
}

bool isEscapedText(const RichTextToken &token)
{
    return token.kind == RichTextTokenKind::Symbol && (token.byte == '\\' || token.byte == '{' || token.byte == '}');
}

} // namespace

RichTextParser::RichTextParser(QByteArrayView bytes, RichTextRawBytes rawBytes, QTextDocument &document)
    : tokens_(bytes),
      rawBytes_(rawBytes),
      formats_(fonts_),
      target_(std::make_unique<RichTextBuilder>(document, formats_))
{
    state_.codePage = &codePages_.page(fileCodePage_);
}

RichTextParser::RichTextParser(QByteArrayView bytes, RichTextRawBytes rawBytes, QString &text)
    : tokens_(bytes), rawBytes_(rawBytes), formats_(fonts_), target_(std::make_unique<RichTextCollector>(text))
{
    state_.codePage = &codePages_.page(fileCodePage_);
}

QString RichTextParser::read()
{
    QString error;
    for (bool isOpen = true; isOpen && error.isEmpty();) {
        const RichTextToken token = tokens_.next();
        const bool isStarred = std::exchange(isStarred_, false);
        if (token.kind != RichTextTokenKind::Text && token.kind != RichTextTokenKind::Byte && !isEscapedText(token)) {
            flushBytes();
        }
        switch (token.kind) {
        case RichTextTokenKind::GroupStart: error = openGroup(); break;
        case RichTextTokenKind::GroupEnd: isOpen = closeGroup(); break;
        case RichTextTokenKind::MissingData:
            error = Xlate("%1 bytes of data were expected after \\bin").arg(token.number);
            break;
        case RichTextTokenKind::End:
            error = Xlate("a closing brace was expected: groups that are still open: %1").arg(openGroups());
            break;
        case RichTextTokenKind::Text:
        case RichTextTokenKind::Byte:
        case RichTextTokenKind::Word:
        case RichTextTokenKind::Symbol:
            if (skipDepth_ > 0) {
                noteSkipped(token);
            } else if (token.kind == RichTextTokenKind::Text) {
                readText(token.text);
            } else if (token.kind == RichTextTokenKind::Byte) {
                readByte(token.byte);
            } else if (token.kind == RichTextTokenKind::Word) {
                readWord(token, isStarred);
            } else {
                readSymbol(token.byte);
            }
            break;
        }
    }
    flushBytes();
    if (!target_->isParagraphEmpty()) {
        endParagraph();
    }
    return error;
}

QString RichTextParser::openGroup()
{
    fallback_ = 0;
    if (openGroups() >= mostGroups) {
        return Xlate("at most %1 nested groups were expected").arg(mostGroups);
    }
    if (skipDepth_ > 0) {
        ++skipDepth_;
    } else {
        outer_.push_back(state_);
    }
    return {};
}

/// @return whether a group is still open
bool RichTextParser::closeGroup()
{
    fallback_ = 0;
    if (skipDepth_ > 1) {
        --skipDepth_;
        return true;
    }
    const bool isSkipped = skipDepth_ > 0;
    skipDepth_ = 0;
    skipNote_ = nullptr;
    if (state_.destination == RichTextDestination::FontTable && !isSkipped) {
        fonts_.commit();
    }
    if (outer_.size() <= 1) {
        // What is in force now is in force at the end of the last paragraph.
        return false;
    }
    const bool leavesFonts = state_.destination == RichTextDestination::FontTable &&
                             outer_.back().destination != RichTextDestination::FontTable;
    state_ = std::move(outer_.back());
    outer_.pop_back();
    if (leavesFonts) {
        useFont(fonts_.defaultFont());
    }
    return true;
}

void RichTextParser::skipGroup(int *note)
{
    skipDepth_ = 1;
    skipNote_ = note;
}

void RichTextParser::noteSkipped(const RichTextToken &token)
{
    const bool isText = (token.kind == RichTextTokenKind::Text && !isBlank(token.text)) ||
                        token.kind == RichTextTokenKind::Byte || isEscapedText(token) ||
                        (token.kind == RichTextTokenKind::Word && token.text == "u");
    if (isText && skipNote_ != nullptr) {
        ++*std::exchange(skipNote_, nullptr);
    }
}

void RichTextParser::readDestination(const RichTextWord &word)
{
    const bool isBody = state_.destination == RichTextDestination::Body;
    switch (word.action) {
    case RichTextAction::FontTable: state_.destination = RichTextDestination::FontTable; break;
    case RichTextAction::ColourTable:
        state_.destination = RichTextDestination::ColourTable;
        colours_.clear();
        colour_ = automaticColour;
        break;
    case RichTextAction::Skip: skipGroup(nullptr); break;
    case RichTextAction::SkipCounted:
        skipGroup(!isBody                      ? nullptr
                  : word.value == FootnoteNote ? &notes_.footnotes
                  : word.value == HeaderNote   ? &notes_.headers
                                               : &notes_.objects);
        break;
    case RichTextAction::Picture:
        notes_.pictures += isBody ? 1 : 0;
        skipGroup(nullptr);
        break;
    case RichTextAction::Object:
    case RichTextAction::TwoForms:
        notes_.objects += isBody && word.action == RichTextAction::Object ? 1 : 0;
        state_.outer = state_.destination;
        state_.destination = RichTextDestination::Ignored;
        break;
    case RichTextAction::ObjectResult:
    case RichTextAction::UnicodeForm:
        if (state_.destination == RichTextDestination::Ignored) {
            state_.destination = state_.outer;
        }
        break;
    default: break;
    }
}

void RichTextParser::readText(std::string_view bytes)
{
    bytes = withoutFallback(bytes);
    switch (state_.destination) {
    case RichTextDestination::Body:
        if (isShown()) {
            putRawBytes(bytes);
        } else if (!isBlank(bytes)) {
            noteHidden();
        }
        break;
    case RichTextDestination::FontTable:
        for (std::size_t end = bytes.find(';'); end != std::string_view::npos; end = bytes.find(';')) {
            putRawBytes(bytes.substr(0, end));
            flushBytes();
            fonts_.commit();
            bytes.remove_prefix(end + 1);
        }
        putRawBytes(bytes);
        break;
    case RichTextDestination::ColourTable:
        for (auto count = std::count(bytes.begin(), bytes.end(), ';'); count > 0; --count) {
            colours_.push_back(std::exchange(colour_, automaticColour));
        }
        break;
    case RichTextDestination::Ignored: break;
    }
}

/// Leaves out of a text what stands for the Unicode character before it.
std::string_view RichTextParser::withoutFallback(std::string_view bytes)
{
    while (fallback_ > 0 && !bytes.empty()) {
        --fallback_;
        bytes.remove_prefix(1);
        const auto continues = [](char byte) { return (static_cast<unsigned char>(byte) & 0xC0) == 0x80; };
        while (rawBytes_ == RichTextRawBytes::Utf8 && !bytes.empty() && continues(bytes.front())) {
            bytes.remove_prefix(1);
        }
    }
    return bytes;
}

void RichTextParser::readByte(char byte)
{
    if (fallback_ > 0) {
        --fallback_;
    } else if (state_.hasSignBytes && static_cast<unsigned char>(byte) < 0x80 &&
               state_.destination != RichTextDestination::FontTable)
    {
        putSigns(std::string_view(&byte, 1));
    } else if (!state_.codePage->isSingleByte()) {
        if (isShown() || state_.destination == RichTextDestination::FontTable) {
            bytes_.append(byte);
        } else {
            noteHidden();
        }
    } else {
        put(state_.codePage->character(byte));
    }
}

} // namespace kareport
