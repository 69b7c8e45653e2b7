#include "UReportDoc.h"

#include "AppMessageBox.h"
#include "ApplicationTitle.h"
#include "ByteLineReader.h"
#include "MemoryLasts.h"
#include "ReportGuards.h"
#include "ReportParts.h"
#include "RichTextReader.h"
#include "StandardText.h"
#include "UArchive.h"
#include "UView.h"

#include <QFile>

#include <optional>
#include <utility>

namespace
{

/// The most of a file's first line that is looked at to tell what it is.
constexpr qint64 longestProbe = qint64(64) * 1024;

/// Whether a file may be rich text by its name. Opening looks for ".rtf" anywhere after the first character, and saving only at
/// the end of the name (`kareport::isRichTextName`). The difference is intended: a file such as "a.rtf.rep" may hold rich text, so
/// its content decides, but a report that is saved under that name is saved as text.
bool namesRichText(const QString &path)
{
    return path.indexOf(u".rtf", 0, Qt::CaseInsensitive) > 0;
}

bool holdsRichText(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) && kareport::isRichText(file.readLine(longestProbe).trimmed());
}

/// Writes the lines of a file. @return whether they are the source of a rich-text document
bool readLines(QIODevice &file, kareport::PageWriter &page, bool mayBeRichText, bool keepLineEnds)
{
    kareport::ByteLineReader reader(file);
    bool isRichText = false;
    bool isFirst = true;
    bool isOpen = false;
    while (reader.next()) {
        QLatin1StringView line = reader.piece();
        if (std::exchange(isFirst, false)) {
            isRichText = mayBeRichText && kareport::isRichText(line.trimmed());
        }
        isOpen = isRichText && !line.endsWith(u'\n');
        if (isOpen) {
            // A line end between the pieces of a long line could cut a control word in two.
            page.write(line, 0);
            continue;
        }
        if (!keepLineEnds && line.endsWith(u'\n')) {
            line.chop(1);
        }
        // What comes before the first word of a report is the byte-order mark; in rich text it is the head.
        if (!isRichText && page.lineCount() == 0 && line.indexOf(baseApplicationTitle) > 0) {
            line = line.sliced(line.indexOf(baseApplicationTitle));
        }
        page.writeLine(line, 0, 1, 0);
        page.countLine();
    }
    if (isOpen) {
        page.lineFeed(1);
        page.countLine();
    }
    return isRichText;
}

} // namespace

bool UReportDoc::OnNewDocument()
{
    if (!UDocument::OnNewDocument()) {
        return false;
    }
    SetPageSize();
    return true;
}

bool UReportDoc::OnOpenDocument(const QString &path)
{
    parts_->openedFromRtf = namesRichText(path);
    parts_->openedWithoutMemory = true; // until it comes to reading the file
    if (!UDocument::OnOpenDocument(path)) {
        return false;
    }
    SetPageSize();
    return true;
}

void UReportDoc::Serialize(UArchive &archive)
{
    if (archive.IsStoring()) {
        // As many bytes as the text has characters, which is the first half of it: what reads such archives counts on
        // that length.
        const bool isTaken = kareport::doneWhileMemoryLasts(
            [&] { archive.Write(QByteArrayView(reinterpret_cast<const char *>(GetData()), GetText().size())); });
        if (!isTaken || GetText().size() != GetTextLength() || HasLostText()) {
            archive.Abandon(); // there is no memory for it in UTF-16, or there was none for all of it
        }
        return;
    }
    parts_->openedWithoutMemory = false;
    if (!GetViews().empty() && archive.GetLength() > UView::nMaxSize) {
        AppMessageBox(kareport::fileTooLarge, 0, unsigned(-1));
        archive.Abandon();
        return;
    }
    if (GetRTFDataFlag()) {
        return;
    }
    const auto noHeader = kareport::withoutHeader(*this);
    const kareport::ValueGuard serializing(parts_->isSerializing, true, [this](bool on) {
        if (IsReportAvailable(this)) {
            parts_->isSerializing = on;
        }
    });
    const bool isLoaded = LoadFile(archive.GetFilePath(), true) != 0;
    // A view or an editor that took the text may have closed the report.
    if (!isLoaded && IsReportAvailable(this)) {
        archive.Abandon(); // the file was removed meanwhile, or there is no memory for it
    }
}

bool UReportDoc::IsOpenedFromRtf() const
{
    return parts_->openedFromRtf;
}

void UReportDoc::SetOpenedFromRtf(bool on)
{
    parts_->openedFromRtf = on;
}

int UReportDoc::LoadFile(const QString &path, bool keepLineEnds)
{
    if (path.isEmpty()) {
        return 0;
    }
    // Rich text is opened as a document; its source is what is loaded then.
    bool isDocument = false;
    std::optional<QFile> file;
    bool isOpen = false;
    const bool isTried = kareport::doneWhileMemoryLasts([&] {
        isDocument = !parts_->isSerializing && namesRichText(path) && holdsRichText(path);
        isOpen = isDocument || file.emplace(path).open(QIODevice::ReadOnly);
    });
    if (!isTried) {
        parts_->openedWithoutMemory = true;
    }
    if (!isTried || !isOpen) {
        return 0;
    }
    if (isDocument) {
        // What the opening answers counts for nothing: a document that was too large was said to be.
        parts_->openedWithoutMemory = false; // an earlier opening's, where a derived class opens by itself
        const bool isOpened = OnOpenDocument(path);
        return !isOpened && IsReportAvailable(this) && parts_->openedWithoutMemory ? 0 : 1;
    }
    const qint64 before = GetTextLength();
    const bool isWhole = parts_->page.losesNothing([&] {
        if (readLines(*file, parts_->page, namesRichText(path), keepLineEnds)) {
            SetPageStarts({}); // pages are those of the text that is shown
        } else {
            FindPageStarts(before); // those that it was written in, not those that its lines would fill now
        }
    });
    file.reset();
    parts_->openedWithoutMemory = parts_->openedWithoutMemory || !isWhole;
    UpdateAllViews(nullptr, 0, nullptr); // may hand the report to an editor and close it
    return isWhole ? 1 : 0;
}
