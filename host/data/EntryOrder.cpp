#include "EntryOrder.h"

#include <cmath>
#include <optional>

namespace kareport
{

namespace
{

std::weak_ordering compareFolded(QStringView left, QStringView right)
{
    return left.compare(right, Qt::CaseInsensitive) <=> 0;
}

std::optional<double> numberOf(const UDictEntry &entry)
{
    return std::visit(
        [](const auto &held) -> std::optional<double> {
            if constexpr (std::is_arithmetic_v<std::decay_t<decltype(held)>>) {
                return static_cast<double>(held);
            } else {
                return std::nullopt;
            }
        },
        entry.value());
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
    const auto leftNumber = numberOf(*left);
    const auto rightNumber = numberOf(*right);
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
