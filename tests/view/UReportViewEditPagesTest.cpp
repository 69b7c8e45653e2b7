#include "PageHeader.h"
#include "ReportPages.h"
#include "ViewFixture.h"

#include <QClipboard>
#include <QTextBlock>

namespace
{

using kareport::ReportEdit;

/// Three pages without header lines, each of three lines: only the record tells them apart.
void writePages(UReportDoc &report, const QString &secondLine)
{
    report.FixPage(12, 80);
    report.SetHeaderFlag(false);
    for (int page = 1; page <= 3; ++page) {
        if (page > 1) {
            report.NewPage(-1);
        }
        report.WriteLine(QStringLiteral("page %1").arg(page), 0, 1, 0);
        report.WriteLine(secondLine, 0, 1, 0);
        report.WriteLine(QStringLiteral("last of %1").arg(page), 0, 1, 0);
    }
}

/// The first line of each page, by what the view shows and by the document.
QStringList firstLines(UReportView &view, const UReportDoc &report)
{
    QStringList lines;
    for (int page = 1; page <= widgetOf(view).pageCount(); ++page) {
        widgetOf(view).goToPage(page);
        lines += view.GetEdit().textCursor().block().text().trimmed();
    }
    QStringList known;
    const QString text = textOf(report);
    for (const kareport::ReportPage &page : report.GetPages()) {
        known += text.sliced(page.begin).section(QStringLiteral("\r\n"), 0, 0).trimmed();
    }
    EXPECT_EQ(lines, known);
    return known;
}

/// A report whose control shows another text than it holds, so that the first edit takes the control's over.
struct Kind
{
    bool isImage;
    QString secondLine;
    const char *name;
};

std::vector<Kind> kinds()
{
    return {{false, QStringLiteral("a\rb"), "a return in a line"},
            {false, QStringLiteral("a\u2029b"), "a separator of paragraphs"},
            {false, QStringLiteral("a\nb"), "a line feed"},
            {true, QStringLiteral("b"), "a rich-text image, with a blank after each line"}};
}

/// Removes what is between the middle of the first page's last line and the cursor.
void joinWithLineBefore(ReportEdit &edit)
{
    QTextCursor cursor = edit.textCursor();
    cursor.setPosition(static_cast<int>(edit.toPlainText().indexOf(QStringLiteral("of 1"))), QTextCursor::KeepAnchor);
    edit.setTextCursor(cursor);
    QTest::keyClick(&edit, Qt::Key_Delete);
}

/// An edit of three pages, and what the pages begin with after it.
struct FirstEdit
{
    const char *at; ///< the cursor is before it
    int length;     ///< of what is selected
    void (*act)(ReportEdit &edit);
    QStringList expected;
    const char *reason;
};
const QStringList three = {QStringLiteral("page 1"), QStringLiteral("page 2"), QStringLiteral("page 3")};
const FirstEdit firstEdits[] = {
    {"last of 1", 0, [](ReportEdit &e) { QTest::keyClick(&e, Qt::Key_X); }, three, "a letter"},
    {"last of 1", 0, [](ReportEdit &e) { QTest::keyClick(&e, Qt::Key_Return); }, three, "a line end"},
    {"last of 2", 5,
     [](ReportEdit &e) {
         QApplication::clipboard()->setText(QStringLiteral("1\n2\n3\n"));
         e.paste();
     },
     three, "lines over a selection"},
    {"page 2", 0, [](ReportEdit &e) { QTest::keyClick(&e, Qt::Key_Return); }, three,
     "a line end at a page's start is the page's before"},
    {"page 2",
     0,
     [](ReportEdit &e) { QTest::keyClick(&e, Qt::Key_X); },
     {QStringLiteral("page 1"), QStringLiteral("xpage 2"), QStringLiteral("page 3")},
     "a letter there is the page's"},
    {"page 2",
     6,
     [](ReportEdit &e) { QTest::keyClick(&e, Qt::Key_Delete); },
     {QStringLiteral("page 1"), QString(), QStringLiteral("page 3")},
     "the first line of a page goes, not the page"},
    {"page 1",
     0,
     [](ReportEdit &e) { QTest::keyClick(&e, Qt::Key_Return); },
     {QString(), QStringLiteral("page 2"), QStringLiteral("page 3")},
     "before the first page there is none"},
    {"page 2", 0, [](ReportEdit &e) { QTest::keyClick(&e, Qt::Key_Backspace); }, three,
     "a blank line before a page goes"},
    {"page 2",
     0,
     [](ReportEdit &e) { joinWithLineBefore(e); },
     {QStringLiteral("page 1"), QStringLiteral("page 3")},
     "a start that begins no line does not count"},
    {"page 2", 0,
     [](ReportEdit &e) {
         joinWithLineBefore(e);
         e.undo();
     },
     three, "and counts again"},
    {"page 3",
     0,
     [](ReportEdit &e) {
         e.moveCursor(QTextCursor::Start, QTextCursor::KeepAnchor);
         QTest::keyClick(&e, Qt::Key_Delete);
     },
     {QStringLiteral("page 3")},
     "all before a page"},
};

TEST(UReportViewEditPages, TheFirstEditCarriesTheRecordAlong)
{
    for (const Kind &kind : kinds()) {
        for (const FirstEdit &edit : firstEdits) {
            ShownReport t;
            t.report.SetRTFDataFlag(kind.isImage);
            writePages(t.report, kind.secondLine);
            UReportView &view = t.open();
            ASSERT_EQ(firstLines(view, t.report), three) << kind.name;
            const int at = static_cast<int>(view.GetEdit().toPlainText().indexOf(QString::fromUtf8(edit.at)));
            putCursor(view.GetEdit(), at + edit.length, at);
            edit.act(view.GetEdit());
            EXPECT_EQ(firstLines(view, t.report), edit.expected) << kind.name << ": " << edit.reason;
        }
    }
}

TEST(UReportViewEditPages, ATextThatIsTakenOverKeepsItsPages)
{
    for (const Kind &kind : kinds()) {
        ShownReport t;
        t.report.SetRTFDataFlag(kind.isImage);
        writePages(t.report, kind.secondLine);
        UReportView &view = t.open();
        const QStringList before = firstLines(view, t.report);
        view.OnChange();
        EXPECT_EQ(textOf(t.report), view.GetEdit().windowText()) << kind.name;
        EXPECT_EQ(firstLines(view, t.report), before) << kind.name;
    }
}

TEST(UReportViewEditPages, APastedHeaderBeginsAPageWithTheFirstEditAlready)
{
    const QString header =
        kareport::pageHeaderLine(QStringLiteral("A"), QStringLiteral("T"), QDateTime(QDate(2024, 3, 5), QTime(14, 7)),
                                 QStringLiteral("   Page:"), 80) +
        QStringLiteral("  9");
    for (const Kind &kind : kinds()) {
        ShownReport t;
        t.report.SetRTFDataFlag(kind.isImage);
        writePages(t.report, kind.secondLine);
        UReportView &view = t.open();
        putCursor(view.GetEdit(), static_cast<int>(view.GetEdit().toPlainText().indexOf(QStringLiteral("last of 1"))));
        QApplication::clipboard()->setText(header + u'\n');
        view.GetEdit().paste();
        EXPECT_EQ(firstLines(view, t.report),
                  QStringList({QStringLiteral("page 1"), header, QStringLiteral("page 2"), QStringLiteral("page 3")}))
            << kind.name;
    }
}

TEST(UReportViewEditPages, AHeaderLineThatBeginsNoPageIsAnOrdinaryLineAlsoAfterTheFirstEdit)
{
    for (const Kind &kind : kinds()) {
        ShownReport t;
        t.report.SetRTFDataFlag(kind.isImage);
        t.report.WriteLine(kind.secondLine, 0, 1, 0);
        t.report.WriteLine(headerOf(QString(), 7), 0, 1, 0);
        t.report.SetPageStarts({});
        UReportView &view = t.open();
        putCursor(view.GetEdit(), 0);
        QTest::keyClick(&view.GetEdit(), Qt::Key_X);
        EXPECT_TRUE(t.report.GetPageStarts().empty()) << kind.name;
        view.OnChange();
        EXPECT_TRUE(t.report.GetPageStarts().empty()) << kind.name << ", taken as a whole";
    }
}

TEST(UReportViewEditPages, AViewThatIsBehindItsReportKnowsNoPages)
{
    ShownReport t;
    writePages(t.report, QStringLiteral("a\rb"));
    UReportView &view = t.open();
    t.report.SetData(QStringLiteral("other\r\n").repeated(200));
    t.report.SetPageStarts({0, 700});
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_EQ(textOf(t.report), view.GetEdit().windowText());
    EXPECT_TRUE(t.report.GetPageStarts().empty()) << "those of the other text are not this one's";
}

} // namespace
