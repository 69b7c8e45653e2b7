#include "KeptReport.h"

#include "MemoryLasts.h"
#include "RecoveryFolder.h"
#include "ReportAccess.h"
#include "ReportEntry.h"
#include "ReportPages.h"
#include "ReportSaveName.h"
#include "SavedReports.h"
#include "TextFile.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

namespace
{

void fixPage(UReportDoc &report, const KeptReport &kept)
{
    if (kept.linesPerPage > 0) {
        report.FixPage(kept.linesPerPage, std::nullopt);
    }
}

/// A text that a program kept.
TextFile readText(const KeptReport &kept)
{
    if (!kept.holdsText()) {
        return {TextFile::State::NotRead, nullptr, Xlate("its saved copy no longer exists")};
    }
    return readTextFile(kept.textFile, UserInput::Taken,
                        [lines = kept.pageLines](QByteArrayView bytes, LoadedText &loaded, const auto &proceed) {
                            const TextLoading answer = loadPlainText(bytes, loaded, proceed);
                            if (answer == TextLoading::Whole && !lines.empty()) {
                                loaded.pageStarts =
                                    loaded.text.visit([&lines](auto text) { return startsOfLines(text, lines); });
                            }
                            return answer;
                        });
}

/// Gives a report the text that was kept of it. @return whether it has all of it
bool fill(UReportDoc &report, const KeptReport &kept, LoadedText &text)
{
    ReportAccess::takeText(report, text);
    fixPage(report, kept);
    if (!kept.path.isEmpty() && !isPdfName(kept.path)) {
        report.SetPathName(kept.path, false);
    }
    report.UpdateAllViews(nullptr, 0, nullptr);
    report.SetModifiedFlag(true);
    return !report.HasLostText();
}

} // namespace

QString KeptReport::name() const
{
    if (!title.isEmpty()) {
        return title;
    }
    return path.isEmpty() ? Xlate("Untitled") : path;
}

bool KeptReport::holdsText() const
{
    return !textFile.isEmpty() && RecoveryFolder(QFileInfo(textFile).path()).holdsText(textFile);
}

UReportDoc *reopenReport(const KeptReport &kept, ReadNotes *notes)
{
    if (kept.textFile.isEmpty()) {
        UReportDoc *saved = openSavedReport(kept.path, notes);
        if (saved != nullptr && !saved->IsPageFixed()) {
            fixPage(*saved, kept);
        }
        return saved;
    }
    UReportDoc *report = nullptr;
    const bool isWhole = whileMemoryLasts(false, [&] {
        const TextFile read = readText(kept);
        if (notes != nullptr) {
            notes->isStopped = read.state == TextFile::State::Stopped;
            notes->problem = read.problem;
        }
        report = read.text ? CreateReport(kept.title, true, false, nullptr, 0, nullptr) : nullptr;
        return report != nullptr && fill(*report, kept, *read.text);
    });
    if (!isWhole && UReportDoc::IsReportAvailable(report)) {
        report->OnCloseDocument(); // the copy on the disk is kept
    }
    return isWhole ? report : nullptr;
}

} // namespace kareport
