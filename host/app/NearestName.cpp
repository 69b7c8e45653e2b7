#include "NearestName.h"

#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>
#include <array>
#include <vector>

namespace kareport
{

namespace
{

/// Longer names are compared by their beginnings alone.
constexpr qsizetype longestCompared = 64;
/// A shorter beginning fits too many names.
constexpr qsizetype shortestBeginning = 3;

/// How many letters must be put in, taken out, replaced or exchanged with the next to make one text of another.
qsizetype distanceOf(QStringView left, QStringView right)
{
    std::array<std::vector<qsizetype>, 3> rows;
    for (auto &row : rows) {
        row.resize(static_cast<std::size_t>(right.size()) + 1);
    }
    for (std::size_t j = 0; j < rows[0].size(); ++j) {
        rows[0][j] = static_cast<qsizetype>(j);
    }
    for (qsizetype i = 1; i <= left.size(); ++i) {
        auto &row = rows[static_cast<std::size_t>(i % 3)];
        const auto &above = rows[static_cast<std::size_t>((i + 2) % 3)];
        const auto &second = rows[static_cast<std::size_t>((i + 1) % 3)];
        row[0] = i;
        for (qsizetype j = 1; j <= right.size(); ++j) {
            const auto at = static_cast<std::size_t>(j);
            const bool same = left[i - 1] == right[j - 1];
            row[at] = std::min({above[at] + 1, row[at - 1] + 1, above[at - 1] + (same ? 0 : 1)});
            if (i > 1 && j > 1 && left[i - 1] == right[j - 2] && left[i - 2] == right[j - 1]) {
                row[at] = std::min(row[at], second[at - 2] + 1);
            }
        }
    }
    return rows[static_cast<std::size_t>(left.size() % 3)].back();
}

/// Names for a message, not all of very many.
QString listed(const QStringList &names)
{
    constexpr qsizetype mostNames = 40;
    QStringList shown = names.mid(0, mostNames);
    if (names.size() > mostNames) {
        shown.append(QStringLiteral("…"));
    }
    return shown.join(QStringLiteral(", "));
}

} // namespace

QString nearestName(QStringView misspelt, const QStringList &known)
{
    const QString sought = foldedKey(misspelt.left(longestCompared));
    // A third of the letters may be wrong, and one of a short name.
    qsizetype nearest = std::max<qsizetype>(sought.size() / 3, 1) + 1;
    QString found;
    for (const QString &name : known) {
        const QString folded = foldedKey(QStringView(name).left(longestCompared));
        const qsizetype shorter = std::min(folded.size(), sought.size());
        const bool begins = shorter >= shortestBeginning && folded.left(shorter) == sought.left(shorter);
        const qsizetype distance = begins ? 1 : distanceOf(sought, folded);
        if (distance < nearest && distance < std::max(folded.size(), sought.size())) {
            nearest = distance;
            found = name;
        }
    }
    return found;
}

QString didYouMean(QStringView misspelt, const QStringList &known)
{
    const QString name = nearestName(misspelt, known);
    return name.isEmpty() ? QString() : Xlate("did you mean \"%1\"?").arg(name);
}

QString withQuestion(const QString &sentence, QStringView misspelt, const QStringList &known)
{
    const QString question = didYouMean(misspelt, known);
    return question.isEmpty() ? sentence : sentence + QStringLiteral(": ") + question;
}

QString shortened(const QString &text, qsizetype most)
{
    if (text.size() <= most) {
        return text;
    }
    const bool isHalved = most > 0 && text[most - 1].isHighSurrogate() && text[most].isLowSurrogate();
    return text.left(isHalved ? most - 1 : most) + u'…';
}

QString withExpected(const QString &sentence, QStringView misspelt, const QStringList &known)
{
    const QString question = withQuestion(sentence, misspelt, known);
    return known.isEmpty() || question.size() > sentence.size()
               ? question
               : sentence + QStringLiteral(": ") + Xlate("one of %1 was expected").arg(listed(known));
}

QString oneOfExpected(QStringView given, const QStringList &known)
{
    const QString all = known.isEmpty() ? Xlate("none") : listed(known);
    const QString question = didYouMean(given, known);
    const QString expected = Xlate("one of %1 was expected").arg(all);
    return question.isEmpty() ? expected : expected + QStringLiteral("; ") + question;
}

} // namespace kareport
