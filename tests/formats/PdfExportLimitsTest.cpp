#include "LimitedDevice.h"
#include "PdfFixture.h"
#include "TestSize.h"

#include <gtest/gtest.h>

#include <utility>

// What a PDF cannot be made of, and very long reports.

namespace
{

using kareport::PdfNotes;
using kareport::PdfOptions;
using kareport::writePdf;

struct Attempt
{
    bool done = false;
    QString problem;
    QByteArray bytes;
};

Attempt attempt(QStringView text, const PdfOptions &options)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    PdfNotes notes;
    const bool done = writePdf(buffer, text, options, &notes);
    EXPECT_EQ(writePdf(buffer, text, options), done) << "also when the reason is not asked for";
    return {done, notes.problem, done ? QByteArray() : buffer.data()};
}

TEST(PdfExportLimits, APageThatCannotBeIsRefused)
{
    struct Row
    {
        void (*change)(PdfOptions &);
        QStringView problem; ///< how it begins
        const char *reason;
    };
    const Row rows[] = {
        {[](PdfOptions &o) { o.page.resolution = 0; }, u"the page has not been measured", "no resolution"},
        {[](PdfOptions &o) { o.page.linesPerPage = 0; }, u"the page has not been measured", "no lines on a page"},
        {[](PdfOptions &o) { o.page.linesPerPage = -1; }, u"the page has not been measured", "fewer than no lines"},
        {[](PdfOptions &o) { o.page = {}; }, u"the page has not been measured", "nothing was measured"},
        {[](PdfOptions &o) { o.page.fontSize = 0; }, u"a font size of 1 point or more", "no font size"},
        {[](PdfOptions &o) { o.page.pageSize = QSize(0, 0); }, u"the margins leave no room", "no sheet"},
        {[](PdfOptions &o) { o.page.pageSize = QSize(-5100, 6600); }, u"the margins leave no room", "a negative sheet"},
        {[](PdfOptions &o) { o.page.pageSize = QSize(121000, 6600); }, u"the PDF library failed with error 0x",
         "a sheet that is larger than a PDF has"},
    };
    for (const Row &row : rows) {
        PdfOptions options = pdfOptions();
        row.change(options);
        const Attempt result = attempt(u"A\r\n", options);
        EXPECT_FALSE(result.done) << row.reason;
        EXPECT_FALSE(result.problem.isEmpty()) << row.reason;
        EXPECT_TRUE(result.problem.startsWith(row.problem)) << row.reason << ": " << result.problem.toStdString();
        EXPECT_TRUE(result.bytes.isEmpty()) << row.reason << ": nothing is written";
    }
}

TEST(PdfExportLimits, AFaceThatIsNotAFontIsRefused)
{
    const char *const names[] = {"MSGOTHIC.TTC", "lucon.TTF"};
    const QByteArray contents[] = {"", "This is a text.\n", QByteArray("\0\1\0\0", 4), QByteArray(100000, '\xFF')};
    for (const char *name : names) {
        for (const QByteArray &content : contents) {
            FontFolder folder;
            folder.withText(QString::fromUtf8(name), content);
            PdfOptions options = pdfOptions();
            options.fontFolders = QStringList{folder.path()};
            const Attempt result = attempt(u"A\r\n", options);
            EXPECT_FALSE(result.done) << name << ", " << content.size() << " bytes";
            EXPECT_EQ(
                result.problem,
                QStringLiteral("the font file \"%1/%2\" cannot be used").arg(folder.path(), QString::fromUtf8(name)));
            EXPECT_TRUE(result.bytes.isEmpty()) << name;
        }
    }
}

TEST(PdfExportLimits, AFontFileThatIsCutOffIsRefusedOrWhole)
{
    QFile file(dejaVuFile());
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    const QByteArray whole = file.readAll();
    for (const qsizetype size : {4, 12, 100, 300, 1000, 20000, 100000}) {
        FontFolder folder;
        folder.withText(QStringLiteral("lucon.TTF"), whole.first(size));
        PdfOptions options = pdfOptions();
        options.fontFolders = QStringList{folder.path()};
        const Attempt result = attempt(u"A\r\n", options);
        EXPECT_FALSE(result.done) << size;
        EXPECT_FALSE(result.problem.isEmpty()) << size;
    }
}

