#include "ReplaceFile.h"

#include <QFileInfo>
#include <QSaveFile>

#include <algorithm>
#include <vector>

namespace kareport
{

namespace
{

constexpr qsizetype pieceSize = 64 * 1024;

template <typename Text>
bool writePieces(QIODevice &device, Text text, LineEnds lineEnds)
{
    if (lineEnds == LineEnds::ReportFile &&
        device.write(reportFileMark, sizeof reportFileMark) != qint64(sizeof reportFileMark))
    {
        return false;
    }
    ReportTextEncoder encoder(lineEnds);
    std::vector<char> bytes(ReportTextEncoder::bound(pieceSize));
    for (qsizetype at = 0; at < text.size(); at += pieceSize) {
        const qsizetype count = std::min(pieceSize, text.size() - at);
        const auto size =
            static_cast<qint64>(encoder.encode(text.sliced(at, count), bytes.data(), at + count == text.size()));
        if (device.write(bytes.data(), size) != size) {
            return false;
        }
    }
    return true;
}

} // namespace

bool replaceFile(const QString &path, const std::function<bool(QIODevice &)> &write, QString *error)
{
    // A link stays a link: what it points to is replaced.
    const QFileInfo info(path);
    QSaveFile file(info.isSymLink() && info.exists() ? info.canonicalFilePath() : path);
    const bool done = file.open(QIODevice::WriteOnly) && write(file) && file.commit();
    if (!done && error != nullptr) {
        *error = file.errorString();
    }
    return done;
}

bool writeReportText(QIODevice &device, QStringView text, LineEnds lineEnds)
{
    return writePieces(device, text, lineEnds);
}

bool writeReportText(QIODevice &device, QLatin1StringView text, LineEnds lineEnds)
{
    return writePieces(device, text, lineEnds);
}

} // namespace kareport
