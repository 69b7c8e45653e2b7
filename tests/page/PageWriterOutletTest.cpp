#include "PageWriter.h"

#include "LimitedMemory.h"
#include "PrintQt.h"
#include "ReportTextCodec.h"

#include <QBuffer>

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>

// Text that is handed on while it is written.

namespace
{

using kareport::LineEnds;
using kareport::PageWriter;
using kareport::ReportTextWriter;

/// Takes so many bytes and no more.
class FullDevice : public QIODevice
{
public:
    explicit FullDevice(qint64 room) : room_(room) { open(QIODevice::WriteOnly | QIODevice::Unbuffered); }
    int calls = 0;

protected:
    qint64 readData(char * /*data*/, qint64 /*size*/) override { return -1; }
    qint64 writeData(const char * /*data*/, qint64 size) override
    {
        ++calls;
        room_ -= size;
        return room_ >= 0 ? size : -1;
    }

private:
    qint64 room_;
};

struct Row
{
    std::function<void(PageWriter &)> write;
    const char *reason;
};

std::vector<Row> reports()
{
    const QString line(79, u'x');
    return {
        {[](PageWriter &) {}, "nothing"},
        {[](PageWriter &writer) { writer.writeLine(u"one", 0, 1, 0); }, "a line"},
        {[=](PageWriter &writer) {
             for (int i = 0; i < 20'000; ++i) {
                 writer.writeLine(line, 0, 1, 0);
             }
         },
         "1.6 MB of lines: several pieces"},
        {[=](PageWriter &writer) {
             for (int i = 0; i < 20'000; ++i) {
                 writer.writeLine(line + (i % 1000 == 999 ? QStringLiteral("漢😀é") : QString()), 0, 1, 0);
             }
         },
         "characters of every length"},
        {[](PageWriter &writer) {
             // One character more each time, so that pieces end at every place of the pair.
             for (int i = 0; i < 30; ++i) {
                 writer.write(QString(256 * 1024 - i, u'x'), 0);
                 writer.write(u"\xD83D", 0);
                 writer.write(u"\xDE00\r", 0);
                 writer.write(u"\n", 0);
             }
         },
         "pairs and line ends that a piece cuts in two"},
        {[](PageWriter &writer) { writer.write(QString(3'000'000, u'é'), 0); }, "one piece that is longer than any"},
        {[](PageWriter &writer) { writer.lineFeed(400'000); }, "nothing but line ends"},
        {[](PageWriter &writer) {
             writer.setHeaderFlag(true);
             writer.setHeaderLine(QStringLiteral("TALVEN"));
             writer.setHeading({QStringLiteral("Heading"), 1, 2});
             for (int i = 0; i < 50'000; ++i) {
                 writer.writeLine(u"row", i % 7 == 0 ? 1 : 0, 1, 0);
             }
             writer.newPage(-1);
         },
         "pages with headers and headings"},
    };
}

TEST(PageWriterOutlet, GetsTheTextThatIsOtherwiseKept)
{
    for (const LineEnds lineEnds : {LineEnds::ReportFile, LineEnds::PlainText}) {
        for (const Row &row : reports()) {
            PageWriter kept;
            row.write(kept);
            QBuffer expected;
            expected.open(QIODevice::WriteOnly);
            ASSERT_TRUE(kareport::writeReportText(expected, kept.text().view(), lineEnds));

            QBuffer got;
            got.open(QIODevice::WriteOnly);
            ReportTextWriter outlet(got, lineEnds);
            PageWriter writer;
            writer.setOutlet(&outlet);
            row.write(writer);
            EXPECT_TRUE(writer.emptyIntoOutlet()) << row.reason;
            EXPECT_TRUE(outlet.finish()) << row.reason;
            EXPECT_EQ(got.data(), expected.data()) << row.reason;
            EXPECT_EQ(outlet.isEmpty(), kept.text().isEmpty()) << row.reason;
            EXPECT_FALSE(writer.hasLostText()) << row.reason;
            EXPECT_EQ(writer.lineNumber(), kept.lineNumber()) << row.reason;
            EXPECT_EQ(writer.lineCount(), kept.lineCount()) << row.reason;
            EXPECT_EQ(writer.pageNumber(), kept.pageNumber()) << row.reason;
        }
    }
}

TEST(PageWriterOutlet, AReportMayBeLongerThanThereIsMemory)
{
    const auto writeAll = [](PageWriter &writer) {
        for (int i = 0; i < 100'000; ++i) {
            writer.writeLine(QString(99, u'x'), 0, 1, 0);
        }
    };
    PageWriter kept;
    writeAll(kept);
    QBuffer expected;
    expected.open(QIODevice::WriteOnly);
    ASSERT_TRUE(kareport::writeReportText(expected, kept.text().view(), LineEnds::PlainText));

    const LimitedMemory memory(1'000'000);
    QBuffer got;
    got.open(QIODevice::WriteOnly);
    ReportTextWriter outlet(got, LineEnds::PlainText);
    PageWriter writer(nullptr, &LimitedMemory::reallocate);
    writer.setOutlet(&outlet);
    writeAll(writer);
    EXPECT_TRUE(writer.emptyIntoOutlet());
    EXPECT_FALSE(writer.hasLostText());
    EXPECT_TRUE(got.data() == expected.data());

    PageWriter keeping(nullptr, &LimitedMemory::reallocate);
    writeAll(keeping);
    EXPECT_TRUE(keeping.hasLostText()) << "without the outlet the same text does not fit";
}

TEST(PageWriterOutlet, WhatFailsIsRememberedAndNothingMoreIsWritten)
{
    FullDevice device(500'000);
    ReportTextWriter outlet(device, LineEnds::PlainText);
    PageWriter writer;
    writer.setOutlet(&outlet);
    int lines = 0;
    while (!outlet.hasFailed() && lines < 1'000'000) {
        writer.writeLine(QString(99, u'x'), 0, 1, 0);
        ++lines;
    }
    EXPECT_TRUE(outlet.hasFailed());
    EXPECT_LT(lines, 10'000) << "it shows before a megabyte more was made";
    const int calls = device.calls;
    for (int i = 0; i < 10'000; ++i) {
        writer.writeLine(QString(99, u'x'), 0, 1, 0);
    }
    EXPECT_EQ(device.calls, calls) << "what comes after a gap is not written";
    EXPECT_FALSE(writer.emptyIntoOutlet());
    EXPECT_FALSE(outlet.finish());
}

TEST(PageWriterOutlet, WithoutOneTheTextIsKept)
{
    QBuffer got;
    got.open(QIODevice::WriteOnly);
    ReportTextWriter outlet(got, LineEnds::PlainText);
    PageWriter writer;
    writer.setOutlet(&outlet);
    writer.write(u"handed on", 0);
    EXPECT_TRUE(writer.emptyIntoOutlet());
    writer.setOutlet(nullptr);
    writer.write(QString(1'000'000, u'k'), 0);
    EXPECT_EQ(writer.text().size(), 1'000'000);
    EXPECT_EQ(got.data(), "handed on");
}

} // namespace
