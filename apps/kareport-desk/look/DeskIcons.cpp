#include "DeskIcons.h"

#include "DeskCommandIds.h"
#include "LineIcon.h"
#include "PathDrawing.h"
#include "ReportResources.h"

#include <QPainter>

#include <algorithm>

namespace kareport
{

namespace
{

struct Drawing
{
    unsigned command;
    const char16_t *lines;  ///< in the colour of the text
    const char16_t *accent; ///< in the second colour; null for none
};

constexpr const char16_t *page = u"M3.5 1.5H9.5L12.5 4.5V14.5H3.5Z M9.5 1.5V4.5H12.5";
constexpr const char16_t *lens = u"M11 6.5Q11 11 6.5 11Q2 11 2 6.5Q2 2 6.5 2Q11 2 11 6.5Z M10 10L14 14";

constexpr Drawing drawings[] = {
    {fileNewCommand, page, nullptr},
    {fileOpenCommand, u"M1.5 13.5V3.5H6L7.5 5.5H13.5V7.5 M1.5 13.5L4 7.5H15L12.5 13.5Z", nullptr},
    {fileFromTemplateCommand, u"M1.5 2.5H14.5V13.5H1.5Z M1.5 5.5H14.5 M6.5 5.5V13.5",
     u"M8.5 8H12.5 M8.5 10.5H12.5 M3.5 8H4.5 M3.5 10.5H4.5"},
    {exportPdfCommand, u"M9.5 1.5H3.5V14.5H8 M9.5 1.5L12.5 4.5V7 M9.5 1.5V4.5H12.5",
     u"M8 10.5H14.5 M12 8L14.5 10.5L12 13"},
    {exportRichTextCommand, page, u"M5.5 7.5H10.5 M5.5 9.5H8.5"},
    {exportTextCommand, page, u"M5.5 7.5H10.5 M5.5 9.5H10.5 M5.5 11.5H10.5"},
    {fileExportCommand, u"M1.5 2.5H14.5V13.5H1.5Z M1.5 6H14.5 M1.5 9.75H14.5 M6 2.5V13.5 M10.25 2.5V13.5", nullptr},
    {printPreviewCommand, u"M8 14.5H3.5V1.5H9.5L12.5 4.5V6.5 M9.5 1.5V4.5H12.5",
     u"M13 10.5Q13 13 10.5 13Q8 13 8 10.5Q8 8 10.5 8Q13 8 13 10.5Z M12.5 12.5L15 15"},
    {pageSetupCommand, page, u"M5.5 4V12.5 M5.5 12.5H10.5"},
    {undoCommand, u"M3 6.5H10Q13.5 6.5 13.5 10Q13.5 13.5 10 13.5H6 M6 3.5L3 6.5L6 9.5", nullptr},
    {redoCommand, u"M13 6.5H6Q2.5 6.5 2.5 10Q2.5 13.5 6 13.5H10 M10 3.5L13 6.5L10 9.5", nullptr},
    {cutCommand, u"M5 2L10 10.5 M11 2L6 10.5",
     u"M6.5 12Q6.5 14 4.5 14Q2.5 14 2.5 12Q2.5 10 4.5 10Q6.5 10 6.5 12Z M13.5 12Q13.5 14 11.5 14Q9.5 14 9.5 12Q9.5 10 11.5 10Q13.5 10 13.5 12Z"},
    {copyCommand, u"M5.5 4.5H13.5V14.5H5.5Z M10.5 4.5V1.5H2.5V11.5H5.5", nullptr},
    {pasteCommand, u"M5.5 2.5H2.5V14.5H7.5 M10.5 2.5H13.5V5.5 M5.5 1.5H10.5V4.5H5.5Z", u"M7.5 7.5H13.5V14.5H7.5Z"},
    {findCommand, lens, nullptr},
    {findNextCommand, lens, u"M6.5 4.5V8.5 M4.5 6.5L6.5 8.5L8.5 6.5"},
    {findPreviousCommand, lens, u"M6.5 8.5V4.5 M4.5 6.5L6.5 4.5L8.5 6.5"},
    {goToPageCommand, page, u"M5 9.5H11 M8.5 7L11 9.5L8.5 12"},
    {zoomInCommand, lens, u"M4.5 6.5H8.5 M6.5 4.5V8.5"},
    {zoomOutCommand, lens, u"M4.5 6.5H8.5"},
    {zoomResetCommand, lens, u"M5.5 5.5L6.5 4.5V8.5"},
    {preferencesCommand, u"M1.5 4.5H7 M10 4.5H14.5 M1.5 11.5H5 M8 11.5H14.5", u"M7 3H10V6H7Z M5 10H8V13H5Z"},
    {commandListCommand, u"M1.5 2.5H14.5V13.5H1.5Z", u"M4 6L6.5 8L4 10 M8 10.5H12"},
    {keepReportWindowCommand, u"M6 1.5H10 M7 1.5V6L4.5 9.5H11.5L9 6V1.5 M8 9.5V14.5", nullptr},
    {helpContentsCommand, u"M14.5 8Q14.5 14.5 8 14.5Q1.5 14.5 1.5 8Q1.5 1.5 8 1.5Q14.5 1.5 14.5 8Z",
     u"M6 6Q6 4.25 8 4.25Q10 4.25 10 6Q10 7.25 8 8.25V9.5 M8 11.75V12"},
    {windowNewCommand, u"M1.5 4.5H11.5V13.5H1.5Z M1.5 6.5H11.5", u"M4 2.5H14.5V11"},
    {fileCloseCommand, u"M3.5 3.5L12.5 12.5 M12.5 3.5L3.5 12.5", nullptr},
};

} // namespace

QIcon deskIcon(unsigned command)
{
    if (command == fileSaveCommand) {
        return reportIcon(commandSaveReport);
    }
    if (command == filePrintCommand) {
        return reportIcon(commandPrintReport);
    }
    const auto *found = std::find_if(std::begin(drawings), std::end(drawings),
                                     [command](const Drawing &drawing) { return drawing.command == command; });
    if (found == std::end(drawings)) {
        return {};
    }
    const QPainterPath lines = pathOf(found->lines);
    const QPainterPath accented = found->accent != nullptr ? pathOf(found->accent) : QPainterPath();
    return lineIcon([lines, accented](QPainter &painter, const QColor &accent) {
        painter.drawPath(lines);
        painter.setPen(QPen(accent, iconLineWidth, Qt::SolidLine, Qt::RoundCap, Qt::MiterJoin));
        painter.drawPath(accented);
    });
}

} // namespace kareport
