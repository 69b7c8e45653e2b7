#pragma once

#include "KaReportExport.h"
#include "RichTextReader.h"

#include <QFont>

#include <optional>

class QTextDocument;
class UReportDoc;

namespace kareport
{

/// The fixed-pitch font that a report is shown in.
KAREPORT_EXPORT QFont reportFont(const QString &name, unsigned points);

/// Puts what a report holds into a text document, as its view shows it: the rich text of a report in rich-text mode or of
/// a text that begins as rich text does, else the plain text in the report's font.
/// @param notes  receives what rich text is not shown; may be null
/// @return what is wrong with the rich text; the document then holds what was read up to there
KAREPORT_EXPORT std::optional<RichTextError> showReportContent(const UReportDoc &report, QTextDocument &document,
                                                               RichTextNotes *notes = nullptr);

} // namespace kareport
