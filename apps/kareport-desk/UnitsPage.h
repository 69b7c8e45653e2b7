#pragma once

#include "UJobSettings.h"

#include <QWidget>

#include <array>

class QCheckBox;
class QComboBox;
class QFormLayout;
class QLabel;
class QLayout;
class QLineEdit;
class QSpinBox;

namespace kareport
{

/// Asks for units and formats, and shows at once what values look like in them.
class UnitsPage : public QWidget
{
public:
    explicit UnitsPage(const UJobSettings &settings, QWidget *parent = nullptr);

    UJobSettings settings() const;

private:
    void addFields(QFormLayout &form);
    QLayout *makeMarks(const UJobSettings &settings);
    QWidget *makeSampleBox();
    void nameFields();
    void followFields();
    void showSamples();

    QComboBox *lengthUnit_;
    QSpinBox *lengthDecimals_;
    QComboBox *areaUnit_;
    QComboBox *angleUnit_;
    QSpinBox *numberDecimals_;
    QComboBox *stationFormat_;
    QSpinBox *stationDecimals_;
    QComboBox *northEastOrder_;
    QComboBox *bearingUnit_;
    QSpinBox *bearingDecimals_;
    QComboBox *bearingStyle_;
    QComboBox *bearingReference_;
    QCheckBox *bearingPadding_;
    QLabel *marksLabel_;
    std::array<QLineEdit *, 3> angleMarks_ = {};
    QLabel *samples_;
};

} // namespace kareport
