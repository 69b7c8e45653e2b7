#include "FrameFixture.h"
#include "ReportFixture.h"

#include <gtest/gtest.h>

#include <memory>
#include <utility>
#include <vector>

namespace
{

/// What a host document was given, and what it does then.
struct Receipt
{
    std::vector<std::pair<unsigned, QString>> texts;
    bool takes = true;
    bool closes = false;
};

class Receiver : public UDocument
{
public:
    explicit Receiver(Receipt &receipt) : receipt_(receipt) {}
    bool OnTextReceived(unsigned id, const QString &text) override
    {
        Receipt &receipt = receipt_;
        receipt.texts.emplace_back(id, text);
        if (receipt.closes) {
            OnCloseDocument();
        }
        return receipt.takes;
    }

private:
    Receipt &receipt_;
};

/// A report in a view, and a host document that takes its edited text.
class EditedReport
{
public:
    EditedReport()
    {
        UDocTemplate *receivers = application.AddDocTemplate(std::make_unique<UDocTemplate>(
            9, [this] { return std::make_unique<Receiver>(receipt); }, UDocTemplate::PaneFactory(),
            UDocTemplate::ViewFactory(), QStringLiteral("Receivers"), 0, 0));
        receivers->OpenReportDocumentFile(QString(), 0, 0, nullptr, 0, nullptr);
        receiver = receivers->OpenReportDocumentFile(QString(), 0, 0, nullptr, 0, nullptr);
        report = application.create(QStringLiteral("N"));
        report->SetTextObject(receiver, 7);
    }

    TestReportView *view() const { return dynamic_cast<TestReportView *>(report->GetViews().front()); }

private:
    FixedSurroundings surroundings_;

public:
    Receipt receipt;
    ReportApplication application;
    UReportDoc *report = nullptr;
    UDocument *receiver = nullptr;
};

/// The two bytes of each character, the low one first.
QByteArray bytesOf(const QString &text)
{
    QByteArray bytes;
    for (const QChar character : text) {
        bytes.append(static_cast<char>(character.cell())).append(static_cast<char>(character.row()));
    }
    return bytes;
}

TEST(UReportDocTextObject, IsThereWhenItHasANumber)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    EXPECT_FALSE(report.HasTextObj()) << "none at first";
    EXPECT_EQ(report.GetTextObject(), nullptr);
    report.SetTextObject(&report, 1);
    EXPECT_TRUE(report.HasTextObj());
    EXPECT_EQ(report.GetTextObject(), &report);
    report.SetTextObject(&report, 0);
    EXPECT_FALSE(report.HasTextObj()) << "an object without a number";
    report.SetTextObject(nullptr, 4294967295U);
    EXPECT_TRUE(report.HasTextObj()) << "a number without an object";
    report.Clear();
    EXPECT_TRUE(report.HasTextObj()) << "an emptied report keeps it";
}

