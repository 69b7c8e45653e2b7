#include "ReportEditorFixture.h"

#include <QTest>

#include <gtest/gtest.h>

namespace
{

using UReportDocEditor = ReportEditor;

TEST_F(UReportDocEditor, IsUsedByAMarkedReportWhereItIsPreferredChosenAndInstalled)
{
    const QTemporaryDir folder;
    const QString editor = folder.filePath(QStringLiteral("edit"));
    UReportDoc report;
    EXPECT_FALSE(report.UsePreferredReportEditor()) << "nothing chosen, not marked";
    report.SetExternalEditorFlag(true);
    EXPECT_FALSE(report.UsePreferredReportEditor()) << "nothing chosen";
    WriteProfileString(QString(), GetPreferredReportEditorRegKey(), editor);
    SetUsePreferredReportEditorFlag(true);
    EXPECT_FALSE(report.UsePreferredReportEditor()) << "not installed yet";
    putFile(editor, "");
    EXPECT_TRUE(report.UsePreferredReportEditor()) << "installed since";
    EXPECT_TRUE(IsUseExternalEditor(true));
    EXPECT_FALSE(IsUseExternalEditor(false)) << "not wanted";
    SetUsePreferredReportEditorFlag(false);
    EXPECT_FALSE(report.UsePreferredReportEditor()) << "no longer preferred";
    EXPECT_FALSE(IsUseExternalEditor(true)) << "although it is there";
    SetUsePreferredReportEditorFlag(true);
    report.SetExternalEditorFlag(false);
    EXPECT_FALSE(report.UsePreferredReportEditor()) << "not marked";
    report.SetExternalEditorFlag(true);
    EXPECT_TRUE(report.UsePreferredReportEditor());
    for (const QString &path : {folder.path(), QString(), editor + u' ', u' ' + editor, editor + QStringLiteral("2")}) {
        WriteProfileString(QString(), GetPreferredReportEditorRegKey(), path);
        EXPECT_FALSE(report.UsePreferredReportEditor()) << path.toStdString() << " does not exist";
    }
}

TEST_F(UReportDocEditor, AWordProcessorGetsAConvertedReportUnlessItIsRichTextOrAPdf)
{
    struct Row
    {
        const char *file;
        const char *editor;
        bool excelOption;
        bool expected;
        bool externalExcel;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"/t/Report$$$.rep", "C:\\Apps\\WINWORD.EXE", false, true, false, "the usual case"},
        {"/t/Report$$$.rep", "/usr/bin/wordpad", false, true, false, "the other word processor"},
        {"/t/Report$$$.rep", "C:\\Apps\\notepad.exe", false, false, false, "any other editor"},
        {"/t/a.rtf", "winword", false, false, false, "rich text already"},
        {"/t/a.PDF", "winword", false, false, false, "no editor reads more out of a PDF"},
        {"/t/a.rtf.rtf", "winword", false, true, false, "not the first of its name: counts as text"},
        {"", "winword", false, true, false, "no name at all"},
        {"/t/a.rep", "C:\\Apps\\excel.exe", false, false, false, "a spreadsheet that the report does not allow"},
        {"/t/a.rep", "C:\\Apps\\EXCEL.EXE", true, true, true, "one that it allows"},
        {"/t/a.rtf", "excel", true, false, true, "it is marked also when nothing is to be converted"},
        {"/t/a.rep", "winword", true, true, false, "the option changes nothing for a word processor"},
        {"/t/a.rep", "notepad", true, false, false, "nor for any other editor"},
    };
    for (const Row &row : rows) {
        UReportDoc report;
        if (row.excelOption) {
            report.SetOptionExcel();
        }
        EXPECT_EQ(report.IsConvertToOpenInWord(QLatin1String(row.file), QLatin1String(row.editor)), row.expected)
            << row.reason;
        EXPECT_EQ(report.IsExternalExcel(), row.externalExcel) << row.reason;
        EXPECT_EQ(report.IsOptionExcel(), row.excelOption) << row.reason;
    }
}

TEST_F(UReportDocEditor, APlainOneGetsTheReportTextAnewWithEveryUpdate)
{
    const PreferredEditor editor(QStringLiteral("notepad.exe"));
    UReportDoc *report = createWritten();
    EXPECT_FALSE(paneOf(report)->IsVisible()) << "from the beginning";
    paneOf(report)->ShowPane(true);
    viewOf(report)->updates = 0;
    ToldPane properties;
    report->UpdateAllViews(nullptr);
    ASSERT_EQ(launches.all.size(), 1U);
    EXPECT_EQ(launches.all[0].program, editor.path);
    EXPECT_EQ(launches.all[0].file, at("Report$$$.rep"));
    EXPECT_EQ(launches.all[0].folder, QDir::tempPath());
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFtext\r\r\n");
    EXPECT_FALSE(report->IsModified()) << "it has been saved";
    EXPECT_FALSE(paneOf(report)->IsVisible());
    EXPECT_EQ(viewOf(report)->updates, 0);
    EXPECT_EQ(properties.told, std::vector<UDocument *>{report});
    EXPECT_EQ(documents().size(), 1U) << "nothing is converted";

    paneOf(report)->ShowPane(true);
    report->WriteLine(QStringLiteral("more"), 0, 1, 0);
    report->UpdateAllViews(viewOf(report), 7, &properties);
    EXPECT_EQ(launches.files(), (QStringList{at("Report$$$.rep"), at("Report$$$ 2.rep")})) << "each time a new file";
    EXPECT_EQ(contentOf(at("Report$$$ 2.rep")), "\xEF\xBB\xBFtext\r\r\nmore\r\r\n");
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFtext\r\r\n") << "the one before stays";
    EXPECT_FALSE(paneOf(report)->IsVisible()) << "hidden again";
    EXPECT_EQ(properties.told.size(), 2U);
}

