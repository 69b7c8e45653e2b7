#include "UnitsBar.h"

#include "JobSettings.h"
#include "OrientationOrder.h"
#include "ValueBoxes.h"
#include "Xlate.h"

#include <QApplication>
#include <QKeyEvent>

#include <algorithm>

namespace kareport
{

namespace
{

QSpinBox *wholeDecimals()
{
    QSpinBox *box = decimals(mostDecimals);
    box->setKeyboardTracking(false); // a number of two digits is chosen when both are there
    return box;
}

} // namespace

UnitsBar::UnitsBar(QWidget *parent) : QToolBar(Xlate("Units"), parent)
{
    using Station = UJobSettings::StationFormat;
    setObjectName(QStringLiteral("units"));
    lengthUnit_ = add(choice<LengthUnit>({{LengthUnit::Metre, QStringLiteral("m")},
                                          {LengthUnit::Millimetre, QStringLiteral("mm")},
                                          {LengthUnit::Kilometre, QStringLiteral("km")},
                                          {LengthUnit::InternationalFoot, QStringLiteral("ft")},
                                          {LengthUnit::UsSurveyFoot, QStringLiteral("US ft")}}),
                      Xlate("Unit of lengths"));
    lengthDecimals_ = add(wholeDecimals(), Xlate("Decimals of lengths"));
    addSeparator();
    areaUnit_ = add(choice<AreaUnit>({{AreaUnit::SquareMetre, QStringLiteral("m²")},
                                      {AreaUnit::Hectare, QStringLiteral("ha")},
                                      {AreaUnit::SquareKilometre, QStringLiteral("km²")},
                                      {AreaUnit::SquareFoot, QStringLiteral("ft²")},
                                      {AreaUnit::Acre, QStringLiteral("ac")}}),
                    Xlate("Unit of areas"));
    angleUnit_ = add(choice<AngleUnit>({{AngleUnit::Degree, QStringLiteral("°")},
                                        {AngleUnit::Gon, QStringLiteral("gon")},
                                        {AngleUnit::Radian, QStringLiteral("rad")}}),
                     Xlate("Unit of angles"));
    numberDecimals_ = add(wholeDecimals(), Xlate("Decimals of numbers and areas"));
    addSeparator();
    stationFormat_ = add(choice<Station>({{Station::Plain, QStringLiteral("12345.678")},
                                          {Station::HundredsPlus, QStringLiteral("123+45.678")},
                                          {Station::ThousandsPlus, QStringLiteral("12+345.678")}}),
                         Xlate("Form of stations"));
    stationDecimals_ = add(wholeDecimals(), Xlate("Decimals of stations"));
    addSeparator();
    northEastOrder_ =
        add(choice<int>({{ORDER_NORTHING_EASTING, Xlate("N, E")}, {ORDER_EASTING_NORTHING, Xlate("E, N")}}),
            Xlate("Order of coordinates"));
    for (QComboBox *box : findChildren<QComboBox *>()) {
        connect(box, &QComboBox::activated, this, [this] { noteChosen(); });
    }
    for (QSpinBox *box : findChildren<QSpinBox *>()) {
        connect(box, &QSpinBox::valueChanged, this, [this] { noteChosen(); });
    }
    showSettings(std::nullopt);
}

template <typename Widget>
Widget *UnitsBar::add(Widget *widget, const QString &name)
{
    widget->setAccessibleName(name);
    widget->setToolTip(name);
    // As with the other bars, the Tab key does not reach it from the reports; within it, Tab goes from box to box. The wheel
    // chooses nothing when the mouse passes over the bar.
    widget->setFocusPolicy(Qt::ClickFocus);
    boxes_.push_back(widget);
    widget->installEventFilter(this);
    addWidget(widget);
    return widget;
}

void UnitsBar::showSettings(const std::optional<UJobSettings> &settings)
{
    setEnabled(settings.has_value());
    if (!settings) {
        return;
    }
    settings_ = *settings;
    display(*lengthUnit_, settings_.lengthUnit);
    display(*lengthDecimals_, settings_.lengthDecimals);
    display(*areaUnit_, settings_.areaUnit);
    display(*angleUnit_, settings_.angleUnit);
    display(*numberDecimals_, settings_.numberDecimals);
    display(*stationFormat_, settings_.stationFormat);
    display(*stationDecimals_, settings_.stationDecimals);
    display(*northEastOrder_, settings_.northEastOrder);
}

UJobSettings UnitsBar::chosenSettings() const
{
    UJobSettings chosen = settings_;
    chosen.lengthUnit = chosenIn<LengthUnit>(*lengthUnit_);
    chosen.lengthDecimals = lengthDecimals_->value();
    chosen.areaUnit = chosenIn<AreaUnit>(*areaUnit_);
    chosen.angleUnit = chosenIn<AngleUnit>(*angleUnit_);
    chosen.numberDecimals = numberDecimals_->value();
    chosen.stationFormat = chosenIn<UJobSettings::StationFormat>(*stationFormat_);
    chosen.stationDecimals = stationDecimals_->value();
    chosen.northEastOrder = chosenIn<qint16>(*northEastOrder_);
    return chosen;
}

void UnitsBar::noteChosen()
{
    const QJsonObject before = settingsToJson(settings_);
    const QJsonObject after = settingsToJson(chosenSettings());
    QJsonObject changed;
    for (auto key = after.begin(); key != after.end(); ++key) {
        if (before.value(key.key()) != key.value()) {
            changed.insert(key.key(), key.value());
        }
    }
    if (!changed.isEmpty() && chosen_) {
        chosen_(changed);
    }
}

void UnitsBar::takeFocus()
{
    show();
    before_ = QApplication::focusWidget();
    lengthUnit_->setFocus(Qt::ShortcutFocusReason);
}

/// @return whether it uses the key up
bool UnitsBar::pressKey(int key, const QObject *box)
{
    const auto at = std::find(boxes_.begin(), boxes_.end(), box);
    if (key == Qt::Key_Escape && before_) {
        before_->setFocus(Qt::OtherFocusReason);
        before_.clear();
        return true;
    }
    if ((key == Qt::Key_Tab || key == Qt::Key_Backtab) && at != boxes_.end()) {
        const std::size_t number = static_cast<std::size_t>(at - boxes_.begin());
        const std::size_t step = key == Qt::Key_Tab ? 1 : boxes_.size() - 1;
        boxes_[(number + step) % boxes_.size()]->setFocus(Qt::TabFocusReason);
        return true;
    }
    return false;
}

bool UnitsBar::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::KeyPress && pressKey(static_cast<QKeyEvent *>(event)->key(), watched)) {
        return true;
    }
    if (event->type() == QEvent::Wheel && !static_cast<QWidget *>(watched)->hasFocus()) {
        event->ignore();
        return true;
    }
    return QToolBar::eventFilter(watched, event);
}

} // namespace kareport
