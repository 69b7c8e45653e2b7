#include "OutputKind.h"

#include "FileKind.h"

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
    {OutputKind::RichText, u"rtf", u".rtf"},
    {OutputKind::Pdf, u"pdf", u".pdf"},
    {OutputKind::RichTextImage, u"rtf-image", {}}, // a ".rtf" file, which its name alone does not tell
    {OutputKind::Xlsx, u"xlsx", u".xlsx"},
    {OutputKind::Html, u"html", u".html"},
    {OutputKind::Csv, u"csv", u".csv"},
    {OutputKind::JsonLines, u"jsonl", u".jsonl"},
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
        if (!row.ending.isEmpty() && hasEnding(file, row.ending)) {
            // Both kinds of rich text have one ending.
            const bool isImage = row.kind == OutputKind::RichText && otherwise == OutputKind::RichTextImage;
            return isImage ? *otherwise : row.kind;
        }
    }
    return otherwise;
}

bool isMadeOfResults(OutputKind kind)
{
    return kind == OutputKind::Html || kind == OutputKind::Xlsx || isOfOneTable(kind);
}

bool isOfOneTable(OutputKind kind)
{
    return kind == OutputKind::Csv || kind == OutputKind::JsonLines || kind == OutputKind::Schema;
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
