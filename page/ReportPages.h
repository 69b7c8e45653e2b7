#pragma once

#include "ReportPage.h"

#include <QLatin1StringView>
#include <QStringView>

#include <vector>

namespace kareport
{

/// Whether a line has nothing that a page shows.
bool isBlankLine(QStringView line);

/// The pages of a text, in order: whatever shows, prints or saves pages asks here.
///
/// A page begins at each recorded start that is at the beginning of a line. Text before the first of them, and a text
/// without any, is cut every `linesPerPage` lines. What holds nothing but blank lines is not a page at the end of the text or
/// of the part that is cut by lines; a text of blank lines alone is one page, an empty text none.
/// @param starts        in ascending order
/// @param linesPerPage  below 1 counts as 1
std::vector<ReportPage> reportPages(QStringView text, const std::vector<qint64> &starts, int linesPerPage);
std::vector<ReportPage> reportPages(QLatin1StringView text, const std::vector<qint64> &starts, int linesPerPage);

/// The lines, from 0, that the recorded starts are at the beginning of; the other starts are left out.
std::vector<qint64> linesOfStarts(QStringView text, const std::vector<qint64> &starts);
std::vector<qint64> linesOfStarts(QLatin1StringView text, const std::vector<qint64> &starts);
/// The places at which such lines begin; lines that the text does not have are left out.
std::vector<qint64> startsOfLines(QStringView text, const std::vector<qint64> &lines);
std::vector<qint64> startsOfLines(QLatin1StringView text, const std::vector<qint64> &lines);

} // namespace kareport
