// The check of a file and of its templates; that of what a template holds is in another file.
#include "TemplateChecker.h"

#include "NearestName.h"
#include "ScanNoteText.h"
#include "TagLint.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

std::vector<TemplateRemark> TemplateChecker::check()
{
    checkTags();
    const auto templates = readTemplateElements(scan_, &notes_);
    if (templates.empty() && notes_.empty()) {
        error(0, Xlate("no template was read: a <ReportTemplate> element was expected"));
    }
    checkUnread();
    checkNames(templates);
    for (const TemplateElement &element : templates) {
        checkTemplate(element);
    }
    addNotes();
    keepScope(templates);
    std::stable_sort(found_.begin(), found_.end(),
                     [](const Found &left, const Found &right) { return left.source < right.source; });
    std::vector<TemplateRemark> remarks;
    remarks.reserve(found_.size());
    for (const Found &found : found_) {
        remarks.push_back({places_.of(found.source), found.isError, found.text});
    }
    return remarks;
}

/// A sentence with the question what may have been meant. A file that is wrong all over is not searched for every name.
QString TemplateChecker::asking(const QString &sentence, QStringView misspelt, const QStringList &known)
{
    constexpr int mostAsked = 100;
    constexpr qsizetype mostKnown = 1000;
    return asked_++ < mostAsked && known.size() <= mostKnown ? withQuestion(sentence, misspelt, known) : sentence;
}

/// Leaves the remarks on the one template that is asked for.
void TemplateChecker::keepScope(const std::vector<TemplateElement> &templates)
{
    if (scope_.name.isEmpty()) {
        return;
    }
    const auto chosen = std::find_if(templates.rbegin(), templates.rend(), [this](const TemplateElement &element) {
        return equalFolded(element.name.value.view(), scope_.name);
    });
    const bool isThere = chosen != templates.rend();
    const qsizetype begin = isThere ? chosen->body.source : 0;
    const qsizetype end = isThere ? chosen->body.value.sourceOf(chosen->body.value.size()) : 0;
    std::erase_if(found_, [begin, end](const Found &found) { return found.source < begin || found.source >= end; });
}

/// Remarks on what is not read.
void TemplateChecker::checkUnread()
{
    for (const UnreadPiece &piece : findUnread(scan_)) {
        const qsizetype size = std::max<qsizetype>(piece.end - piece.source, 0);
        const QStringView text = QStringView(text_).sliced(piece.source, size).trimmed();
        const QString lines = QString::number(text.count(u'\n') + 1);
        const QString characters = QString::number(text.toUcs4().size());
        switch (piece.kind) {
        case UnreadPiece::Kind::Element: checkElementName(piece); break;
        case UnreadPiece::Kind::Text:
            warning(piece.source, Xlate("the text \"%1\" is outside of all elements and is not read").arg(piece.text));
            break;
        case UnreadPiece::Kind::Around:
            warning(
                piece.source,
                Xlate("this text is in no template: %1 characters in %2 lines are not read").arg(characters, lines));
            break;
        case UnreadPiece::Kind::AfterLast:
            warning(
                piece.source,
                Xlate("no template follows: the last %1 characters, in %2 lines, are not read").arg(characters, lines));
            break;
        }
    }
}

void TemplateChecker::checkElementName(const UnreadPiece &piece)
{
    const QString tag = u'<' + piece.text + u'>';
    const auto [known, isNew] = questions_.try_emplace(piece.text);
    if (isNew) {
        known->second = didYouMean(piece.text, elementNameList());
    }
    const QString &question = known->second;
    if (question.isEmpty()) {
        warning(piece.source, Xlate("unknown element %1: it is not read").arg(tag));
    } else if (piece.holdsElement) {
        // What is inside it may still be read.
        warning(piece.source, Xlate("unknown element %1: %2").arg(tag, question));
    } else {
        error(piece.source, Xlate("unknown element %1: %2").arg(tag, question));
    }
}

void TemplateChecker::checkTags()
{
    for (const TagRemark &remark : findIgnoredTags(scan_)) {
        if (remark.kind == TagRemark::Kind::InComment) {
            warning(remark.source, Xlate("%1 is read although it is in a comment").arg(remark.text));
        } else {
            error(remark.source, Xlate("%1 is not a tag: a tag has no blanks and no attributes").arg(remark.text));
        }
    }
}

void TemplateChecker::checkNames(const std::vector<TemplateElement> &templates)
{
    Names names;
    for (const TemplateElement &element : templates) {
        if (element.name.value.isEmpty()) {
            error(element.body.source, Xlate("the template has no <Name>, so it cannot be chosen"));
            continue;
        }
        if (names.contains(element.name.value.view())) {
            warning(element.name.source,
                    Xlate("a template named %1 comes before this one: the last one of a name is read")
                        .arg(quotedValue(element.name)));
        }
        names.insert(element.name.value.text());
    }
}

void TemplateChecker::checkTemplate(const TemplateElement &element)
{
    const ScanText &body = element.body.value;
    for (const auto *tag : {u"TABLES", u"BLOCKS"}) {
        const ScanElement list = GetNode(body, tag);
        if (list.exists() && element.name.source > list.source) {
            error(element.name.source, Xlate("the template's own <Name> must come before %1: this one was taken for it")
                                           .arg(bracketedTag(tag)));
            break;
        }
    }
    checkText(element.title);

    checkDictionaries(readDictionaryElements(body, &notes_));
    const auto tables = readTableElements(body, &notes_);
    const auto blocks = readBlockElements(body, &notes_);
    const auto sorts = readSortElements(body, &notes_);
    for (const OutputElement &table : tables) {
        checkOutput(table, true);
    }
    for (const OutputElement &block : blocks) {
        checkOutput(block, false);
    }
    checkTwice(tables, true);
    checkTwice(blocks, false);
    for (const SortElement &sort : sorts) {
        const auto known = variables_.find(foldedKey(sort.use.value.view()));
        for (const ScanElement &name : sort.variableNames) {
            if (known != variables_.end() && !known->second.contains(name.value.view())) {
                const QString sentence =
                    Xlate("the sort key %1 is not in the dictionary %2").arg(quotedValue(name), quotedValue(sort.use));
                error(name.source, asking(sentence, name.value.view(), known->second.all()));
            }
        }
    }

    const OptionElements options = readOptionElements(body, &notes_);
    if (!options.separator.exists() || options.separator.value.isEmpty()) {
        warning(options.options.exists() ? options.options.source : element.body.source,
                Xlate("no <Separator>: the columns are separated by the character 0"));
    }
}

void TemplateChecker::addNotes()
{
    for (const ScanNote &note : notes_) {
        found_.push_back({note.source, isScanError(note), scanNoteText(note)});
    }
}

} // namespace kareport
