#pragma once

#include "KaReportExport.h"

#include <QDateTime>
#include <QString>
#include <QStringView>

#include <optional>

namespace kareport
{

/// The header line of every page, without the page number: application, title, and the date right-aligned so that the
/// line with label and number ends a few characters before the row does. Where the row is too short for that, the date stands left and is filled on its
/// right; this follows from the one width that the line is made with and is kept.
KAREPORT_EXPORT QString pageHeaderLine(const QString &application, const QString &title, const QDateTime &time,
                                       const QString &pageLabel, int charsPerRow);

/// A date and time such as "Mar 05, 2024  02:07PM", in English on every machine.
KAREPORT_EXPORT QString pageHeaderDate(const QDateTime &time);

/// The lines of a page of a report, as its first two header lines tell: the number of lines from the one to the other.
/// Nothing when the text does not begin with the header of page 1 or has no second page.
KAREPORT_EXPORT std::optional<int> linesBetweenPageHeaders(QStringView text, QStringView pageLabel);

} // namespace kareport
