#include "RichTextParser.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// Word processors go no further with measures (22 inches) and sizes; documents stay clear of overflow.
constexpr int mostTwips = 31680;
constexpr int mostHalfPoints = 3276;
constexpr qsizetype mostTabs = 64;

} // namespace

void RichTextParser::readWord(const RichTextToken &token, bool isStarred)
{
    const RichTextWord *word = findRichTextWord(token.text);
    // A writer that gives no characters for old readers means the next number, not to have it left out.
    if (fallback_ > 0 && (word == nullptr || word->action != RichTextAction::Unicode)) {
        --fallback_;
        return;
    }
    if (word == nullptr) {
        // The mark says that a reader that does not know the word skips the group. Before a word that is known and says nothing
        // of its group, as that of a character style, it means nothing.
        if (isStarred) {
            skipGroup(nullptr);
        }
        return;
    }
    switch (subjectOf(word->action)) {
    case RichTextSubject::Text: readTextWord(word->action, word->value, token); break;
    case RichTextSubject::Characters: readCharacterWord(word->action, word->value, token); break;
    case RichTextSubject::Paragraphs: readParagraphWord(word->action, word->value, token); break;
    case RichTextSubject::File: readFontWord(word->action, word->value, token); break;
    case RichTextSubject::Group: readDestination(*word); break;
    }
}

void RichTextParser::readSymbol(char symbol)
{
    if (fallback_ > 0) {
        --fallback_;
        return;
    }
    switch (symbol) {
    case '\\':
    case '{':
    case '}': putRawBytes(std::string_view(&symbol, 1)); break;
    case '~': put(QChar::Nbsp); break;
    case '-': put(QChar::SoftHyphen); break;
    case '_': put(0x2011); break;
    case '\t': put(u'\t'); break;
    case '\n': endParagraph(); break;
    case '*': isStarred_ = true; break;
    default: break;
    }
}

void RichTextParser::readTextWord(RichTextAction action, int value, const RichTextToken &token)
{
    switch (action) {
    case RichTextAction::Insert: put(static_cast<char16_t>(value)); break;
    case RichTextAction::Unicode: readUnicode(token.number); break;
    case RichTextAction::FallbackCount: state_.fallbackCount = token.hasNumber ? std::max(token.number, 0) : 1; break;
    case RichTextAction::EndParagraph: endParagraph(); break;
    case RichTextAction::Cell:
        if (isShown()) {
            if (cellEnded_) {
                beforeText();
            }
            cellEnded_ = true;
        }
        break;
    case RichTextAction::Row: endRow(false); break;
    case RichTextAction::NestedRow: endRow(true); break;
    case RichTextAction::PageBreak: breakPage(); break;
    case RichTextAction::SectionBreak: {
        const bool isPageEnd = pageBreak_;
        breakPage();
        sectionBreak_ = !isPageEnd;
        break;
    }
    case RichTextAction::SamePage:
        // Said of a section after its beginning.
        pageBreak_ = pageBreak_ && !sectionBreak_;
        break;
    default: break;
    }
}

int RichTextParser::colourAt(int index) const
{
    return index >= 0 && static_cast<std::size_t>(index) < colours_.size() ? colours_[static_cast<std::size_t>(index)]
                                                                           : automaticColour;
}

void RichTextParser::useFont(int font)
{
    if (state_.characters.font == font) {
        return;
    }
    state_.characters.font = font;
    state_.format = -1;
    static const RichTextFont none;
    const RichTextFont &used = font >= 0 ? fonts_[font] : none;
    state_.signs = used.signs;
    state_.hasSignBytes = used.hasSignBytes();
    const int page = state_.hasSignBytes ? symbolCodePage : used.codePage;
    state_.codePage = &codePages_.page(page != 0 ? page : fileCodePage_);
}

