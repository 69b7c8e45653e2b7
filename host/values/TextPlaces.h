#pragma once

#include "TextPlace.h"

#include <QStringView>

#include <vector>

namespace kareport
{

/// Finds the places of positions in a text whose lines end with LF. The text must live as long as this object.
class TextPlaces
{
public:
    explicit TextPlaces(QStringView text);

    /// The place of the character at a position; after the end, the place of the end.
    TextPlace of(qsizetype position) const;

private:
    QStringView text_;
    std::vector<qsizetype> lineStarts_;
    std::vector<qsizetype> pairs_; ///< where the second halves of surrogate pairs are
};

} // namespace kareport
