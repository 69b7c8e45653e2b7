#include "PrintJob.h"

#include "PrintProgress.h"
#include "PrintSpool.h"
#include "PrintTarget.h"

#include <QPageRanges>
#include <QPainter>
#include <QPrinter>

#include <optional>

namespace kareport
{

namespace
{

/// The loop over the pages of one job.
class PageLoop
{
public:
    PageLoop(QPrinter &printer, QPainter &painter, const PrintSource &source, PrintProgress &progress, int lastPage)
        : printer_(printer),
          painter_(painter),
          source_(source),
          progress_(progress),
          ranges_(rangesOf(printer)),
          lastPage_(lastPage)
    {}

    PrintOutcome run()
    {
        if (printer_.pageOrder() == QPrinter::LastPageFirst) {
            runBackwards();
        } else {
            runForwards();
        }
        if (outcome_.result == PrintResult::Done && outcome_.pages == 0) {
            outcome_.result = PrintResult::Empty;
        }
        return outcome_;
    }

private:
    static QPageRanges rangesOf(const QPrinter &printer)
    {
        if (!printer.pageRanges().isEmpty()) {
            return printer.pageRanges();
        }
        QPageRanges ranges;
        if (printer.fromPage() > 0 && printer.toPage() >= printer.fromPage()) {
            ranges.addRange(printer.fromPage(), printer.toPage());
        }
        return ranges;
    }

    bool isWanted(int page) const { return ranges_.isEmpty() || ranges_.contains(page); }
    /// Whether a page lies after those that are asked for. Says so where it is one that the limit leaves out.
    bool isAfterLast(int page)
    {
        if (!ranges_.isEmpty() && page > ranges_.lastPage()) {
            return true;
        }
        const bool isOverLimit = lastPage_ > 0 && page > lastPage_;
        outcome_.isCut = isOverLimit && source_.find(painter_, page);
        return isOverLimit;
    }

    void runForwards()
    {
        for (int page = 1; !isAfterLast(page) && goesOn(page) && source_.find(painter_, page); ++page) {
            if (isWanted(page) && !(print(page) && hasMore_)) {
                return;
            }
        }
    }

    void runBackwards()
    {
        int last = 0;
        while (!isAfterLast(last + 1) && goesOn(last + 1) && source_.find(painter_, last + 1)) {
            ++last;
        }
        for (int page = last; page > 0 && outcome_.result == PrintResult::Done; --page) {
            if (isWanted(page) && !(goesOn(last - page + 1) && print(page))) {
                return;
            }
        }
    }

    /// Lets other events happen. @return whether the job continues after them
    bool goesOn(int page)
    {
        if (progress_.step(page) && !source_.isUnchanged()) {
            outcome_.result = PrintResult::Changed;
        } else if (progress_.isCancelled()) {
            outcome_.result = PrintResult::Cancelled;
        }
        return outcome_.result == PrintResult::Done;
    }

    bool print(int page)
    {
        if ((outcome_.pages > 0 && !printer_.newPage()) || printer_.printerState() == QPrinter::Error) {
            outcome_.result = PrintResult::Failed;
            return false;
        }
        hasMore_ = source_.print(painter_, page);
        ++outcome_.pages;
        return true;
    }

    QPrinter &printer_;
    QPainter &painter_;
    const PrintSource &source_;
    PrintProgress &progress_;
    QPageRanges ranges_;
    int lastPage_;
    bool hasMore_ = true;
    PrintOutcome outcome_;
};

} // namespace

PrintOutcome printPages(QPrinter &printer, const PrintSource &source, QWidget *parent, int lastPage)
{
    PrintTarget target(printer);
    QPainter painter;
    if (!painter.begin(&printer)) {
        target.discard();
        return {PrintResult::Failed, target.error(), 0};
    }
    PrintProgress progress(parent, source.expectedPages);
    source.begin(painter);
    PrintOutcome outcome = PageLoop(printer, painter, source, progress, lastPage).run();
    source.end(painter);
    if (outcome.result == PrintResult::Done) {
        painter.end();
        if (!target.commit()) {
            outcome.result = PrintResult::Failed;
        }
    } else {
        std::optional<PrintSpool::Closed> closed;
        if (target.isQueue() && !printer.abort()) {
            closed.emplace();
        }
        painter.end();
        target.discard();
    }
    outcome.reason = outcome.result == PrintResult::Failed ? target.error() : QString();
    return outcome;
}

} // namespace kareport
