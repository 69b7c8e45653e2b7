#pragma once

#include <QStringView>

#include <optional>

class UReportDoc;

namespace kareport
{

/// The lines of a page by a report's header lines, in whatever language they were written; nothing without any.
std::optional<int> linesOfPages(QStringView text);
/// Writes the lines of a text into a report as they are, counting them. Page headers that it has are lines like others.
void writeLines(UReportDoc &report, QStringView text);

} // namespace kareport
