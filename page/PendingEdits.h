#pragma once

#include <QString>
#include <QStringView>

#include <vector>

namespace kareport
{

/// Edits of a long text that have not been carried out in it yet: which of its pieces are replaced, and by what. Edits
/// that touch become one, so that typing grows a single edit.
class PendingEdits
{
public:
    struct Edit
    {
        qint64 at;      ///< in the text without any of the edits
        qint64 removed; ///< characters of that text
        QString inserted;
    };

    /// Adds the replacement of a piece of the edited text. @throws std::bad_alloc, with the edits as they were
    void replace(qint64 at, qint64 removed, QStringView inserted);
    /// In the order of their places.
    const std::vector<Edit> &edits() const { return edits_; }
    bool isEmpty() const { return edits_.empty(); }
    /// By how much the edited text is longer.
    qint64 growth() const { return growth_; }
    /// All characters that were inserted since the last `clear`, also those that were removed again: the edits never take
    /// more room than this, in whatever order they are carried out.
    qint64 inserted() const { return inserted_; }
    void clear();

private:
    void replaceInEdits(qint64 at, qint64 removed, QStringView inserted);

    std::vector<Edit> edits_;
    qint64 growth_ = 0;
    qint64 inserted_ = 0;
};

} // namespace kareport
