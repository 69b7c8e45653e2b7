#include "FileKind.h"

#include "ReportSaveName.h"

#include <QByteArray>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

struct EndingRow
{
    QStringView ending;
    FileKind kind;
};

constexpr EndingRow endings[] = {
    {u".json", FileKind::Job},
    {u".xml", FileKind::Template},
    {u".pdf", FileKind::Pdf},
    {u".rtf", FileKind::RichText},
};

/// What a file begins with; empty for what cannot be read. A pipe is not opened: its bytes would be gone.
QByteArray beginOf(const QString &path, qint64 bytes)
{
    QFile file(path);
    return QFileInfo(path).isFile() && file.open(QIODevice::ReadOnly) ? file.read(bytes) : QByteArray();
}

} // namespace

bool hasEnding(QStringView name, QStringView ending)
{
    return name.endsWith(ending, Qt::CaseInsensitive);
}

std::optional<FileKind> fileKindOf(QStringView name)
{
    for (const EndingRow &row : endings) {
        if (hasEnding(name, row.ending)) {
            return row.kind;
        }
    }
    return std::nullopt;
}

bool isDataName(QStringView name)
{
    constexpr QStringView dataEndings[] = {u".csv", u".tsv", u".pts", u".jsonl", u".gpkg", u".sqlite", u".db"};
    return std::any_of(std::begin(dataEndings), std::end(dataEndings),
                       [name](QStringView ending) { return hasEnding(name, ending); });
}

bool isJobFile(const QString &file)
{
    const auto kind = fileKindOf(file);
    if (file == u"-" || kind == FileKind::Job) {
        return true;
    }
    constexpr qint64 lookedAt = 4096;
    return kind != FileKind::Template && beginOf(file, lookedAt).trimmed().startsWith('{');
}

bool isPdfFile(const QString &path)
{
    constexpr QByteArrayView firstBytes = "%PDF-";
    return isPdfName(path) || beginOf(path, firstBytes.size()) == firstBytes;
}

} // namespace kareport
