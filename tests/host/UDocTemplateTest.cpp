#include "FrameFixture.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

const QString noPath;

TEST(UDocTemplate, IsFoundByItsCreatorName)
{
    FrameLog log;
    const TextApplication application(log);
    EXPECT_EQ(application.texts().GetResourceId(), 128U);
    EXPECT_TRUE(application.texts().IsThatCreator(QStringLiteral("Texts")));
    EXPECT_FALSE(application.texts().IsThatCreator(QStringLiteral("Text"))) << "cut off";
    EXPECT_FALSE(application.texts().IsThatCreator(QString())) << "no name";
    EXPECT_TRUE(application.texts().GetDocuments().empty());
}

TEST(UDocTemplate, OpensANewDocumentInAPaneOfItsOwn)
{
    FrameLog log;
    const TextApplication application(log);
    const TextDocument *document = application.open();
    ASSERT_NE(document, nullptr);
    EXPECT_EQ(application.texts().GetDocuments(), (std::vector<UDocument *>{application.texts().GetDocuments()[0]}));
    EXPECT_EQ(application.texts().GetDocuments()[0], document);
    EXPECT_EQ(document->GetDocTemplate(), &application.texts());
    EXPECT_EQ(document->GetPathName(), noPath);
    EXPECT_FALSE(document->IsModified());
    EXPECT_TRUE(document->IsAutoDelete());
    EXPECT_EQ(log.events, QStringList{QStringLiteral("new")});
    EXPECT_EQ(application.GetRecentFileList(), QStringList());

    ASSERT_EQ(log.panes.size(), 1U);
    const CViewPane *pane = log.panes[0];
    ASSERT_EQ(pane->GetViews().size(), 1U);
    EXPECT_EQ(pane->GetActiveDocument(), document);
    EXPECT_TRUE(pane->IsVisible());
    EXPECT_EQ(pane->GetWindowNumber(), 0);
    EXPECT_EQ(viewOf(pane)->updates, (std::vector<RecordingView::Update>{{nullptr, 0, nullptr}})) << "once";
}

TEST(UDocTemplate, LeavesThePaneHiddenWhenWanted)
{
    FrameLog log;
    const TextApplication application(log);
    ASSERT_NE(application.open(noPath, nullptr, 0), nullptr);
    ASSERT_EQ(log.panes.size(), 1U);
    EXPECT_FALSE(log.panes[0]->IsVisible());
    EXPECT_EQ(viewOf(log.panes[0])->updates.size(), 1U) << "ready to be shown";
}

TEST(UDocTemplate, OpensAFile)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.txt"));
    putFile(path, "stored");
    FrameLog log;
    const TextApplication application(log);
    const TextDocument *document = application.open(path);
    ASSERT_NE(document, nullptr);
    EXPECT_EQ(document->content, "stored");
    EXPECT_EQ(document->GetPathName(), path);
    EXPECT_EQ(document->GetTitle(), QStringLiteral("a.txt"));
    EXPECT_FALSE(document->IsModified());
    EXPECT_EQ(log.events, QStringList{QStringLiteral("open")});
    EXPECT_EQ(paneCaptions(), QStringList{QStringLiteral("a.txt")});
    EXPECT_EQ(application.GetRecentFileList(), QStringList{path});
}

/// A view that remembers what it saw when it was first updated.
class SeeingView : public UView
{
public:
    explicit SeeingView(QByteArray &seen) : seen_(seen) {}
    void OnInitialUpdate() override { seen_ = static_cast<TextDocument *>(GetDocument())->content; }

private:
    QByteArray &seen_;
};

