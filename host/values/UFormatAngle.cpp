#include "UFormatAngle.h"

#include "MemoryLasts.h"

void UFormatAngle::ConvertToDMSformatString(char degreeMark, char minuteMark, char secondMark, QString &text)
{
    if (!kareport::doneWhileMemoryLasts([&text] { text.detach(); })) {
        return;
    }
    qsizetype kept = 0;
    QChar *const characters = text.data();
    for (qsizetype i = 0; i < text.size(); ++i) {
        char mark = 0;
        switch (characters[i].unicode()) {
        case u'°': mark = degreeMark; break;
        case u'\'': mark = minuteMark; break;
        case u'"': mark = secondMark; break;
        default: characters[kept++] = characters[i]; continue;
        }
        if (mark != 0) {
            characters[kept++] = QLatin1Char(mark);
        }
    }
    text.truncate(kept);
}
