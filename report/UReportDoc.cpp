#include "UReportDoc.h"

#include "ApplicationTitle.h"
#include "Clock.h"
#include "PageHeader.h"
#include "Preferences.h"
#include "Profile.h"
#include "ReportMargins.h"
#include "ReportWindow.h"
#include "TemplateText.h"
#include "UPreviewDlg.h"
#include "Xlate.h"

#include <utility>

namespace
{

const QString marginsEntry = QStringLiteral("Report Margins");
const QString printHashEntry = QStringLiteral("ReportPrintHash");

} // namespace

QHash<const UReportDoc *, bool> UReportDoc::UReportMgr;
bool UReportDoc::printHash_ = false;

UReportDoc::UReportDoc() : UReportDoc(QString(), false, false, nullptr) {}

UReportDoc::UReportDoc(const QString &name, bool externalEditor, bool closeDocument, UDocument *owner)
    : owner_(owner), page_(this), externalEditor_(externalEditor), closeDocument_(closeDocument)
{
    if (!name.isNull()) {
        title_ = name;
        reportFileName_ = name;
    }
    SetHeader();
    LoadSettings();
    UReportMgr.insert(this, true);
    const QString printHash = GetProfileString(QString(), printHashEntry).trimmed();
    if (!printHash.isEmpty()) {
        printHash_ = kareport::leadingInteger(printHash) != 0;
    }
    chainageLabel_ = Xlate("Station");
}

UReportDoc::~UReportDoc()
{
    UReportMgr.remove(this);
    delete std::exchange(reportWindow_, nullptr);
}

bool UReportDoc::IsReportAvailable(const UReportDoc *report)
{
    return UReportMgr.contains(report);
}

void UReportDoc::SetData(const QString &text)
{
    ++editCount_;
    page_.setPageStarts({});
    if (!page_.text().assign(text)) {
        page_.noteLostText();
    }
    FindPageStarts();
}

void UReportDoc::Clear()
{
    ++editCount_;
    page_.clear();
    image_.clear();
    openedFromRtf_ = false;
}

int UReportDoc::CheckSize(int required)
{
    return page_.text().reserve(required) ? 1 : 0;
}

bool UReportDoc::Write(const QString &text, int style)
{
    return page_.write(text, style);
}

void UReportDoc::LineFeed(int count)
{
    page_.lineFeed(count);
}

bool UReportDoc::NewPage(int linesNeeded)
{
    return page_.newPage(linesNeeded);
}

void UReportDoc::WriteLine(const QString &text, int linesBefore, int linesAfter, int style)
{
    page_.writeLine(text, linesBefore, linesAfter, style);
}

void UReportDoc::SetHeading(const QString &heading, int linesBefore, int linesAfter)
{
    page_.setHeading({heading, linesBefore, linesAfter});
}

void UReportDoc::WriteHeading()
{
    page_.writeHeading();
}

void UReportDoc::SetHeader()
{
    page_.setHeaderLine(kareport::pageHeaderLine(GetApplicationTitle(), title_, kareport::currentTime(),
                                                 Xlate("   Page:@@Report Header"), geometry_.charsPerRow));
}

void UReportDoc::WriteHeader()
{
    page_.writeHeader();
}

void UReportDoc::textWritten(QStringView text, int style)
{
    SetModifiedFlag(true);
    image_.write(text, style, imageForm());
    if (reportWindow_ != nullptr) {
        reportWindow_->WriteLine(text.toString());
    }
}

void UReportDoc::lineEnded()
{
    SetModifiedFlag(true);
    image_.write({}, 0, imageForm());
}

void UReportDoc::changed()
{
    SetModifiedFlag(true);
}

int UReportDoc::SetPageSize()
{
    const bool wasPortrait = UPreviewDlg::IsModulePrinterOrientationPortrait();
    UPreviewDlg::SetModulePrinterOrientationPortrait(IsReportPrinterSetToPortrait());
    const auto device = kareport::defaultPageDevice(UPreviewDlg::IsModulePrinterOrientationPortrait());
    UPreviewDlg::SetModulePrinterOrientationPortrait(wasPortrait);
    if (!device) {
        return 0;
    }
    geometry_.pageSize = device->size;
    geometry_.resolution = static_cast<unsigned>(device->resolution);
    if (!IsPageFixed() || !fixedCharsPerRow_) {
        geometry_ =
            kareport::measurePage(*device, margins_, kareport::measureFont(fontName_, fontSize_, device->resolution));
    }
    applyGivenPage();
    return 1;
}

void UReportDoc::FixPage(std::optional<int> linesPerPage, std::optional<int> charsPerRow)
{
    fixedLinesPerPage_ = linesPerPage;
    fixedCharsPerRow_ = charsPerRow;
    UseGivenPage(true);
}

void UReportDoc::UseGivenPage(bool on)
{
    usesGivenPage_ = on;
    applyGivenPage();
}

void UReportDoc::applyGivenPage()
{
    if (IsPageFixed()) {
        geometry_.linesPerPage = *fixedLinesPerPage_;
    }
    geometry_.charsPerRow = fixedCharsPerRow_.value_or(geometry_.charsPerRow);
    page_.setLinesPerPage(geometry_.linesPerPage);
}

void UReportDoc::LoadSettings()
{
    const QString margins = GetProfileString(QString(), marginsEntry);
    if (margins.isEmpty()) {
        SaveSettings();
    } else {
        margins_ = kareport::marginsFromText(margins, margins_);
    }
    fontSize_ = GetReportFontSize();
}

void UReportDoc::SaveSettings()
{
    WriteProfileString(QString(), marginsEntry, kareport::marginsToText(margins_));
}
