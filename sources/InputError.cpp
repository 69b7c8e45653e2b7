#include "InputError.h"

namespace kareport
{

QString InputError::message() const
{
    QString message = file;
    if (place) {
        message += QStringLiteral(":%1:%2").arg(place->line).arg(place->column);
    }
    if (!message.isEmpty()) {
        message += QStringLiteral(": ");
    }
    return message + QStringLiteral("error: ") + text;
}

} // namespace kareport
