#include "PdfNotes.h"

#include "Xlate.h"

#include <algorithm>
#include <numeric>

namespace kareport
{

namespace
{

/// Missing characters that are named; the others are counted.
constexpr std::size_t mostWarnings = 20;

QString linesOf(const PdfWideLines &lines)
{
    const QString first = QString::number(lines.firstLine);
    return lines.count == 1
               ? Xlate("line %1 is").arg(first)
               : Xlate("%1 lines, the first of them line %2, are").arg(QString::number(lines.count), first);
}

QString pointsOf(const PdfWideLines &lines)
{
    return QString::number(lines.points, 'g', 3);
}

} // namespace

QString PdfNotes::sentenceOf(const MissingCharacter &missing)
{
    const QString code = QString::number(missing.character, 16).toUpper().rightJustified(4, u'0');
    return Xlate("no font has the character \"%1\" (U+%2), first in line %3, %4 times in all")
        .arg(QString::fromUcs4(&missing.character, 1), code, QString::number(missing.firstLine),
             QString::number(missing.count));
}

QStringList PdfNotes::warnings() const
{
    QStringList texts;
    if (reduced.count > 0) {
        texts += Xlate("%1 wider than the page: the type is %2 points on all pages")
                     .arg(linesOf(reduced), pointsOf(reduced));
    }
    if (broken.count > 0) {
        texts += Xlate("%1 wider than the page in type of %2 points: what is too wide continues below")
                     .arg(linesOf(broken), pointsOf(broken));
    }
    for (std::size_t i = 0; i < std::min(missing.size(), mostWarnings); ++i) {
        texts += sentenceOf(missing[i]);
    }
    if (missing.size() > mostWarnings) {
        const qint64 others =
            std::accumulate(missing.begin() + mostWarnings, missing.end(), qint64(0),
                            [](qint64 sum, const MissingCharacter &entry) { return sum + entry.count; });
        texts += Xlate("no font has %1 other characters, %2 times in all")
                     .arg(QString::number(missing.size() - mostWarnings), QString::number(others));
    }
    return texts;
}

} // namespace kareport
