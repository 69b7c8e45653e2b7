#pragma once

#include <QString>

/// The number of a survey point. It is a text, since points are also called "12A" or "BM-3"; lists sort it in natural
/// order.
class UPointNumber
{
public:
    UPointNumber() = default;
    /// A number as it is shown.
    explicit UPointNumber(QString text) : text_(std::move(text)) {}

    /// The number as it is shown.
    const QString &Convert() const { return text_; }

    /// The text for refilling in place, so that a list that is read row by row keeps its memory.
    QString &text() { return text_; }

private:
    QString text_;
};
