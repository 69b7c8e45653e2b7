#include "PageHeader.h"

#include "Language.h"
#include "ReportPages.h"
#include "Xlate.h"

#include <QLocale>
#include <QStringList>

#include <algorithm>
#include <map>

namespace kareport
{

namespace
{

/// The text before the page number, without blanks, in every language and in the current one.
QStringList pageLabels()
{
    constexpr const char *english = "   Page:@@Report Header";
    static const QStringList known = inAllLanguages(english);
    QStringList labels;
    for (const QString &text : known + QStringList(Xlate(english))) {
        const QString trimmed = text.trimmed();
        // A report that is loaded has a character for each byte of its file.
        const QString bytes = QString::fromLatin1(trimmed.toUtf8());
        for (const QString *label : {&trimmed, &bytes}) {
            if (!label->isEmpty() && !labels.contains(*label)) {
                labels.append(*label);
            }
        }
    }
    return labels;
}

bool isDigit(QChar character)
{
    return character >= u'0' && character <= u'9';
}

/// Whether a text ends with a date as `pageHeaderDate` writes it.
bool endsWithDate(QStringView text)
{
    constexpr QStringView pattern = u"Aaa 00, 0000  00:00XM";
    if (text.size() < pattern.size()) {
        return false;
    }
    const QStringView date = text.last(pattern.size());
    for (qsizetype i = 0; i < pattern.size(); ++i) {
        const QChar character = date[i];
        const bool fits = pattern[i] == u'A'   ? character >= u'A' && character <= u'Z'
                          : pattern[i] == u'a' ? character >= u'a' && character <= u'z'
                          : pattern[i] == u'0' ? isDigit(character)
                          : pattern[i] == u'X' ? character == u'A' || character == u'P'
                                               : character == pattern[i];
        if (!fits) {
            return false;
        }
    }
    return true;
}

/// The part of a line before the number that it ends with; empty without one.
template <typename View>
View beforeNumber(View line)
{
    qsizetype end = line.size();
    const auto skip = [&](auto isSkipped) {
        const qsizetype from = end;
        while (end > 0 && isSkipped(QChar(line[end - 1]))) {
            --end;
        }
        return from - end;
    };
    const auto isSpace = [](QChar character) { return character == u' ' || character == u'\r'; };
    skip(isSpace);
    if (skip(isDigit) == 0) {
        return View();
    }
    skip(isSpace);
    return line.first(end);
}

bool isHeaderBeforeNumber(QStringView front)
{
    const auto endsHeader = [front](const QString &label) {
        return front.endsWith(label) && endsWithDate(front.chopped(label.size()).trimmed());
    };
    const QStringList labels = pageLabels();
    return std::any_of(labels.begin(), labels.end(), endsHeader);
}

template <typename View>
bool isHeader(View line)
{
    // Most lines that end with a number have a digit or a blank before it.
    const View front = beforeNumber(line);
    return !front.isEmpty() && !isDigit(front.back()) && QChar(front.back()) != u'.' &&
           isHeaderBeforeNumber(front.toString());
}

template <typename View>
std::vector<qint64> findHeaders(View text)
{
    std::vector<qint64> headers;
    for (qsizetype at = 0; at < text.size();) {
        const qsizetype feed = text.indexOf(u'\n', at);
        const qsizetype end = feed < 0 ? text.size() : feed;
        if (isHeader(text.sliced(at, end - at))) {
            headers.push_back(at);
        }
        at = end + 1;
    }
    return headers;
}

/// From one line to the next what most have: single pages may have been edited.
std::optional<int> usualDistance(const std::vector<qint64> &lines)
{
    std::map<qint64, int> pages;
    for (std::size_t i = 1; i < lines.size(); ++i) {
        ++pages[lines[i] - lines[i - 1]];
    }
    const auto most =
        std::max_element(pages.begin(), pages.end(), [](const auto &a, const auto &b) { return a.second < b.second; });
    return most == pages.end() ? std::nullopt : std::optional<int>(static_cast<int>(most->first));
}

} // namespace

QString pageHeaderDate(const QDateTime &time)
{
    return pageHeaderDay(time) + QStringLiteral("  ") + pageHeaderHour(time);
}

QString pageHeaderDay(const QDateTime &time)
{
    return QLocale::c().toString(time, QStringLiteral("MMM dd, yyyy"));
}

QString pageHeaderHour(const QDateTime &time)
{
    return QLocale::c().toString(time, QStringLiteral("hh:mmAP"));
}

QString pageHeaderLine(const QString &application, const QString &title, const QDateTime &time,
                       const QString &pageLabel, int charsPerRow)
{
    /// Room for the page label and number and what sets them off.
    constexpr int pageRoom = 20;
    const QString front = application + QStringLiteral(" - ") + title;
    const qsizetype width = charsPerRow - front.size() - pageRoom;
    const QString date = pageHeaderDate(time);
    const QString placed = width < 0 ? date.leftJustified(-width) : date.rightJustified(width);
    return front + u' ' + placed + u' ' + pageLabel;
}

bool isPageHeader(QStringView line)
{
    return isHeader(line);
}

std::optional<int> pageNumberOf(QStringView line)
{
    constexpr qsizetype mostDigits = 9;
    if (!isPageHeader(line)) {
        return std::nullopt;
    }
    const QStringView trimmed = line.trimmed();
    qsizetype digits = 0;
    while (digits < trimmed.size() && isDigit(trimmed[trimmed.size() - 1 - digits])) {
        ++digits;
    }
    return digits <= mostDigits ? std::optional(trimmed.last(digits).toInt()) : std::nullopt;
}

std::vector<qint64> pageHeadersIn(QStringView text)
{
    return findHeaders(text);
}

std::vector<qint64> pageHeadersIn(QLatin1StringView text)
{
    return findHeaders(text);
}

std::optional<int> linesBetweenPageHeaders(QStringView text)
{
    return linesBetweenPageHeaders(text, pageHeadersIn(text));
}

std::optional<int> linesBetweenPageHeaders(QStringView text, const std::vector<qint64> &headers)
{
    return usualDistance(linesOfStarts(text, headers));
}

std::optional<int> linesBetweenPageHeaders(QLatin1StringView text, const std::vector<qint64> &headers)
{
    return usualDistance(linesOfStarts(text, headers));
}

} // namespace kareport
