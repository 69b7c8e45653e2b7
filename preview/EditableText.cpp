#include "EditableText.h"

#include <QStringList>
#include <QUtf8StringView>

#include <algorithm>
#include <cstdint>

namespace kareport
{

namespace
{

constexpr QByteArrayView byteOrderMark = "\xEF\xBB\xBF";
constexpr char16_t paragraphSeparator = u'\u2029';

/// The characters of the line end at a position; 0 where there is none.
qsizetype lineEndAt(QStringView text, qsizetype at)
{
    const QChar character = text[at];
    if (character == u'\r') {
        return at + 1 < text.size() && text[at + 1] == u'\n' ? 2 : 1;
    }
    return character == u'\n' || character == paragraphSeparator ? 1 : 0;
}

/// Which lines of one list are which of another: for each of `lines` the index of the same line in `others`, -1 for a new one.
/// The longest sequence of lines that both have in common is kept.
std::vector<qsizetype> sameLines(const QStringList &lines, const QStringList &others)
{
    const std::size_t rows = static_cast<std::size_t>(lines.size());
    const std::size_t columns = static_cast<std::size_t>(others.size());
    std::vector<qsizetype> same(rows, -1);
    constexpr std::size_t mostCompared = 16'000'000;
    if (columns == 0 || rows > mostCompared / columns) {
        return same; // a text that has little to do with the file any more
    }
    std::vector<std::uint32_t> longest((rows + 1) * (columns + 1));
    const auto at = [&](std::size_t row, std::size_t column) -> std::uint32_t & {
        return longest[row * (columns + 1) + column];
    };
    for (std::size_t row = rows; row-- > 0;) {
        for (std::size_t column = columns; column-- > 0;) {
            const bool isSame = lines[static_cast<qsizetype>(row)] == others[static_cast<qsizetype>(column)];
            at(row, column) = isSame ? at(row + 1, column + 1) + 1 : std::max(at(row + 1, column), at(row, column + 1));
        }
    }
    for (std::size_t row = 0, column = 0; row < rows && column < columns;) {
        if (lines[static_cast<qsizetype>(row)] == others[static_cast<qsizetype>(column)]) {
            same[row++] = static_cast<qsizetype>(column++);
        } else if (at(row + 1, column) >= at(row, column + 1)) {
            ++row;
        } else {
            ++column;
        }
    }
    return same;
}

bool isValidUtf8(const QByteArray &bytes)
{
    return QUtf8StringView(bytes.constData(), bytes.size()).isValidUtf8();
}

} // namespace

EditableText::EditableText(const QByteArray &bytes)
    : isUtf8_(isValidUtf8(bytes)), hasMark_(isUtf8_ && bytes.startsWith(byteOrderMark))
{
    const QByteArrayView body = QByteArrayView(bytes).sliced(hasMark_ ? byteOrderMark.size() : 0);
    const QString decoded = isUtf8_ ? QString::fromUtf8(body) : QString::fromLatin1(body);
    for (qsizetype begin = 0, at = 0;; ++at) {
        if (at == decoded.size()) {
            lines_.push_back({decoded.mid(begin), QString()});
            break;
        }
        if (const qsizetype size = lineEndAt(decoded, at); size > 0) {
            lines_.push_back({decoded.mid(begin, at - begin), decoded.mid(at, size)});
            at += size - 1;
            begin = at + 1;
        }
    }
    usualEnd_ = lines_.size() > 1 ? lines_.front().end : QStringLiteral("\n");
    isUniform_ =
        std::all_of(lines_.begin(), lines_.end() - 1, [this](const Line &line) { return line.end == usualEnd_; });
    text_.reserve(decoded.size());
    for (const Line &line : lines_) {
        text_ += line.text;
        text_ += line.end.isEmpty() ? QStringView() : QStringView(u"\n");
    }
}

/// The end of each line but the last.
std::vector<QString> EditableText::endsOf(const QStringList &lines) const
{
    const qsizetype count = lines.size() - 1;
    std::vector<QString> ends(static_cast<std::size_t>(count), usualEnd_);
    if (isUniform_) {
        return ends;
    }
    const auto known = static_cast<qsizetype>(lines_.size());
    const auto of = [this](qsizetype index) -> const Line & { return lines_[static_cast<std::size_t>(index)]; };
    qsizetype front = 0;
    while (front < std::min(lines.size(), known) && of(front).text == lines[front]) {
        ++front;
    }
    qsizetype back = 0;
    while (back < std::min(lines.size(), known) - front && of(known - 1 - back).text == lines[lines.size() - 1 - back])
    {
        ++back;
    }
    QStringList others;
    for (qsizetype i = front; i < known - back; ++i) {
        others.append(of(i).text);
    }
    const std::vector<qsizetype> same = sameLines(lines.mid(front, lines.size() - front - back), others);
    for (qsizetype i = 0; i < count; ++i) {
        qsizetype index = i;
        if (i >= lines.size() - back) {
            index = i - lines.size() + known;
        } else if (i >= front) {
            const qsizetype found = same[static_cast<std::size_t>(i - front)];
            index = found < 0 ? -1 : front + found;
        }
        QString &end = ends[static_cast<std::size_t>(i)];
        end = index >= 0 ? of(index).end : QString();
        if (end.isEmpty()) {
            end = i > 0 ? ends[static_cast<std::size_t>(i - 1)] : usualEnd_;
        }
    }
    return ends;
}

QString EditableText::withLineEnds(const QString &text) const
{
    if (isUniform_ && usualEnd_ == u"\n") {
        return text;
    }
    const QStringList lines = text.split(u'\n');
    const std::vector<QString> ends = endsOf(lines);
    QString whole;
    whole.reserve(text.size() + lines.size());
    for (qsizetype i = 0; i < lines.size(); ++i) {
        whole += lines[i];
        whole += i + 1 < lines.size() ? QStringView(ends[static_cast<std::size_t>(i)]) : QStringView();
    }
    return whole;
}

bool EditableText::fitsLatin1(const QString &text) const
{
    constexpr char16_t lastOfLatin1 = 0xFF;
    constexpr char16_t lastOfAscii = 0x7F;
    const bool hasAll = std::all_of(text.begin(), text.end(), [](QChar one) { return one.unicode() <= lastOfLatin1; });
    const bool isAscii = std::all_of(text.begin(), text.end(), [](QChar one) { return one.unicode() <= lastOfAscii; });
    return isAscii || (hasAll && !isValidUtf8(text.toLatin1()));
}

bool EditableText::changesEncoding(const QString &text) const
{
    return !isUtf8_ && !fitsLatin1(text);
}

QByteArray EditableText::bytesOf(const QString &text) const
{
    const QString whole = withLineEnds(text);
    if (!isUtf8_ && fitsLatin1(whole)) {
        return whole.toLatin1();
    }
    return (hasMark_ ? byteOrderMark.toByteArray() : QByteArray()) + whole.toUtf8();
}

} // namespace kareport
