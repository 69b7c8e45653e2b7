#include "ReportAllocations.h"

#include "FrameFixture.h"
#include "ReportInitialTemplate.h"
#include "ReportPages.h"
#include "ReportSurroundings.h"
#include "ReportTextCodec.h"
#include "UArchive.h"
#include "UXmlReportTpl.h"

#include <cstdio>
#include <iterator>
#include <string>

namespace
{

using Text = ReportOperation::Text;

const QString line = QStringLiteral("a line that is long enough to need memory of its own");
const QString wideLine = QStringLiteral("a line with \u6E2C in it");
const QString blocks(70000, u'x');

// What is not tried, because what is underneath does not survive it:
// - `SetPageSize` on a printer, and with it the making of a report where there is one: Qt's fonts are measured with fontconfig,
//   which does not look whether it got what it asked for, and Qt 6.4's own list of names, made of its members, does not
//   either.
// - `WritePdf` and saving as ".pdf" here: the faces of the document are looked for with fontconfig. PdfAllocations lets fail
//   what it does not ask for.
// - Rich text that is shown or read: QTextDocument and what lays it out.
constexpr ReportOperation operations[] = {
    {"Write", Text::Written, [](auto &s, auto &) { return s.report.Write(line, 0); }},
    {"Write, UTF-16", Text::Written, [](auto &s, auto &) { return s.report.Write(wideLine, 1); }},
    {"Write, a block", Text::Written, [](auto &s, auto &) { return s.report.Write(blocks, 1); }},
    {"Write, unknown style", Text::Written, [](auto &s, auto &) { return s.report.Write(line, 7); }},
    {"LineFeed", Text::Written,
     [](auto &s, auto &) {
         s.report.LineFeed(16000);
         return lostNothing(s);
     }},
    {"NewPage", Text::Written, [](auto &s, auto &) { return s.report.NewPage(-1) && lostNothing(s); }},
    {"WriteLine", Text::Written,
     [](auto &s, auto &) {
         s.report.WriteLine(line, 1, 2, 2);
         return lostNothing(s);
     }},
    {"WriteLine, a new page", Text::Written,
     [](auto &s, auto &) {
         s.report.WriteLine(line, -1, 1, 0);
         return lostNothing(s);
     }},
    {"AnnounceEntry", Text::Same,
     [](auto &s, auto &) {
         s.report.AnnounceEntry(1, QStringLiteral("an entry of the outline that is not a short one"));
         return true;
     }},
    {"WriteHeading", Text::Written,
     [](auto &s, auto &) {
         s.report.WriteHeading();
         return lostNothing(s);
     }},
    {"WriteHeader", Text::Written,
     [](auto &s, auto &) {
         s.report.WriteHeader();
         return lostNothing(s);
     }},
    {"WriteDataBlock",
     Text::Written,
     [](auto &s, auto &) { return s.report.WriteDataBlock(s.list.GetAt(0), 1, 1); },
     {.isLoaded = true}},
    {"WriteDataBlock by name",
     Text::Written,
     [](auto &s, auto &) { return s.report.WriteDataBlock(QStringLiteral("Site"), s.list.GetAt(0), 0, 0); },
     {.isLoaded = true}},
    {"WriteDataTable",
     Text::Written,
     [](auto &s, auto &) { return s.report.WriteDataTable(&s.list, 1, 1, -1); },
     {.isLoaded = true}},
    {"WriteDataTable by name",
     Text::Written,
     [](auto &s, auto &) { return s.report.WriteDataTable(QStringLiteral("Points"), &s.list, 0, 0, -1); },
     {.isLoaded = true}},
    {"LoadFile", Text::Written,
     [](auto &s, auto &a) { return s.report.LoadFile(a.loadPath, false) == 1 && lostNothing(s); }},
    {"OnOpenDocument", Text::Written, [](auto &s, auto &a) { return s.report.OnOpenDocument(a.loadPath); }},
    {"SetData", Text::Set,
     [](auto &s, auto &) {
         s.report.SetData(line);
         return lostNothing(s);
     }},
    {"SetData, UTF-16", Text::Set,
     [](auto &s, auto &) {
         s.report.SetData(wideLine);
         return lostNothing(s);
     }},
    {"SetData, blocks", Text::Set,
     [](auto &s, auto &) {
         s.report.SetData(blocks);
         return lostNothing(s);
     }},
    {"ReplaceText", Text::Replaced, [](auto &s, auto &) { return s.report.ReplaceText(2, 3, line); }},
    {"ReplaceText, UTF-16", Text::Replaced, [](auto &s, auto &) { return s.report.ReplaceText(2, 3, wideLine); }},
    {"ReplaceText, blocks", Text::Replaced, [](auto &s, auto &) { return s.report.ReplaceText(2, 3, blocks); }},
    {"CopyText", Text::Same,
     [](auto &s, auto &) {
         s.answer = s.report.CopyText();
         return !s.answer.isEmpty();
     }},
    {"CopyText, a piece", Text::Same,
     [](auto &s, auto &) {
         s.answer = s.report.CopyText(1, 4);
         return s.answer.size() == 4;
     }},
    {"GetData", Text::Same,
     [](auto &s, auto &) {
         return std::char_traits<char16_t>::length(s.report.GetData()) == std::size_t(s.report.GetTextLength());
     }},
    {"GetText", Text::Same, [](auto &s, auto &) { return s.report.GetText().size() == s.report.GetTextLength(); }},
    {"CheckSize", Text::Same, [](auto &s, auto &) { return s.report.CheckSize(200000) == 1; }},
    {"WriteText", Text::Same,
     [](auto &s, auto &) { return s.report.WriteText(s.bytes, kareport::LineEnds::ReportFile); }},
    {"SetHeader", Text::Same,
     [](auto &s, auto &) {
         s.report.SetHeader();
         return lostNothing(s);
     }},
    {"SetHeading", Text::Same,
     [](auto &s, auto &) {
         s.report.SetHeading(line, 1, 1);
         return true;
     }},
    {"SetTitle",
     Text::Same,
     [](auto &s, auto &) {
         s.report.SetTitle(line);
         return lostNothing(s);
     },
     {.hasView = true}},
    {"SetRTFDataFlag", Text::Same,
     [](auto &s, auto &) {
         s.report.SetRTFDataFlag(true);
         return lostNothing(s);
     }},
    {"WriteRTFData", Text::Same,
     [](auto &s, auto &) {
         s.report.WriteRTFData(line, 1);
         return lostNothing(s);
     }},
    {"GetRTFData", Text::Same,
     [](auto &s, auto &) {
         s.report.GetRTFData(s.answer);
         return !s.answer.isEmpty();
     }},
    {"GetFontTableData", Text::Same,
     [](auto &s, auto &) {
         s.report.GetFontTableData(s.answer);
         return !s.answer.isEmpty();
     }},
    {"WriteFontTable", Text::Same, [](auto &s, auto &) { return s.report.WriteFontTable(s.bytes); }},
    {"WriteRichTextFile", Text::Same, [](auto &s, auto &) { return s.report.WriteRichTextFile(s.bytes); }},
    {"ResetFormatString", Text::Same,
     [](auto &s, auto &) {
         s.answer = QStringLiteral("{\\rtf1\\viewkind4 text}");
         const bool isCut = UReportDoc::ResetFormatString(s.answer);
         return isCut == (s.answer == QStringLiteral("\\viewkind4 text")) && isCut;
     }},
    {"LoadSettings", Text::Same,
     [](auto &s, auto &) {
         s.report.LoadSettings();
         return s.report.GetMargins() == QMargins(1000, 1000, 1200, 2000);
     }},
    {"SaveSettings", Text::Same,
     [](auto &s, auto &) {
         s.report.SaveSettings();
         return true;
     }},
    {"LoadTemplateXml", Text::Same,
     [](auto &s, auto &) {
         return s.report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QStringLiteral("Points"),
                                         QStringLiteral("Site"));
     }},
    {"LoadTemplateFile", Text::Same,
     [](auto &s, auto &around) {
         return s.report.LoadTemplateFile(around.templatePath, QStringLiteral("T"), QStringLiteral("Points"),
                                          QStringLiteral("Site"));
     }},
    {"SetSurroundings", Text::Same,
     [](auto &s, auto &) {
         s.report.SetSurroundings(kareport::ReportSurroundings());
         return true;
     }},
    {"LoadTemplateTable",
     Text::Same,
     [](auto &s, auto &) { return s.report.LoadTemplateTable(QStringLiteral("Points")); },
     {.isLoaded = true}},
    {"LoadTemplateBlock",
     Text::Same,
     [](auto &s, auto &) { return s.report.LoadTemplateBlock(QStringLiteral("Site")); },
     {.isLoaded = true}},
    {"FormatXmlStringToDisplay",
     Text::Same,
     [](auto &s, auto &) {
         const double value = 1.5;
         s.answer = s.report.FormatXmlStringToDisplay(
             &s.report.GetTemplate()->GetTable(QStringLiteral("Points"))->Fields[0], 8, &value, QString());
         return !s.answer.isEmpty();
     },
     {.isLoaded = true}},
    {"SaveFile", Text::Same, [](auto &s, auto &a) { return s.report.SaveFile(a.reportPath) == 1; }},
    {"OnSaveDocument, .rep",
     Text::Same,
     [](auto &s, auto &a) { return s.report.OnSaveDocument(a.reportPath); },
     {},
     true},
    {"OnSaveDocument, .rtf",
     Text::Same,
     [](auto &s, auto &a) { return s.report.OnSaveDocument(a.richTextPath); },
     {.hasView = true},
     true},
    {"UpdateReportInfo",
     Text::Written,
     [](auto &s, auto &) {
         s.report.UpdateReportInfo(QStringLiteral("another run of it, with a long name"), true, false);
         return lostNothing(s);
     },
     {.hasView = true}},
    {"CanCloseFrame", Text::Same,
     [](auto &s, auto &) {
         s.report.SetModifiedFlag(true);
         return s.report.CanCloseFrame(nullptr);
     }},
    {"GetPages", Text::Same, [](auto &s, auto &) { return !s.report.GetPages().empty(); }},
    {"GetPageStartLines", Text::Same,
     [](auto &s, auto &) {
         s.report.GetPageStartLines();
         return true;
     }},
    {"Activate",
     Text::Same,
     [](auto &s, auto &) {
         s.report.Activate(true);
         return true;
     },
     {.hasView = true}},
    {"DoSave", Text::Same, [](auto &s, auto &a) { return s.report.DoSave(a.reportPath, false); }, {}, true},
    {"GetCurrentReportFileName", Text::Same,
     [](auto &s, auto &) { return !s.report.GetCurrentReportFileName().isEmpty(); }},
    {"SaveText",
     Text::Same,
     [](auto &s, auto &) {
         s.report.SetTextObject(&s, 1);
         s.report.SaveText();
         return true;
     },
     {.hasView = true}},
    {"SaveText, to the host's document",
     Text::Same,
     [](auto &s, auto &around) {
         around.receiver->received.clear();
         s.report.SetTextObject(around.receiver, 1);
         s.report.SaveText();
         s.answer = around.receiver->received;
         EXPECT_EQ(s.report.GetTextObject(), around.receiver) << "another try may follow";
         return !s.answer.isEmpty();
     },
     {.hasView = true}},
    {"UpdateAllViews",
     Text::Same,
     [](auto &s, auto &) {
         s.report.UpdateAllViews(nullptr);
         return true;
     },
     {.hasView = true}},
    {"UpdateAllViews, an editor",
     Text::Same,
     [](auto &s, auto &a) {
         s.report.SetExternalEditorFlag(true);
         s.report.UpdateAllViews(nullptr);
         return !a.launches.all.empty();
     },
     {.hasView = true}},
    {"ReportRTfData, an editor", Text::Same,
     [](auto &s, auto &a) {
         s.report.SetExternalEditorFlag(true);
         s.report.ReportRTfData();
         return !a.launches.all.empty();
     }},
    {"ConvertAndOpenInWord", Text::Same,
     [](auto &s, auto &a) {
         s.report.ConvertAndOpenInWord();
         return !a.launches.all.empty();
     }},
};

