#pragma once

#include <QByteArray>
#include <QIODevice>

/// A device that takes at most so many bytes at a write; -1 lets it fail.
class LimitedDevice : public QIODevice
{
public:
    LimitedDevice() { open(QIODevice::WriteOnly | QIODevice::Unbuffered); }

    qint64 limit = 100;
    QByteArray taken;

protected:
    qint64 readData(char *, qint64) override { return -1; }
    qint64 writeData(const char *data, qint64 size) override
    {
        const qint64 written = qMin(size, limit);
        if (written > 0) {
            taken.append(data, written);
        }
        return written;
    }
};
