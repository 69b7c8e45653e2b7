#include "ConnectionWords.h"

#include "LibPq.h"

#include <QRegularExpression>
#include <QStringList>

#include <algorithm>
#include <memory>

namespace kareport
{

namespace
{

/// A value with quotes where they are needed.
QString quoted(const QString &value)
{
    const bool isPlain = std::none_of(value.begin(), value.end(),
                                      [](QChar one) { return one.isSpace() || one == u'\'' || one == u'\\'; });
    if (isPlain && !value.isEmpty()) {
        return value;
    }
    QString text = value;
    text.replace(u'\\', QStringLiteral("\\\\")).replace(u'\'', QStringLiteral("\\'"));
    return u'\'' + text + u'\'';
}

} // namespace

bool isLikeConnection(const QString &text)
{
    static const QRegularExpression begin(QStringLiteral("^\\s*(?:[a-z_]+\\s*=|postgres(?:ql)?://)"));
    return begin.match(text).hasMatch();
}

std::optional<ConnectionWords> connectionWords(const QString &connection)
{
    const LibPq &pq = libPq();
    if (!pq.isLoaded) {
        return std::nullopt;
    }
    char *message = nullptr;
    const std::unique_ptr<PQconninfoOption, decltype(pq.conninfoFree)> options(
        pq.conninfoParse(connection.toUtf8().constData(), &message), pq.conninfoFree);
    pq.freemem(message);
    if (!options) {
        return std::nullopt;
    }
    ConnectionWords words;
    for (const PQconninfoOption *option = options.get(); option->keyword != nullptr; ++option) {
        if (option->val != nullptr) {
            words.insert(QString::fromUtf8(option->keyword), QString::fromUtf8(option->val));
        }
    }
    return words;
}

QString connectionOf(const ConnectionWords &words)
{
    QStringList order;
    for (const char *keyword : {"service", "host", "port", "dbname", "user"}) {
        order.append(QLatin1StringView(keyword));
    }
    for (const QString &keyword : words.keys()) {
        if (!order.contains(keyword)) {
            order.append(keyword);
        }
    }
    QStringList parts;
    for (const QString &keyword : order) {
        if (const QString value = words.value(keyword); !value.isEmpty()) {
            parts.append(keyword + u'=' + quoted(value));
        }
    }
    return parts.join(u' ');
}

} // namespace kareport
