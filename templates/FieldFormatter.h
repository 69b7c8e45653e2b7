#pragma once

#include "FieldMarker.h"
#include "TextBuffer.h"
#include "UJobSettings.h"
#include "ValueKind.h"
#include "WidestText.h"
#include "sXmlReportField.h"

#include <QStringView>

namespace kareport
{

/// What the formatting of a value depends on besides its field.
struct FormatOptions
{
    const UJobSettings *settings = nullptr;
    char16_t separator = u' '; ///< a tab trims every value and fills no column
    bool zeroBlank = false;    ///< a value of exactly 0 shows as blanks
    bool printHash = false;    ///< a text wider than its column shows as "#"
};

/// How a value shows in its column.
enum class Shown
{
    Whole,
    TooWide,  ///< the text is wider than the column, which then is wider, or shows "#"
    NotFinite ///< the value is infinite or not-a-number, whatever shows for it
};

/// A field prepared for being formatted row after row.
class FieldFormatter
{
public:
    explicit FieldFormatter(const sXmlReportField &field);

    FieldMarker marker() const { return marker_; }
    quint32 id() const { return id_; }
    /// The kinds of values that a type shows, together; a value of any other kind counts as none.
    static int kindsOf(qint32 type);
    /// Whether a value of a kind shows as what it is.
    bool shows(ValueKind kind) const { return (kinds_ & static_cast<int>(kind)) != 0; }
    /// Whether a value that is missing shows as a number 0.
    bool showsZeroForNone(const FormatOptions &options) const;

    /// Whether it shows texts of the data, which have blanks of their own.
    bool showsText() const;

    /// Appends a value's text, fitted to the field's column.
    /// @param kind    what `value` points to; `None` and any other number count as 0, false or an empty text
    /// @param suffix  "+" shows an offset with its sign, anything else with "L" or "R" after it
    /// @param widest  takes the text, without the blanks that fill the column, where it is the widest; null for none
    /// @return how it shows; a column without a width, or in the spreadsheet form, has room for any text
    Shown append(TextBuffer &out, const FormatOptions &options, ValueKind kind, const void *value, QStringView suffix,
                 WidestText *widest = nullptr) const;

private:
    enum class Align
    {
        Left,
        Centre,
        Right
    };
    struct Input;

    void appendValue(TextBuffer &out, const FormatOptions &options, const Input &input, QStringView suffix) const;
    bool appendBlanks(TextBuffer &out) const;
    void appendNumber(TextBuffer &out, double value, int decimals) const;
    void appendOffset(TextBuffer &out, const UJobSettings &settings, double value, bool withSign) const;
    void appendThickness(TextBuffer &out, double value) const;
    QStringView ownText(QStringView text) const;
    void fit(TextBuffer &out, std::size_t start, char16_t separator) const;
    void centre(TextBuffer &out, std::size_t start) const;

    FieldMarker marker_;
    Align align_;
    qint32 width_;
    qint32 decimals_;
    qint32 type_;
    quint32 id_;
    int kinds_;
};

} // namespace kareport
