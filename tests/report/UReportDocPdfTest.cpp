#include "FrameFixture.h"
#include "ReportFixture.h"

#include "PdfExport.h"
#include "PdfReadBack.h"

#include <QBuffer>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <functional>
#include <vector>

namespace
{

/// A measured report of a few lines.
class PrintedReport : public UReportDoc
{
public:
    PrintedReport()
    {
        FixPage(10, 80);
        SetPageSize();
        SetData(QStringLiteral("one\r\ntwo\r\n"));
    }
};

std::string pdfOf(const UReportDoc &report)
{
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    EXPECT_TRUE(report.WritePdf(file));
    return file.data().toStdString();
}

std::string pdfOf(const UReportDoc &report, const kareport::PdfPageSetup &page)
{
    kareport::PdfOptions options;
    options.page = page;
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    EXPECT_TRUE(kareport::writePdf(file, report.GetText(), options));
    return file.data().toStdString();
}

TEST(UReportDocPdf, ThePageOfTheReportIsTheOneThatIsWritten)
{
    // An A4 sheet at 600 dots an inch, and the margins and the size that a report has at first.
    const kareport::PdfPageSetup usual{QSize(4961, 7016), 600, QMargins(1000, 1000, 1200, 2000), 8, 10};
    const auto changed = [&usual](const std::function<void(kareport::PdfPageSetup &)> &change) {
        kareport::PdfPageSetup page = usual;
        change(page);
        return page;
    };
    struct Row
    {
        std::function<void(UReportDoc &)> change;
        kareport::PdfPageSetup page;
        bool differs;
        const char *reason;
    };
    const Row rows[] = {
        {[](UReportDoc &) {}, usual, false, "as it is"},
        {[](UReportDoc &report) { report.SetMargins(QMargins(1270, 100, 200, 300)); },
         changed([](auto &page) { page.margins = QMargins(1270, 100, 200, 300); }), true, "margins"},
        {[](UReportDoc &report) { report.SetFontSize(14); }, changed([](auto &page) { page.fontSize = 14; }), true,
         "font size"},
        {[](UReportDoc &report) { report.FixPage(1, 80); }, changed([](auto &page) { page.linesPerPage = 1; }), true,
         "lines of a page"},
        {[](UReportDoc &report) {
             report.LineFeed(35);
             report.SetData(QStringLiteral("one\r\ntwo\r\n"));
         },
         usual, false, "lines that were counted are not those of the text as it is now"},
        {[](UReportDoc &report) {
             kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::Letter, 300});
             report.SetPageSize();
         },
         changed([](auto &page) {
             page.pageSize = QSize(2550, 3300);
             page.resolution = 300;
         }),
         true, "sheet and resolution"},
    };
    const FixedSurroundings surroundings;
    const std::string first = pdfOf(PrintedReport());
    for (const Row &row : rows) {
        kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::A4, 600});
        PrintedReport report;
        row.change(report);
        const std::string pdf = pdfOf(report);
        EXPECT_TRUE(pdf == pdfOf(report, row.page)) << row.reason;
        EXPECT_EQ(pdf != first, row.differs) << row.reason;
    }
}

TEST(UReportDocPdf, WideTextsAndEmptyOnesAreWrittenAsWell)
{
    const FixedSurroundings surroundings;
    for (const QString &text : {QString(), QStringLiteral(u"\u0416 \u03A9\r\n")}) {
        PrintedReport report;
        report.SetData(text);
        const kareport::PdfPageSetup page{QSize(4961, 7016), 600, QMargins(1000, 1000, 1200, 2000), 8, 10};
        EXPECT_TRUE(pdfOf(report) == pdfOf(report, page)) << text.toStdString();
    }
}

TEST(UReportDocPdf, NeitherTheTextNorTheModifiedFlagChanges)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.pdf"));
    for (const bool modified : {true, false}) {
        PrintedReport report;
        report.SetModifiedFlag(modified);
        EXPECT_TRUE(report.OnSaveDocument(path));
        EXPECT_EQ(report.IsModified(), modified);
        EXPECT_EQ(textOf(report), QStringLiteral("one\r\ntwo\r\n"));
        EXPECT_TRUE(contentOf(path) == pdfOf(report));
    }
}

TEST(UReportDocPdf, WithoutAMeasuredPageThereIsNone)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.pdf"));
    putFile(path, "earlier");
    UReportDoc report;
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    ASSERT_EQ(report.GetPrintResolution(), 0U);
    EXPECT_FALSE(report.OnSaveDocument(path));
    EXPECT_EQ(contentOf(path), "earlier");
    kareport::PdfNotes notes;
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    EXPECT_FALSE(report.WritePdf(file, &notes));
    EXPECT_EQ(file.data().size(), 0);
    EXPECT_FALSE(notes.problem.isEmpty()) << "and it says why";
}

TEST(UReportDocPdf, TheProgressIsToldAndCanStopIt)
{
    const FixedSurroundings surroundings;
    PrintedReport report;
    report.FixPage(1, 80);
    for (const bool goesOn : {true, false}) {
        QBuffer file;
        file.open(QIODevice::WriteOnly);
        std::vector<qint64> pages;
        EXPECT_EQ(report.WritePdf(file, nullptr,
                                  [&](qint64 done, qint64) {
                                      pages.push_back(done);
                                      return goesOn;
                                  }),
                  goesOn);
        EXPECT_EQ(pages, goesOn ? (std::vector<qint64>{1, 2}) : std::vector<qint64>{1});
    }
}

TEST(UReportDocPdf, WhatIsMissingIsTold)
{
    const FixedSurroundings surroundings;
    PrintedReport report;
    report.SetData(QStringLiteral(u"a\r\nb\U000F0000\r\n"));
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    kareport::PdfNotes notes;
    EXPECT_TRUE(report.WritePdf(file, &notes));
    ASSERT_EQ(notes.missing.size(), 1U) << "a character for private use";
    EXPECT_EQ(notes.missing[0].character, U'\U000F0000');
    EXPECT_EQ(notes.missing[0].firstLine, 2);
}

TEST(UReportDocPdf, AnOpenedRichTextIsWrittenAsItIsRead)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rtf"));
    putFile(path, "{\\rtf1\\ansi\\ansicpg1251 {\\b \xCF\xF0\xE8}\\par second}");
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetAutoDelete(false);
    ASSERT_TRUE(report.OnOpenDocument(path));
    const QString pdf = folder.filePath(QStringLiteral("a.pdf"));
    ASSERT_TRUE(report.OnSaveDocument(pdf));
    const QString text = PdfReadBack(QByteArray::fromStdString(contentOf(pdf))).pages().join(u'\n');
    EXPECT_TRUE(text.contains(QStringLiteral("При"))) << text.toStdString();
    EXPECT_TRUE(text.contains(QStringLiteral("second"))) << text.toStdString();
    EXPECT_FALSE(text.contains(QStringLiteral("rtf1"))) << "the text, not its source";
}

} // namespace
