#include "TableShapeReader.h"

#include "NearestName.h"
#include "Xlate.h"

#include <algorithm>
#include <functional>

namespace kareport
{

namespace
{

constexpr int mostKept = 1000; ///< rows with a heading
constexpr int mostBlank = 1000;

QStringList texts(std::initializer_list<const char *> keys)
{
    QStringList list;
    for (const char *key : keys) {
        list.append(QLatin1StringView(key));
    }
    return list;
}

TableShape::Name readName(const JsonNode &node)
{
    return {node.text(), node.path()};
}

/// A name of a variable that must be there.
TableShape::Name readVariable(const JsonNode &node)
{
    if (!node.exists()) {
        node.fail(Xlate("the name of a variable was expected"));
    }
    return readName(node);
}

/// One name, or a list of them.
std::vector<TableShape::Name> readNames(const JsonNode &node)
{
    std::vector<TableShape::Name> names;
    if (!node.value().isArray()) {
        names.push_back(readVariable(node));
        return names;
    }
    if (node.size() == 0) {
        node.fail(Xlate("the name of a variable was expected"));
    }
    for (qsizetype i = 0; i < node.size(); ++i) {
        names.push_back(readVariable(node[i]));
    }
    return names;
}

/// The elements of a list; nothing for a key that is not there.
void forEach(const JsonNode &list, const std::function<void(const JsonNode &)> &read)
{
    if (!list.exists() || !list.expectArray()) {
        return;
    }
    for (qsizetype i = 0; i < list.size(); ++i) {
        if (list[i].expectObject()) {
            read(list[i]);
        }
    }
}

/// The one of some keys that an object has. More or none of them is an error.
QString readKind(const JsonNode &node, const QStringList &kinds)
{
    QString found;
    for (const QString &kind : kinds) {
        if (!node[kind].exists()) {
            continue;
        }
        if (!found.isEmpty()) {
            node[kind].fail(Xlate("one of %1 was expected, not two").arg(kinds.join(QStringLiteral(", "))));
        }
        found = kind;
    }
    if (found.isEmpty()) {
        node.fail(Xlate("one of %1 was expected").arg(kinds.join(QStringLiteral(", "))));
    }
    return found;
}

TableShape::Condition readCondition(const JsonNode &node, const QStringList &others)
{
    const QStringList kinds = texts({"is", "isNot", "above", "below", "outside", "exists"});
    node.allowOnly(others + texts({"of", "beside"}) + kinds);
    TableShape::Condition condition;
    condition.of = readVariable(node[QStringLiteral("of")]);
    condition.kind = readKind(node, kinds);
    const JsonNode value = node[condition.kind];
    const bool isList = condition.kind.startsWith(u"is") && value.value().isArray();
    for (qsizetype i = 0; i < (isList ? value.size() : 1); ++i) {
        const JsonNode one = isList ? value[i] : value;
        condition.values.push_back({one.value(), one.path()});
    }
    if (condition.kind == u"exists") {
        value.boolean(true);
    }
    if (const JsonNode beside = node[QStringLiteral("beside")]; beside.exists()) {
        condition.beside = readName(beside);
        if (condition.kind.startsWith(u"is") || condition.kind == u"exists") {
            beside.fail(Xlate("\"beside\" was expected only with above, below or outside"));
        }
    }
    return condition;
}

TableShape::Formula readFormula(const JsonNode &node)
{
    const QStringList kinds = texts({"sum", "difference", "product", "distance", "bearing"});
    node.allowOnly(texts({"variable"}) + kinds);
    TableShape::Formula formula;
    formula.variable = readVariable(node[QStringLiteral("variable")]);
    formula.kind = readKind(node, kinds);
    formula.path = node.path();
    const JsonNode operands = node[formula.kind];
    if (!operands.expectArray()) {
        return formula;
    }
    formula.operands = readNames(operands);
    const std::size_t count = formula.operands.size();
    if ((formula.kind == u"difference" || formula.kind == u"product") && count != 2) {
        operands.fail(Xlate("two variables were expected"));
    } else if (formula.kind == u"sum" && count < 2) {
        operands.fail(Xlate("two variables or more were expected"));
    } else if (formula.kind == u"distance" && count != 4 && count != 6) {
        operands.fail(Xlate("the northing and easting, or the northing, easting and elevation, of two points were "
                            "expected"));
    } else if (formula.kind == u"bearing" && count != 4) {
        operands.fail(Xlate("the northing and easting of two points were expected"));
    }
    return formula;
}

TableShape::Running readRunning(const JsonNode &node)
{
    const QStringList kinds = texts({"sum", "difference", "rowNumber"});
    node.allowOnly(texts({"variable", "per"}) + kinds);
    TableShape::Running running;
    running.variable = readVariable(node[QStringLiteral("variable")]);
    running.kind = readKind(node, kinds);
    running.path = node.path();
    const JsonNode value = node[running.kind];
    if (running.kind == u"rowNumber") {
        if (!value.boolean(true)) {
            value.fail(Xlate("true was expected"));
        }
    } else {
        running.of = readVariable(value);
    }
    if (const JsonNode per = node[QStringLiteral("per")]; per.exists()) {
        running.perGroup = per.text() == u"group";
        if (!running.perGroup && per.text() != u"table") {
            per.fail(oneOfExpected(per.text(), texts({"table", "group"})));
        }
    }
    return running;
}

TableShape::Flag readFlag(const JsonNode &node)
{
    TableShape::Flag flag;
    flag.condition = readCondition(node, texts({"variable", "text"}));
    flag.variable = readVariable(node[QStringLiteral("variable")]);
    flag.path = node.path();
    if (const JsonNode text = node[QStringLiteral("text")]; text.exists()) {
        flag.text = readName(text);
    }
    return flag;
}

std::vector<TableShape::TotalLine> readTotals(const JsonNode &list)
{
    const QStringList kinds = texts({"sum", "mean", "min", "max", "count"});
    std::vector<TableShape::TotalLine> lines;
    forEach(list, [&](const JsonNode &node) {
        node.allowOnly(texts({"label"}) + kinds);
        TableShape::TotalLine line;
        line.label = readName(node[QStringLiteral("label")]);
        for (const QString &kind : kinds) {
            if (!node[kind].exists()) {
                continue;
            }
            for (const TableShape::Name &name : readNames(node[kind])) {
                line.totals.push_back({kind, name});
            }
        }
        if (line.totals.empty() && line.label.text.isEmpty()) {
            node.fail(Xlate("one of %1 was expected").arg((texts({"label"}) + kinds).join(QStringLiteral(", "))));
        }
        lines.push_back(std::move(line));
    });
    return lines;
}

TableShape::Group readGroup(const JsonNode &node)
{
    node.allowOnly({"by", "heading", "totals", "before", "keep", "newPage"});
    TableShape::Group group;
    group.by = readNames(node[QStringLiteral("by")]);
    if (const JsonNode heading = node[QStringLiteral("heading")]; heading.exists()) {
        group.heading = readName(heading);
    }
    for (const char *key : {"before", "keep", "newPage"}) {
        if (const JsonNode one = node[QLatin1StringView(key)]; one.exists() && !group.heading) {
            one.fail(Xlate("\"%1\" goes with a heading: the key \"heading\" was expected").arg(QLatin1StringView(key)));
        }
    }
    group.totals = readTotals(node[QStringLiteral("totals")]);
    group.before = node[QStringLiteral("before")].whole(0, 0, mostBlank);
    group.keep = node[QStringLiteral("keep")].whole(1, 1, mostKept);
    group.newPage = node[QStringLiteral("newPage")].boolean(false);
    return group;
}

} // namespace

QStringList tableShapeKeys()
{
    return texts({"sort", "where", "compute", "running", "flags", "groups", "totals", "pageTotals", "rounding"});
}

TableShape readTableShape(const JsonNode &step)
{
    TableShape shape;
    if (const JsonNode sort = step[QStringLiteral("sort")]; sort.exists()) {
        shape.sort = readNames(sort);
    }
    forEach(step[QStringLiteral("where")],
            [&](const JsonNode &node) { shape.where.push_back(readCondition(node, {})); });
    forEach(step[QStringLiteral("compute")], [&](const JsonNode &node) { shape.compute.push_back(readFormula(node)); });
    forEach(step[QStringLiteral("running")], [&](const JsonNode &node) { shape.running.push_back(readRunning(node)); });
    forEach(step[QStringLiteral("flags")], [&](const JsonNode &node) { shape.flags.push_back(readFlag(node)); });
    forEach(step[QStringLiteral("groups")], [&](const JsonNode &node) { shape.groups.push_back(readGroup(node)); });
    shape.totals = readTotals(step[QStringLiteral("totals")]);
    shape.pageTotals = readTotals(step[QStringLiteral("pageTotals")]);
    if (const JsonNode rounding = step[QStringLiteral("rounding")]; rounding.exists()) {
        shape.addsPrinted = rounding.text() == u"printed";
        if (!shape.addsPrinted && rounding.text() != u"exact") {
            rounding.fail(oneOfExpected(rounding.text(), texts({"exact", "printed"})));
        }
    }
    return shape;
}

} // namespace kareport
