#pragma once

#include "RichTextCodePage.h"
#include "RichTextSigns.h"

#include <QFont>
#include <QString>

#include <unordered_map>
#include <vector>

namespace kareport
{

struct RichTextFont
{
    QString family;
    QFont::StyleHint kind = QFont::AnyStyle;
    int codePage = 0;                     ///< 0: that of the file
    const RichTextSigns *signs = nullptr; ///< where the font holds signs that are known

    /// Whether its bytes are numbers of signs.
    bool hasSignBytes() const { return codePage == symbolCodePage || (signs != nullptr && codePage == 0); }
};

/// The font table of a file. Fonts are known by their place in the table, not by the numbers that the file gives them.
class RichTextFonts
{
public:
    /// The font with the file's number; the default one where the table does not have the number, the first one of letters
    /// where it does not have that either, else -1.
    int find(int number) const;
    int defaultFont() const { return find(defaultNumber_); }
    void setDefaultNumber(int number) { defaultNumber_ = number; }
    /// @param font  in the table
    const RichTextFont &operator[](int font) const { return fonts_[static_cast<std::size_t>(font)]; }

    // While the table is read:
    void begin(int number);
    /// The font that is being read; it counts once it has been put into the table.
    RichTextFont &current() { return current_; }
    /// Puts the font that is being read into the table, if it has a name.
    void commit();

private:
    std::vector<RichTextFont> fonts_;
    std::unordered_map<int, int> numbers_;
    int defaultNumber_ = 0;
    int currentNumber_ = 0;
    RichTextFont current_;
};

} // namespace kareport
