#include "ReportFixture.h"
#include "UXTPMDIFrameWnd.h"

#include <gtest/gtest.h>

namespace
{

/// A report with a window that records its notifications.
struct WindowedReport
{
    explicit WindowedReport(const QString &title = QString())
        : report(application.create(title)), window(new TestReportWindow)
    {
        report->SetReportWindow(window);
    }
    QString lines() const { return textOf(*report).replace(QStringLiteral("\r\n"), QStringLiteral("\n")); }

    FixedSurroundings surroundings;
    ReportApplication application;
    UReportDoc *report;
    TestReportWindow *window;
};

TEST(UReportDocWindow, BecomesActiveAndGetsTheKeyboard)
{
    WindowedReport t;
    t.report->SetReportWindowActive();
    EXPECT_EQ(t.window->calls, (QStringList{QStringLiteral("active"), QStringLiteral("focus")}));
    UReportDoc without;
    without.SetReportWindowActive();
}

/// Looks at the rich text of its report when a piece comes.
class LookingWindow : public TestReportWindow
{
public:
    void WriteLine(const QString &piece) override
    {
        QString richText;
        report->GetRTFData(richText);
        comesFirst = comesFirst && !richText.contains(piece);
    }
    const UReportDoc *report = nullptr;
    bool comesFirst = true;
};

TEST(UReportDocWindow, GetsAPieceBeforeTheRichTextDoes)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    auto *window = new LookingWindow;
    window->report = &report;
    report.SetReportWindow(window);
    report.SetRTFDataFlag(true);
    report.WriteLine(QStringLiteral("alpha"), 0, 1, 1);
    EXPECT_TRUE(window->comesFirst);
    QString richText;
    report.GetRTFData(richText);
    EXPECT_TRUE(richText.contains(QStringLiteral("alpha"))) << "and it does";
}

TEST(UReportDocWindow, IsShownAndHidden)
{
    WindowedReport t;
    UReportDoc::ShowReportBar(t.window, true);
    UReportDoc::ShowReportBar(t.window, false);
    EXPECT_EQ(t.window->calls, (QStringList{QStringLiteral("show"), QStringLiteral("hide")}));
    TestReportWindow other;
    UReportDoc::ShowReportBar(&other, false);
    EXPECT_EQ(other.calls, QStringList{QStringLiteral("hide")}) << "whosever it is";
    UReportDoc::ShowReportBar(nullptr, true);
}

TEST(UReportDocWindow, AnotherRunHasAnotherNameAndFlags)
{
    for (const bool header : {false, true}) {
        for (const bool editor : {false, true}) {
            WindowedReport t(QStringLiteral("First"));
            t.report->UpdateReportInfo(QStringLiteral("Second"), header, editor);
            EXPECT_EQ(t.report->GetHeaderFlag(), header);
            EXPECT_EQ(t.report->GetExternalEditorFlag(), editor);
            EXPECT_EQ(t.report->GetTitle(), QStringLiteral("Second"));
            EXPECT_EQ(t.report->GetReportFileName(), QStringLiteral("Second"));
        }
    }
}

TEST(UReportDocWindow, AnotherRunHidesTheReportsPane)
{
    WindowedReport t(QStringLiteral("Traverse"));
    ASSERT_TRUE(t.report->GetFrameWindow()->IsVisible());
    t.report->UpdateReportInfo(QString(), false, false);
    EXPECT_FALSE(t.report->GetFrameWindow()->IsVisible());

    UReportDoc withoutPane;
    withoutPane.UpdateReportInfo(QStringLiteral("Levels"), false, false);
    EXPECT_EQ(withoutPane.GetTitle(), QStringLiteral("Levels"));
}

TEST(UReportDocWindow, AnotherRunBringsAClosedWindowBack)
{
    struct Row
    {
        bool created;
        QStringList calls;
        const char *reason;
    };
    const Row rows[] = {
        {true, {QStringLiteral("not active")}, "a window that is there stays as it is"},
        {false, {QStringLiteral("create Traverse"), QStringLiteral("not active")}, "one that was closed"},
    };
    for (const Row &row : rows) {
        WindowedReport t;
        t.window->created = row.created;
        t.report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
        EXPECT_EQ(t.window->calls, row.calls) << row.reason;
    }
    WindowedReport t;
    t.window->created = false;
    t.window->canBeCreated = false;
    t.report->UpdateReportInfo(QStringLiteral("Traverse"), true, false);
    EXPECT_EQ(t.report->GetTitle(), QStringLiteral("Traverse"))
        << "without a window the report is written all the same";
}

