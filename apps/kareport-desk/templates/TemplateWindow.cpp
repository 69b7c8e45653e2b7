#include "TemplateWindow.h"

#include "AppMessageBox.h"
#include "FileDrops.h"
#include "PlainWidgets.h"
#include "TemplateFindBar.h"
#include "TemplatePage.h"
#include "TemplateTextEdit.h"
#include "TextDifference.h"
#include "Xlate.h"

#include <QApplication>
#include <QComboBox>
#include <QLabel>
#include <QStatusBar>
#include <QTextBlock>
#include <QTreeWidget>

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

/// The position of a place, whose columns count a surrogate pair once.
qsizetype positionOf(const QTextDocument &document, const TextPlace &place)
{
    const QTextBlock block = document.findBlockByNumber(
        static_cast<int>(std::clamp<qsizetype>(place.line - 1, 0, document.blockCount() - 1)));
    const QString text = block.text();
    qsizetype at = 0;
    for (qsizetype column = 1; column < place.column && at < text.size(); ++column) {
        at += text[at].isHighSurrogate() && at + 1 < text.size() ? 2 : 1;
    }
    return block.position() + at;
}

/// What a remark is about: a tag, or a word or value up to the next tag or the end of the line.
TextRange rangeOfRemark(const QString &text, qsizetype begin)
{
    const qsizetype line = text.indexOf(u'\n', begin);
    const qsizetype stop = line < 0 ? text.size() : line;
    if (begin >= stop) {
        return {std::max<qsizetype>(begin - 1, 0), begin};
    }
    qsizetype end = text.indexOf(text[begin] == u'<' ? u'>' : u'<', begin + 1);
    if (end >= 0 && text[begin] == u'<') {
        ++end;
    }
    return {begin, end < 0 || end > stop ? stop : end};
}

} // namespace

TemplateWindow::TemplateWindow()
    : now_(QDateTime::currentDateTime()),
      watch_([this](const QString &path) { fileChanged(path); }),
      dataWatch_([this](const QString & /*path*/) { setData(data_); })
{
    setAttribute(Qt::WA_DeleteOnClose);
    makeDialogs();
    makeBody();
    makeMenus();
    new FileDrops(*this, [this](const QStringList &files) { takeDropped(files); });
    constexpr int workingAfter = 60; // milliseconds: what takes longer is said
    workingTimer_.setSingleShot(true);
    workingTimer_.setInterval(workingAfter);
    connect(&workingTimer_, &QTimer::timeout, this, [this] { showMessage(Xlate("Working…")); });
    connect(edit_, &QPlainTextEdit::textChanged, this, [this] { textChanged(); });
    connect(edit_, &QPlainTextEdit::cursorPositionChanged, this, [this] { cursorMoved(); });
    connect(edit_, &QPlainTextEdit::modificationChanged, this, [this](bool on) { setWindowModified(on); });
    connect(remarkList_, &QTreeWidget::itemActivated, this, [this](QTreeWidgetItem *item) {
        const auto index = static_cast<std::size_t>(remarkList_->indexOfTopLevelItem(item));
        if (index < edit_->remarks().size()) {
            edit_->select(edit_->remarks()[index].range);
            edit_->setFocus(Qt::OtherFocusReason);
        }
    });
    connect(dataChoice_, &QComboBox::activated, this, [this](int index) { chooseData(index); });
    page_->chosen = [this](const PreviewCell &cell) {
        edit_->select(shifted(cell.target, pagesText_, edit_->wholeText()));
        edit_->setFocus(Qt::OtherFocusReason);
    };
}

TemplateWindow::~TemplateWindow()
{
    // The texts tell of changes until they are gone, and the program of the keyboard.
    edit_->disconnect(this);
    page_->disconnect(this);
    qApp->disconnect(this);
    worker_.reset();
}

void TemplateWindow::goTo(qsizetype line, qsizetype column)
{
    const qsizetype at = positionOf(*edit_->document(), {line, column});
    edit_->select({at, at});
    edit_->setFocus(Qt::OtherFocusReason);
}

void TemplateWindow::textChanged()
{
    if (!isLoading_) {
        requestPages();
    }
}

void TemplateWindow::requestPages()
{
    outlined_ = edit_->wholeText();
    outline_ = std::make_shared<TemplateOutline>(outlineOf(outlined_));
    const OutlineTemplate *here = outline_->templateAt(edit_->textCursor().position());
    templateName_->setText(here != nullptr ? here->name.text : QString());
    ++requested_;
    workingTimer_.start();
    worker_->show({requested_, outlined_, file_.bytesOf(outlined_), templateName_->text(), outline_});
}

