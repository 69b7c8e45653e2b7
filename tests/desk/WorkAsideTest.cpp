#include "WorkAside.h"

#include "PrintQt.h"

#include <QApplication>
#include <QLabel>
#include <QProgressDialog>
#include <QPushButton>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

#include <thread>

namespace
{

using kareport::AsideState;
using kareport::doAside;
using kareport::UserInput;

constexpr int step = 5; // milliseconds

void waitFor(const std::atomic<bool> &isSet)
{
    while (!isSet) {
        std::this_thread::sleep_for(std::chrono::milliseconds(step));
    }
}

void waitUntilStopped(AsideState &state)
{
    while (!state.isStopped()) {
        std::this_thread::sleep_for(std::chrono::milliseconds(step));
    }
}

QProgressDialog *shownDialog()
{
    return qobject_cast<QProgressDialog *>(QApplication::activeModalWidget());
}

TEST(WorkAside, LetsTheWindowsAnswer)
{
    for (const UserInput input : {UserInput::Taken, UserInput::Kept}) {
        std::atomic<bool> hasAnswered = false; // only the event loop sets it
        QTimer::singleShot(0, [&hasAnswered] { hasAnswered = true; });
        const auto here = std::this_thread::get_id();
        bool isElsewhere = false;
        EXPECT_TRUE(doAside(QString(), input, [&](AsideState &) {
            isElsewhere = std::this_thread::get_id() != here;
            waitFor(hasAnswered);
        }));
        EXPECT_TRUE(isElsewhere);
    }
}

TEST(WorkAside, ThatIsDoneInAMomentShowsNothing)
{
    bool isShown = false;
    std::atomic<bool> hasLooked = false;
    QTimer lookTimer;
    QObject::connect(&lookTimer, &QTimer::timeout, &lookTimer, [&] {
        isShown = isShown || shownDialog() != nullptr;
        hasLooked = true;
    });
    lookTimer.start(0);
    EXPECT_TRUE(doAside(QString(), UserInput::Taken, [&hasLooked](AsideState &) { waitFor(hasLooked); }));
    EXPECT_FALSE(isShown);
}

TEST(WorkAside, IsShownAndCanBeStopped)
{
    struct Row
    {
        void (*stop)(QProgressDialog &dialog);
        UserInput input;
        const char *reason;
    };
    constexpr Row rows[] = {
        {[](QProgressDialog &dialog) { QTest::keyClick(&dialog, Qt::Key_Escape); }, UserInput::Taken, "by Escape"},
        {[](QProgressDialog &dialog) { QTest::mouseClick(dialog.findChild<QPushButton *>(), Qt::LeftButton); },
         UserInput::Kept, "by the button"},
        {[](QProgressDialog &dialog) { dialog.close(); }, UserInput::Taken, "by closing the dialog"},
        {[](QProgressDialog &dialog) { dialog.reject(); }, UserInput::Kept, "by Escape before the dialog is active"},
    };
    for (const Row &row : rows) {
        QString label;
        int value = -1;
        QTimer lookTimer;
        QObject::connect(&lookTimer, &QTimer::timeout, &lookTimer, [&] {
            if (QProgressDialog *dialog = shownDialog(); dialog != nullptr && label.isEmpty()) {
                label = dialog->findChild<QLabel *>()->text();
                value = dialog->value();
                row.stop(*dialog);
            }
        });
        lookTimer.start(step);
        EXPECT_FALSE(doAside(QStringLiteral("<b>what</b>"), row.input, [](AsideState &state) {
            state.setPercent(42);
            waitUntilStopped(state);
        })) << row.reason;
        EXPECT_EQ(label, QStringLiteral("<b>what</b>")) << row.reason;
        EXPECT_EQ(value, 42) << row.reason;
        EXPECT_EQ(shownDialog(), nullptr) << row.reason;
        kareport::waitForStoppedWork();
    }
}

TEST(WorkAside, ThatDoesNotEndIsLeftAlone)
{
    const auto mayEnd = std::make_shared<std::atomic<bool>>(false);
    const auto hasEnded = std::make_shared<std::atomic<bool>>(false);
    QTimer::singleShot(0, [] { kareport::stopWorkAside(nullptr, {}); });
    EXPECT_FALSE(doAside(QString(), UserInput::Taken, [mayEnd, hasEnded](AsideState &) {
        waitFor(*mayEnd);
        *hasEnded = true;
    }));
    EXPECT_FALSE(*hasEnded);
    *mayEnd = true;
    kareport::waitForStoppedWork();
    EXPECT_TRUE(*hasEnded);
}

TEST(WorkAside, IsStoppedAsAWhole)
{
    QObject context;
    bool isDone = false;
    bool isInnerDone = true;
    QTimer::singleShot(0, [&] {
        QTimer::singleShot(0, [&] {
            EXPECT_TRUE(kareport::stopWorkAside(&context, [&isDone] { isDone = true; }));
            QCoreApplication::processEvents();
            EXPECT_FALSE(isDone) << "the work is still waited for";
        });
        isInnerDone = doAside(QString(), UserInput::Taken, waitUntilStopped);
    });
    EXPECT_FALSE(doAside(QString(), UserInput::Taken, waitUntilStopped));
    EXPECT_FALSE(isInnerDone);
    EXPECT_FALSE(isDone) << "from the event loop";
    QCoreApplication::processEvents();
    EXPECT_TRUE(isDone);
    EXPECT_FALSE(kareport::stopWorkAside(&context, [&isDone] { isDone = false; })) << "there is no work";
    QCoreApplication::processEvents();
    EXPECT_TRUE(isDone);
    kareport::waitForStoppedWork();
}

TEST(WorkAside, ForgetsWhatWasToBeDoneForWhoHasGone)
{
    bool isDone = false;
    auto context = std::make_unique<QObject>();
    QTimer::singleShot(0, [&] {
        kareport::stopWorkAside(context.get(), [&isDone] { isDone = true; });
        context.reset();
    });
    EXPECT_FALSE(doAside(QString(), UserInput::Taken, waitUntilStopped));
    QCoreApplication::processEvents();
    EXPECT_FALSE(isDone);
    kareport::waitForStoppedWork();
}

} // namespace
