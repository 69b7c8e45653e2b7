#include "PostgresObjectList.h"
#include "PostgresPreview.h"
#include "SurveyRows.h"

#include <QTemporaryDir>

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <chrono>
#include <cstring>
#include <future>
#include <string>

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

    /// Takes a connection, and answers its first questions as a server does until a query is prepared. From then on it reads
    /// nothing. @return the connection
    int serveUntilQuery() const
    {
        const int client = ::accept(socket_, nullptr, nullptr);
        readMessage(client);
        const std::string ready("Z\0\0\0\5I", 6);
        send(client, std::string("R\0\0\0\x8\0\0\0\0", 9) + ready);
        for (char kind = readByte(client); kind == 'Q'; kind = readByte(client)) {
            readMessage(client);
            send(client, std::string("C\0\0\0\x8SET\0", 9) + ready);
        }
        return client;
    }

private:
    static void send(int client, const std::string &bytes)
    {
        EXPECT_EQ(::write(client, bytes.data(), bytes.size()), static_cast<ssize_t>(bytes.size()));
    }
    static char readByte(int client)
    {
        char byte = '\0';
        return ::read(client, &byte, 1) == 1 ? byte : '\0';
    }
    /// A message without its kind: four bytes of its length with themselves, and what follows. It is thrown away.
    static void readMessage(int client)
    {
        std::size_t length = 0;
        for (int i = 0; i < 4; ++i) {
            length = length << 8U | static_cast<unsigned char>(readByte(client));
        }
        for (std::size_t i = 4; i < length; ++i) {
            readByte(client);
        }
    }

    QTemporaryDir folder_{QStringLiteral("/tmp/ka-silent-XXXXXX")};
    int socket_;
};

TEST_F(SilentServer, NeedNotBeWaitedFor)
{
    // Without an answer and without a time limit of the connection only the stop ends the wait.
    int calls = 0;
    PostgresObjectList list(query(), survey::variables(), [&calls](std::size_t) { return ++calls < 5; });
    EXPECT_EQ(list.GetAt(0), nullptr);
    EXPECT_FALSE(list.error()) << "to be stopped is not a mistake of the data";
    EXPECT_GE(calls, 5);
}

TEST_F(SilentServer, IsSaidAfterTheTimeOfTheConnection)
{
    const PostgresObjectList list(query(" connect_timeout=1"), survey::variables(), {});
    ASSERT_TRUE(list.error());
    EXPECT_EQ(list.error()->text.toStdString(), "the server does not answer");
}

TEST_F(SilentServer, IsNotWaitedForLongWhenTablesAreListed)
{
    const auto begun = std::chrono::steady_clock::now();
    const auto late = kareport::postgresTables(query().connection, [] { return false; });
    const auto took = std::chrono::steady_clock::now() - begun;
    ASSERT_NE(kareport::errorOf(late), nullptr);
    EXPECT_EQ(kareport::errorOf(late)->text.toStdString(), "the server does not answer");
    EXPECT_LT(took, std::chrono::seconds(10));

    int calls = 0;
    const auto stopped = kareport::postgresTables(query().connection, [&calls] { return ++calls >= 3; });
    EXPECT_NE(kareport::errorOf(stopped), nullptr);
    EXPECT_LE(calls, 6) << "it ends at once";
}

TEST_F(SilentServer, NeedNotTakeAQuery)
{
    std::future<int> served = std::async(std::launch::async, [this] { return serveUntilQuery(); });
    kareport::PostgresQuery longQuery = query();
    longQuery.query +=
        QStringLiteral(" /*") + QString(32 << 20, u'x') + QStringLiteral("*/"); // more than a socket takes
    // The stop comes when the query is on its way: the server has seen its beginning, and takes no more.
    constexpr int mostCalls = 5;
    int calls = 0;
    {
        PostgresObjectList list(longQuery, survey::variables(), [&served, &calls](std::size_t) {
            const bool isSent = served.wait_for(std::chrono::seconds(0)) == std::future_status::ready;
            calls += isSent ? 1 : 0;
            return calls < mostCalls;
        });
        EXPECT_EQ(list.GetAt(0), nullptr);
        EXPECT_FALSE(list.error()) << list.error()->message().toStdString();
    }
    EXPECT_GE(calls, mostCalls) << "it waits, and asks meanwhile";
    EXPECT_LE(calls, mostCalls + 2) << "it is not asked much longer";
    ::close(served.get());
}

} // namespace
