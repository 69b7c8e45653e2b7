#include "ReportWindowFixture.h"

#include "BracketTranslator.h"
#include "ReportContent.h"
#include "XInput.h"

#include <gtest/gtest.h>

namespace
{

using ReportWindow = OwnReportWindow;

TEST_F(ReportWindow, BeginsWithoutAnything)
{
    EXPECT_FALSE(window.IsActive());
    EXPECT_FALSE(window.isCreated());
    EXPECT_EQ(window.GetReportDoc(), nullptr);
    EXPECT_EQ(window.GetPreviousView(), nullptr);
    EXPECT_EQ(window.GetList(), nullptr);
    EXPECT_EQ(window.GetToolBar(), nullptr);
    EXPECT_EQ(window.GetOwningPane(), nullptr) << "there is nothing to close";
    EXPECT_FALSE(window.CanBeTabbedDocument());
    window.WriteLine(QStringLiteral("lost"));
    window.showBar(true);
    window.takeFocus();
    window.UpdateDocumentData();
    window.ActivatePreviousView();
    window.OnSize(0, 100, 50);
    window.ClosePane();
    EXPECT_FALSE(window.IsVisible());
    ASSERT_TRUE(create());
    EXPECT_EQ(rows(), QStringList()) << "lines are not kept for later";
}

TEST_F(ReportWindow, IsCreatedAtTheBottomOfTheFrame)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    window.setActive(true);
    ASSERT_TRUE(create(QStringLiteral("Traverse"), report->GetViews().front()));
    EXPECT_TRUE(window.isCreated());
    EXPECT_TRUE(window.IsVisible());
    EXPECT_TRUE(window.GetList()->isVisible());
    EXPECT_EQ(desk.frame->dockWidgetArea(window.GetDock()), Qt::BottomDockWidgetArea);
    EXPECT_EQ(window.GetDock()->allowedAreas(), Qt::AllDockWidgetAreas);
    EXPECT_EQ(window.GetWindowTextW(), QStringLiteral("Traverse"));
    EXPECT_EQ(window.GetDock()->windowTitle(), QStringLiteral("Traverse"));
    EXPECT_EQ(window.GetPreviousView(), report->GetViews().front());
    EXPECT_EQ(window.GetOwningPane(), &window);
    EXPECT_FALSE(window.IsActive()) << "a window that is new is not active";
    EXPECT_EQ(window.GetList()->accessibleName(), QStringLiteral("Report lines"));
    EXPECT_EQ(window.GetDock()->accessibleName(), QStringLiteral("Traverse"));
    const auto *pane = dynamic_cast<COneViewPane *>(report->GetFrameWindow());
    EXPECT_GT(pane->GetDock()->height(), window.GetDock()->height()) << "the documents keep the greater part";
    EXPECT_NEAR(window.GetDock()->height(), window.GetDock()->sizeHint().height(), 40);
}

TEST_F(ReportWindow, ItsTextsAreTranslatedWhenItIsPrepared)
{
    ASSERT_TRUE(create());
    window.setActive(true);
    ASSERT_EQ(window.GetList()->accessibleName(), QStringLiteral("Report lines"));
    const BracketTranslator translator;
    EXPECT_EQ(window.HandleInitDialog(), 0);
    EXPECT_FALSE(window.IsActive());
    EXPECT_EQ(window.GetList()->accessibleName(), QStringLiteral("[Report lines]"));
    WindowDesk::settle();
    const CReportToolBar *bar = window.GetToolBar();
    EXPECT_EQ(bar->actions().front()->toolTip(), QStringLiteral("[Save]"));
}

TEST_F(ReportWindow, IsCreatedOnce)
{
    ASSERT_TRUE(create());
    const UReportList *list = window.GetList();
    window.WriteLine(QStringLiteral("line"));
    EXPECT_TRUE(create(QStringLiteral("other"))) << "it is there";
    EXPECT_EQ(window.GetList(), list);
    EXPECT_EQ(rows(), QStringList{QStringLiteral("line")});
    EXPECT_EQ(window.GetWindowTextW(), QStringLiteral("Traverse"));
}

