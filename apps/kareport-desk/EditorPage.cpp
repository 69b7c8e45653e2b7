#include "EditorPage.h"

#include "EditorKind.h"
#include "InstalledEditors.h"
#include "PlainWidgets.h"
#include "Xlate.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFileDialog>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace kareport
{

EditorPage::EditorPage(bool usesEditor, const QString &editor, bool keepsReports, QWidget *parent)
    : QWidget(parent),
      uses_(new QCheckBox(Xlate("&Show reports in this program:"))),
      editor_(new QComboBox),
      browse_(new QPushButton(Xlate("Bro&wse..."))),
      keeps_(new QCheckBox(Xlate("&Keep a report open while the program is"))),
      kind_(plainLabel())
{
    keeps_->setChecked(keepsReports);
    uses_->setChecked(usesEditor);
    editor_->setEditable(true);
    editor_->setInsertPolicy(QComboBox::NoInsert);
    editor_->setAccessibleName(Xlate("Program that shows reports"));
    for (const InstalledEditor &installed : installedEditors()) {
        editor_->addItem(installed.name, installed.path);
        editor_->setItemData(editor_->count() - 1, plainToolTip(installed.path), Qt::ToolTipRole);
    }
    editor_->setEditText(editor);
    kind_->setWordWrap(true);
    kind_->setObjectName(QStringLiteral("kind"));

    auto *row = new QHBoxLayout;
    row->addWidget(editor_, 1);
    row->addWidget(browse_);
    auto *layout = new QVBoxLayout(this);
    layout->addWidget(uses_);
    layout->addLayout(row);
    layout->addWidget(keeps_);
    layout->addWidget(kind_);
    layout->addStretch();

    // The list shows names; what is kept, and shown in the field, is the program's path.
    connect(editor_, &QComboBox::activated, this,
            [this](int index) { editor_->setEditText(editor_->itemData(index).toString()); });
    connect(editor_, &QComboBox::editTextChanged, this, &EditorPage::showKind);
    connect(browse_, &QPushButton::clicked, this, &EditorPage::browse);
    connect(uses_, &QCheckBox::toggled, this, &EditorPage::showKind);
    showKind();
}

bool EditorPage::usesEditor() const
{
    return uses_->isChecked();
}

bool EditorPage::keepsReports() const
{
    return keeps_->isChecked();
}

QString EditorPage::editor() const
{
    return editor_->currentText().trimmed();
}

bool EditorPage::confirm()
{
    const QFileInfo program(editor());
    if (!usesEditor() || (program.isAbsolute() && program.isFile() && program.isExecutable())) {
        return true;
    }
    kind_->setText(editor().isEmpty()
                       ? Xlate("Choose a program, or clear the box above.")
                       : Xlate("There is no program \"%1\". Choose one from the list, or with Browse.").arg(editor()));
    editor_->setFocus();
    return false;
}

void EditorPage::browse()
{
    const QString start = editor().isEmpty() ? programsFolder() : editor();
    const QString program = QFileDialog::getOpenFileName(this, Xlate("Choose a program"), start);
    if (!program.isEmpty()) {
        editor_->setEditText(program);
    }
}

void EditorPage::showKind()
{
    editor_->setEnabled(uses_->isChecked());
    browse_->setEnabled(uses_->isChecked());
    keeps_->setEnabled(uses_->isChecked());
    if (!uses_->isChecked()) {
        kind_->setText(Xlate("Reports are shown in their own window."));
    } else if (editorKind(editor(), false) == EditorKind::WordProcessor) {
        kind_->setText(Xlate("It gets reports as rich text."));
    } else {
        kind_->setText(Xlate("It gets reports as plain text."));
    }
}

} // namespace kareport
