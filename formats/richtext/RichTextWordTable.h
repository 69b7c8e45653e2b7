#pragma once

#include <string_view>

namespace kareport
{

/// What a control word asks for. "n" is the number after the word, "value" the one in the table.
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
    Style, ///< nothing: the words of its formats are after it
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
    TwoForms, ///< one form of a text for old readers, and after it one in Unicode
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

/// What a control word is about.
enum class RichTextSubject
{
    Text,
    Characters,
    Paragraphs,
    File, ///< the whole file, its font table or its colour table
    Group ///< what the rest of the group is
};

constexpr RichTextSubject subjectOf(RichTextAction action)
{
    // Without a default, so that the compiler names an action that was forgotten.
    switch (action) {
        using enum RichTextAction;
    case Insert:
    case Unicode:
    case FallbackCount:
    case EndParagraph:
    case Cell:
    case Row:
    case NestedRow:
    case PageBreak:
    case SectionBreak:
    case SamePage:
    case Style: return RichTextSubject::Text;
    case Plain:
    case Font:
    case FontSize:
    case Toggle:
    case Underline:
    case VerticalAlignment:
    case Foreground:
    case Background:
    case Highlight: return RichTextSubject::Characters;
    case ParagraphDefaults:
    case Align:
    case Measure:
    case TabKind:
    case TabStop:
    case PageBreakBefore:
    case Direction:
    case Shading: return RichTextSubject::Paragraphs;
    case CodePage:
    case AnsiCodePage:
    case DefaultFont:
    case FontCharset:
    case FontCodePage:
    case FontKind:
    case Red:
    case Green:
    case Blue: return RichTextSubject::File;
    case FontTable:
    case ColourTable:
    case Shown:
    case Skip:
    case SkipCounted:
    case Picture:
    case Object:
    case ObjectResult:
    case TwoForms:
    case UnicodeForm: break;
    }
    return RichTextSubject::Group;
}

} // namespace kareport
