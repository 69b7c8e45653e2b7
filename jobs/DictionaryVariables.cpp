#include "DictionaryVariables.h"

#include "ColumnNotes.h"

namespace kareport
{

Variables variablesOf(const UXmlReportTpl &tpl, const QString &dictionary, const DataUnits &units)
{
    Variables variables;
    variables.find = [&tpl, units, dictionary](const QString &variable) -> std::optional<ValueParser> {
        qint32 id = 0;
        qint32 type = 0;
        if (!tpl.FindVariable(dictionary, variable, id, type)) {
            return std::nullopt;
        }
        return ValueParser(type, static_cast<unsigned>(id), units);
    };
    if (const sXmlReportDictionary *found = tpl.GetDictionary(dictionary)) {
        variables.names = variableNames(*found);
    }
    return variables;
}

} // namespace kareport
