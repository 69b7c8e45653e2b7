#include "OutputKind.h"

namespace kareport
{

namespace
{

struct KindRow
{
    OutputKind kind;
    QStringView name;
    QStringView ending;
};

constexpr KindRow kinds[] = {
    {OutputKind::Report, u"rep", u".rep"},
    {OutputKind::Text, u"text", u".txt"},
};

} // namespace

std::optional<OutputKind> outputKindFromName(const QString &name)
{
    for (const KindRow &row : kinds) {
        if (name == row.name) {
            return row.kind;
        }
    }
    return std::nullopt;
}

std::optional<OutputKind> outputKindOf(const QString &file, std::optional<OutputKind> otherwise)
{
    if (file == u"-") {
        return otherwise.value_or(OutputKind::Text);
    }
    for (const KindRow &row : kinds) {
        if (file.endsWith(row.ending, Qt::CaseInsensitive)) {
            return row.kind;
        }
    }
    return otherwise;
}

QString outputKindNames()
{
    QString names;
    for (const KindRow &row : kinds) {
        names += names.isEmpty() ? QString() : QStringLiteral(", ");
        names += row.name;
    }
    return names;
}

} // namespace kareport
