#include "EditedText.h"

#include <QtEndian>

namespace kareport
{

namespace
{

constexpr int wrapColumn = 80;

} // namespace

QString textOfBytes(QByteArrayView bytes)
{
    if (bytes.size() < 2) {
        return QString();
    }
    QString text(bytes.size() / 2, Qt::Uninitialized);
    qFromLittleEndian<char16_t>(bytes.data(), text.size(), text.data());
    return text;
}

QString printableText(const QString &text)
{
    QString result = text;
    for (QChar &character : result) {
        const bool isLineEnd = character == QChar::LineSeparator || character == QChar::ParagraphSeparator;
        if (isLineEnd || !character.isPrint()) {
            character = u' ';
        }
    }
    qsizetype end = result.size();
    while (end > 0 && result[end - 1].isSpace()) {
        --end;
    }
    result.truncate(end);
    return result;
}

QString wrappedText(const QString &text)
{
    QString result;
    result.reserve(text.size() + text.size() / wrapColumn);
    int column = 0;
    for (const QChar character : text) {
        if (character == u'\n') {
            result += u'\r';
            column = 0;
        } else if (character == u'\r') {
            column = 0;
        } else {
            ++column;
            if (column >= wrapColumn && character != u' ' && !result.isEmpty() && result.back() == u' ') {
                result += u'\n';
                column = 0;
            }
        }
        result += character;
    }
    return result;
}

} // namespace kareport
