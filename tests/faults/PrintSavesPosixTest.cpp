#include "FailEachCall.h"

#include "NumberedPages.h"
#include "PrintFixture.h"

#include <QTemporaryDir>

namespace
{

TEST(PrintSaves, PagesThatArePrintedIntoAFileAreWholeOrItIsSaid)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("printed.pdf"));
    AnsweredPrinting printing;
    printing.changePrinter = [&path](QPrinter &printer) { printer.setOutputFileName(path); };
    AnsweredMessages messages(MessageAnswer::Ok);
    ShownReport shown;
    writeLines(shown.report, 300); // more than is buffered at once
    UReportView &view = shown.open();
    failEachCall(
        path, [&messages] { messages.texts.clear(); },
        [&] {
            view.OnReportPrint();
            return messages.texts.isEmpty();
        },
        [&] {
            ASSERT_EQ(messages.texts.size(), 1);
            EXPECT_TRUE(messages.texts.front().contains(path)) << messages.texts.front().toStdString();
        });
    view.OnReportPrint();
    EXPECT_EQ(pagesIn(path), 4);
}

} // namespace
