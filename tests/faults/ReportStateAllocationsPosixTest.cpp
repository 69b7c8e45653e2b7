#include "ReportAllocations.h"

#include "CViewPane.h"
#include "ReportAccess.h"
#include "UArchive.h"
#include "UJobSettings.h"

#include <utility>

// What is set on a report, and what takes a text as a whole, without memory. Much of it needs none, and must stay so.

namespace
{

using Text = ReportOperation::Text;

const QString longName = QStringLiteral("a name that is long enough to need memory of its own");
const UJobSettings jobSettings = UJobSettings();

constexpr ReportOperation operations[] = {
    {"takeText", Text::Set,
     [](auto &s, auto &) {
         kareport::ReportAccess::takeText(s.report, s.loaded);
         return lostNothing(s);
     }},
    {"Clear", Text::Set,
     [](auto &s, auto &) {
         s.report.Clear();
         return s.report.IsEmpty();
     }},
    {"OnNewDocument", Text::Same, [](auto &s, auto &) { return s.report.OnNewDocument(); }},
    {"Serialize, storing", Text::Same,
     [](auto &s, auto &) {
         UArchive archive(s.bytes, UArchive::Mode::Storing, QString());
         s.report.Serialize(archive);
         return archive.IsGood();
     }},
    {"Serialize, loading", Text::Written,
     [](auto &s, auto &around) {
         UArchive archive(s.bytes, UArchive::Mode::Loading, around.loadPath);
         s.report.Serialize(archive);
         return archive.IsGood() && lostNothing(s);
     }},
    {"OnOpenDocument, .rtf", Text::Written,
     [](auto &s, auto &around) { return s.report.OnOpenDocument(around.richTextLoadPath); }},
    {"LoadFile, .rtf", Text::Written,
     [](auto &s, auto &around) { return s.report.LoadFile(around.richTextLoadPath, false) == 1 && lostNothing(s); }},
    {"OnCloseDocument",
     Text::Same,
     [](auto &s, auto &) {
         s.report.OnCloseDocument();
         return s.report.GetViews().empty();
     },
     {.hasView = true}},
    {"CloseReportDocument",
     Text::Same,
     [](auto &s, auto &) {
         s.report.CloseReportDocument();
         return s.report.GetViews().empty();
     },
     {.hasView = true}},
    {"CloseReportDocument, deferred",
     Text::Same,
     [](auto &s, auto &) {
         s.report.SetCloseDocument(1);
         s.report.CloseReportDocument();
         return s.report.GetCloseDocument() == 2;
     },
     {.hasView = true}},
    {"SetWindowTextW",
     Text::Same,
     [](auto &s, auto &) {
         s.report.SetWindowTextW(longName);
         return true;
     },
     {.hasView = true}},
    {"SetReportWindowActive", Text::Same,
     [](auto &s, auto &) {
         s.report.SetReportWindowActive();
         return true;
     }},
    {"ShowReportBar", Text::Same,
     [](auto &s, auto &) {
         UReportDoc::ShowReportBar(s.report.GetReportWindow(), true);
         return true;
     }},
    {"SetReportFileName", Text::Same,
     [](auto &s, auto &) {
         s.report.SetReportFileName(longName);
         return s.report.GetReportFileName() == longName;
     }},
    {"SetFontName", Text::Same,
     [](auto &s, auto &) {
         s.report.SetFontName(longName);
         return s.report.GetFontName() == longName;
     }},
    {"SetChainageLabel", Text::Same,
     [](auto &s, auto &) {
         s.report.SetChainageLabel(longName);
         return true;
     }},
    {"SetDataColumnSeparator", Text::Same,
     [](auto &s, auto &) {
         s.report.SetDataColumnSeparator(u';', false);
         return s.report.GetDataColumnSeparator() == u';';
     }},
    {"SetExcelFormat", Text::Same,
     [](auto &s, auto &) {
         s.report.SetExcelFormat();
         return s.report.GetDataColumnSeparator() == u'\t' && !s.report.GetHeaderFlag();
     }},
    {"SetJobSettings", Text::Same,
     [](auto &s, auto &) {
         s.report.SetJobSettings(jobSettings);
         return true;
     }},
    {"FixPage", Text::Same,
     [](auto &s, auto &) {
         s.report.FixPage(30, 70);
         return s.report.GetLinesPerPage() == 30 && s.report.GetCharsPerRow() == 70;
     }},
    {"UseGivenPage", Text::Same,
     [](auto &s, auto &) {
         s.report.UseGivenPage(false);
         return !s.report.IsPageFixed();
     }},
    {"SetPageStarts", Text::Same,
     [](auto &s, auto &) {
         s.report.SetPageStarts(std::move(s.starts));
         return s.report.GetPageStarts().size() == 2;
     }},
    {"FindPageStarts", Text::Same,
     [](auto &s, auto &) {
         s.report.SetPageStarts({});
         return s.report.FindPageStarts() && lostNothing(s);
     }},
    {"SetPathName",
     Text::Same,
     [](auto &s, auto &around) {
         s.report.SetPathName(around.reportPath, true);
         const QString path = s.report.GetPathName();
         EXPECT_TRUE(path.isEmpty() || path == around.reportPath);
         const QString &title = static_cast<const UDocument &>(s.report).GetTitle(); // which panes show
         EXPECT_EQ(path.isEmpty(), title != u"s.rep") << "the path and no title, or the other way round";
         return !path.isEmpty();
     },
     {.hasView = true}},
    {"HoldsRichTextSource", Text::Same, [](auto &s, auto &) { return !s.report.HoldsRichTextSource(); }},
    {"OnAutoDelete", Text::Same,
     [](auto &s, auto &) {
         s.report.OnAutoDelete();
         return lostNothing(s);
     }},
    {"UsePreferredReportEditor", Text::Same,
     [](auto &s, auto &) {
         s.report.SetExternalEditorFlag(true);
         return s.report.UsePreferredReportEditor();
     }},
    {"Numbers and flags", Text::Same,
     [](auto &s, auto &) {
         s.report.SetMargins(QMargins(1, 2, 3, 4));
         s.report.SetFontSize(9);
         s.report.SetZeroBlank(true);
         s.report.WriteTableName(true);
         s.report.SetOptionExcel();
         s.report.SetExternalExcel();
         s.report.SetOpenedFromRtf(false);
         s.report.SetCanClose(1);
         s.report.EnableCloseOption(true);
         s.report.SetCloseDocumentFlag(false);
         return s.report.GetMargins() == QMargins(1, 2, 3, 4) && s.report.GetFontSize() == 9 &&
                s.report.IsZeroBlank() && s.report.IsOptionExcel() && s.report.IsExternalExcel();
     }},
    {"IsConvertToOpenInWord", Text::Same,
     [](auto &s, auto &) { return s.report.IsConvertToOpenInWord(longName, QStringLiteral("/bin/WinWord.exe")); }},
};

INSTANTIATE_TEST_SUITE_P(States, ReportAllocations, testing::ValuesIn(operations), nameOf);

} // namespace
