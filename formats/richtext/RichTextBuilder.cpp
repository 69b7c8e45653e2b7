#include "RichTextBuilder.h"

#include <QTextDocument>

namespace kareport
{

namespace
{

constexpr qsizetype longestPending = qsizetype(64) * 1024;

} // namespace

RichTextBuilder::RichTextBuilder(QTextDocument &document, RichTextFormats &formats)
    : formats_(&formats), wasUndoEnabled_(document.isUndoRedoEnabled())
{
    document.setUndoRedoEnabled(false);
    document.clear();
    cursor_ = QTextCursor(&document);
    cursor_.beginEditBlock();
}

RichTextBuilder::~RichTextBuilder()
{
    flush();
    cursor_.endEditBlock();
    cursor_.document()->setUndoRedoEnabled(wasUndoEnabled_);
    cursor_.document()->setModified(false);
}

void RichTextBuilder::endParagraph(const RichTextParagraph &paragraph, int format)
{
    startBlock(paragraph, runs_.empty() ? format : runs_.front().format);
    qsizetype begin = 0;
    for (const Run &run : runs_) {
        insert(QStringView(paragraph_).sliced(begin, run.end - begin), run.format);
        begin = run.end;
    }
    // Not clear(), which would release the memory.
    paragraph_.resize(0);
    runs_.clear();
}

void RichTextBuilder::startBlock(const RichTextParagraph &paragraph, int format)
{
    const bool isFirst = blockFormat_ < 0;
    if (isFirst || paragraph != lastParagraph_) {
        const int blockFormat = formats_->paragraph(paragraph);
        lastParagraph_ = paragraph;
        if (blockFormat != blockFormat_) {
            blockFormat_ = blockFormat;
            flush();
            if (isFirst) {
                cursor_.setBlockFormat(formats_->paragraph(blockFormat));
                cursor_.setBlockCharFormat(formats_->character(format));
            } else {
                cursor_.insertBlock(formats_->paragraph(blockFormat), formats_->character(format));
            }
            return;
        }
    }
    const QChar separator(QChar::ParagraphSeparator);
    insert(QStringView(&separator, 1), format);
}

void RichTextBuilder::insert(QStringView text, int format)
{
    if (format != pendingFormat_ || pending_.size() > longestPending) {
        flush();
        pendingFormat_ = format;
    }
    pending_.append(text);
}

void RichTextBuilder::flush()
{
    if (!pending_.isEmpty()) {
        cursor_.insertText(pending_, formats_->character(pendingFormat_));
        pending_.resize(0);
    }
}

} // namespace kareport
