#include "AppMessageBox.h"

#include "PrintQt.h"

#include <QStringList>

#include <gtest/gtest.h>

#include <vector>

namespace
{

TEST(AppMessageBox, WithoutAHandlerNothingIsShownAndTheAnswerLosesNothing)
{
    EXPECT_EQ(AppMessageBox(QStringLiteral("text")), MessageAnswer::Cancel);
    EXPECT_EQ(AppMessageBox(QStringLiteral("text"), MessageButtons::YesNoCancel), MessageAnswer::Cancel);
    kareport::setMessageHandler([](const QString &, MessageButtons) { return MessageAnswer::Yes; });
    kareport::setMessageHandler({});
    EXPECT_EQ(AppMessageBox(QStringLiteral("text"), MessageButtons::YesNoCancel), MessageAnswer::Cancel)
        << "an empty handler shows nothing again";
}

TEST(AppMessageBox, TheHandlerGetsTextAndButtonsAndAnswers)
{
    QStringList texts;
    std::vector<MessageButtons> asked;
    auto answer = MessageAnswer::Ok;
    kareport::setMessageHandler([&](const QString &text, MessageButtons buttons) {
        texts.append(text);
        asked.push_back(buttons);
        return answer;
    });
    EXPECT_EQ(AppMessageBox(QStringLiteral("100 % 測量")), MessageAnswer::Ok);
    for (const MessageAnswer given : {MessageAnswer::Yes, MessageAnswer::No, MessageAnswer::Cancel}) {
        answer = given;
        EXPECT_EQ(AppMessageBox(QString(), MessageButtons::YesNoCancel), given);
    }
    kareport::setMessageHandler({});
    EXPECT_EQ(texts, (QStringList{QStringLiteral("100 % 測量"), QString(), QString(), QString()}));
    EXPECT_EQ(asked, (std::vector{MessageButtons::Ok, MessageButtons::YesNoCancel, MessageButtons::YesNoCancel,
                                  MessageButtons::YesNoCancel}));
}

TEST(AppMessageBox, ShowsAStandardTextByItsNumber)
{
    struct Row
    {
        unsigned number;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {61701, u"The file is too large to open.", "of a document that is opened"},
        {61442, u"All Files (*.*)", "a title can be shown, too"},
        {0, u"", "no text has this number"},
        {0xFFFFFFFF, u"", "no text has this number"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(AppMessageBox(row.number, 0, 0xFFFFFFFF), MessageAnswer::Cancel) << "nothing is installed";
        QStringList texts;
        std::vector<MessageButtons> asked;
        kareport::setMessageHandler([&](const QString &text, MessageButtons buttons) {
            texts.append(text);
            asked.push_back(buttons);
            return MessageAnswer::Ok;
        });
        EXPECT_EQ(AppMessageBox(row.number, 0, 0xFFFFFFFF), MessageAnswer::Ok) << row.reason;
        kareport::setMessageHandler({});
        EXPECT_EQ(texts, QStringList{row.expected.toString()}) << row.reason;
        EXPECT_EQ(asked, std::vector{MessageButtons::Ok}) << row.reason;
    }
}

} // namespace