TEST(PdfExportLimits, ADeviceThatFailsEndsInFalse)
{
    const qint64 size = pdfBytes(QStringLiteral("A\r\n")).size();
    for (const qint64 limit : {qint64(-1), qint64(0), qint64(1), size - 1, size}) {
        LimitedDevice device;
        device.limit = limit;
        PdfNotes notes;
        EXPECT_EQ(writePdf(device, u"A\r\n", pdfOptions(), &notes), limit == size) << limit;
        EXPECT_EQ(notes.problem, QString()) << "the device knows why";
        EXPECT_LE(device.taken.size(), std::max<qint64>(limit, 0)) << "nothing is written after the gap";
    }
}

TEST(PdfExportLimits, MarginsThatLeaveNoRoomAreRefused)
{
    const QMargins rows[] = {QMargins(20000, 0, 20000, 0), QMargins(0, 20000, 0, 20000), QMargins(0, 0, 40000, 0),
                             QMargins(0, 40000, 0, 0)};
    for (const QMargins &margins : rows) {
        PdfOptions options = pdfOptions();
        options.page.margins = margins;
        const Attempt result = attempt(u"AB C\r\nDE\r\n", options);
        EXPECT_FALSE(result.done) << "text beside the sheet is text that is missing";
        EXPECT_TRUE(result.problem.startsWith(u"the margins leave no room")) << result.problem.toStdString();
        EXPECT_TRUE(result.bytes.isEmpty());
    }
}

TEST(PdfExportLimits, ABoxOfOneCharacterLosesNoText)
{
    PdfOptions options = pdfOptions();
    const int width = options.page.pageSize.width() * 2540 / int(options.page.resolution);
    options.page.margins = QMargins(width / 2 - 50, 1000, width / 2 - 50, 1000);
    const PdfReadBack pdf(pdfBytes(u"AB C\r\nDE\r\n", options));
    EXPECT_EQ(pdf.pageCount(), 1);
    EXPECT_EQ(pdf.characters(), QStringLiteral("ABCDE"));
}

TEST(PdfExportLimits, AReportMayHaveMorePagesThanALibraryListTakes)
{
    for (const qint64 pages : {32767, testSize(32768, 33001)}) {
        QString text;
        for (qint64 page = 1; page <= pages; ++page) {
            text += QStringLiteral("p%1\r\n").arg(page);
        }
        PdfOptions options = pdfOptions();
        options.page.linesPerPage = 1;
        const PdfReadBack pdf(pdfBytes(text, options));
        EXPECT_EQ(pdf.pageCount(), pages);
        const QString last = QString::number(pages);
        const std::vector<PdfWord> words = pdf.words(static_cast<int>(pages));
        ASSERT_EQ(words.size(), 1U);
        EXPECT_EQ(words[0].text, u'p' + last);
    }
}

TEST(PdfExportLimits, APageMayGoOnOnMoreSheetsThanALibraryListTakes)
{
    // A slip with room for one line of 5 points.
    PdfOptions options = pdfOptions();
    options.page.pageSize = QSize(200, 9);
    options.page.resolution = 72;
    options.page.margins = QMargins();
    options.page.linesPerPage = 1;
    options.pageStarts = {0};
    const int sheets = testSize(32'768, 40'000);
    EXPECT_EQ(PdfReadBack(pdfBytes(QStringLiteral("x\n").repeated(sheets), options)).pageCount(), sheets);
}

TEST(PdfExportLimits, ProgressIsToldAndMayStop)
{
    std::vector<std::pair<qint64, qint64>> told;
    PdfOptions options = pdfOptions();
    options.progress = [&told](qint64 done, qint64 all) {
        told.emplace_back(done, all);
        return true;
    };
    const QString text = QStringLiteral("line\r\n").repeated(150);
    EXPECT_EQ(pdfBytes(text, options), pdfBytes(text, pdfOptions())) << "being told changes nothing";
    EXPECT_EQ(told, (std::vector<std::pair<qint64, qint64>>{{1, 3}, {2, 3}, {3, 3}}));

    told.clear();
    options.progress = [&told](qint64 done, qint64 all) {
        told.emplace_back(done, all);
        return done < 2;
    };
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    PdfNotes notes;
    EXPECT_FALSE(writePdf(buffer, text, options, &notes));
    EXPECT_EQ(notes.problem, QStringLiteral("stopped"));
    EXPECT_TRUE(buffer.data().isEmpty()) << "nothing is written";
    EXPECT_EQ(told.size(), 2U) << "and nothing more is done";
}

} // namespace
