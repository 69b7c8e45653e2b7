#include "InputError.h"

namespace kareport
{

QString InputError::message() const
{
    return messageAs(QStringLiteral("error"));
}

QString InputError::messageAs(const QString &word) const
{
    QString message = file;
    if (place) {
        message += QStringLiteral(":%1:%2").arg(place->line).arg(place->column);
    }
    if (!message.isEmpty()) {
        message += QStringLiteral(": ");
    }
    return message + word + QStringLiteral(": ") + text;
}

} // namespace kareport
