// What the window of a template consists of.
#include "Folders.h"
#include "PlainWidgets.h"
#include "ReportEntry.h"
#include "TemplateFindBar.h"
#include "TemplatePage.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"
#include "Xlate.h"

#include <QComboBox>
#include <QDialog>
#include <QDialogButtonBox>
#include <QFileDialog>
#include <QFormLayout>
#include <QGuiApplication>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QScreen>
#include <QSplitter>
#include <QStatusBar>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace kareport
{

namespace
{

std::optional<QString> chosen(const QString &path)
{
    return path.isEmpty() ? std::nullopt : std::optional(path);
}

/// Asks for the new name of a variable.
std::optional<QString> askName(QWidget *parent, const QString &name)
{
    QDialog dialog(parent);
    dialog.setWindowTitle(Xlate("Rename Variable"));
    auto *field = new QLineEdit(name);
    field->setAccessibleName(Xlate("New name"));
    field->selectAll();
    auto *label = plainLabel(Xlate("&New name of \"%1\":").arg(plainMenuText(name)));
    label->setBuddy(field);
    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    auto *layout = new QVBoxLayout(&dialog);
    layout->addWidget(label);
    layout->addWidget(field);
    layout->addWidget(buttons);
    constexpr int usualWidth = 360;
    dialog.resize(usualWidth, dialog.sizeHint().height());
    QObject::connect(buttons, &QDialogButtonBox::accepted, &dialog, &QDialog::accept);
    QObject::connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    return dialog.exec() == QDialog::Accepted ? std::optional(field->text()) : std::nullopt;
}

} // namespace

void TemplateWindow::makeDialogs()
{
    askData = [this] {
        return chosen(QFileDialog::getOpenFileName(this, Xlate("Choose a job or a data file"), path_,
                                                   Xlate("Jobs and data (*.json *.csv *.txt)") + QStringLiteral(";;") +
                                                       Xlate("All files (*)")));
    };
    askOpen = [this] {
        return chosen(QFileDialog::getOpenFileName(this, Xlate("Open"), path_,
                                                   Xlate("Reports, jobs and templates (*.rep *.rtf *.json *.xml)") +
                                                       QStringLiteral(";;") + Xlate("All files (*)")));
    };
    askSaveName = [this] {
        return chosen(
            QFileDialog::getSaveFileName(this, Xlate("Save As"), path_, Xlate("Templates (*.xml);;All files (*)")));
    };
    askNewName = [this](const QString &name) { return askName(this, name); };
}

void TemplateWindow::makeBody()
{
    auto *halves = new QSplitter(Qt::Horizontal);
    halves->addWidget(makeTextHalf());
    halves->addWidget(makePageHalf());
    halves->setChildrenCollapsible(false);
    setCentralWidget(halves);
    templateName_ = plainLabel();
    templateName_->setAccessibleName(Xlate("Template"));
    place_ = plainLabel();
    statusBar()->addPermanentWidget(templateName_);
    statusBar()->addPermanentWidget(place_);
    constexpr QSize usualSize(1280, 800);
    resize(usualSize.boundedTo(QGuiApplication::primaryScreen()->availableSize()));
    halves->setSizes({width() / 2, width() / 2});
    edit_->setFocus();
}

/// The text of the template with its find bar, above the remarks on it.
QWidget *TemplateWindow::makeTextHalf()
{
    edit_ = new TemplateTextEdit;
    findBar_ = new TemplateFindBar(*edit_);
    remarkList_ = new QTreeWidget;
    remarkList_->setAccessibleName(Xlate("Remarks on the template"));
    remarkList_->setColumnCount(3);
    QStringList columns;
    columns.append(Xlate("Line"));
    columns.append(Xlate("Kind"));
    columns.append(Xlate("Remark"));
    remarkList_->setHeaderLabels(columns);
    remarkList_->setRootIsDecorated(false);
    remarkList_->setUniformRowHeights(true);
    remarkList_->header()->setSectionResizeMode(0, QHeaderView::ResizeToContents);
    remarkList_->header()->setSectionResizeMode(1, QHeaderView::ResizeToContents);

    auto *text = new QWidget;
    auto *layout = new QVBoxLayout(text);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(edit_, 1);
    layout->addWidget(findBar_);
    auto *half = new QSplitter(Qt::Vertical);
    half->addWidget(text);
    half->addWidget(remarkList_);
    half->setStretchFactor(0, 4);
    half->setStretchFactor(1, 1);
    return half;
}

/// The first pages of the report, below the choice of their data.
QWidget *TemplateWindow::makePageHalf()
{
    constexpr int gap = 6;
    page_ = new TemplatePage;
    dataChoice_ = new QComboBox;
    dataChoice_->setAccessibleName(Xlate("Data of the pages"));
    dataChoice_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    constexpr int leastLetters = 16;
    dataChoice_->setMinimumContentsLength(leastLetters);
    auto *dataLabel = plainLabel(Xlate("&Data:"));
    dataLabel->setBuddy(dataChoice_);
    message_ = plainLabel();
    message_->setObjectName(QStringLiteral("message"));
    message_->setAccessibleName(Xlate("State of the pages"));
    message_->setWordWrap(true);
    message_->setMargin(gap);
    message_->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    message_->hide();
    auto *half = new QWidget;
    auto *layout = new QVBoxLayout(half);
    auto *row = new QHBoxLayout;
    row->setContentsMargins(gap, gap, gap, 0);
    row->addWidget(dataLabel);
    row->addWidget(dataChoice_, 1);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addLayout(row);
    layout->addWidget(message_);
    layout->addWidget(page_, 1);
    return half;
}

} // namespace kareport
