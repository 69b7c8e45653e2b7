#pragma once

#include <QString>

#include <vector>

class UReportDoc;

namespace monkey
{

/// What leaves ink, and does in every face: sheets and pages are compared by it.
QString inkOf(QStringView text);

/// A page of a report, and whether it has room on a sheet in the smallest type.
struct Page
{
    QString ink;
    bool hasRoom = true;
};

/// The pages that a report says it has.
std::vector<Page> pagesFor(const UReportDoc &report);

} // namespace monkey
