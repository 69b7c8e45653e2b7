#include "UnitsPage.h"

#include "BearingText.h"
#include "OrientationOrder.h"
#include "PlainWidgets.h"
#include "TextBuffer.h"
#include "UnitFactors.h"
#include "ValueBoxes.h"
#include "VariableType.h"
#include "Xlate.h"

#include <QCheckBox>
#include <QFontDatabase>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QRegularExpressionValidator>

#include <numbers>
#include <type_traits>

namespace kareport
{

namespace
{

constexpr int mostBearingDecimals = 9;

// Values whose digits show what decimals, zeros and units do to them.
constexpr double sampleLength = 1234.56789;                                                 // metres
constexpr double sampleStation = 12345.678;                                                 // metres
constexpr double sampleArea = 25600.5;                                                      // square metres
constexpr double sampleAngle = (7 + 5 / 60.0) * std::numbers::pi / 180;                     // 7°05'
constexpr double sampleBearing = (135 + 4 / 60.0 + 9.25 / 3600.0) * std::numbers::pi / 180; // 135°04'09.25"

template <typename Value>
QComboBox *choiceOf(Value current, std::initializer_list<std::pair<std::type_identity_t<Value>, QString>> items)
{
    QComboBox *box = choice<Value>(items);
    display(*box, current);
    return box;
}

QSpinBox *decimalsOf(int value, int most)
{
    QSpinBox *box = decimals(most);
    box->setValue(value);
    return box;
}

/// A row of two fields under one label; the second has its name from its accessible name.
void addPair(QFormLayout &form, const QString &label, QWidget *first, const QString &secondName, QWidget *second)
{
    auto *row = new QHBoxLayout;
    row->addWidget(first, 1);
    auto *secondLabel = plainLabel(secondName);
    secondLabel->setBuddy(second);
    row->addWidget(secondLabel);
    row->addWidget(second);
    auto *firstLabel = plainLabel(label);
    firstLabel->setBuddy(first);
    form.addRow(firstLabel, row);
}

} // namespace

UnitsPage::UnitsPage(const UJobSettings &settings, QWidget *parent)
    : QWidget(parent),
      lengthUnit_(choiceOf(settings.lengthUnit, {{LengthUnit::Metre, Xlate("Metre")},
                                                 {LengthUnit::Millimetre, Xlate("Millimetre")},
                                                 {LengthUnit::Kilometre, Xlate("Kilometre")},
                                                 {LengthUnit::InternationalFoot, Xlate("International foot")},
                                                 {LengthUnit::UsSurveyFoot, Xlate("US survey foot")}})),
      lengthDecimals_(decimalsOf(settings.lengthDecimals, mostDecimals)),
      areaUnit_(choiceOf(settings.areaUnit, {{AreaUnit::SquareMetre, Xlate("Square metre")},
                                             {AreaUnit::Hectare, Xlate("Hectare")},
                                             {AreaUnit::SquareKilometre, Xlate("Square kilometre")},
                                             {AreaUnit::SquareFoot, Xlate("Square foot")},
                                             {AreaUnit::Acre, Xlate("Acre")}})),
      angleUnit_(choiceOf(settings.angleUnit, {{AngleUnit::Degree, Xlate("Degree")},
                                               {AngleUnit::Gon, Xlate("Gon")},
                                               {AngleUnit::Radian, Xlate("Radian")}})),
      numberDecimals_(decimalsOf(settings.numberDecimals, mostDecimals)),
      stationFormat_(choiceOf(settings.stationFormat,
                              {{UJobSettings::StationFormat::Plain, QStringLiteral("12345.678")},
                               {UJobSettings::StationFormat::HundredsPlus, QStringLiteral("123+45.678")},
                               {UJobSettings::StationFormat::ThousandsPlus, QStringLiteral("12+345.678")}})),
      stationDecimals_(decimalsOf(settings.stationDecimals, mostDecimals)),
      northEastOrder_(choiceOf<int>(settings.northEastOrder, {{ORDER_EASTING_NORTHING, Xlate("Easting, northing")},
                                                              {ORDER_NORTHING_EASTING, Xlate("Northing, easting")}})),
      bearingUnit_(choiceOf<unsigned>(
          settings.bearingUnit,
          {{0U, Xlate("Degrees, minutes, seconds")}, {1U, Xlate("Decimal degrees")}, {2U, Xlate("Gon")}})),
      bearingDecimals_(decimalsOf(settings.bearingDecimals, mostBearingDecimals)),
      bearingStyle_(choiceOf<int>(settings.bearingStyle, {{0, Xlate("Whole circle")}, {1, Xlate("Quadrant")}})),
      bearingReference_(
          choiceOf<unsigned>(settings.bearingReference, {{0U, Xlate("From north")}, {1U, Xlate("From south")}})),
      bearingPadding_(new QCheckBox(Xlate("Leading &zeros"))),
      marksLabel_(plainLabel(Xlate("Angle &marks:"))),
      samples_(plainLabel())
{
    auto *layout = new QHBoxLayout(this);
    auto *form = new QFormLayout;
    bearingPadding_->setChecked(settings.bearingPadding != 0);
    addFields(*form);
    form->addRow(marksLabel_, makeMarks(settings));
    layout->addLayout(form, 1);
    layout->addWidget(makeSampleBox());
    nameFields();
    followFields();
    showSamples();
}

void UnitsPage::addFields(QFormLayout &form)
{
    addPair(form, Xlate("&Lengths:"), lengthUnit_, Xlate("Decimals:"), lengthDecimals_);
    addPair(form, Xlate("&Areas:"), areaUnit_, Xlate("Decimals of numbers:"), numberDecimals_);
    form.addRow(Xlate("A&ngles:"), angleUnit_);
    addPair(form, Xlate("&Stations:"), stationFormat_, Xlate("Decimals:"), stationDecimals_);
    form.addRow(Xlate("&Coordinates:"), northEastOrder_);
    addPair(form, Xlate("&Bearings:"), bearingUnit_, Xlate("Decimals:"), bearingDecimals_);
    addPair(form, QString(), bearingStyle_, QString(), bearingReference_);
    form.addRow(QString(), bearingPadding_);
}

/// A row of three fields, each with the mark that is shown after a part of an angle.
QLayout *UnitsPage::makeMarks(const UJobSettings &settings)
{
    auto *marks = new QHBoxLayout;
    const std::array<QString, 3> names = {Xlate("Degree mark"), Xlate("Minute mark"), Xlate("Second mark")};
    for (std::size_t i = 0; i < angleMarks_.size(); ++i) {
        const char mark = settings.angleMarks.at(i);
        auto *field = new QLineEdit(mark == 0 ? QString() : QString(QLatin1Char(mark)));
        // Printable characters of one byte: the marks have no others.
        field->setValidator(new QRegularExpressionValidator(
            QRegularExpression(QStringLiteral("[\\x{20}-\\x{7E}\\x{A0}-\\x{FF}]?")), field));
        field->setMaximumWidth(3 * fontMetrics().averageCharWidth() + 20);
        field->setAccessibleName(names.at(i));
        field->setToolTip(names.at(i));
        marks->addWidget(field);
        angleMarks_.at(i) = field;
    }
    marks->addStretch();
    marksLabel_->setBuddy(angleMarks_[0]);
    return marks;
}

QWidget *UnitsPage::makeSampleBox()
{
    auto *box = new QGroupBox(Xlate("Looks like"));
    auto *layout = new QHBoxLayout(box);
    samples_->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    samples_->setAlignment(Qt::AlignTop | Qt::AlignLeft);
    // As wide as the widest of them from the beginning, so that nothing moves when another unit is chosen.
    constexpr int widestSample = 22; // characters
    samples_->setMinimumWidth(QFontMetrics(samples_->font()).averageCharWidth() * widestSample);
    layout->addWidget(samples_);
    return box;
}

void UnitsPage::nameFields()
{
    lengthUnit_->setAccessibleName(Xlate("Unit of lengths"));
    lengthDecimals_->setAccessibleName(Xlate("Decimals of lengths"));
    areaUnit_->setAccessibleName(Xlate("Unit of areas"));
    numberDecimals_->setAccessibleName(Xlate("Decimals of numbers and areas"));
    angleUnit_->setAccessibleName(Xlate("Unit of angles"));
    stationFormat_->setAccessibleName(Xlate("Form of stations"));
    stationDecimals_->setAccessibleName(Xlate("Decimals of stations"));
    northEastOrder_->setAccessibleName(Xlate("Order of coordinates"));
    bearingUnit_->setAccessibleName(Xlate("Unit of bearings"));
    bearingDecimals_->setAccessibleName(Xlate("Decimals of bearings"));
    bearingStyle_->setAccessibleName(Xlate("Style of bearings"));
    bearingReference_->setAccessibleName(Xlate("Reference of bearings"));
}

/// Shows the samples again whenever a field changes.
void UnitsPage::followFields()
{
    for (QComboBox *box : findChildren<QComboBox *>()) {
        connect(box, &QComboBox::currentIndexChanged, this, &UnitsPage::showSamples);
    }
    for (QSpinBox *box : findChildren<QSpinBox *>()) {
        connect(box, &QSpinBox::valueChanged, this, &UnitsPage::showSamples);
    }
    for (QLineEdit *mark : angleMarks_) {
        connect(mark, &QLineEdit::textChanged, this, &UnitsPage::showSamples);
    }
    connect(bearingPadding_, &QCheckBox::toggled, this, &UnitsPage::showSamples);
}

UJobSettings UnitsPage::settings() const
{
    UJobSettings settings;
    settings.lengthUnit = chosenIn<LengthUnit>(*lengthUnit_);
    settings.lengthDecimals = lengthDecimals_->value();
    settings.areaUnit = chosenIn<AreaUnit>(*areaUnit_);
    settings.angleUnit = chosenIn<AngleUnit>(*angleUnit_);
    settings.numberDecimals = numberDecimals_->value();
    settings.stationFormat = chosenIn<UJobSettings::StationFormat>(*stationFormat_);
    settings.stationDecimals = stationDecimals_->value();
    settings.northEastOrder = chosenIn<qint16>(*northEastOrder_);
    settings.bearingUnit = chosenIn<unsigned>(*bearingUnit_);
    settings.bearingDecimals = bearingDecimals_->value();
    settings.bearingStyle = chosenIn<qint16>(*bearingStyle_);
    settings.bearingReference = chosenIn<unsigned>(*bearingReference_);
    settings.bearingPadding = bearingPadding_->isChecked() ? 1 : 0;
    for (std::size_t i = 0; i < angleMarks_.size(); ++i) {
        const QString mark = angleMarks_.at(i)->text();
        settings.angleMarks.at(i) = mark.isEmpty() ? '\0' : mark[0].toLatin1();
    }
    return settings;
}

void UnitsPage::showSamples()
{
    const UJobSettings chosen = settings();
    const auto number = [&chosen](double value) { return QString::number(value, 'f', chosen.numberDecimals); };
    kareport::TextBuffer length;
    chosen.appendUnitLength(length, sampleLength, {.fromInternal = true, .withUnit = true});
    kareport::TextBuffer station;
    chosen.appendStation(station, sampleStation, {.fromInternal = true});
    const QStringList rows = {Xlate("Length"),  length.view().toString(),
                              Xlate("Area"),    number(chosen.ConvertToDisplay(sampleArea, VARIABLE_AREA, 0)),
                              Xlate("Angle"),   number(chosen.ConvertToDisplay(sampleAngle, VARIABLE_ANGLE, 0)),
                              Xlate("Station"), station.view().toString(),
                              Xlate("Bearing"), bearingText(sampleBearing, chosen),
                              Xlate("Columns"), chosen.northEastOrder == 0 ? Xlate("E, N") : Xlate("N, E")};
    QString text;
    for (qsizetype i = 0; i + 1 < rows.size(); i += 2) {
        text += rows[i] + u'\n' + QStringLiteral("  ") + rows[i + 1] + u'\n';
    }
    samples_->setText(text.trimmed());
    samples_->setAccessibleName(text);
}

} // namespace kareport
