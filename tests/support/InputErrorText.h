#pragma once

#include "InputError.h"
#include "PrintQt.h"

#include <QString>

#include <optional>

/// A place as "line:column", or "none".
QString placeText(const std::optional<kareport::TextPlace> &place);

QString placeText(const std::optional<kareport::InputError> &error);

QString textOfError(const std::optional<kareport::InputError> &error);
