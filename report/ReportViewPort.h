#pragma once

#include "KaReportExport.h"

class QIODevice;

namespace kareport
{

/// What a report document needs of the views that show its text, and what marks them among all views that a host may give
/// a report document.
class KAREPORT_EXPORT ReportViewPort
{
public:
    virtual ~ReportViewPort();
    /// Writes what the view shows to an open device, as rich text. @return false as soon as a write fails
    virtual bool streamRichText(QIODevice &device) const = 0;
    /// The same as plain text of one byte a character. @return false as soon as a write fails
    virtual bool streamPlainText(QIODevice &device) const = 0;
};

} // namespace kareport
