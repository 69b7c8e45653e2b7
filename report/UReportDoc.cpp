#include "UReportDoc.h"

#include "ApplicationTitle.h"
#include "Clock.h"
#include "LeadingInteger.h"
#include "MemoryLasts.h"
#include "PageHeader.h"
#include "Preferences.h"
#include "Profile.h"
#include "ReportExit.h"
#include "ReportMargins.h"
#include "ReportWindow.h"
#include "UPreviewDlg.h"
#include "Xlate.h"

#include <utility>

namespace
{

const QString marginsEntry = QStringLiteral("Report Margins");
const QString printHashEntry = QStringLiteral("ReportPrintHash");

/// Lets the module's printer stand as reports are printed, for a moment.
class ReportOrientation
{
public:
    ReportOrientation() { UPreviewDlg::SetModulePrinterOrientationPortrait(IsReportPrinterSetToPortrait()); }
    ~ReportOrientation() { UPreviewDlg::SetModulePrinterOrientationPortrait(wasPortrait_); }
    ReportOrientation(const ReportOrientation &) = delete;
    ReportOrientation &operator=(const ReportOrientation &) = delete;

private:
    bool wasPortrait_ = UPreviewDlg::IsModulePrinterOrientationPortrait();
};

} // namespace

std::unordered_map<const UReportDoc *, bool> UReportDoc::UReportMgr;
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
    const QString printHash = GetProfileString(QString(), printHashEntry).trimmed();
    if (!printHash.isEmpty()) {
        printHash_ = kareport::leadingInteger(printHash) != 0;
    }
    chainageLabel_ = Xlate("Station");
    UReportMgr.emplace(this, true); // nothing after it can fail: what is entered is alive
}

UReportDoc::~UReportDoc()
{
    UReportMgr.erase(this);
    kareport::forgetExit(*this);
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
    bool isNew = true; // also a page whose header there is no memory for
    page_.losesNothing([&] { isNew = page_.newPage(linesNeeded); });
    return isNew;
}

void UReportDoc::WriteLine(const QString &text, int linesBefore, int linesAfter, int style)
{
    page_.losesNothing([&] { page_.writeLine(text, linesBefore, linesAfter, style); });
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
    page_.losesNothing([this] {
        page_.setHeaderLine(kareport::pageHeaderLine(GetApplicationTitle(), title_, kareport::currentTime(),
                                                     Xlate("   Page:@@Report Header"), geometry_.charsPerRow));
    });
}

void UReportDoc::WriteHeader()
{
    page_.losesNothing([this] { page_.writeHeader(); });
}

bool UReportDoc::textWritten(QStringView text, int style)
{
    const bool isTaken = kareport::whileMemoryLasts(false, [&] {
        // The window is told first: a host's window may look at the rich text, which then ends before the piece. It takes
        // nothing back, so a piece that the rich text has no memory for stays in the window alone.
        if (reportWindow_ != nullptr) {
            reportWindow_->WriteLine(text.toString());
        }
        return image_.write(text, style, imageForm());
    });
    if (isTaken) {
        SetModifiedFlag(true);
    }
    return isTaken;
}

bool UReportDoc::lineEnded()
{
    SetModifiedFlag(true);
    return image_.write({}, 0, imageForm());
}

void UReportDoc::changed()
{
    SetModifiedFlag(true);
}

int UReportDoc::SetPageSize()
{
    return kareport::whileMemoryLasts(0, [this] { return measurePage(); });
}

int UReportDoc::measurePage()
{
    const ReportOrientation orientation;
    const auto device = kareport::defaultPageDevice(UPreviewDlg::IsModulePrinterOrientationPortrait());
    if (!device) {
        return 0;
    }
    kareport::PageGeometry measured = geometry_;
    measured.pageSize = device->size;
    measured.resolution = static_cast<unsigned>(device->resolution);
    if (!IsPageFixed() || !fixedCharsPerRow_) {
        measured =
            kareport::measurePage(*device, margins_, kareport::measureFont(fontName_, fontSize_, device->resolution));
    }
    geometry_ = measured;
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
    // Without memory the settings stay as they are.
    kareport::doneWhileMemoryLasts([this] {
        const QString margins = GetProfileString(QString(), marginsEntry);
        if (margins.isEmpty()) {
            SaveSettings();
        } else {
            margins_ = kareport::marginsFromText(margins, margins_);
        }
        fontSize_ = GetReportFontSize();
    });
}

void UReportDoc::SaveSettings()
{
    kareport::doneWhileMemoryLasts(
        [this] { WriteProfileString(QString(), marginsEntry, kareport::marginsToText(margins_)); });
}
