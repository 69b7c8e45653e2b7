#pragma once

#include <QMap>
#include <QString>

#include <optional>

namespace kareport
{

/// What a connection to a PostgreSQL server says, by its keywords, such as "host" and "dbname".
using ConnectionWords = QMap<QString, QString>;

/// Whether a text is meant as a connection: it begins with a word and "=", or is an address of PostgreSQL.
bool isLikeConnection(const QString &text);

/// The words of a connection. @return nothing where it is none, and where libpq is not installed
std::optional<ConnectionWords> connectionWords(const QString &connection);
/// The connection that has these words, with quotes where they are needed. Empty values are left out.
QString connectionOf(const ConnectionWords &words);

} // namespace kareport
