#pragma once

#include <string_view>

namespace kareport
{

/// What a control word asks for. "n" is the number behind the word, "value" the one in the table.
enum class RichTextAction
{
    // Text
    Insert, ///< the character `value`
    Unicode,
    FallbackCount,
    EndParagraph,
    Cell,
    Row,
    NestedRow,
    PageBreak,
    SectionBreak,
    SamePage,
    Style, ///< nothing: the words of its formats stand after it
    // Characters
    Plain,
    Font,
    FontSize,
    Toggle,    ///< the flags `value`
    Underline, ///< the style `value`
    VerticalAlignment,
    Foreground,
    Background,
    Highlight,
    // Paragraphs
    ParagraphDefaults,
    Align,
    Measure, ///< the measure `value`, n twips
    TabKind,
    TabStop,
    PageBreakBefore,
    Direction,
    Shading,
    // The whole file
    CodePage, ///< `value`
    AnsiCodePage,
    DefaultFont,
    // Font table, colour table
    FontCharset,
    FontCodePage,
    FontKind,
    Red,
    Green,
    Blue,
    // Destinations: what the rest of the group is
    FontTable,
    ColourTable,
    Shown,
    Skip,
    SkipCounted, ///< text of a person; the note `value`
    Picture,
    Object,
    ObjectResult,
    TwoForms, ///< one form of a text for old readers, and behind it one in Unicode
    UnicodeForm
};

enum RichTextNoteKind : int
{
    FootnoteNote,
    HeaderNote,
    ObjectNote
};

struct RichTextWord
{
    std::string_view name;
    RichTextAction action;
    int value = 0;
};

/// The control word of that name; null where it is not known or changes nothing.
const RichTextWord *findRichTextWord(std::string_view name);

/// Whether the word says what its group is.
inline bool isDestination(RichTextAction action)
{
    return action >= RichTextAction::FontTable;
}

} // namespace kareport
