#include "PageHeader.h"

#include <QLocale>

namespace kareport
{

QString pageHeaderDate(const QDateTime &time)
{
    return QLocale::c().toString(time, QStringLiteral("MMM dd, yyyy  hh:mmAP"));
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

std::optional<int> linesBetweenPageHeaders(QStringView text, QStringView pageLabel)
{
    const auto isHeader = [pageLabel](QStringView line, int page) {
        const qsizetype label = line.lastIndexOf(pageLabel);
        return label > 0 && line.sliced(label + pageLabel.size()).trimmed() == QString::number(page);
    };
    int number = 0;
    for (const QStringView line : text.tokenize(u'\n')) {
        if (number == 0 && !isHeader(line, 1)) {
            return std::nullopt;
        }
        if (number > 0 && isHeader(line, 2)) {
            return number;
        }
        ++number;
    }
    return std::nullopt;
}

} // namespace kareport
