#include "ReportTextWriter.h"

#include "MemoryLasts.h"
#include "ReportTextCodec.h"

#include <QIODevice>

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{
constexpr qsizetype pieceSize = 64 * 1024;
}

ReportTextWriter::ReportTextWriter(QIODevice &device, LineEnds lineEnds)
    : device_(device), encoder_(std::make_unique<ReportTextEncoder>(lineEnds)), lineEnds_(lineEnds)
{}

ReportTextWriter::~ReportTextWriter() = default;

bool ReportTextWriter::writeBytes(const char *bytes, std::size_t size)
{
    if (!std::exchange(hasFailed_, true)) { // also where the device throws: it is not known how much of it was taken
        hasFailed_ = device_.write(bytes, static_cast<qint64>(size)) != static_cast<qint64>(size);
    }
    return !hasFailed_;
}

template <typename Text>
bool ReportTextWriter::writePieces(Text text, bool last)
{
    if (!hasBegun_) {
        hasBegun_ = true;
        // What cannot be converted to bytes counts as not written.
        lacksMemory_ = !doneWhileMemoryLasts([this] { bytes_.resize(ReportTextEncoder::bound(pieceSize)); });
        hasFailed_ = lacksMemory_;
        if (lineEnds_ == LineEnds::ReportFile) {
            writeBytes(reportFileMark, sizeof reportFileMark);
        }
    }
    isEmpty_ = isEmpty_ && text.isEmpty();
    if (hasFailed_) {
        return false;
    }
    qsizetype at = 0;
    do {
        const qsizetype count = std::min(pieceSize, text.size() - at);
        const bool isLast = last && at + count == text.size();
        if (!writeBytes(bytes_.data(), encoder_->encode(text.sliced(at, count), bytes_.data(), isLast))) {
            return false;
        }
        at += count;
    } while (at < text.size());
    return true;
}

bool ReportTextWriter::write(QStringView text)
{
    return writePieces(text, false);
}

bool ReportTextWriter::write(QLatin1StringView text)
{
    return writePieces(text, false);
}

bool ReportTextWriter::finish()
{
    return writePieces(QStringView(), true);
}

} // namespace kareport
