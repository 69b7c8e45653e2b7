#include "ResultOptionsReader.h"

#include "JobFileName.h"
#include "LanguageTag.h"
#include "NearestName.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

constexpr int mostRowsPerPage = 1'000'000;

QString readName(const JsonNode &node)
{
    if (node.exists() && node.text().isEmpty()) {
        node.fail(Xlate("a text that is not empty was expected"));
    }
    return node.text();
}

/// Which values an output of a kind has: those that are named, the first of them where nothing is said.
ResultValues readValues(const JsonNode &node, OutputKind kind)
{
    struct NamedValues
    {
        QStringView name;
        ResultValues values;
    };
    const bool isSheet = kind == OutputKind::Xlsx;
    const NamedValues printed = {u"printed", ResultValues::Printed};
    const NamedValues first = isSheet ? printed : NamedValues{u"data", ResultValues::Data};
    const NamedValues second = isSheet ? NamedValues{u"exact", ResultValues::Exact} : printed;
    if (!node.exists()) {
        return first.values;
    }
    const QString name = node.text();
    if (name != first.name && name != second.name) {
        QStringList names;
        names.append(first.name.toString());
        names.append(second.name.toString());
        node.fail(oneOfExpected(name, names));
    }
    return name == second.name ? second.values : first.values;
}

/// Whether the second one of two words is said; the first one may be said as well.
bool readIsSecond(const JsonNode &node, const QString &first, const QString &second)
{
    const QString name = node.text();
    if (node.exists() && name != first && name != second) {
        QStringList names;
        names.append(first);
        names.append(second);
        node.fail(oneOfExpected(name, names));
    }
    return name == second;
}

/// A tag of a language such as "de" or "pt-BR".
QString readLanguage(const JsonNode &node)
{
    const QString tag = node.text();
    if (node.exists() && !isLanguageTag(tag)) {
        node.fail(Xlate("the tag of a language such as de or pt-BR was expected"));
    }
    return tag;
}

/// One ASCII character that no number and no quoting needs.
char readDelimiter(const JsonNode &node)
{
    if (!node.exists()) {
        return ',';
    }
    const QString text = node.text();
    const bool isOne = text.size() == 1 && text[0].unicode() > 0 && text[0].unicode() < 128;
    if (!isOne || text[0].isLetterOrNumber() || QStringLiteral("\"\r\n+-. ").contains(text[0])) {
        node.fail(Xlate(
            "one ASCII character was expected, other than a letter, a digit, a sign, a point, a quote, a blank or a line end"));
        return ',';
    }
    return text[0].toLatin1();
}

} // namespace

QStringList outputKeys(OutputKind kind)
{
    QString keys = QStringLiteral("file as");
    if (isOfOneTable(kind)) {
        keys += QStringLiteral(" table block data values schema");
    }
    switch (kind) {
    case OutputKind::Csv: keys += QStringLiteral(" delimiter"); break;
    case OutputKind::Html: keys += QStringLiteral(" title language rowsPerPage"); break;
    case OutputKind::Xlsx: keys += QStringLiteral(" values sheets bearingValues totals"); break;
    default: break;
    }
    return keys.split(u' ');
}

QStringList allOutputKeys()
{
    QStringList keys;
    for (const OutputKind kind : {OutputKind::Csv, OutputKind::Html, OutputKind::Xlsx}) {
        for (const QString &key : outputKeys(kind)) {
            if (!keys.contains(key)) {
                keys.append(key);
            }
        }
    }
    return keys;
}

ResultOptions readResultOptions(const JsonNode &node, OutputKind kind, const QDir &folder)
{
    ResultOptions options;
    options.table = readName(node[QStringLiteral("table")]);
    options.block = readName(node[QStringLiteral("block")]);
    options.data = readName(node[QStringLiteral("data")]);
    options.values = readValues(node[QStringLiteral("values")], kind);
    options.delimiter = readDelimiter(node[QStringLiteral("delimiter")]);
    options.isOneSheet = readIsSecond(node[QStringLiteral("sheets")], QStringLiteral("tables"), QStringLiteral("one"));
    options.formulas =
        readIsSecond(node[QStringLiteral("totals")], QStringLiteral("values"), QStringLiteral("formulas"));
    options.bearingValues = node[QStringLiteral("bearingValues")].boolean(false);
    options.title = readName(node[QStringLiteral("title")]);
    options.language = readLanguage(node[QStringLiteral("language")]);
    options.rowsPerPage = node[QStringLiteral("rowsPerPage")].whole(options.rowsPerPage, 1, mostRowsPerPage);
    if (!options.table.isEmpty() && !options.block.isEmpty()) {
        node[QStringLiteral("block")].fail(Xlate("\"table\" or \"block\" was expected, not both"));
    }
    if (const JsonNode schema = node[QStringLiteral("schema")]; schema.exists()) {
        const QString name = readFileName(schema);
        if (name == u"-" || name.isEmpty()) {
            schema.fail(Xlate("the name of a file was expected"));
        }
        options.schema = folder.filePath(name);
    }
    return options;
}

} // namespace kareport
