#include "UReportDoc.h"

#include "AppMessageBox.h"
#include "MemoryLasts.h"
#include "ReportFileReader.h"
#include "RichTextReader.h"
#include "StandardText.h"
#include "UArchive.h"
#include "UView.h"

#include <QFile>

namespace
{

/// The word that the first line of a report begins with.
constexpr QLatin1StringView firstWord("TALVEN");

/// The most of a file's first line that is looked at to tell what it is.
constexpr qint64 longestProbe = 64 * 1024;

/// Whether a file may be rich text by its name.
bool namesRichText(const QString &path)
{
    return path.indexOf(u".rtf", 0, Qt::CaseInsensitive) > 0;
}

bool holdsRichText(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) && kareport::isRichText(file.readLine(longestProbe).trimmed());
}

} // namespace

bool UReportDoc::OnOpenDocument(const QString &path)
{
    openedFromRtf_ = namesRichText(path);
    if (!kareport::whileMemoryLasts(false, [&] { return UDocument::OnOpenDocument(path); })) {
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
        archive.Write(QByteArrayView(reinterpret_cast<const char *>(GetData()), GetText().size()));
        if (GetText().size() != GetTextLength() || HasLostText()) {
            archive.Abandon(); // there is no memory for it in UTF-16, or there was none for all of it
        }
        return;
    }
    if (!GetViews().empty() && archive.GetLength() > UView::nMaxSize) {
        AppMessageBox(kareport::fileTooLarge, 0, unsigned(-1));
        archive.Abandon();
        return;
    }
    if (GetRTFDataFlag()) {
        return;
    }
    const bool headerFlag = GetHeaderFlag();
    SetHeaderFlag(false);
    isSerializing_ = true;
    const bool isLoaded = LoadFile(archive.GetFilePath(), true) != 0;
    if (!IsReportAvailable(this)) {
        return; // a view or an editor that took the text has closed the report
    }
    if (!isLoaded) {
        archive.Abandon(); // the file has gone meanwhile, or there is no memory for it
    }
    isSerializing_ = false;
    SetHeaderFlag(headerFlag);
}

int UReportDoc::LoadFile(const QString &path, bool keepLineEnds)
{
    if (path.isEmpty()) {
        return 0;
    }
    // Rich text is opened as a document; its source is what is loaded then.
    const bool isDocument = kareport::whileMemoryLasts(
        false, [&] { return !isSerializing_ && namesRichText(path) && holdsRichText(path); });
    if (isDocument) {
        OnOpenDocument(path);
        return 1;
    }
    std::optional<QFile> file;
    if (!kareport::whileMemoryLasts(false, [&] { return file.emplace(path).open(QIODevice::ReadOnly); })) {
        return 0;
    }
    const bool isWhole = page_.losesNothing([&] { readLines(*file, namesRichText(path), keepLineEnds); });
    file.reset();
    UpdateAllViews(nullptr, 0, nullptr); // may hand the report to an editor and close it
    return isWhole ? 1 : 0;
}

void UReportDoc::readLines(QIODevice &file, bool mayBeRichText, bool keepLineEnds)
{
    kareport::ReportFileReader reader(file);
    bool isRichText = false;
    bool isFirst = true;
    bool isOpen = false;
    const qint64 before = GetTextLength();
    while (reader.next()) {
        QLatin1StringView line = reader.piece();
        if (std::exchange(isFirst, false)) {
            isRichText = mayBeRichText && kareport::isRichText(QByteArrayView(line.trimmed()));
        }
        isOpen = isRichText && !line.endsWith(u'\n');
        if (isOpen) {
            // A line end between the pieces of a long line could cut a control word in two.
            page_.write(line, 0);
            continue;
        }
        if (!keepLineEnds && line.endsWith(u'\n')) {
            line.chop(1);
        }
        // What stands before the first word of a report is the byte-order mark; in rich text it is the head.
        if (!isRichText && GetLineCount() == 0 && line.indexOf(firstWord) > 0) {
            line = line.sliced(line.indexOf(firstWord));
        }
        page_.writeLine(line, 0, 1, 0);
        page_.countLine();
    }
    if (isOpen) {
        page_.lineFeed(1);
        page_.countLine();
    }
    if (isRichText) {
        SetPageStarts({}); // pages are those of the text that is shown
    } else {
        FindPageStarts(before); // those that it was written in, not those that its lines would fill now
    }
}
