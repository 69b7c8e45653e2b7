#include "FailingAllocation.h"

#include "ReportEdit.h"
#include "ViewFixture.h"

#include <QTest>

#include <gtest/gtest.h>

namespace
{

/// What the view loads takes so many bytes at least; all else that it asks for takes less.
constexpr std::size_t leastBytes = 1'000'000;

QString longText()
{
    return QStringLiteral("a line of a report\r\n").repeated(60'000);
}

/// Types a letter into a view as a user does.
void type(UReportView &view)
{
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
}

TEST(ViewAllocations, AReportThatCouldNotBeShownIsNotReplacedByWhatIs)
{
    struct Row
    {
        bool richText;
        const char *reason;
    };
    constexpr Row rows[] = {
        {false, "the text itself"},
        {true, "its image as rich text"},
    };
    for (const Row &row : rows) {
        SCOPED_TRACE(row.reason);
        ShownReport shown;
        shown.report.SetRTFDataFlag(row.richText);
        UReportView &view = shown.open();
        ASSERT_TRUE(shown.report.Write(longText(), 0));
        shown.report.SetModifiedFlag(false);
        const QString text = shown.report.CopyText();
        {
            const FailingAllocation failing(1, leastBytes, FailingAllocation::Extent::AllAfter);
            view.UpdateData(true);
            ASSERT_TRUE(failing.hasFailed());
        }
        EXPECT_TRUE(view.GetEdit().isReadOnly()) << "what it shows is not the report";
        type(view);
        view.GetEdit().undo();
        view.OnChange();
        view.UpdateData(false);
        EXPECT_TRUE(shown.report.CopyText() == text) << "nothing of it has become the report's";
        EXPECT_FALSE(shown.report.IsModified());
        EXPECT_FALSE(shown.report.HasLostText());

        view.OnUpdate(nullptr, 0, nullptr);
        EXPECT_FALSE(view.GetEdit().isReadOnly()) << "the next update finds the memory";
        type(view);
        EXPECT_TRUE(shown.report.IsModified());
        if (!row.richText) {
            EXPECT_EQ(shown.report.GetTextLength(), text.size() + 1) << "one letter more";
        }
    }
}

TEST(ViewAllocations, ALoadInPiecesThatIsCutShortWithoutMemoryTakesNoEdit)
{
    ShownReport shown;
    UReportView &view = shown.open(true);
    ASSERT_TRUE(shown.report.Write(longText(), 0));
    view.OnUpdate(nullptr, 0, nullptr);
    ASSERT_TRUE(view.GetEdit().isLoading());
    ASSERT_TRUE(shown.report.ReplaceText(0, 1, QStringLiteral("A"))); // the pieces are of another text from now on
    const QString text = shown.report.CopyText();
    {
        const FailingAllocation failing(1, leastBytes, FailingAllocation::Extent::AllAfter);
        view.GetEdit().finishLoading();
        ASSERT_TRUE(failing.hasFailed());
    }
    EXPECT_TRUE(view.GetEdit().isReadOnly());
    type(view);
    EXPECT_TRUE(shown.report.CopyText() == text);
    view.UpdateData(true);
    EXPECT_FALSE(view.GetEdit().isReadOnly());
    EXPECT_EQ(view.GetEdit().windowTextLength(), text.size()) << "all of it is there";
}

} // namespace
