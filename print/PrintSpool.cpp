#include "PrintSpool.h"

#include <QLibrary>

namespace kareport
{

namespace
{

/// The functions of the print system's library, which Qt has loaded when there are printers. They answer for the thread
/// that calls them.
struct QueueLibrary
{
    using LastStatus = int (*)();
    using LastText = const char *(*)();
    using SetServer = void (*)(const char *);

    QueueLibrary()
    {
        QLibrary library(QStringLiteral("cups"), 2);
        if (library.load()) {
            lastStatus = reinterpret_cast<LastStatus>(library.resolve("cupsLastError"));
            lastText = reinterpret_cast<LastText>(library.resolve("cupsLastErrorString"));
            setServer = reinterpret_cast<SetServer>(library.resolve("cupsSetServer"));
        }
    }

    LastStatus lastStatus = nullptr;
    LastText lastText = nullptr;
    SetServer setServer = nullptr;
};

const QueueLibrary &queueLibrary()
{
    static const QueueLibrary library;
    return library;
}

/// Statuses up to here say that the request was carried out.
constexpr int lastGoodStatus = 0x00FF;

} // namespace

QString PrintSpool::lastError()
{
    const QueueLibrary &queue = queueLibrary();
    if (queue.lastStatus == nullptr || queue.lastText == nullptr) {
        return QString();
    }
    const int status = queue.lastStatus();
    return status >= 0 && status <= lastGoodStatus ? QString() : QString::fromUtf8(queue.lastText());
}

PrintSpool::Closed::Closed()
{
    if (queueLibrary().setServer != nullptr) {
        queueLibrary().setServer("/nonexistent/print-queue");
    }
}

PrintSpool::Closed::~Closed()
{
    if (queueLibrary().setServer != nullptr) {
        queueLibrary().setServer(nullptr);
    }
}

} // namespace kareport