TEST_F(ReportWindow, IsAtTheLeftUnlessItIsDocked)
{
    EXPECT_TRUE(window.Create(QString(), nullptr));
    WindowDesk::settle();
    EXPECT_EQ(desk.frame->dockWidgetArea(window.GetDock()), Qt::LeftDockWidgetArea);
    EXPECT_TRUE(window.IsVisible());
    EXPECT_EQ(window.GetDock()->windowTitle(), QString()) << "no title";
}

TEST_F(ReportWindow, ThereIsNoneWithoutAFrame)
{
    desk.frame.reset();
    EXPECT_FALSE(create());
    EXPECT_FALSE(window.Create(QStringLiteral("Traverse"), nullptr));
    EXPECT_FALSE(window.isCreated());
    EXPECT_EQ(window.GetList(), nullptr);
}

TEST_F(ReportWindow, TheBarIsAboveTheList)
{
    ASSERT_TRUE(create());
    const int bar = window.GetToolBar()->sizeHint().height();
    ASSERT_GT(bar, 0);
    struct Row
    {
        QSize size;
        QRect list;
        const char *reason;
    };
    const Row rows[] = {
        {{300, 200}, {0, bar, 300, 200 - bar}, "the list takes the rest"},
        {{50, 120}, {0, bar, 50, 120 - bar}, "narrow"},
        {{300, bar}, {0, bar, 300, 0}, "room for the bar alone"},
        {{300, 3}, {0, bar, 300, 0}, "not even for that"},
    };
    for (const Row &row : rows) {
        window.OnSize(0, row.size.width(), row.size.height());
        EXPECT_EQ(window.GetToolBar()->geometry(), QRect(0, 0, row.size.width(), bar)) << row.reason;
        EXPECT_EQ(window.GetList()->geometry().topLeft(), row.list.topLeft()) << row.reason;
        EXPECT_EQ(window.GetList()->width(), row.list.width()) << row.reason;
        EXPECT_EQ(window.GetList()->height(), row.list.height()) << row.reason;
    }
    desk.frame->resize(640, 480);
    WindowDesk::settle();
    EXPECT_EQ(window.GetList()->parentWidget()->size(),
              QSize(window.GetToolBar()->width(), bar + window.GetList()->height()))
        << "it follows the window";
}

TEST_F(ReportWindow, ItsPartsAreKnownByTheirNumbers)
{
    ASSERT_TRUE(create());
    EXPECT_EQ(window.GetList()->GetDlgCtrlID(), 11005);
    EXPECT_EQ(window.GetToolBar()->GetDlgCtrlID(), 11018);
    window.GetList()->Resize(3, 40, 200, 60);
    EXPECT_EQ(window.GetList()->geometry(), QRect(3, 40, 200, 60)) << "as one that was created by itself";
}

TEST_F(ReportWindow, ShowsLinesAsTheyAreWritten)
{
    ASSERT_TRUE(create());
    const QStringList lines = {QStringLiteral("TALVEN - Traverse"), QStringLiteral("    indented"), QStringLiteral(" "),
                               QStringLiteral("two\r\nlines"), QStringLiteral("\ttab")};
    for (const QString &line : lines) {
        window.WriteLine(line);
        EXPECT_EQ(window.GetList()->GetText(window.GetList()->GetCurSel()), line) << "the newest is the current one";
    }
    EXPECT_EQ(rows(), lines) << "leading blanks and all";
}

TEST_F(ReportWindow, IsHiddenAndShownWithItsLines)
{
    ASSERT_TRUE(create());
    window.WriteLine(QStringLiteral("line"));
    window.showBar(false);
    EXPECT_FALSE(window.IsVisible());
    EXPECT_TRUE(window.isCreated());
    window.WriteLine(QStringLiteral("while it is hidden"));
    window.showBar(true);
    EXPECT_TRUE(window.IsVisible());
    EXPECT_EQ(rows(), (QStringList{QStringLiteral("line"), QStringLiteral("while it is hidden")}));
}

