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

/// Takes what is read of a rich text, paragraph by paragraph.
class RichTextTarget
{
public:
    virtual ~RichTextTarget() = default;

    /// Whether it needs the formats. Otherwise any number does for one.
    virtual bool takesFormats() const = 0;
    /// Adds text to the paragraph; it holds no characters that part paragraphs.
    virtual void append(QLatin1StringView text, int format) = 0;
    virtual void append(char16_t character, int format) = 0;
    virtual bool isParagraphEmpty() const = 0;
    /// Ends the paragraph.
    /// @param format  of the paragraph's characters where it has none
    virtual void endParagraph(const RichTextParagraph &paragraph, int format) = 0;
};

/// Collects the characters alone, paragraphs separated by U+2029.
class RichTextCollector final : public RichTextTarget
{
public:
    explicit RichTextCollector(QString &text) : text_(text) { text_.clear(); }

    bool takesFormats() const override { return false; }
    void append(QLatin1StringView text, int /*format*/) override { paragraph_.append(text); }
    void append(char16_t character, int /*format*/) override { paragraph_.append(QChar(character)); }
    bool isParagraphEmpty() const override { return paragraph_.isEmpty(); }
    void endParagraph(const RichTextParagraph & /*paragraph*/, int /*format*/) override
    {
        if (!isFirst_) {
            text_.append(QChar(QChar::ParagraphSeparator));
        }
        isFirst_ = false;
        text_.append(paragraph_);
        paragraph_.resize(0); // not clear(), which would release the memory
    }

private:
    QString &text_;
    QString paragraph_;
    bool isFirst_ = true;
};

/// Fills a document; all is there when the builder is destroyed. Texts and paragraphs of the same formats are inserted
/// together, as each insertion takes time of its own.
class RichTextBuilder final : public RichTextTarget
{
public:
    RichTextBuilder(QTextDocument &document, RichTextFormats &formats);
    ~RichTextBuilder() override;
    RichTextBuilder(const RichTextBuilder &) = delete;
    RichTextBuilder &operator=(const RichTextBuilder &) = delete;

    bool takesFormats() const override { return true; }
    void append(QLatin1StringView text, int format) override
    {
        paragraph_.append(text);
        setFormat(format);
    }
    void append(char16_t character, int format) override
    {
        paragraph_.append(QChar(character));
        setFormat(format);
    }
    bool isParagraphEmpty() const override { return paragraph_.isEmpty(); }
    void endParagraph(const RichTextParagraph &paragraph, int format) override;

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
