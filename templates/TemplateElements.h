#pragma once

#include "TagScanner.h"

#include <optional>
#include <vector>

namespace kareport
{

/// The elements of a template as the scanner finds them, before anything is made of their values.

struct FieldElement
{
    ScanElement element;
    ScanElement variableName;
    ScanElement label;
    ScanElement format;
    ScanElement align;
};

struct OutputElement ///< a table or a block
{
    ScanElement element;
    ScanElement name;
    ScanElement use;
    std::vector<FieldElement> fields;
};

struct SortElement
{
    ScanElement name;
    ScanElement use;
    std::vector<ScanElement> variableNames;
};

struct VariableElement
{
    ScanElement element;
    ScanElement id;
    ScanElement variableName;
    ScanElement type;
};

struct DictionaryElement
{
    ScanElement element;
    ScanElement name;
    std::vector<VariableElement> variables;
};

struct OptionElements
{
    ScanElement options;
    ScanElement separator;
    ScanElement pageBreaks;
};

struct TemplateElement
{
    ScanElement body; ///< with its name and title
    ScanElement name;
    ScanElement title;
};

/// The templates of a whole file, one after the other in file order, for code that needs only some of them.
class TemplateSequence
{
public:
    /// The text must live as long as the sequence.
    explicit TemplateSequence(const ScanText &file, ScanNotes *notes = nullptr);

    /// The next template; nothing after the last one.
    std::optional<TemplateElement> next();

private:
    NodeSequence elements_;
    ScanNotes *notes_;
};

/// The templates of a whole file, in file order.
std::vector<TemplateElement> readTemplateElements(const ScanText &file, ScanNotes *notes = nullptr);

/// The template of a name, without regard to case: of several the last one, as for loading. Nothing where there is none.
std::optional<TemplateElement> findTemplate(const ScanText &file, QStringView name);

// The parts of one template's body.
std::vector<OutputElement> readTableElements(const ScanText &body, ScanNotes *notes = nullptr);
std::vector<OutputElement> readBlockElements(const ScanText &body, ScanNotes *notes = nullptr);
std::vector<SortElement> readSortElements(const ScanText &body, ScanNotes *notes = nullptr);
std::vector<DictionaryElement> readDictionaryElements(const ScanText &body, ScanNotes *notes = nullptr);
OptionElements readOptionElements(const ScanText &body, ScanNotes *notes = nullptr);

} // namespace kareport
