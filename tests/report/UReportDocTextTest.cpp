#include "ReportFixture.h"

#include "LoadedText.h"
#include "PageMeasurement.h"
#include "Preferences.h"
#include "ReportAccess.h"

#include <gtest/gtest.h>

namespace
{

/// A report "T" on pages of 72 lines of 80 characters.
class TextReport
{
public:
    explicit TextReport(bool header = false) : report(QStringLiteral("T"), false, false, nullptr)
    {
        report.FixPage(72, 80);
        report.SetHeaderFlag(header);
    }

private:
    FixedSurroundings surroundings_;

public:
    UReportDoc report;
};

const QString line = QStringLiteral("x");

TEST(UReportDocText, TheFirstLineBeginsPageOneWithItsHeader)
{
    TextReport t(true);
    t.report.WriteLine(line, 3, 1, 0);
    const QString header = headerOf(QStringLiteral("T"), 1);
    EXPECT_TRUE(header.endsWith(u"Page:  1"));
    EXPECT_EQ(header.size(), 73) << "seven characters less than the row";
    EXPECT_EQ(textOf(t.report), reportLines(header + QStringLiteral("\n\n\n\nx\n")));
    EXPECT_EQ(t.report.GetPageNumber(), 1);
    EXPECT_EQ(t.report.GetLineNumber(), 6) << "the first line is the page's fifth";
    EXPECT_EQ(t.report.GetLineCount(), 5);

    t.report.NewPage(-1);
    t.report.Clear();
    EXPECT_EQ(textOf(t.report), QString());
    t.report.WriteLine(line, 3, 1, 0);
    EXPECT_EQ(textOf(t.report), reportLines(header + QStringLiteral("\n\n\n\nx\n"))) << "the same after clearing";
}

TEST(UReportDocText, AtLine70ALineWithOneBeforeFitsAndAt71ItBreaksThePage)
{
    for (const int lineNumber : {70, 71}) {
        TextReport t;
        t.report.WriteLine(line, 0, 1, 0);
        t.report.LineFeed(lineNumber - 2);
        ASSERT_EQ(t.report.GetLineNumber(), lineNumber);
        const qsizetype size = t.report.GetText().size();
        t.report.WriteLine(line, 1, 0, 0);
        const QString expected = lineNumber == 70 ? QStringLiteral("\nx") : QStringLiteral("\n\nx");
        EXPECT_EQ(t.report.GetText().sliced(size).toString(), reportLines(expected)) << lineNumber;
        EXPECT_EQ(t.report.GetPageNumber(), lineNumber == 70 ? 1 : 2) << lineNumber;
        EXPECT_EQ(t.report.GetLineNumber(), lineNumber == 70 ? 71 : 1) << lineNumber;
    }
}

TEST(UReportDocText, ANegativeCountAlwaysBreaksThePage)
{
    TextReport t(true);
    EXPECT_TRUE(t.report.NewPage(-1));
    EXPECT_TRUE(t.report.NewPage(-1)) << "the page is empty below its header";
    EXPECT_EQ(textOf(t.report), reportLines(headerOf(QStringLiteral("T"), 1) + QString(4 + 68, u'\n') +
                                            headerOf(QStringLiteral("T"), 2) + QString(4, u'\n')));
    EXPECT_EQ(t.report.GetPageNumber(), 2);
}

TEST(UReportDocText, AHeadingWithALineFeedCountsOneLineMoreThanItPuts)
{
    TextReport t(true);
    t.report.SetHeading(reportLines(QStringLiteral("Point\nNumber")), 0, 2);
    t.report.NewPage(0);
    const qsizetype lines = t.report.GetText().toString().count(u'\n');
    EXPECT_EQ(lines, 7);
    EXPECT_EQ(t.report.GetLineNumber(), 1 + 7 + 1);
    EXPECT_EQ(t.report.GetLineCount(), 7 + 1);
}

TEST(UReportDocText, WritingWithoutLineFeedsLeavesTheCounters)
{
    TextReport t;
    t.report.WriteLine(line, 0, 1, 0);
    EXPECT_TRUE(t.report.Write(QStringLiteral("a long text without an end"), 1));
    EXPECT_EQ(t.report.GetLineNumber(), 2);
    EXPECT_EQ(t.report.GetLineCount(), 1);
    EXPECT_TRUE(t.report.Write(QString(), 0));
    EXPECT_EQ(textOf(t.report), reportLines(QStringLiteral("x\na long text without an end")));
}

TEST(UReportDocText, GrowingPast32000CharactersKeepsEveryCharacter)
{
    TextReport t;
    QString expected;
    for (int i = 0; expected.size() < 100000; ++i) {
        const QString piece = QStringLiteral("line %1 of many").arg(i);
        ASSERT_TRUE(t.report.Write(piece, 0));
        t.report.LineFeed(1);
        expected += piece + QStringLiteral("\r\n");
    }
    EXPECT_TRUE(textOf(t.report) == expected);
    EXPECT_TRUE(QString::fromUtf16(t.report.GetData()) == expected) << "ended by a character 0";
}

TEST(UReportDocText, RoomIsMadeWithoutChangingTheText)
{
    TextReport t;
    t.report.Write(line, 0);
    for (const int required : {-1, 0, 1, 32000, 32001, 200000}) {
        EXPECT_NE(t.report.CheckSize(required), 0) << required;
    }
    EXPECT_EQ(textOf(t.report), line);
}

TEST(UReportDocText, SettingTheTextLeavesTheCounters)
{
    TextReport t;
    t.report.WriteLine(line, 0, 1, 0);
    t.report.LineFeed(69);
    ASSERT_EQ(t.report.GetLineNumber(), 71);
    t.report.SetData(QStringLiteral("new\r\ntext\r\n"));
    EXPECT_EQ(textOf(t.report), QStringLiteral("new\r\ntext\r\n"));
    EXPECT_EQ(t.report.GetLineNumber(), 71);
    EXPECT_EQ(t.report.GetLineCount(), 70);
    EXPECT_EQ(t.report.GetPageNumber(), 1);
    t.report.WriteLine(line, 1, 1, 0);
    EXPECT_EQ(textOf(t.report), reportLines(QStringLiteral("new\ntext\n\n\nx\n"))) << "the old page goes on and breaks";
    EXPECT_EQ(t.report.GetPageNumber(), 2);
    t.report.SetData(QString());
    EXPECT_EQ(textOf(t.report), QString());
    t.report.SetData(QStringLiteral("\n\r alone"));
    EXPECT_EQ(textOf(t.report), QStringLiteral("\n\r alone")) << "taken as it is";
}

TEST(UReportDocText, LinesAndHeadingsSetTheModifiedFlag)
{
    TextReport t;
    const auto modified = [&t] {
        const bool was = t.report.IsModified();
        t.report.SetModifiedFlag(false);
        return was;
    };
    EXPECT_FALSE(modified());
    t.report.WriteLine(line, 0, 1, 0);
    EXPECT_TRUE(modified());
    t.report.WriteHeading();
    EXPECT_TRUE(modified());
    t.report.WriteHeader();
    EXPECT_TRUE(modified());
    t.report.Clear();
    EXPECT_TRUE(modified());
    t.report.SetHeading(line, 1, 1);
    EXPECT_FALSE(modified()) << "nothing is written yet";
}

TEST(UReportDocText, TheHeadersTimeIsThatOfTheLastSetHeader)
{
    TextReport t(true);
    kareport::fixTime(QDateTime(QDate(2030, 12, 31), QTime(0, 5)));
    t.report.NewPage(0);
    EXPECT_EQ(textOf(t.report), reportLines(headerOf(QStringLiteral("T"), 1) + QStringLiteral("\n\n\n\n")))
        << "pages do not read the clock";
    SetApplicationTitle(QStringLiteral("TALVEN Survey"));
    t.report.Clear();
    t.report.SetHeader();
    t.report.NewPage(0);
    EXPECT_EQ(textOf(t.report),
              reportLines(
                  QStringLiteral("TALVEN Survey - T                       Dec 31, 2030  12:05AM    Page:  1\n\n\n\n")));
}

TEST(UReportDocText, AHeaderWithoutRoomHasItsDateOnTheLeft)
{
    TextReport t(true);
    t.report.FixPage(72, 5); // 5 - 10 - 20: a width of -25
    t.report.SetHeader();
    t.report.NewPage(0);
    EXPECT_EQ(textOf(t.report),
              reportLines(QStringLiteral("TALVEN - T Mar 05, 2024  02:07PM        Page:  1\n\n\n\n")));
}

TEST(UReportDocText, AReportWindowGetsEachPieceAsItIsWritten)
{
    TextReport t(true);
    auto *window = new TestReportWindow;
    t.report.SetReportWindow(window);
    t.report.SetHeading(QStringLiteral("Point"), 0, 1);
    t.report.WriteLine(line, 0, 2, 0);
    t.report.Write(QString(), 0);
    t.report.Write(QStringLiteral("a\r\nb"), 0);
    t.report.LineFeed(2);
    t.report.SetData(QStringLiteral("not written"));
    EXPECT_EQ(window->pieces,
              QStringList({headerOf(QStringLiteral("T"), 1), QStringLiteral("Point"), line, QStringLiteral("a\r\nb")}));
    t.report.SetReportWindow(nullptr);
    t.report.Write(line, 0);
    EXPECT_EQ(window->pieces.size(), 4) << "no longer linked";
    delete window;
}

TEST(UReportDocText, ThePageIsMeasuredOnTheDefaultPrinter)
{
    const FixedSurroundings surroundings;
    kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::Letter, 600});
    UReportDoc report;
    EXPECT_EQ(report.SetPageSize(), 1);
    EXPECT_EQ(report.GetPageSize(), QSize(5100, 6600));
    EXPECT_EQ(report.GetPrintResolution(), 600U);
    const kareport::FontExtents font = kareport::measureFont(QStringLiteral("Lucida Console"), 8, 600);
    EXPECT_EQ(report.GetLinesPerPage(), (6600 - 236 - 472) / (font.height + font.externalLeading));
    EXPECT_EQ(report.GetCharsPerRow(), (5100 - 236 - 283) / font.averageWidth);

    SetReportPrinterSetToPortrait(false);
    for (const bool portrait : {true, false}) {
        UPreviewDlg::SetModulePrinterOrientationPortrait(portrait);
        EXPECT_EQ(report.SetPageSize(), 1);
        EXPECT_EQ(report.GetPageSize(), QSize(6600, 5100)) << "the reports' own orientation counts";
        EXPECT_EQ(UPreviewDlg::IsModulePrinterOrientationPortrait(), portrait) << "and the module's is put back";
    }
    report.SetMargins(QMargins(0, 0, 0, 0));
    report.SetFontSize(16);
    EXPECT_EQ(report.GetLinesPerPage(), (5100 - 236 - 472) / (font.height + font.externalLeading))
        << "not measured again yet";
    EXPECT_EQ(report.SetPageSize(), 1);
    const kareport::FontExtents larger = kareport::measureFont(QStringLiteral("Lucida Console"), 16, 600);
    EXPECT_EQ(report.GetLinesPerPage(), 5100 / (larger.height + larger.externalLeading));
    EXPECT_EQ(report.GetCharsPerRow(), 6600 / larger.averageWidth);
}

