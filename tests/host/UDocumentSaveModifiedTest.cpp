#include "FrameFixture.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

TEST(UDocumentSaveModified, FollowsTheAnswer)
{
    struct Row
    {
        MessageAnswer answer;
        bool closes;
        const char *content;
        bool modified;
        const char *reason;
    };
    constexpr Row rows[] = {
        {MessageAnswer::Yes, true, "changed", false, "saved, then closed"},
        {MessageAnswer::No, true, "earlier", true, "closed without saving"},
        {MessageAnswer::Cancel, false, "earlier", true, "not closed"},
    };
    for (const Row &row : rows) {
        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("own.txt"));
        putFile(path, "earlier");
        FrameLog log;
        TextDocument document(log);
        document.SetPathName(path, false);
        document.content = "changed";
        document.SetModifiedFlag();
        const AnsweredMessages messages(row.answer);
        EXPECT_EQ(document.SaveModified(), row.closes) << row.reason;
        EXPECT_EQ(contentOf(path), row.content) << row.reason;
        EXPECT_EQ(document.IsModified(), row.modified) << row.reason;
        ASSERT_EQ(messages.texts.size(), 1) << row.reason;
        EXPECT_EQ(messages.texts[0], QStringLiteral("Save changes to own.txt?")) << row.reason;
        EXPECT_EQ(messages.asked[0], MessageButtons::YesNoCancel) << row.reason;
    }
}

TEST(UDocumentSaveModified, DoesNotAskWithoutChanges)
{
    FrameLog log;
    TextDocument document(log);
    const AnsweredMessages messages(MessageAnswer::Cancel);
    EXPECT_TRUE(document.SaveModified());
    EXPECT_TRUE(messages.texts.isEmpty());
}

TEST(UDocumentSaveModified, AsksByTheTitle)
{
    struct Row
    {
        QStringView title;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"Traverse", u"Save changes to Traverse?", "a title"},
        {u"", u"Save changes to Untitled?", "none"},
        {u"100 % 測量 %1", u"Save changes to 100 % 測量 %1?", "taken as it is"},
    };
    for (const Row &row : rows) {
        FrameLog log;
        TextDocument document(log);
        document.SetTitle(row.title.toString());
        document.SetModifiedFlag();
        const AnsweredMessages messages(MessageAnswer::No);
        EXPECT_TRUE(document.SaveModified());
        EXPECT_EQ(messages.texts.value(0), row.expected.toString()) << row.reason;
    }
}

TEST(UDocumentSaveModified, AFailedSaveCancelsTheClosing)
{
    const QTemporaryDir folder;
    FrameLog log;
    TextDocument document(log);
    document.content = "changed";
    document.SetModifiedFlag();
    const AnsweredMessages messages(MessageAnswer::Yes);
    EXPECT_FALSE(document.SaveModified()) << "it has no file to be saved to";
    EXPECT_TRUE(document.IsModified());
    document.SetPathName(folder.filePath(QStringLiteral("missing/own.txt")), false);
    EXPECT_FALSE(document.SaveModified()) << "the folder has gone";
    EXPECT_TRUE(document.IsModified());
}

TEST(UDocumentSaveModified, WithoutAnyoneToAskNothingIsLost)
{
    FrameLog log;
    TextDocument document(log);
    document.SetModifiedFlag();
    EXPECT_FALSE(document.SaveModified());
    EXPECT_TRUE(document.IsModified());
}

TEST(UDocumentSaveModified, IsAskedForTheLastPaneOnly)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *first = openRecordingPane(log, document);
    auto *second = openRecordingPane(log, document);
    document.SetModifiedFlag();
    const AnsweredMessages messages(MessageAnswer::Cancel);
    EXPECT_TRUE(document.CanCloseFrame(first)) << "the second pane keeps the document";
    EXPECT_TRUE(document.CanCloseFrame(second)) << "the first pane keeps the document";
    EXPECT_TRUE(messages.texts.isEmpty());
    second->ClosePane();
    EXPECT_FALSE(document.CanCloseFrame(first)) << "now the changes would be lost";
    EXPECT_EQ(messages.texts.size(), 1);
    addRecordingView(*first, document);
    EXPECT_FALSE(document.CanCloseFrame(first)) << "a second view in the same pane goes with it";
    document.SetModifiedFlag(false);
    EXPECT_TRUE(document.CanCloseFrame(first)) << "nothing to lose";
    EXPECT_EQ(messages.texts.size(), 2);
}

} // namespace
