#include "PrintJob.h"

#include "NumberedPages.h"
#include "PagedText.h"
#include "PrintQt.h"

#include <QApplication>
#include <QFile>
#include <QFileInfo>
#include <QPrinter>
#include <QProgressDialog>
#include <QPushButton>
#include <QTimer>
#include <QWidget>

#include <gmock/gmock.h>

#include <algorithm>

namespace
{

using kareport::PrintOutcome;
using kareport::PrintResult;
using testing::ElementsAre;
using testing::IsEmpty;

/// The progress window, when there is one.
QProgressDialog *progressWindow()
{
    for (QWidget *window : QApplication::topLevelWidgets()) {
        if (auto *dialog = qobject_cast<QProgressDialog *>(window)) {
            return dialog;
        }
    }
    return nullptr;
}

TEST(PrintJob, PrintsThePagesThatThePrinterIsSetTo)
{
    struct Row
    {
        int pages;
        int from;
        int to;
        QPrinter::PageOrder order;
        std::vector<int> printed;
        const char *reason;
    };
    const Row rows[] = {
        {3, 0, 0, QPrinter::FirstPageFirst, {1, 2, 3}, "all"},
        {1, 0, 0, QPrinter::FirstPageFirst, {1}, "one page"},
        {5, 2, 3, QPrinter::FirstPageFirst, {2, 3}, "a range"},
        {5, 5, 5, QPrinter::FirstPageFirst, {5}, "the last"},
        {3, 2, 9, QPrinter::FirstPageFirst, {2, 3}, "a range that goes beyond the end"},
        {3, 0, 0, QPrinter::LastPageFirst, {3, 2, 1}, "all, backwards"},
        {5, 2, 4, QPrinter::LastPageFirst, {4, 3, 2}, "a range, backwards"},
    };
    for (const Row &row : rows) {
        PagedText text;
        NumberedPages pages(row.pages);
        text.printer().setFromTo(row.from, row.to);
        text.printer().setPageOrder(row.order);
        const PrintOutcome outcome = kareport::printPages(text.printer(), pages.source, nullptr);
        EXPECT_EQ(outcome.result, PrintResult::Done) << row.reason;
        EXPECT_EQ(outcome.pages, static_cast<int>(row.printed.size())) << row.reason;
        EXPECT_EQ(pages.printed, row.printed) << row.reason;
        EXPECT_EQ(pages.begun, 1) << row.reason;
        EXPECT_EQ(pages.ended, 1) << row.reason;
        EXPECT_EQ(pagesIn(text.file()), static_cast<int>(row.printed.size())) << row.reason;
        EXPECT_EQ(text.printer().outputFileName(), text.file()) << "the printer is as it was; " << row.reason;
    }
}

TEST(PrintJob, PrintsSinglePagesOutOfSeveralRanges)
{
    PagedText text;
    NumberedPages pages(9);
    text.printer().setPageRanges(QPageRanges::fromString(QStringLiteral("2,4-5,8")));
    kareport::printPages(text.printer(), pages.source, nullptr);
    EXPECT_THAT(pages.printed, ElementsAre(2, 4, 5, 8));
}

TEST(PrintJob, NothingToPrintLeavesTheFileAsItWas)
{
    struct Row
    {
        int pages;
        int from;
        const char *reason;
    };
    for (const Row &row : {Row{0, 0, "no page"}, Row{3, 4, "a range past the end"}}) {
        PagedText text;
        QFile(text.file()).open(QIODevice::WriteOnly);
        NumberedPages pages(row.pages);
        text.printer().setFromTo(row.from, row.from);
        EXPECT_EQ(kareport::printPages(text.printer(), pages.source, nullptr).result, PrintResult::Empty) << row.reason;
        EXPECT_THAT(pages.printed, IsEmpty()) << row.reason;
        EXPECT_EQ(QFileInfo(text.file()).size(), 0) << row.reason;
    }
}

TEST(PrintJob, StopsAtTheLastPageThatIsAskedForAndSaysWhatIsLeftOut)
{
    struct Row
    {
        int pages;
        int lastPage;
        QPrinter::PageOrder order;
        std::vector<int> printed;
        bool isCut;
        const char *reason;
    };
    const Row rows[] = {
        {5, 2, QPrinter::FirstPageFirst, {1, 2}, true, "three pages are left out"},
        {3, 2, QPrinter::FirstPageFirst, {1, 2}, true, "one is"},
        {2, 2, QPrinter::FirstPageFirst, {1, 2}, false, "just as many"},
        {1, 2, QPrinter::FirstPageFirst, {1}, false, "fewer"},
        {5, 0, QPrinter::FirstPageFirst, {1, 2, 3, 4, 5}, false, "no limit"},
        {5, 2, QPrinter::LastPageFirst, {2, 1}, true, "backwards"},
        {2, 2, QPrinter::LastPageFirst, {2, 1}, false, "just as many, backwards"},
    };
    for (const Row &row : rows) {
        PagedText text;
        NumberedPages pages(row.pages);
        text.printer().setPageOrder(row.order);
        const PrintOutcome outcome = kareport::printPages(text.printer(), pages.source, nullptr, row.lastPage);
        EXPECT_EQ(outcome.result, PrintResult::Done) << row.reason;
        EXPECT_EQ(pages.printed, row.printed) << row.reason;
        EXPECT_EQ(outcome.isCut, row.isCut) << row.reason;
    }
    PagedText text;
    NumberedPages pages(5);
    text.printer().setFromTo(1, 2);
    EXPECT_FALSE(kareport::printPages(text.printer(), pages.source, nullptr, 2).isCut) << "no more are asked for";
}

TEST(PrintJob, WindowsAnswerWhileItPrintsAndTheProgressIsShown)
{
    PagedText text;
    NumberedPages pages(200);
    pages.delay = 3;
    std::size_t pagesAtAnswer = 0;
    std::size_t mostPages = 0; // between two answers: on a busy machine, each of them takes longer
    int answers = 0;
    QStringList labels;
    QTimer timer;
    QObject::connect(&timer, &QTimer::timeout, [&] {
        mostPages = std::max(mostPages, pages.printed.size() - pagesAtAnswer);
        pagesAtAnswer = pages.printed.size();
        ++answers;
        if (const QProgressDialog *window = progressWindow()) {
            labels += window->labelText();
            EXPECT_TRUE(window->isModal()) << "nothing else takes input meanwhile";
        }
    });
    timer.start(5);
    EXPECT_EQ(kareport::printPages(text.printer(), pages.source, nullptr).result, PrintResult::Done);
    EXPECT_GT(answers, 8);
    EXPECT_LT(mostPages, 100U / 3) << "of 3 ms each: a window that is not served for 100 ms seems to hang";
    ASSERT_FALSE(labels.isEmpty());
    EXPECT_TRUE(labels.last().endsWith(QStringLiteral(" of 200"))) << labels.last().toStdString();
    EXPECT_EQ(progressWindow(), nullptr) << "gone with the job";
}

TEST(PrintJob, AJobOfAMomentShowsNoProgress)
{
    PagedText text;
    NumberedPages pages(2);
    bool shown = false;
    QTimer::singleShot(0, qApp, [&shown] { shown = progressWindow() != nullptr; });
    kareport::printPages(text.printer(), pages.source, nullptr);
    QApplication::processEvents();
    EXPECT_FALSE(shown);
}

TEST(PrintJob, CancellingLeavesTheFileAsItWas)
{
    PagedText text;
    QFile earlier(text.file());
    ASSERT_TRUE(earlier.open(QIODevice::WriteOnly));
    earlier.write("earlier");
    earlier.close();
    NumberedPages pages(2000);
    pages.delay = 3;
    QTimer timer;
    QObject::connect(&timer, &QTimer::timeout, [] {
        if (const QProgressDialog *window = progressWindow()) {
            window->findChild<QPushButton *>()->click();
        }
    });
    timer.start(10);
    const PrintOutcome outcome = kareport::printPages(text.printer(), pages.source, nullptr);
    EXPECT_EQ(outcome.result, PrintResult::Cancelled);
    EXPECT_LT(outcome.pages, 200);
    EXPECT_EQ(pages.ended, 1);
    EXPECT_EQ(QFileInfo(text.file()).size(), 7);
}

TEST(PrintJob, StopsWhenTheTextChangesOrItsWindowGoes)
{
    PagedText text;
    NumberedPages pages(2000);
    pages.delay = 3;
    auto window = std::make_unique<QWidget>();
    QTimer::singleShot(0, qApp, [&] {
        pages.unchanged = false;
        window.reset(); // and the progress window, which belongs to it
    });
    const PrintOutcome outcome = kareport::printPages(text.printer(), pages.source, window.get());
    EXPECT_EQ(outcome.result, PrintResult::Changed);
    EXPECT_LT(outcome.pages, 200);
    EXPECT_FALSE(QFileInfo::exists(text.file()));
}

TEST(PrintJob, SaysWhyAFileCannotBeWritten)
{
    PagedText text;
    NumberedPages pages(3);
    text.printer().setOutputFileName(text.file() + QStringLiteral("/no/such/folder.pdf"));
    const PrintOutcome outcome = kareport::printPages(text.printer(), pages.source, nullptr);
    EXPECT_EQ(outcome.result, PrintResult::Failed);
    EXPECT_FALSE(outcome.reason.isEmpty());
}

} // namespace
