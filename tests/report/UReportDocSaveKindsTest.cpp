#include "FileSizeLimit.h"
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
        {"x.pdf ", text, "a blank after it"},
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
        EXPECT_FALSE(report->OnSaveDocument(folder.filePath(inTheWay))) << "a folder has the name";
        EXPECT_FALSE(report->OnSaveDocument(folder.filePath(QStringLiteral("missing/a") + extension)))
            << "the folder does not exist";
        EXPECT_FALSE(report->OnSaveDocument(folder.filePath(QStringLiteral("file/a") + extension)))
            << "a file is not a folder";
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
                const FileSizeLimit full(4096);
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