TEST_F(ReportWindow, IsCreatedAgainAfterItWasClosed)
{
    ASSERT_TRUE(create());
    window.setActive(true);
    window.WriteLine(QStringLiteral("line"));
    window.ClosePane();
    EXPECT_FALSE(window.isCreated());
    EXPECT_FALSE(window.IsVisible());
    EXPECT_EQ(window.GetList(), nullptr);
    WindowDesk::settle();
    EXPECT_TRUE(desk.frame->findChildren<QDockWidget *>().isEmpty()) << "nothing is left of it in the frame";
    window.WriteLine(QStringLiteral("lost"));
    ASSERT_TRUE(create(QStringLiteral("Again")));
    EXPECT_TRUE(window.IsVisible());
    EXPECT_FALSE(window.IsActive());
    EXPECT_EQ(rows(), QStringList()) << "a new window has no lines";
    window.WriteLine(QStringLiteral("new"));
    EXPECT_EQ(rows(), QStringList{QStringLiteral("new")});
    EXPECT_EQ(window.GetDock()->windowTitle(), QStringLiteral("Again"));
}

TEST_F(ReportWindow, HasTheFontOfItsReport)
{
    UReportDoc report;
    report.SetFontName(QStringLiteral("DejaVu Sans Mono"));
    report.SetFontSize(13);
    ASSERT_TRUE(create());
    EXPECT_EQ(window.GetList()->font(), kareport::reportFont(QStringLiteral("Lucida Console"), 8)) << "of no report";
    window.SetReportDoc(&report);
    EXPECT_EQ(window.GetList()->font(), kareport::reportFont(QStringLiteral("DejaVu Sans Mono"), 13));
    window.ClosePane();
    ASSERT_TRUE(create());
    EXPECT_EQ(window.GetList()->font(), kareport::reportFont(QStringLiteral("DejaVu Sans Mono"), 13));
}

TEST_F(ReportWindow, IsRefilledFromTheReportsText)
{
    struct Row
    {
        QString text;
        QStringList expected;
        const char *reason;
    };
    const QString a = QStringLiteral("A");
    const QString b = QStringLiteral("B");
    const QString c = QStringLiteral("C");
    const Row rows_[] = {
        {QString(), {}, "no text"},
        {QStringLiteral("A\r\n  B\r\n\r\nC"), {a, b, c}, "without leading blanks and empty lines"},
        {QStringLiteral("A\r\n  B\r\n\r\nC\r\n"), {a, b, c}, "the last line ended"},
        {QStringLiteral("\r\n\r\n"), {}, "only empty lines"},
        {QStringLiteral("   \r\n \t \r\n  "), {}, "only blank ones"},
        {QStringLiteral("A \r\nB\t\r\n"), {QStringLiteral("A "), QStringLiteral("B\t")}, "blanks at the end stay"},
        {QStringLiteral("A\rB\r\rC"), {a, b, c}, "a carriage return ends a line"},
        {QStringLiteral("A\nB\r\nC"), {QStringLiteral("A\nB"), c}, "a line feed alone does not"},
        {QStringLiteral("\n\n A"), {a}, "line feeds before a line go with its blanks"},
        {QStringLiteral("\u3000\u00A0A"), {a}, "blanks of other scripts"},
        {QStringLiteral("A"), {a}, "one line"},
    };
    for (const Row &row : rows_) {
        UReportDoc report;
        report.SetData(row.text);
        ASSERT_TRUE(create());
        window.SetReportDoc(&report);
        window.UpdateDocumentData();
        EXPECT_EQ(rows(), row.expected) << row.reason;
        EXPECT_EQ(window.GetList()->GetCurSel(), -1) << "no line is the current one; " << row.reason;
        EXPECT_EQ(textOf(report), row.text) << row.reason;
        window.ClosePane();
    }
    UReportDoc report;
    report.SetData(QStringLiteral("A\r\nB"));
    ASSERT_TRUE(create());
    window.SetReportDoc(&report);
    window.WriteLine(QStringLiteral("  written"));
    window.UpdateDocumentData();
    EXPECT_EQ(rows(), (QStringList{QStringLiteral("  written"), a, b})) << "what the list has stays";
    EXPECT_EQ(window.GetList()->GetCurSel(), 0);
}

