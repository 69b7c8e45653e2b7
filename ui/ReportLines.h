#pragma once

#include <QAbstractListModel>

#include <cstddef>
#include <memory>
#include <vector>

namespace kareport
{

/// The lines of a report window as a list model. Lines are added one by one and shown together: views learn of them with
/// `publish`, so that a line costs what it is long, however many there are.
///
/// Lines of one-byte characters, as nearly all are, take a byte a character.
class ReportLines : public QAbstractListModel
{
public:
    explicit ReportLines(QObject *parent = nullptr);
    ~ReportLines() override;

    /// Adds a line after the last. @return false, with nothing added, when there is no memory
    bool append(QStringView line);
    /// Takes all lines out. Views learn of it at once.
    void clear();
    /// Lines that were added, published or not.
    int count() const { return static_cast<int>(lines_.size()); }
    bool hasUnpublished() const { return count() > published_; }
    /// Tells the views of the lines that were added since the last time.
    void publish();
    /// A line as it was added, from 0; empty for a number that has none.
    QString line(int number) const;

    /// Lines that were published.
    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;

private:
    struct Line
    {
        const char *bytes;
        int length; ///< characters
        bool isWide;
    };

    char *room(std::size_t bytes);

    std::vector<std::unique_ptr<char[]>> blocks_;
    std::size_t used_ = 0; ///< bytes of the last block
    std::size_t size_ = 0; ///< of the last block
    std::vector<Line> lines_;
    int published_ = 0;
};

} // namespace kareport
