#pragma once

#include "PageSetup.h"

#include <QWidget>

#include <array>
#include <vector>

class QComboBox;
class QDoubleSpinBox;
class QLabel;
class QRadioButton;
class QVBoxLayout;

namespace kareport
{

/// Asks for paper, orientation, margins, what a page is and, where there are several, the printer.
class PageSetupForm : public QWidget
{
public:
    explicit PageSetupForm(const PageSetup &setup, QWidget *parent = nullptr);

    /// What the user has chosen; the rest as it was given.
    PageSetup setup() const;
    /// Shows lengths in inches, or in millimetres.
    void showInInches(bool inInches);
    /// Whether the margins leave room for text. Where they do not, the form says so and leads to them.
    bool confirm();

private:
    static std::array<int, 4> inOrder(const QMargins &margins); ///< left, top, right, bottom

    void addPrinter(QVBoxLayout &layout);
    void addOrientation(QVBoxLayout &layout);
    void addMargins(QVBoxLayout &layout);
    void addPages(QVBoxLayout &layout);
    void fillMargins();
    double hundredths() const; ///< of a millimetre, in the unit that is shown
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
