#pragma once

#include "MemoryLasts.h"
#include "PageDefaults.h"
#include "PageStarts.h"
#include "ReportOutline.h"
#include "ReportText.h"
#include "TextOutlet.h"

#include <QString>
#include <QStringView>

#include <algorithm>
#include <limits>
#include <vector>

namespace kareport
{

/// Is notified of what is written, piece by piece.
class PageWriterObserver
{
public:
    virtual ~PageWriterObserver();
    /// Whether it needs the text that is written. Otherwise it is only notified that something was.
    virtual bool takesText() const { return true; }
    /// A piece of text, never empty, with the style it was written in. @return false when there is no memory for it: it is
    /// then not written at all
    virtual bool textWritten(QStringView text, int style) = 0;
    /// A line end that is not part of a piece. @return false as above
    virtual bool lineEnded() = 0;
    /// A line, a heading or a page header was written.
    virtual void changed() = 0;
};

/// The repeated lines at a page's start.
struct PageHeading
{
    QString text;
    int linesBefore = 0;
    int linesAfter = 0;
};

/// Lays text out in pages and lines: the counters, the page rule, the header and the heading of every page.
class PageWriter
{
public:
    /// The characters after which the text is handed to an outlet: few enough to be near the processor.
    static constexpr qint64 mostBeforeOutlet = 256 * 1024;

    /// The observer may be null; otherwise it must live as long as the writer.
    explicit PageWriter(PageWriterObserver *observer = nullptr, ReportText::Reallocate reallocate = nullptr);

    ReportText &text() { return text_; }
    const ReportText &text() const { return text_; }

    /// Hands the text on while it is written, so that `text` never holds more than its end; null keeps the text. The outlet
    /// must live until another one, or null, is set. `clear` does not take back what was handed on.
    void setOutlet(TextOutlet *outlet) { outlet_ = outlet; }
    /// Hands on what is left. @return whether all of the text was taken
    bool emptyIntoOutlet();

    /// Where each page begins. A text that is handed on has no record: its pages cannot be looked at.
    const PageStarts &pageStarts() const { return starts_; }
    void setPageStarts(std::vector<qint64> starts) { starts_.assign(std::move(starts)); }
    /// The report's outline. A text that is handed on has none.
    const ReportOutline &outline() const { return outline_; }
    /// Announces an entry of the outline for what is written next. @param level, text  as `OutlineEntry` has them
    void announceEntry(int level, const QString &text);
    void clearOutline() { outline_.clear(); }
    /// Notes in a list where each heading of a page begins in the text, from now on; null ends that. The list must live until
    /// then.
    void noteHeadings(std::vector<qint64> *starts) { headingStarts_ = starts; }
    /// Where the piece of text begins that was written last, other than a page header or a heading. It counts while the text
    /// is not handed on.
    qint64 lastPieceStart() const { return lastPieceStart_; }
    /// Exchanges the text for another one. @param lineEnds  counted as if they had been written
    void exchangeText(ReportText &text, std::vector<qint64> pageStarts, qint64 lineEnds);
    /// Exchanges all that was written with another writer's: the text with its pages and its outline, the counters, the
    /// header and the heading, and the lines of a page. Observers and outlets stay, and are not notified.
    void exchangeContent(PageWriter &other) noexcept;
    /// Replaces a piece of the text and carries the page starts along.
    /// @return false, changing nothing, for a piece that is not in the text or when there is no memory
    bool replace(qint64 at, qint64 removed, QStringView inserted);

    /// Whether a part of what was to be written since the last `clear` is missing, because memory ran out.
    bool hasLostText() const { return losses_ != 0; }
    void noteLostText() { ++losses_; }
    /// How often something was lost.
    quint64 losses() const { return losses_; }
    /// Does something that writes; where memory runs out in the middle, what comes then is lost. @return whether nothing was
    template <typename Write>
    bool losesNothing(Write write)
    {
        const quint64 before = losses_;
        if (!doneWhileMemoryLasts(write)) {
            noteLostText();
        }
        return losses_ == before;
    }

