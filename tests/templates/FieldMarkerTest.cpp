#include "FieldMarker.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

using kareport::FieldMarker;
using kareport::fieldMarker;

namespace
{

struct MarkerRow
{
    const char16_t *name;
    FieldMarker marker;
    const char *reason;
};

constexpr MarkerRow markerRows[] = {
    {u"FILLER", FieldMarker::Filler, "capitals"},
    {u"Filler", FieldMarker::Filler, "any case"},
    {u"SUFFIX_R", FieldMarker::SuffixR, "capitals"},
    {u"suffix_r", FieldMarker::SuffixR, "any case"},
    {u"SUFFIX_+", FieldMarker::SuffixPlus, "capitals"},
    {u"Suffix_+", FieldMarker::SuffixPlus, "any case"},
    {u"", FieldMarker::None, "no name"},
    {u"FILLER ", FieldMarker::None, "a blank after it"},
    {u"FILLERS", FieldMarker::None, "a longer name"},
    {u"SUFFIX_", FieldMarker::None, "no style"},
    {u"SUFFIX_L", FieldMarker::None, "another letter"},
    {u"Northing", FieldMarker::None, "a variable"},
};

TEST(FieldMarker, KnowsTheMarkers)
{
    for (const MarkerRow &row : markerRows) {
        EXPECT_EQ(fieldMarker(row.name), row.marker) << row.reason;
    }
}

} // namespace
