#include "ModelledReport.h"

#include <QTextBlock>

QString ModelledReport::inkOf(QString text)
{
    return text.remove(u'\r').remove(u'\n').remove(u' ');
}

ModelledReport::ModelledReport(QString &clipboard)
    : template_(shown_.report), model_(headerOf(QStringLiteral("Title"), 0).chopped(3)), clip_(clipboard)
{
    shown_.report.FixPage(9, 80);
    model_.setLinesPerPage(9);
    openView(false);
}

namespace
{

/// Whether a step writes at the end of a report.
bool writes(const ReportStep &step)
{
    return step.op <= ReportOp::Heading || step.op == ReportOp::Load ||
           (step.op == ReportOp::WriteUnseen && step.b % 3 != 0);
}

} // namespace

QString ModelledReport::carryOut(const ReportStep &step)
{
    const QString textBefore = model_.text();
    const std::vector<qint64> startsBefore = model_.starts();
    const bool isUser = step.op >= ReportOp::Type && step.op <= ReportOp::TakeAll;
    const bool wasRich = isRich_;
    editsSeen_ = 0;
    isUser ? actAsUser(step) : step.op >= ReportOp::HidePane ? actOnPanes(step) : actAsHost(step);
    if (wasRich && isRich_ && writes(step)) {
        image_ += model_.text().sliced(textBefore.size()); // what hosts write goes into the image as well
    }
    QString wrong = compare();
    if (wrong.isEmpty() && step.op == ReportOp::Undo && canUndoExactly_ && editsSeen_ > 0 &&
        model_.text() == beforeEdit_ && model_.starts() != startsBeforeEdit_)
    {
        wrong = QStringLiteral("undone: pages %1 and not %2").arg(joined(model_.starts()), joined(startsBeforeEdit_));
    }
    canUndoExactly_ = isUser && step.op != ReportOp::Undo && step.op != ReportOp::Redo &&
                      step.op != ReportOp::TakeAll && editsSeen_ == 1;
    beforeEdit_ = textBefore;
    startsBeforeEdit_ = startsBefore;
    return wrong;
}

QString ModelledReport::compare()
{
    const QString text = model_.text();
    const QString wrong = compareReport(text);
    return wrong.isEmpty() ? compareViews(text) : wrong;
}

ModelledReport::Shown *ModelledReport::visibleView(int number)
{
    std::vector<Shown *> visible;
    for (Shown &shown : views_) {
        if (!shown.isHidden) {
            visible.push_back(&shown);
        }
    }
    return visible.empty() ? nullptr : visible[std::size_t(number) % visible.size()];
}

void ModelledReport::tellViews()
{
    report().UpdateAllViews(nullptr, 0, nullptr);
    for (Shown &shown : views_) {
        shown.isStale = false;
        shown.isEdited = false;
    }
}

QString ModelledReport::line(int seed)
{
    static const QStringList lines = {QString(),
                                      QStringLiteral("a"),
                                      QStringLiteral("12.345  67.890"),
                                      QStringLiteral("  "),
                                      QStringLiteral("\u2126 ohm"),
                                      QStringLiteral("two\r\nlines"),
                                      QStringLiteral("\r\n"),
                                      headerOf(QString(), 7)};
    return lines[seed % lines.size()];
}

QString ModelledReport::data(int seed)
{
    QString text;
    for (int i = 0; i < seed % 23; ++i) {
        text += line(seed / 7 + i * 3) + (seed % 5 == 1 ? QStringLiteral("\n") : QStringLiteral("\r\n"));
    }
    return seed % 3 == 0 ? text + QStringLiteral("end") : text;
}

