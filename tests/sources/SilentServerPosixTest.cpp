#include "PostgresObjectList.h"
#include "SurveyRows.h"

#include <QElapsedTimer>
#include <QTemporaryDir>

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <cstring>

// A server that takes connections and never answers.

namespace
{

using kareport::PostgresObjectList;

class SilentServer : public testing::Test
{
protected:
    SilentServer() : socket_(::socket(AF_UNIX, SOCK_STREAM, 0))
    {
        sockaddr_un address = {};
        address.sun_family = AF_UNIX;
        const QByteArray path = folder_.filePath(QStringLiteral(".s.PGSQL.5432")).toUtf8();
        std::memcpy(address.sun_path, path.constData(), static_cast<std::size_t>(path.size()));
        EXPECT_EQ(::bind(socket_, reinterpret_cast<const sockaddr *>(&address), sizeof address), 0);
        EXPECT_EQ(::listen(socket_, 5), 0);
    }
    ~SilentServer() override { ::close(socket_); }

    kareport::PostgresQuery query(const char *more = "") const
    {
        return {QStringLiteral("host=%1 port=5432 user=u dbname=d%2").arg(folder_.path(), QLatin1StringView(more)),
                QStringLiteral("SELECT 1 AS number"),
                {},
                {}};
    }

private:
    QTemporaryDir folder_{QStringLiteral("/tmp/ka-silent-XXXXXX")};
    int socket_;
};

TEST_F(SilentServer, NeedNotBeWaitedFor)
{
    QElapsedTimer timer;
    timer.start();
    int calls = 0;
    PostgresObjectList list(query(), survey::variables(), [&calls](std::size_t) { return ++calls < 5; });
    EXPECT_EQ(list.GetAt(0), nullptr);
    EXPECT_FALSE(list.error()) << "to be stopped is no mistake of the data";
    EXPECT_GE(calls, 5);
    EXPECT_LT(timer.elapsed(), 5000);
}

TEST_F(SilentServer, IsSaidAfterTheTimeOfTheConnection)
{
    const PostgresObjectList list(query(" connect_timeout=1"), survey::variables(), {});
    ASSERT_TRUE(list.error());
    EXPECT_EQ(list.error()->text.toStdString(), "the server does not answer");
}

} // namespace
