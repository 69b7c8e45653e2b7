#include "JsonObjectList.h"

#include "Xlate.h"

namespace kareport
{

void storeJsonObject(const JsonNode &node, const FindVariable &findVariable, UDataObject &object)
{
    if (!node.expectObject()) {
        return;
    }
    for (const QString &name : node.keys()) {
        const auto parser = findVariable(name);
        if (!parser) {
            continue;
        }
        const JsonNode member = node[name];
        const QJsonValue &value = member.value();
        bool fits = false;
        switch (value.type()) {
        case QJsonValue::Null: fits = true; break;
        case QJsonValue::Bool: fits = parser->storeBoolean(value.toBool(), object); break;
        case QJsonValue::Double: fits = parser->storeNumber(value.toDouble(), object); break;
        case QJsonValue::String: fits = parser->store(value.toString().toStdString(), object); break;
        default: break;
        }
        if (!fits) {
            member.fail(Xlate("the value of \"%1\" does not fit: %2 was expected").arg(name, parser->expected()));
            return;
        }
    }
}

} // namespace kareport
