#pragma once

#include "RichTextFonts.h"
#include "RichTextState.h"

#include <QTextFormat>

#include <unordered_map>
#include <vector>

namespace kareport
{

/// The formats of a document, each made once for all the places that ask for the same.
class RichTextFormats
{
public:
    explicit RichTextFormats(const RichTextFonts &fonts) : fonts_(&fonts) {}

    int character(const RichTextCharacters &characters);
    const QTextCharFormat &character(int format) const { return characterFormats_[static_cast<std::size_t>(format)]; }
    int paragraph(const RichTextParagraph &paragraph);
    const QTextBlockFormat &paragraph(int format) const { return paragraphFormats_[static_cast<std::size_t>(format)]; }

private:
    struct Hash
    {
        std::size_t operator()(const RichTextCharacters &characters) const;
        std::size_t operator()(const RichTextParagraph &paragraph) const;
    };

    QTextCharFormat make(const RichTextCharacters &characters) const;

    const RichTextFonts *fonts_;
    std::unordered_map<RichTextCharacters, int, Hash> characters_;
    std::unordered_map<RichTextParagraph, int, Hash> paragraphs_;
    std::vector<QTextCharFormat> characterFormats_;
    std::vector<QTextBlockFormat> paragraphFormats_;
};

} // namespace kareport
