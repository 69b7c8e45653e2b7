#include "ReportEditorFixture.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

using UReportDocOpenAfterSave = ReportEditor;

TEST_F(UReportDocOpenAfterSave, ASavedRichTextOfAMarkedReportIsOpened)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a b.rtf"));
    UReportDoc *report = createWritten();
    EXPECT_TRUE(report->OnSaveDocument(path));
    ASSERT_EQ(launches.all.size(), 1U) << "bringing the view up to date starts none";
    EXPECT_EQ(launches.all[0].program, editor.path);
    EXPECT_EQ(launches.all[0].file, path) << "the file itself, of whatever kind the editor is";
    EXPECT_EQ(launches.all[0].folder, QString()) << "where the program was";
    EXPECT_EQ(contentOf(path), "{\\rtf1 of the view}");
    EXPECT_TRUE(report->GetExternalEditorFlag());
    EXPECT_TRUE(report->IsModified());
}

TEST_F(UReportDocOpenAfterSave, TheFileIsWholeByThen)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    const QString path = at("a.rtf");
    std::string found;
    launches.meanwhile = [&] { found = contentOf(path); };
    EXPECT_TRUE(createWritten()->OnSaveDocument(path));
    EXPECT_EQ(found, "{\\rtf1 of the view}");
}

TEST_F(UReportDocOpenAfterSave, OnlyARichTextOfAMarkedReportWithAnEditorIs)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    struct Row
    {
        const char *name;
        bool marked;
        bool preferred;
        QString editor;
        bool expected;
        const char *reason;
    };
    const Row rows[] = {
        {"a.rtf", true, true, editor.path, true, "the usual case"},
        {"a.RTF", true, true, editor.path, true, "in capitals"},
        {"a.rtf", true, true, QStringLiteral(" \t") + editor.path + u'\n', true, "blanks around the path do no harm"},
        {"a.rtf", false, true, editor.path, false, "not marked"},
        {"a.rtf", true, false, editor.path, false, "not preferred"},
        {"a.rtf", true, true, QString(), false, "none chosen"},
        {"a.rtf", true, true, QStringLiteral("  "), false, "none chosen"},
        {"a.rtf", true, true, editor.path + u'2', false, "not installed"},
        {"a.rtf", true, true, QFileInfo(editor.path).path(), false, "a folder"},
        {"a.rep", true, true, editor.path, false, "a report file"},
        {"a.pdf", true, true, editor.path, false, "a PDF"},
        {"a.rtf.rtf", true, true, editor.path, false, "saved as text"},
        {"missing/a.rtf", true, true, editor.path, false, "not saved"},
    };
    const QTemporaryDir folder;
    for (const Row &row : rows) {
        UReportDoc *report = createWritten();
        report->SetExternalEditorFlag(row.marked);
        preferEditor(row.editor);
        SetUsePreferredReportEditorFlag(row.preferred);
        launches.all.clear();
        const QString path = folder.filePath(QLatin1String(row.name));
        report->OnSaveDocument(path);
        EXPECT_EQ(launches.files(), row.expected ? QStringList{path} : QStringList()) << row.reason;
        if (row.expected) {
            EXPECT_EQ(launches.all.front().program, editor.path) << row.reason;
        }
        EXPECT_EQ(report->GetExternalEditorFlag(), row.marked) << row.reason;
    }
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

TEST_F(UReportDocOpenAfterSave, AFileThatCouldNotBeWrittenIsNot)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    putFile(at("a.rtf"), "earlier");
    UReportDoc report(QString(), true, false, nullptr);
    report.SetAutoDelete(false);
    CViewPane pane;
    showIn<FailingView>(pane, report);
    EXPECT_FALSE(report.OnSaveDocument(at("a.rtf")));
    EXPECT_EQ(contentOf(at("a.rtf")), "earlier");
    EXPECT_EQ(launches.files(), QStringList()) << "what is there is not what was saved";
}

TEST_F(UReportDocOpenAfterSave, WithoutAViewTheTextIsSavedAndNotOpened)
{
    const PreferredEditor editor(QStringLiteral("winword"));
    UReportDoc report(QString(), true, false, nullptr);
    report.SetData(QStringLiteral("text"));
    EXPECT_TRUE(report.OnSaveDocument(at("a.rtf")));
    EXPECT_EQ(contentOf(at("a.rtf")), "\xEF\xBB\xBFtext");
    EXPECT_EQ(launches.files(), QStringList());
}

} // namespace
