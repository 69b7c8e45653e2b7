#pragma once

#include "PageWriter.h"
#include "TextBuffer.h"

#include <QString>
#include <QStringView>

#include <cstddef>
#include <functional>
#include <vector>

namespace kareport
{

/// Writes lines so that some stay on one page with the line before them, and with lines of its own at each page's end.
///
/// Lines are held until it is known how many belong together: those are written on one page where a page has room for them.
class KeptLines
{
public:
    struct Line
    {
        bool isBound = false;    ///< stays on the page of the line before it
        bool beginsPage = false; ///< begins a page, unless it is at the top of one
        int before = 0;          ///< blank lines before it, but at the top of a page
        quint64 row = 0;         ///< of the table, from 1; 0 for another line
        bool hasRemarks = false; ///< the line of the row in the report is asked for
        int group = -1;          ///< it heads a group of this level, from 0, and is an entry of the outline
    };
    /// What the lines are told and asked while they are written.
    struct Hooks
    {
        std::function<void(qint64 lines)> begin;          ///< so many lines follow that belong together: the first ones
        std::function<void(const Line &line)> rowWritten; ///< a row has its place
        std::function<std::vector<QString>()> pageEnd;    ///< the lines at the end of a page that has rows
        std::function<void()> pageTurned;                 ///< what follows is on another page
    };

    explicit KeptLines(PageWriter &page) : page_(page) {}

    /// Sets what the lines ask, before the first of them. @param reserved  lines that `Hooks::pageEnd` takes
    void setHooks(Hooks hooks, qint64 reserved)
    {
        hooks_ = std::move(hooks);
        reserved_ = reserved;
    }
    void add(const Line &line, QStringView text);
    /// Adds a line whose text is not known yet. Nothing is written before it is. @return what `setText` is told
    std::size_t addOpen(const Line &line);
    void setText(std::size_t open, QString text);
    /// How many lines a text takes: those of the data may have line breaks.
    static qint64 heightOf(QStringView text);
    /// Writes what is left, the lines of the page's end and then some more, all of which stay with the last lines. The heading
    /// does not follow the last of them to another page.
    void finish(const std::vector<QString> &more);

private:
    struct Held
    {
        Line line;
        std::size_t start; ///< of its text in `text_`
        qsizetype size;    ///< -1 for a text in `texts_`
        qint64 height;     ///< lines that the text takes, where it is known
    };

    void writeHeld(const std::vector<QString> *more);
    void writeTogether(std::size_t begin, std::size_t end, const std::vector<QString> *more);
    void writeParts(std::size_t begin, std::size_t end, qint64 after, bool isLast);
    void writePart(std::size_t begin, std::size_t end, bool isLast);
    std::size_t endOfPart(std::size_t begin, std::size_t end) const;
    void place(std::size_t begin, qint64 lines);
    void writeLine(QStringView text, int before, bool isLast);
    void endPage();
    void noteTop();
    qint64 heightOf(std::size_t begin, std::size_t end) const;
    static qint64 heightOf(const std::vector<QString> &lines);
    QStringView textOf(const Held &held) const;
    bool isAtTop() const { return page_.pageNumber() == topPage_ && page_.lineNumber() == topLine_; }

    PageWriter &page_;
    qint64 reserved_ = 0;
    Hooks hooks_;
    std::vector<Held> lines_;
    TextBuffer text_;            ///< of rows
    std::vector<QString> texts_; ///< of lines that were open
    std::size_t open_ = 0;
    bool hasBegun_ = false;
    int topPage_ = -1; ///< the page that was begun last, and its first line
    int topLine_ = -1;
};

} // namespace kareport
