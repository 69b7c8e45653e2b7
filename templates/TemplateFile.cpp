#include "TemplateFile.h"

#include <QByteArray>
#include <QFile>
#include <QUtf8StringView>

#include <algorithm>

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

} // namespace

TemplateFile::TemplateFile(QByteArrayView bytes)
{
    const bool utf8 = QUtf8StringView(bytes.data(), bytes.size()).isValidUtf8();
    const QByteArray kept =
        bytes.contains('\0') ? withoutZeroTails(bytes) : QByteArray::fromRawData(bytes.data(), bytes.size());
    text_ = utf8 ? QString::fromUtf8(kept) : QString::fromLatin1(kept);
}

std::optional<TemplateFile> TemplateFile::read(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return std::nullopt;
    }
    const QByteArray bytes = file.readAll();
    if (file.error() != QFileDevice::NoError) {
        return std::nullopt;
    }
    return TemplateFile(bytes);
}

ScanText TemplateFile::scanText() const
{
    ScanText scanned;
    const QStringView view(text_);
    const auto *const begin = view.begin();
    for (const auto *at = begin; at != view.end();) {
        const auto *const end = std::find_if(at, view.end(), isStripped);
        scanned.append(QStringView(at, end), at - begin);
        at = std::find_if_not(end, view.end(), isStripped);
    }
    return scanned;
}

} // namespace kareport
