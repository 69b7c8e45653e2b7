#pragma once

#include <QString>
#include <QStringView>

#include <optional>

class UDocument;

namespace kareport
{

/// The profile entry of the folder that a report was opened from or saved in last.
inline const QString lastReportFolder = QStringLiteral("LastOpenDirectoryReport");

/// Whether a file name ends with an extension (".rtf", in small letters), in any case. The first occurrence of the
/// extension decides: a name that holds it earlier as well does not count as ending with it.
bool endsWithExtension(QStringView name, QStringView extension);
/// Whether a report is saved as rich text under a name, or as a PDF; otherwise it is saved as report text.
bool isRichTextName(QStringView name);
bool isPdfName(QStringView name);
/// Asks for the name of a file to save a report in, beginning with the folder used last, and keeps its folder.
/// @param richTextFirst  offers rich text before report text
/// @return nothing when the user has cancelled
std::optional<QString> askReportName(UDocument &document, bool richTextFirst);
/// Says in a message that a report could not be saved, and why, for a host that wants it. @param reason  empty when it is not known: what to do is said then
void sayNotSaved(const QString &path, const QString &reason);

/// Why a report that has lost text is not saved, as the end of a sentence: half of a report would replace a whole one.
QString lostTextReason();
/// Why an empty report becomes no PDF, as the end of a sentence.
QString emptyPdfReason();

} // namespace kareport
