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

} // namespace