TEST(UReportDocWindow, AnotherNameIsWrittenIntoTheReport)
{
    struct Row
    {
        QString title;
        QString name;
        bool written;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("Traverse"), QStringLiteral("Traverse"), false, "the same name"},
        {QStringLiteral("Traverse"), QStringLiteral("TRAVERSE"), false, "case does not matter"},
        {QStringLiteral("Traverse 2"), QStringLiteral("traverse"), false, "the title begins with it"},
        {QStringLiteral("Traverse"), QStringLiteral("T"), false, "also with a single letter"},
        {QStringLiteral("Traverse"), QStringLiteral(""), false, "and with nothing"},
        {QStringLiteral("Traverse"), QString(), false, "no name"},
        {QStringLiteral("Traverse"), QStringLiteral("Traverse 2"), true, "the title is shorter"},
        {QStringLiteral("Traverse"), QStringLiteral("raverse"), true, "within the title, not at its beginning"},
        {QStringLiteral("Traverse"), QStringLiteral("Levels"), true, "another name"},
        {QString(), QStringLiteral("Traverse"), true, "a report without a title"},
    };
    for (const Row &row : rows) {
        WindowedReport t(row.title);
        t.report->WriteLine(QStringLiteral("before"), 0, 1, 0);
        t.report->UpdateReportInfo(row.name, false, false);
        EXPECT_EQ(t.lines(), row.written ? QStringLiteral("before\n\n\n") + row.name + QStringLiteral("\n\n")
                                         : QStringLiteral("before\n"))
            << row.reason;
        EXPECT_EQ(t.window->pieces.contains(row.name), row.written) << row.reason;
        EXPECT_EQ(t.report->GetReportFileName(), row.name.isNull() ? row.title : row.name) << row.reason;
    }
}

/// Writes down what its report is when it is called.
class WitnessWindow : public TestReportWindow
{
public:
    void WriteLine(const QString &piece) override { seen += piece.trimmed() + QStringLiteral(" under ") + state(); }
    bool createDocked(const QString &caption, UView *previousView) override
    {
        seen += QStringLiteral("create: ") + state();
        return TestReportWindow::createDocked(caption, previousView);
    }
    void setActive(bool active) override
    {
        seen += (active ? QStringLiteral("active: ") : QStringLiteral("not active: ")) + state();
    }

    UReportDoc *report = nullptr;
    QStringList seen;

private:
    QString state() const
    {
        return QStringLiteral("%1, %2, %3, %4")
            .arg(report->GetTitle(), report->GetReportFileName(),
                 report->GetHeaderFlag() ? QStringLiteral("headers") : QStringLiteral("none"),
                 report->GetFrameWindow()->IsVisible() ? QStringLiteral("shown") : QStringLiteral("hidden"));
    }
};

TEST(UReportDocWindow, AnotherRunGoesStepByStep)
{
    WindowedReport t(QStringLiteral("First"));
    delete t.window;
    auto *window = new WitnessWindow;
    t.window = window;
    window->created = false;
    window->report = t.report;
    t.report->SetReportWindow(window);
    ASSERT_TRUE(t.report->GetFrameWindow()->IsVisible());
    t.report->UpdateReportInfo(QStringLiteral("Second"), true, false);
    window->seen.removeIf([](const QString &piece) {
        return piece.startsWith(QStringLiteral(" under ")) || piece.startsWith(QStringLiteral("TALVEN - "));
    });
    EXPECT_EQ(window->seen, (QStringList{QStringLiteral("create: First, First, headers, hidden"),
                                         QStringLiteral("not active: First, First, headers, hidden"),
                                         QStringLiteral("Second under First, First, headers, hidden")}))
        << "the pane is hidden and the flags are set before the window is there; the name is written before it is the title";
    EXPECT_EQ(t.report->GetTitle(), QStringLiteral("Second"));
}

TEST(UReportDocWindow, WithoutANameTheTitleStays)
{
    WindowedReport t(QStringLiteral("Traverse"));
    t.report->UpdateReportInfo(QString(), true, true);
    EXPECT_EQ(t.report->GetTitle(), QStringLiteral("Traverse"));
    EXPECT_EQ(t.report->GetReportFileName(), QStringLiteral("Traverse"));
    EXPECT_TRUE(t.report->GetHeaderFlag());
    EXPECT_EQ(t.window->calls, QStringList{QStringLiteral("not active")});
}

/// A pane that counts how often it is brought to the front.
class ToppedPane : public CViewPane
{
public:
    void BringToTop() override { ++tops; }
    int tops = 0;
};

TEST(UReportDocWindow, TheActiveViewIsRememberedAndGetsItsPlaceBack)
{
    WindowedReport t(QStringLiteral("Traverse"));
    UXTPMDIFrameWnd frame;
    UReportDoc worked;
    worked.SetAutoDelete(false);
    ToppedPane pane;
    UView *view = showIn<UView>(pane, worked);
    pane.ShowPane(true);

    /// Takes the active view's place when it is created, as windows do.
    class GreedyWindow : public TestReportWindow
    {
    public:
        explicit GreedyWindow(UXTPMDIFrameWnd &frame) : frame_(frame) { created = false; }
        bool createDocked(const QString &caption, UView *previousView) override
        {
            frame_.SetActiveViewForFrameAndPane(nullptr);
            return TestReportWindow::createDocked(caption, previousView);
        }

    private:
        UXTPMDIFrameWnd &frame_;
    };
    delete t.window;
    t.window = new GreedyWindow(frame);
    t.report->SetReportWindow(t.window);

    frame.SetActiveViewForFrameAndPane(view);
    t.report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
    EXPECT_EQ(t.window->previous, view);
    EXPECT_EQ(frame.GetActiveView(), view);
    EXPECT_EQ(pane.tops, 1);

    UView withoutPane;
    frame.SetActiveViewForFrameAndPane(&withoutPane);
    t.window->created = false;
    t.report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
    EXPECT_EQ(frame.GetActiveView(), nullptr) << "a view without a pane has no place to get back";

    frame.SetActiveViewForFrameAndPane(nullptr);
    t.report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
    EXPECT_EQ(frame.GetActiveView(), nullptr);
    EXPECT_EQ(pane.tops, 1);
}

} // namespace
