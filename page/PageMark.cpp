#include "PageMark.h"

namespace kareport
{

QString withPageNumber(QStringView text, int page)
{
    QString numbered;
    for (qsizetype at = 0; at < text.size();) {
        if (text[at] != pageMark) {
            numbered += text[at++];
            continue;
        }
        qsizetype end = at;
        while (end < text.size() && text[end] == pageMark) {
            ++end;
        }
        numbered += QString::number(page).rightJustified(end - at);
        at = end;
    }
    return numbered;
}

} // namespace kareport
