#include "PointGeometry.h"

#include "Xlate.h"

#include <array>
#include <cstdint>
#include <cstring>
#include <string>

namespace kareport
{

namespace
{

/// Takes numbers off the front of bytes, in the order of bytes that these have.
class ByteTaker
{
public:
    explicit ByteTaker(std::string_view bytes) : bytes_(bytes) {}

    void setLittleEndian(bool isLittle) { isLittle_ = isLittle; }
    std::size_t left() const { return bytes_.size(); }

    /// The next number; 0 where the bytes have ended, which `isShort` tells.
    std::uint64_t take(std::size_t count)
    {
        if (bytes_.size() < count) {
            isShort_ = true;
            bytes_ = {};
            return 0;
        }
        std::uint64_t number = 0;
        for (std::size_t i = 0; i < count; ++i) {
            const auto byte = static_cast<unsigned char>(bytes_[isLittle_ ? count - 1 - i : i]);
            number = number << 8 | byte;
        }
        bytes_.remove_prefix(count);
        return number;
    }
    double takeDouble()
    {
        const std::uint64_t bits = take(8);
        double number = 0;
        std::memcpy(&number, &bits, sizeof number);
        return number;
    }
    void skip(std::size_t count)
    {
        isShort_ = isShort_ || count > bytes_.size();
        bytes_.remove_prefix(std::min(count, bytes_.size()));
    }
    bool isShort() const { return isShort_; }
    std::string_view rest() const { return bytes_; }

private:
    std::string_view bytes_;
    bool isLittle_ = true;
    bool isShort_ = false;
};

QString noGeometry()
{
    return Xlate("bytes that are not a geometry");
}

QString nameOfType(std::uint32_t type)
{
    switch (type) {
    case 2: return Xlate("a line string");
    case 3: return Xlate("a polygon");
    case 4: return Xlate("several points");
    case 5: return Xlate("several line strings");
    case 6: return Xlate("several polygons");
    case 7: return Xlate("a collection of geometries");
    default: return Xlate("a geometry of another kind");
    }
}

int valueOfDigit(char digit)
{
    if (digit >= '0' && digit <= '9') {
        return digit - '0';
    }
    const char lower = static_cast<char>(digit | 0x20);
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : -1;
}

} // namespace

PointOrFault parseWkbPoint(std::string_view bytes)
{
    constexpr std::uint32_t flagZ = 0x80000000;
    constexpr std::uint32_t flagM = 0x40000000;
    constexpr std::uint32_t flagSystem = 0x20000000;
    ByteTaker taker(bytes);
    const std::uint64_t order = taker.take(1);
    if (taker.isShort() || order > 1) {
        return noGeometry();
    }
    taker.setLittleEndian(order == 1);
    const auto type = static_cast<std::uint32_t>(taker.take(4));
    const std::uint32_t kind = type & ~(flagZ | flagM | flagSystem);
    const std::uint32_t dimensions = kind / 1000;
    if (taker.isShort() || kind % 1000 < 1 || kind % 1000 > 17 || dimensions > 3) {
        return noGeometry();
    }
    if (kind % 1000 != 1) {
        return nameOfType(kind % 1000);
    }
    PointGeometry point;
    if ((type & flagSystem) != 0) {
        point.referenceSystem = static_cast<qint32>(taker.take(4));
    }
    const bool hasZ = (type & flagZ) != 0 || dimensions == 1 || dimensions == 3;
    const bool hasM = (type & flagM) != 0 || dimensions == 2 || dimensions == 3;
    point.x = taker.takeDouble();
    point.y = taker.takeDouble();
    if (hasZ) {
        point.z = taker.takeDouble();
    }
    taker.skip(hasM ? 8 : 0);
    if (taker.isShort() || taker.left() != 0) {
        return noGeometry();
    }
    return point;
}

PointOrFault parseHexPoint(std::string_view text)
{
    if (text.starts_with("\\x")) {
        text.remove_prefix(2);
    }
    // A longer text is not a point; its first bytes say its kind.
    constexpr std::size_t longestPoint = 2 * (1 + 4 + 4 + 4 * 8);
    const bool isWhole = text.size() <= longestPoint;
    std::string bytes;
    for (std::size_t i = 0; i + 1 < text.size() && i < longestPoint; i += 2) {
        const int high = valueOfDigit(text[i]);
        const int low = valueOfDigit(text[i + 1]);
        if (high < 0 || low < 0) {
            return noGeometry();
        }
        bytes += static_cast<char>(high << 4 | low);
    }
    const PointOrFault point = parseWkbPoint(bytes);
    const bool isCut = (isWhole && text.size() % 2 != 0) || (!isWhole && std::holds_alternative<PointGeometry>(point));
    return isCut ? PointOrFault(noGeometry()) : point;
}

PointOrFault parseGeoPackagePoint(std::string_view bytes)
{
    constexpr std::array<std::size_t, 5> envelopes = {0, 32, 48, 48, 64};
    ByteTaker taker(bytes);
    const std::uint64_t magic = taker.take(2);
    const std::uint64_t version = taker.take(1);
    const std::uint64_t flags = taker.take(1);
    const std::size_t envelope = flags >> 1 & 7;
    const bool isExtended = (flags & 0x20) != 0;
    if (taker.isShort() || magic != 0x5047 || version != 0 || envelope >= envelopes.size() || isExtended) {
        return noGeometry();
    }
    taker.setLittleEndian((flags & 1) != 0);
    const auto referenceSystem = static_cast<qint32>(taker.take(4));
    taker.skip(envelopes[envelope]);
    if (taker.isShort()) {
        return noGeometry();
    }
    PointOrFault result = parseWkbPoint(taker.rest());
    if (auto *point = std::get_if<PointGeometry>(&result)) {
        point->referenceSystem = referenceSystem;
    }
    return result;
}

} // namespace kareport
