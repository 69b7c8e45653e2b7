#include "WaitCursor.h"

#include <QCursor>
#include <QGuiApplication>

#include <gtest/gtest.h>

#include <optional>

namespace
{

using kareport::WaitCursor;

bool isWaiting()
{
    const QCursor *cursor = QGuiApplication::overrideCursor();
    return cursor != nullptr && cursor->shape() == Qt::WaitCursor;
}

TEST(WaitCursor, IsShownWhileItLives)
{
    EXPECT_EQ(QGuiApplication::overrideCursor(), nullptr);
    {
        const WaitCursor outer;
        EXPECT_TRUE(isWaiting());
        {
            const WaitCursor inner;
            EXPECT_TRUE(isWaiting());
        }
        EXPECT_TRUE(isWaiting()) << "the outer one still waits";
    }
    EXPECT_EQ(QGuiApplication::overrideCursor(), nullptr);
}

TEST(WaitCursor, AnotherCursorComesBack)
{
    QGuiApplication::setOverrideCursor(QCursor(Qt::CrossCursor));
    std::optional<WaitCursor> wait(std::in_place);
    EXPECT_TRUE(isWaiting());
    wait.reset();
    ASSERT_NE(QGuiApplication::overrideCursor(), nullptr);
    EXPECT_EQ(QGuiApplication::overrideCursor()->shape(), Qt::CrossCursor);
    QGuiApplication::restoreOverrideCursor();
}

} // namespace
