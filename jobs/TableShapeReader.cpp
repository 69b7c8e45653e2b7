#include "TableShapeReader.h"

#include "NearestName.h"
#include "ShapeKeys.h"
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

template <typename Kind, std::size_t count>
QStringList namesOf(const ShapeKey<Kind> (&keys)[count])
{
    QStringList names;
    for (const ShapeKey<Kind> &key : keys) {
        names.append(QLatin1StringView(key.key));
    }
    return names;
}

/// The one of some keys that an object has. More or none of them is an error; what comes back then is not used.
template <typename Kind, std::size_t count>
ShapeKey<Kind> readKind(const JsonNode &node, const ShapeKey<Kind> (&keys)[count])
{
    const QString expected = namesOf(keys).join(QStringLiteral(", "));
    const ShapeKey<Kind> *found = nullptr;
    for (const ShapeKey<Kind> &key : keys) {
        const JsonNode one = node[QLatin1StringView(key.key)];
        if (!one.exists()) {
            continue;
        }
        if (found != nullptr) {
            one.fail(Xlate("one of %1 was expected, not two").arg(expected));
        }
        found = &key;
    }
    if (found == nullptr) {
        node.fail(Xlate("one of %1 was expected").arg(expected));
    }
    return found != nullptr ? *found : keys[0];
}

TableShape::Condition readCondition(const JsonNode &node, const QStringList &others)
{
    using Kind = RowCondition::Kind;
    node.allowOnly(others + texts({"of", "beside"}) + namesOf(conditionKeys));
    TableShape::Condition condition;
    condition.of = readVariable(node[QStringLiteral("of")]);
    const auto [key, kind] = readKind(node, conditionKeys);
    condition.kind = kind;
    const JsonNode value = node[QLatin1StringView(key)];
    const bool isOfValues = kind == Kind::Is || kind == Kind::IsNot;
    const bool isList = isOfValues && value.value().isArray();
    for (qsizetype i = 0; i < (isList ? value.size() : 1); ++i) {
        const JsonNode one = isList ? value[i] : value;
        condition.values.push_back({one.value(), one.path()});
    }
    if (kind == Kind::Exists && !value.boolean(true)) {
        condition.kind = Kind::Missing;
    }
    if (const JsonNode beside = node[QStringLiteral("beside")]; beside.exists()) {
        condition.beside = readName(beside);
        if (isOfValues || kind == Kind::Exists) {
            beside.fail(Xlate("\"beside\" was expected only with above, below or outside"));
        }
    }
    return condition;
}

TableShape::Formula readFormula(const JsonNode &node)
{
    using Kind = RowFormula::Kind;
    node.allowOnly(texts({"variable"}) + namesOf(formulaKeys));
    TableShape::Formula formula;
    formula.variable = readVariable(node[QStringLiteral("variable")]);
    const auto [key, kind] = readKind(node, formulaKeys);
    formula.kind = kind;
    formula.path = node.path();
    const JsonNode operands = node[QLatin1StringView(key)];
    if (!operands.expectArray()) {
        return formula;
    }
    formula.operands = readNames(operands);
    const std::size_t count = formula.operands.size();
    if ((kind == Kind::Difference || kind == Kind::Product) && count != 2) {
        operands.fail(Xlate("two variables were expected"));
    } else if (kind == Kind::Sum && count < 2) {
        operands.fail(Xlate("two variables or more were expected"));
    } else if (kind == Kind::Distance && count != 4 && count != 6) {
        operands.fail(Xlate("the northing and easting, or the northing, easting and elevation, of two points were "
                            "expected"));
    } else if (kind == Kind::Bearing && count != 4) {
        operands.fail(Xlate("the northing and easting of two points were expected"));
    }
    return formula;
}

TableShape::Running readRunning(const JsonNode &node)
{
    node.allowOnly(texts({"variable", "per"}) + namesOf(runningKeys));
    TableShape::Running running;
    running.variable = readVariable(node[QStringLiteral("variable")]);
    const auto [key, kind] = readKind(node, runningKeys);
    running.kind = kind;
    running.path = node.path();
    const JsonNode value = node[QLatin1StringView(key)];
    if (kind == RunningValue::Kind::RowNumber) {
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
    const QStringList expected = texts({"label"}) + namesOf(totalKeys);
    std::vector<TableShape::TotalLine> lines;
    forEach(list, [&](const JsonNode &node) {
        node.allowOnly(expected);
        TableShape::TotalLine line;
        line.label = readName(node[QStringLiteral("label")]);
        for (const ShapeKey<TotalKind> &key : totalKeys) {
            const JsonNode named = node[QLatin1StringView(key.key)];
            if (!named.exists()) {
                continue;
            }
            for (const TableShape::Name &name : readNames(named)) {
                line.totals.push_back({key.kind, name});
            }
        }
        if (line.totals.empty() && line.label.text.isEmpty()) {
            node.fail(Xlate("one of %1 was expected").arg(expected.join(QStringLiteral(", "))));
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
            one.fail(Xlate("\"%1\" needs a heading: the key \"heading\" was expected").arg(QLatin1StringView(key)));
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
        shape.rounding = rounding.path();
        shape.addsPrinted = rounding.text() == u"printed";
        if (!shape.addsPrinted && rounding.text() != u"exact") {
            rounding.fail(oneOfExpected(rounding.text(), texts({"exact", "printed"})));
        }
    }
    return shape;
}

} // namespace kareport
