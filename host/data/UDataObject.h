#pragma once

#include "UDictionary.h"

/// One object of the host's data (a point, a station, a traverse leg): its values by their dictionary identifiers.
class UDataObject : public UDictionary
{};
