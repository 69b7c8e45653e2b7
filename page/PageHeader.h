#pragma once

#include <QDateTime>
#include <QLatin1StringView>
#include <QString>
#include <QStringView>

#include <optional>
#include <vector>

namespace kareport
{

/// The header line of every page, without the page number: application, title, and the date right-aligned so that the
/// line with label and number ends a few characters before the row does. Where the row is too short for that, the date is at the left and is padded on its
/// right; this follows from the one width that the line is made with and is kept.
QString pageHeaderLine(const QString &application, const QString &title, const QDateTime &time,
                       const QString &pageLabel, int charsPerRow);

/// A date and time such as "Mar 05, 2024  02:07PM", in English on every machine.
QString pageHeaderDate(const QDateTime &time);
/// Its parts: "Mar 05, 2024" and "02:07PM".
QString pageHeaderDay(const QDateTime &time);
QString pageHeaderHour(const QDateTime &time);

/// Whether a line, without its line end, is a page header, in whatever language it was written: it ends with the date, the
/// label of the page number and the number.
bool isPageHeader(QStringView line);

/// The number of the page that a page header ends with; nothing for any other line, and for a number of more than nine digits.
std::optional<int> pageNumberOf(QStringView line);

/// Where the lines of a text begin that are page headers.
std::vector<qint64> pageHeadersIn(QStringView text);
std::vector<qint64> pageHeadersIn(QLatin1StringView text);

/// The lines of a page of a report, as its header lines tell: the number of lines that is most frequent from one of them
/// to the next. Nothing for a text with fewer than two.
std::optional<int> linesBetweenPageHeaders(QStringView text);
/// The same where the header lines are known. @param headers  as `pageHeadersIn` gives them
std::optional<int> linesBetweenPageHeaders(QStringView text, const std::vector<qint64> &headers);
std::optional<int> linesBetweenPageHeaders(QLatin1StringView text, const std::vector<qint64> &headers);

} // namespace kareport
