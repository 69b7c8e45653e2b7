#pragma once

#include "TextPlaces.h"

#include <QByteArray>
#include <QHash>
#include <QString>

#include <memory>
#include <optional>
#include <variant>
#include <vector>

namespace kareport
{

/// The way from a JSON document's root to a value: names of members and indices of elements.
using JsonPath = std::vector<std::variant<QString, qsizetype>>;

/// Finds places in a JSON text that has been parsed already. What it goes over on the way it keeps, so that the places of the many
/// steps of a job are not all counted from its beginning.
class JsonPlaces
{
public:
    explicit JsonPlaces(const QByteArray &json) : json_(json) {}

    /// Where a value (or, with `ofKey`, the name of the member that holds it) is. Of members of one name the last counts. Nothing
    /// when the path does not exist.
    std::optional<TextPlace> of(const JsonPath &path, bool ofKey = false);

private:
    struct Found
    {
        qsizetype key;
        qsizetype value;
    };
    /// What is in a list or an object.
    struct Children
    {
        QHash<QString, Found> members;
        std::vector<Found> elements;
    };
    using Step = std::variant<QString, qsizetype>;

    const Children &childrenOf(const QString &name, qsizetype at);
    std::optional<Found> find(const JsonPath &path, std::size_t step, const Found &parent);
    TextPlace placeOf(qsizetype byte);

    template <typename Visit>
    void visitChildren(qsizetype at, const Visit &visit) const;
    Children childrenAt(qsizetype at) const;
    std::optional<Found> childAt(qsizetype at, const Step &step) const;
    static std::optional<Found> childIn(const Children &children, const Step &step);

    QByteArray json_;
    std::unique_ptr<Children> root_;  ///< null until a place is asked for
    QHash<QString, Children> inRoot_; ///< what is in the members of the root that were asked for
    std::vector<TextPlace> marks_;    ///< the places of every so many bytes
};

/// Where a value is, for a text of which no other place is asked for.
std::optional<TextPlace> placeInJson(const QByteArray &json, const JsonPath &path, bool ofKey = false);

/// A key that occurs twice in one object: parsers take the last one and say nothing.
struct RepeatedKey
{
    QString key;
    TextPlace place; ///< of the second one
    qsizetype firstLine;
};
/// The first object of a JSON text, which has been parsed already, that has a key twice; nothing when there is none.
std::optional<RepeatedKey> findRepeatedKey(const QByteArray &json);

/// The place of a byte in a UTF-8 text.
TextPlace placeOfByte(const QByteArray &text, qsizetype byte);

} // namespace kareport
