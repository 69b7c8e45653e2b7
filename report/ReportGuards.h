#pragma once

#include "UReportDoc.h"
#include "ValueGuard.h"

namespace kareport
{

// Settings of a report that are changed for a moment. What is done meanwhile may close the report.

/// Keeps a report from the user's editor: updates reach its views alone.
inline auto withoutEditor(UReportDoc &report)
{
    return ValueGuard(report.GetExternalEditorFlag(), false, [&report](bool on) {
        if (UReportDoc::IsReportAvailable(&report)) {
            report.SetExternalEditorFlag(on);
        }
    });
}

/// Keeps page headers out of what is written.
inline auto withoutHeader(UReportDoc &report)
{
    return ValueGuard(report.GetHeaderFlag(), false, [&report](bool on) {
        if (UReportDoc::IsReportAvailable(&report)) {
            report.SetHeaderFlag(on);
        }
    });
}

/// Shows a report as it was written, and not its rich-text image.
inline auto withoutRichTextMode(UReportDoc &report)
{
    return ValueGuard(report.GetRTFDataFlag(), false, [&report](bool on) {
        if (UReportDoc::IsReportAvailable(&report)) {
            report.SetRTFDataFlag(on);
        }
    });
}

} // namespace kareport
