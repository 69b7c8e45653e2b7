#include "FileSizeLimit.h"
#include "ReportEditorFixture.h"

#include <gtest/gtest.h>

namespace
{

using UReportDocEditorClose = ReportEditor;

TEST_F(UReportDocEditorClose, WhatTheEditorDidNotGetStaysOpen)
{
    for (const char *name : {"notepad", "winword"}) {
        const PreferredEditor editor(QLatin1String{name});
        UReportDoc *report = createWritten(QStringLiteral("a"));
        UReportDoc *empty = create(QStringLiteral("b"));
        report->SetCloseDocumentFlag(true);
        empty->SetCloseDocumentFlag(true);
        {
            const FileSizeLimit fullDisk(0);
            report->UpdateAllViews(nullptr);
            ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << name << ": it is nowhere else";
            EXPECT_TRUE(report->IsModified()) << name;
            empty->UpdateAllViews(nullptr);
            EXPECT_FALSE(UReportDoc::IsReportAvailable(empty)) << name << ": there is nothing to lose";
        }
        report->UpdateAllViews(nullptr);
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << name << ": now the editor has it";
        launches.all.clear();
    }
}

} // namespace
