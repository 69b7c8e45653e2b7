#include "PreferencesDialog.h"

#include "DefaultPrinter.h"
#include "EditorPage.h"
#include "PageMeasurement.h"
#include "PageSetupForm.h"
#include "ReportPrinter.h"
#include "UnitsPage.h"
#include "Xlate.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QPageSize>
#include <QSpinBox>
#include <QTabWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr int leastFontSize = 4;
constexpr int mostFontSize = 72;

PageSetupForm *makePageForm(const DeskPreferences &preferences)
{
    // A printer is chosen when a report is printed.
    PageSetup setup;
    setup.sheetsOf = [](const QString &) {
        DefaultPrinter own = defaultPrinter();
        own.sheet = QSize();
        const QPageSize usual = builtInSheet(own);
        std::vector<PageSheet> sheets = usualSheets(usual);
        sheets.push_back(sheets.front());
        sheets.front().name = Xlate("Of the printer, else of the country (%1)").arg(usual.name());
        std::rotate(sheets.begin() + 1, sheets.end() - 1, sheets.end());
        return sheets;
    };
    setup.sheet = preferences.paper;
    setup.inInches = preferences.inInches;
    setup.margins = preferences.margins;
    setup.portrait = preferences.portrait;
    return new PageSetupForm(setup);
}

} // namespace

PreferencesDialog::PreferencesDialog(const DeskPreferences &preferences, QWidget *parent)
    : QDialog(parent),
      tabs_(new QTabWidget),
      units_(new UnitsPage(preferences.settings)),
      fontSize_(new QSpinBox),
      unit_(new QComboBox),
      page_(makePageForm(preferences)),
      editor_(new EditorPage(preferences.usesEditor, preferences.editor, preferences.keepsForEditor)),
      language_(new QComboBox),
      reportWindows_(new QCheckBox(Xlate("&Keep the report window when a job is done"))),
      session_(new QCheckBox(Xlate("Open at the &start what was open at the end")))
{
    setWindowTitle(Xlate("Preferences"));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);

    tabs_->addTab(units_, Xlate("&Units and Formats"));
    tabs_->addTab(makePageTab(preferences), Xlate("&Page"));
    tabs_->addTab(editor_, Xlate("&Editor"));
    tabs_->addTab(makeProgramTab(preferences), Xlate("Pro&gram"));

    auto *layout = new QVBoxLayout(this);
    layout->addWidget(tabs_);
    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    connect(buttons, &QDialogButtonBox::accepted, this, &PreferencesDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &PreferencesDialog::reject);
    layout->addWidget(buttons);
}

QWidget *PreferencesDialog::makePageTab(const DeskPreferences &preferences)
{
    fontSize_->setRange(leastFontSize, mostFontSize);
    fontSize_->setSuffix(Xlate(" pt"));
    fontSize_->setValue(static_cast<int>(preferences.fontSize));
    fontSize_->setAccessibleName(Xlate("Font size"));
    unit_->addItem(Xlate("Millimetres"), false);
    unit_->addItem(Xlate("Inches"), true);
    unit_->setCurrentIndex(preferences.inInches ? 1 : 0);
    unit_->setAccessibleName(Xlate("Unit of margins"));
    connect(unit_, &QComboBox::currentIndexChanged, page_,
            [this] { page_->showInInches(unit_->currentData().toBool()); });

    auto *tab = new QWidget;
    auto *layout = new QVBoxLayout(tab);
    auto *rows = new QFormLayout;
    rows->setFieldGrowthPolicy(QFormLayout::FieldsStayAtSizeHint);
    rows->addRow(Xlate("&Font size of new reports:"), fontSize_);
    rows->addRow(Xlate("Unit of &margins:"), unit_);
    layout->addLayout(rows);
    layout->addWidget(page_);
    layout->addStretch();
    return tab;
}

QWidget *PreferencesDialog::makeProgramTab(const DeskPreferences &preferences)
{
    language_->addItem(Xlate("As the system"), QString());
    language_->addItem(QStringLiteral("English"), QStringLiteral("en"));
    language_->addItem(QStringLiteral("Deutsch"), QStringLiteral("de"));
    language_->addItem(QStringLiteral("日本語"), QStringLiteral("ja"));
    language_->setCurrentIndex(qMax(0, language_->findData(preferences.language)));
    language_->setAccessibleName(Xlate("Language"));
    reportWindows_->setChecked(preferences.keepsReportWindows);
    session_->setChecked(preferences.restoresSession);

    auto *tab = new QWidget;
    auto *rows = new QFormLayout(tab);
    rows->setFieldGrowthPolicy(QFormLayout::FieldsStayAtSizeHint);
    rows->addRow(Xlate("&Language (from the next start):"), language_);
    rows->addRow(session_);
    rows->addRow(reportWindows_);
    return tab;
}

DeskPreferences PreferencesDialog::preferences() const
{
    DeskPreferences preferences;
    preferences.settings = units_->settings();
    preferences.fontSize = static_cast<unsigned>(fontSize_->value());
    const PageSetup page = page_->setup();
    preferences.margins = page.margins;
    preferences.portrait = page.portrait;
    preferences.paper = page.sheet;
    preferences.inInches = page.inInches;
    preferences.usesEditor = editor_->usesEditor();
    preferences.editor = editor_->editor();
    preferences.keepsForEditor = editor_->keepsReports();
    preferences.language = language_->currentData().toString();
    preferences.keepsReportWindows = reportWindows_->isChecked();
    preferences.restoresSession = session_->isChecked();
    return preferences;
}

void PreferencesDialog::accept()
{
    constexpr int pageTab = 1;
    constexpr int editorTab = 2;
    if (!page_->confirm()) {
        tabs_->setCurrentIndex(pageTab);
    } else if (!editor_->confirm()) {
        tabs_->setCurrentIndex(editorTab);
    } else {
        QDialog::accept();
    }
}

} // namespace kareport
