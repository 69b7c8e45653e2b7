#include "EntryOrder.h"

#include <cmath>

namespace kareport
{

namespace
{

std::weak_ordering compareFolded(QStringView left, QStringView right)
{
    return left.compare(right, Qt::CaseInsensitive) <=> 0;
}

/// The number that an entry sorts as, true and false as 1 and 0; nothing where it is not a number.
std::optional<double> rankOf(const UDictEntry &entry)
{
    const bool *truth = std::get_if<bool>(&entry.value());
    return truth != nullptr ? std::optional(*truth ? 1.0 : 0.0) : numberOf(&entry);
}

std::weak_ordering compareNumbers(double left, double right)
{
    if (std::isnan(left) || std::isnan(right)) {
        return std::isnan(right) <=> std::isnan(left);
    }
    return std::weak_order(left, right);
}

bool isDigit(QChar character)
{
    return character >= u'0' && character <= u'9';
}

/// Takes the run of digits or of other characters off the front of a text.
QStringView takeRun(QStringView &text)
{
    qsizetype length = 1;
    while (length < text.size() && isDigit(text[length]) == isDigit(text[0])) {
        ++length;
    }
    const QStringView run = text.first(length);
    text = text.sliced(length);
    return run;
}

std::weak_ordering compareDigitRuns(QStringView left, QStringView right)
{
    const auto withoutZeros = [](QStringView run) {
        while (run.size() > 1 && run[0] == u'0') {
            run = run.sliced(1);
        }
        return run;
    };
    const QStringView leftDigits = withoutZeros(left);
    const QStringView rightDigits = withoutZeros(right);
    if (leftDigits.size() != rightDigits.size()) {
        return leftDigits.size() <=> rightDigits.size();
    }
    if (const int order = leftDigits.compare(rightDigits); order != 0) {
        return order <=> 0;
    }
    return left.size() <=> right.size();
}

} // namespace

std::optional<double> numberOf(const UDictEntry *entry)
{
    if (entry == nullptr) {
        return std::nullopt;
    }
    return std::visit(
        [](const auto &held) -> std::optional<double> {
            using Held = std::decay_t<decltype(held)>;
            if constexpr (std::is_arithmetic_v<Held> && !std::is_same_v<Held, bool>) {
                return static_cast<double>(held);
            } else {
                return std::nullopt;
            }
        },
        entry->value());
}

std::weak_ordering compareNaturally(QStringView left, QStringView right)
{
    while (!left.isEmpty() && !right.isEmpty()) {
        const QStringView leftRun = takeRun(left);
        const QStringView rightRun = takeRun(right);
        const bool leftIsNumber = isDigit(leftRun[0]);
        const bool rightIsNumber = isDigit(rightRun[0]);
        if (leftIsNumber != rightIsNumber) {
            return leftIsNumber ? std::weak_ordering::less : std::weak_ordering::greater;
        }
        const auto order = leftIsNumber ? compareDigitRuns(leftRun, rightRun) : compareFolded(leftRun, rightRun);
        if (std::is_neq(order)) {
            return order;
        }
    }
    return right.isEmpty() <=> left.isEmpty();
}

std::weak_ordering compareEntries(const UDictEntry *left, const UDictEntry *right)
{
    if (left == nullptr || right == nullptr) {
        return (left != nullptr) <=> (right != nullptr);
    }
    const auto leftNumber = rankOf(*left);
    const auto rightNumber = rankOf(*right);
    if (leftNumber && rightNumber) {
        return compareNumbers(*leftNumber, *rightNumber);
    }
    const auto rank = [](const UDictEntry &entry, bool number) { return number ? 0 : entry.GetKind(); };
    const auto leftRank = rank(*left, leftNumber.has_value());
    const auto rightRank = rank(*right, rightNumber.has_value());
    if (leftRank != rightRank) {
        return leftRank <=> rightRank;
    }
    if (const auto *text = std::get_if<QString>(&left->value())) {
        return compareFolded(*text, std::get<QString>(right->value()));
    }
    return compareNaturally(std::get<UPointNumber>(left->value()).Convert(),
                            std::get<UPointNumber>(right->value()).Convert());
}

std::weak_ordering compareObjects(const UDataObject &left, const UDataObject &right, const std::vector<unsigned> &ids)
{
    for (const unsigned id : ids) {
        if (const auto order = compareEntries(left.Find(id), right.Find(id)); std::is_neq(order)) {
            return order;
        }
    }
    return std::weak_ordering::equivalent;
}

} // namespace kareport
