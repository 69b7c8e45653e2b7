#include "SizeLimit.h"

#include <QLocale>

#include <limits>

namespace kareport
{

std::optional<qint64> sizeFromText(const QString &text)
{
    constexpr QStringView units = u"KMG";
    const qsizetype unit = text.isEmpty() ? -1 : units.indexOf(text.back(), 0, Qt::CaseInsensitive);
    const QStringView digits = QStringView(text).chopped(unit < 0 ? 0 : 1);
    for (const QChar digit : digits) {
        if (digit < u'0' || digit > u'9') {
            return std::nullopt;
        }
    }
    bool isNumber = false;
    const qint64 number = digits.toLongLong(&isNumber);
    const int shift = static_cast<int>(10 * (unit + 1));
    if (!isNumber || number < 1 || number > (std::numeric_limits<qint64>::max() >> shift)) {
        return std::nullopt;
    }
    return number << shift;
}

QString sizeText(qint64 bytes)
{
    return QLocale::c().formattedDataSize(bytes, 1, QLocale::DataSizeTraditionalFormat);
}

SizeLimit::SizeLimit(QIODevice *device, qint64 mostBytes) : device_(device), left_(mostBytes)
{
    open(QIODevice::WriteOnly | QIODevice::Unbuffered);
}

qint64 SizeLimit::readData(char * /*data*/, qint64 /*size*/)
{
    return -1;
}

qint64 SizeLimit::writeData(const char *data, qint64 size)
{
    isExceeded_ |= size > left_;
    if (isExceeded_) {
        return -1;
    }
    left_ -= size;
    return device_ == nullptr ? size : device_->write(data, size);
}

} // namespace kareport
