#include "ReportContent.h"

#include "UReportDoc.h"

#include <QTextDocument>

namespace kareport
{

QFont reportFont(const QString &name, unsigned points)
{
    // Where the face is missing, the nearest fixed-pitch one has to stand in: the system would take a proportional one.
    QFont font(QStringList{name, QStringLiteral("DejaVu Sans Mono"), QStringLiteral("Liberation Mono")});
    font.setStyleHint(QFont::TypeWriter);
    font.setFixedPitch(true);
    if (points > 0) {
        font.setPointSize(static_cast<int>(points));
    }
    return font;
}

std::optional<RichTextError> showReportContent(const UReportDoc &report, QTextDocument &document, RichTextNotes *notes)
{
    document.setDefaultFont(reportFont(report.GetFontName(), report.GetFontSize()));
    QString text;
    if (report.GetRTFDataFlag()) {
        report.GetRTFData(text);
    } else {
        text = report.CopyText();
    }
    if (isRichText(text)) {
        if (report.IsOpenedFromRtf()) {
            // The bytes of the file, one to a character, each line with the line end that loading gave it.
            QByteArray bytes = text.toLatin1();
            return readRichText(bytes.replace("\n\r\n", "\n"), document, notes);
        }
        return readRichText(text, document, notes);
    }
    document.setPlainText(text);
    return std::nullopt;
}

} // namespace kareport
