#pragma once

#include "KaReportExport.h"

#include <QMargins>
#include <QSizeF>
#include <QString>
#include <QStringList>
#include <QWidget>

#include <array>
#include <functional>
#include <optional>
#include <vector>

class QComboBox;
class QDoubleSpinBox;
class QLabel;
class QRadioButton;
class QVBoxLayout;

namespace kareport
{

/// A sheet that a printer takes, upright.
struct PageSheet
{
    QString name;
    QSize points;
    QSizeF millimetres;
};

/// What a page is set up with.
struct PageSetup
{
    QMargins margins; ///< hundredths of a millimetre
    bool portrait = true;
    QString printer;      ///< empty for the built-in page device
    QStringList printers; ///< to choose from
    QSize sheet;          ///< upright, in points; empty for the printer's own
    /// Whether there is a report to ask for its pages.
    bool asksForPages = false;
    /// The lines of the page that the report was made for; nothing for a report whose page has only been measured.
    std::optional<int> givenLines;
    /// Whether each of those pages is printed on a sheet of its own, or as many lines on a sheet as it takes.
    bool keepsGivenPages = false;
    /// The sheets that a printer takes, its own first.
    std::function<std::vector<PageSheet>(const QString &printer)> sheetsOf;
};

/// Asks for paper, orientation, margins, what a page is and, where there are several, the printer.
class KAREPORT_EXPORT PageSetupForm : public QWidget
{
public:
    explicit PageSetupForm(const PageSetup &setup, QWidget *parent = nullptr);

    /// What the user has chosen; the rest as it was given.
    PageSetup setup() const;
    /// Whether the margins leave room for text. Where they do not, the form says so and leads to them.
    bool confirm();

private:
    void addPrinter(QVBoxLayout &layout);
    void addOrientation(QVBoxLayout &layout);
    void addMargins(QVBoxLayout &layout);
    void addPages(QVBoxLayout &layout);
    bool leavesRoom() const;
    const PageSheet *chosenSheet() const; ///< null when nothing is known of the printer's sheets
    void fillSheets();
    void showSheet();
    void checkMargins();

    PageSetup setup_;
    QRadioButton *portrait_;
    QRadioButton *landscape_;
    QComboBox *printer_;
    QComboBox *paper_;
    QWidget *paperRow_;
    std::vector<PageSheet> sheets_; ///< of the chosen printer
    QLabel *sheet_;
    QRadioButton *givenPages_;
    QRadioButton *measuredPages_;
    QLabel *warning_;
    std::array<QDoubleSpinBox *, 4> margins_ = {}; ///< left, top, right, bottom
    std::array<double, 4> shownMargins_ = {};      ///< as they were given, as far as the fields can show them
};

} // namespace kareport
