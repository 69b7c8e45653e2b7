#include "RichTextReader.h"
#include "RichTextWriter.h"

#include "ProcessorTime.h"

#include <benchmark/benchmark.h>

#include <QBuffer>
#include <QTextDocument>

namespace
{

/// A report as rich text: every line with all its words, none ended by a line feed.
QByteArray reportImage(qint64 lines)
{
    QByteArray bytes(
        "{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida Console;}}");
    for (qint64 i = 0; i < lines; ++i) {
        bytes += "\\viewkind4\\uc1\\pard\\f1\\fs18  " + QByteArray::number(i) +
                 "        6295.3311       16603.3967        108.584   P75954\\par";
    }
    return bytes + "}";
}

/// A document as word processors write it, with four formats in a line.
QByteArray formattedText(qint64 lines)
{
    QByteArray bytes(
        "{\\rtf1\\ansi\\ansicpg1252\\deff0{\\fonttbl{\\f0\\fswiss\\fcharset0 Arial;}{\\f1\\fmodern\\fcharset0 Courier;}}\r\n"
        "{\\colortbl;\\red255\\green0\\blue0;}\r\n");
    for (qint64 i = 0; i < lines; ++i) {
        bytes += i % 4 == 0 ? "\\pard\\plain\\ltrpar\\qr\\li360\\sb120 " : "\\pard\\plain\\ltrpar\\ql\\li0\\sb0 ";
        bytes +=
            "{\\rtlch\\fcs1\\af0\\ltrch\\fcs0\\f0\\fs20\\b\\insrsid1 Point P75954}{\\rtlch\\fcs1\\af0\\ltrch\\fcs0\\f0\\fs20\\insrsid2 "
            "  which was measured twice: northing 6295.3311, easting 16603.3967, }{\\i elevation 108.584 }"
            "{\\cf1\\f1 at 12\\'b0 34\\'92}\\par\r\n";
    }
    return bytes + "}";
}

void read(benchmark::State &state, const QByteArray &bytes)
{
    const ProcessorTime time;
    for (auto _ : state) {
        QTextDocument document;
        if (kareport::readRichText(QByteArrayView(bytes), document) || document.blockCount() != state.range(0)) {
            state.SkipWithError("lines were lost");
        }
    }
    state.SetBytesProcessed(state.iterations() * bytes.size());
    time.report(state, static_cast<double>(bytes.size()));
}

void write(benchmark::State &state, const QByteArray &bytes)
{
    QTextDocument document;
    if (kareport::readRichText(QByteArrayView(bytes), document)) {
        state.SkipWithError("lines were lost");
    }
    qint64 size = 0;
    const ProcessorTime time;
    for (auto _ : state) {
        QBuffer buffer;
        buffer.open(QIODevice::WriteOnly);
        if (!kareport::writeRichText(buffer, document)) {
            state.SkipWithError("writing failed");
        }
        size = buffer.size();
    }
    state.SetBytesProcessed(state.iterations() * size);
    time.report(state, static_cast<double>(size));
}

// Compare the bytes a second at N and 10 N.

void readReportImage(benchmark::State &state)
{
    read(state, reportImage(state.range(0)));
}
BENCHMARK(readReportImage)->Arg(30'000)->Arg(300'000)->Unit(benchmark::kMillisecond);

void readFormattedText(benchmark::State &state)
{
    read(state, formattedText(state.range(0)));
}
BENCHMARK(readFormattedText)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);

void writeReport(benchmark::State &state)
{
    write(state, reportImage(state.range(0)));
}
BENCHMARK(writeReport)->Arg(30'000)->Arg(300'000)->Unit(benchmark::kMillisecond);

void writeFormattedText(benchmark::State &state)
{
    write(state, formattedText(state.range(0)));
}
BENCHMARK(writeFormattedText)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);

/// Fonts and tab stops that differ in each line: they look alike until they are compared one by one.
void readManyFormats(benchmark::State &state)
{
    QByteArray bytes("{\\rtf1{\\fonttbl");
    QByteArray lines;
    for (qint64 i = 0; i < state.range(0); ++i) {
        const QByteArray number = QByteArray::number(i);
        bytes += "{\\f" + number + " F" + number + ";}";
        // Tab stops are limited to the width of a page.
        lines += i == 0 ? "" : "\\par";
        lines += "\\pard\\tx" + QByteArray::number(i % 300) + "\\tx" + QByteArray::number(300 + 15 * (i / 300)) +
                 "\\f" + number + " x";
    }
    read(state, bytes + "}" + lines + "}");
}
BENCHMARK(readManyFormats)->Arg(6'000)->Arg(60'000)->Unit(benchmark::kMillisecond);

} // namespace
