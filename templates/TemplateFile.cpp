#include "TemplateFile.h"

#include "MemoryLasts.h"
#include "ScanText.h"

#include <QByteArray>
#include <QFile>
#include <QUtf8StringView>

#include <algorithm>
#include <cstdint>
#include <cstring>

namespace kareport
{

namespace
{

constexpr qsizetype chunkSize = 4095;

QByteArray withoutZeroTails(QByteArrayView bytes)
{
    QByteArray kept;
    kept.reserve(bytes.size());
    for (qsizetype at = 0; at < bytes.size(); at += chunkSize) {
        const QByteArrayView chunk = bytes.sliced(at, std::min(chunkSize, bytes.size() - at));
        const qsizetype zero = chunk.indexOf('\0');
        kept.append(zero < 0 ? chunk : chunk.first(zero));
    }
    return kept;
}

bool isStripped(QChar character)
{
    return character == u'\t' || character == u'\n' || character == u'\r';
}

bool isUtf8(QByteArrayView bytes)
{
    return QUtf8StringView(bytes.data(), bytes.size()).isValidUtf8();
}

QString decoded(const QByteArray &bytes, bool utf8)
{
    return utf8 ? QString::fromUtf8(bytes) : QString::fromLatin1(bytes);
}

/// Whether one of eight bytes is below a limit of at most 128: taking the limit from such a byte sets a top bit that it does
/// not have.
bool hasByteBelow(std::uint64_t bytes, unsigned limit)
{
    constexpr std::uint64_t ones = 0x0101010101010101;
    constexpr std::uint64_t tops = 0x8080808080808080;
    return ((bytes - ones * limit) & ~bytes & tops) != 0;
}

/// Removes what is not scanned. None of it is a part of a longer character.
void strip(QByteArray &bytes)
{
    constexpr std::ptrdiff_t block = sizeof(std::uint64_t);
    const char *at = bytes.constData();
    const char *const end = at + bytes.size();
    char *out = bytes.data();
    const auto isStrippedByte = [](char byte) { return byte == '\t' || byte == '\n' || byte == '\r'; };
    for (; end - at >= block; at += block) {
        std::uint64_t word = 0;
        std::memcpy(&word, at, block);
        if (!hasByteBelow(word, '\r' + 1)) {
            std::memcpy(out, &word, block);
            out += block;
        } else {
            out = std::remove_copy_if(at, at + block, out, isStrippedByte);
        }
    }
    out = std::remove_copy_if(at, end, out, isStrippedByte);
    bytes.truncate(out - bytes.constData());
}

std::optional<QByteArray> bytesOf(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return std::nullopt;
    }
    QByteArray bytes = file.readAll();
    return file.error() == QFileDevice::NoError ? std::optional(std::move(bytes)) : std::nullopt;
}

} // namespace

TemplateFile::TemplateFile(QByteArrayView bytes)
{
    const QByteArray kept =
        bytes.contains('\0') ? withoutZeroTails(bytes) : QByteArray::fromRawData(bytes.data(), bytes.size());
    text_ = decoded(kept, isUtf8(bytes));
}

std::optional<TemplateFile> TemplateFile::read(const QString &path)
{
    return whileMemoryLasts(std::optional<TemplateFile>(), [&path] {
        const auto bytes = bytesOf(path);
        return bytes ? std::optional(TemplateFile(*bytes)) : std::nullopt;
    });
}

std::optional<QString> TemplateFile::readScanned(const QString &path)
{
    return whileMemoryLasts(std::optional<QString>(), [&path]() -> std::optional<QString> {
        auto bytes = bytesOf(path);
        if (!bytes) {
            return std::nullopt;
        }
        const bool utf8 = isUtf8(*bytes);
        if (bytes->contains('\0')) {
            bytes = withoutZeroTails(*bytes);
        }
        strip(*bytes);
        return decoded(*bytes, utf8);
    });
}

ScanText scanTextOf(const TemplateFile &file)
{
    ScanText scanned;
    const QStringView view(file.text());
    const auto *const begin = view.begin();
    for (const auto *at = begin; at != view.end();) {
        const auto *const end = std::find_if(at, view.end(), isStripped);
        scanned.append(QStringView(at, end), at - begin);
        at = std::find_if_not(end, view.end(), isStripped);
    }
    return scanned;
}

} // namespace kareport
