#pragma once

#include "RichTextReader.h"

#include <QFont>

#include <optional>

class QTextDocument;
class UReportDoc;

namespace kareport
{

/// The fixed-pitch font that a report is shown in.
QFont reportFont(const QString &name, unsigned points);
/// The font of a report's view: its face by the 31 characters that the name of a face has at most.
QFont reportFont(const UReportDoc &report);

/// The text that a view shows of a report: its rich text in rich-text mode, else its own. Nothing when there is no memory for
/// a copy.
std::optional<QString> shownText(const UReportDoc &report);

/// The characters that a view shows of a report, its lines ended by CR LF: of rich text those of the document. Empty when
/// there is no memory for them.
QString shownPlainText(const UReportDoc &report);

/// Reads the shown text of a report that is rich text into a document. What was loaded from a file is read as the bytes that
/// it is.
/// @param text  as `shownText` gives it; it begins as rich text does
/// @return what is wrong with it; the document then holds what was read up to there
std::optional<RichTextError> readShownRichText(const UReportDoc &report, const QString &text, QTextDocument &document,
                                               RichTextNotes *notes = nullptr);

/// Puts what a report holds into a text document, as its view shows it: the rich text of a report in rich-text mode or of
/// a text that begins as rich text does, else the plain text in the report's font.
/// @param notes  receives what rich text is not shown; may be null
/// @return what is wrong with the rich text; the document then holds what was read up to there
std::optional<RichTextError> showReportContent(const UReportDoc &report, QTextDocument &document,
                                               RichTextNotes *notes = nullptr);

} // namespace kareport
