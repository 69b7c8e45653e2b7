// A text file in a bare control, for comparison with the desktop program: nothing around it, and nothing done to the text.
#include <QApplication>
#include <QFile>
#include <QFontDatabase>
#include <QPlainTextEdit>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QFile file(QApplication::arguments().value(1));
    if (!file.open(QIODevice::ReadOnly)) {
        return 1;
    }
    QPlainTextEdit edit;
    edit.setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    edit.setLineWrapMode(QPlainTextEdit::NoWrap);
    edit.setPlainText(QString::fromUtf8(file.readAll()));
    edit.resize(1000, 700);
    edit.show();
    return QApplication::exec();
}
