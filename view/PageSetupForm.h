#pragma once

#include "KaReportExport.h"

#include <QMargins>
#include <QSizeF>
#include <QString>
#include <QStringList>
#include <QWidget>

#include <array>
#include <functional>

class QComboBox;
class QDoubleSpinBox;
class QLabel;
class QRadioButton;

namespace kareport
{

/// What a page is set up with.
struct PageSetup
{
    QMargins margins; ///< hundredths of a millimetre
    bool portrait = true;
    QString printer;                                ///< empty for the built-in page device
    QStringList printers;                           ///< to choose from
    std::function<QSizeF(const QString &)> sheetOf; ///< the upright sheet of a printer in millimetres
};

/// Asks for paper orientation, margins and, where there are several, the printer.
class KAREPORT_EXPORT PageSetupForm : public QWidget
{
public:
    explicit PageSetupForm(const PageSetup &setup, QWidget *parent = nullptr);

    /// What the user has chosen; the rest as it was given.
    PageSetup setup() const;
    /// Whether the margins leave room for text. Where they do not, the form says so and leads to them.
    bool confirm();

private:
    bool leavesRoom() const;
    void showSheet();
    void checkMargins();

    PageSetup setup_;
    QRadioButton *portrait_;
    QRadioButton *landscape_;
    QComboBox *printer_;
    QLabel *sheet_;
    QLabel *warning_;
    std::array<QDoubleSpinBox *, 4> margins_ = {}; ///< left, top, right, bottom
};

} // namespace kareport