TEST(UReportDocTextObject, TheTextIsMadeOfTheBytesOfTheViewTwoByTwo)
{
    struct Row
    {
        QByteArray bytes;
        QString expected; ///< empty: nothing is sent
        const char *reason;
    };
    const Row rows[] = {
        {"", QString(), "no text"},
        {"A", QString(), "half a character"},
        {"AB", QStringLiteral(u"\u4241"), "two bytes are one character"},
        {"ABC", QStringLiteral(u"\u4241"), "an odd byte at the end is left out"},
        {bytesOf(QStringLiteral("text")), QStringLiteral("text"), "the low byte first"},
        {bytesOf(QStringLiteral("a\r\nb\nc\rd")), QStringLiteral("a  b c d"), "line ends become blanks"},
        {bytesOf(QStringLiteral("a \r\n\r\n \t")), QStringLiteral("a"), "and go at the end"},
        {bytesOf(QStringLiteral(" \r\na")), QStringLiteral("   a"), "but stay at the beginning"},
        {bytesOf(QStringLiteral("\r\n \r\n")), QString(), "nothing but white space"},
        {bytesOf(QString::fromLatin1("a\tb\0c\x7F"
                                     "d",
                                     7)),
         QStringLiteral("a b c d"), "what cannot be printed becomes a blank"},
        {bytesOf(QStringLiteral(u"12\xB0 \u6E2C\u91CF")), QStringLiteral(u"12\xB0 \u6E2C\u91CF"),
         "what can be printed stays"},
        {bytesOf(QStringLiteral(u"a\xD83D\xDE00z")), QStringLiteral("a  z"),
         "halves of a pair cannot be printed by themselves"},
    };
    for (const Row &row : rows) {
        EditedReport edited;
        edited.view()->plainText = row.bytes;
        edited.report->SaveText();
        ASSERT_EQ(edited.receipt.texts.size(), row.expected.isEmpty() ? 0U : 1U) << row.reason;
        if (!row.expected.isEmpty()) {
            EXPECT_EQ(edited.receipt.texts[0].first, 7U) << row.reason;
            EXPECT_EQ(edited.receipt.texts[0].second, row.expected) << row.reason;
        }
        EXPECT_TRUE(edited.report->HasTextObj()) << row.reason;
    }
}

TEST(UReportDocTextObject, TheTextIsBrokenAfterABlankWhereItHas80Characters)
{
    const QString x77(77, u'x');
    const QString x78(78, u'x');
    const QString x100(100, u'x');
    struct Row
    {
        QString text;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {x78 + QStringLiteral(" ab"), x78 + QStringLiteral(" \nab"), "the 80th character after a blank"},
        {x77 + QStringLiteral(" ab"), x77 + QStringLiteral(" ab"), "the 79th is early, the 80th is in a word"},
        {x77 + QStringLiteral(" ab c"), x77 + QStringLiteral(" ab \nc"), "a word is not broken"},
        {x77 + QStringLiteral("x  ab"), x78 + QStringLiteral("  \nab"), "blanks stay on their line"},
        {x78 + QStringLiteral("\r\nab"), x78 + QStringLiteral("  \nab"), "a line end of the text is two blanks"},
        {x100 + QStringLiteral(" ab"), x100 + QStringLiteral(" \nab"), "a word longer than a line"},
        {x100 + x100, x100 + x100, "no blank, no break"},
        {x100 + QStringLiteral(" a") + x77 + QStringLiteral("x b"),
         x100 + QStringLiteral(" \na") + x77 + QStringLiteral("x \nb"), "the next line is counted after its first"},
        {x100 + QStringLiteral(" a") + x77 + QStringLiteral(" b"),
         x100 + QStringLiteral(" \na") + x77 + QStringLiteral(" b"), "the next line is counted after its first"},
        {QString(90, u' ') + QStringLiteral("a"), QString(90, u' ') + QStringLiteral("\na"), "blanks in front"},
    };
    for (const Row &row : rows) {
        EditedReport edited;
        edited.view()->plainText = bytesOf(row.text);
        edited.report->SaveText();
        ASSERT_EQ(edited.receipt.texts.size(), 1U) << row.reason;
        EXPECT_EQ(edited.receipt.texts[0].second, row.expected) << row.reason;
    }
}

TEST(UReportDocTextObject, WithoutAnObjectNothingIsSent)
{
    EditedReport edited;
    edited.view()->plainText = bytesOf(QStringLiteral("text"));
    edited.report->SetTextObject(edited.receiver, 0);
    edited.report->SaveText();
    edited.report->SetTextObject(nullptr, 7);
    edited.report->SaveText();
    EXPECT_TRUE(edited.receipt.texts.empty());
    EXPECT_TRUE(edited.report->HasTextObj()) << "the number stays";
}

