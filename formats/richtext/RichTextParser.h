#pragma once

#include "RichTextBuilder.h"
#include "RichTextCodePage.h"
#include "RichTextFonts.h"
#include "RichTextFormats.h"
#include "RichTextReader.h"
#include "RichTextState.h"
#include "RichTextTokens.h"
#include "RichTextWordTable.h"

#include <QByteArray>

#include <cstddef>
#include <memory>
#include <string_view>
#include <vector>

class QTextDocument;

namespace kareport
{

/// How bytes from 0x80 on are read that are in a rich text without an escape.
enum class RichTextRawBytes
{
    CodePage,
    Utf8
};

/// Reads a rich text into a document, or its characters alone.
class RichTextParser
{
public:
    RichTextParser(QByteArrayView bytes, RichTextRawBytes rawBytes, QTextDocument &document);
    /// Reads the characters alone.
    RichTextParser(QByteArrayView bytes, RichTextRawBytes rawBytes, QString &text);

    /// Reads to the end of the outermost group. @return what was expected where it could not; empty where all was read
    QString read();
    /// Where reading ended.
    qsizetype position() const { return tokens_.position(); }
    const RichTextNotes &notes() const { return notes_; }

private:
    // Groups
    QString openGroup();
    bool closeGroup();
    void skipGroup(int *note);
    void readDestination(const RichTextWord &word);
    void noteSkipped(const RichTextToken &token);

    // Words
    void readWord(const RichTextToken &token, bool isStarred);
    void readSymbol(char symbol);
    void readFontWord(RichTextAction action, int value, const RichTextToken &token);
    void readCharacterWord(RichTextAction action, int value, const RichTextToken &token);
    void readParagraphWord(RichTextAction action, int value, const RichTextToken &token);
    void readTextWord(RichTextAction action, int value, const RichTextToken &token);
    int colourAt(int index) const;
    void useFont(int font);

    // Text
    void readText(std::string_view bytes);
    void readByte(char byte);
    void readUnicode(int number);
    std::string_view withoutFallback(std::string_view bytes);
    void flushBytes();
    void put(char16_t character);
    void putSign(char16_t character);
    void putSigns(std::string_view bytes);
    void putText(QStringView text);
    void putAscii(std::string_view bytes);
    void putRawBytes(std::string_view bytes);
    void beforeText();
    void noteHidden();
    int format();
    void endParagraph();
    void endRow(bool isNested);
    void breakPage();

    std::size_t openGroups() const
    {
        // The group that is skipped is among the open ones as well.
        return outer_.size() + static_cast<std::size_t>(skipDepth_ > 0 ? skipDepth_ - 1 : 0);
    }
    bool isHidden() const { return (state_.characters.flags & HiddenFlag) != 0; }
    bool isShown() const { return state_.destination == RichTextDestination::Body && !isHidden(); }

    RichTextTokens tokens_;
    RichTextRawBytes rawBytes_;
    RichTextNotes notes_;
    RichTextCodePages codePages_;
    RichTextFonts fonts_;
    RichTextFormats formats_;
    std::vector<int> colours_;
    int colour_ = automaticColour; ///< that is being read
    int fileCodePage_ = 1252;

    RichTextState state_;
    std::vector<RichTextState> outer_; ///< what the ends of the open groups restore
    int skipDepth_ = 0;                ///< groups open in one that is skipped, with it
    int *skipNote_ = nullptr;          ///< counts one as soon as the group that is skipped has text
    bool isStarred_ = false;           ///< the next word is one of those that not every reader knows
    int fallback_ = 0;                 ///< characters to leave out, which stand for one in Unicode
    QByteArray bytes_;                 ///< of characters that may have several bytes
    bool cellEnded_ = false;           ///< a tab comes here if more follows in the row
    bool nestedRowEnded_ = false;
    bool hiddenCounted_ = false; ///< the hidden text that is being skipped
    bool pageBreak_ = false;     ///< before the next paragraph
    bool sectionBreak_ = false;
    std::unique_ptr<RichTextTarget> target_;
};

} // namespace kareport
