#include "PageSetupForm.h"

#include "PageUnits.h"
#include "PlainWidgets.h"
#include "PrintGeometry.h"
#include "Xlate.h"

#include <QComboBox>
#include <QDoubleSpinBox>
#include <QLabel>
#include <QLocale>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QVBoxLayout>

#include <cmath>

namespace kareport
{

namespace
{

QString givenPagesText(std::optional<int> lines)
{
    if (!lines) {
        return Xlate("As the report was &made");
    }
    return *lines == 1 ? Xlate("As the report was &made (1 line)")
                       : Xlate("As the report was &made (%1 lines)").arg(*lines);
}

} // namespace

PageSetupForm::PageSetupForm(const PageSetup &setup, QWidget *parent)
    : QWidget(parent),
      setup_(setup),
      portrait_(new QRadioButton(Xlate("P&ortrait"))),
      landscape_(new QRadioButton(Xlate("L&andscape"))),
      printer_(new QComboBox),
      paper_(new QComboBox),
      paperRow_(new QWidget),
      sheet_(plainLabel()),
      givenPages_(new QRadioButton(givenPagesText(setup.givenLines))),
      measuredPages_(new QRadioButton(Xlate("As the &sheet takes them"))),
      warning_(plainLabel())
{
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    addPrinter(*layout);
    addOrientation(*layout);
    addMargins(*layout);
    addPages(*layout);
    warning_->setWordWrap(true);
    warning_->setObjectName(QStringLiteral("warning"));
    warning_->hide();
    layout->addWidget(warning_);

    connect(portrait_, &QRadioButton::toggled, this, &PageSetupForm::showSheet);
    connect(printer_, &QComboBox::currentIndexChanged, this, &PageSetupForm::fillSheets);
    connect(paper_, &QComboBox::currentIndexChanged, this, &PageSetupForm::showSheet);
    fillSheets();
    setFocusProxy(margins_[0]);
    margins_[0]->selectAll();
}

PageSetup PageSetupForm::setup() const
{
    PageSetup setup = setup_;
    setup.portrait = portrait_->isChecked();
    setup.keepsGivenPages = givenPages_->isChecked();
    if (setup_.printers.size() > 1) {
        setup.printer = printer_->currentText();
    }
    if (const PageSheet *chosen = chosenSheet()) {
        // The printer's own sheet stays its own, whichever that is then.
        setup.sheet = paper_->currentIndex() == 0 ? QSize() : chosen->points;
    }
    std::array<int, 4> margins = inOrder(setup_.margins);
    for (std::size_t i = 0; i < margins_.size(); ++i) {
        // A margin that the field cannot show stays as it is until another one is entered.
        if (margins_.at(i)->value() != shownMargins_.at(i)) {
            margins.at(i) = static_cast<int>(std::lround(margins_.at(i)->value() * hundredths()));
        }
    }
    setup.margins = QMargins(margins[0], margins[1], margins[2], margins[3]);
    return setup;
}

bool PageSetupForm::leavesRoom() const
{
    const PageSetup chosen = setup();
    if (chosenSheet() == nullptr) {
        return true;
    }
    const QSizeF upright = chosenSheet()->millimetres;
    const QSizeF sheet = chosen.portrait ? upright : upright.transposed();
    return kareport::leavesRoom({twipsOfMillimetres(sheet.width()), twipsOfMillimetres(sheet.height())},
                                twipsOfHundredths(chosen.margins));
}

const PageSheet *PageSetupForm::chosenSheet() const
{
    const int index = paper_->currentIndex();
    return index >= 0 ? &sheets_.at(static_cast<std::size_t>(index)) : nullptr;
}

void PageSetupForm::fillSheets()
{
    const QString printer = setup_.printers.size() > 1 ? printer_->currentText() : setup_.printer;
    // A printer's own sheet is replaced by the next printer's; one that was chosen is kept where it can be.
    const QSize wanted = sheets_.empty() ? setup_.sheet : setup().sheet;
    const QSignalBlocker blocker(paper_);
    paper_->clear();
    sheets_ = setup_.sheetsOf ? setup_.sheetsOf(printer) : std::vector<PageSheet>();
    for (const PageSheet &sheet : sheets_) {
        paper_->addItem(sheet.name);
        if (sheet.points == wanted) {
            paper_->setCurrentIndex(paper_->count() - 1);
        }
    }
    paperRow_->setVisible(sheets_.size() > 1);
    showSheet();
}

void PageSetupForm::showSheet()
{
    const QSizeF upright = chosenSheet() != nullptr ? chosenSheet()->millimetres : QSizeF();
    const QSizeF sheet = portrait_->isChecked() ? upright : upright.transposed();
    const QLocale locale;
    if (setup_.inInches) {
        const QSizeF inches = sheet / millimetresPerInch;
        sheet_->setText(Xlate("Paper: %1 x %2 in")
                            .arg(locale.toString(inches.width(), 'f', 2), locale.toString(inches.height(), 'f', 2)));
    } else {
        sheet_->setText(
            Xlate("Paper: %1 x %2 mm")
                .arg(locale.toString(std::lround(sheet.width())), locale.toString(std::lround(sheet.height()))));
    }
    sheet_->setVisible(!upright.isEmpty());
    checkMargins();
}

void PageSetupForm::showInInches(bool inInches)
{
    if (inInches != setup_.inInches) {
        setup_.margins = setup().margins;
        setup_.inInches = inInches;
        fillMargins();
        showSheet();
    }
}

void PageSetupForm::checkMargins()
{
    // Shown when the user wants to leave, not while typing; removed as soon as it is no longer true.
    if (!warning_->isHidden() && leavesRoom()) {
        warning_->hide();
    }
}

bool PageSetupForm::confirm()
{
    if (leavesRoom()) {
        return true;
    }
    warning_->setText(Xlate("These margins leave no room for text on the paper. Choose smaller margins."));
    warning_->setAccessibleName(warning_->text());
    warning_->show();
    margins_[0]->setFocus();
    margins_[0]->selectAll();
    return false;
}

} // namespace kareport
