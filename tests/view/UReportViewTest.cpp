#include "ViewFixture.h"

#include "UXTPMDIFrameWnd.h"

#include <QFontInfo>

namespace
{

using kareport::ReportEdit;

TEST(UReportView, ShowsAReportAsItsTextBegins)
{
    struct Row
    {
        const char16_t *text;
        UReportView::WordWrap wrap;
        const char16_t *shown;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", UReportView::WrapNone, u"", "an empty report"},
        {u"one\r\ntwo", UReportView::WrapNone, u"one\ntwo", "plain text"},
        {u"\r\n", UReportView::WrapNone, u"\n", "a line end only"},
        {u"{\\rtf1 a{\\b b}\\par c}", UReportView::WrapToWindow, u"ab\nc", "rich text at the beginning"},
        {u" {\\rtf1 a}", UReportView::WrapNone, u" {\\rtf1 a}", "rich text after a blank is plain text"},
        {u"x\r\n{\\rtf1 a}", UReportView::WrapNone, u"x\n{\\rtf1 a}", "rich text further on"},
        {u"{\\rt", UReportView::WrapNone, u"{\\rt", "a part of the beginning"},
        {u"{\\RTF1 a}", UReportView::WrapNone, u"{\\RTF1 a}", "its letters are small"},
    };
    for (const Row &row : rows) {
        ShownReport t(QString::fromUtf16(row.text));
        UReportView &view = t.open();
        EXPECT_EQ(view.GetWordWrap(), row.wrap) << row.reason;
        EXPECT_EQ(view.GetEdit().lineWrapMode() == ReportEdit::WidgetWidth, row.wrap == UReportView::WrapToWindow)
            << row.reason;
        EXPECT_EQ(view.GetEdit().toPlainText(), QString::fromUtf16(row.shown)) << row.reason;
        EXPECT_EQ(textOf(t.report), QString::fromUtf16(row.text)) << row.reason << ": showing changes nothing";
        EXPECT_FALSE(t.report.IsModified()) << row.reason;
    }
}

TEST(UReportView, WordWrapFollowsTheContentOnEveryUpdate)
{
    ShownReport t(QStringLiteral("{\\rtf1 a}"));
    UReportView &view = t.open();
    ASSERT_EQ(view.GetWordWrap(), UReportView::WrapToWindow);
    t.report.SetData(QStringLiteral("plain"));
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("a")) << "shown with the next update";
    t.report.UpdateAllViews(nullptr);
    EXPECT_EQ(view.GetWordWrap(), UReportView::WrapNone);
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("plain"));
    t.report.SetData(QStringLiteral("{\\rtf1 b}"));
    t.report.UpdateAllViews(nullptr);
    EXPECT_EQ(view.GetWordWrap(), UReportView::WrapToWindow);
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("b"));
}

TEST(UReportView, InRichTextModeItShowsTheImageAndNotTheText)
{
    ShownReport t;
    t.report.SetRTFDataFlag(true);
    t.report.WriteLine(QStringLiteral("bold"), 0, 1, 1);
    t.report.SetData(QStringLiteral("something else"));
    UReportView &view = t.open();
    EXPECT_EQ(view.GetWordWrap(), UReportView::WrapToWindow);
    EXPECT_TRUE(view.GetEdit().toPlainText().startsWith(QStringLiteral("bold")));
    QTextCursor cursor(view.GetEdit().document());
    cursor.setPosition(1);
    EXPECT_EQ(cursor.charFormat().fontWeight(), QFont::Bold);
}

TEST(UReportView, FontIsTheReportsAndAlwaysFixedPitch)
{
    ShownReport t(QStringLiteral("x"));
    const QString longName = QStringLiteral("A face whose name has more characters than one may have");
    for (const QString &name : {QStringLiteral("Lucida Console"), longName}) {
        t.report.SetFontName(name);
        t.report.SetFontSize(11);
        UReportView &view = t.open();
        const QFont font = view.GetEdit().font();
        EXPECT_EQ(font.families().first(), name.left(31));
        EXPECT_EQ(font.pointSize(), 11);
        EXPECT_TRUE(QFontInfo(font).fixedPitch());
        EXPECT_EQ(font.weight(), QFont::Normal);
        EXPECT_FALSE(font.italic() || font.underline() || font.strikeOut());
        EXPECT_EQ(view.GetEdit().document()->defaultFont().pointSize(), 11) << "also of what is shown";
    }
}

TEST(UReportView, AnExitWithoutAFrameDefersNoClosing)
{
    ShownReport shown;
    UReportView &view = shown.open();
    shown.report.SetReportWindow(new TestReportWindow);
    view.OnReportExit();
    EXPECT_EQ(shown.report.GetCloseDocument(), 0) << "there is no exit, and nothing would put it back later";
}

TEST(UReportView, AViewWithoutADocument)
{
    UReportView view;
    EXPECT_EQ(view.GetDocument(), nullptr);
    EXPECT_EQ(view.OnCreate(), -1) << "there is no font to take";
    view.OnInitialUpdate();
    view.OnUpdate(nullptr, 0, nullptr);
    view.UpdateData(true);
    view.UpdateData(false);
    view.OnSaveReportText();
    view.OnReportExit();
    EXPECT_NE(view.GetWidget(), nullptr);
    EXPECT_TRUE(view.GetEdit().toPlainText().isEmpty());
}

