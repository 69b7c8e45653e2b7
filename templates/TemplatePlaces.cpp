#include "TemplatePlaces.h"

#include "TemplateElements.h"
#include "TextFolding.h"
#include "TextPlaces.h"

#include <QSet>

namespace kareport
{

namespace
{

/// No name has a line feed: values lose theirs.
QString keyOf(TemplatePart part, QStringView record)
{
    return QString::number(static_cast<int>(part)) + u'\n' + foldedKey(record) + u'\n';
}

/// Finds the places of the variables that records name.
class Places
{
public:
    Places(const QString &text, QHash<QString, TextPlace> &places) : places_(places), of_(text) {}

    /// Adds the names of a record, unless there was one of its name before.
    template <typename Elements, typename NameOf>
    void add(TemplatePart part, const ScanElement &record, const Elements &elements, const NameOf &nameOf)
    {
        const QString front = keyOf(part, record.value.view());
        if (records_.contains(front)) {
            return;
        }
        records_.insert(front);
        for (const auto &element : elements) {
            const ScanElement &name = nameOf(element);
            const QString key = front + foldedKey(name.value.view());
            if (name.exists() && !places_.contains(key)) {
                places_.insert(key, of_.of(name.source));
            }
        }
    }

private:
    QHash<QString, TextPlace> &places_;
    TextPlaces of_;
    QSet<QString> records_;
};

} // namespace

VariablePlaces::VariablePlaces(const TemplateFile &file, const QString &templateName)
{
    const ScanText text = scanTextOf(file);
    const auto chosen = findTemplate(text, templateName);
    if (!chosen) {
        return;
    }
    const ScanText &body = chosen->body.value;
    Places places(file.text(), places_);
    const auto nameOfField = [](const FieldElement &field) -> const ScanElement & { return field.variableName; };
    for (const OutputElement &table : readTableElements(body)) {
        places.add(TemplatePart::Table, table.name, table.fields, nameOfField);
    }
    for (const OutputElement &block : readBlockElements(body)) {
        places.add(TemplatePart::Block, block.name, block.fields, nameOfField);
    }
    for (const SortElement &sort : readSortElements(body)) {
        places.add(TemplatePart::SortKey, sort.name, sort.variableNames,
                   [](const ScanElement &name) -> const ScanElement & { return name; });
    }
}

std::optional<TextPlace> VariablePlaces::of(TemplatePart part, const QString &record, const QString &variable) const
{
    const auto found = places_.constFind(keyOf(part, record) + foldedKey(variable));
    return found != places_.constEnd() ? std::optional(*found) : std::nullopt;
}

} // namespace kareport
