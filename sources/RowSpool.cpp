#include "RowSpool.h"

#include <cstring>
#include <string>
#include <string_view>

namespace kareport
{

namespace
{

template <typename T>
void put(std::string &buffer, const T &value)
{
    buffer.append(reinterpret_cast<const char *>(&value), sizeof value);
}

void putText(std::string &buffer, const QString &text)
{
    put(buffer, text.size());
    buffer.append(reinterpret_cast<const char *>(text.constData()),
                  static_cast<std::size_t>(text.size()) * sizeof(QChar));
}

template <typename T>
T take(const char *&at)
{
    T value;
    std::memcpy(&value, at, sizeof value);
    at += sizeof value;
    return value;
}

void takeText(const char *&at, QString &text)
{
    text.resize(take<qsizetype>(at));
    const std::size_t bytes = static_cast<std::size_t>(text.size()) * sizeof(QChar);
    std::memcpy(text.data(), at, bytes);
    at += bytes;
}

} // namespace

bool RowSpool::add(const UDataObject &object)
{
    std::string &buffer = bytes_.buffer();
    for (const unsigned id : ids_) {
        const UDictEntry *entry = object.Find(id);
        if (entry == nullptr) {
            buffer += static_cast<char>(ValueKind::None);
            continue;
        }
        buffer += static_cast<char>(entry->kind());
        const UDictEntry::Value &value = entry->value();
        switch (entry->kind()) {
        case ValueKind::Boolean: put(buffer, std::get<bool>(value)); break;
        case ValueKind::Int16: put(buffer, std::get<qint16>(value)); break;
        case ValueKind::Int32: put(buffer, std::get<qint32>(value)); break;
        case ValueKind::Double: put(buffer, std::get<double>(value)); break;
        case ValueKind::Text: putText(buffer, std::get<QString>(value)); break;
        default: putText(buffer, std::get<UPointNumber>(value).Convert()); break;
        }
    }
    return bytes_.flushFull();
}

std::size_t RowSpool::read(std::size_t place, UDataObject &object) const
{
    const std::string_view bytes = bytes_.view();
    const char *at = bytes.data() + place;
    for (const unsigned id : ids_) {
        switch (static_cast<ValueKind>(take<char>(at))) {
        case ValueKind::None: object.Remove(id); break;
        case ValueKind::Boolean: object.Refill<bool>(id) = take<bool>(at); break;
        case ValueKind::Int16: object.Refill<qint16>(id) = take<qint16>(at); break;
        case ValueKind::Int32: object.Refill<qint32>(id) = take<qint32>(at); break;
        case ValueKind::Double: object.Refill<double>(id) = take<double>(at); break;
        case ValueKind::Text: takeText(at, object.Refill<QString>(id)); break;
        default: takeText(at, object.Refill<UPointNumber>(id).text()); break;
        }
    }
    return static_cast<std::size_t>(at - bytes.data());
}

} // namespace kareport