TEST_P(ReportAllocations, AnyOfThemMayFail)
{
    tryAll();
}

INSTANTIATE_TEST_SUITE_P(Operations, ReportAllocations, testing::ValuesIn(operations), nameOf);

TEST(ReportAllocation, DataThatIsNotWrittenWholeLeavesNoHeading)
{
    const Surroundings around;
    for (const bool isTable : {true, false}) {
        failingEachAllocation([&](qint64 number) {
            ReportSubject subject({.isRichText = true, .isLoaded = true});
            bool isWritten = false;
            bool hasFailed = false;
            {
                const FailingAllocation failing(number);
                isWritten = isTable ? subject.report.WriteDataTable(&subject.list, 0, 0, -1)
                                    : subject.report.WriteDataBlock(subject.list.GetAt(0), 0, 0);
                hasFailed = failing.hasFailed();
            }
            EXPECT_EQ(isWritten, !subject.report.HasLostText()) << number;
            const qint64 written = subject.report.GetTextLength();
            subject.report.NewPage(-1);
            const QString page = subject.report.CopyText().sliced(written);
            EXPECT_TRUE(page.contains(QStringLiteral("TALVEN - Title"))) << number;
            EXPECT_FALSE(page.contains(QStringLiteral("Heading"))) << number << ": what was set before";
            EXPECT_FALSE(page.contains(QStringLiteral("Point"))) << number << ": of the table";
            return hasFailed && !testing::Test::HasFailure();
        });
    }
}

