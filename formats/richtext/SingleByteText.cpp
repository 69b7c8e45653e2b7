#include "SingleByteText.h"

#include "MemoryLasts.h"

#include <QByteArray>
#include <QChar>
#include <QIODevice>

namespace kareport
{

namespace
{

constexpr qsizetype bufferSize = qsizetype(64) * 1024;

bool writeBytes(QIODevice &device, QStringView text, WideCharacters wide)
{
    QByteArray bytes;
    bytes.reserve(bufferSize + 16);
    for (qsizetype i = 0; i < text.size(); ++i) {
        const char16_t character = text[i].unicode();
        if (character == u'\n') {
            bytes += "\r\n";
        } else if (character <= 0xFF) {
            bytes += static_cast<char>(static_cast<unsigned char>(character));
        } else if (wide == WideCharacters::RichTextEscape) {
            bytes += "\\u";
            bytes += QByteArray::number(static_cast<qint16>(character));
            bytes += '?';
        } else {
            bytes += '?';
            const bool isPair =
                QChar::isHighSurrogate(character) && i + 1 < text.size() && text[i + 1].isLowSurrogate();
            i += isPair ? 1 : 0;
        }
        if (bytes.size() >= bufferSize) {
            if (device.write(bytes) != bytes.size()) {
                return false;
            }
            bytes.resize(0);
        }
    }
    return device.write(bytes) == bytes.size();
}

} // namespace

bool writeSingleByteText(QIODevice &device, QStringView text, WideCharacters wide)
{
    return whileMemoryLasts(false, [&] { return writeBytes(device, text, wide); });
}

} // namespace kareport
