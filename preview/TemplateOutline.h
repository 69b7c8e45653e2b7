#pragma once

#include <QString>

#include <optional>
#include <vector>

namespace kareport
{

/// A piece of a text.
struct TextRange
{
    qsizetype begin = -1; ///< its first character, from 0; -1 for none
    qsizetype end = -1;   ///< after its last character

    bool exists() const { return begin >= 0; }
    qsizetype size() const { return end - begin; }
    /// Whether a cursor there is in the range or at its edge.
    bool touches(qsizetype position) const { return exists() && position >= begin && position <= end; }
};

/// A value of a template, where the text has it.
struct OutlineValue
{
    QString text;
    TextRange range; ///< of the value alone; none where there is no such element
};

struct OutlineField
{
    TextRange element; ///< with its tags
    OutlineValue variable;
    OutlineValue label;
    OutlineValue format;
    OutlineValue align;
};

/// A table or a block.
struct OutlineOutput
{
    bool isTable = false;
    TextRange element;
    OutlineValue name;
    OutlineValue use;
    TextRange outputList; ///< between its tags
    std::vector<OutlineField> fields;
    std::vector<OutlineValue> sortKeys;
};

struct OutlineVariable
{
    TextRange element;
    OutlineValue id;
    OutlineValue name;
    OutlineValue type;
};

struct OutlineDictionary
{
    TextRange element;
    OutlineValue name;
    TextRange variableList; ///< between its tags
    std::vector<OutlineVariable> variables;
};

struct OutlineTemplate
{
    TextRange element;
    OutlineValue name;
    OutlineValue title;
    TextRange tables;                   ///< between its tags
    TextRange blocks;                   ///< the same
    TextRange dictionaries;             ///< the same
    std::vector<OutlineOutput> outputs; ///< the tables and then the blocks
    std::vector<OutlineDictionary> dictionaryList;

    /// The first table or block of a name, without regard to case, which is the one that is written; null where there is none.
    const OutlineOutput *output(bool isTable, QStringView name) const;
};

/// What is where in the text of a template file, as the file is read. What is not read is not in it.
struct TemplateOutline
{
    std::vector<OutlineTemplate> templates;

    /// The template that a position is in; without one there, the one before it, or else the first; null without any.
    const OutlineTemplate *templateAt(qsizetype position) const;
    /// The template of a name, without regard to case: of several the last one, as for loading.
    const OutlineTemplate *templateOf(QStringView name) const;
    /// The field that a position is in; null where it is in none.
    const OutlineField *fieldAt(qsizetype position) const;
};

TemplateOutline outlineOf(const QString &text);

} // namespace kareport
