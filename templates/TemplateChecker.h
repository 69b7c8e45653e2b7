#pragma once

#include "TemplateCheck.h"
#include "TemplateElements.h"
#include "TemplateFile.h"
#include "TextFolding.h"
#include "TextPlaces.h"
#include "UnreadText.h"

#include <QHashFunctions>
#include <QString>
#include <QStringList>

#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace kareport
{

/// Names as they are written, found by their folded forms.
class Names
{
public:
    void insert(const QString &name)
    {
        if (folded_.insert(foldedKey(name)).second) {
            all_.append(name);
        }
    }
    bool contains(QStringView name) const { return folded_.contains(foldedKey(name)); }
    const QStringList &all() const { return all_; }

private:
    std::unordered_set<QString> folded_;
    QStringList all_;
};

/// Checks a template file.
class TemplateChecker
{
public:
    TemplateChecker(const TemplateFile &file, const TemplateCheckScope &scope)
        : text_(file.text()), places_(text_), scan_(scanTextOf(file)), scope_(scope)
    {}

    std::vector<TemplateRemark> check();

private:
    /// A remark with its position in the file.
    struct Found
    {
        qsizetype source;
        bool isError;
        QString text;
    };

    void error(qsizetype source, const QString &text) { found_.push_back({source, true, text}); }
    void warning(qsizetype source, const QString &text) { found_.push_back({source, false, text}); }

    QString asking(const QString &sentence, QStringView misspelt, const QStringList &known);
    void checkTags();
    void checkUnread();
    void checkElementName(const UnreadPiece &piece);
    void keepScope(const std::vector<TemplateElement> &templates);
    void checkTwice(const std::vector<OutputElement> &outputs, bool isTable);
    void checkFormat(const FieldElement &field);
    void checkNames(const std::vector<TemplateElement> &templates);
    void checkTemplate(const TemplateElement &element);
    void checkDictionaries(const std::vector<DictionaryElement> &dictionaries);
    void checkVariables(const DictionaryElement &dictionary);
    void checkOutput(const OutputElement &output, bool isTable);
    void checkField(const FieldElement &field, const Names *variables, bool isTable);
    void checkText(const ScanElement &element);
    void addNotes();

    const QString &text_;
    TextPlaces places_;
    ScanText scan_;
    const TemplateCheckScope &scope_;
    ScanNotes notes_;
    std::unordered_map<QString, Names> variables_;   ///< of the current template, by the dictionary's folded name
    QStringList dictionaries_;                       ///< the names of its dictionaries
    int asked_ = 0;                                  ///< how many names were compared with all that are known
    std::unordered_map<QString, QString> questions_; ///< which element may have been meant, by the unknown name
    std::vector<Found> found_;
};

} // namespace kareport
