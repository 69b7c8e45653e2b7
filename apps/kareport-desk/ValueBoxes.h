#pragma once

#include <QComboBox>
#include <QSignalBlocker>
#include <QSpinBox>
#include <QString>

#include <initializer_list>
#include <utility>

namespace kareport
{

/// The most decimals that lengths, numbers and stations are shown with.
constexpr int mostDecimals = 15;

/// A list of choices, each with the value that it means.
template <typename Value>
QComboBox *choice(std::initializer_list<std::pair<Value, QString>> items)
{
    auto *box = new QComboBox;
    for (const auto &[value, text] : items) {
        box->addItem(text, static_cast<int>(value));
    }
    return box;
}

/// The value that was chosen.
template <typename Value>
Value chosenIn(const QComboBox &box)
{
    return static_cast<Value>(box.currentData().toInt());
}

/// Shows a value as if it had been chosen, without a signal.
template <typename Value>
void display(QComboBox &box, Value value)
{
    const QSignalBlocker blocker(box);
    box.setCurrentIndex(box.findData(static_cast<int>(value)));
}

/// The same of a number.
inline void display(QSpinBox &box, int value)
{
    const QSignalBlocker blocker(box);
    box.setValue(value);
}

/// A number of decimals, from 0.
inline QSpinBox *decimals(int most)
{
    auto *box = new QSpinBox;
    box->setRange(0, most);
    return box;
}

} // namespace kareport