TEST(UDocTemplate, ViewsSeeTheirDocumentFilledAtFirst)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.txt"));
    putFile(path, "stored");
    FrameLog log;
    QByteArray seen;
    UApplication application;
    UDocTemplate *seeing = application.AddDocTemplate(std::make_unique<UDocTemplate>(
        1, [&log] { return std::make_unique<TextDocument>(log); }, [&log] { return new RecordingPane(log); },
        [&seen] { return std::make_unique<SeeingView>(seen); }, QString(), 1, 1));
    ASSERT_NE(seeing->OpenReportDocumentFile(path, 1, 1, nullptr, 0, nullptr), nullptr);
    EXPECT_EQ(seen, "stored");
}

TEST(UDocTemplate, OpensIntoAPaneThatIsThere)
{
    FrameLog log;
    const TextApplication application(log);
    auto *pane = new RecordingPane(log);
    TextDocument other(log);
    other.SetAutoDelete(false);
    const RecordingView *otherView = addRecordingView(*pane, other);

    const TextDocument *document = application.open(noPath, pane);
    ASSERT_NE(document, nullptr);
    EXPECT_EQ(log.panes.size(), 1U) << "no other pane";
    ASSERT_EQ(pane->GetViews().size(), 2U);
    EXPECT_EQ(viewOf(pane, 1)->GetDocument(), document);
    EXPECT_EQ(viewOf(pane, 1)->updates.size(), 1U);
    EXPECT_TRUE(otherView->updates.empty()) << "views of other documents are not touched";
    EXPECT_TRUE(pane->IsVisible());
}

TEST(UDocTemplate, WorksWithoutWindows)
{
    FrameLog log;
    const TextApplication application(log, false);
    TextDocument *document = application.open();
    ASSERT_NE(document, nullptr);
    EXPECT_TRUE(document->GetViews().empty());
    EXPECT_TRUE(log.panes.empty());
    EXPECT_EQ(application.texts().CreateNewPane(document, nullptr, 0, nullptr), nullptr);
    document->OnCloseDocument();
    EXPECT_TRUE(application.texts().GetDocuments().empty());
    EXPECT_EQ(log.documents, 0);
}

TEST(UDocTemplate, AFailedOpenGivesNullAndLeavesNothing)
{
    const QTemporaryDir folder;
    const QString broken = folder.filePath(QStringLiteral("broken.txt"));
    putFile(broken, "broken content");
    struct Row
    {
        QString path;
        const char *reason;
    };
    const Row rows[] = {
        {folder.filePath(QStringLiteral("missing.txt")), "no such file"},
        {folder.path(), "a folder"},
        {broken, "reading fails in the middle"},
    };
    FrameLog log;
    for (const bool withWindows : {true, false}) {
        const TextApplication application(log, withWindows);
        const TextDocument *before = application.open();
        for (const Row &row : rows) {
            EXPECT_EQ(application.open(row.path), nullptr) << row.reason;
            EXPECT_EQ(log.documents, 1) << row.reason;
            EXPECT_EQ(log.panes.size(), withWindows ? 1U : 0U) << row.reason;
            EXPECT_EQ(paneCaptions().size(), withWindows ? 1 : 0) << row.reason;
            ASSERT_EQ(application.texts().GetDocuments().size(), 1U) << row.reason;
            EXPECT_EQ(application.texts().GetDocuments()[0], before) << row.reason;
            EXPECT_EQ(application.GetRecentFileList(), QStringList()) << row.reason;
        }
        application.texts().GetDocuments()[0]->OnCloseDocument();
    }
}

TEST(UDocTemplate, AFailedOpenLeavesAPaneThatWasThereOpen)
{
    FrameLog log;
    const TextApplication application(log);
    auto *pane = new RecordingPane(log);
    EXPECT_EQ(application.open(QStringLiteral("/missing/a.txt"), pane), nullptr);
    EXPECT_EQ(log.documents, 0);
    EXPECT_EQ(log.panes, (std::vector<CViewPane *>{pane}));
    EXPECT_EQ(pane->GetActiveDocument(), nullptr);
}

