#include "PdfFaces.h"

#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QHash>

#include <array>
#include <mutex>

namespace kareport
{

namespace
{

struct Row
{
    QStringView name;
    bool isCollection;
};
constexpr Row rows[] = {{u"MSGOTHIC.TTC", true}, {u"lucon.TTF", false}};

/// The file of each row in a folder; empty where it has none.
using Found = std::array<QString, std::size(rows)>;

Found lookInto(const QString &folder)
{
    Found found;
    for (std::size_t i = 0; i < std::size(rows); ++i) {
        // A name filter ignores case, as the platform does that these files come from.
        QStringList names;
        names.append(rows[i].name.toString());
        const QStringList files = QDir(folder).entryList(names, QDir::Files, QDir::Name);
        found[i] = files.isEmpty() ? QString() : QDir(folder).filePath(files.first());
    }
    return found;
}

/// What the folders of a system have, which may be hundreds: each is looked into again when it was changed.
class LookedInto
{
public:
    Found find(const QString &folder)
    {
        const std::lock_guard held(lock_);
        const qint64 changed = QFileInfo(folder).lastModified().toMSecsSinceEpoch();
        const auto known = folders_.constFind(folder);
        if (known != folders_.constEnd() && known->changed == changed) {
            return known->found;
        }
        const qint64 now = QDateTime::currentMSecsSinceEpoch();
        Found found = lookInto(folder);
        if (folders_.size() >= mostFolders) {
            folders_.clear();
        }
        // A file that is put in right after this may leave the folder with the same time.
        if (changed < now - unsureFor) {
            folders_.insert(folder, {changed, found});
        }
        return found;
    }

private:
    static constexpr qsizetype mostFolders = 10'000;
    static constexpr qint64 unsureFor = 2000; ///< milliseconds

    struct Folder
    {
        qint64 changed = 0; ///< milliseconds since 1970
        Found found;
    };
    std::mutex lock_;
    QHash<QString, Folder> folders_;
};

/// A face whose file was read, until it is changed.
class ReadFace
{
public:
    PdfFace read(const QString &file, bool isCollection)
    {
        const std::lock_guard held(lock_);
        const QFileInfo info(file);
        const Identity identity = {file, info.size(), info.lastModified()};
        if (!face_ || identity != identity_) {
            face_.emplace(file, 0, isCollection);
            identity_ = identity;
        }
        return *face_;
    }

private:
    struct Identity
    {
        QString file;
        qint64 size = 0;
        QDateTime changed;

        bool operator==(const Identity &other) const = default;
    };
    std::mutex lock_;
    Identity identity_;
    std::optional<PdfFace> face_;
};

} // namespace

std::optional<PdfFace> preferredPdfFace(const QStringList &fontFolders)
{
    static LookedInto looked;
    static ReadFace face;
    std::vector<Found> found;
    for (const QString &folder : fontFolders) {
        found.push_back(looked.find(folder));
    }
    for (std::size_t i = 0; i < std::size(rows); ++i) {
        for (const Found &files : found) {
            if (!files[i].isEmpty()) {
                return face.read(files[i], rows[i].isCollection);
            }
        }
    }
    return std::nullopt;
}

} // namespace kareport
