#pragma once

#include "UJobSettings.h"

#include <QJsonObject>
#include <QPointer>
#include <QToolBar>

#include <functional>
#include <optional>
#include <vector>

class QComboBox;
class QSpinBox;

namespace kareport
{

/// A bar that shows the units and formats of the report in front and chooses others for it.
class UnitsBar : public QToolBar
{
public:
    explicit UnitsBar(QWidget *parent);

    /// Shows settings; nothing disables the bar. The handler is not called.
    void showSettings(const std::optional<UJobSettings> &settings);
    /// Called when the user has chosen something. @param changed  the keys of a job's settings that are different now
    void setChosenHandler(std::function<void(const QJsonObject &changed)> handler) { chosen_ = std::move(handler); }
    /// Shows the bar and gives it the keyboard. Escape gives it back.
    void takeFocus();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    template <typename Widget>
    Widget *add(Widget *widget, const QString &name);
    UJobSettings chosenSettings() const;
    void noteChosen();
    bool pressKey(int key, const QObject *box);

    UJobSettings settings_; ///< that are shown, with those that the bar does not show
    QComboBox *lengthUnit_;
    QSpinBox *lengthDecimals_;
    QComboBox *areaUnit_;
    QComboBox *angleUnit_;
    QSpinBox *numberDecimals_;
    QComboBox *stationFormat_;
    QSpinBox *stationDecimals_;
    QComboBox *northEastOrder_;
    std::vector<QWidget *> boxes_; ///< in their order
    QPointer<QWidget> before_;     ///< had the keyboard before the bar took it
    std::function<void(const QJsonObject &)> chosen_;
};

} // namespace kareport
