#include "PageWriter.h"

#include <utility>

namespace kareport
{

void PageWriter::clear()
{
    text_.clear();
    starts_.clear();
    outline_.clear();
    losses_ = 0;
    lineCount_ = 0;
    heading_.text.clear();
    noteChange();
}

bool PageWriter::emptyIntoOutlet()
{
    bool isTaken = false;
    losesNothing([&] { isTaken = text_.visit([this](auto text) { return outlet_->write(text); }); });
    text_.drain();
    starts_.clear();
    outline_.clear();
    return isTaken;
}

void PageWriter::exchangeText(ReportText &text, std::vector<qint64> pageStarts, qint64 lineEnds)
{
    text_.swap(text);
    starts_.assign(std::move(pageStarts));
    outline_.clear();
    lineNumber_ += static_cast<int>(lineEnds);
    lineCount_ += lineEnds;
}

void PageWriter::exchangeContent(PageWriter &other) noexcept
{
    text_.swap(other.text_);
    std::swap(starts_, other.starts_);
    std::swap(outline_, other.outline_);
    std::swap(losses_, other.losses_);
    std::swap(lineNumber_, other.lineNumber_);
    std::swap(lineCount_, other.lineCount_);
    std::swap(pageNumber_, other.pageNumber_);
    std::swap(linesPerPage_, other.linesPerPage_);
    std::swap(headerFlag_, other.headerFlag_);
    std::swap(hasPageMarks_, other.hasPageMarks_);
    std::swap(headerLine_, other.headerLine_);
    std::swap(heading_, other.heading_);
}

bool PageWriter::replace(qint64 at, qint64 removed, QStringView inserted)
{
    if (at < 0 || removed < 0 || at > text_.size() || removed > text_.size() - at) {
        return false;
    }
    return whileMemoryLasts(false, [&] {
        if (text_.owns(inserted)) {
            return replace(at, removed, inserted.toString());
        }
        const bool isForStarts = starts_.wantsRemoved(at, removed, inserted.size());
        const bool isWanted = isForStarts || outline_.wantsRemoved(at, removed);
        const QString removedText = isWanted ? text_.piece(at, removed) : QString();
        const bool mayBeHeader = inserted.size() > PageStarts::shortestHeader;
        const bool beginsLine = at == 0 || (mayBeHeader && text_.piece(at - 1, 1) == u"\n");
        PageStarts::Edit edit =
            starts_.prepare(at, removed, isForStarts ? removedText : QString(), inserted, beginsLine);
        if (!text_.replace(at, removed, inserted)) {
            return false;
        }
        starts_.carryOut(std::move(edit));
        outline_.carry(at, removed, removedText, inserted);
        return true;
    });
}

} // namespace kareport
