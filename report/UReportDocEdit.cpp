#include "UReportDoc.h"

#include "LoadedText.h"
#include "MemoryLasts.h"

#include <algorithm>
#include <utility>

void UReportDoc::TakeText(kareport::LoadedText &text)
{
    ++editCount_;
    page_.exchangeText(text.text, std::move(text.pageStarts), text.lineEnds);
    SetModifiedFlag(true);
}

bool UReportDoc::ReplaceText(qint64 at, qint64 removed, QStringView inserted)
{
    if (!page_.replace(at, removed, inserted)) {
        return false;
    }
    if (removed > 0 || !inserted.isEmpty()) {
        ++editCount_;
        SetModifiedFlag(true);
    }
    return true;
}

QString UReportDoc::CopyText(qint64 at, qint64 count) const
{
    const kareport::ReportText &text = page_.text();
    const qint64 first = std::clamp<qint64>(at, 0, text.size());
    return kareport::whileMemoryLasts(
        QString(), [&] { return text.piece(first, std::clamp<qint64>(count, 0, text.size() - first)); });
}

QString UReportDoc::CopyText() const
{
    const kareport::ReportText &text = page_.text();
    return kareport::whileMemoryLasts(QString(), [&text] {
        QString copy;
        copy.reserve(text.size());
        text.forEachPiece([&copy](auto piece) { copy += piece; });
        return copy;
    });
}