bool ModelledReport::writeAsHost(const ReportStep &step)
{
    switch (step.op) {
    case ReportOp::WriteLine: {
        const int before = step.a % 4 - 1;
        const int after = step.b % 12 == 11 ? 30 : step.b % 4;
        report().WriteLine(line(step.c), before, after, step.c % 4);
        model_.writeLine(line(step.c), before, after);
        isModified_ = true;
        break;
    }
    case ReportOp::Write:
        report().Write(line(step.c), 0);
        model_.write(line(step.c));
        isModified_ = isModified_ || !line(step.c).isEmpty();
        break;
    case ReportOp::LineFeed: {
        const int count = step.a % 8 == 7 ? 25 : step.a % 5 - 1;
        report().LineFeed(count);
        model_.lineFeed(count);
        isModified_ = isModified_ || count > 0;
        break;
    }
    case ReportOp::NewPage: {
        const int needed = step.a % 2 == 0 ? -1 : step.b % 12;
        const qint64 before = model_.size();
        const bool isNew = report().NewPage(needed);
        wrongAnswer_ = wrongAnswer_ || isNew != model_.newPage(needed);
        isModified_ = isModified_ || model_.size() > before || (isNew && report().GetHeaderFlag());
        break;
    }
    case ReportOp::Rows:
        for (int i = 0; i < step.a % 15; ++i) {
            const QString row = QStringLiteral("%1  %2").arg(i, 4).arg(i * 1.25);
            report().WriteLine(row, 0, 1, 0);
            model_.writeLine(row, 0, 1);
            isModified_ = true;
        }
        break;
    case ReportOp::Table:
    case ReportOp::Block: {
        const qint64 before = model_.size();
        const bool isWritten =
            step.op == ReportOp::Table ? template_.writeTable(model_, step) : template_.writeBlock(model_, step);
        wrongAnswer_ = wrongAnswer_ || !isWritten;
        isModified_ = isModified_ || model_.size() > before;
        break;
    }
    default: return false;
    }
    return true;
}

/// Changes how the report is written. @return false for any other step
bool ModelledReport::setUpAsHost(const ReportStep &step)
{
    switch (step.op) {
    case ReportOp::Heading: {
        const QString heading = line(step.c % 7);
        report().SetHeading(heading, step.a % 3, step.b % 3);
        model_.setHeading(heading, step.a % 3, step.b % 3);
        if (step.c % 2 == 0) {
            report().WriteHeading();
            model_.writeHeading();
            isModified_ = true;
        }
        break;
    }
    case ReportOp::HeaderFlag:
        report().SetHeaderFlag(step.a % 2 == 0);
        model_.setHeaderFlag(step.a % 2 == 0);
        break;
    case ReportOp::LinesPerPage: {
        const int lines = step.a % 12 + 1;
        report().FixPage(lines, 80);
        model_.setLinesPerPage(lines);
        break;
    }
    default: return false;
    }
    return true;
}

/// Opens and closes views, and saves what changes no view. @return false for any other step
bool ModelledReport::actUnseen(const ReportStep &step)
{
    switch (step.op) {
    case ReportOp::RichText: actInRichText(step); break;
    case ReportOp::SaveAlone: saveAlone(); break;
    case ReportOp::SaveRichText: saveRichText(); break;
    case ReportOp::OpenView:
        if (views_.size() < 3) {
            openView(step.b % 2 == 0);
        }
        break;
    case ReportOp::CloseView:
        if (views_.size() > 1) {
            shown_.close(std::size_t(step.a) % views_.size());
            views_.erase(views_.begin() + step.a % static_cast<int>(views_.size()));
        }
        break;
    default: return false;
    }
    return true;
}

void ModelledReport::actAsHost(const ReportStep &step)
{
    if (actUnseen(step)) {
        return;
    }
    switch (step.op) {
    case ReportOp::SetData:
        report().SetData(data(step.c));
        model_.setData(data(step.c));
        break;
    case ReportOp::Clear:
        report().Clear();
        model_.clear();
        image_.clear();
        isModified_ = true;
        break;
    case ReportOp::RichTextOn: switchOn(); break;
    case ReportOp::RichTextOff: switchOff(); break;
    case ReportOp::Load: load(step); break;
    case ReportOp::Open: openSaved(); break;
    case ReportOp::ReloadRichText: reloadRichText(step); break;
    case ReportOp::Reload: reload(); break;
    default:
        if (!setUpAsHost(step) && !writeAsHost(step)) {
            return;
        }
    }
    tellViews();
}

