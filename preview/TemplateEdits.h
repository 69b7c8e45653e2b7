#pragma once

#include "TemplateOutline.h"

#include <QString>

#include <optional>

namespace kareport
{

/// A template's text after a command.
struct EditedTemplate
{
    QString text;
    TextRange selection; ///< what is typed over next
    QString problem;     ///< why nothing was changed, as a sentence; empty when it was
};

/// Inserts a field into the table or block at a position, after the field there: of the first variable that it does not show
/// yet, and written as the field before it.
EditedTemplate withField(const QString &text, qsizetype position);
/// Why no field can be inserted at a position, as a sentence; empty where one can.
QString whyNoField(const TemplateOutline &outline, qsizetype position);
/// Inserts a table, or a block, into the template at a position, with a field for each variable of the template's first dictionary.
/// What is missing for it is inserted as well: its list, a dictionary, and in a text without any a template.
EditedTemplate withOutput(const QString &text, qsizetype position, bool isTable);
/// Inserts a dictionary with a variable into the template at a position.
EditedTemplate withDictionary(const QString &text, qsizetype position);

/// A variable of a dictionary.
struct VariableUse
{
    QString dictionary;
    QString name;
};
/// The variable that is named at a position, in a dictionary, a field or a sort key.
std::optional<VariableUse> variableAt(const TemplateOutline &outline, qsizetype position);
/// Why none is named there, as a sentence; empty where one is.
QString whyNoVariable(const TemplateOutline &outline, qsizetype position);
/// Renames the variable that is named at a position: in its dictionary and wherever a table or block of the template uses it.
EditedTemplate withRenamedVariable(const QString &text, qsizetype position, const QString &name);

} // namespace kareport
