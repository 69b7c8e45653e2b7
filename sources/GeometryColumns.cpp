#include "GeometryColumns.h"

#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

double coordinateOf(const PointGeometry &point, GeometryPart part)
{
    return part == GeometryPart::X ? point.x : part == GeometryPart::Y ? point.y : point.z;
}

QString misfit(const QString &value, const BoundField &field)
{
    return Xlate("the value \"%1\" of the column \"%2\" does not fit: %3 was expected")
        .arg(value, field.name, field.parser.expected());
}

} // namespace

void offerGeometryParts(std::vector<SourceColumn> &columns)
{
    for (const auto &part : geometryParts) {
        columns.push_back({QString::fromUtf16(part.second), std::nullopt, false, true});
    }
}

std::optional<ColumnFault> bindDatabaseColumns(ColumnBinding &binding, std::vector<SourceColumn> &columns,
                                               const std::vector<ColumnChoice> &choices, const Variables &variables,
                                               std::size_t ownColumns, std::vector<FieldSource> &sources)
{
    if (auto fault = binding.bind(columns, choices, variables)) {
        return fault;
    }
    if (binding.fields().empty()) {
        return ColumnFault{std::nullopt, QString(),
                           Xlate("no column is a variable of the dictionary; the columns are: %1")
                               .arg(namesOf(columns).join(QStringLiteral(", ")))};
    }
    for (const BoundField &field : binding.fields()) {
        FieldSource &source = sources.emplace_back();
        if (field.column < ownColumns) {
            source.column = static_cast<int>(field.column);
        } else {
            source.part = geometryParts[field.column - ownColumns].first;
        }
    }
    return std::nullopt;
}

bool needsGeometry(const std::vector<FieldSource> &sources)
{
    return std::any_of(sources.begin(), sources.end(),
                       [](const FieldSource &source) { return source.part.has_value(); });
}

bool needsReferenceSystem(const std::vector<FieldSource> &sources)
{
    return std::any_of(sources.begin(), sources.end(), [](const FieldSource &source) {
        return source.part == GeometryPart::System || source.part == GeometryPart::SystemName;
    });
}

std::optional<QString> storeGeometryPart(const ColumnBinding &binding, const BoundField &field, GeometryPart part,
                                         const std::optional<PointGeometry> &point, const ReferenceSystem *system,
                                         UDataObject &object)
{
    if (part == GeometryPart::System || part == GeometryPart::SystemName) {
        const QString text = system == nullptr ? QString() : part == GeometryPart::System ? system->key : system->name;
        if (!text.isEmpty()) {
            return field.parser.storeValue(text.toStdString(), object) ? std::nullopt
                                                                       : std::optional(misfit(text, field));
        }
        binding.storeNone(field, object);
        return std::nullopt;
    }
    const double value = point ? coordinateOf(*point, part) : std::nan("");
    if (!std::isnan(value)) {
        return field.parser.storeNumber(value, object) ? std::nullopt
                                                       : std::optional(misfit(QString::number(value), field));
    }
    binding.storeNone(field, object);
    return std::nullopt;
}

} // namespace kareport
