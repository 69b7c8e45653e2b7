#include "UReportDoc.h"

#include "ApplicationTitle.h"
#include "Clock.h"
#include "LoadedText.h"
#include "MemoryLasts.h"
#include "PageHeader.h"
#include "ReportParts.h"
#include "ReportTextCodec.h"
#include "WrittenCells.h"
#include "Xlate.h"

#include <algorithm>
#include <utility>

const char16_t *UReportDoc::GetData() const
{
    return parts_->page.text().data();
}

QStringView UReportDoc::GetText() const
{
    return parts_->page.text().view();
}

bool UReportDoc::IsEmpty() const
{
    return parts_->page.text().isEmpty();
}

qint64 UReportDoc::GetTextLength() const
{
    return parts_->page.text().size();
}

bool UReportDoc::HasLostText() const
{
    return parts_->page.hasLostText();
}

quint64 UReportDoc::GetEditCount() const
{
    return parts_->editCount;
}

QString UReportDoc::CopyText(qint64 at, qint64 count) const
{
    const kareport::ReportText &text = parts_->page.text();
    const qint64 first = std::clamp<qint64>(at, 0, text.size());
    const qint64 size = std::clamp<qint64>(count, 0, text.size() - first);
    return size == 0 ? QStringLiteral("")
                     : kareport::whileMemoryLasts(QString(), [&] { return text.piece(first, size); });
}

QString UReportDoc::CopyText() const
{
    return CopyText(0, GetTextLength());
}

void UReportDoc::StreamText(kareport::ReportTextWriter *writer)
{
    parts_->page.setOutlet(writer);
}

bool UReportDoc::EndTextStream(kareport::ReportTextWriter &writer)
{
    parts_->page.setOutlet(&writer);
    const bool isTaken = parts_->page.emptyIntoOutlet();
    parts_->page.setOutlet(nullptr);
    return isTaken && !HasLostText() && kareport::whileMemoryLasts(false, [&] { return writer.finish(); });
}

void UReportDoc::SetData(const QString &text)
{
    ++parts_->editCount;
    parts_->page.setPageStarts({});
    parts_->page.clearOutline();
    if (!parts_->page.text().assign(text)) {
        parts_->page.noteLostText();
    }
    FindPageStarts();
}

bool UReportDoc::ReplaceText(qint64 at, qint64 removed, QStringView inserted)
{
    if (!parts_->page.replace(at, removed, inserted)) {
        return false;
    }
    if (removed > 0 || !inserted.isEmpty()) {
        ++parts_->editCount;
        SetModifiedFlag(true);
    }
    return true;
}

void UReportDoc::Clear()
{
    ++parts_->editCount;
    parts_->page.clear();
    parts_->mirrors.image.clear();
    parts_->openedFromRtf = false;
    if (parts_->hooks.cells != nullptr) {
        parts_->hooks.cells->clear();
    }
}

int UReportDoc::CheckSize(int required)
{
    return parts_->page.text().reserve(required) ? 1 : 0;
}

bool UReportDoc::Write(const QString &text, int style)
{
    return parts_->page.write(text, style);
}

void UReportDoc::LineFeed(int count)
{
    parts_->page.lineFeed(count);
}

bool UReportDoc::NewPage(int linesNeeded)
{
    bool isNew = true; // also a page whose header there is no memory for
    parts_->page.losesNothing([&] { isNew = parts_->page.newPage(linesNeeded); });
    return isNew;
}

void UReportDoc::WriteLine(const QString &text, int linesBefore, int linesAfter, int style)
{
    parts_->page.losesNothing(
        [&] { parts_->page.writeNumberedLine(text, text.size(), linesBefore, linesAfter, style); });
}

void UReportDoc::AnnounceEntry(int level, const QString &text)
{
    parts_->page.announceEntry(level, text);
}

void UReportDoc::SetHeading(const QString &heading, int linesBefore, int linesAfter)
{
    parts_->page.setHeading({heading, linesBefore, linesAfter});
}

void UReportDoc::WriteHeading()
{
    parts_->page.losesNothing([this] { parts_->page.writeHeading(); });
}

void UReportDoc::SetHeader()
{
    parts_->page.losesNothing([this] {
        const auto &given = parts_->surroundings;
        parts_->page.setHeaderLine(kareport::pageHeaderLine(
            given ? given->application : GetApplicationTitle(), parts_->title,
            given ? given->time : kareport::currentTime(), Xlate("   Page:@@Report Header"), GetCharsPerRow()));
    });
}

void UReportDoc::WriteHeader()
{
    parts_->page.losesNothing([this] { parts_->page.writeHeader(); });
}

void UReportDoc::SetHeaderFlag(bool on)
{
    parts_->page.setHeaderFlag(on);
}

bool UReportDoc::GetHeaderFlag() const
{
    return parts_->page.headerFlag();
}

int UReportDoc::GetLineCount() const
{
    return parts_->page.lineCount();
}

int UReportDoc::GetLineNumber() const
{
    return parts_->page.lineNumber();
}

int UReportDoc::GetPageNumber() const
{
    return parts_->page.pageNumber();
}