void RichTextParser::readCharacterWord(RichTextAction action, int value, const RichTextToken &token)
{
    RichTextCharacters &characters = state_.characters;
    const bool isOn = !token.hasNumber || token.number != 0;
    const auto set = [this](int &property, int to) {
        if (property != to) {
            property = to;
            state_.format = -1;
        }
    };
    switch (action) {
    case RichTextAction::Plain:
        useFont(fonts_.defaultFont());
        characters = {.font = characters.font};
        state_.format = -1;
        break;
    case RichTextAction::Font:
        if (state_.destination == RichTextDestination::FontTable) {
            fonts_.commit();
            fonts_.begin(token.number);
            state_.codePage = &codePages_.page(fileCodePage_);
        } else {
            useFont(fonts_.find(token.number));
        }
        break;
    case RichTextAction::FontSize:
        set(characters.halfPoints,
            token.number > 0 ? std::min(token.number, mostHalfPoints) : RichTextCharacters().halfPoints);
        break;
    case RichTextAction::Toggle:
        set(characters.flags, isOn ? characters.flags | value : characters.flags & ~value);
        break;
    case RichTextAction::Underline: set(characters.underline, isOn ? value : int(QTextCharFormat::NoUnderline)); break;
    case RichTextAction::VerticalAlignment:
        set(characters.verticalAlignment, isOn ? value : int(QTextCharFormat::AlignNormal));
        break;
    case RichTextAction::Foreground: set(characters.foreground, colourAt(token.number)); break;
    case RichTextAction::Background: set(characters.background, colourAt(token.number)); break;
    case RichTextAction::Highlight:
        set(characters.background, token.number != 0 ? colourAt(token.number) : automaticColour);
        break;
    default: break;
    }
}

void RichTextParser::readParagraphWord(RichTextAction action, int value, const RichTextToken &token)
{
    RichTextParagraph &paragraph = state_.paragraph;
    const int twips = std::clamp(token.number, -mostTwips, mostTwips);
    switch (action) {
    case RichTextAction::ParagraphDefaults:
        paragraph = {};
        state_.nextTab = QTextOption::LeftTab;
        break;
    case RichTextAction::Align: paragraph.alignment = value; break;
    case RichTextAction::Measure: paragraph.twips[static_cast<std::size_t>(value)] = twips; break;
    case RichTextAction::TabKind: state_.nextTab = static_cast<QTextOption::TabType>(value); break;
    case RichTextAction::TabStop:
        if (paragraph.tabs.size() < mostTabs) {
            paragraph.tabs.append({twips, state_.nextTab});
        }
        state_.nextTab = QTextOption::LeftTab;
        break;
    case RichTextAction::PageBreakBefore: paragraph.pageBreakBefore = !token.hasNumber || token.number != 0; break;
    case RichTextAction::Direction: paragraph.rightToLeft = value == Qt::RightToLeft; break;
    case RichTextAction::Shading: paragraph.shading = colourAt(token.number); break;
    default: break;
    }
}

void RichTextParser::readFontWord(RichTextAction action, int value, const RichTextToken &token)
{
    const auto setFileCodePage = [this](int number) {
        fileCodePage_ = number;
        state_.codePage = &codePages_.page(number);
    };
    const auto setComponent = [this](int shift, int component) {
        colour_ = colour_ == automaticColour ? 0 : colour_;
        colour_ = (colour_ & ~(0xFF << shift)) | (std::clamp(component, 0, 255) << shift);
    };
    const auto setFontCodePage = [this](int number) {
        if (state_.destination == RichTextDestination::FontTable) {
            fonts_.current().codePage = number;
            state_.codePage = &codePages_.page(number != 0 && number != symbolCodePage ? number : fileCodePage_);
        }
    };
    switch (action) {
    case RichTextAction::CodePage: setFileCodePage(value); break;
    case RichTextAction::AnsiCodePage: setFileCodePage(token.number); break;
    case RichTextAction::DefaultFont: fonts_.setDefaultNumber(token.number); break;
    case RichTextAction::FontCharset: setFontCodePage(codePageOfCharset(token.number)); break;
    case RichTextAction::FontCodePage: setFontCodePage(token.number); break;
    case RichTextAction::FontKind: fonts_.current().kind = static_cast<QFont::StyleHint>(value); break;
    case RichTextAction::Red: setComponent(16, token.number); break;
    case RichTextAction::Green: setComponent(8, token.number); break;
    case RichTextAction::Blue: setComponent(0, token.number); break;
    default: break;
    }
}

} // namespace kareport
