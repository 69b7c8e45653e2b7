#include "TextFolding.h"

namespace kareport
{

bool equalFolded(QStringView left, QStringView right)
{
    return left.compare(right, Qt::CaseInsensitive) == 0;
}

QString foldedKey(QStringView text)
{
    // A full folding would make two characters of one; each character is folded by itself.
    QString key;
    key.reserve(text.size());
    for (qsizetype i = 0; i < text.size(); ++i) {
        if (text[i].isHighSurrogate() && i + 1 < text.size() && text[i + 1].isLowSurrogate()) {
            const char32_t character = QChar::surrogateToUcs4(text[i], text[i + 1]);
            key.append(QStringView(QChar::fromUcs4(QChar::toCaseFolded(character))));
            ++i;
        } else {
            key.append(text[i].toCaseFolded());
        }
    }
    return key;
}

} // namespace kareport
