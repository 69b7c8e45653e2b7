#pragma once

#include "InputError.h"
#include "PrintQt.h"

#include <QString>

#include <optional>

/// A place as "line:column", or "none".
inline QString placeText(const std::optional<kareport::TextPlace> &place)
{
    return place ? QStringLiteral("%1:%2").arg(place->line).arg(place->column) : QStringLiteral("none");
}

inline QString placeText(const std::optional<kareport::InputError> &error)
{
    return error ? placeText(error->place) : QStringLiteral("no error");
}

inline QString textOfError(const std::optional<kareport::InputError> &error)
{
    return error ? error->text : QString();
}
