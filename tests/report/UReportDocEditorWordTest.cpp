#include "ReportEditorFixture.h"

#include <gtest/gtest.h>

namespace
{

using UReportDocEditorWord = ReportEditor;

TEST_F(UReportDocEditorWord, GetsTheReportAsRichText)
{
    const PreferredEditor editor(QStringLiteral("WINWORD.EXE"));
    UReportDoc *report = createWritten();
    report->WriteLine(QStringLiteral("bold"), 0, 1, 1);
    ToldPane properties;
    report->UpdateAllViews(nullptr);
    ASSERT_EQ(launches.all.size(), 1U);
    EXPECT_EQ(launches.all[0].program, editor.path);
    EXPECT_EQ(launches.all[0].file, at("Report$$$ 2.rtf"));
    EXPECT_EQ(launches.all[0].folder, QDir::tempPath());
    EXPECT_EQ(contentOf(at("Report$$$ 2.rtf")), richTextOf({"text\r", "bold\r"})) << "styles are not kept";
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFtext\r\r\nbold\r\r\n") << "the text is saved all the same";
    EXPECT_FALSE(QFile::exists(at("Report$$$ 2.rep")));
    EXPECT_FALSE(paneOf(report)->IsVisible());
    EXPECT_EQ(properties.told, std::vector<UDocument *>{report});
    EXPECT_FALSE(report->IsExternalExcel());
}

TEST_F(UReportDocEditorWord, IsHandedASecondHiddenReport)
{
    const PreferredEditor editor(QStringLiteral("wordpad"));
    UReportDoc *report = createWritten(QStringLiteral("Survey"));
    report->SetHeaderFlag(true);
    report->SetOptionExcel();
    report->UpdateAllViews(nullptr);
    ASSERT_EQ(documents().size(), 2U);
    UReportDoc *converted = lastMade();
    EXPECT_NE(converted, report);
    ASSERT_NE(paneOf(converted), nullptr);
    EXPECT_EQ(paneOf(converted)->shows, 0);
    EXPECT_EQ(paneOf(converted)->GetStyle(), 4096U);
    EXPECT_EQ(paneOf(converted)->GetRect(), std::nullopt);
    EXPECT_FALSE(converted->GetHeaderFlag());
    EXPECT_TRUE(converted->GetExternalEditorFlag());
    EXPECT_TRUE(converted->GetRTFDataFlag());
    EXPECT_EQ(converted->GetReportFileName(), QStringLiteral("Survey"));
    EXPECT_TRUE(converted->IsOptionExcel());
    EXPECT_FALSE(converted->IsExternalExcel()) << "the editor is not one";
    EXPECT_FALSE(converted->IsModified());
    EXPECT_EQ(textOf(*converted), QStringLiteral("text\r\r\n"));
    EXPECT_EQ(converted->GetLineCount(), 2) << "its own count and one more for each line";
    EXPECT_EQ(launches.files(), QStringList{at("Survey 2.rtf")});

    converted->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), (QStringList{at("Survey 2.rtf"), at("Survey 4.rtf")}))
        << "it stays open, and goes to the editor itself";
}

TEST_F(UReportDocEditorWord, LeavesNoReportOpenThatClosesByItself)
{
    const PreferredEditor editor(QStringLiteral("winword"));
    UReportDoc *report = createWritten();
    closesConverted = true;
    report->UpdateAllViews(nullptr);
    EXPECT_EQ(documents(), std::vector<UDocument *>{report});
    EXPECT_EQ(contentOf(at("Report$$$ 2.rtf")), richTextOf({"text\r"}));
    EXPECT_EQ(paneCaptions().size(), 1) << "its pane has gone with it";
}

