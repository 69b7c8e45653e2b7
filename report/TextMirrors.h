#pragma once

#include "PageWriter.h"
#include "RichTextImage.h"

class UDocument;

namespace kareport
{

class ReportWindow;

/// What follows the text of a report while it is written: the document's modified flag, the rich-text image and the report
/// window.
class TextMirrors : public PageWriterObserver
{
public:
    /// The document must outlive this object.
    explicit TextMirrors(UDocument &document) : document_(document) {}

    RichTextImage image;
    RichTextImage::Form imageForm = RichTextImage::Form::RichText;
    ReportWindow *window = nullptr; ///< null for none

    bool takesText() const override { return image.isOn() || window != nullptr; }
    bool textWritten(QStringView text, int style) override;
    bool lineEnded() override;
    void changed() override;

private:
    UDocument &document_;
};

} // namespace kareport
