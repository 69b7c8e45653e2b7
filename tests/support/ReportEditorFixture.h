#pragma once

#include "CPropertyPane.h"
#include "EditorFixture.h"
#include "FrameFixture.h"
#include "ReportFixture.h"
#include "TemporaryFolder.h"

#include <gtest/gtest.h>

/// A pane that counts how it is shown.
class ShownPane : public CViewPane
{
public:
    void ShowPane(bool show) override;
    void BringToTop() override { ++tops; }

    int shows = 0;
    int hides = 0;
    int tops = 0;
};

/// A property pane that records its notifications.
class ToldPane : public CPropertyPane
{
public:
    void OnUpdateProperties(UDocument *document) override { told.push_back(document); }

    std::vector<UDocument *> told;
};

/// Reports of an application whose launches are recorded. Temporary names begin again.
class ReportEditor : public testing::Test
{
protected:
    ReportEditor();

    UReportDoc *create(const QString &name = QString(), bool externalEditor = true);
    /// A report with a line.
    UReportDoc *createWritten(const QString &name = QString());
    static ShownPane *paneOf(const UReportDoc *report) { return static_cast<ShownPane *>(report->GetFrameWindow()); }
    static TestReportView *viewOf(const UReportDoc *report);
    /// Hides the application with its template for reports, as long as what comes back lives.
    static std::unique_ptr<UApplication> hideTemplate() { return std::make_unique<UApplication>(); }
    std::vector<UDocument *> documents() const { return reports_->GetDocuments(); }
    UReportDoc *lastMade() const { return static_cast<UReportDoc *>(reports_->GetDocuments().back()); }
    QString at(const char *name) const { return temporary.at(QString::fromUtf8(name)); }

private:
    FixedSurroundings surroundings_;

protected:
    bool closesConverted = false; ///< the close-document flag of the reports that are made
    TemporaryFolder temporary;
    RecordedLaunches launches;

private:
    UApplication application_;
    UDocTemplate *reports_ = nullptr;
};

/// A report's lines, each in a paragraph template of its own, as the file for a word processor holds them.
std::string richTextOf(const std::vector<std::string> &lines);
