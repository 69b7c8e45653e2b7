#include "FrameFixture.h"
#include "PosixFileSizeLimit.h"
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

TestReportView *shownView(const UReportDoc &report)
{
    return dynamic_cast<TestReportView *>(report.GetViews().front());
}

TEST(UReportDocSaveKinds, TheNamesEndSaysWhatIsWritten)
{
    constexpr const char *text = "\xEF\xBB\xBFx\r\r\n";
    constexpr const char *rich = "{\\rtf1 of the view}";
    constexpr const char *pdf = "%PDF-";
    struct Row
    {
        const char *name;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"x.rep", text, "a report file"},
        {"x.txt", text, "any other"},
        {"x", text, "no extension"},
        {"rtf", text, "no point"},
        {"x.rtf", rich, "rich text"},
        {"x.RTF", rich, "in any case"},
        {"x.rtf.rep", text, "not at the end"},
        {"x.rtf.rtf", text, "the first one is not at the end"},
        {"x.pdf.rtf", rich, "another one in front does not matter"},
        {"x.pdf", pdf, "PDF"},
        {"x.PDF", pdf, "in any case"},
        {"x.pdf.pdf", text, "the first one is not at the end"},
        {"x.rtf.pdf", pdf, "the rich-text one is not at the end"},
        {"x.pdf ", text, "a blank behind it"},
    };
    for (const Row &row : rows) {
        for (const bool modified : {true, false}) {
            const FixedSurroundings surroundings;
            const QTemporaryDir folder;
            ReportApplication application;
            UReportDoc *report = application.create(QStringLiteral("N"));
            report->SetHeaderFlag(false);
            report->WriteLine(QStringLiteral("x"), 0, 1, 0);
            report->SetModifiedFlag(modified);
            const QString path = folder.filePath(QLatin1String(row.name));
            EXPECT_TRUE(report->OnSaveDocument(path)) << row.name << ": " << row.reason;
            const std::string content = contentOf(path);
            EXPECT_EQ(row.expected == pdf ? content.substr(0, 5) : content, row.expected)
                << row.name << ": " << row.reason;
            EXPECT_EQ(report->IsModified(), modified && row.expected != text)
                << row.name << ": only the report text itself is all that there is";
            EXPECT_EQ(namesIn(folder).size(), 1) << row.name << ": nothing is left beside it";
        }
    }
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

TEST(UReportDocSaveKinds, TheViewIsBroughtUpToDateWithoutAnEditorBeforeItIsSaved)
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

TEST(UReportDocSaveKinds, TheFirstViewOfTheReportIsTheOneThatIsSaved)
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
    EXPECT_EQ(first->streams, 1) << "other views are passed over";
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

TEST(UReportDocSaveKinds, AViewThatClosesMeanwhileIsNotAsked)
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

TEST(UReportDocSaveKinds, WithoutAViewRichTextIsSavedAsText)
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

TEST(UReportDocSaveKinds, WhereNoFileCanBeOpenedEveryViewIsTriedAndThenTheText)
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

TEST(UReportDocSaveKinds, AViewThatFailsLeavesTheEarlierFile)
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

TEST(UReportDocSaveKinds, AnImpossibleTargetFailsForEveryKind)
{
    const FixedSurroundings surroundings;
    ReportApplication application;
    UReportDoc *report = application.create(QStringLiteral("N"));
    report->WriteLine(QStringLiteral("x"), 0, 1, 0);
    for (const QString &extension : {QStringLiteral(".rep"), QStringLiteral(".rtf"), QStringLiteral(".pdf")}) {
        const QTemporaryDir folder;
        const QString inTheWay = QStringLiteral("folder") + extension;
        ASSERT_TRUE(QDir().mkdir(folder.filePath(inTheWay)));
        putFile(folder.filePath(QStringLiteral("file")), "earlier");
        EXPECT_FALSE(report->OnSaveDocument(folder.filePath(inTheWay))) << "a folder stands there";
        EXPECT_FALSE(report->OnSaveDocument(folder.filePath(QStringLiteral("missing/a") + extension)))
            << "the folder does not exist";
        EXPECT_FALSE(report->OnSaveDocument(folder.filePath(QStringLiteral("file/a") + extension)))
            << "a file is no folder";
        EXPECT_TRUE(report->IsModified()) << extension.toStdString();
        EXPECT_EQ(namesIn(folder), (QStringList{QStringLiteral("file"), inTheWay}));
        EXPECT_EQ(contentOf(folder.filePath(QStringLiteral("file"))), "earlier");
    }
}

TEST(UReportDocSaveKinds, AFullDiskLeavesTheEarlierFileWhole)
{
    const FixedSurroundings surroundings;
    for (const QString &name : {QStringLiteral("a.rep"), QStringLiteral("a.rtf"), QStringLiteral("a.pdf")}) {
        for (const int size : {10000, 1000000}) {
            const QTemporaryDir folder;
            const QString path = folder.filePath(name);
            putFile(path, "earlier");
            ReportApplication application;
            UReportDoc *report = application.create(QStringLiteral("N"));
            shownView(*report)->richText = QByteArray(size, 'x');
            report->WriteLine(QString(size, u'x'), 0, 1, 0);
            bool saved = true;
            {
                const PosixFileSizeLimit full(4096);
                saved = report->OnSaveDocument(path);
            }
            EXPECT_FALSE(saved) << name.toStdString() << size;
            EXPECT_TRUE(report->IsModified()) << name.toStdString() << size;
            EXPECT_EQ(contentOf(path).substr(0, 20), "earlier") << name.toStdString() << size;
            EXPECT_EQ(namesIn(folder), QStringList{name}) << "nothing is left behind";
            EXPECT_TRUE(report->OnSaveDocument(path)) << name.toStdString() << ": there is room again";
            EXPECT_NE(contentOf(path).substr(0, 20), "earlier") << name.toStdString();
        }
    }
}

class CountingReport : public UReportDoc
{
public:
    bool OnSaveDocument(const QString &path) override
    {
        saved.append(path);
        return UReportDoc::OnSaveDocument(path);
    }

    QStringList saved;
};

TEST(UReportDocSaveKinds, SavingAFileTellsOnlyWhetherThereWasAName)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    const QString missing = folder.filePath(QStringLiteral("missing/a.rep"));
    CountingReport report;
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    EXPECT_EQ(report.SaveFile(QString()), 0);
    EXPECT_EQ(report.saved, QStringList());
    EXPECT_EQ(report.SaveFile(missing), 1) << "callers go on also when it failed";
    EXPECT_TRUE(report.IsModified());
    EXPECT_EQ(report.SaveFile(path), 1);
    EXPECT_FALSE(report.IsModified());
    EXPECT_EQ(contentOf(path), "\xEF\xBB\xBFx\r\r\n");
    EXPECT_EQ(report.saved, (QStringList{missing, path}));
}

} // namespace
