#include "TemplateCompletion.h"

#include "TagLint.h"
#include "TemplateOutline.h"
#include "TextFolding.h"
#include "VariableKeywords.h"

#include <QSet>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

/// The elements that an element has.
struct Parts
{
    QStringView element; ///< empty for the file
    QStringView parts;   ///< with blanks between them
};

constexpr Parts allParts[] = {
    {u"", u"ReportTemplate"},
    {u"ReportTemplate", u"Name Title Tables Dictionaries Blocks Options"},
    {u"Tables", u"Table"},
    {u"Table", u"Name Use Sort OutputList"},
    {u"Sort", u"VariableName"},
    {u"OutputList", u"Field"},
    {u"Field", u"VariableName Label Format Align"},
    {u"Dictionaries", u"Dictionary"},
    {u"Dictionary", u"DictionaryName VariableList"},
    {u"VariableList", u"Variable"},
    {u"Variable", u"ID VariableName Type"},
    {u"Blocks", u"Block"},
    {u"Block", u"Name Use OutputList"},
    {u"Options", u"Separator PageBreaks"},
};

QStringList wordsOf(QStringView words)
{
    return words.toString().split(u' ', Qt::SkipEmptyParts);
}

QStringList partsOf(const QString &element)
{
    const auto *found = std::find_if(std::begin(allParts), std::end(allParts),
                                     [&element](const Parts &one) { return one.element == element; });
    return found != std::end(allParts) ? wordsOf(found->parts) : QStringList();
}

QStringList allTypes()
{
    constexpr int lastType = 22;
    QStringList types;
    for (int type = 0; type <= lastType; ++type) {
        if (const QStringView keyword = keywordOf(type); !keyword.isEmpty()) {
            types.append(keyword.toString());
        }
    }
    types.sort();
    return types;
}

void addOnce(QStringList &words, const QString &word)
{
    if (!word.isEmpty() && !words.contains(word, Qt::CaseInsensitive)) {
        words.append(word);
    }
}

/// What a value may be that depends on the rest of the template.
class Values
{
public:
    Values(const QString &text, qsizetype position)
        : outline_(outlineOf(text)), template_(outline_.templateAt(position)), position_(position)
    {}

    QStringList dictionaries() const
    {
        QStringList names;
        for (const OutlineDictionary &dictionary : templateDictionaries()) {
            addOnce(names, dictionary.name.text);
        }
        return names;
    }

    /// The variables that a table or a block can show.
    QStringList variables() const
    {
        const OutlineOutput *output = outputHere();
        QStringList names;
        for (const OutlineDictionary &dictionary : templateDictionaries()) {
            if (output == nullptr || equalFolded(dictionary.name.text, output->use.text)) {
                for (const OutlineVariable &variable : dictionary.variables) {
                    addOnce(names, variable.name.text);
                }
            }
        }
        return names;
    }

    /// The variables that tables and blocks show and the dictionary here lacks.
    QStringList missingVariables() const
    {
        const OutlineDictionary *here = nullptr;
        for (const OutlineDictionary &dictionary : templateDictionaries()) {
            here = dictionary.element.touches(position_) ? &dictionary : here;
        }
        if (here == nullptr) {
            return {};
        }
        QSet<QString> known;
        for (const OutlineVariable &variable : here->variables) {
            if (!variable.element.touches(position_)) {
                known.insert(foldedKey(variable.name.text));
            }
        }
        QStringList names;
        for (const OutlineOutput &output : template_->outputs) {
            for (const OutlineField &field : output.fields) {
                if (equalFolded(output.use.text, here->name.text) && !known.contains(foldedKey(field.variable.text))) {
                    addOnce(names, field.variable.text);
                }
            }
        }
        return names;
    }

    QStringList formats() const
    {
        QStringList formats;
        for (const OutlineTemplate &one : outline_.templates) {
            for (const OutlineOutput &output : one.outputs) {
                for (const OutlineField &field : output.fields) {
                    if (!field.element.touches(position_)) {
                        addOnce(formats, field.format.text);
                    }
                }
            }
        }
        for (const QString &usual : wordsOf(u"8 12 20 40 9.3 10.3 12.3 14.4")) {
            addOnce(formats, usual);
        }
        return formats;
    }

