#include "LabelPlaceholders.h"

#include "Placeholders.h"
#include "TemplateElements.h"
#include "TemplateFile.h"
#include "TextPlaces.h"

namespace kareport
{

namespace
{

/// The label whose placeholders are wrong, and what is wrong with them.
struct WrongLabel
{
    qsizetype source;
    QString text;
};

std::optional<WrongLabel> wrongLabelIn(const std::vector<OutputElement> &outputs)
{
    for (const OutputElement &output : outputs) {
        for (const FieldElement &field : output.fields) {
            if (auto wrong = Placeholders::wrongIn(field.label.value.view())) {
                return WrongLabel{field.label.source, *std::move(wrong)};
            }
        }
    }
    return std::nullopt;
}

} // namespace

std::optional<InputError> wrongLabelPlaceholder(const QString &path, const QString &name)
{
    const auto file = TemplateFile::read(path);
    if (!file) {
        return std::nullopt;
    }
    const ScanText text = scanTextOf(*file);
    const auto element = findTemplate(text, name);
    if (!element) {
        return std::nullopt;
    }
    auto wrong = wrongLabelIn(readTableElements(element->body.value));
    wrong = wrong ? wrong : wrongLabelIn(readBlockElements(element->body.value));
    return wrong ? std::optional(InputError{path, TextPlaces(file->text()).of(wrong->source), wrong->text})
                 : std::nullopt;
}

} // namespace kareport
