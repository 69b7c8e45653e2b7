#include "PrintTarget.h"

#include "PrintSpool.h"
#include "ReplaceFile.h"
#include "Xlate.h"

#include <QFile>
#include <QPaintEngine>
#include <QPrinter>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr qint64 blockSize = 1 << 16;

/// Whether a PDF was written whole: what writes it does not look at the disk's answers. It ends with a mark, and before that
/// says where its table is: with a piece missing before the table, that is elsewhere.
bool isWhole(QFile &pdf)
{
    constexpr qint64 tail = 64;
    const QByteArray pointer("startxref");
    pdf.seek(std::max<qint64>(0, pdf.size() - tail));
    const QByteArray end = pdf.readAll();
    const qsizetype at = end.lastIndexOf(pointer);
    const qsizetype mark = end.lastIndexOf("%%EOF");
    bool isWhole = false;
    if (at >= 0 && mark > at) {
        const QByteArray place = end.sliced(at + pointer.size(), mark - at - pointer.size()).trimmed();
        isWhole = pdf.seek(place.toLongLong()) && pdf.read(4) == "xref";
    }
    pdf.seek(0);
    return isWhole;
}

/// A preview keeps its pages as pictures, whatever the printer is set to.
bool isPicture(const QPrinter &printer)
{
    return printer.paintEngine() != nullptr && printer.paintEngine()->type() == QPaintEngine::Picture;
}

bool copyTo(QIODevice &target, QFile &source)
{
    while (!source.atEnd()) {
        const QByteArray block = source.read(blockSize);
        if (block.isEmpty() || target.write(block) != block.size()) {
            return false;
        }
    }
    return true;
}

} // namespace

PrintTarget::PrintTarget(QPrinter &printer)
    : printer_(printer),
      file_(printer.outputFileName()),
      isQueue_(!isPicture(printer) && printer.outputFormat() == QPrinter::NativeFormat)
{
    if (!isPicture(printer) && !isQueue_ && !file_.isEmpty()) {
        folder_.emplace();
        printer_.setOutputFileName(folder_->filePath(QStringLiteral("pages.pdf")));
    }
}

PrintTarget::~PrintTarget()
{
    discard();
}

bool PrintTarget::commit()
{
    if (!isIntoFile()) {
        error_ = isQueue_ ? PrintSpool::lastError() : QString();
        return error_.isEmpty();
    }
    QFile pages(printer_.outputFileName());
    bool done = false;
    if (!pages.open(QIODevice::ReadOnly) || !isWhole(pages)) {
        error_ = Xlate("There is not enough room for the pages on the disk.");
    } else {
        done = replaceFile(
            file_, [&pages](QIODevice &device) { return copyTo(device, pages); }, &error_);
    }
    discard();
    return done;
}

void PrintTarget::discard()
{
    if (isIntoFile()) {
        printer_.setOutputFileName(file_);
        folder_.reset();
    }
}

} // namespace kareport
