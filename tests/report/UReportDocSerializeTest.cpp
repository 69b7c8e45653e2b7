#include "FrameFixture.h"
#include "ReportFixture.h"

#include "StandardText.h"

#include <QBuffer>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

/// A report that counts what is opened.
class WatchedReport : public UReportDoc
{
public:
    WatchedReport() { SetAutoDelete(false); }
    void OnDocumentEvent(DocumentEvent event) override { opens += event == DocumentEvent::AfterOpenDocument ? 1 : 0; }

    int opens = 0;
};

TEST(UReportDocSerialize, InRichTextModeNothingIsLoaded)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rtf"));
    putFile(path, "{\\rtf1 x}\n");
    WatchedReport report;
    CViewPane pane;
    const auto *view = showIn<TestReportView>(pane, report);
    report.SetRTFDataFlag(true);
    EXPECT_TRUE(report.OnOpenDocument(path));
    EXPECT_EQ(report.LoadFile(path, true), 1);
    EXPECT_EQ(textOf(report), QString());
    EXPECT_EQ(view->updates, 0);
    EXPECT_EQ(report.GetPrintResolution(), 600U) << "it is open all the same";
}

/// A device that seems to be of any length.
class LongDevice : public QBuffer
{
public:
    explicit LongDevice(qint64 length) : length_(length) { open(QIODevice::ReadOnly); }
    qint64 size() const override { return length_; }

private:
    qint64 length_;
};

TEST(UReportDocSerialize, AFileThatIsTooLongForAViewIsGivenUp)
{
    struct Row
    {
        qint64 length;
        bool hasView;
        bool richText;
        bool loads;
        bool good;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0x3FFFFFFF, true, false, true, true, "the longest that a view takes"},
        {0x40000000, true, false, false, false, "one byte more"},
        {qint64(1) << 40, true, false, false, false, "far too long"},
        {0x40000000, false, false, true, true, "without a view there is no limit"},
        {0x40000000, true, true, false, false, "in rich-text mode as well"},
        {0x40000000, false, true, false, true, "without a view rich-text mode loads nothing"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("a.rep"));
        putFile(path, "x\n");
        const AnsweredMessages messages(MessageAnswer::Ok);
        WatchedReport report;
        CViewPane pane;
        if (row.hasView) {
            showIn<TestReportView>(pane, report);
        }
        report.SetRTFDataFlag(row.richText);
        LongDevice device(row.length);
        UArchive archive(device, UArchive::Mode::Loading, path);
        report.Serialize(archive);
        EXPECT_EQ(archive.IsGood(), row.good) << row.reason;
        EXPECT_EQ(textOf(report), row.loads ? QStringLiteral("x\n\r\n") : QString()) << row.reason;
        EXPECT_EQ(messages.texts,
                  row.good ? QStringList() : QStringList{kareport::standardText(kareport::fileTooLarge)})
            << row.reason;
    }
}

TEST(UReportDocSerialize, NothingOfAFileThatIsTooLongIsRead)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    for (const QString &name : {QStringLiteral("a.rep"), QStringLiteral("a.rtf")}) {
        const QString path = folder.filePath(name);
        putFile(path, "{\\rtf1 x\n");
        ASSERT_TRUE(QFile::resize(path, UView::nMaxSize + 1)); // takes no room on the disk
        const AnsweredMessages messages(MessageAnswer::Ok);
        WatchedReport report;
        CViewPane pane;
        const auto *view = showIn<TestReportView>(pane, report);
        EXPECT_FALSE(report.OnOpenDocument(path));
        EXPECT_EQ(messages.texts, QStringList{QStringLiteral("The file is too large to open.")});
        EXPECT_EQ(textOf(report), QString());
        EXPECT_EQ(report.GetLineCount(), 0);
        EXPECT_EQ(view->updates, 0);
        EXPECT_EQ(report.opens, 0);
        EXPECT_EQ(report.GetPrintResolution(), 0U) << "no page is measured";
    }
}

TEST(UReportDocSerialize, AnArchiveTakesAsManyBytesAsThereAreCharacters)
{
    struct Row
    {
        QString text;
        std::string expected;
        const char *reason;
    };
    const Row rows[] = {
        {QString(), "", "empty"},
        {QStringLiteral("A"), "A", "half a character"},
        {QStringLiteral("AB"), std::string("A\0", 2), "one of two"},
        {QStringLiteral("ABC\r\n"), std::string("A\0B\0C", 5), "cut in the middle of a character"},
        {QStringLiteral(u"\u6E2C\u91CF"), "\x2C\x6E", "the low byte first"},
        {QStringLiteral(u"\xD83D\xDE00"), "\x3D\xD8", "half a pair"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        UReportDoc report;
        report.SetData(row.text);
        QBuffer device;
        device.open(QIODevice::WriteOnly);
        UArchive archive(device, UArchive::Mode::Storing, QStringLiteral("/jobs/a.rep"));
        report.Serialize(archive);
        EXPECT_TRUE(archive.IsGood()) << row.reason;
        EXPECT_EQ(device.data().toStdString(), row.expected) << row.reason;
        EXPECT_EQ(textOf(report), row.text) << row.reason;

        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("a.rep"));
        EXPECT_TRUE(report.UDocument::OnSaveDocument(path)) << row.reason;
        EXPECT_EQ(contentOf(path), row.expected) << row.reason;
    }
}

} // namespace
