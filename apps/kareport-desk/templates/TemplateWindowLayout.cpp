// What the window of a template consists of.
#include "Folders.h"
#include "OpenTemplate.h"
#include "PlainWidgets.h"
#include "ReportEntry.h"
#include "TemplateFindBar.h"
#include "TemplatePage.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"
#include "Xlate.h"

#include <QAction>
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
#include <QMenu>
#include <QMenuBar>
#include <QScreen>
#include <QSplitter>
#include <QStatusBar>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace kareport
{

namespace
{

/// Adds a command to a menu. What follows a tab in the text is its key.
template <typename Act>
QAction *addCommand(QWidget &window, QMenu &menu, const QString &text, Act act)
{
    const QStringList parts = text.split(u'\t');
    QAction *action = menu.addAction(parts.first());
    if (parts.size() > 1) {
        action->setShortcut(QKeySequence(parts.last()));
    }
    QObject::connect(action, &QAction::triggered, &window, act);
    return action;
}

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

void TemplateWindow::makeMenus()
{
    addFileMenu();
    addEditMenu();
    addInsertMenu();
    addViewMenu();
}

void TemplateWindow::addFileMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&File"));
    addCommand(*this, menu, Xlate("&Open...\tCtrl+O"), [this] {
        if (const auto path = askOpen()) {
            openAnyFile(*path);
        }
    });
    addCommand(*this, menu, Xlate("&Save\tCtrl+S"), [this] { save(); });
    addCommand(*this, menu, Xlate("Save &As...\tCtrl+Shift+S"), [this] { saveAs(); });
    menu.addSeparator();
    addCommand(*this, menu, Xlate("Choose &Data...\tCtrl+D"), [this] { browseData(); });
    menu.addSeparator();
    addCommand(*this, menu, Xlate("&Close\tCtrl+W"), [this] { close(); });
}

void TemplateWindow::addEditMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&Edit"));
    QAction *undo = addCommand(*this, menu, Xlate("&Undo\tCtrl+Z"), [this] { edit_->undo(); });
    QAction *redo = addCommand(*this, menu, Xlate("&Redo\tCtrl+Shift+Z"), [this] { edit_->redo(); });
    undo->setEnabled(false);
    redo->setEnabled(false);
    connect(edit_, &QPlainTextEdit::undoAvailable, undo, &QAction::setEnabled);
    connect(edit_, &QPlainTextEdit::redoAvailable, redo, &QAction::setEnabled);
    menu.addSeparator();
    QAction *cut = addCommand(*this, menu, Xlate("Cu&t\tCtrl+X"), [this] { edit_->cut(); });
    QAction *copy = addCommand(*this, menu, Xlate("&Copy\tCtrl+C"),
                               [this] { (page_->hasFocus() ? static_cast<QPlainTextEdit *>(page_) : edit_)->copy(); });
    cut->setEnabled(false);
    connect(edit_, &QPlainTextEdit::copyAvailable, cut, &QAction::setEnabled);
    copy->setEnabled(true);
    addCommand(*this, menu, Xlate("&Paste\tCtrl+V"), [this] { edit_->paste(); });
    addCommand(*this, menu, Xlate("Select &All\tCtrl+A"),
               [this] { (page_->hasFocus() ? static_cast<QPlainTextEdit *>(page_) : edit_)->selectAll(); });
    menu.addSeparator();
    addCommand(*this, menu, Xlate("&Find and Replace...\tCtrl+F"), [this] { findBar_->open(); });
    addCommand(*this, menu, Xlate("Find &Next\tF3"), [this] { findBar_->findNext(); });
    addCommand(*this, menu, Xlate("Find Pre&vious\tShift+F3"), [this] { findBar_->findPrevious(); });
    menu.addSeparator();
    addCommand(*this, menu, Xlate("C&omplete\tCtrl+Space"), [this] { edit_->complete(true); });
    addCommand(*this, menu, Xlate("Rena&me Variable...\tF2"), [this] { renameVariable(); });
}

void TemplateWindow::addInsertMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&Insert"));
    const auto here = [this] { return static_cast<qsizetype>(edit_->textCursor().position()); };
    addCommand(*this, menu, Xlate("&Field\tCtrl+Shift+F"),
               [this, here] { carryOut(withField(edit_->wholeText(), here())); });
    addCommand(*this, menu, Xlate("&Table\tCtrl+Shift+T"),
               [this, here] { carryOut(withOutput(edit_->wholeText(), here(), true)); });
    addCommand(*this, menu, Xlate("&Block\tCtrl+Shift+B"),
               [this, here] { carryOut(withOutput(edit_->wholeText(), here(), false)); });
    addCommand(*this, menu, Xlate("&Dictionary\tCtrl+Shift+D"),
               [this, here] { carryOut(withDictionary(edit_->wholeText(), here())); });
}

void TemplateWindow::addViewMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&View"));
    addCommand(*this, menu, Xlate("&Next Remark\tF8"), [this] { stepRemark(1); });
    addCommand(*this, menu, Xlate("&Previous Remark\tShift+F8"), [this] { stepRemark(-1); });
    menu.addSeparator();
    addCommand(*this, menu, Xlate("Text, &Pages, Remarks\tF6"), [this] { turnFocus(); });
    menu.addSeparator();
    const auto zoom = [this](int step) {
        edit_->zoomIn(step);
        page_->zoomIn(step);
    };
    addCommand(*this, menu, Xlate("Zoom &In\tCtrl++"), [zoom] { zoom(1); });
    addCommand(*this, menu, Xlate("Zoom &Out\tCtrl+-"), [zoom] { zoom(-1); });
}

/// Gives the keyboard to the next part of the window: a tab is a character of the text.
void TemplateWindow::turnFocus()
{
    QWidget *next = edit_;
    if (edit_->hasFocus()) {
        next = page_;
    } else if (page_->hasFocus()) {
        next = remarkList_;
    }
    next->setFocus(Qt::TabFocusReason);
}

} // namespace kareport
