#include "FrameFixture.h"
#include "ReportFixture.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

/// A file in a folder of its own.
class LoadedFile
{
public:
    explicit LoadedFile(const QByteArray &content, const QString &name = QStringLiteral("a.rep"))
        : path(folder_.filePath(name))
    {
        putFile(path, content);
    }

private:
    QTemporaryDir folder_;

public:
    const QString path;
};

TEST(UReportDocLoad, EveryByteIsACharacterAndEveryLineGetsALineEnd)
{
    struct Row
    {
        QByteArray content;
        QString keeping; ///< their line ends
        int keepingLines;
        QString cutting;
        int cuttingLines;
        const char *reason;
    };
    const Row rows[] = {
        {"", QString(), 0, QString(), 0, "empty"},
        {"\n", QStringLiteral("\n\r\n"), 3, QStringLiteral("\r\n"), 2, "an empty line"},
        {"A", QStringLiteral("A\r\n"), 2, QStringLiteral("A\r\n"), 2, "no line end at the end"},
        {"A\nB\n", QStringLiteral("A\n\r\nB\n\r\n"), 6, QStringLiteral("A\r\nB\r\n"), 4,
         "a line is counted as it is written and once more"},
        {"A\r\nB\r\n", QStringLiteral("A\n\r\nB\n\r\n"), 6, QStringLiteral("A\r\nB\r\n"), 4, "CR LF is LF"},
        {"A\r\nB", QStringLiteral("A\n\r\nB\r\n"), 5, QStringLiteral("A\r\nB\r\n"), 4, "a last line without its end"},
        {"A\r\r\n", QStringLiteral("A\r\n\r\n"), 3, QStringLiteral("A\r\r\n"), 2, "a line end as reports have it"},
        {"A\rB", QStringLiteral("A\rB\r\n"), 2, QStringLiteral("A\rB\r\n"), 2, "a CR alone ends no line"},
        {"\r", QStringLiteral("\r\r\n"), 2, QStringLiteral("\r\r\n"), 2, "nothing but a CR"},
        {"A\n\r", QStringLiteral("A\n\r\n\r\r\n"), 5, QStringLiteral("A\r\n\r\r\n"), 4, "a CR after the last LF"},
        {"\xEF\xBB\xBF", QStringLiteral(u"\xEF\xBB\xBF\r\n"), 2, QStringLiteral(u"\xEF\xBB\xBF\r\n"), 2,
         "nothing but a byte-order mark: three characters"},
        {"\xEF\xBB\xBF"
         "A\r\r\n",
         QStringLiteral(u"\xEF\xBB\xBF"
                        "A\r\n\r\n"),
         3,
         QStringLiteral(u"\xEF\xBB\xBF"
                        "A\r\r\n"),
         2, "a mark that no header line follows stays"},
        {"12\xC2\xB0\n", QStringLiteral(u"12\xC2\xB0\n\r\n"), 3, QStringLiteral(u"12\xC2\xB0\r\n"), 2,
         "the bytes of UTF-8 are characters each"},
        {"\xFF\xC3(\x80\n", QStringLiteral(u"\xFF\xC3(\x80\n\r\n"), 3, QStringLiteral(u"\xFF\xC3(\x80\r\n"), 2,
         "bytes that are not UTF-8 as well"},
        {QByteArray("a\0b\n\0", 5), QString::fromLatin1("a\0b\n\r\n\0\r\n", 9), 5,
         QString::fromLatin1("a\0b\r\n\0\r\n", 8), 4, "bytes of 0 are characters, too"},
        {"a\fb\x1A"
         "c\n",
         QStringLiteral("a\fb\x1A"
                        "c\n\r\n"),
         3,
         QStringLiteral("a\fb\x1A"
                        "c\r\n"),
         2, "no control character ends the file"},
    };
    for (const Row &row : rows) {
        for (const bool keeps : {true, false}) {
            const FixedSurroundings surroundings;
            const LoadedFile file(row.content);
            UReportDoc report;
            EXPECT_EQ(report.LoadFile(file.path, keeps), 1) << row.reason;
            EXPECT_EQ(textOf(report), keeps ? row.keeping : row.cutting) << row.reason;
            EXPECT_EQ(report.GetLineCount(), keeps ? row.keepingLines : row.cuttingLines) << row.reason;
        }
    }
}