void ModelledReport::actOnPanes(const ReportStep &step)
{
    Shown &shown = views_[std::size_t(step.a) % views_.size()];
    switch (step.op) {
    case ReportOp::HidePane:
        shown.isHidden = true;
        shown.view->GetParentPane()->ShowPane(false);
        shown.view->GetWidget()->hide();
        break;
    case ReportOp::ShowPane:
        shown.view->GetParentPane()->ShowPane(true);
        shown.view->GetWidget()->show();
        if (shown.isStale && shown.isHidden) {
            shown.isStale = false; // what is shown again is loaded where it is another text
            shown.isEdited = false;
        }
        shown.isHidden = false;
        break;
    case ReportOp::WriteUnseen: writeUnseen(step); break;
    case ReportOp::SetLongData: {
        const QString text = longText(step.c);
        report().SetData(text);
        model_.setData(text);
        tellViews();
        break;
    }
    case ReportOp::GoOn:
        for (int i = 0; i <= step.b % 3; ++i) {
            QCoreApplication::processEvents();
        }
        break;
    case ReportOp::NeedAll: needAll(shown, step.c); break;
    default: break;
    }
}

void ModelledReport::writeUnseen(const ReportStep &step)
{
    if (step.b % 3 == 0) {
        report().ReplaceText(0, 0, u"Z");
        model_.replace(0, 0, QStringLiteral("Z"));
    } else {
        report().WriteLine(line(step.c), 0, 1, 0);
        model_.writeLine(line(step.c), 0, 1);
    }
    isModified_ = true;
    for (Shown &shown : views_) {
        shown.isStale = true;
    }
}

void ModelledReport::needAll(Shown &shown, int seed)
{
    UReportView &view = *shown.view;
    if (shown.isStale) {
        tellViews();
    }
    QBuffer device;
    device.open(QIODevice::WriteOnly);
    switch (seed % 5) {
    case 0: widgetOf(view).goToPage(1 + seed % 9); break;
    case 1: wrongAnswer_ = wrongAnswer_ || !view.streamPlainText(device); break;
    case 2:
        view.UpdateData(true);
        shown.isEdited = false;
        break;
    case 3:
        widgetOf(view).openPageBar();
        QTest::keyClick(&view.GetEdit(), Qt::Key_Escape);
        break;
    default: QTest::keyClick(&view.GetEdit(), Qt::Key_End, Qt::ControlModifier); break;
    }
    wrongAnswer_ = wrongAnswer_ || view.GetEdit().isLoading();
}

QString ModelledReport::longText(int seed)
{
    QString text;
    for (int number = 1; number <= 6000; ++number) {
        text += seed % 2 == 0 && number % 60 == 1
                    ? headerOf(QString(), number / 60 + 1)
                    : QStringLiteral("point %1 of %2").arg(number, 6).arg(seed).leftJustified(90, u'.');
        text += QStringLiteral("\r\n");
    }
    return text;
}

bool ModelledReport::isAllCrLf() const
{
    const QString text = model_.text();
    return text.count(u'\n') == text.count(QStringLiteral("\r\n")) &&
           text.count(u'\r') == text.count(QStringLiteral("\r\n"));
}

void ModelledReport::switchOn()
{
    report().Clear();
    model_.clear();
    image_.clear();
    report().SetRTFDataFlag(true);
    isRich_ = true;
    isModified_ = true;
}

void ModelledReport::switchOff()
{
    report().SetRTFDataFlag(false);
    isRich_ = false;
}

void ModelledReport::actInRichText(const ReportStep &step)
{
    Shown *shown = visibleView(step.b);
    if (shown == nullptr) {
        return;
    }
    switchOn();
    for (int i = 0; i < step.a % 20; ++i) {
        report().WriteLine(line(1 + i % 3), 0, 1, i % 4);
        model_.writeLine(line(1 + i % 3), 0, 1);
    }
    image_ = model_.text();
    tellViews();
    typeIntoImage(*shown, step);
    switchOff();
    tellViews();
}