TEST_F(UReportDocEditor, ThePreferencesAreReadWithEveryUpdate)
{
    const PreferredEditor first(QStringLiteral("notepad"));
    UReportDoc *report = createWritten(QStringLiteral("Survey"));
    report->UpdateAllViews(nullptr);
    const PreferredEditor second(QStringLiteral("edit"));
    report->UpdateAllViews(nullptr);
    SetUsePreferredReportEditorFlag(false);
    report->UpdateAllViews(nullptr);
    SetUsePreferredReportEditorFlag(true);
    report->SetExternalEditorFlag(false);
    report->UpdateAllViews(nullptr);
    report->SetExternalEditorFlag(true);
    QFile::remove(second.path);
    report->UpdateAllViews(nullptr);
    ASSERT_EQ(launches.all.size(), 2U) << "in the other cases the module shows the report itself";
    EXPECT_EQ(launches.all[0].program, first.path);
    EXPECT_EQ(launches.all[1].program, second.path);
    EXPECT_EQ(launches.files(), (QStringList{at("Survey.rep"), at("Survey 2.rep")}));
}

TEST_F(UReportDocEditor, AnEmptyReportMakesNoFile)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    UReportDoc *report = create();
    report->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), QStringList{at("Report$$$.rep")}) << "the editor begins one of its own";
    EXPECT_FALSE(QFile::exists(at("Report$$$.rep")));
}

TEST_F(UReportDocEditor, WithoutOneTheViewsAreUpdatedAndThePaneIsShown)
{
    for (const bool marked : {false, true}) {
        UReportDoc *report = create(QString(), marked);
        auto *other = new CViewPane;
        const auto *otherView = showIn<RecordingView>(*other, *report);
        ShownPane *pane = paneOf(report);
        viewOf(report)->updates = 0;
        pane->ShowPane(false);
        pane->shows = 0;
        ToldPane properties;
        report->UpdateAllViews(viewOf(report), 7, &properties);
        EXPECT_EQ(viewOf(report)->updates, 0) << "the sender knows";
        EXPECT_EQ(otherView->updates, (std::vector<RecordingView::Update>{{viewOf(report), 7, &properties}}));
        EXPECT_TRUE(pane->IsVisible());
        EXPECT_EQ(pane->shows, 1);
        EXPECT_EQ(properties.told, std::vector<UDocument *>{report});
        report->UpdateAllViews(nullptr);
        EXPECT_EQ(pane->shows, 1) << "an open pane is not shown again: that would draw the focus to it";
        EXPECT_FALSE(other->IsVisible()) << "other panes are not the report's frame";

        pane->ShowPane(false);
        report->SetCloseDocumentFlag(true);
        report->UpdateAllViews(nullptr);
        EXPECT_FALSE(pane->IsVisible()) << "the pane of a report that only goes to editors stays as it is";
        EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << "it went to none, so it stays open";
        EXPECT_EQ(properties.told.size(), 3U);
    }
    EXPECT_EQ(launches.files(), QStringList());
}

TEST_F(UReportDocEditor, AReportWithoutWindowsNeedsNone)
{
    UReportDoc report;
    report.SetData(QStringLiteral("text"));
    report.UpdateAllViews(nullptr);
    const PreferredEditor editor(QStringLiteral("notepad"));
    report.SetExternalEditorFlag(true);
    report.UpdateAllViews(nullptr);
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFtext");
    EXPECT_EQ(launches.files(), QStringList{at("Report$$$.rep")});
}

TEST_F(UReportDocEditor, AStartedProgramFindsTheReport)
{
    kareport::setEditorLauncher({});
    const PreferredEditor editor(QStringLiteral("WinWord.sh"));
    const QString got = QFileInfo(editor.path).path() + QStringLiteral("/got");
    putFile(editor.path, "#!/bin/sh\n"
                         "cat \"$1\" > \"$0.part\"\n"
                         "mv \"$0.part\" \"$(dirname \"$0\")/got\"\n");
    QFile::setPermissions(editor.path, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    UReportDoc *report = create(QStringLiteral("$(touch pwned) it's"));
    report->WriteLine(QStringLiteral(u"Radius \u221E"), 0, 1, 0);
    report->SetCloseDocumentFlag(true);
    report->UpdateAllViews(nullptr);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << "closed while the program starts";
    ASSERT_TRUE(QTest::qWaitFor([&got] { return QFile::exists(got); }, 10'000));
    EXPECT_EQ(contentOf(got), richTextOf({"Radius inf.\r"}));
    EXPECT_FALSE(QFile::exists(at("pwned")));
}

} // namespace