void TemplateWindow::takeAnswer(PreviewWorker::Answer &answer)
{
    if (answer.number != requested_) {
        return; // a later one is on its way
    }
    if (answer.areRemarks) {
        checked_ = answer.number;
        showRemarks(answer.remarks);
        showPlace();
        return;
    }
    shown_ = answer.number;
    workingTimer_.stop();
    if (answer.result.pages) {
        pagesText_ = std::move(answer.text);
        page_->setPages(*std::move(answer.result.pages));
    }
    if (answer.dataProblem) {
        showMessage(Xlate("Sample rows are shown: %1").arg(answer.dataProblem->message()));
    } else if (answer.result.wrong) {
        showMessage(Xlate("The last pages that could be made are shown: %1").arg(answer.result.wrong->message()));
    } else {
        showMessage(QString());
    }
    for (const QString &file : answer.dataFiles) {
        if (!dataWatch_.isWatched(file)) {
            dataWatch_.watch(file);
        }
    }
    dataWatch_.retain(answer.dataFiles);
    cursorMoved();
}

void TemplateWindow::showMessage(const QString &text)
{
    message_->setText(text);
    message_->setVisible(!text.isEmpty());
}

void TemplateWindow::showRemarks(const std::vector<TemplateRemark> &remarks)
{
    std::vector<RemarkMark> marks;
    QList<QTreeWidgetItem *> items;
    for (const TemplateRemark &remark : remarks) {
        const TextRange range = rangeOfRemark(outlined_, positionOf(*edit_->document(), remark.place));
        marks.push_back({range, remark.isError, remark.text});
        QStringList cells;
        cells.append(QString::number(remark.place.line));
        cells.append(remark.isError ? Xlate("error") : Xlate("warning"));
        cells.append(remark.text);
        auto *item = new QTreeWidgetItem(cells);
        item->setToolTip(2, plainToolTip(remark.text));
        items.append(item);
    }
    const int current = remarkList_->indexOfTopLevelItem(remarkList_->currentItem());
    remarkList_->clear();
    remarkList_->addTopLevelItems(items);
    if (current >= 0) {
        remarkList_->setCurrentItem(remarkList_->topLevelItem(std::min(current, remarkList_->topLevelItemCount() - 1)));
    }
    edit_->setRemarks(std::move(marks));
}

/// A piece of one text in another one that was made of it: what lies in the change is cut off.
TextRange TemplateWindow::shifted(const TextRange &range, const QString &from, const QString &to) const
{
    if (from == to || !range.exists()) {
        return range;
    }
    const TextDifference change = differenceOf(from, to);
    const auto moved = [&change](qsizetype at) {
        if (at <= change.at) {
            return at;
        }
        const qsizetype end = change.at + change.removed;
        return at >= end ? at - change.removed + change.inserted.size() : change.at;
    };
    return {moved(range.begin), moved(range.end)};
}

void TemplateWindow::cursorMoved()
{
    showPlace();
    if (isLoading_ || worker_ == nullptr) {
        return;
    }
    const qsizetype position = edit_->textCursor().position();
    if (outlined_.size() + 1 != edit_->document()->characterCount()) {
        return; // the text has changed, and its outline follows in a moment
    }
    const OutlineTemplate *here = outline_->templateAt(position);
    const QString name = here != nullptr ? here->name.text : QString();
    if (data_.isSample() && name != templateName_->text()) {
        requestPages(); // another template of the file is looked at
        return;
    }
    const OutlineField *field = outline_->fieldAt(position);
    const TextRange element = field != nullptr ? field->element : TextRange();
    edit_->setField(element);
    page_->mark(shifted(element, outlined_, pagesText_));
}

void TemplateWindow::showPlace()
{
    const QTextCursor cursor = edit_->textCursor();
    place_->setText(Xlate("Line %1, column %2")
                        .arg(QString::number(cursor.blockNumber() + 1), QString::number(cursor.positionInBlock() + 1)));
    const RemarkMark *remark = edit_->remarkAt(cursor.position());
    if (remark != nullptr) {
        statusBar()->showMessage(remark->text);
    } else {
        statusBar()->clearMessage();
    }
}

void TemplateWindow::stepRemark(int step)
{
    const std::vector<RemarkMark> &remarks = edit_->remarks();
    if (remarks.empty()) {
        return;
    }
    const qsizetype at = edit_->textCursor().selectionStart();
    const RemarkMark *next = nullptr;
    if (step > 0) {
        const auto found = std::find_if(remarks.begin(), remarks.end(),
                                        [at](const RemarkMark &remark) { return remark.range.begin > at; });
        next = found != remarks.end() ? &*found : &remarks.front();
    } else {
        const auto found = std::find_if(remarks.rbegin(), remarks.rend(),
                                        [at](const RemarkMark &remark) { return remark.range.begin < at; });
        next = found != remarks.rend() ? &*found : &remarks.back();
    }
    const TextRange range = next->range;
    edit_->select(range);
}

void TemplateWindow::carryOut(const EditedTemplate &edited)
{
    if (!edited.problem.isEmpty()) {
        AppMessageBox(edited.problem);
        return;
    }
    edit_->replaceBy(edited.text, edited.selection);
    edit_->setFocus(Qt::OtherFocusReason);
}

void TemplateWindow::renameVariable()
{
    const QString text = edit_->wholeText();
    const qsizetype position = edit_->textCursor().position();
    const auto use = variableAt(*outline_, position);
    if (!use) {
        return; // the command is disabled then
    }
    if (const auto name = askNewName(use->name); name && *name != use->name) {
        carryOut(withRenamedVariable(text, position, *name));
    }
}

} // namespace kareport
