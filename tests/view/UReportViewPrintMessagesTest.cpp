#include "UReportView.h"

#include "BracketTranslator.h"
#include "PdfReadBack.h"
#include "PrintFixture.h"

#include <QFile>
#include <QPrintPreviewWidget>

#include <gmock/gmock.h>

namespace
{

using kareport::PrintInfo;
using testing::ElementsAre;
using testing::IsEmpty;

TEST(UReportViewPrintMessages, PrintingDirectlyDoesNotAsk)
{
    AnsweredPrinting printing;
    ShownReport report;
    writeLines(report.report, 3);
    UReportView &view = report.open();
    report.report.SetPageSize();
    PrintInfo info;
    info.direct = true;
    ASSERT_TRUE(view.OnPreparePrinting(info));
    EXPECT_EQ(printing.prints, 0);
    info.direct = false;
    ASSERT_TRUE(view.OnPreparePrinting(info));
    EXPECT_EQ(printing.prints, 1) << "the other print commands ask";
}

TEST(UReportViewPrintMessages, WithoutAPrinterEveryCommandSaysSo)
{
    const AnsweredPrinting printing;
    ShownReport report;
    writeLines(report.report, 3);
    UReportView &view = report.open();
    kareport::setDefaultPrinter({kareport::PrinterSource::None});
    UPreviewDlg::SetModulePrinterOrientationPortrait(false);
    AnsweredMessages messages(MessageAnswer::Ok);
    view.OnReportPrint();
    view.OnReportPrintPreview();
    PrintInfo info;
    EXPECT_FALSE(view.OnPreparePrinting(info));
    EXPECT_EQ(info.maxPage, 1) << "counted before the printer is asked for";
    EXPECT_THAT(messages.texts, testing::Each(QStringLiteral("No Default Printer is Installed!!!")));
    EXPECT_EQ(messages.texts.size(), 3);
    messages.texts.clear();
    view.OnPageSetup();
    EXPECT_THAT(messages.texts, ElementsAre(QStringLiteral("Failed to get default printer settings.")));
    EXPECT_EQ(printing.prints + printing.previews, 0);
    EXPECT_THAT(printing.setups, IsEmpty());
    EXPECT_FALSE(UPreviewDlg::IsModulePrinterOrientationPortrait()) << "put back";
}

TEST(UReportViewPrintMessages, WithoutAPrinterTheBoxesAreTheUsualOnes)
{
    const AnsweredPrinting printing;
    ShownReport report;
    UReportView &view = report.open();
    kareport::setDefaultPrinter({kareport::PrinterSource::None});
    std::vector<kareport::Message> messages;
    kareport::setMessageBox([&messages](const kareport::Message &message) {
        messages.push_back(message);
        return MessageAnswer::Ok;
    });
    {
        const BracketTranslator translator;
        view.OnReportPrint();
        view.OnPageSetup();
    }
    kareport::setMessageBox({});
    ASSERT_EQ(messages.size(), 2U);
    EXPECT_EQ(messages[0].text, QStringLiteral("No Default Printer is Installed!!!")) << "in every language";
    EXPECT_EQ(messages[1].text, QStringLiteral("[Failed to get default printer settings.]"));
    for (const kareport::Message &message : messages) {
        EXPECT_EQ(message.buttons, MessageButtons::Ok) << message.text.toStdString();
        EXPECT_EQ(message.icon, kareport::MessageIcon::None) << message.text.toStdString();
        EXPECT_EQ(message.caption, QString()) << message.text.toStdString();
    }
}

TEST(UReportViewPrintMessages, MarginsThatLeaveNoRoomAreReportedInsteadOfPrinted)
{
    for (const QMargins &margins :
         {QMargins(11000, 1000, 11000, 1000), QMargins(1000, 15000, 1000, 15000), QMargins(99999999, 0, 0, 0)})
    {
        const AnsweredPrinting printing;
        const AnsweredMessages messages(MessageAnswer::Ok);
        ShownReport report;
        writeLines(report.report, 3);
        report.report.SetMargins(margins);
        UReportView &view = report.open();
        view.OnReportPrint(true);
        view.OnReportPrintPreview();
        EXPECT_EQ(messages.texts.size(), 2);
        EXPECT_TRUE(messages.texts.value(0).contains(QStringLiteral("Page Setup")));
        EXPECT_EQ(printing.prints + printing.previews, 0);
        view.OnReportPrint();
        EXPECT_EQ(printing.prints, 1) << "a larger sheet might be chosen";
        EXPECT_EQ(messages.texts.size(), 3) << "none was";
        EXPECT_FALSE(QFile::exists(printing.file()));
    }
}

TEST(UReportViewPrintMessages, ALargerSheetThatTheUserChoosesHasRoom)
{
    AnsweredPrinting printing;
    printing.changePrinter = [](QPrinter &printer) { printer.setPageSize(QPageSize(QPageSize::A3)); };
    const AnsweredMessages messages(MessageAnswer::Ok);
    ShownReport report;
    writeLines(report.report, 3);
    report.report.SetMargins(QMargins(10500, 1000, 10000, 1000)); // 5 mm are left on A4, 92 on A3
    report.open().OnReportPrint();
    EXPECT_EQ(printing.prints, 1);
    EXPECT_EQ(printing.printedPages(), 1);
    EXPECT_THAT(messages.texts, IsEmpty());
}

/// Lets a preview change its sheet and print.
void previewWith(const std::function<void(QPrinter &, const std::function<void(QPrinter &)> &)> &act)
{
    kareport::PrintDialogs dialogs;
    dialogs.preview = [act](QPrinter &printer, QWidget *, const std::function<void(QPrinter &)> &paint) {
        act(printer, paint);
    };
    kareport::setPrintDialogs(dialogs);
}

TEST(UReportViewPrintMessages, ASheetWithoutRoomThatIsChosenInThePreviewIsRefused)
{
    const AnsweredPrinting printing; // puts Qt's windows back
    const AnsweredMessages messages(MessageAnswer::Ok);
    ShownReport report;
    writeLines(report.report, 3);
    report.report.SetMargins(QMargins(6000, 1000, 6000, 1000)); // room on A4, none on A6
    UReportView &view = report.open();
    previewWith([&](QPrinter &printer, const std::function<void(QPrinter &)> &paint) {
        printer.setOutputFileName(printing.file());
        printer.setPageSize(QPageSize(QPageSize::A6));
        paint(printer);
        EXPECT_FALSE(QFile::exists(printing.file())) << "no blank sheet";
        printer.setPageSize(QPageSize(QPageSize::A4));
        paint(printer);
    });
    view.OnReportPrintPreview();
    EXPECT_THAT(messages.texts,
                ElementsAre(testing::Truly([](const QString &text) { return text.contains(u"Page Setup"); })));
    EXPECT_EQ(printing.printedPages(), 1) << "back on A4";
}

TEST(UReportViewPrintMessages, APreviewSaysWhenItDoesNotShowAllPages)
{
    struct Row
    {
        int lines;
        bool isCut;
        const char *reason;
    };
    // Three rows a page; each line takes two of them.
    for (const Row &row : {Row{3000, false, "2000 pages"}, Row{3001, true, "2001 pages, 1001 of them counted"}}) {
        const AnsweredPrinting printing;
        const AnsweredMessages messages(MessageAnswer::Ok);
        ShownReport report;
        report.report.SetMargins(QMargins(1000, 1000, 21000 - 1000 - 1050, 29700 - 1000 - 1050));
        report.report.SetHeaderFlag(false);
        report.report.SetData(QStringLiteral("12345678\r\n").repeated(row.lines).chopped(2));
        UReportView &view = report.open();
        int shown = 0;
        int paints = 0;
        previewWith([&](QPrinter &printer, const std::function<void(QPrinter &)> &paint) {
            QPrintPreviewWidget widget(&printer);
            QObject::connect(&widget, &QPrintPreviewWidget::paintRequested, &widget, [&](QPrinter *target) {
                ++paints;
                paint(*target);
            });
            widget.updatePreview();
            widget.updatePreview(); // as when it is turned
            shown = widget.pageCount();
        });
        view.OnReportPrintPreview();
        EXPECT_GE(paints, 2) << row.reason;
        EXPECT_EQ(shown, 2000) << row.reason;
        EXPECT_EQ(messages.texts.size(), row.isCut ? 1 : 0) << row.reason << ": said once";
        EXPECT_EQ(messages.texts.value(0).contains(QStringLiteral("2000")), row.isCut) << row.reason;
    }
}

TEST(UReportViewPrintMessages, AnEmptyReportPrintsNothingAndSaysSo)
{
    const AnsweredPrinting printing;
    const AnsweredMessages messages(MessageAnswer::Ok);
    ShownReport report;
    report.open().OnReportPrint();
    EXPECT_EQ(messages.texts.size(), 1);
    EXPECT_FALSE(QFile::exists(printing.file()));
}

TEST(UReportViewPrintMessages, AFailedJobSaysWhatToDo)
{
    AnsweredPrinting printing;
    printing.changePrinter = [](QPrinter &printer) { printer.setOutputFileName(QStringLiteral("/no/folder/a.pdf")); };
    const AnsweredMessages messages(MessageAnswer::Ok);
    ShownReport report;
    writeLines(report.report, 3);
    report.open().OnReportPrint();
    ASSERT_EQ(messages.texts.size(), 1);
    EXPECT_TRUE(messages.texts[0].contains(QStringLiteral("/no/folder/a.pdf")));
    EXPECT_TRUE(messages.texts[0].contains(QStringLiteral("print again")));
}

TEST(UReportViewPrintMessages, AReportThatIsClosedWhileItsWindowAsksIsNotTouched)
{
    AnsweredPrinting printing;
    ShownReport report;
    writeLines(report.report, 3);
    UReportView *view = &report.open();
    printing.changePrinter = [&](QPrinter &) { report.close(0); };
    view->OnReportPrint();
    EXPECT_FALSE(QFile::exists(printing.file()));
    view = &report.open();
    printing.changeSetup = [&](kareport::PageSetup &setup) {
        setup.margins = QMargins(1, 2, 3, 4);
        report.close(0);
    };
    view->OnPageSetup();
    EXPECT_EQ(report.report.GetMargins(), QMargins(1000, 1000, 1200, 2000));
}

TEST(UReportViewPrintMessages, AViewWithoutAReportPrintsNothing)
{
    const AnsweredPrinting printing;
    const AnsweredMessages messages(MessageAnswer::Ok);
    UReportView view;
    view.OnReportPrint();
    view.OnReportPrintPreview();
    view.OnPageSetup();
    PrintInfo info;
    EXPECT_FALSE(view.OnPreparePrinting(info));
    EXPECT_EQ(printing.prints + printing.previews, 0);
    EXPECT_THAT(messages.texts, IsEmpty());
}

} // namespace