TEST(UReportView, TheControlsTextGoesIntoTheDocumentWhole)
{
    ShownReport t(QStringLiteral("a\nb"));
    UReportView &view = t.open();
    UReportView &other = t.open();
    view.SetRTFText(QStringLiteral("x\ny\n"));
    EXPECT_EQ(textOf(t.report), QStringLiteral("a\nb")) << "the control only";
    view.UpdateData(false);
    EXPECT_EQ(textOf(t.report), QStringLiteral("x\r\ny\r\n"));
    EXPECT_EQ(other.GetEdit().toPlainText(), QStringLiteral("x\ny\n")) << "the other views follow";
    view.SetRTFText(QStringLiteral("{\\rtf1 rich}"));
    view.OnChange();
    EXPECT_EQ(textOf(t.report), QStringLiteral("rich"));
    EXPECT_TRUE(t.report.IsModified()) << "a change by the user";
}

TEST(UReportView, ReloadingKeepsThePlaceWhereTheUserReads)
{
    ShownReport t(reportLines(QStringLiteral("line\n")).repeated(500));
    UReportView &view = t.open();
    putCursor(view.GetEdit(), 5 * 300);
    view.GetEdit().ensureCursorVisible();
    const int top = view.GetEdit().firstVisibleLine();
    ASSERT_GT(top, 100);
    t.report.UpdateAllViews(nullptr);
    EXPECT_EQ(view.GetEdit().textCursor().blockNumber(), 300);
    EXPECT_EQ(view.GetEdit().firstVisibleLine(), top);
    t.report.SetData(QStringLiteral("short"));
    t.report.UpdateAllViews(nullptr);
    EXPECT_EQ(view.GetEdit().textCursor().position(), 5) << "as far as there is text";
}

TEST(UReportView, WritesWhatItShows)
{
    struct Row
    {
        const char16_t *text;
        QByteArray plain;
        const char *reason;
    };
    const Row rows[] = {
        {u"", "", "nothing"},
        {u"a\r\nb\r\n", "a\r\nb\r\n", "lines"},
        {u"a\nb", "a\r\nb", "other line ends"},
        {u"\u00E9\u00A0\u6E2C\U0001F600", "\xE9\xA0??", "one byte a character, ? for what has none"},
        {u"{\\rtf1 {\\b a}\\par b\\line c}", "a\r\nb\r\nc", "rich text without its formats"},
    };
    for (const Row &row : rows) {
        ShownReport t(QString::fromUtf16(row.text));
        UReportView &view = t.open();
        QBuffer bytes;
        ASSERT_TRUE(bytes.open(QIODevice::WriteOnly));
        EXPECT_TRUE(view.streamPlainText(bytes)) << row.reason;
        EXPECT_EQ(bytes.data(), row.plain) << row.reason;
        QBuffer closed;
        EXPECT_FALSE(view.streamPlainText(closed)) << row.reason << ": a device that takes nothing";
        EXPECT_FALSE(view.streamRichText(closed)) << row.reason;
    }
}

TEST(UReportView, FormatsThatAreNotDrawnAreSavedAgain)
{
    ShownReport t(QStringLiteral("{\\rtf1\\pard\\qc\\li720 centred\\par\\pard {\\fs40\\ul big}}"));
    UReportView &view = t.open();
    view.GetEdit().setZoomPercent(200);
    QBuffer bytes;
    ASSERT_TRUE(bytes.open(QIODevice::WriteOnly));
    ASSERT_TRUE(view.streamRichText(bytes));
    EXPECT_TRUE(bytes.data().contains("\\qc")) << bytes.data().toStdString();
    EXPECT_TRUE(bytes.data().contains("\\li720")) << bytes.data().toStdString();
    EXPECT_TRUE(bytes.data().contains("\\fs40")) << "the size does not depend on the zoom";
    EXPECT_TRUE(bytes.data().contains("\\ul")) << bytes.data().toStdString();
}

TEST(UReportView, ALongReportIsShownWhole)
{
    ShownReport t(reportLines(QStringLiteral("line\n")).repeated(200'000));
    UReportView &view = t.open();
    EXPECT_EQ(view.GetEdit().blockCount(), 200'001);
    putCursor(view.GetEdit(), 5 * 200'000);
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_EQ(t.report.GetTextLength(), 1'200'001);
    EXPECT_TRUE(textOf(t.report).endsWith(QStringLiteral("line\r\nx")));
}

TEST(UReportView, TheFrameForgetsAViewThatGoes)
{
    const FixedSurroundings surroundings;
    UXTPMDIFrameWnd frame;
    auto view = std::make_unique<UReportView>();
    frame.SetActiveViewForFrameAndPane(view.get());
    frame.GetRibbonBar().SetRibbonTabIndexForView(view.get(), 3);
    const UReportView *address = view.get();
    const QPointer<QWidget> widget = view->GetWidget();
    view.reset();
    EXPECT_EQ(frame.GetActiveView(), nullptr);
    EXPECT_EQ(frame.GetRibbonBar().GetRibbonTabIndexForView(address), std::nullopt);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(widget, nullptr) << "its window goes with it";
}

TEST(UReportView, AWindowThatGoesFirstLeavesTheViewUsable)
{
    ShownReport t(QStringLiteral("a"));
    CViewPane pane;
    auto *view = showIn<UReportView>(pane, t.report);
    view->OnInitialUpdate();
    delete view->GetWidget();
    EXPECT_EQ(view->GetWidget(), nullptr);
    EXPECT_EQ(view->OnCreate(), -1);
    t.report.UpdateAllViews(nullptr);
    pane.RemoveView(view);
}

} // namespace
