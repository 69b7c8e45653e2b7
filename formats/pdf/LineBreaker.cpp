#include "LineBreaker.h"

#include <QChar>

namespace kareport
{

void breakLine(QStringView line, double width, const CharacterWidth &characterWidth, std::vector<QStringView> &pieces)
{
    qsizetype inkEnd = line.size();
    while (inkEnd > 0 && line[inkEnd - 1] == u' ') {
        --inkEnd;
    }
    qsizetype begin = 0;
    qsizetype breakAt = 0; // after the last blank of the piece
    double used = 0;
    qsizetype at = 0;
    while (at < inkEnd) {
        const bool isPair = line[at].isHighSurrogate() && at + 1 < inkEnd && line[at + 1].isLowSurrogate();
        const qsizetype next = at + (isPair ? 2 : 1);
        if (line[at] == u' ') {
            breakAt = next;
        }
        used += characterWidth(isPair ? QChar::surrogateToUcs4(line[at], line[at + 1]) : line[at].unicode());
        if (used > width && at > begin) {
            const qsizetype end = breakAt > begin ? breakAt : at;
            pieces.push_back(line.sliced(begin, end - begin));
            begin = breakAt = at = end;
            used = 0;
            continue;
        }
        at = next;
    }
    pieces.push_back(line.sliced(begin));
}

} // namespace kareport