TEST(ReportAllocation, WithoutMemoryThereIsNoNewReport)
{
    const Surroundings around;
    const auto &documents = around.application.reportTemplate()->GetDocuments();
    const auto create = [](qint64 number, bool &hasFailed) {
        const FailingAllocation failing(number);
        UReportDoc *report = CreateReport(QStringLiteral("a name of a report"), true, false, nullptr, 0, nullptr);
        hasFailed = failing.hasFailed();
        return report;
    };
    bool hasFailed = false;
    ASSERT_NE(create(0, hasFailed), nullptr);
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        const std::size_t before = documents.size();
        const UReportDoc *report = nullptr;
        EXPECT_NO_THROW(report = create(number, hasFailed)) << number;
        EXPECT_EQ(documents.size(), before + (report != nullptr ? 1 : 0)) << number;
        if (report != nullptr) {
            EXPECT_FALSE(report->HasLostText()) << number;
            EXPECT_EQ(report->GetTitle().left(4), QStringLiteral("a na")) << number;
            EXPECT_EQ(report->GetReportFileName(), QStringLiteral("a name of a report")) << number;
            documents.back()->OnCloseDocument();
        }
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GT(allocations, 5);
}

TEST(ReportAllocation, AReportThatCannotBeMadeLeavesTheGivenPane)
{
    const Surroundings around;
    UDocTemplate &reports = *around.application.reportTemplate();
    UReportDoc *neighbour = CreateReport(QStringLiteral("neighbour"), false, false, nullptr, 0, nullptr);
    ASSERT_NE(neighbour, nullptr);
    auto *pane = new CountingPane;
    showIn<TestReportView>(*pane, *neighbour);
    failingEachAllocation([&](qint64 number) {
        bool hasFailed = false;
        UReportDoc *report = nullptr;
        {
            const FailingAllocation failing(number);
            EXPECT_NO_THROW(report = CreateReport(QStringLiteral("a name of a report"), true, false, pane, 0, nullptr));
            hasFailed = failing.hasFailed();
        }
        EXPECT_TRUE(CViewPane::IsOpen(pane)) << number;
        EXPECT_TRUE(UReportDoc::IsReportAvailable(neighbour)) << number;
        if (testing::Test::HasFailure()) {
            return false;
        }
        EXPECT_EQ(pane->GetViews().front()->GetDocument(), neighbour) << number;
        EXPECT_EQ(pane->GetViews().size(), report != nullptr ? 2U : 1U) << number;
        if (report != nullptr) {
            pane->RemoveView(report->GetViews().front());
        }
        EXPECT_EQ(reports.GetDocuments().size(), 1U) << number;
        return hasFailed && !testing::Test::HasFailure();
    });
    neighbour->OnCloseDocument();
}

