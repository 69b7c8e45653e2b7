#include "DeskFixture.h"

#include "PageHeader.h"
#include "PdfReadBack.h"
#include "ReportEdit.h"
#include "ReportPages.h"
#include "ReportViewWidget.h"
#include "SavedReports.h"
#include "UReportView.h"

#include <QBuffer>
#include <QFile>
#include <QTextBlock>

#include <gtest/gtest.h>

#include <algorithm>

namespace
{

QString header(int page)
{
    return kareport::pageHeaderLine(QStringLiteral("TALVEN"), QStringLiteral("T"),
                                    QDateTime(QDate(2024, 3, 5), QTime(14, 7)), QStringLiteral("   Page:"), 80) +
           QString::number(page).rightJustified(3);
}

/// Three pages of seven lines; a line was put into the second one since.
QStringList savedLines()
{
    QStringList lines;
    for (int page = 1; page <= 3; ++page) {
        lines += {header(page), QString(), QString(), QString(), QStringLiteral("a"), QStringLiteral("b")};
        lines += page == 2 ? QStringList{QStringLiteral("c"), QString()} : QStringList{QString()};
    }
    return lines;
}

TEST(SavedReportPages, AReopenedReportHasThePagesThatItWasWrittenIn)
{
    const JobFolder files;
    files.put("a.rep", "\xEF\xBB\xBF" + savedLines().join(QStringLiteral("\r\r\n")).toUtf8());
    files.put("cr.rep", savedLines().join(QStringLiteral("\r\r\n")).toUtf8()); // a text with returns in it
    files.put("a.rtf", ("{\\rtf1\\ansi{\\fonttbl{\\f0 Courier;}}\\f0 " + savedLines().join(QStringLiteral("\\par\n")) +
                        QStringLiteral("\\par}"))
                           .toLatin1());
    Desk desk;
    desk.answer = MessageAnswer::No;
    for (const char *name : {"a.rep", "cr.rep", "a.rtf"}) {
        UReportDoc *report = kareport::openSavedReport(files.path(name));
        ASSERT_NE(report, nullptr) << name;
        for (int turn = 0; turn < 2; ++turn) {
            EXPECT_EQ(report->GetPages().size(), 3U) << name << ", turn " << turn;
            EXPECT_EQ(report->GetLinesPerPage(), 7) << name << ": what most pages have";
            EXPECT_TRUE(report->IsPageFixed()) << name;
            auto *view = dynamic_cast<UReportView *>(report->GetViews().front());
            ASSERT_NE(view, nullptr);
            auto *widget = static_cast<kareport::ReportViewWidget *>(view->GetWidget());
            EXPECT_EQ(widget->pageCount(), 3) << name;
            widget->goToPage(3);
            EXPECT_EQ(widget->edit().textCursor().block().text(), header(3)) << name;
            ASSERT_TRUE(kareport::reloadSavedReport(*report)) << name;
        }
    }
}

TEST(SavedReportPages, ThePdfOfAReopenedRichTextHasThem)
{
    const JobFolder files;
    files.put("a.rtf", ("{\\rtf1\\ansi{\\fonttbl{\\f0 Courier;}}\\f0 " + savedLines().join(QStringLiteral("\\par\n")) +
                        QStringLiteral("\\par}"))
                           .toLatin1());
    Desk desk;
    desk.answer = MessageAnswer::No;
    UReportDoc *report = kareport::openSavedReport(files.path("a.rtf"));
    ASSERT_NE(report, nullptr);
    report->FixPage(40, 80); // by counting, all lines would be on one page
    QBuffer pdf;
    pdf.open(QIODevice::WriteOnly);
    ASSERT_TRUE(report->WritePdf(pdf));
    const QStringList pages = PdfReadBack(pdf.data()).pages();
    ASSERT_EQ(pages.size(), 3);
    for (int page = 1; page <= 3; ++page) {
        EXPECT_EQ(pages[page - 1].trimmed().section(u'\n', 0, 0).simplified(), header(page).simplified());
    }
}

TEST(SavedReportPages, AReloadedReportKeepsAPageLengthThatItsTextDoesNotTell)
{
    const JobFolder files;
    files.put("a.rep", "one\r\r\ntwo\r\r\nthree\r\r\n");
    Desk desk;
    desk.answer = MessageAnswer::No;
    UReportDoc *report = kareport::openSavedReport(files.path("a.rep"));
    ASSERT_NE(report, nullptr);
    EXPECT_FALSE(report->IsPageFixed()) << "as measured";
    report->FixPage(2, 80);
    ASSERT_TRUE(kareport::reloadSavedReport(*report));
    EXPECT_EQ(report->GetLinesPerPage(), 2);
    EXPECT_EQ(report->GetPages().size(), 2U);
}

TEST(SavedReportPages, APageLengthThatTheTextToldGoesWithTheText)
{
    const JobFolder files;
    files.put("a.rep", "\xEF\xBB\xBF" + savedLines().join(QStringLiteral("\r\r\n")).toUtf8());
    Desk desk;
    desk.answer = MessageAnswer::No;
    UReportDoc *report = kareport::openSavedReport(files.path("a.rep"));
    ASSERT_NE(report, nullptr);
    ASSERT_TRUE(report->IsPageFixed());
    files.put("a.rep", "\xEF\xBB\xBFone\r\r\ntwo\r\r\n");
    ASSERT_TRUE(kareport::reloadSavedReport(*report));
    EXPECT_FALSE(report->IsPageFixed()) << "as if it were opened now";
}

TEST(SavedReportPages, ReturnsWithinLinesDoNotHoldAPageLengthOfAnOlderText)
{
    QStringList lines = savedLines();
    std::replace(lines.begin(), lines.end(), QStringLiteral("a"), QStringLiteral("a\rz"));
    const JobFolder files;
    files.put("a.rep", "\xEF\xBB\xBF" + lines.join(QStringLiteral("\r\r\n")).toUtf8());
    Desk desk;
    desk.answer = MessageAnswer::No;
    UReportDoc *report = kareport::openSavedReport(files.path("a.rep"));
    ASSERT_NE(report, nullptr);
    ASSERT_EQ(report->GetLinesPerPage(), 7);
    files.put("a.rep", "\xEF\xBB\xBFone\r\r\ntwo\r\r\n");
    ASSERT_TRUE(kareport::reloadSavedReport(*report));
    EXPECT_FALSE(report->IsPageFixed()) << "as if it were opened now";
}

TEST(SavedReportText, OpensAsTheGuideAndTheManualPageSay)
{
    const QString text = QStringLiteral("TALVEN  \u00E9 \u4E2D \U0001F600\r\n\r\n  two  blanks\tand a tab \r\n") +
                         QStringLiteral("1\u00A0234\r\n\r\n\r\n").repeated(3) + QStringLiteral("the last line\r\n");
    const JobFolder files;
    const QString path = files.path("a.rep");
    Desk desk;
    desk.answer = MessageAnswer::No;
    UReportDoc *report = CreateReport(QStringLiteral("R"), false, false, nullptr, 0, nullptr);
    report->SetData(text);
    ASSERT_TRUE(report->OnSaveDocument(path));
    for (int turn = 1; turn <= 2; ++turn) {
        UReportDoc *opened = kareport::openSavedReport(path);
        ASSERT_NE(opened, nullptr);
        EXPECT_EQ(opened->CopyText(), text) << "opened " << turn << " times";
        ASSERT_TRUE(opened->OnSaveDocument(path));
        opened->OnCloseDocument();
    }
    for (const char *page : {"/../docs/guide-desk.md", "/../docs/kareport-desk.1"}) {
        QFile file(QStringLiteral(KAREPORT_TEST_DIR) + QLatin1StringView(page));
        ASSERT_TRUE(file.open(QIODevice::ReadOnly)) << page;
        EXPECT_TRUE(file.readAll().contains("opens as it was when it was saved")) << page;
    }
}

} // namespace
