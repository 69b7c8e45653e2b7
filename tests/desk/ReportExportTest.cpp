#include "ReportExport.h"

#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "UReportView.h"
#include "UView.h"

#include <QFileDialog>
#include <QLineEdit>
#include <QTimer>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

/// A desk whose questions for a file to export into are answered.
class ExportingDesk : public Desk
{
public:
    ExportingDesk()
    {
        answer = MessageAnswer::No;
        frame->askExportFile = [this](const SaveRequest &request) {
            asked = request;
            return choice;
        };
    }

    SaveRequest asked;
    std::optional<SaveChoice> choice;
};

TEST(ReportExport, WritesTheReportAsItIsAndLeavesItsOwnFileAlone)
{
    const JobFolder folder;
    folder.put("list.json", lineJob());
    ExportingDesk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("list.json")));
    UReportDoc *report = Desk::reports().front();
    QCoreApplication::processEvents();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_X);
    struct Row
    {
        unsigned command;
        const char *file;
        const char *begins;
    };
    for (const Row &row : {Row{exportPdfCommand, "a.pdf", "%PDF-"}, Row{exportRichTextCommand, "a.rtf", "{\\rtf"},
                           Row{exportTextCommand, "a.txt", "xFirst line"}})
    {
        desk.choice = SaveChoice(folder.path(row.file));
        ASSERT_TRUE(desk.frame->OnCommand(row.command)) << row.file;
        EXPECT_TRUE(folder.bytesOf(row.file).startsWith(row.begins))
            << row.file << folder.bytesOf(row.file).toStdString();
        EXPECT_EQ(desk.asked.fileName, folder.path(("Lines" + QByteArray(row.file).mid(1)).constData()))
            << "beside the job, by the title";
        EXPECT_TRUE(report->IsModified()) << row.file;
        EXPECT_TRUE(report->GetPathName().isEmpty()) << row.file;
    }
    EXPECT_TRUE(desk.messages.isEmpty()) << desk.messages.join(u'\n').toStdString();
    desk.choice = SaveChoice(folder.path("outline.pdf"), true);
    ASSERT_TRUE(desk.frame->OnCommand(exportPdfCommand));
    EXPECT_TRUE(folder.bytesOf("outline.pdf").contains("/PageLabels"));
}

TEST(ReportExport, WhatCannotBeWrittenIsSaid)
{
    const JobFolder folder;
    folder.put("a.rep", savedText("TALVEN"));
    ExportingDesk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    desk.choice = SaveChoice(folder.path("no/such/folder/a.txt"));
    ASSERT_TRUE(desk.frame->OnCommand(exportTextCommand));
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("no/such/folder/a.txt")));
    desk.choice = SaveChoice(folder.path("a.rep"));
    const QByteArray before = folder.bytesOf("a.rep");
    ASSERT_TRUE(desk.frame->OnCommand(exportTextCommand));
    ASSERT_EQ(desk.messages.size(), 2) << "its own file is not replaced by a text";
    EXPECT_EQ(folder.bytesOf("a.rep"), before);
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    desk.choice = SaveChoice(folder.path("empty.pdf"));
    ASSERT_TRUE(desk.frame->OnCommand(exportPdfCommand));
    EXPECT_EQ(desk.messages.size(), 3) << "a PDF without a page";
    EXPECT_FALSE(QFile::exists(folder.path("empty.pdf")));
}

/// Answers the next file dialog.
void inDialog(const std::function<void(QFileDialog &)> &act)
{
    QTimer::singleShot(0, qApp, [act] {
        auto *dialog = qobject_cast<QFileDialog *>(QApplication::activeModalWidget());
        ASSERT_NE(dialog, nullptr);
        act(*dialog);
        dialog->reject();
    });
}

TEST(ReportExport, TheDialogProposesANameWhoseEndingFollowsTheKind)
{
    const JobFolder folder;
    folder.put("list.json", lineJob());
    Desk desk;
    desk.answer = MessageAnswer::No;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("list.json")));
    QString proposed;
    QString other;
    const auto look = [&](QFileDialog &dialog) {
        auto *field = dialog.findChild<QLineEdit *>(QStringLiteral("fileNameEdit"));
        ASSERT_NE(field, nullptr);
        EXPECT_EQ(dialog.directory(), QDir(folder.path())) << "beside the job";
        proposed = field->text();
        Q_EMIT dialog.filterSelected(dialog.nameFilters().at(2));
        other = field->text();
    };
    inDialog(look);
    ASSERT_TRUE(desk.frame->OnCommand(exportRichTextCommand));
    EXPECT_EQ(proposed, QStringLiteral("Lines.rtf"));
    EXPECT_EQ(other, QStringLiteral("Lines.pdf")) << "PDF with an outline";
    installDialogs(&*desk.frame);
    setMessageBox([](const Message &) { return MessageAnswer::No; });
    inDialog(look);
    ASSERT_TRUE(desk.frame->OnCommand(fileSaveAsCommand));
    EXPECT_EQ(proposed, QStringLiteral("Lines.rep")) << "Save As proposes the title";
    EXPECT_EQ(other, QStringLiteral("Lines.pdf"));
    setSaveDialog({});
}

} // namespace