TEST(ReportAllocation, ClosingAReportInTwoPanesNeedsNoMemory)
{
    const Surroundings around;
    UReportDoc *report = CreateReport(QStringLiteral("report"), false, false, nullptr, 0, nullptr);
    ASSERT_NE(report, nullptr);
    for (int i = 0; i < 2; ++i) {
        auto *pane = new CountingPane;
        showIn<TestReportView>(*pane, *report);
        pane->ShowPane(true);
    }
    const FailingAllocation failing(1);
    EXPECT_NO_THROW(report->OnCloseDocument());
    EXPECT_FALSE(failing.hasFailed()) << "a view that is closed has nothing to tell";
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

TEST(ReportAllocation, WithoutMemoryThereIsNoTemplateForReports)
{
    EXPECT_GT(failingEachAllocation([](qint64 number) {
                  const FailingAllocation failing(number);
                  std::unique_ptr<UDocTemplate> made;
                  EXPECT_NO_THROW(made = ReportInitialTemplate()) << number;
                  EXPECT_EQ(made == nullptr, failing.hasFailed()) << number;
                  return failing.hasFailed() && !testing::Test::HasFailure();
              }),
              0);
}

TEST(ReportAllocation, AStreamThatIsNotWholeSaysSo)
{
    const Surroundings around;
    const QString piece(1000, u'x');
    QByteArray whole;
    failingEachAllocation([&](qint64 number) {
        ReportSubject subject({});
        kareport::ReportTextWriter writer(subject.bytes, kareport::LineEnds::ReportFile);
        subject.report.StreamText(&writer);
        bool isTaken = false;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number);
            EXPECT_NO_THROW({
                for (int i = 0; i < 600; ++i) {
                    subject.report.WriteLine(piece, 0, 1, 0);
                }
                subject.report.LineFeed(2);
                isTaken = subject.report.EndTextStream(writer);
            }) << number;
            hasFailed = failing.hasFailed();
        }
        EXPECT_TRUE(isTaken || hasFailed) << number;
        if (isTaken) {
            EXPECT_FALSE(subject.report.HasLostText()) << number;
            EXPECT_TRUE(whole.isEmpty() || whole == subject.bytes.data()) << number;
            whole = subject.bytes.data();
        }
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GT(whole.size(), 600000);
}

TEST(ReportAllocation, AReportThatHasLostTextIsNotStored)
{
    const Surroundings around;
    ReportSubject subject({.hasWindow = true});
    UArchive archive(subject.bytes, UArchive::Mode::Storing, QString());
    subject.report.Serialize(archive);
    EXPECT_TRUE(archive.IsGood());
    // Room for the text itself is asked for a second time where the first request fails. What the window takes of it is not.
    failingEachAllocation([&](qint64 number) {
        const FailingAllocation failing(number);
        subject.report.Write(QStringLiteral("a piece"), 0);
        return failing.hasFailed() && !subject.report.HasLostText();
    });
    ASSERT_TRUE(subject.report.HasLostText());
    subject.report.Serialize(archive);
    EXPECT_FALSE(archive.IsGood());
}

} // namespace
