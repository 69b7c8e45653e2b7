#include "PageSetupForm.h"

#include "PlainWidgets.h"
#include "PrintGeometry.h"
#include "Xlate.h"

#include <QComboBox>
#include <QDoubleSpinBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
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

constexpr int hundredths = 100;       // of a millimetre
constexpr double mostMargin = 2000.0; // millimetres
constexpr int columns = 2;

std::array<int, 4> inOrder(const QMargins &margins)
{
    return {margins.left(), margins.top(), margins.right(), margins.bottom()};
}

QString givenPagesText(std::optional<int> lines)
{
    if (!lines) {
        return Xlate("As the report was &made");
    }
    return *lines == 1 ? Xlate("As the report was &made (1 line)")
                       : Xlate("As the report was &made (%1 lines)").arg(*lines);
}

void explain(QWidget &widget, const QString &text)
{
    widget.setToolTip(text);
    widget.setAccessibleDescription(text);
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

void PageSetupForm::addPrinter(QVBoxLayout &layout)
{
    auto *printerRow = new QWidget;
    auto *printerLayout = new QHBoxLayout(printerRow);
    printerLayout->setContentsMargins(0, 0, 0, 0);
    auto *printerLabel = plainLabel(Xlate("Pr&inter:"));
    printerLabel->setBuddy(printer_);
    printer_->setAccessibleName(Xlate("Printer"));
    printer_->addItems(setup_.printers);
    printer_->setCurrentText(setup_.printer);
    printerLayout->addWidget(printerLabel);
    printerLayout->addWidget(printer_, 1);
    printerRow->setVisible(setup_.printers.size() > 1);
    layout.addWidget(printerRow);

    auto *paperLayout = new QHBoxLayout(paperRow_);
    paperLayout->setContentsMargins(0, 0, 0, 0);
    auto *paperLabel = plainLabel(Xlate("Pa&per:"));
    paperLabel->setBuddy(paper_);
    paper_->setAccessibleName(Xlate("Paper"));
    paperLayout->addWidget(paperLabel);
    paperLayout->addWidget(paper_, 1);
    layout.addWidget(paperRow_);
}

void PageSetupForm::addOrientation(QVBoxLayout &layout)
{
    auto *orientation = new QGroupBox(Xlate("Orientation"));
    auto *orientationLayout = new QVBoxLayout(orientation);
    auto *choices = new QHBoxLayout;
    choices->addWidget(portrait_);
    choices->addWidget(landscape_);
    choices->addStretch();
    orientationLayout->addLayout(choices);
    orientationLayout->addWidget(sheet_);
    (setup_.portrait ? portrait_ : landscape_)->setChecked(true);
    layout.addWidget(orientation);
}

void PageSetupForm::addMargins(QVBoxLayout &layout)
{
    auto *margins = new QGroupBox(Xlate("Margins"));
    auto *marginsLayout = new QGridLayout(margins);
    const std::array<QString, 4> labels = {Xlate("&Left:"), Xlate("&Top:"), Xlate("&Right:"), Xlate("&Bottom:")};
    const std::array<QString, 4> names = {Xlate("Left margin"), Xlate("Top margin"), Xlate("Right margin"),
                                          Xlate("Bottom margin")};
    // Left and right are side by side, top and bottom below them.
    constexpr std::array<std::pair<int, int>, 4> places = {{{0, 0}, {1, 0}, {0, 1}, {1, 1}}};
    for (std::size_t i = 0; i < margins_.size(); ++i) {
        auto *field = new QDoubleSpinBox;
        field->setDecimals(2);
        field->setRange(0, mostMargin);
        field->setSuffix(Xlate(" mm"));
        field->setValue(double(inOrder(setup_.margins).at(i)) / hundredths);
        shownMargins_.at(i) = field->value();
        field->setAccessibleName(names.at(i));
        auto *label = plainLabel(labels.at(i));
        label->setBuddy(field);
        marginsLayout->addWidget(label, places.at(i).first, columns * places.at(i).second);
        marginsLayout->addWidget(field, places.at(i).first, columns * places.at(i).second + 1);
        connect(field, &QDoubleSpinBox::valueChanged, this, &PageSetupForm::checkMargins);
        margins_.at(i) = field;
    }
    marginsLayout->setColumnStretch(2 * columns, 1);
    QWidget::setTabOrder(margins_[0], margins_[2]);
    QWidget::setTabOrder(margins_[2], margins_[1]);
    QWidget::setTabOrder(margins_[1], margins_[3]);
    layout.addWidget(margins);
}

void PageSetupForm::addPages(QVBoxLayout &layout)
{
    auto *pages = new QGroupBox(Xlate("Pages"));
    auto *pagesLayout = new QVBoxLayout(pages);
    pagesLayout->addWidget(givenPages_);
    pagesLayout->addWidget(measuredPages_);
    givenPages_->setEnabled(setup_.givenLines.has_value());
    (setup_.givenLines && setup_.keepsGivenPages ? givenPages_ : measuredPages_)->setChecked(true);
    // A screen reader does not read a box around a button.
    for (QRadioButton *button : {givenPages_, measuredPages_}) {
        button->setAccessibleName(Xlate("Pages: %1").arg(button->text().remove(u'&')));
    }
    explain(*givenPages_,
            Xlate("Each page of the report is printed on a sheet of its own, in smaller type where it has to "
                  "be."));
    explain(*measuredPages_, Xlate("Each sheet takes as many lines as fit, and the next sheet goes on from there."));
    layout.addWidget(pages);
    pages->setVisible(setup_.asksForPages);
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
            margins.at(i) = static_cast<int>(std::lround(margins_.at(i)->value() * hundredths));
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
    // A printer's own sheet gives way to the next printer's; one that was chosen is kept where it can be.
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
    sheet_->setText(
        Xlate("Paper: %1 x %2 mm")
            .arg(locale.toString(std::lround(sheet.width())), locale.toString(std::lround(sheet.height()))));
    sheet_->setVisible(!upright.isEmpty());
    checkMargins();
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
