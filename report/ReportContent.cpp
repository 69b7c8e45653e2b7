#include "ReportContent.h"

#include "FixedPitchFont.h"
#include "LineEndings.h"
#include "UReportDoc.h"

#include <QTextDocument>

#include <utility>

namespace kareport
{

QFont reportFont(const QString &name, unsigned points)
{
    QFont font = fixedPitchFont(name);
    if (points > 0) {
        font.setPointSize(static_cast<int>(points));
    }
    return font;
}

QFont reportFont(const UReportDoc &report)
{
    return reportFont(report.GetFontName().left(longestFaceName), report.GetFontSize());
}

std::optional<QString> shownText(const UReportDoc &report)
{
    QString text;
    if (report.GetRTFDataFlag()) {
        report.GetRTFData(text);
    } else {
        text = report.CopyText();
    }
    return text.isNull() ? std::nullopt : std::optional(std::move(text));
}

QString shownPlainText(const UReportDoc &report)
{
    QTextDocument document;
    showReportContent(report, document);
    return withCrLf(document.toPlainText());
}

std::optional<RichTextError> readShownRichText(const UReportDoc &report, const QString &text, QTextDocument &document,
                                               RichTextNotes *notes)
{
    if (report.IsOpenedFromRtf() && !report.GetRTFDataFlag()) {
        // The bytes of the file, one to a character, each line with the line end that loading gave it.
        QByteArray bytes = text.toLatin1();
        return readRichText(bytes.replace("\n\r\n", "\n"), document, notes);
    }
    return readRichText(text, document, notes);
}

std::optional<RichTextError> showReportContent(const UReportDoc &report, QTextDocument &document, RichTextNotes *notes)
{
    document.setDefaultFont(reportFont(report));
    const QString text = shownText(report).value_or(QString());
    if (isRichText(text)) {
        return readShownRichText(report, text, document, notes);
    }
    document.setPlainText(text);
    return std::nullopt;
}

} // namespace kareport
