// Does one piece of work on files and says how long it took, for comparisons with other programs.
//
//   ka_file_work save TEXT OUT    TEXT (UTF-16LE) is put into a report; the time of saving it as OUT
//   ka_file_work load IN          the time of loading a report file
//   ka_file_work copy IN OUT      the time of writing the bytes of IN as OUT: what any saving must take
//   ka_file_work deflate IN       the time of compressing the pages of a report file as a PDF does, 72 lines a page
//   ka_file_work pdf IN OUT       IN is loaded; the time of writing it as a PDF, 72 lines a page
//
// Prints the seconds and the peak memory of the process in KB.

#include "BenchProfile.h"
#include "ProcessorTime.h"
#include "ReplaceFile.h"
#include "UReportDoc.h"

#include <QElapsedTimer>
#include <QFile>

#include <cstdio>
#include <functional>

namespace
{

int say(const std::function<bool()> &work)
{
    QElapsedTimer timer;
    timer.start();
    const bool done = work();
    const double seconds = double(timer.nsecsElapsed()) * 1e-9;
    std::printf("%.6f %ld\n", seconds, peakMemory());
    return done ? 0 : 1;
}

/// The content of a page of a PDF: two bytes for each character, and the commands around a line.
QByteArrayList pageContents(const QByteArray &report)
{
    constexpr qsizetype linesOfPage = 72;
    QByteArrayList pages;
    qsizetype lines = 0;
    for (const QByteArray &line : report.split('\n')) {
        if (lines++ % linesOfPage == 0) {
            pages.append("BT\n/F1 8 Tf\n");
        }
        pages.last() += '(';
        for (const char character : line.trimmed()) {
            (pages.last() += '\0') += character;
        }
        pages.last() += ") '\n";
    }
    return pages;
}

QByteArray contentOf(const char *path)
{
    QFile file(QFile::decodeName(path));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

int main(int argc, char **argv)
{
    kareport::useBenchProfile();
    const QByteArrayView verb(argc > 1 ? argv[1] : "");
    UReportDoc report;
    if (verb == QByteArrayView("save") && argc == 4) {
        const QByteArray bytes = contentOf(argv[2]);
        report.SetData(QString(reinterpret_cast<const QChar *>(bytes.constData()), bytes.size() / 2));
        return say([&] { return report.OnSaveDocument(QFile::decodeName(argv[3])); });
    }
    if (verb == QByteArrayView("load") && argc == 3) {
        return say([&] { return report.LoadFile(QFile::decodeName(argv[2]), true) == 1; });
    }
    if (verb == QByteArrayView("copy") && argc == 4) {
        const QByteArray bytes = contentOf(argv[2]);
        return say([&] {
            return kareport::replaceFile(QFile::decodeName(argv[3]),
                                         [&](QIODevice &device) { return device.write(bytes) == bytes.size(); });
        });
    }
    if (verb == QByteArrayView("deflate") && argc == 3) {
        const QByteArrayList pages = pageContents(contentOf(argv[2]));
        return say([&] {
            qsizetype size = 0;
            for (const QByteArray &page : pages) {
                size += qCompress(page).size();
            }
            return size > 0;
        });
    }
    if (verb == QByteArrayView("pdf") && argc == 4) {
        report.FixPage(72, 80);
        report.SetPageSize();
        // Line by line, as a host writes it.
        QFile file(QFile::decodeName(argv[2]));
        file.open(QIODevice::ReadOnly);
        file.skip(3);
        while (!file.atEnd()) {
            report.WriteLine(QString::fromUtf8(file.readLine().trimmed()), 0, 1, 0);
        }
        return say([&] {
            return kareport::replaceFile(QFile::decodeName(argv[3]),
                                         [&](QIODevice &device) { return report.WritePdf(device); });
        });
    }
    std::fputs("ka_file_work save TEXT OUT | load IN | copy IN OUT | deflate IN | pdf IN OUT\n", stderr);
    return 1;
}
