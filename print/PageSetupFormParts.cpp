#include "PageSetupForm.h"

#include "PageUnits.h"
#include "PlainWidgets.h"
#include "Xlate.h"

#include <QComboBox>
#include <QDoubleSpinBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QRadioButton>
#include <QVBoxLayout>

#include <utility>

namespace kareport
{

namespace
{

void explain(QWidget &widget, const QString &text)
{
    widget.setToolTip(text);
    widget.setAccessibleDescription(text);
}

} // namespace

std::array<int, 4> PageSetupForm::inOrder(const QMargins &margins)
{
    return {margins.left(), margins.top(), margins.right(), margins.bottom()};
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
    constexpr int columns = 2;
    auto *margins = new QGroupBox(Xlate("Margins"));
    auto *marginsLayout = new QGridLayout(margins);
    const std::array<QString, 4> labels = {Xlate("&Left:"), Xlate("&Top:"), Xlate("&Right:"), Xlate("&Bottom:")};
    const std::array<QString, 4> names = {Xlate("Left margin"), Xlate("Top margin"), Xlate("Right margin"),
                                          Xlate("Bottom margin")};
    // Left and right are side by side, top and bottom below them.
    constexpr std::array<std::pair<int, int>, 4> places = {{{0, 0}, {1, 0}, {0, 1}, {1, 1}}};
    for (std::size_t i = 0; i < margins_.size(); ++i) {
        auto *field = new QDoubleSpinBox;
        field->setAccessibleName(names.at(i));
        auto *label = plainLabel(labels.at(i));
        label->setBuddy(field);
        marginsLayout->addWidget(label, places.at(i).first, columns * places.at(i).second);
        marginsLayout->addWidget(field, places.at(i).first, columns * places.at(i).second + 1);
        connect(field, &QDoubleSpinBox::valueChanged, this, &PageSetupForm::checkMargins);
        margins_.at(i) = field;
    }
    fillMargins();
    marginsLayout->setColumnStretch(2 * columns, 1);
    QWidget::setTabOrder(margins_[0], margins_[2]);
    QWidget::setTabOrder(margins_[2], margins_[1]);
    QWidget::setTabOrder(margins_[1], margins_[3]);
    layout.addWidget(margins);
}

double PageSetupForm::hundredths() const
{
    return setup_.inInches ? hundredthsPerInch : 100;
}

void PageSetupForm::fillMargins()
{
    constexpr double mostMargin = 200'000; // hundredths of a millimetre
    for (std::size_t i = 0; i < margins_.size(); ++i) {
        QDoubleSpinBox &field = *margins_.at(i);
        field.setDecimals(setup_.inInches ? 3 : 2);
        field.setSingleStep(setup_.inInches ? 0.1 : 1);
        field.setRange(0, mostMargin / hundredths());
        field.setSuffix(setup_.inInches ? Xlate(" in@@inches, after a number") : Xlate(" mm"));
        field.setValue(inOrder(setup_.margins).at(i) / hundredths());
        shownMargins_.at(i) = field.value();
    }
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

} // namespace kareport
