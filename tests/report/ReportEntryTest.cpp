#include "ReportFixture.h"

#include "Preferences.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

const QString creator = QStringLiteral("REPORTDOCTEMPLATE");

std::unique_ptr<UDocTemplate> otherTemplate(const QString &name)
{
    return std::make_unique<UDocTemplate>(
        1, [] { return std::unique_ptr<UDocument>(); }, UDocTemplate::PaneFactory(), UDocTemplate::ViewFactory(), name,
        1, 1);
}

TEST(ReportEntry, TheReportTemplateIsKnownByItsCreator)
{
    LoadKaReport();
    const auto reportTemplate = kareport::makeReportTemplate();
    ASSERT_NE(reportTemplate, nullptr);
    EXPECT_EQ(reportTemplate->GetResourceId(), 27006U);
    EXPECT_TRUE(reportTemplate->IsThatCreator(creator));
    EXPECT_FALSE(reportTemplate->IsThatCreator(QStringLiteral("OTHER")));
    EXPECT_FALSE(reportTemplate->IsThatCreator(QString()));
}

TEST(ReportEntry, TheFirstReportTemplateOfTheApplicationIsFound)
{
    EXPECT_EQ(GetReportTemplate(), nullptr) << "no application";
    UApplication application;
    EXPECT_EQ(GetReportTemplate(), nullptr) << "no template";
    application.AddDocTemplate(otherTemplate(QStringLiteral("OTHER")));
    EXPECT_EQ(GetReportTemplate(), nullptr) << "no template for reports";
    const UDocTemplate *first = application.AddDocTemplate(kareport::makeReportTemplate());
    EXPECT_EQ(GetReportTemplate(), first);
    application.AddDocTemplate(kareport::makeReportTemplate());
    EXPECT_EQ(GetReportTemplate(), first) << "the first of two";
}

TEST(ReportEntry, WithoutATemplateOrADocumentThereIsNoReport)
{
    const FixedSurroundings surroundings;
    EXPECT_EQ(CreateReport(QStringLiteral("N"), true, true, nullptr, 0, nullptr), nullptr) << "no application";
    UApplication application;
    EXPECT_EQ(CreateReport(QStringLiteral("N"), true, true, nullptr, 0, nullptr), nullptr) << "no template";
    application.AddDocTemplate(otherTemplate(creator));
    EXPECT_EQ(CreateReport(QStringLiteral("N"), true, true, nullptr, 0, nullptr), nullptr)
        << "a template that makes no document";
}

TEST(ReportEntry, AReportIsCreatedWithItsNameAndFlags)
{
    const FixedSurroundings surroundings;
    const ReportApplication application;
    for (const bool header : {false, true}) {
        for (const bool editor : {false, true}) {
            const UReportDoc *report = CreateReport(QStringLiteral("Survey"), header, editor, nullptr, 0, nullptr);
            ASSERT_NE(report, nullptr);
            EXPECT_TRUE(report->GetTitle().startsWith(u"Survey"));
            EXPECT_EQ(report->GetReportFileName(), QStringLiteral("Survey"));
            EXPECT_EQ(report->GetHeaderFlag(), header);
            EXPECT_EQ(report->GetExternalEditorFlag(), editor);
            EXPECT_FALSE(report->IsModified());
            EXPECT_EQ(report->GetPrintResolution(), 600U) << "the page is measured";
            EXPECT_EQ(report->GetDocTemplate(), application.reportTemplate());
        }
    }
    EXPECT_EQ(application.reportTemplate()->GetDocuments().size(), 4U) << "the template owns them";
}

TEST(ReportEntry, ANullNameLeavesTitleAndFileNameEmpty)
{
    const FixedSurroundings surroundings;
    ReportApplication application;
    const UReportDoc *report = application.create(QString());
    ASSERT_NE(report, nullptr);
    EXPECT_EQ(report->GetTitle(), QString());
    EXPECT_EQ(report->GetReportFileName(), QString());
}

TEST(ReportEntry, WithoutPanesReportsAreMadeWithoutAView)
{
    const FixedSurroundings surroundings;
    UApplication application;
    application.AddDocTemplate(kareport::makeReportTemplate());
    const UReportDoc *report = CreateReport(QStringLiteral("N"), false, false, nullptr, 0, nullptr);
    ASSERT_NE(report, nullptr);
    EXPECT_TRUE(report->GetViews().empty());
    EXPECT_EQ(report->GetTitle(), QStringLiteral("N"));
    EXPECT_EQ(CreateReport(QStringLiteral("N"), false, false, nullptr, 0, nullptr)->GetTitle(), QStringLiteral("N"))
        << "no pane has the caption";
}

TEST(ReportEntry, AGivenPaneShowsTheReport)
{
    const FixedSurroundings surroundings;
    const ReportApplication application;
    auto *pane = new CountingPane;
    UReportDoc *report = CreateReport(QStringLiteral("N"), false, false, pane, 0, nullptr);
    ASSERT_NE(report, nullptr);
    EXPECT_EQ(report->GetFrameWindow(), pane);
    EXPECT_EQ(report->GetViews().size(), 1U) << "no pane of its own";
    EXPECT_TRUE(pane->IsVisible());
    EXPECT_EQ(pane->GetCaption(), QStringLiteral("N"));
}

TEST(ReportEntry, TheEditorGetsAReportWhenItIsWantedPreferredChosenAndInstalled)
{
    const QTemporaryDir folder;
    const QString editor = folder.filePath(QStringLiteral("editor"));
    QFile(editor).open(QIODevice::WriteOnly);
    const QString missing = folder.filePath(QStringLiteral("missing"));
    struct Row
    {
        bool want;
        bool prefer;
        QString path;
        bool expected;
        const char *reason;
    };
    const Row rows[] = {
        {true, true, editor, true, "all together"},    {false, true, editor, false, "not wanted"},
        {true, false, editor, false, "not preferred"}, {true, true, QString(), false, "none chosen"},
        {true, true, missing, false, "not installed"}, {false, false, QString(), false, "nothing at all"},
    };
    const FixedSurroundings surroundings;
    const ReportApplication application;
    EXPECT_FALSE(IsUseExternalEditor(true)) << "without any preference";
    for (const Row &row : rows) {
        SetUsePreferredReportEditorFlag(row.prefer);
        WriteProfileString(QString(), GetPreferredReportEditorRegKey(), row.path);
        EXPECT_EQ(IsUseExternalEditor(row.want), row.expected) << row.reason;

        const UReportDoc *report = CreateReport(QStringLiteral("N"), false, row.want, nullptr, 0, nullptr);
        ASSERT_NE(report, nullptr);
        ASSERT_NE(report->GetFrameWindow(), nullptr) << row.reason << ": a pane is made in any case";
        EXPECT_EQ(report->GetFrameWindow()->IsVisible(), !row.expected) << row.reason;
        EXPECT_EQ(report->GetExternalEditorFlag(), row.want) << row.reason << ": what was wanted, not what came of it";
    }
}

} // namespace
