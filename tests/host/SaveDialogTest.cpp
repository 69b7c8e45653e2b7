#include "SaveDialog.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <vector>

namespace
{

using kareport::askSaveName;
using kareport::SaveRequest;
using kareport::setSaveDialog;

TEST(SaveDialog, WithoutOneEveryQuestionIsCancelled)
{
    EXPECT_EQ(askSaveName({}), std::nullopt);
    setSaveDialog([](const SaveRequest &) { return QStringLiteral("/jobs/a.rep"); });
    setSaveDialog({});
    EXPECT_EQ(askSaveName({}), std::nullopt) << "an empty one cancels again";
}

TEST(SaveDialog, GetsTheRequestAndAnswers)
{
    std::vector<SaveRequest> requests;
    std::optional<QString> answer;
    setSaveDialog([&](const SaveRequest &request) {
        requests.push_back(request);
        return answer;
    });
    SaveRequest request;
    request.defaultExtension = QStringLiteral("rep");
    request.fileName = QStringLiteral("測量");
    request.initialFolder = QStringLiteral("/jobs");
    request.filter = QStringLiteral("Report Files (*.rep)|*.rep||");
    request.flags = SaveRequest::overwritePrompt | SaveRequest::pathMustExist;
    EXPECT_EQ(askSaveName(request), std::nullopt) << "cancelled";
    answer = QString();
    EXPECT_EQ(askSaveName(request), QString()) << "an empty name is an answer";
    answer = QStringLiteral("/jobs/é.rep");
    EXPECT_EQ(askSaveName(request), QStringLiteral("/jobs/é.rep"));
    setSaveDialog({});
    ASSERT_EQ(requests.size(), 3U);
    for (const SaveRequest &got : requests) {
        EXPECT_EQ(got.defaultExtension, request.defaultExtension);
        EXPECT_EQ(got.fileName, request.fileName);
        EXPECT_EQ(got.initialFolder, request.initialFolder);
        EXPECT_EQ(got.filter, request.filter);
        EXPECT_EQ(got.flags, request.flags);
    }
}

TEST(SaveDialog, TheFlagsHaveTheirUsualValues)
{
    // Dialogs of other hosts are given these numbers as they are.
    EXPECT_EQ(SaveRequest::overwritePrompt | SaveRequest::hideReadOnly | SaveRequest::pathMustExist, 0x0806U);
    EXPECT_EQ(SaveRequest().flags, 0U);
}

} // namespace
