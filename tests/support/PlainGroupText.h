#pragma once

#include "TableGroups.h"

/// A text of a group without a value in it.
inline kareport::GroupText plainText(const QString &text)
{
    kareport::GroupText made;
    kareport::GroupText::Piece piece;
    piece.text = text;
    made.pieces.push_back(piece);
    return made;
}
