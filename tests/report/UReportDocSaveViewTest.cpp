#include "FrameFixture.h"
#include "ReportFixture.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

QStringList namesIn(const QTemporaryDir &folder)
{
    return QDir(folder.path()).entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
}

/// Notes how the report was marked while it was updated.
class WatchingView : public TestReportView
{
public:
    void OnUpdate(UView *sender, long hint, void *hintObject) override
    {
        TestReportView::OnUpdate(sender, hint, hintObject);
        wasForEditor = static_cast<const UReportDoc *>(GetDocument())->GetExternalEditorFlag();
        wasFromAll = sender == nullptr && hint == 0 && hintObject == nullptr;
        richText = "{\\rtf1 updated}";
    }
    bool streamRichText(QIODevice &device) const override
    {
        ++streams;
        return TestReportView::streamRichText(device);
    }

    bool wasForEditor = true;
    bool wasFromAll = false;
    mutable int streams = 0;
};

TEST(UReportDocSaveView, TheViewIsBroughtUpToDateWithoutAnEditorBeforeItIsSaved)
{
    for (const bool externalEditor : {true, false}) {
        const FixedSurroundings surroundings;
        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("a.rtf"));
        UReportDoc report;
        report.SetAutoDelete(false);
        CViewPane pane;
        const auto *view = showIn<WatchingView>(pane, report);
        report.SetExternalEditorFlag(externalEditor);
        EXPECT_TRUE(report.OnSaveDocument(path));
        EXPECT_EQ(view->updates, 1);
        EXPECT_FALSE(view->wasForEditor);
        EXPECT_TRUE(view->wasFromAll);
        EXPECT_EQ(report.GetExternalEditorFlag(), externalEditor) << "and the mark is as it was";
        EXPECT_EQ(contentOf(path), "{\\rtf1 updated}") << "also of a report without text";
    }
}

TEST(UReportDocSaveView, TheFirstViewOfTheReportIsTheOneThatIsSaved)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rtf"));
    UReportDoc report;
    report.SetAutoDelete(false);
    CViewPane pane;
    showIn<UView>(pane, report);
    auto *first = showIn<WatchingView>(pane, report);
    auto *second = showIn<WatchingView>(pane, report);
    EXPECT_TRUE(report.OnSaveDocument(path));
    EXPECT_EQ(first->streams, 1) << "other views are skipped";
    EXPECT_EQ(second->streams, 0);
    EXPECT_EQ(first->updates, 1);
    EXPECT_EQ(second->updates, 1) << "all views are updated, once";
}

/// Closes when it is updated.
class ClosingView : public TestReportView
{
public:
    void OnUpdate(UView *, long, void *) override { GetParentPane()->ClosePane(); }
};

TEST(UReportDocSaveView, AViewThatClosesMeanwhileIsNotAsked)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    UReportDoc report;
    report.SetAutoDelete(false);
    report.SetData(QStringLiteral("text"));
    showIn<ClosingView>(*new CViewPane, report);
    CViewPane pane;
    const auto *second = showIn<WatchingView>(pane, report);
    EXPECT_TRUE(report.OnSaveDocument(folder.filePath(QStringLiteral("a.rtf"))));
    EXPECT_EQ(second->streams, 1) << "the next one is";
    EXPECT_EQ(contentOf(folder.filePath(QStringLiteral("a.rtf"))), "{\\rtf1 updated}");

    UReportDoc only;
    only.SetAutoDelete(false);
    only.SetData(QStringLiteral("text"));
    showIn<ClosingView>(*new CViewPane, only);
    EXPECT_TRUE(only.OnSaveDocument(folder.filePath(QStringLiteral("b.rtf"))));
    EXPECT_EQ(contentOf(folder.filePath(QStringLiteral("b.rtf"))), "\xEF\xBB\xBFtext") << "without a next one the text";
}

TEST(UReportDocSaveView, WithoutAViewRichTextIsSavedAsText)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rtf"));
    UReportDoc report;
    report.SetAutoDelete(false);
    CViewPane pane;
    showIn<UView>(pane, report);
    report.SetModifiedFlag(true);
    EXPECT_TRUE(report.OnSaveDocument(path));
    EXPECT_FALSE(QFile::exists(path)) << "an empty text makes no file";
    EXPECT_FALSE(report.IsModified());
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    EXPECT_TRUE(report.OnSaveDocument(path));
    EXPECT_EQ(contentOf(path), "\xEF\xBB\xBFx\r\r\n");
    EXPECT_FALSE(report.IsModified());
}

TEST(UReportDocSaveView, WhereNoFileCanBeOpenedEveryViewIsTriedAndThenTheText)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("missing/a.rtf"));
    UReportDoc report;
    report.SetAutoDelete(false);
    CViewPane pane;
    const auto *first = showIn<WatchingView>(pane, report);
    const auto *second = showIn<WatchingView>(pane, report);
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    EXPECT_FALSE(report.OnSaveDocument(path));
    EXPECT_TRUE(report.IsModified());
    EXPECT_EQ(first->streams + second->streams, 0);
    EXPECT_EQ(first->updates, 2) << "once for each view that was tried";
    EXPECT_EQ(second->updates, 2);
    report.Clear();
    EXPECT_TRUE(report.OnSaveDocument(path)) << "an empty text needs no file";
    EXPECT_FALSE(report.IsModified());
}

/// Fails in the middle.
class FailingView : public TestReportView
{
public:
    bool streamRichText(QIODevice &device) const override
    {
        device.write("{\\rtf1 cut");
        return false;
    }
};

TEST(UReportDocSaveView, AViewThatFailsLeavesTheEarlierFile)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rtf"));
    putFile(path, "earlier");
    UReportDoc report;
    report.SetAutoDelete(false);
    CViewPane pane;
    showIn<FailingView>(pane, report);
    const auto *second = showIn<WatchingView>(pane, report);
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    EXPECT_FALSE(report.OnSaveDocument(path));
    EXPECT_EQ(contentOf(path), "earlier");
    EXPECT_EQ(namesIn(folder), QStringList{QStringLiteral("a.rtf")});
    EXPECT_TRUE(report.IsModified());
    EXPECT_EQ(second->streams, 0) << "the file could be opened: no other view would do better";
}

} // namespace
