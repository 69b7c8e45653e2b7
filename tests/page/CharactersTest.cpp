#include "Characters.h"

#include <gtest/gtest.h>

using kareport::isControl;
using kareport::needsNoShaping;

namespace
{

TEST(Characters, WhatNeedsNoShaping)
{
    struct Row
    {
        char16_t character;
        bool needsNoShaping;
        const char *reason;
    };
    const Row rows[] = {
        {u' ', true, "a blank"},
        {u'~', true, "the last of ASCII"},
        {u'\t', false, "a tab depends on its place"},
        {0x7F, false, "a control"},
        {0x85, false, "a control"},
        {u'\u00A0', true, "a blank that does not break"},
        {u'\u00AD', false, "a soft hyphen is shown at a line's end alone"},
        {u'\u00E9', true, "a letter with its mark"},
        {u'\u0301', false, "a mark goes on the letter before it"},
        {u'\u03A9', true, "Greek"},
        {u'\u0483', false, "a Cyrillic mark"},
        {u'\u05D0', false, "Hebrew runs from right to left"},
        {u'\u0627', false, "Arabic letters join"},
        {u'\u0915', false, "Devanagari stacks"},
        {u'\u200D', false, "a joiner"},
        {u'\u2192', true, "an arrow"},
        {u'\u2500', true, "a frame"},
        {u'\u302A', false, "an ideographic tone mark"},
        {u'\u3042', true, "Japanese"},
        {u'\u3099', false, "a Japanese voicing mark"},
        {u'\u6E2C', true, "Chinese"},
        {u'\u1100', false, "a Hangul consonant joins a syllable"},
        {u'\uAC00', true, "a Hangul syllable"},
        {0xD83D, false, "half of a pair"},
        {u'\uFE0F', false, "a variation selector"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(needsNoShaping(row.character), row.needsNoShaping) << row.reason;
    }
}

TEST(Characters, ControlsTakeNoPlace)
{
    for (const char16_t control :
         {u'\0', u'\t', u'\r', u'\n', char16_t(0x1F), char16_t(0x7F), char16_t(0x9F), u'\u2028', u'\u2029'})
    {
        EXPECT_TRUE(isControl(control)) << int(control);
        EXPECT_FALSE(needsNoShaping(control)) << int(control);
    }
    for (const char16_t shown : {u' ', u'~', u'\u00A0', u'\u00AD', u'\u2027', u'\u202A'}) {
        EXPECT_FALSE(isControl(shown)) << int(shown);
    }
}

} // namespace