void ModelledReport::typeIntoImage(Shown &shown, const ReportStep &step)
{
    kareport::ReportEdit &edit = shown.view->GetEdit();
    const QString text = model_.text();
    const int blocks = edit.document()->blockCount();
    putCursor(edit, placeIn(edit.document()->characterCount(), step.c));
    const QTextCursor cursor = edit.textCursor();
    const int line = cursor.blockNumber();
    const bool endsLine = step.c % 2 != 0;
    const bool isPutBefore = endsLine && cursor.atBlockStart() && cursor.position() > 0;
    // Where the lines of the text are those of the image, pages go on beginning with the lines that they began with.
    const auto ends = text.count(u'\n');
    const bool areLines = ends + 1 == blocks || (ends == blocks && text.endsWith(u'\n'));
    const bool isSame = edit.windowText() == asShown(text);
    std::vector<int> lines;
    for (const qint64 start : model_.starts()) {
        const auto number = static_cast<int>(QStringView(text).first(start).count(u'\n'));
        const bool begins = start == 0 || text[start - 1] == u'\n';
        if (begins && start < text.size() && number < blocks) {
            lines.push_back(number + (endsLine && (number > line || (number == line && isPutBefore)) ? 1 : 0));
        }
    }
    EditSpy spy(edit);
    QTest::keyClick(&edit, endsLine ? Qt::Key_Return : Qt::Key_X);
    isModified_ = true;
    for (Shown &other : views_) {
        other.isStale = false;
        other.isEdited = &other == &shown;
    }
    if (isSame) {
        model_.withCrLf();
        for (const SeenEdit &seen : spy.edits) {
            model_.replace(seen.at, seen.removed, seen.inserted);
        }
        return;
    }
    std::vector<qint64> starts;
    for (const int number : lines) {
        const QTextBlock block = edit.document()->findBlockByNumber(number);
        starts.push_back(qint64(block.position()) + number);
    }
    model_.setTextWithStarts(edit.windowText(), areLines ? starts : ReportModel::headersIn(edit.windowText()));
}

void ModelledReport::actAsUser(const ReportStep &step)
{
    Shown *shown = visibleView(step.a);
    if (shown == nullptr) {
        return;
    }
    const bool isStale = std::any_of(views_.begin(), views_.end(), [](const Shown &one) { return one.isStale; });
    if (isStale) {
        tellViews(); // what is typed into another text than the report's takes the place of that
    }
    kareport::ReportEdit &edit = shown->view->GetEdit();
    if (edit.isLoading()) {
        QTest::keyClick(&edit, step.c % 2 == 0 ? Qt::Key_X : Qt::Key_Delete); // which edits nothing
    } else if (isRich_ && !shown->isEdited) {
        typeIntoImage(*shown, step);
    } else if (!isRich_ || step.op != ReportOp::TakeAll) {
        actInView(*shown, step);
    }
}

int ModelledReport::placeIn(int length, int number)
{
    constexpr int range = 5000;
    return length <= range ? number % length : static_cast<int>(qint64(number) * (length - 1) / range);
}

