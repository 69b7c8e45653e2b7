#include "PathDrawing.h"

#include <vector>

namespace kareport
{

namespace
{

class PathReader
{
public:
    explicit PathReader(QStringView text) : text_(text) {}

    QPainterPath read()
    {
        QPainterPath path;
        QChar command;
        while (skipBlanks(), at_ < text_.size()) {
            if (text_[at_].isLetter()) {
                command = text_[at_++];
            }
            if (!add(path, command)) {
                break;
            }
            if (command == u'M' || command == u'm') {
                command = command == u'M' ? u'L' : u'l'; // pairs that follow without a letter
            }
        }
        return path;
    }

private:
    void skipBlanks()
    {
        while (at_ < text_.size() && (text_[at_].isSpace() || text_[at_] == u',')) {
            ++at_;
        }
    }

    bool number(qreal &value)
    {
        skipBlanks();
        const qsizetype begin = at_;
        bool hasPoint = false;
        while (at_ < text_.size()) {
            const QChar c = text_[at_];
            const bool isSign = at_ == begin && (c == u'-' || c == u'+');
            const bool isPoint = c == u'.' && !hasPoint;
            if (!c.isDigit() && !isSign && !isPoint) {
                break;
            }
            hasPoint = hasPoint || isPoint;
            ++at_;
        }
        bool isNumber = false;
        value = text_.sliced(begin, at_ - begin).toDouble(&isNumber);
        return isNumber;
    }

    bool points(std::vector<QPointF> &read, std::size_t count, QPointF origin)
    {
        for (std::size_t i = 0; i < count; ++i) {
            QPointF point;
            if (!number(point.rx()) || !number(point.ry())) {
                return false;
            }
            read.push_back(origin + point);
        }
        return true;
    }

    bool add(QPainterPath &path, QChar command)
    {
        const QPointF here = path.currentPosition();
        const QPointF origin = command.isLower() ? here : QPointF();
        std::vector<QPointF> to;
        qreal value = 0;
        switch (command.toUpper().unicode()) {
        case u'M':
            if (!points(to, 1, origin)) {
                return false;
            }
            path.moveTo(to[0]);
            return true;
        case u'L':
            if (!points(to, 1, origin)) {
                return false;
            }
            path.lineTo(to[0]);
            return true;
        case u'H':
            if (!number(value)) {
                return false;
            }
            path.lineTo(origin.x() + value, here.y());
            return true;
        case u'V':
            if (!number(value)) {
                return false;
            }
            path.lineTo(here.x(), origin.y() + value);
            return true;
        case u'Q':
            if (!points(to, 2, origin)) {
                return false;
            }
            path.quadTo(to[0], to[1]);
            return true;
        case u'C':
            if (!points(to, 3, origin)) {
                return false;
            }
            path.cubicTo(to[0], to[1], to[2]);
            return true;
        case u'Z': path.closeSubpath(); return true;
        default: return false;
        }
    }

    QStringView text_;
    qsizetype at_ = 0;
};

} // namespace

QPainterPath pathOf(QStringView description)
{
    return PathReader(description).read();
}

} // namespace kareport