TEST(UReportDocTextObject, TheNumberGoesWithTheTextEachTime)
{
    EditedReport edited;
    edited.view()->plainText = bytesOf(QStringLiteral("text"));
    for (const unsigned id : {1U, 1U, 4294967295U}) {
        edited.report->SetTextObject(edited.receiver, id);
        edited.report->SaveText();
        ASSERT_FALSE(edited.receipt.texts.empty());
        EXPECT_EQ(edited.receipt.texts.back(), std::make_pair(id, QStringLiteral("text")));
    }
    EXPECT_EQ(edited.receipt.texts.size(), 3U);
    EXPECT_TRUE(edited.report->HasTextObj());
}

/// Fails in the middle.
class FailingView : public TestReportView
{
public:
    bool streamPlainText(QIODevice &device) const override
    {
        device.write("cut off ");
        return false;
    }
};

TEST(UReportDocTextObject, TheLastViewOfTheReportThatHasATextCounts)
{
    EditedReport edited;
    CViewPane pane;
    edited.view()->plainText = bytesOf(QStringLiteral("first"));
    showIn<UView>(pane, *edited.report);
    auto *second = showIn<TestReportView>(pane, *edited.report);
    edited.report->SaveText();
    ASSERT_EQ(edited.receipt.texts.size(), 1U);
    EXPECT_EQ(edited.receipt.texts.back().second, QStringLiteral("first")) << "the second has none";
    second->plainText = bytesOf(QStringLiteral("second"));
    edited.report->SaveText();
    EXPECT_EQ(edited.receipt.texts.back().second, QStringLiteral("second"));
    showIn<FailingView>(pane, *edited.report);
    edited.report->SaveText();
    EXPECT_EQ(edited.receipt.texts.back().second, QStringLiteral("second")) << "a text that is cut off is not sent";
    EXPECT_EQ(edited.receipt.texts.size(), 3U) << "one text each time";
}

TEST(UReportDocTextObject, AnObjectThatWillNotHaveTheTextIsForgotten)
{
    struct Row
    {
        bool takes;
        bool closes;
        bool stays;
        const char *reason;
    };
    constexpr Row rows[] = {
        {true, false, true, "taken"},
        {false, false, false, "refused"},
        {true, true, false, "taken, but the document has closed then"},
        {false, true, false, "refused and closed"},
    };
    for (const Row &row : rows) {
        EditedReport edited;
        edited.receipt.takes = row.takes;
        edited.receipt.closes = row.closes;
        edited.view()->plainText = bytesOf(QStringLiteral("text"));
        edited.report->SaveText();
        EXPECT_EQ(edited.receipt.texts.size(), 1U) << row.reason;
        EXPECT_EQ(edited.report->HasTextObj(), row.stays) << row.reason;
        EXPECT_EQ(edited.report->GetTextObject(), row.stays ? edited.receiver : nullptr) << row.reason;
        edited.report->SaveText();
        EXPECT_EQ(edited.receipt.texts.size(), row.stays ? 2U : 1U) << row.reason;
    }
}

TEST(UReportDocTextObject, AnObjectThatIsNotOpenGetsNothingAndIsKept)
{
    EditedReport edited;
    edited.view()->plainText = bytesOf(QStringLiteral("text"));
    void *const gone = edited.receiver;
    edited.receiver->OnCloseDocument();
    edited.report->SaveText();
    EXPECT_EQ(edited.report->GetTextObject(), gone) << "closed before";
    Receiver unknown(edited.receipt);
    edited.report->SetTextObject(&unknown, 7);
    edited.report->SaveText();
    EXPECT_EQ(edited.report->GetTextObject(), &unknown) << "of no document template";
    EXPECT_TRUE(edited.receipt.texts.empty());
}

TEST(UReportDocTextObject, WithoutAnApplicationNothingIsSent)
{
    const FixedSurroundings surroundings;
    Receipt receipt;
    Receiver receiver(receipt);
    UReportDoc report;
    report.SetAutoDelete(false);
    CViewPane pane;
    showIn<TestReportView>(pane, report)->plainText = bytesOf(QStringLiteral("text"));
    report.SetTextObject(&receiver, 7);
    report.SaveText();
    EXPECT_TRUE(receipt.texts.empty());
    EXPECT_TRUE(report.HasTextObj());
}

} // namespace