/// An input operation that a view is in the middle of.
class TestInput : public XInput
{
public:
    explicit TestInput(UView &view) : view_(view.GetHandle()) { view.SetTop(this); }
    ~TestInput() override { end(); }
    void Terminate(int reason) override
    {
        reasons.push_back(reason);
        if (ends) {
            end();
        }
    }

    std::vector<int> reasons;
    bool ends = true;

private:
    void end()
    {
        if (*view_ != nullptr) {
            (*view_)->SetTop(nullptr);
        }
    }

    std::shared_ptr<UView *const> view_;
};

TEST_F(ReportWindow, EscapeEndsWhatThePreviousViewIsInTheMiddleOf)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    UView &view = *report->GetViews().front();
    ASSERT_TRUE(create(QStringLiteral("Traverse"), &view));
    TestInput input(view);
    struct Row
    {
        QEvent::Type type;
        int key;
        bool used;
        const char *reason;
    };
    const Row rows_[] = {
        {QEvent::KeyPress, Qt::Key_Escape, true, "pressed"},
        {QEvent::KeyRelease, Qt::Key_Escape, true, "released"},
        {QEvent::KeyPress, Qt::Key_Return, false, "another key"},
        {QEvent::KeyPress, 27, false, "the number of the key elsewhere"},
    };
    for (const Row &row : rows_) {
        input.reasons.clear();
        view.SetTop(&input);
        QKeyEvent event(row.type, row.key, Qt::NoModifier);
        EXPECT_EQ(window.PreTranslateMessage(&event), row.used) << row.reason;
        EXPECT_EQ(input.reasons, row.used ? std::vector<int>{2} : std::vector<int>{}) << row.reason;
    }
    QMouseEvent press(QEvent::MouseButtonPress, QPointF(), QPointF(), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    EXPECT_FALSE(window.PreTranslateMessage(&press)) << "no key at all";

    input.reasons.clear();
    QKeyEvent question(QEvent::ShortcutOverride, Qt::Key_Escape, Qt::NoModifier);
    question.ignore();
    EXPECT_TRUE(window.PreTranslateMessage(&question));
    EXPECT_TRUE(question.isAccepted()) << "it is to come as a key, not as a shortcut";
    EXPECT_TRUE(input.reasons.empty()) << "nothing ends before it does";

    QKeyEvent escape(QEvent::KeyPress, Qt::Key_Escape, Qt::NoModifier);
    view.SetTop(nullptr);
    EXPECT_FALSE(window.PreTranslateMessage(&escape)) << "the view is in the middle of nothing";
    report->OnCloseDocument();
    EXPECT_EQ(window.GetPreviousView(), nullptr) << "the view has gone";
    EXPECT_FALSE(window.PreTranslateMessage(&escape));
}

TEST_F(ReportWindow, EscapeComesToTheWindowWhateverInItHasTheKeyboard)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    ASSERT_TRUE(create(QStringLiteral("Traverse"), report->GetViews().front()));
    window.SetReportDoc(report);
    window.setActive(true);
    QWidgetList inside = {window.GetList(), window.GetToolBar()};
    for (QAction *button : window.GetToolBar()->actions()) {
        inside += window.GetToolBar()->widgetForAction(button);
    }
    ASSERT_EQ(inside.size(), 5);
    TestInput input(*report->GetViews().front());
    input.ends = false;
    for (QWidget *widget : inside) {
        input.reasons.clear();
        QTest::keyClick(widget, Qt::Key_Escape);
        EXPECT_EQ(input.reasons, (std::vector<int>{2, 2}))
            << "pressed and released, in " << widget->metaObject()->className();
    }
    input.reasons.clear();
    QTest::keyClick(report->GetViews().front()->GetWidget(), Qt::Key_Escape);
    EXPECT_TRUE(input.reasons.empty()) << "the view itself is not the window's business";
}

} // namespace
