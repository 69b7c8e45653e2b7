#pragma once

#include "RichTextFormats.h"

#include <QLatin1StringView>
#include <QString>
#include <QStringView>
#include <QTextCursor>

#include <vector>

class QTextDocument;

namespace kareport
{

/// Fills a document paragraph by paragraph; all is there when the builder goes. Texts and paragraphs of the same formats are inserted together, as each
/// insertion has its cost.
class RichTextBuilder
{
public:
    RichTextBuilder(QTextDocument &document, RichTextFormats &formats);
    ~RichTextBuilder();
    RichTextBuilder(const RichTextBuilder &) = delete;
    RichTextBuilder &operator=(const RichTextBuilder &) = delete;

    /// Adds text to the paragraph; it holds no characters that part paragraphs.
    void append(QLatin1StringView text, int format)
    {
        paragraph_.append(text);
        setFormat(format);
    }
    void append(char16_t character, int format)
    {
        paragraph_.append(QChar(character));
        setFormat(format);
    }
    bool isParagraphEmpty() const { return paragraph_.isEmpty(); }
    /// Ends the paragraph.
    /// @param format  of the paragraph's characters where it has none
    void endParagraph(const RichTextParagraph &paragraph, int format);

private:
    struct Run
    {
        qsizetype end;
        int format;
    };

    void setFormat(int format)
    {
        if (!runs_.empty() && runs_.back().format == format) {
            runs_.back().end = paragraph_.size();
        } else {
            runs_.push_back({paragraph_.size(), format});
        }
    }
    void startBlock(const RichTextParagraph &paragraph, int format);
    void insert(QStringView text, int format);
    void flush();

    RichTextFormats *formats_;
    QTextCursor cursor_;
    bool wasUndoEnabled_;

    QString paragraph_;
    std::vector<Run> runs_;

    QString pending_; ///< not inserted yet, all of one format
    int pendingFormat_ = -1;

    RichTextParagraph lastParagraph_;
    int blockFormat_ = -1; ///< of the last block; -1: no block was begun
};

} // namespace kareport
