#include "NameQuestions.h"

#include "NearestName.h"
#include "TextFolding.h"

namespace kareport
{

QString NameQuestions::ask(const QString &list, const QString &name, const std::function<QStringList()> &known)
{
    const QString key = list + QChar() + foldedKey(name);
    const auto earlier = asked_.constFind(key);
    return earlier != asked_.constEnd() ? *earlier : *asked_.insert(key, didYouMean(name, known()));
}

QString joinedQuestion(const QString &sentence, const QString &question)
{
    return question.isEmpty() ? sentence : sentence + QStringLiteral(": ") + question;
}

} // namespace kareport
