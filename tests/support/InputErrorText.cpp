#include "InputErrorText.h"

QString placeText(const std::optional<kareport::TextPlace> &place)
{
    return place ? QStringLiteral("%1:%2").arg(place->line).arg(place->column) : QStringLiteral("none");
}

QString placeText(const std::optional<kareport::InputError> &error)
{
    return error ? placeText(error->place) : QStringLiteral("no error");
}

QString textOfError(const std::optional<kareport::InputError> &error)
{
    return error ? error->text : QString();
}
