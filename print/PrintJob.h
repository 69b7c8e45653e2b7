#pragma once

#include <QString>

#include <functional>

class QPainter;
class QPrinter;
class QWidget;

namespace kareport
{

/// What a print job prints, page by page.
struct PrintSource
{
    int expectedPages = 0; ///< for the progress; the job continues while there is text
    std::function<void(QPainter &painter)> begin;
    std::function<void(QPainter &painter)> end;
    /// Finds where a page begins; pages are asked for one after the other at first. @return false when there is no such page
    std::function<bool(QPainter &painter, int page)> find;
    /// Prints a page that has been found. @return false when it was the last
    std::function<bool(QPainter &painter, int page)> print;
    /// Whether what is printed is still there and as it was. Asked whenever other events may have happened.
    std::function<bool()> isUnchanged;
};

enum class PrintResult
{
    Done,
    Empty,     ///< there is no page
    Cancelled, ///< by the user
    Changed,   ///< the text has changed or was closed meanwhile
    Failed     ///< the printer does not print
};

/// What became of a job, and why.
struct PrintOutcome
{
    PrintResult result = PrintResult::Done;
    QString reason;     ///< what the system says; may be empty
    int pages = 0;      ///< printed
    bool isCut = false; ///< whether more pages were left out for the limit
};

/// Prints the pages that the printer is set to, in its order. The windows of the program stay responsive; after a
/// moment one of them shows how far the job is and lets the user cancel it. A job that does not come to its end leaves
/// nothing in a print queue, and an earlier file as it was.
/// @param lastPage  stops there, for a preview that cannot hold more, and says in the outcome whether there is a page
///                  after it; 0 for no limit
PrintOutcome printPages(QPrinter &printer, const PrintSource &source, QWidget *parent, int lastPage = 0);

} // namespace kareport
