#pragma once

#include "PageDefaults.h"
#include "PageMeasurement.h"

#include <QMargins>
#include <QString>

#include <optional>

namespace kareport
{

/// The page that a report is laid out for: its margins, its font, and how much text has room between the margins, as it was
/// measured on the default printer or as it was given.
class PageLayout
{
public:
    /// Hundredths of a millimetre. What is measured changes by `measure` alone.
    QMargins margins = defaultMargins;
    QString fontName = defaultFace.toString();
    unsigned fontSize = defaultFontSize; ///< points

    const PageGeometry &geometry() const { return geometry_; }

    /// Measures the page on a printer; the figures that were given stay. @return false, with the figures as they were,
    /// without a printer
    bool measure(const std::optional<PageDevice> &device);

    /// Gives the lines of a page or the characters of a row (1 or more) instead of the measured ones. With both, no font
    /// is measured. What is not given is measured again by the next `measure`.
    void give(std::optional<int> linesPerPage, std::optional<int> charsPerRow);
    /// Whether the lines that were given count.
    bool isGiven() const { return usesGiven_ && givenLinesPerPage_.has_value(); }
    /// Switches between the lines that were given and those that the next `measure` finds.
    void useGiven(bool on);
    std::optional<int> givenLinesPerPage() const { return givenLinesPerPage_; }

    /// Reads margins and font size from the user's preferences; where these have no margins, they get the current ones.
    void load();
    /// Writes the margins to the user's preferences.
    void save() const;

private:
    void applyGiven();

    PageGeometry geometry_;
    std::optional<int> givenLinesPerPage_;
    std::optional<int> givenCharsPerRow_;
    bool usesGiven_ = true;
};

/// The default printer, as the user has reports printed, upright or not.
std::optional<PageDevice> reportPageDevice();

} // namespace kareport
