#include "ReportPages.h"

#include <algorithm>

namespace kareport
{

namespace
{

bool isBlank(QChar character)
{
    return character == u' ' || character == u'\n' || character == u'\r' || character == u'\t';
}

template <typename View>
bool beginsLine(View text, qint64 at)
{
    return at >= 0 && at < text.size() && (at == 0 || QChar(text[at - 1]) == u'\n');
}

template <typename View>
qint64 lineEndsIn(View text)
{
    return std::count(text.begin(), text.end(), typename View::value_type('\n'));
}

/// After so many line ends from a place, or the end of the text.
template <typename View>
qint64 afterLines(View text, qint64 at, qint64 lines)
{
    for (; lines > 0 && at < text.size(); --lines) {
        const qint64 feed = text.indexOf(u'\n', at);
        at = feed < 0 ? text.size() : feed + 1;
    }
    return at;
}

template <typename View>
ReportPage pageOf(View text, qint64 begin, qint64 stop)
{
    qint64 end = stop;
    while (end > begin && isBlank(QChar(text[end - 1]))) {
        --end;
    }
    if (end == begin) {
        return {begin, begin, 0};
    }
    end = std::min(stop, afterLines(text, end, 1));
    const bool isOpen = QChar(text[end - 1]) != u'\n';
    return {begin, end, lineEndsIn(text.sliced(begin, end - begin)) + (isOpen ? 1 : 0)};
}

void dropBlankAtEnd(std::vector<ReportPage> &pages, std::size_t kept)
{
    while (pages.size() > kept && pages.back().lines == 0) {
        pages.pop_back();
    }
}

template <typename View>
std::vector<ReportPage> cut(View text, const std::vector<qint64> &starts, int linesPerPage)
{
    std::vector<ReportPage> pages;
    qint64 begin = -1; // of the current page, once the first start was found
    const auto cutByLines = [&](qint64 stop) {
        for (qint64 at = 0; at < stop;) {
            const qint64 next = std::min(stop, afterLines(text, at, std::max(1, linesPerPage)));
            pages.push_back(pageOf(text, at, next));
            at = next;
        }
        dropBlankAtEnd(pages, 0);
    };
    for (const qint64 start : starts) {
        if (start <= begin || !beginsLine(text, start)) {
            continue;
        }
        if (begin < 0) {
            cutByLines(start);
        } else {
            pages.push_back(pageOf(text, begin, start));
        }
        begin = start;
    }
    if (begin < 0) {
        cutByLines(text.size());
    } else {
        pages.push_back(pageOf(text, begin, text.size()));
    }
    dropBlankAtEnd(pages, 0);
    if (pages.empty() && !text.isEmpty()) {
        pages.push_back(ReportPage());
    }
    return pages;
}

template <typename View>
std::vector<qint64> findLines(View text, const std::vector<qint64> &starts)
{
    std::vector<qint64> lines;
    qint64 line = 0;
    qint64 counted = 0;
    for (const qint64 start : starts) {
        if (start < counted || !beginsLine(text, start)) {
            continue;
        }
        line += lineEndsIn(text.sliced(counted, start - counted));
        counted = start;
        if (lines.empty() || lines.back() != line) {
            lines.push_back(line);
        }
    }
    return lines;
}

template <typename View>
std::vector<qint64> findStarts(View text, const std::vector<qint64> &lines)
{
    std::vector<qint64> starts;
    qint64 at = 0;
    qint64 line = 0;
    for (const qint64 wanted : lines) {
        if (wanted < line) {
            continue;
        }
        at = afterLines(text, at, wanted - line);
        line = wanted;
        if (beginsLine(text, at) && (starts.empty() || starts.back() != at)) {
            starts.push_back(at);
        }
    }
    return starts;
}

} // namespace

bool isBlankLine(QStringView line)
{
    return std::all_of(line.begin(), line.end(), isBlank);
}

std::vector<ReportPage> reportPages(QStringView text, const std::vector<qint64> &starts, int linesPerPage)
{
    return cut(text, starts, linesPerPage);
}

std::vector<ReportPage> reportPages(QLatin1StringView text, const std::vector<qint64> &starts, int linesPerPage)
{
    return cut(text, starts, linesPerPage);
}

std::vector<qint64> linesOfStarts(QStringView text, const std::vector<qint64> &starts)
{
    return findLines(text, starts);
}

std::vector<qint64> linesOfStarts(QLatin1StringView text, const std::vector<qint64> &starts)
{
    return findLines(text, starts);
}

std::vector<qint64> startsOfLines(QStringView text, const std::vector<qint64> &lines)
{
    return findStarts(text, lines);
}

std::vector<qint64> startsOfLines(QLatin1StringView text, const std::vector<qint64> &lines)
{
    return findStarts(text, lines);
}

} // namespace kareport
