#include "FrameFixture.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

TEST(UApplication, IsKnownWhileItLives)
{
    EXPECT_EQ(UApplication::Get(), nullptr);
    {
        const UApplication application;
        EXPECT_EQ(UApplication::Get(), &application);
    }
    EXPECT_EQ(UApplication::Get(), nullptr);
}

TEST(UApplication, KeepsItsTemplatesInOrder)
{
    UApplication application;
    EXPECT_TRUE(application.GetDocTemplates().empty());
    const auto make = [](unsigned id) {
        return std::make_unique<UDocTemplate>(id, nullptr, nullptr, nullptr, QString(), 1, 1);
    };
    const UDocTemplate *first = application.AddDocTemplate(make(2));
    const UDocTemplate *second = application.AddDocTemplate(make(1));
    ASSERT_EQ(application.GetDocTemplates().size(), 2U);
    EXPECT_EQ(application.GetDocTemplates()[0].get(), first);
    EXPECT_EQ(application.GetDocTemplates()[1].get(), second);
    EXPECT_EQ(first->GetResourceId(), 2U);
}

TEST(UApplication, KeepsTheFilesLastUsedWithTheLastInFront)
{
    UApplication application;
    EXPECT_EQ(application.GetRecentFileList(), QStringList());
    const QString a = QStringLiteral("/jobs/a.rep");
    const QString b = QStringLiteral("/jobs/b.rep");
    application.AddToRecentFileList(a);
    application.AddToRecentFileList(b);
    EXPECT_EQ(application.GetRecentFileList(), (QStringList{b, a}));
    application.AddToRecentFileList(a);
    EXPECT_EQ(application.GetRecentFileList(), (QStringList{a, b})) << "each file once";
    application.AddToRecentFileList(a);
    EXPECT_EQ(application.GetRecentFileList(), (QStringList{a, b})) << "in front already";
    for (int i = 0; i < 100; ++i) {
        application.AddToRecentFileList(QString::number(i));
    }
    EXPECT_EQ(application.GetRecentFileList().value(0), QStringLiteral("99"));
    EXPECT_LT(application.GetRecentFileList().size(), 100) << "the list stays short";
    EXPECT_FALSE(application.GetRecentFileList().contains(b)) << "the oldest go";
}

TEST(UApplication, ClosesItsDocumentsWhenItGoes)
{
    FrameLog log;
    {
        const TextApplication application(log);
        TextDocument *kept = application.open();
        ASSERT_NE(kept, nullptr);
        kept->SetAutoDelete(false);
        application.open();
        TextDocument *shownTwice = application.open();
        addRecordingView(*new RecordingPane(log), *shownTwice);
        EXPECT_EQ(log.documents, 3);
        EXPECT_EQ(log.panes.size(), 4U);
    }
    EXPECT_EQ(log.documents, 0);
    for (const CViewPane *pane : log.panes) {
        for (const auto &view : pane->GetViews()) {
            EXPECT_EQ(view->GetDocument(), nullptr) << "a view that is left knows that its document has gone";
        }
    }
}

TEST(UApplication, NoPaneOfItsDocumentsStaysOpenWhenItGoes)
{
    FrameLog log;
    {
        const TextApplication application(log);
        application.open();
        addRecordingView(*new RecordingPane(log), *application.open());
    }
    EXPECT_EQ(log.panes.size(), 0U);
    EXPECT_EQ(paneCaptions(), QStringList());
}

/// A document that asks for the application while it is destroyed.
class AskingDocument : public TextDocument
{
public:
    AskingDocument(FrameLog &log, const UApplication *&answer) : TextDocument(log), answer_(answer) {}
    ~AskingDocument() override { answer_ = UApplication::Get(); }

private:
    const UApplication *&answer_;
};

TEST(UApplication, IsStillKnownToDocumentsThatGoWithIt)
{
    FrameLog log;
    const UApplication *answer = nullptr;
    const UApplication *expected = nullptr;
    {
        UApplication application;
        expected = &application;
        UDocTemplate *asking = application.AddDocTemplate(std::make_unique<UDocTemplate>(
            1, [&] { return std::make_unique<AskingDocument>(log, answer); }, nullptr, nullptr, QString(), 1, 1));
        ASSERT_NE(asking->OpenReportDocumentFile(QString(), 1, 1, nullptr, 0, nullptr), nullptr);
    }
    EXPECT_EQ(answer, expected);
}

} // namespace
