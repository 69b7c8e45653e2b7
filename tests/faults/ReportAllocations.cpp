#include "ReportAllocations.h"

#include "FrameFixture.h"
#include "ReportTextCodec.h"

#include <cctype>
#include <ostream>
#include <utility>

void PrintTo(const ReportOperation &operation, std::ostream *out)
{
    *out << operation.name;
}

std::string nameOf(const testing::TestParamInfo<ReportOperation> &info)
{
    std::string name;
    bool isNext = false;
    for (const char letter : std::string(info.param.name)) {
        if (std::isalnum(static_cast<unsigned char>(letter)) == 0) {
            isNext = true;
            continue;
        }
        name += isNext ? static_cast<char>(std::toupper(static_cast<unsigned char>(letter))) : letter;
        isNext = false;
    }
    return name;
}

ReportAllocations::ReportAllocations()
{
    putFile(around_.loadPath, "\xEF\xBB\xBFTALVEN of a file\r\r\nline\r\r\n");
    putFile(around_.richTextLoadPath, "{\\rtf1\\ansi a line\\par\r\nanother one\\par}\r\n");
}

void ReportAllocations::tryAll()
{
    const bool usesEditor = std::string(GetParam().name).find("ditor") != std::string::npos ||
                            std::string(GetParam().name).find("Word") != std::string::npos;
    SetUsePreferredReportEditorFlag(usesEditor);
    for (const auto &[isRichText, hasWindow] :
         {std::pair(false, false), std::pair(true, false), std::pair(false, true), std::pair(true, true)})
    {
        Shape shape = GetParam().shape;
        shape.isRichText = isRichText;
        shape.hasWindow = hasWindow;
        Result whole;
        {
            // Once as it should be; what is made only once in a program is made then.
            ReportSubject subject(shape);
            around_.launches.all.clear();
            ASSERT_TRUE(GetParam().act(subject, around_)) << "it does not work at all";
            whole = resultOf(subject);
            closeConverted();
        }
        failingEachAllocation([&](qint64 number) { return attempt(shape, number, whole); });
        if (HasFailure()) {
            return;
        }
    }
}

ReportAllocations::Result ReportAllocations::resultOf(const ReportSubject &subject)
{
    return {subject.report.CopyText(), subject.answer, subject.bytes.data()};
}

/// Does the operation with a request for memory failing. @return whether it failed
bool ReportAllocations::attempt(const Shape &shape, qint64 number, const Result &whole)
{
    ReportSubject subject(shape);
    UReportDoc &report = subject.report;
    const QString before = report.CopyText();
    putFile(around_.reportPath, "earlier");
    putFile(around_.richTextPath, "earlier");
    around_.launches.all.clear();
    bool isDone = false;
    bool hasFailed = false;
    try {
        const FailingAllocation failing(number);
        isDone = GetParam().act(subject, around_);
        hasFailed = failing.hasFailed();
    } catch (...) {
        ADD_FAILURE() << "allocation " << number << ": an exception comes out";
        return true;
    }
    if (hasFailed) {
        SCOPED_TRACE(testing::Message() << "allocation " << number << (shape.isRichText ? ", rich text" : "")
                                        << (shape.hasWindow ? ", a window" : ""));
        const Result result = resultOf(subject);
        if (isDone) {
            EXPECT_TRUE(result.text == whole.text) << "it says that all is done: " << result.text.toStdString();
            EXPECT_TRUE(result.answer == whole.answer) << result.answer.toStdString();
            EXPECT_TRUE(result.bytes == whole.bytes) << result.bytes.toStdString();
        }
        checkText(report, before, whole.text, isDone);
        if (GetParam().isSave) {
            const bool isEarlier =
                contentOf(around_.reportPath) == "earlier" && contentOf(around_.richTextPath) == "earlier";
            EXPECT_EQ(isEarlier, !isDone) << "the file is not what the answer says";
        }
        checkUsable(report);
    }
    closeConverted();
    return hasFailed && !HasFailure();
}

void ReportAllocations::checkText(const UReportDoc &report, const QString &before, const QString &whole, bool isDone)
{
    using Text = ReportOperation::Text;
    const QString text = report.CopyText();
    switch (GetParam().text) {
    case Text::Same: EXPECT_TRUE(text == before) << text.toStdString(); break;
    case Text::Written:
        EXPECT_TRUE(text.startsWith(before)) << text.toStdString();
        EXPECT_TRUE(isDone || text == before || report.HasLostText()) << "half of it, and nothing says so";
        break;
    case Text::Replaced: EXPECT_TRUE(isDone || text == before) << text.toStdString(); break;
    case Text::Set:
        EXPECT_TRUE(isDone ? text == whole : text.isEmpty()) << text.toStdString();
        EXPECT_EQ(report.HasLostText(), !isDone);
        break;
    }
}

void ReportAllocations::checkUsable(UReportDoc &report)
{
    if (report.HasLostText()) {
        checkNotSaved(report); // also where nothing of it is left
    }
    const QString text = report.CopyText();
    EXPECT_TRUE(report.Write(QStringLiteral("after"), 0));
    EXPECT_TRUE(report.CopyText() == text + QStringLiteral("after"));
    if (report.HasLostText()) {
        EXPECT_EQ(report.LoadFile(around_.loadPath, false), 1) << "that file is there as a whole";
        checkNotSaved(report);
    }
    report.Clear();
    EXPECT_TRUE(report.IsEmpty());
    EXPECT_FALSE(report.HasLostText());
}

void ReportAllocations::checkNotSaved(UReportDoc &report)
{
    const QString pdfPath = around_.reportPath + QStringLiteral(".pdf");
    for (const QString &path : {around_.reportPath, around_.richTextPath, pdfPath}) {
        putFile(path, "earlier");
        EXPECT_FALSE(report.OnSaveDocument(path)) << "half a report is saved: " << path.toStdString();
        EXPECT_FALSE(report.DoSave(path, false)) << path.toStdString();
        EXPECT_EQ(contentOf(path), "earlier");
    }
    QBuffer taken;
    taken.open(QIODevice::WriteOnly);
    EXPECT_FALSE(report.WriteText(taken, kareport::LineEnds::PlainText));
    EXPECT_FALSE(report.WriteRichTextFile(taken));
    EXPECT_FALSE(report.WritePdf(taken));
    EXPECT_TRUE(taken.data().isEmpty());
}

void ReportAllocations::closeConverted()
{
    const auto &documents = around_.application.reportTemplate()->GetDocuments();
    while (!documents.empty()) {
        documents.back()->SetAutoDelete(true);
        documents.back()->OnCloseDocument();
    }
}