TEST(UReportDocLoad, TheFirstLineBeginsWithItsWord)
{
    struct Row
    {
        QByteArray content;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {"\xEF\xBB\xBFTALVEN - N\n", QStringLiteral("TALVEN - N\r\n"), "the byte-order mark goes"},
        {"xyz TALVEN - N\n", QStringLiteral("TALVEN - N\r\n"), "and whatever else is in front"},
        {"TALVEN - N\n", QStringLiteral("TALVEN - N\r\n"), "nothing is in front"},
        {"xTALVEN TALVEN\n", QStringLiteral("TALVEN TALVEN\r\n"), "the first one counts"},
        {"TALVEN TALVEN\n", QStringLiteral("TALVEN TALVEN\r\n"), "the first one, at the very beginning"},
        {"x\ny TALVEN\n", QStringLiteral("x\r\ny TALVEN\r\n"), "not in the second line"},
        {"\nx TALVEN\n", QStringLiteral("\r\nx TALVEN\r\n"), "not after an empty first line"},
        {"x talven\n", QStringLiteral("x talven\r\n"), "in capital letters only"},
        {"x TALVE", QStringLiteral("x TALVE\r\n"), "cut off"},
        {"x TALVEN", QStringLiteral("TALVEN\r\n"), "at the very end"},
        {QByteArray(1020, 'x') + "TALVEN\n", QString(1020, u'x') + QStringLiteral("TA\r\nLVEN\r\n"),
         "cut by the end of the first piece"},
        {QByteArray(1022, 'x') + "y TALVEN\n", QString(1022, u'x') + QStringLiteral("\r\ny TALVEN\r\n"),
         "the second piece is a line of its own"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const LoadedFile file(row.content);
        UReportDoc report;
        EXPECT_EQ(report.LoadFile(file.path, false), 1) << row.reason;
        EXPECT_EQ(textOf(report), row.expected) << row.reason;

        UReportDoc written;
        written.WriteLine(QStringLiteral("before"), 0, 1, 0);
        EXPECT_EQ(written.LoadFile(file.path, false), 1) << row.reason;
        EXPECT_TRUE(textOf(written).startsWith(QStringLiteral("before\r\n"))) << row.reason;
        EXPECT_EQ(textOf(written).contains(QStringLiteral("TALVEN")), row.expected.contains(QStringLiteral("TALVEN")))
            << row.reason;
        const QByteArray front = row.content.left(std::min<qsizetype>(row.content.indexOf('\n'), 3));
        EXPECT_TRUE(textOf(written).sliced(8).startsWith(QString::fromLatin1(front)))
            << row.reason << ": after other text nothing is dropped";
    }
}

TEST(UReportDocLoad, AReportComesBackFromItsFile)
{
    const FixedSurroundings surroundings;
    const LoadedFile file("");
    UReportDoc report;
    report.SetTitle(QStringLiteral("N"));
    report.SetHeaderFlag(true);
    for (int line = 0; line < 100; ++line) {
        report.WriteLine(QStringLiteral("line %1").arg(line), 0, 1, 0);
    }
    ASSERT_TRUE(report.OnSaveDocument(file.path));
    UReportDoc loaded;
    loaded.FixPage(1000, 80);
    EXPECT_EQ(loaded.LoadFile(file.path, false), 1);
    EXPECT_TRUE(textOf(loaded).startsWith(headerOf(QStringLiteral("N"), 1)));
    EXPECT_EQ(textOf(loaded).replace(QStringLiteral("\r\r\n"), QStringLiteral("\r\n")), textOf(report))
        << "with one CR more in each line";
}

TEST(UReportDocLoad, PagesAreLaidOutAsForAnyLine)
{
    const FixedSurroundings surroundings;
    const LoadedFile file("0\n1\n2\n3\n4\n5\n6\n7\n8\n9\n");
    for (const bool header : {false, true}) {
        for (const bool keeps : {false, true}) {
            UReportDoc loaded;
            UReportDoc written;
            for (UReportDoc *report : {&loaded, &written}) {
                report->SetTitle(QStringLiteral("N"));
                report->FixPage(8, 80);
                report->SetHeaderFlag(header);
            }
            for (int line = 0; line < 10; ++line) {
                written.WriteLine(QString::number(line) + (keeps ? QStringLiteral("\n") : QString()), 0, 1, 0);
            }
            EXPECT_EQ(loaded.LoadFile(file.path, keeps), 1);
            EXPECT_EQ(textOf(loaded), textOf(written));
            EXPECT_GT(loaded.GetPageNumber(), 1);
            EXPECT_EQ(loaded.GetPageNumber(), written.GetPageNumber());
            EXPECT_EQ(loaded.GetLineNumber(), written.GetLineNumber());
            EXPECT_EQ(loaded.GetLineCount(), written.GetLineCount() + 10);
        }
    }
}

TEST(UReportDocLoad, WhatIsLoadedIsNewToTheViewsAndTheDocument)
{
    const FixedSurroundings surroundings;
    const LoadedFile file("A\nB\n");
    UReportDoc report;
    report.SetAutoDelete(false);
    CViewPane pane;
    const auto *view = showIn<TestReportView>(pane, report);
    report.SetRTFDataFlag(true);
    EXPECT_EQ(report.LoadFile(file.path, false), 1);
    EXPECT_EQ(view->updates, 1) << "once, when all is there";
    EXPECT_TRUE(report.IsModified());
    EXPECT_EQ(report.GetPathName(), QString()) << "it is text from a file, not the document's file";
    QString image;
    report.GetRTFData(image);
    EXPECT_TRUE(image.contains(QStringLiteral("A \\par"))) << "lines go into the rich text as any other";
}

TEST(UReportDocLoad, WhatCannotBeOpenedIsNotLoaded)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    ASSERT_TRUE(QDir().mkdir(folder.filePath(QStringLiteral("folder.rtf"))));
    struct Row
    {
        QString path;
        const char *reason;
    };
    const Row rows[] = {
        {QString(), "no name"},
        {folder.filePath(QStringLiteral("missing.rep")), "no such file"},
        {folder.filePath(QStringLiteral("missing.rtf")), "no such file"},
        {folder.filePath(QStringLiteral("missing/a.rep")), "no such folder"},
        {folder.path(), "a folder"},
        {folder.filePath(QStringLiteral("folder.rtf")), "a folder of that name"},
    };
    const AnsweredMessages messages(MessageAnswer::Ok);
    UReportDoc report;
    report.SetAutoDelete(false);
    CViewPane pane;
    const auto *view = showIn<TestReportView>(pane, report);
    report.SetData(QStringLiteral("text"));
    for (const Row &row : rows) {
        EXPECT_EQ(report.LoadFile(row.path, true), 0) << row.reason;
        EXPECT_EQ(textOf(report), QStringLiteral("text")) << row.reason;
        EXPECT_EQ(view->updates, 0) << row.reason;
        EXPECT_FALSE(report.IsModified()) << row.reason;
        EXPECT_EQ(messages.texts, QStringList()) << row.reason << ": without a message";
    }
}

} // namespace