    int lineNumber() const { return lineNumber_; } ///< line on the page; 1 right after a page break
    int lineCount() const
    {
        return static_cast<int>(std::min<qint64>(lineCount_, std::numeric_limits<int>::max()));
    }                                              ///< lines since the last `clear`; 0: nothing has been written
    int pageNumber() const { return pageNumber_; } ///< from 1

    int linesPerPage() const { return linesPerPage_; }
    void setLinesPerPage(int lines) { linesPerPage_ = lines; }
    void setHeaderFlag(bool on) { headerFlag_ = on; }
    bool headerFlag() const { return headerFlag_; }
    /// The header line without its page number, which every page adds.
    void setHeaderLine(const QString &line) { headerLine_ = line; }
    /// Whether `pageMark` in headings, and where `writeNumberedLine` looks for it, is replaced by the number of the page.
    void setPageMarks(bool on) { hasPageMarks_ = on; }
    bool hasPageMarks() const { return hasPageMarks_; }
    void setHeading(PageHeading heading) { heading_ = std::move(heading); }
    const PageHeading &heading() const { return heading_; }

    /// Empties the text and the heading. Line and page number stay until the next `newPage` starts them again.
    void clear();
    /// Appends text as it is, counting its line feeds. @return false, changing nothing, when there is no room
    bool write(QStringView text, int style);
    bool write(QLatin1StringView text, int style);
    /// Ends the line so many times; stops where there is no room.
    void lineFeed(qint64 count);
    /// Starts a new page when so many lines and one more do not fit, always for a number below 0.
    /// @return whether it did
    bool newPage(qint64 linesNeeded);
    /// Leaves so many lines blank, or starts a new page where they do not fit.
    void skipLines(qint64 count);
    /// Writes a line: blank lines before it (dropped at a page's start), the text, line ends after it. With 0 after, the
    /// line stays open.
    void writeLine(QStringView text, int linesBefore, int linesAfter, int style);
    void writeLine(QLatin1StringView text, int linesBefore, int linesAfter, int style);
    /// The same with the number of the page that the line is on in place of the page marks, which are looked for in the
    /// first `marked` characters.
    void writeNumberedLine(QStringView text, qsizetype marked, int linesBefore, int linesAfter, int style);
    /// Ends the page without looking at what is left of it, and begins the next one.
    void breakPage();
    /// What `newPage` does before anything is written.
    void beginFirstPage();
    qint64 linesLeft() const { return qint64(linesPerPage_) - lineNumber_; }
    void writeHeading();
    void writeHeader();
    /// Counts a line that was not written.
    void countLine() { ++lineCount_; }
    /// Tells the observer that something was changed.
    void noteChange();

private:
    static constexpr int headerGap = 4; ///< line ends after the header line

    template <typename View>
    bool writeText(View text, int style);
    template <typename View>
    bool tellWritten(View text, int style);
    template <typename View>
    void placeEntries(qint64 at, View text);
    template <typename View>
    void writeTextLine(View text, int linesAfter, int style);
    bool isNumbered(QStringView text) const;
    void writeHeadingText();

    void notePageStart();
    void takeBack(qint64 size)
    {
        text_.truncate(size);
        noteLostText();
    }
    void noteGrowth()
    {
        if (outlet_ != nullptr && text_.size() >= mostBeforeOutlet) {
            emptyIntoOutlet();
        }
    }

    PageWriterObserver *observer_;
    ReportText text_;
    PageStarts starts_;
    ReportOutline outline_;
    TextOutlet *outlet_ = nullptr;
    std::vector<qint64> *headingStarts_ = nullptr; ///< null while nobody asks for them
    qint64 lastPieceStart_ = 0;
    quint64 losses_ = 0;
    int lineNumber_ = 0;
    qint64 lineCount_ = 0; ///< a report that is handed on may have any number
    int pageNumber_ = 0;
    int linesPerPage_ = defaultLinesPerPage;
    bool headerFlag_ = false;
    bool hasPageMarks_ = false;
    QString headerLine_;
    PageHeading heading_;
};

} // namespace kareport
