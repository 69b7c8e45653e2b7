#pragma once

#include <QByteArray>
#include <QByteArrayView>

#include <mutex>
#include <vector>

namespace kareport
{

/// Embedded faces that were compressed, by their content: most reports of a process show the same characters, and in a short
/// one the face is most of what there is to compress. May be used from several threads.
class CompressedFaces
{
public:
    /// Bytes of all that is kept, as they were and compressed. What was used last is kept.
    static constexpr qint64 mostBytes = qint64(4) << 20;

    /// What the process keeps.
    static CompressedFaces &ofProcess();

    /// What a face became. Empty when it is not kept.
    QByteArray find(QByteArrayView face);
    /// Keeps what a face became, unless that is more than may be kept.
    void keep(const QByteArray &face, const QByteArray &compressed);
    /// Bytes that are kept.
    qint64 size() const;

private:
    struct Entry
    {
        QByteArray face;
        QByteArray compressed;

        qint64 size() const { return face.size() + compressed.size(); }
    };

    mutable std::mutex lock_;
    std::vector<Entry> entries_; ///< what was used last is at the end
    qint64 size_ = 0;
};

} // namespace kareport
