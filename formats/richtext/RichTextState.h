#pragma once

#include "RichTextCodePage.h"
#include "RichTextSigns.h"

#include <QList>
#include <QTextFormat>
#include <QTextOption>

#include <array>
#include <cstddef>

namespace kareport
{

enum RichTextFlag : int
{
    BoldFlag = 1,
    ItalicFlag = 2,
    StrikeFlag = 4,
    CapitalsFlag = 8,
    SmallCapitalsFlag = 16,
    HiddenFlag = 32
};

/// No colour is given: that of the reader.
constexpr int automaticColour = -1;

struct RichTextCharacters
{
    int font = -1;       ///< in the font table; -1: none is known
    int halfPoints = 24; ///< what holds where no size is given
    int foreground = automaticColour;
    int background = automaticColour;
    int flags = 0;
    int underline = QTextCharFormat::NoUnderline;
    int verticalAlignment = QTextCharFormat::AlignNormal;

    bool operator==(const RichTextCharacters &) const = default;
};

enum RichTextMeasure : int
{
    LeftIndent,
    RightIndent,
    FirstLineIndent,
    SpaceBefore,
    SpaceAfter,
    LineSpacing,
    LineSpacingIsMultiple,
    measureCount
};

struct RichTextTab
{
    int twips = 0; ///< from the margin of the page
    QTextOption::TabType kind = QTextOption::LeftTab;

    bool operator==(const RichTextTab &) const = default;
};

struct RichTextParagraph
{
    std::array<int, measureCount> twips{};
    int alignment = 0; ///< a Qt::AlignmentFlag; 0: as the text runs
    int shading = automaticColour;
    bool pageBreakBefore = false;
    bool rightToLeft = false;
    QList<RichTextTab> tabs;

    bool operator==(const RichTextParagraph &) const = default;
};

enum class RichTextDestination
{
    Body,
    FontTable,
    ColourTable,
    Ignored
};

/// What a group inherits, and what its end restores.
struct RichTextState
{
    RichTextCharacters characters;
    int format = -1; ///< of the characters, once it is needed
    RichTextParagraph paragraph;
    QTextOption::TabType nextTab = QTextOption::LeftTab;
    RichTextCodePage *codePage = nullptr;
    const RichTextSigns *signs = nullptr; ///< of the font, where they are known
    bool hasSignBytes = false;            ///< bytes are numbers of signs
    int fallbackCount = 1;
    RichTextDestination destination = RichTextDestination::Body;
    /// What holds again in the part of an ignored group that is to be read.
    RichTextDestination outer = RichTextDestination::Body;
};

} // namespace kareport