/// What the user does in the control.
void ModelledReport::editInView(UReportView &view, const ReportStep &step)
{
    kareport::ReportEdit &edit = view.GetEdit();
    const int length = edit.document()->characterCount();
    const int place = placeIn(length, step.b);
    const int other = std::min(length - 1, place + step.c % (step.c % 3 == 0 ? 200 : 12));
    switch (step.op) {
    case ReportOp::Type:
        putCursor(edit, place);
        QTest::keyClick(&edit, step.c % 2 == 0 ? Qt::Key_X : Qt::Key_Space);
        break;
    case ReportOp::LineEnd:
        putCursor(edit, place);
        QTest::keyClick(&edit, Qt::Key_Return);
        break;
    case ReportOp::Backspace:
        putCursor(edit, place);
        QTest::keyClick(&edit, Qt::Key_Backspace);
        break;
    case ReportOp::Delete:
        putCursor(edit, place);
        QTest::keyClick(&edit, Qt::Key_Delete);
        break;
    case ReportOp::Cut:
        putWholeLines(edit, place, other, step.c % 2 == 0);
        clip_ = edit.textCursor().selectedText().replace(QChar::ParagraphSeparator, u'\n');
        edit.textCursor().removeSelectedText();
        break;
    case ReportOp::Paste:
        putWholeLines(edit, place, place, step.c % 2 == 0);
        edit.textCursor().insertText(clip_);
        break;
    case ReportOp::TypeOver:
        putWholeLines(edit, place, other, step.c % 2 == 0);
        QTest::keyClick(&edit, Qt::Key_Y);
        break;
    case ReportOp::Undo: edit.undo(); break;
    case ReportOp::Redo: edit.redo(); break;
    case ReportOp::TakeAll:
        view.OnChange();
        model_.withCrLf();
        isModified_ = true;
        break;
    default: break;
    }
}

void ModelledReport::actInView(Shown &shown, const ReportStep &step)
{
    EditSpy spy(shown.view->GetEdit());
    editInView(*shown.view, step);
    editsSeen_ = spy.edits.size();
    for (const SeenEdit &seen : spy.edits) {
        if (!isAllCrLf()) {
            model_.withCrLf();
        }
        model_.replace(seen.at, seen.removed, seen.inserted);
        isModified_ = true;
    }
    if (isRich_ && !spy.edits.empty()) {
        for (Shown &one : views_) { // the image takes the place of what was edited there
            one.isEdited = &one == &shown;
        }
    }
}

void ModelledReport::putWholeLines(kareport::ReportEdit &edit, int from, int to, bool isWhole)
{
    QTextCursor cursor(edit.document());
    cursor.setPosition(from);
    if (isWhole) {
        cursor.movePosition(QTextCursor::StartOfBlock);
    }
    const int start = cursor.position();
    cursor.setPosition(std::max(start, to));
    if (isWhole) {
        cursor.movePosition(QTextCursor::StartOfBlock);
    }
    putCursor(edit, cursor.position(), start);
}

QString ModelledReport::compareReport(const QString &text)
{
    if (wrongAnswer_) {
        return QStringLiteral("an operation answered wrong");
    }
    if (!wrongSave_.isEmpty()) {
        return wrongSave_;
    }
    if (report().CopyText() != text) {
        return QStringLiteral("the text is \"%1\" and not \"%2\"").arg(brief(report().CopyText()), brief(text));
    }
    if (report().GetPageStarts() != model_.starts()) {
        return QStringLiteral("pages start at %1 and not at %2")
            .arg(brief(joined(report().GetPageStarts())), brief(joined(model_.starts())));
    }
    if (report().IsModified() != isModified_) {
        return QStringLiteral("modified is %1").arg(report().IsModified());
    }
    return QString();
}

QString ModelledReport::compareViews(const QString &text)
{
    const std::vector<kareport::ReportPage> pages = model_.pages();
    if (shown(report().GetPages()) != shown(pages)) {
        return QStringLiteral("pages are %1 and not %2").arg(brief(shown(report().GetPages())), brief(shown(pages)));
    }
    for (std::size_t i = 0; i < views_.size(); ++i) {
        const Shown &one = views_[i];
        if (one.isStale) {
            continue;
        }
        if (isRich_ && !one.isEdited) {
            const QString image = one.view->GetEdit().windowText();
            if (inkOf(image) != inkOf(image_)) {
                return QStringLiteral("view %1 shows \"%2\" and not the image of \"%3\"")
                    .arg(QString::number(i), brief(image), brief(image_));
            }
            continue;
        }
        QString wrong = wrongWithText(*one.view, text);
        if (wrong.isEmpty() && !one.view->GetEdit().isLoading()) {
            wrong = wrongWithPages(*one.view, text, pages);
        }
        if (!wrong.isEmpty()) {
            return QStringLiteral("view %1: ").arg(i) + wrong;
        }
    }
    return QString();
}