TEST(UReportDocText, WithoutAPrinterThePageKeepsItsFigures)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    kareport::setDefaultPrinter({kareport::PrinterSource::None, kareport::PaperSize::A4, 600});
    SetReportPrinterSetToPortrait(false);
    EXPECT_EQ(report.SetPageSize(), 0);
    EXPECT_TRUE(UPreviewDlg::IsModulePrinterOrientationPortrait()) << "the orientation is put back";
    EXPECT_EQ(report.GetLinesPerPage(), 72);
    EXPECT_EQ(report.GetCharsPerRow(), 80);
    EXPECT_EQ(report.GetPrintResolution(), 0U);

    kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::Letter, 300});
    ASSERT_EQ(report.SetPageSize(), 1);
    const int lines = report.GetLinesPerPage();
    kareport::setDefaultPrinter({kareport::PrinterSource::None, kareport::PaperSize::A4, 600});
    EXPECT_EQ(report.SetPageSize(), 0);
    EXPECT_EQ(report.GetPrintResolution(), 300U) << "the last measurement";
    EXPECT_EQ(report.GetLinesPerPage(), lines);
}

TEST(UReportDocText, FixedFiguresOutliveAMeasurement)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.FixPage(60, 100);
    EXPECT_EQ(report.SetPageSize(), 1);
    EXPECT_EQ(report.GetLinesPerPage(), 60);
    EXPECT_EQ(report.GetCharsPerRow(), 100);
    report.FixPage(50, std::nullopt);
    EXPECT_EQ(report.SetPageSize(), 1);
    EXPECT_EQ(report.GetLinesPerPage(), 50);
    EXPECT_NE(report.GetCharsPerRow(), 100) << "measured again";
    report.NewPage(0);
    report.LineFeed(49);
    EXPECT_TRUE(report.NewPage(0)) << "the page rule counts with the fixed figure";
}

