#pragma once

#include "DeskPreferences.h"

#include <QDialog>

class QCheckBox;
class QComboBox;
class QSpinBox;
class QTabWidget;

namespace kareport
{

class EditorPage;
class PageSetupForm;
class UnitsPage;

/// Asks for the settings of all reports.
class PreferencesDialog : public QDialog
{
public:
    explicit PreferencesDialog(const DeskPreferences &preferences, QWidget *parent = nullptr);

    DeskPreferences preferences() const;
    void accept() override;

private:
    QWidget *makePageTab(const DeskPreferences &preferences);
    QWidget *makeProgramTab(const DeskPreferences &preferences);

    QTabWidget *tabs_;
    UnitsPage *units_;
    QSpinBox *fontSize_;
    QComboBox *unit_;
    PageSetupForm *page_;
    EditorPage *editor_;
    QComboBox *language_;
    QCheckBox *reportWindows_;
    QCheckBox *session_;
};

} // namespace kareport
