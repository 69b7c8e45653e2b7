#include "UReportDoc.h"

#include "MemoryLasts.h"
#include "PageHeader.h"
#include "ReportContent.h"
#include "ReportPages.h"
#include "ReportParts.h"
#include "RichTextReader.h"

#include <algorithm>
#include <utility>

int UReportDoc::SetPageSize()
{
    if (!kareport::whileMemoryLasts(false, [this] { return parts_->layout.measure(parts_->pageDevice()); })) {
        return 0;
    }
    parts_->page.setLinesPerPage(GetLinesPerPage());
    return 1;
}

void UReportDoc::FixPage(std::optional<int> linesPerPage, std::optional<int> charsPerRow)
{
    parts_->layout.give(linesPerPage, charsPerRow);
    parts_->page.setLinesPerPage(GetLinesPerPage());
}

bool UReportDoc::IsPageFixed() const
{
    return parts_->layout.isGiven();
}

void UReportDoc::UseGivenPage(bool on)
{
    parts_->layout.useGiven(on);
    parts_->page.setLinesPerPage(GetLinesPerPage());
}

std::optional<int> UReportDoc::GetGivenLinesPerPage() const
{
    return parts_->layout.givenLinesPerPage();
}

bool UReportDoc::HoldsRichTextSource() const
{
    return !GetRTFDataFlag() && parts_->page.text().visit([](auto text) { return kareport::isRichText(text); });
}

std::vector<kareport::ReportPage> UReportDoc::GetPages() const
{
    return kareport::whileMemoryLasts(std::vector<kareport::ReportPage>(), [this] {
        if (HoldsRichTextSource()) {
            const QString shown = kareport::shownPlainText(*this);
            return kareport::reportPages(QStringView(shown), kareport::pageHeadersIn(shown), GetLinesPerPage());
        }
        return parts_->page.text().visit(
            [this](auto text) { return kareport::reportPages(text, GetPageStarts(), GetLinesPerPage()); });
    });
}

const std::vector<qint64> &UReportDoc::GetPageStarts() const
{
    return parts_->page.pageStarts().positions();
}

void UReportDoc::SetPageStarts(std::vector<qint64> starts)
{
    parts_->page.setPageStarts(std::move(starts));
}

std::vector<qint64> UReportDoc::GetPageStartLines() const
{
    return kareport::whileMemoryLasts(std::vector<qint64>(), [this] {
        return parts_->page.text().visit([this](auto text) { return kareport::linesOfStarts(text, GetPageStarts()); });
    });
}

bool UReportDoc::FindPageStarts(qint64 from)
{
    if (from < 0 || from >= GetTextLength() || HoldsRichTextSource()) {
        return false; // the lines of a source are not those that it shows
    }
    bool areFound = false;
    const bool isLooked = kareport::doneWhileMemoryLasts([&] {
        const std::vector<qint64> found =
            parts_->page.text().visit([from](auto text) { return kareport::pageHeadersIn(text.sliced(from)); });
        if (found.empty()) {
            return;
        }
        std::vector<qint64> starts = GetPageStarts();
        starts.erase(std::lower_bound(starts.begin(), starts.end(), from), starts.end());
        for (const qint64 header : found) {
            starts.push_back(from + header);
        }
        SetPageStarts(std::move(starts));
        areFound = true;
    });
    if (!isLooked) {
        parts_->page.noteLostText(); // the text is whole, its pages are not
    }
    return areFound;
}

int UReportDoc::GetLinesPerPage() const
{
    return parts_->layout.geometry().linesPerPage;
}

int UReportDoc::GetCharsPerRow() const
{
    return parts_->layout.geometry().charsPerRow;
}

unsigned UReportDoc::GetPrintResolution() const
{
    return parts_->layout.geometry().resolution;
}

QSize UReportDoc::GetPageSize() const
{
    return parts_->layout.geometry().pageSize;
}

unsigned UReportDoc::GetFontSize() const
{
    return parts_->layout.fontSize;
}

void UReportDoc::SetFontSize(unsigned points)
{
    parts_->layout.fontSize = points;
}

QString UReportDoc::GetFontName() const
{
    return parts_->layout.fontName;
}

void UReportDoc::SetFontName(const QString &name)
{
    parts_->layout.fontName = name;
}

QMargins UReportDoc::GetMargins() const
{
    return parts_->layout.margins;
}

void UReportDoc::SetMargins(const QMargins &margins)
{
    parts_->layout.margins = margins;
}

void UReportDoc::LoadSettings()
{
    // Without memory the settings stay as they are.
    kareport::doneWhileMemoryLasts([this] { parts_->layout.load(); });
}

void UReportDoc::SaveSettings()
{
    kareport::doneWhileMemoryLasts([this] { parts_->layout.save(); });
}
