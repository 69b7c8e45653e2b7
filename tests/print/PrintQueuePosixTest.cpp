#include "PrintJob.h"

#include "FileSizeLimit.h"
#include "NumberedPages.h"
#include "PagedText.h"
#include "PrintQt.h"
#include "PrivateCups.h"

#include <QApplication>
#include <QFile>
#include <QFileInfo>
#include <QPrinterInfo>
#include <QProgressDialog>
#include <QPushButton>
#include <QTimer>

#include <gtest/gtest.h>

namespace
{

using kareport::PrintOutcome;
using kareport::PrintResult;

/// Prints on a queue as it is set up.
PrintOutcome printOn(const QString &queue, NumberedPages &pages, int copies = 1)
{
    const QPrinterInfo info = QPrinterInfo::printerInfo(queue);
    EXPECT_FALSE(info.isNull()) << queue.toStdString();
    QPrinter printer(info, QPrinter::HighResolution);
    printer.setCopyCount(copies);
    return kareport::printPages(printer, pages.source, nullptr);
}

TEST(PrintQueuePosix, EveryPageArrives)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    EXPECT_EQ(QPrinterInfo::defaultPrinterName(), QStringLiteral("Whole"));
    NumberedPages pages(250);
    const PrintOutcome outcome = printOn(QStringLiteral("Whole"), pages);
    EXPECT_EQ(outcome.result, PrintResult::Done) << outcome.reason.toStdString();
    EXPECT_EQ(outcome.pages, 250);
    EXPECT_EQ(cups.arrivedPages(), 250);
}

TEST(PrintQueuePosix, CopiesAreMadeByTheQueue)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    NumberedPages pages(3);
    EXPECT_EQ(printOn(QStringLiteral("Whole"), pages, 2).result, PrintResult::Done);
    EXPECT_EQ(cups.arrivedPages(), 6);
}

TEST(PrintQueuePosix, AQueueThatRefusesIsReported)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    NumberedPages pages(3);
    const PrintOutcome outcome = printOn(QStringLiteral("Refusing"), pages);
    EXPECT_EQ(outcome.result, PrintResult::Failed);
    EXPECT_TRUE(outcome.reason.contains(QStringLiteral("not accepting jobs"))) << outcome.reason.toStdString();
    EXPECT_EQ(cups.jobs(), 0);
    NumberedPages next(2);
    EXPECT_EQ(printOn(QStringLiteral("Whole"), next).result, PrintResult::Done) << "an earlier refusal is forgotten";
}

TEST(PrintQueuePosix, APrinterThatIsSwitchedOffKeepsTheJob)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    NumberedPages pages(3);
    EXPECT_EQ(printOn(QStringLiteral("Stopped"), pages).result, PrintResult::Done);
    EXPECT_EQ(cups.jobs(), 1) << "it waits for the printer";
}

TEST(PrintQueuePosix, ACancelledJobIsNotSent)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    NumberedPages pages(2000);
    pages.delay = 3;
    QTimer timer;
    QObject::connect(&timer, &QTimer::timeout, [] {
        for (QWidget *window : QApplication::topLevelWidgets()) {
            if (qobject_cast<QProgressDialog *>(window) != nullptr) {
                window->findChild<QPushButton *>()->click();
            }
        }
    });
    timer.start(10);
    EXPECT_EQ(printOn(QStringLiteral("Stopped"), pages).result, PrintResult::Cancelled);
    EXPECT_EQ(cups.jobs(), 0);
    timer.stop();
    NumberedPages next(2);
    EXPECT_EQ(printOn(QStringLiteral("Stopped"), next).result, PrintResult::Done) << "the queue is reached again";
    EXPECT_EQ(cups.jobs(), 1);
}

TEST(PrintQueuePosix, APrintServerThatGoesAwayInTheMiddleIsReported)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    NumberedPages pages(300);
    const auto print = pages.source.print;
    pages.source.print = [&](QPainter &painter, int page) {
        if (page == 100) {
            cups.end();
        }
        return print(painter, page);
    };
    const PrintOutcome outcome = printOn(QStringLiteral("Whole"), pages);
    EXPECT_EQ(outcome.result, PrintResult::Failed);
    EXPECT_FALSE(outcome.reason.isEmpty());
}

TEST(PrintJobPosix, AFullDiskLeavesTheFileAsItWas)
{
    for (const quint64 limit : {quint64(100), quint64(20'000)}) {
        PagedText text;
        QFile earlier(text.file());
        ASSERT_TRUE(earlier.open(QIODevice::WriteOnly));
        earlier.write("earlier");
        earlier.close();
        NumberedPages pages(300);
        PrintOutcome outcome;
        {
            const FileSizeLimit full(limit);
            outcome = kareport::printPages(text.printer(), pages.source, nullptr);
        }
        EXPECT_EQ(outcome.result, PrintResult::Failed) << limit;
        EXPECT_EQ(QFileInfo(text.file()).size(), 7) << limit;
    }
}

} // namespace