TEST(UReportDocText, ATextThatWasMadeElsewhereIsTakenOver)
{
    TextReport t;
    t.report.WriteLine(QStringLiteral("before"), 0, 1, 0);
    const int lines = t.report.GetLineCount();
    const quint64 edits = t.report.GetEditCount();
    t.report.SetModifiedFlag(false);
    kareport::LoadedText loaded;
    ASSERT_EQ(kareport::loadReportText("a\nb\nc", loaded), kareport::TextLoading::Whole);
    loaded.pageStarts = {0, 3};
    kareport::ReportAccess::takeText(t.report, loaded);
    EXPECT_EQ(textOf(t.report), QStringLiteral("a\r\nb\r\nc"));
    EXPECT_EQ(t.report.GetPageStarts(), (std::vector<qint64>{0, 3}));
    EXPECT_EQ(t.report.GetLineCount(), lines + 2);
    EXPECT_GT(t.report.GetEditCount(), edits) << "views are to load it";
    EXPECT_TRUE(t.report.IsModified());
    EXPECT_EQ(loaded.text.view().toString(), QStringLiteral("before\r\n"));
}

TEST(UReportDocText, LineFeedsInATextAreCountedWhereverTheyAre)
{
    for (qsizetype length = 0; length < 20; ++length) {
        for (qsizetype first = 0; first < length; ++first) {
            for (qsizetype second = first; second < length; ++second) {
                TextReport t;
                QString text(length, u'\u010A'); // whose low byte is a line feed's
                text[first] = u'\n';
                text[second] = u'\n';
                t.report.Write(text, 0);
                ASSERT_EQ(t.report.GetLineCount(), first == second ? 1 : 2) << length << ' ' << first << ' ' << second;
            }
        }
        TextReport t;
        t.report.Write(QString(length, u'\u000B'), 0);
        ASSERT_EQ(t.report.GetLineCount(), 0) << length;
    }
}

} // namespace