TEST(UDocTemplate, ADocumentThatCannotBeMadeGivesNull)
{
    FrameLog log;
    UApplication application;
    const auto openWith = [&](UDocTemplate::DocumentFactory makeDocument) {
        UDocTemplate *docTemplate = application.AddDocTemplate(std::make_unique<UDocTemplate>(
            1, std::move(makeDocument), [&log] { return new RecordingPane(log); },
            [] { return std::make_unique<RecordingView>(); }, QString(), 1, 1));
        return docTemplate->OpenReportDocumentFile(noPath, 1, 1, nullptr, 0, nullptr);
    };
    EXPECT_EQ(openWith([] { return nullptr; }), nullptr) << "none is made";
    EXPECT_EQ(openWith([&log] {
                  auto document = std::make_unique<TextDocument>(log);
                  document->makes = false;
                  return document;
              }),
              nullptr)
        << "it cannot be made new";
    EXPECT_EQ(log.documents, 0);
    EXPECT_TRUE(log.panes.empty());
}

TEST(UDocTemplate, KeepsAutoDeleteOffWhereTheDocumentHasItOff)
{
    FrameLog log;
    UApplication application;
    UDocTemplate *kept = application.AddDocTemplate(std::make_unique<UDocTemplate>(
        1,
        [&log] {
            auto document = std::make_unique<TextDocument>(log);
            document->SetAutoDelete(false);
            return document;
        },
        [&log] { return new RecordingPane(log); }, [] { return std::make_unique<RecordingView>(); }, QString(), 1, 1));
    const UDocument *document = kept->OpenReportDocumentFile(noPath, 1, 1, nullptr, 0, nullptr);
    ASSERT_NE(document, nullptr);
    EXPECT_FALSE(document->IsAutoDelete());
    log.panes[0]->ClosePane();
    EXPECT_EQ(log.documents, 1) << "it stays when its pane is closed";
}

TEST(UDocTemplate, ForgetsDocumentsThatClose)
{
    FrameLog log;
    const TextApplication application(log);
    UDocument *first = application.open();
    UDocument *second = application.open();
    UDocument *third = application.open();
    EXPECT_EQ(application.texts().GetDocuments(), (std::vector{first, second, third})) << "in the order of opening";
    log.panes[1]->ClosePane();
    EXPECT_EQ(application.texts().GetDocuments(), (std::vector{first, third})) << "its pane was closed";
    first->OnCloseDocument();
    EXPECT_EQ(application.texts().GetDocuments(), (std::vector{third})) << "it was closed itself";
    EXPECT_EQ(log.panes.size(), 1U);
}

TEST(UDocTemplate, ASecondPaneOfADocumentIsNumbered)
{
    FrameLog log;
    const TextApplication application(log);
    TextDocument *document = application.open();
    ASSERT_NE(document, nullptr);
    document->SetTitle(QStringLiteral("Traverse"));
    CViewPane *second = application.texts().CreateNewPane(document, log.panes[0], 0, nullptr);
    ASSERT_NE(second, nullptr);
    second->SetWindowTextW(QStringLiteral("Traverse"));
    EXPECT_FALSE(second->IsVisible()) << "not before its first update";
    EXPECT_EQ(second->GetActiveDocument(), document);
    EXPECT_TRUE(viewOf(second)->updates.empty());
    EXPECT_EQ(paneCaptions(), (QStringList{QStringLiteral("Traverse"), QStringLiteral("Traverse")}));

    application.texts().InitialUpdatePane(second, document, 1);
    EXPECT_TRUE(second->IsVisible());
    EXPECT_EQ(viewOf(second)->updates.size(), 1U);
    EXPECT_EQ(viewOf(log.panes[0])->updates.size(), 1U) << "the first pane was updated when it was opened";
    EXPECT_EQ(paneCaptions(), (QStringList{QStringLiteral("Traverse:1"), QStringLiteral("Traverse:2")}));
    second->ClosePane();
    EXPECT_EQ(paneCaptions(), QStringList{QStringLiteral("Traverse")});
    EXPECT_EQ(log.documents, 1);
}

} // namespace
