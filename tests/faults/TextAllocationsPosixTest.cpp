#include "ReportSubject.h"

#include "LoadedText.h"
#include "ReportTextCodec.h"
#include "RichTextReader.h"
#include "SingleByteText.h"

#include <QBuffer>

#include <gtest/gtest.h>

namespace
{

using kareport::LoadedText;
using kareport::TextLoading;

QString textOf(const LoadedText &loaded)
{
    return loaded.text.piece(0, loaded.text.size());
}

TEST(TextAllocations, AReportFileIsReadWholeOrNot)
{
    struct Row
    {
        TextLoading (*load)(QByteArrayView bytes, LoadedText &loaded);
        QByteArray bytes;
    };
    const FixedSurroundings surroundings;
    const QByteArray header = headerOf(QStringLiteral("Title"), 1).toUtf8() + "\r\r\n";
    const QByteArray wide = "\xEF\xBB\xBF" + header +
                            (QByteArray("a line \xE6\xB8\xAC ") + QByteArray(300, 'x') + "\r\r\n").repeated(1000) +
                            header;
    const auto report = [](QByteArrayView bytes, LoadedText &loaded) { return loadReportText(bytes, loaded); };
    const auto plain = [](QByteArrayView bytes, LoadedText &loaded) { return loadPlainText(bytes, loaded); };
    const Row rows[] = {
        {report, wide},
        {report, "\xEF\xBB\xBF" + header + (QByteArray(300, 'x') + "\r\r\n").repeated(1000)},
        {plain, wide},
    };
    for (const Row &row : rows) {
        LoadedText whole;
        ASSERT_EQ(row.load(row.bytes, whole), TextLoading::Whole);
        ASSERT_FALSE(whole.pageStarts.empty());
        EXPECT_GT(failingEachAllocation([&](qint64 number) {
                      LoadedText loaded;
                      auto answer = TextLoading::Stopped;
                      bool hasFailed = false;
                      {
                          const FailingAllocation failing(number);
                          EXPECT_NO_THROW(answer = row.load(row.bytes, loaded)) << number;
                          hasFailed = failing.hasFailed();
                      }
                      EXPECT_TRUE(answer == TextLoading::Whole || (hasFailed && answer == TextLoading::NoMemory))
                          << number;
                      if (answer == TextLoading::Whole) {
                          EXPECT_TRUE(textOf(loaded) == textOf(whole)) << number;
                          EXPECT_EQ(loaded.pageStarts, whole.pageStarts) << number;
                          EXPECT_EQ(loaded.linesPerPage, whole.linesPerPage) << number;
                          EXPECT_EQ(loaded.lineEnds, whole.lineEnds) << number;
                      }
                      return hasFailed && !testing::Test::HasFailure();
                  }),
                  2);
    }
}

TEST(TextAllocations, WhatIsNotWrittenWholeIsSaid)
{
    struct Row
    {
        const char *name;
        bool (*write)(QIODevice &device, const QString &text);
    };
    using kareport::LineEnds;
    using kareport::WideCharacters;
    const Row rows[] = {
        {"report file",
         [](QIODevice &device, const QString &text) {
             return kareport::writeReportText(device, QStringView(text), LineEnds::ReportFile);
         }},
        {"report file, one byte a character",
         [](QIODevice &device, const QString &) {
             static const QByteArray narrow = QByteArray("a line\r\n").repeated(20000);
             return kareport::writeReportText(device, QLatin1StringView(narrow), LineEnds::PlainText);
         }},
        {"rich text",
         [](QIODevice &device, const QString &text) {
             return kareport::writeSingleByteText(device, text, WideCharacters::RichTextEscape);
         }},
        {"bytes",
         [](QIODevice &device, const QString &text) {
             return kareport::writeSingleByteText(device, text, WideCharacters::QuestionMark);
         }},
    };
    const QString text = QStringLiteral("a line\n").repeated(30000) + QStringLiteral("\u6E2C\n");
    for (const Row &row : rows) {
        QBuffer whole;
        whole.open(QIODevice::WriteOnly);
        ASSERT_TRUE(row.write(whole, text)) << row.name;
        // A device in memory needs more of it with every piece.
        EXPECT_GE(failingEachAllocation([&](qint64 number) {
                      QBuffer device;
                      device.open(QIODevice::WriteOnly);
                      bool isWritten = false;
                      bool hasFailed = false;
                      {
                          const FailingAllocation failing(number);
                          EXPECT_NO_THROW(isWritten = row.write(device, text)) << row.name << ' ' << number;
                          hasFailed = failing.hasFailed();
                      }
                      EXPECT_EQ(isWritten, device.data() == whole.data()) << row.name << ' ' << number;
                      return hasFailed && !testing::Test::HasFailure();
                  }),
                  2)
            << row.name;
    }
}

TEST(TextAllocations, RichTextIsReadWholeOrItIsSaid)
{
    // In the code page that is read without a converter: the system takes one that it has no memory for for one that it does
    // not know.
    const QByteArray bytes =
        "{\\rtf1\\ansi\\ansicpg1252{\\fonttbl{\\f0\\fcharset0 Arial;}{\\f1\\fcharset2 Symbol;}}"
        "{\\colortbl;\\red255\\green0\\blue0;}" +
        QByteArray("a \\b line\\b0\\'e1\\u8486? {\\f1\\'61}\\tab{\\v hidden}\\par\r\n").repeated(50) +
        "{\\trowd\\cellx100 cell\\cell\\row}{\\pict 00}}";
    QString whole;
    kareport::RichTextNotes wholeNotes;
    ASSERT_FALSE(kareport::readRichTextCharacters(bytes, whole, &wholeNotes));
    ASSERT_FALSE(wholeNotes.texts().isEmpty());
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        QString text;
        kareport::RichTextNotes notes;
        std::optional<kareport::RichTextError> error;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number);
            EXPECT_NO_THROW(error = kareport::readRichTextCharacters(bytes, text, &notes)) << number;
            hasFailed = failing.hasFailed();
        }
        EXPECT_TRUE(error || (text == whole && notes.texts() == wholeNotes.texts()))
            << number << ": " << text.left(200).toStdString();
        if (error) {
            EXPECT_EQ(error->text, QStringLiteral("there is not enough memory for it")) << number;
            EXPECT_TRUE(whole.startsWith(text)) << number << ": what was read up to there";
        }
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GT(allocations, 5);
}

} // namespace
