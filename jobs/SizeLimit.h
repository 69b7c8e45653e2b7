#pragma once

#include <QIODevice>
#include <QString>

#include <optional>

namespace kareport
{

/// A number of bytes such as "500", "64K", "10M" or "2G". @return nothing for another text
std::optional<qint64> sizeFromText(const QString &text);
/// The same for messages, rounded: "10 MB".
QString sizeText(qint64 bytes);

/// Hands what is written on to another device, or only counts it, until it is more than a limit.
class SizeLimit : public QIODevice
{
public:
    /// @param device  open for writing; null to count only
    SizeLimit(QIODevice *device, qint64 mostBytes);

    bool isExceeded() const { return isExceeded_; }
    bool isSequential() const override { return true; }

protected:
    qint64 readData(char *data, qint64 size) override;
    qint64 writeData(const char *data, qint64 size) override;

private:
    QIODevice *device_;
    qint64 left_;
    bool isExceeded_ = false;
};

} // namespace kareport
