#include "LineEndings.h"

namespace kareport
{

QString withCrLf(QStringView text)
{
    const auto isBare = [text](qsizetype at) { return text[at] == u'\n' && (at == 0 || text[at - 1] != u'\r'); };
    qsizetype bare = 0;
    for (qsizetype at = 0; at < text.size(); ++at) {
        bare += isBare(at) ? 1 : 0;
    }
    QString result(text.size() + bare, Qt::Uninitialized);
    QChar *out = result.data();
    for (qsizetype at = 0; at < text.size(); ++at) {
        if (isBare(at)) {
            *out++ = u'\r';
        }
        *out++ = text[at];
    }
    return result;
}

} // namespace kareport