    QString nextId() const
    {
        int next = 1;
        for (const OutlineDictionary &dictionary : templateDictionaries()) {
            if (dictionary.element.touches(position_)) {
                for (const OutlineVariable &variable : dictionary.variables) {
                    next = std::max(next, variable.element.touches(position_) ? 0 : variable.id.text.toInt() + 1);
                }
            }
        }
        return QString::number(next);
    }

private:
    const std::vector<OutlineDictionary> &templateDictionaries() const
    {
        static const std::vector<OutlineDictionary> none;
        return template_ != nullptr ? template_->dictionaryList : none;
    }
    const OutlineOutput *outputHere() const
    {
        if (template_ != nullptr) {
            for (const OutlineOutput &output : template_->outputs) {
                if (output.element.touches(position_)) {
                    return &output;
                }
            }
        }
        return nullptr;
    }

    TemplateOutline outline_;
    const OutlineTemplate *template_;
    qsizetype position_;
};

QStringList variableWords(const Values &values, const QString &parent)
{
    if (parent == u"Variable") {
        return values.missingVariables();
    }
    QStringList words = values.variables();
    if (parent == u"Field") {
        words.append(wordsOf(u"FILLER SUFFIX_R SUFFIX_+"));
    }
    return words;
}

/// The words that an element's value may be.
QStringList valueWords(const Values &values, const QString &element, const QString &parent)
{
    if (element == u"Type") {
        return allTypes();
    }
    if (element == u"Align") {
        return wordsOf(parent == u"Field" ? u"LEFT RIGHT CENTER" : u"");
    }
    if (element == u"Format") {
        return values.formats();
    }
    if (element == u"Use") {
        return values.dictionaries();
    }
    if (element == u"VariableName") {
        return variableWords(values, parent);
    }
    if (element == u"ID") {
        return QStringList(values.nextId());
    }
    if (element == u"PageBreaks") {
        return wordsOf(u"YES NO");
    }
    return element == u"Separator" ? wordsOf(u"32 9 44 59 124") : QStringList();
}

} // namespace

QStringList openElementsAt(const QString &text, qsizetype position)
{
    QStringList open;
    const QStringView before = QStringView(text).first(std::min(position, text.size()));
    for (qsizetype at = before.indexOf(u'<'); at >= 0; at = before.indexOf(u'<', at)) {
        if (before.sliced(at).startsWith(u"<!--")) {
            const qsizetype end = before.indexOf(u"-->", at);
            at = end < 0 ? before.size() : end + 3;
            continue;
        }
        const qsizetype end = before.indexOf(u'>', at);
        if (end < 0) {
            break;
        }
        const QStringView tag = before.sliced(at + 1, end - at - 1);
        at = end + 1;
        const bool isClosing = tag.startsWith(u'/');
        const QString name = elementName(isClosing ? tag.sliced(1) : tag);
        if (!isElementName(name)) {
            continue;
        }
        if (!isClosing) {
            open.append(name);
        } else if (const qsizetype last = open.lastIndexOf(name); last >= 0) {
            open.resize(last);
        }
    }
    return open;
}

Completions completionsAt(const QString &text, qsizetype position)
{
    const QStringView before = QStringView(text).first(std::clamp<qsizetype>(position, 0, text.size()));
    const qsizetype open = before.lastIndexOf(u'<');
    const qsizetype close = before.lastIndexOf(u'>');
    Completions found;
    if (open > close) {
        found.areTags = true;
        found.begin = open + 1;
        const QStringList elements = openElementsAt(text, open);
        const QString inner = elements.isEmpty() ? QString() : elements.last();
        if (before.sliced(found.begin).startsWith(u'/')) {
            ++found.begin;
            found.words = inner.isEmpty() ? QStringList() : QStringList(inner);
        } else {
            found.words = partsOf(inner);
        }
        return found;
    }
    found.begin = close + 1;
    const QStringList elements = openElementsAt(text, position);
    if (close < 0 || open < 0 || elements.isEmpty() || before.sliced(open + 1).startsWith(u'/') ||
        before.sliced(found.begin).contains(u'\n'))
    {
        return found;
    }
    const QString parent = elements.size() > 1 ? elements[elements.size() - 2] : QString();
    found.words = valueWords(Values(text, position), elements.last(), parent);
    return found;
}

} // namespace kareport