TEST_F(UReportDocEditorWord, GetsEveryLineThatIsNotBlank)
{
    struct Row
    {
        QString text;
        std::vector<std::string> lines;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("A\r\nB\r\n"), {"A\r", "B\r"}, "a CR before the LF stays with its line"},
        {QStringLiteral("A\r\n\r\n\r\nB\r\n"), {"A\r", "B\r"}, "blank lines are dropped"},
        {QStringLiteral("\r\n\r\nA\r\n\r\n"), {"A\r"}, "also at the beginning and at the end"},
        {QStringLiteral("A\n\nB\n"), {"A", "B"}, "lines ended by LF alone"},
        {QStringLiteral("A\r\nB"), {"A\r", "B"}, "a last line that is open"},
        {QStringLiteral("A"), {"A"}, "an open line only"},
        {QStringLiteral("A\r\r\n\r\r\nB"), {"A\r\r", "B"}, "as a report file has its line ends"},
        {QStringLiteral("A\rB\r\n"), {"A\rB\r"}, "a CR inside a line is not a line end"},
        {QStringLiteral("A\r\n \r\n\t\r\nB"), {"A\r", " \r", "\t\r", "B"}, "a line of blanks is a line"},
        {QStringLiteral("  A  \r\n"), {"  A  \r"}, "blanks around a text stay"},
        {QStringLiteral("\r\n"), {}, "nothing but a blank line"},
        {QString(), {}, "nothing at all"},
        {QStringLiteral("a{b}\\c\n"), {"a{b}\\c"}, "signs of rich text act as such"},
        {QStringLiteral(u"\xB0\xE9\n"), {"\xB0\xE9"}, "up to U+00FF a byte each"},
        {QStringLiteral(u"\u03A9\xE9\r\n\xD83D\xDE00"),
         {"\\u937?\xE9\r", "\\u-10179?\\u-8704?"},
         "characters beyond it"},
        {QStringLiteral(u"Radius \u221E\r\nR"), {"Radius inf.\r", "R"}, "the infinity sign"},
        {QStringLiteral(u"\u221E\u221E x \u221E\n\u221E"), {"inf.inf. x inf.", "inf."}, "each of them"},
    };
    const PreferredEditor editor(QStringLiteral("winword"));
    for (const Row &row : rows) {
        UReportDoc *report = create();
        report->SetData(row.text);
        launches.all.clear();
        report->ConvertAndOpenInWord();
        ASSERT_EQ(launches.all.size(), 1U) << row.reason;
        EXPECT_EQ(contentOf(launches.all[0].file), richTextOf(row.lines)) << row.reason;
        EXPECT_EQ(textOf(*report), row.text) << row.reason << ": the report itself stays";
    }
}

TEST_F(UReportDocEditorWord, GetsALongReportWhole)
{
    const PreferredEditor editor(QStringLiteral("winword"));
    UReportDoc *report = create();
    constexpr int count = 5000;
    for (int i = 0; i < count; ++i) {
        report->WriteLine(QStringLiteral("line %1").arg(i), 0, 1, 0);
    }
    report->UpdateAllViews(nullptr);
    const std::string text = contentOf(launches.files().value(0));
    std::size_t at = 0;
    for (int i = 0; i < count; ++i) {
        at = text.find("\\fs18 line " + std::to_string(i) + "\r \\par", at);
        ASSERT_NE(at, std::string::npos) << i << ": each line once, in order";
    }
    EXPECT_EQ(text.find("\\viewkind", at + 1), std::string::npos) << "and no other";
}

TEST_F(UReportDocEditorWord, ThatIsASpreadsheetGetsTheTextsOnly)
{
    const PreferredEditor editor(QStringLiteral("EXCEL.exe"));
    UReportDoc *report = create();
    report->SetData(QStringLiteral(u"a\tb\r\n\r\n\u221E\t\u03A9\r\n"));
    report->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), QStringList{at("Report$$$.rep")})
        << "without the option it is an editor like any other";
    EXPECT_FALSE(report->IsExternalExcel());
    report->SetOptionExcel();
    report->UpdateAllViews(nullptr);
    EXPECT_TRUE(report->IsExternalExcel());
    EXPECT_EQ(launches.files(), (QStringList{at("Report$$$.rep"), at("Report$$$ 3.rtf")}));
    EXPECT_EQ(contentOf(at("Report$$$ 3.rtf")), "a\tb\rinf.\t?\r") << "no rich text, and nothing for line ends";
    EXPECT_TRUE(lastMade()->IsExternalExcel());
    EXPECT_TRUE(lastMade()->IsOptionExcel());
}

TEST_F(UReportDocEditorWord, IsNotReachedWithoutATemplateForReports)
{
    const PreferredEditor editor(QStringLiteral("winword"));
    UReportDoc *report = createWritten();
    const auto hidden = hideTemplate();
    report->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), QStringList());
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFtext\r\r\n") << "the text was saved before";
}

TEST_F(UReportDocEditorWord, WithoutOneTheConvertedReportIsShownInTheModule)
{
    UReportDoc *report = createWritten();
    report->ConvertAndOpenInWord();
    EXPECT_EQ(launches.files(), QStringList());
    ASSERT_EQ(documents().size(), 2U);
    const UReportDoc *converted = lastMade();
    ASSERT_NE(paneOf(converted), nullptr);
    EXPECT_TRUE(paneOf(converted)->IsVisible());
    EXPECT_EQ(paneOf(converted)->tops, 1);
    EXPECT_EQ(converted->GetViews().size(), 1U) << "in the pane that it was made with";
    QString image;
    converted->GetRTFData(image);
    EXPECT_EQ(image.toStdString(), richTextOf({"text\r"}));
    EXPECT_FALSE(converted->IsModified());
}

} // namespace
