#include "GroupTextReader.h"

#include "PlaceholderPiece.h"
#include "ShapeKeys.h"
#include "TextFolding.h"
#include "UnitFactors.h"

#include <algorithm>
#include <optional>

namespace kareport
{

namespace
{

using Piece = GroupText::Piece;

Piece textPiece(const QString &text)
{
    Piece piece;
    piece.text = text;
    return piece;
}

std::optional<QString> unitOf(QStringView name, const UJobSettings &settings)
{
    if (name == u"lengthUnit") {
        return nameOf(settings.lengthUnit).toString();
    }
    if (name == u"areaUnit") {
        return nameOf(settings.areaUnit).toString();
    }
    return name == u"angleUnit" ? std::optional(nameOf(settings.angleUnit).toString()) : std::nullopt;
}

QStringList expectedNames(const std::vector<FoundVariable> &by)
{
    QStringList names;
    for (const FoundVariable &variable : by) {
        names.append(inBraces(variable.name));
    }
    names.append(QStringLiteral("{count}"));
    for (const ShapeKey<TotalKind> &key : totalKeys) {
        names.append(QStringLiteral("{%1:...}").arg(QLatin1StringView(key.key)));
    }
    for (const char *name : {"{lengthUnit}", "{areaUnit}", "{angleUnit}"}) {
        names.append(QLatin1StringView(name));
    }
    return names;
}

/// The piece that a placeholder is replaced by; nothing for one that is not known.
std::optional<Piece> placeholderOf(const QString &name, const JsonPath &path, const std::vector<FoundVariable> &by,
                                   const TotalIndex &indexOf, VariableLookup &lookup)
{
    Piece piece;
    const auto variable =
        std::find_if(by.begin(), by.end(), [&](const FoundVariable &other) { return equalFolded(other.name, name); });
    if (variable != by.end()) {
        piece.kind = Piece::Kind::Value;
        piece.field = lookup.fieldOf(*variable);
        piece.field.Width = 0;
        piece.suffix = lookup.suffixOf(*variable);
        return piece;
    }
    if (name == u"count") {
        piece.kind = Piece::Kind::Rows;
        return piece;
    }
    if (const auto unit = unitOf(name, lookup.surroundings().settings)) {
        return textPiece(*unit);
    }
    const QString kind = name.section(u':', 0, 0);
    for (const ShapeKey<TotalKind> &known : totalKeys) {
        if (name.contains(u':') && kind == QLatin1StringView(known.key)) {
            piece.kind = Piece::Kind::Total;
            piece.total = indexOf(known.kind, {name.section(u':', 1), path});
            return piece;
        }
    }
    return std::nullopt;
}

} // namespace

GroupText readGroupText(const TableShape::Name &text, const std::vector<FoundVariable> &by, const TotalIndex &indexOf,
                        VariableLookup &lookup)
{
    GroupText read;
    const QStringView all = text.text;
    for (qsizetype at = 0; at < all.size();) {
        const PlaceholderPiece next = placeholderPieceAt(all, at);
        at = next.end;
        if (next.kind == PlaceholderPiece::Kind::Text) {
            read.pieces.push_back(textPiece(next.text.toString()));
            continue;
        }
        if (next.kind == PlaceholderPiece::Kind::Unended) {
            lookup.fail(text.path, unendedPlaceholder(next.text));
            break;
        }
        const auto piece = placeholderOf(next.text.toString(), text.path, by, indexOf, lookup);
        if (!piece) {
            lookup.fail(text.path, unknownPlaceholder(next.text, expectedNames(by)));
            break;
        }
        read.pieces.push_back(*piece);
    }
    return read;
}

} // namespace kareport
