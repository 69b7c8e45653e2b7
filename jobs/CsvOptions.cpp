#include "CsvOptions.h"

#include "ColumnChoices.h"
#include "NearestName.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

constexpr int mostSkipped = 1'000'000; ///< lines before the header row

/// One ASCII character that no cell needs: no quote, line end, letter, digit or sign. @return 0 after failing the node
char readMark(const JsonNode &node, const QString &expected)
{
    const QString text = node.text();
    const bool isOne = text.size() == 1 && text[0].unicode() > 0 && text[0].unicode() < 128;
    if (!isOne || text[0].isLetterOrNumber() || QStringLiteral("\"\r\n+-").contains(text[0])) {
        node.fail(expected);
        return '\0';
    }
    return text[0].toLatin1();
}

/// Fails a key whose character has another meaning already.
void failWhereTaken(const JsonNode &node, const QString &other)
{
    node.fail(Xlate("the character is that of \"%1\": another one was expected").arg(other));
}

/// Fails where a character of numbers is the delimiter and the job does not say both: then one of them was forgotten. Numbers in
/// quotes may have it, as spreadsheets write them.
void checkDelimiter(const JsonNode &set, const CsvDialect &dialect)
{
    const JsonNode delimiter = set[QStringLiteral("delimiter")];
    const JsonNode decimal = set[QStringLiteral("decimal")];
    if (dialect.kind != DelimiterKind::Character || (delimiter.exists() && decimal.exists())) {
        return;
    }
    if (dialect.delimiter == dialect.numbers.decimal) {
        const bool isSaid = decimal.exists();
        failWhereTaken(isSaid ? decimal : delimiter, isSaid ? QStringLiteral("delimiter") : QStringLiteral("decimal"));
    }
    if (!delimiter.exists() && dialect.numbers.thousands == std::string_view(&dialect.delimiter, 1)) {
        failWhereTaken(set[QStringLiteral("thousands")], QStringLiteral("delimiter"));
    }
}

/// Fails where a row of data may begin with the character of comments.
void checkComment(const JsonNode &comment, const CsvDialect &dialect)
{
    if (!dialect.comment) {
        return;
    }
    const char mark = *dialect.comment;
    const bool isDelimiter =
        dialect.kind == DelimiterKind::Character ? mark == dialect.delimiter : mark == ' ' || mark == '\t';
    if (isDelimiter) {
        failWhereTaken(comment, QStringLiteral("delimiter"));
    } else if (mark == dialect.numbers.decimal) {
        failWhereTaken(comment, QStringLiteral("decimal"));
    }
}

/// Names of columns in their order, or an object that maps variables to columns.
void readColumns(const JsonNode &node, CsvDialect &dialect)
{
    if (!node.value().isArray()) {
        dialect.columns = readColumnChoices(node);
        return;
    }
    if (node.size() == 0) {
        node.fail(Xlate("the names of the columns in their order were expected"));
    }
    for (qsizetype i = 0; i < node.size(); ++i) {
        const JsonNode name = node[i];
        dialect.names.append(name.value().isNull() ? QString() : name.text());
        if (dialect.names.last() == u"-") {
            dialect.names.last().clear();
        }
    }
}

void readNumberStyle(const JsonNode &set, NumberStyle &style)
{
    if (const JsonNode decimal = set[QStringLiteral("decimal")]; decimal.exists()) {
        style.decimal = decimal.text() == u"," ? ',' : '.';
        if (style.decimal == '.' && decimal.text() != u".") {
            decimal.fail(Xlate("one of %1 was expected").arg(QStringLiteral("\".\", \",\"")));
        }
    }
    const JsonNode thousands = set[QStringLiteral("thousands")];
    if (!thousands.exists()) {
        return;
    }
    const QString text = thousands.text();
    const QString taken = QStringLiteral("0123456789+-\"\r\n") + QLatin1Char(style.decimal);
    if (text.toUcs4().size() != 1 || text[0].isLetter() || text[0].isNull() || taken.contains(text[0])) {
        thousands.fail(Xlate(
            "one character was expected, other than a digit, a letter, a sign, a quote, a line end or the decimal sign"));
    }
    style.thousands = text.toStdString();
}

} // namespace

void readDelimiter(const JsonNode &node, CsvDialect &dialect)
{
    if (!node.exists()) {
        return;
    }
    if (node.isText() && node.text() == u"whitespace") {
        dialect.kind = DelimiterKind::Whitespace;
    } else if (node.isText() && node.text() == u"auto") {
        dialect.kind = DelimiterKind::Automatic;
    } else {
        dialect.delimiter = readMark(
            node,
            Xlate(
                "one ASCII character was expected, other than a letter, a digit, a sign, a quote or a line end, or one of the words %1")
                .arg(QStringLiteral("whitespace, auto")));
    }
}

CsvDialect readCsvDialect(const JsonNode &set)
{
    CsvDialect dialect;
    readDelimiter(set[QStringLiteral("delimiter")], dialect);
    dialect.isHeaderSaid = set[QStringLiteral("header")].exists();
    dialect.hasHeader = set[QStringLiteral("header")].boolean(true);
    readColumns(set[QStringLiteral("columns")], dialect);
    if (const JsonNode order = set[QStringLiteral("order")]; order.exists()) {
        dialect.order = order.text();
        if (!namesOfOrder(dialect.order)) {
            order.fail(Xlate("an order of columns such as PNEZD was expected: each of the letters P, N, E, Z and D at "
                             "most once, and - for a column that is skipped"));
        } else if (!dialect.names.isEmpty()) {
            order.fail(Xlate("the columns have names already: either an order or a list of columns was expected"));
        }
    }
    if (const JsonNode encoding = set[QStringLiteral("encoding")]; encoding.exists()) {
        if (const auto known = textEncodingFromKey(encoding.text())) {
            dialect.encoding = *known;
        } else {
            encoding.fail(oneOfExpected(encoding.text(), textEncodingKeys()));
        }
    }
    readNumberStyle(set, dialect.numbers);
    dialect.skip = set[QStringLiteral("skip")].whole(0, 0, mostSkipped);
    if (const JsonNode comment = set[QStringLiteral("comment")]; comment.exists()) {
        dialect.comment = readMark(
            comment,
            Xlate("one ASCII character was expected, other than a letter, a digit, a sign, a quote or a line end"));
    }
    dialect.passesBlankLines = set[QStringLiteral("skipBlankLines")].boolean(false);
    checkDelimiter(set, dialect);
    checkComment(set[QStringLiteral("comment")], dialect);
    return dialect;
}

QStringList csvDialectKeys()
{
    QStringList keys;
    for (const char *key : {"delimiter", "header", "columns", "order", "encoding", "decimal", "thousands", "skip",
                            "comment", "skipBlankLines"})
    {
        keys.append(QLatin1StringView(key));
    }
    return keys;
}

} // namespace kareport
